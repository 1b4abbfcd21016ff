#include <Zandor/headless/Element.h>

#include <Zandor/headless/Toolkit.h>
#include <Zandor/platform/RuntimeError.h>

#include <algorithm>

namespace zandor::platform::headless {

Object::Object(Toolkit& toolkit, std::string name)
    : mToolkit(toolkit), mFaults(toolkit.faults), mName(std::move(name)) {
    mToolkit.enrol(*this);
}

Object::~Object() { mToolkit.strike(*this); }

void Object::pass(const char* member) const {
    mFaults.pass(mName + "." + member);
    // An element of a control array can also be named without its index.
    if (const auto index = mName.find('('); index != std::string::npos)
        mFaults.pass(mName.substr(0, index) + "." + member);
}

Element::Element(Toolkit& toolkit, const Design& design, Element* container)
    : Object(toolkit, toUtf8(design.Name)), mContainer(container) {
    mLook.text = design.Caption;
    mLook.font = container ? container->look().font : toolkit.controlFont;
    if (!design.FontName.empty()) mLook.font = {String(design.FontName), 8.25F};
    if (mContainer) mContainer->mChildren.push_back(this);
}

Element::~Element() {
    for (Element* child : mChildren) child->mContainer = nullptr;
    leave();
}

void Element::leave() {
    giveUpFocus();
    mLook.visible = false;
    if (mContainer) std::erase(mContainer->mChildren, this);
    mContainer = nullptr;
    mToolkit.strike(*this);
}

const Element& Element::window() const {
    const Element* at = this;
    while (at->mContainer) at = at->mContainer;
    return *at;
}

bool Element::isInside(const Element& other) const {
    for (const Element* at = this; at; at = at->mContainer)
        if (at == &other) return true;
    return false;
}

bool Element::shown() const {
    for (const Element* at = this; at; at = at->mContainer)
        if (!at->mLook.visible) return false;
    return true;
}

bool Element::usable() const {
    for (const Element* at = this; at; at = at->mContainer)
        if (!at->mLook.enabled) return false;
    return true;
}

bool Element::focused() const { return mToolkit.focus() == this; }

void Element::takeFocus() {
    if (!shown() || !usable()) throw errors::invalidProcedureCall();
    if (focused()) return;
    mToolkit.moveFocus(this);
    gotFocus();
}

void Element::setVisible(bool value) {
    mLook.visible = value;
    if (!value) giveUpFocus();
}

void Element::setEnabled(bool value) {
    mLook.enabled = value;
    if (!value) giveUpFocus();
}

void Element::bringToFront() {
    if (!mContainer) return;
    auto& siblings = mContainer->mChildren;
    std::rotate(std::find(siblings.begin(), siblings.end(), this),
                std::find(siblings.begin(), siblings.end(), this) + 1, siblings.end());
}

void Element::giveUpFocus() {
    if (mToolkit.focus() && mToolkit.focus()->isInside(*this)) mToolkit.moveFocus(nullptr);
}

std::string elementName(StringView name, std::int16_t index) {
    return toUtf8(name) + "(" + std::to_string(index) + ")";
}

} // namespace zandor::platform::headless
