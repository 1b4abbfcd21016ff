#include <Zandor/headless/Dialog.h>

#include <Zandor/headless/Toolkit.h>

#include <stdexcept>

namespace zandor::platform::headless {

Dialog::Dialog(Toolkit& toolkit, const Design& design, DialogEvents events)
    : Placed(toolkit, design, nullptr), mEvents(std::move(events)) {
    setVisible(false);
}

void Dialog::Caption(const String& value) {
    called("Caption");
    mLook.text = value;
}

void Dialog::ShowModal() {
    called("ShowModal");
    setVisible(true);
    mToolkit.runModal(*this);
}

void Dialog::Hide() {
    called("Hide");
    setVisible(false);
}

void Dialog::close() {
    if (mEvents.Close) mEvents.Close();
    if (!shown()) return;
    setVisible(false);
    throw std::logic_error(name() + " stays open when its user closes it");
}

} // namespace zandor::platform::headless
