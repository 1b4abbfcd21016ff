#pragma once

#include "platform/headless/Element.h"

namespace platform::headless {

class Dialog final : public Placed<platform::Dialog> {
public:
    Dialog(Toolkit& toolkit, const Design& design, DialogEvents events);
    void Caption(const String& value) override;
    /// The toolkit's onDialog plays the user. A dialog that it leaves open is closed by its frame.
    void ShowModal() override;
    void Hide() override;

    void close();

private:
    DialogEvents mEvents;
};

} // namespace platform::headless
