#include "frontends/qt/strict_host/StrictHost.h"

// A host's own variables may bear the names of Qt's keywords.
[[maybe_unused]] static int signals, slots, emit, foreach, forever;

#include "frontends/qt/ZandorWindowMessage.h"
#include "support/FakeModel.h"

#include <Zandor/ZandorWidget.h>

namespace strict {

int errorsHeard() {
    fake::Library library;
    ZandorWidget widget(library);
    widget.setDebugSwitch(0);
    int heard = 0;
    QObject::connect(&widget, &ZandorWidget::Error, &widget,
                     [&heard](const QString&, int) { ++heard; });
    widget.setModel(nullptr);
    return heard;
}

} // namespace strict
