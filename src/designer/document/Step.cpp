#include "designer/document/Step.h"

namespace zandor::designer {

Step::Step(const QString& name, model::Change change, Apply apply)
    : mChange(std::move(change)), mApply(std::move(apply)) {
    // The menu would underline what follows a "&" of a table's name.
    QString inMenu = name;
    setText(name + QLatin1Char('\n') + inMenu.replace(QLatin1Char('&'), QLatin1String("&&")));
}

void Step::undo() {
    mApply(mChange.reversed());
    mDone = false;
}

void Step::redo() {
    if (!mDone) mApply(mChange);
    mDone = true;
}

} // namespace zandor::designer
