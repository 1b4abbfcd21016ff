#pragma once

#include "frontends/windows/toolkit/Window.h"

#include <vector>

namespace zandor::platform::windows {

class Drags;

/// What is dragged, beside the mouse: the names of the columns, in a window that the mouse does not
/// see.
class DragPicture final : public Window {
public:
    explicit DragPicture(std::shared_ptr<Surroundings> surroundings);

    /// Shown at once, where the mouse is.
    static std::shared_ptr<DragPicture> of(const Drags& drags);
    /// To where the mouse is.
    void follow();
    SIZE wanted() const override;

protected:
    LRESULT handle(const Message& message) override;

private:
    std::vector<String> mLines;
};

} // namespace zandor::platform::windows
