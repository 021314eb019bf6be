#include <vexa/export/dialogrunner.h>

#include <QDialog>

namespace vexa {

namespace {

DialogRunner::Function &runner()
{
    static DialogRunner::Function function;
    return function;
}

} // namespace

int DialogRunner::exec(QDialog &dialog)
{
    const Function &function = runner();
    return function ? function(dialog) : dialog.exec();
}

void DialogRunner::setFunction(Function function)
{
    runner() = std::move(function);
}

bool DialogRunner::hasFunction()
{
    return bool(runner());
}

} // namespace vexa
