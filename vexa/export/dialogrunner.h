#pragma once

#include <vexa/vexa_export.h>

#include <functional>

class QDialog;

namespace vexa {

// Runs the library's modal dialogs (file, print, preview and configuration dialogs).
// By default a dialog is executed; a host's test harness or automation installs its own
// runner, which receives the prepared dialog, may fill it in (select a file, set the
// printer's output) and returns the result code (QDialog::Accepted or Rejected) as
// exec() would.
class VEXA_EXPORT DialogRunner
{
public:
    using Function = std::function<int(QDialog &dialog)>;

    static int exec(QDialog &dialog);
    // An empty function restores exec().
    static void setFunction(Function function);
    static bool hasFunction();
};

} // namespace vexa
