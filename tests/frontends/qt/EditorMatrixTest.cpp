#include "frontends/qt/Desk.h"

#include "support/EditorMatrix.h"

namespace {

class AnOpenEditor : public Desk {};

} // namespace

TEST_F(AnOpenEditor, StaysOpenInEveryWindowOverEveryCanvas) {
    show();
    bind();
    EditorMatrix(*widget, [this]() -> ZandorWidget& { return *widget; }).run();
}
