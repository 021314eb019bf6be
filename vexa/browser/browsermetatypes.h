#pragma once

#include <QMetaType>

#include <string>

// Command and object ids travel as std::string in the browser's signals.
Q_DECLARE_METATYPE(std::string)
