#include <Zandor/headless/Toolkit.h>

#include <algorithm>
#include <utility>

namespace zandor::platform::headless {

namespace {

constexpr float unitWidth = 90;                   // of one UTF-16 unit
constexpr std::uint32_t firstRegistered = 0xC000; // where registered messages begin

/// The design of one element of a control array.
struct ElementDesign {
    ElementDesign(const Design& array, std::int16_t index)
        : name(fromUtf8(elementName(array.Name, index))), design(array) {
        design.Name = name;
    }

    String name;
    Design design;
};

} // namespace

Surface::Surface(Toolkit& toolkit) : Element(toolkit, Design{u"UserControl"}, nullptr) {
    resize(4800, 3600);
}

Toolkit::Toolkit() : mSurface(*this) {}

Toolkit::~Toolkit() = default;

void Toolkit::called(const char* member) const {
    if (Faults& heard = const_cast<Toolkit*>(this)->faults; heard.listening()) heard.pass(member);
}

Element* Toolkit::containerOf(const Design& design) {
    if (!design.Container) return &mSurface;
    if (auto* element = dynamic_cast<Element*>(design.Container)) return element;
    throw errors::invalidProcedureCall();
}

Object& Toolkit::find(const std::string& name) const {
    const auto at = mObjects.find(name);
    if (at == mObjects.end()) throw std::logic_error("there is no " + name);
    return *at->second;
}

void Toolkit::MsgBox(const String& prompt, std::int32_t style, const String& title) {
    called("MsgBox");
    const MessageBox box{prompt, style, title};
    mBoxes.push_back(box);
    if (onBox) onBox(box);
}

std::unique_ptr<platform::Frame> Toolkit::makeFrame(const Design& design, FrameEvents events) {
    called("makeFrame");
    return std::make_unique<Frame>(*this, design, containerOf(design), std::move(events));
}

std::unique_ptr<platform::CommandButton> Toolkit::makeCommandButton(const Design& design,
                                                                    CommandButtonEvents events) {
    called("makeCommandButton");
    return std::make_unique<CommandButton>(*this, design, containerOf(design), std::move(events));
}

std::unique_ptr<platform::ComboBox>
Toolkit::makeComboBox(const Design& design, const std::vector<String>& items, KeyEvent KeyDown) {
    called("makeComboBox");
    return std::make_unique<ComboBox>(*this, design, containerOf(design), items,
                                      std::move(KeyDown));
}

std::unique_ptr<platform::TextBox> Toolkit::makeTextBox(const Design& design, KeyEvent KeyDown) {
    called("makeTextBox");
    return std::make_unique<TextBox>(*this, design, containerOf(design), std::move(KeyDown));
}

std::unique_ptr<platform::Label> Toolkit::makeLabel(const Design& design) {
    called("makeLabel");
    return std::make_unique<Label>(*this, design, containerOf(design));
}

std::unique_ptr<platform::ScrollBar>
Toolkit::makeScrollBar(const Design& design, Orientation orientation, ScrollBarEvents events) {
    called("makeScrollBar");
    return std::make_unique<ScrollBar>(*this, design, containerOf(design), orientation,
                                       std::move(events));
}

std::unique_ptr<MSFlexGridLib::MSFlexGrid> Toolkit::makeGrid(const Design& design,
                                                             std::int32_t rows, std::int32_t cols,
                                                             MSFlexGridLib::GridEvents events) {
    called("makeGrid");
    return std::make_unique<Grid>(*this, design, containerOf(design), rows, cols,
                                  std::move(events));
}

std::unique_ptr<platform::PopupMenu> Toolkit::makePopupMenu(const Design& design,
                                                            PlainEvent Click) {
    called("makePopupMenu");
    return std::make_unique<PopupMenu>(*this, design, std::move(Click));
}

std::unique_ptr<platform::Dialog> Toolkit::makeDialog(const Design& design, DialogEvents events) {
    called("makeDialog");
    return std::make_unique<Dialog>(*this, design, std::move(events));
}

std::unique_ptr<platform::PickList> Toolkit::makePickList(const Design& design,
                                                          PickListEvents events) {
    called("makePickList");
    return std::make_unique<PickList>(*this, design, containerOf(design), std::move(events));
}

Ref<platform::ImageList> Toolkit::makeImageList(const Design& design,
                                                const std::vector<Picture>& pictures) {
    called("makeImageList");
    return makeRef<ImageList>(*this, design, pictures);
}

Ref<TalvikTabulet::Tabulet> Toolkit::makeTabulet(const Design& design, std::int16_t index,
                                                 const TalvikTabulet::Tabulet* pattern,
                                                 const TalvikTabulet::TabuletEvents& events) {
    called("makeTabulet");
    const ElementDesign element(design, index);
    Element* container = containerOf(design);
    auto table = makeRef<Tabulet>(*this, element.design, container, index, events);
    if (pattern) table->takeLookOf(dynamic_cast<const Tabulet&>(*pattern));
    return std::shared_ptr<TalvikTabulet::Tabulet>(table);
}

Ref<platform::Line> Toolkit::makeLine(const Design& design, std::int16_t index) {
    called("makeLine");
    const ElementDesign element(design, index);
    return std::make_shared<Line>(*this, element.design, containerOf(design));
}

Ref<platform::Shape> Toolkit::makeShape(const Design& design, std::int16_t index) {
    called("makeShape");
    const ElementDesign element(design, index);
    return std::make_shared<Shape>(*this, element.design, containerOf(design));
}

platform::Font Toolkit::AmbientFont() const {
    called("AmbientFont");
    return ambientFont;
}

platform::Font Toolkit::ControlFont() const {
    called("ControlFont");
    return controlFont;
}

float Toolkit::TextWidth(const String& text) const {
    called("TextWidth");
    return unitWidth * static_cast<float>(text.size());
}

float Toolkit::ScaleWidth() const {
    called("ScaleWidth");
    return mSurface.placement().Width;
}

float Toolkit::ScaleHeight() const {
    called("ScaleHeight");
    return mSurface.placement().Height;
}

std::uint32_t Toolkit::RegisterWindowMessage(const String& name) {
    called("RegisterWindowMessage");
    if (registrationFails) return 0;
    auto at = std::find(mRegistered.begin(), mRegistered.end(), name);
    if (at == mRegistered.end()) at = mRegistered.insert(mRegistered.end(), name);
    return firstRegistered + static_cast<std::uint32_t>(at - mRegistered.begin());
}

void Toolkit::SendMessage(std::uint32_t message, std::uintptr_t wParam, std::int32_t* lParam) {
    called("SendMessage");
    WindowMessage sent;
    if (message >= firstRegistered && message - firstRegistered < mRegistered.size())
        sent.name = mRegistered[message - firstRegistered];
    sent.wParam = wParam;
    sent.menuOpen = mMenuOpen;
    sent.hasLParam = lParam != nullptr;
    mMessages.push_back(sent);
    if (onMessage) onMessage(sent);
}

void Toolkit::enrol(Object& object) { mObjects[object.name()] = &object; }

void Toolkit::strike(Object& object) {
    const auto at = mObjects.find(object.name());
    if (at != mObjects.end() && at->second == &object) mObjects.erase(at);
}

void Toolkit::moveFocus(Element* element) {
    Element* const before = std::exchange(mFocus, element);
    if (before && before != element) before->lostFocus();
}

void Toolkit::endDragOf(const Tabulet* table) {
    if (mDragged == table) mDragged = nullptr;
}

void Toolkit::close() {
    mClosed = true;
    for (Dialog* dialog : mDialogs) dialog->dismiss();
    mSurface.hide();
}

std::string Toolkit::openMenu(const PopupMenu& menu) {
    struct Open {
        explicit Open(bool& flag) : flag(flag) { flag = true; }
        ~Open() { flag = false; }
        bool& flag;
    } const open(mMenuOpen);
    return onMenu && !mClosed ? onMenu(menu) : std::string();
}

void Toolkit::runModal(Dialog& dialog) {
    // Only what is in the dialog can have the focus while it is open.
    Element* const before = mFocus;
    const std::string nameBefore = before ? before->name() : std::string();
    mFocus = nullptr;
    struct Open {
        Open(std::vector<Dialog*>& dialogs, Dialog& dialog) : dialogs(dialogs) {
            dialogs.push_back(&dialog);
        }
        ~Open() { dialogs.pop_back(); }
        std::vector<Dialog*>& dialogs;
    } const open(mDialogs, dialog);

    if (mClosed) dialog.dismiss();
    if (onDialog && !mClosed) onDialog(dialog);
    if (dialog.shown()) dialog.close();

    // The window behind is active again, with the focus where it was and no event of it.
    const auto still = mObjects.find(nameBefore);
    const bool back = before && still != mObjects.end() && still->second == before &&
                      before->shown() && before->usable();
    mFocus = back ? before : nullptr;
}

} // namespace zandor::platform::headless
