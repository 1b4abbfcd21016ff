#pragma once

#include <Zandor/headless/Element.h>
#include <Zandor/headless/export.h>

namespace zandor::platform::headless {

// The sizes of design time, in twips.
inline constexpr float scrollBarThickness = 255;
inline constexpr float frameWidth = 2400;
inline constexpr float frameHeight = 735;
inline constexpr float inputWidth = 1500;
inline constexpr float inputHeight = 315;
inline constexpr float buttonWidth = 735;
inline constexpr float buttonHeight = 315;
inline constexpr float labelWidth = 1800;
inline constexpr float labelHeight = 255;

class ZANDOR_HEADLESS_EXPORT Frame final : public Placed<platform::Frame> {
public:
    Frame(Toolkit& toolkit, const Design& design, Element* container, FrameEvents events);
    bool Visible() const override;
    void Visible(bool value) override;
    void ZOrder() override;

    const FrameEvents events;
};

class ZANDOR_HEADLESS_EXPORT Label final : public Placed<platform::Label> {
public:
    Label(Toolkit& toolkit, const Design& design, Element* container);
    void Caption(const String& value) override;
    void Font(const platform::Font& value) override;
};

class ZANDOR_HEADLESS_EXPORT CommandButton final : public Placed<platform::CommandButton> {
public:
    CommandButton(Toolkit& toolkit, const Design& design, Element* container,
                  CommandButtonEvents events);
    void Caption(const String& value) override;
    void Enabled(bool value) override;
    /// A window has one default button at most: making one ends the other.
    void Default(bool value) override;
    void Font(const platform::Font& value) override;

    bool isDefault() const { return mDefault; }

    const CommandButtonEvents events;

private:
    void gotFocus() override;
    static void endDefaults(const Element& inside);

    bool mDefault = false;
};

/// A control that takes what the user types.
class ZANDOR_HEADLESS_EXPORT Input {
public:
    virtual ~Input() = default;
    virtual void keyDown(std::int16_t keyCode, std::int16_t shift) = 0;
};

class ZANDOR_HEADLESS_EXPORT ComboBox final : public Placed<platform::ComboBox>, public Input {
public:
    ComboBox(Toolkit& toolkit, const Design& design, Element* container, std::vector<String> items,
             KeyEvent KeyDown);
    std::int16_t ListIndex() const override;
    void ListIndex(std::int16_t value) override;
    String Text() const override;
    void Clear() override;
    void AddItem(const String& text) override;
    void Enabled(bool value) override;
    void Font(const platform::Font& value) override;
    void SetFocus() override;
    void DropDown() override;

    void keyDown(std::int16_t keyCode, std::int16_t shift) override;
    const std::vector<String>& items() const { return mItems; }
    /// Whether the list is down; it goes up when something else is chosen for its user.
    bool dropped() const { return mDropped && shown(); }
    std::int16_t chosen() const { return mListIndex; }
    void choose(std::int16_t index);

private:
    std::vector<String> mItems;
    std::int16_t mListIndex = -1;
    bool mDropped = false;
    KeyEvent mKeyDown;
};

class ZANDOR_HEADLESS_EXPORT TextBox final : public Placed<platform::TextBox>, public Input {
public:
    TextBox(Toolkit& toolkit, const Design& design, Element* container, KeyEvent KeyDown);
    String Text() const override;
    void Text(const String& value) override;
    void SetFocus() override;

    void keyDown(std::int16_t keyCode, std::int16_t shift) override;
    void type(const String& text);
    /// Whether the whole text is selected, so that typing replaces it.
    bool allSelected() const { return mAllSelected; }

private:
    KeyEvent mKeyDown;
    bool mAllSelected = false;
};

class ZANDOR_HEADLESS_EXPORT ScrollBar final : public Placed<platform::ScrollBar> {
public:
    ScrollBar(Toolkit& toolkit, const Design& design, Element* container, Orientation orientation,
              ScrollBarEvents events);
    std::int16_t Max() const override;
    void Max(std::int16_t value) override;
    std::int16_t Value() const override;
    void Value(std::int16_t value) override;
    void LargeChange(std::int16_t value) override;
    void Enabled(bool value) override;

    std::int16_t max() const { return mMax; }
    std::int16_t value() const { return mValue; }
    std::int16_t largeChange() const { return mLargeChange; }
    /// As the user moves it: the ends of the range hold it.
    void scrollTo(std::int16_t value);

    const Orientation orientation;

private:
    void gotFocus() override;

    std::int16_t mMax = 32767;
    std::int16_t mValue = 0;
    std::int16_t mLargeChange = 1;
    ScrollBarEvents mEvents;
};

class ZANDOR_HEADLESS_EXPORT Line final : public platform::Line, public Element {
public:
    Line(Toolkit& toolkit, const Design& design, Element* container);
    float X1() const override;
    float Y1() const override;
    float X2() const override;
    float Y2() const override;
    void setEnds(float X1, float Y1, float X2, float Y2) override;
    void BorderWidth(std::int16_t value) override;
    void Visible(bool value) override;
    void Notes(const LineNotes& value) override { mNotes = value; }
    const LineNotes& notes() const { return mNotes; }

    struct Ends {
        float X1 = 0, Y1 = 0, X2 = 0, Y2 = 0;
    };
    const Ends& ends() const { return mEnds; }
    std::int16_t borderWidth() const { return mBorderWidth; }

private:
    LineNotes mNotes;
    Ends mEnds;
    std::int16_t mBorderWidth = 1;
};

class ZANDOR_HEADLESS_EXPORT Shape final : public Placed<platform::Shape> {
public:
    Shape(Toolkit& toolkit, const Design& design, Element* container);
    void ShapeStyle(std::int16_t value) override;
    void Visible(bool value) override;

    std::int16_t style() const { return mStyle; }

private:
    std::int16_t mStyle = shapeSquare;
};

} // namespace zandor::platform::headless
