#include <Zandor/headless/Intrinsic.h>

#include <Zandor/platform/RuntimeError.h>

#include <algorithm>

namespace zandor::platform::headless {

Frame::Frame(Toolkit& toolkit, const Design& design, Element* container, FrameEvents given)
    : Placed(toolkit, design, container), events(std::move(given)) {
    place({0, 0, frameWidth, frameHeight});
}

bool Frame::Visible() const {
    called("Visible?");
    return mLook.visible;
}

void Frame::Visible(bool value) {
    called("Visible");
    setVisible(value);
}

void Frame::ZOrder() {
    called("ZOrder");
    bringToFront();
}

Label::Label(Toolkit& toolkit, const Design& design, Element* container)
    : Placed(toolkit, design, container) {
    place({0, 0, labelWidth, labelHeight});
}

void Label::Caption(const String& value) {
    called("Caption");
    mLook.text = value;
}

void Label::Font(const platform::Font& value) {
    called("Font");
    mLook.font = value;
}

CommandButton::CommandButton(Toolkit& toolkit, const Design& design, Element* container,
                             CommandButtonEvents given)
    : Placed(toolkit, design, container), events(std::move(given)) {
    place({0, 0, buttonWidth, buttonHeight});
}

void CommandButton::Caption(const String& value) {
    called("Caption");
    mLook.text = value;
}

void CommandButton::Enabled(bool value) {
    called("Enabled");
    setEnabled(value);
}

void CommandButton::Default(bool value) {
    called("Default");
    if (value) endDefaults(window());
    mDefault = value;
}

void CommandButton::endDefaults(const Element& inside) {
    for (Element* child : inside.children()) {
        endDefaults(*child);
        if (auto* button = dynamic_cast<CommandButton*>(child)) button->mDefault = false;
    }
}

void CommandButton::Font(const platform::Font& value) {
    called("Font");
    mLook.font = value;
}

void CommandButton::gotFocus() {
    if (events.GotFocus) events.GotFocus();
}

ComboBox::ComboBox(Toolkit& toolkit, const Design& design, Element* container,
                   std::vector<String> items, KeyEvent KeyDown)
    : Placed(toolkit, design, container), mItems(std::move(items)), mKeyDown(std::move(KeyDown)) {
    place({0, 0, inputWidth, inputHeight});
}

std::int16_t ComboBox::ListIndex() const {
    called("ListIndex");
    return mListIndex;
}

void ComboBox::ListIndex(std::int16_t value) {
    called("ListIndex=");
    choose(value);
    mDropped = false;
}

void ComboBox::choose(std::int16_t index) {
    if (index < -1 || index >= static_cast<std::int32_t>(mItems.size()))
        throw errors::invalidPropertyValue();
    mListIndex = index;
    mLook.text = index < 0 ? String() : mItems[static_cast<std::size_t>(index)];
}

String ComboBox::Text() const {
    called("Text");
    return mLook.text;
}

void ComboBox::Clear() {
    called("Clear");
    mItems.clear();
    choose(-1);
}

void ComboBox::AddItem(const String& text) {
    called("AddItem");
    mItems.push_back(text);
}

void ComboBox::Enabled(bool value) {
    called("Enabled");
    setEnabled(value);
}

void ComboBox::Font(const platform::Font& value) {
    called("Font");
    mLook.font = value;
}

void ComboBox::SetFocus() {
    called("SetFocus");
    takeFocus();
}

void ComboBox::DropDown() {
    called("DropDown");
    mDropped = true;
}

void ComboBox::keyDown(std::int16_t keyCode, std::int16_t shift) {
    if (mKeyDown) mKeyDown(keyCode, shift);
}

TextBox::TextBox(Toolkit& toolkit, const Design& design, Element* container, KeyEvent KeyDown)
    : Placed(toolkit, design, container), mKeyDown(std::move(KeyDown)) {
    place({0, 0, inputWidth, inputHeight});
}

String TextBox::Text() const {
    called("Text");
    return mLook.text;
}

void TextBox::Text(const String& value) {
    called("Text=");
    type(value);
}

void TextBox::type(const String& text) {
    mLook.text = text;
    mAllSelected = false;
}

void TextBox::SetFocus() {
    called("SetFocus");
    takeFocus();
    mAllSelected = true;
}

void TextBox::keyDown(std::int16_t keyCode, std::int16_t shift) {
    if (mKeyDown) mKeyDown(keyCode, shift);
}

ScrollBar::ScrollBar(Toolkit& toolkit, const Design& design, Element* container,
                     Orientation orientation, ScrollBarEvents events)
    : Placed(toolkit, design, container), orientation(orientation), mEvents(std::move(events)) {
    Bounds bounds;
    (orientation == Orientation::horizontal ? bounds.Height : bounds.Width) = scrollBarThickness;
    place(bounds);
}

std::int16_t ScrollBar::Max() const {
    called("Max");
    return mMax;
}

void ScrollBar::Max(std::int16_t value) {
    called("Max=");
    if (value < 0) throw errors::invalidPropertyValue();
    mMax = value;
    scrollTo(mValue);
}

std::int16_t ScrollBar::Value() const {
    called("Value");
    return mValue;
}

void ScrollBar::Value(std::int16_t value) {
    called("Value=");
    if (value < 0 || value > mMax) throw errors::invalidPropertyValue();
    scrollTo(value);
}

void ScrollBar::scrollTo(std::int16_t value) {
    const std::int16_t held = std::clamp<std::int16_t>(value, 0, mMax);
    if (held == mValue) return;
    mValue = held;
    if (mEvents.Change) mEvents.Change();
}

void ScrollBar::LargeChange(std::int16_t value) {
    called("LargeChange");
    if (value < 1) throw errors::invalidPropertyValue();
    mLargeChange = value;
}

void ScrollBar::Enabled(bool value) {
    called("Enabled");
    setEnabled(value);
}

void ScrollBar::gotFocus() {
    if (mEvents.GotFocus) mEvents.GotFocus();
}

Line::Line(Toolkit& toolkit, const Design& design, Element* container)
    : Element(toolkit, design, container) {
    setVisible(false);
}

float Line::X1() const {
    called("X1");
    return mEnds.X1;
}

float Line::Y1() const {
    called("Y1");
    return mEnds.Y1;
}

float Line::X2() const {
    called("X2");
    return mEnds.X2;
}

float Line::Y2() const {
    called("Y2");
    return mEnds.Y2;
}

void Line::setEnds(float X1, float Y1, float X2, float Y2) {
    called("setEnds");
    mEnds = {X1, Y1, X2, Y2};
}

void Line::BorderWidth(std::int16_t value) {
    called("BorderWidth");
    mBorderWidth = value;
}

void Line::Visible(bool value) {
    called("Visible");
    setVisible(value);
}

Shape::Shape(Toolkit& toolkit, const Design& design, Element* container)
    : Placed(toolkit, design, container) {
    setVisible(false);
}

void Shape::ShapeStyle(std::int16_t value) {
    called("ShapeStyle");
    mStyle = value;
}

void Shape::Visible(bool value) {
    called("Visible");
    setVisible(value);
}

} // namespace zandor::platform::headless
