#pragma once

#include <Zandor/headless/Faults.h>
#include <Zandor/headless/export.h>
#include <Zandor/platform/Intrinsic.h>

#include <string>
#include <vector>

namespace zandor::platform::headless {

class Toolkit;

/// What a user can tell of a thing by looking at it.
struct Look {
    String text;
    platform::Font font;
    bool visible = true;
    bool enabled = true;
};

/// A thing that the toolkit finds by name: "hsbTable", "lstTable(3)" for a control array's element.
class ZANDOR_HEADLESS_EXPORT Object {
public:
    Object(Toolkit& toolkit, std::string name);
    Object(const Object&) = delete;
    Object& operator=(const Object&) = delete;
    virtual ~Object();

    const std::string& name() const { return mName; }
    const Look& look() const { return mLook; }

protected:
    /// Every call from outside passes here first, where a test may have it fail.
    void called(const char* member) const {
        if (mFaults.listening()) [[unlikely]]
            pass(member);
    }

    Toolkit& mToolkit;
    Look mLook;

private:
    void pass(const char* member) const;

    Faults& mFaults; ///< the toolkit's; at hand, because every call begins with a look at it
    std::string mName;
};

/// A thing that stands in a container, or is a window of its own when it has none.
class ZANDOR_HEADLESS_EXPORT Element : public Object {
public:
    Element(Toolkit& toolkit, const Design& design, Element* container);
    ~Element() override;

    const Element* container() const { return mContainer; }
    /// The window that it stands in; itself when it is one.
    const Element& window() const;
    /// From the backmost to the frontmost.
    const std::vector<Element*>& children() const { return mChildren; }
    const Bounds& placement() const { return mBounds; }
    bool isInside(const Element& other) const;
    /// Visible, and so is all that it stands in.
    bool shown() const;
    /// Enabled, and so is all that it stands in.
    bool usable() const;
    bool focused() const;

    /// Error 5 when it is not shown or not usable. GotFocus fires when it had no focus before.
    void takeFocus();

protected:
    void setVisible(bool value);
    void setEnabled(bool value);
    void place(const Bounds& bounds) { mBounds = bounds; }
    void bringToFront();
    /// Out of its container and out of what the toolkit finds, for good.
    void leave();

private:
    friend class Toolkit;

    virtual void gotFocus() {}
    virtual void lostFocus() {}
    void giveUpFocus();

    Element* mContainer;
    std::vector<Element*> mChildren;
    Bounds mBounds;
};

/// An element behind one of the control interfaces.
template <class Interface>
class Placed : public Interface, public Element {
public:
    using Element::Element;

    Bounds bounds() const override {
        called("bounds");
        return placement();
    }
    void setBounds(const Bounds& bounds) override {
        called("setBounds");
        place(bounds);
    }
};

/// "lstTable(3)"
ZANDOR_HEADLESS_EXPORT std::string elementName(StringView name, std::int16_t index);

} // namespace zandor::platform::headless
