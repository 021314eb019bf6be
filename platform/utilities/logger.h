#pragma once

#include <utilities/utilities_export.h>

#include <mutex>
#include <QString>
#include <QVector>

// The logging classes are global, like the settings classes: hosts use them
// without the library namespace.
enum class LogCategory {
    General,
    Colorimetry,
    Store,
    Settings,
    Ui,
};

VEXA_UTILITIES_EXPORT QString logCategoryName(LogCategory category);

enum class LogLevel { Debug, Warning, Error };

// A sink for log lines. Implementations must be thread-safe: the store and the
// plot workers log from their own threads.
class VEXA_UTILITIES_EXPORT LogInterface
{
public:
    virtual ~LogInterface();
    virtual void log(LogLevel level, LogCategory category, const QString &message) = 0;
};

// The application log. Lines go to every registered sink; with no sink
// registered they go to the Qt message log (qDebug/qCritical).
class VEXA_UTILITIES_EXPORT Logger
{
public:
    static Logger &instance();

    void debug(LogCategory category, const QString &message);
    // Something was refused or left out, and the caller carries on (a comparison of values
    // that are not comparable, say).
    void warning(LogCategory category, const QString &message);
    void error(LogCategory category, const QString &message);

    // The logger does not own the sink; unregister it before it dies.
    void registerLogger(LogInterface *sink);
    void unregisterLogger(LogInterface *sink);

    // Mirror every line into the Qt message log even when sinks are registered.
    void setAlwaysUseQtLog(bool on);

private:
    Logger() = default;
    void write(LogLevel level, LogCategory category, const QString &message);

    std::mutex m_mutex;
    QVector<LogInterface *> m_sinks; // Not owned.
    bool m_alwaysQt = false;
};

