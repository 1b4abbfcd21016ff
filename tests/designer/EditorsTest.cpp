#include "OpenWindow.h"

#include "support/EditorMatrix.h"

namespace {

class AnEditorOfTheDesigner : public OpenWindow {};

} // namespace

TEST_F(AnEditorOfTheDesigner, StaysOpenInEveryWindowOverEveryCanvas) {
    open();
    EditorMatrix(*window, [this]() -> ZandorWidget& { return window->drawing().control(); }).run();
}
