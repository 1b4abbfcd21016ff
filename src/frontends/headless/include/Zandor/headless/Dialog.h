#pragma once

#include <Zandor/headless/Element.h>
#include <Zandor/headless/export.h>

namespace zandor::platform::headless {

class ZANDOR_HEADLESS_EXPORT Dialog final : public Placed<platform::Dialog> {
public:
    Dialog(Toolkit& toolkit, const Design& design, DialogEvents events);
    void Caption(const String& value) override;
    /// The toolkit's onDialog plays the user. A dialog that it leaves open is closed by its frame.
    void ShowModal() override;
    void Hide() override;

    /// As its user closes it by the frame.
    void close();
    /// It is gone, and nobody is told.
    void dismiss() { setVisible(false); }

private:
    DialogEvents mEvents;
};

} // namespace zandor::platform::headless
