#include "support/Stage.h"
#include "support/StageEvents.h"

#include <Zandor/headless/User.h>

#include <gtest/gtest.h>

#include <optional>

using namespace zandor;

namespace {

namespace headless = platform::headless;

std::string tableName(std::int16_t index) { return headless::elementName(u"lstTable", index); }

/// The control's events on their way to the host.
class Passing final : public TalvikDBxZandor::ZandorEvents {
public:
    Passing(headless::Toolkit& toolkit, TalvikDBxZandor::ZandorEvents& host)
        : mToolkit(toolkit), mHost(host) {}
    void Raise(TalvikDBxZandor::Event event,
               const TalvikDBxZandor::EventArguments& arguments) override {
        if (mToolkit.comforts.raised(event, arguments)) mHost.Raise(event, arguments);
    }

private:
    headless::Toolkit& mToolkit;
    TalvikDBxZandor::ZandorEvents& mHost;
};

class HeadlessStage final : public Stage {
public:
    explicit HeadlessStage(TalvikZandorLib::Library& library) : mUser(mToolkit), mEvents(*this) {
        mToolkit.surface().resize(12000, 9000);
        mToolkit.onBox = [this](const headless::MessageBox& box) {
            boxes.push_back({box.prompt, box.title, box.style});
            transcript.push_back("box:" + platform::toUtf8(box.prompt));
        };
        mToolkit.onMessage = [this](const headless::WindowMessage& message) {
            messages.push_back({message.name, message.wParam, message.menuOpen});
            transcript.push_back("message:" + std::to_string(message.wParam));
        };
        mToolkit.onMenu = [this](const headless::PopupMenu& menu) { return chooseFrom(menu); };
        mToolkit.onDialog = [this](headless::Dialog&) {
            transcript.push_back("dialog");
            if (onDialog) onDialog();
        };
        mUser.onHeld = [this] {
            if (onHeld) onHeld();
        };
        mHouse = std::make_shared<House>();
        mHouse->control.emplace(mToolkit, library, mPassing, mHouse);
        mControl = &*mHouse->control;
        mToolkit.comforts.attach(*mControl);
        mToolkit.onPaint = [this] { mControl->UserControl_Paint(); };
        mToolkit.onResize = [this] { mControl->UserControl_Resize(); };
        mToolkit.onResize();
        mToolkit.onPaint();
    }

    ~HeadlessStage() override { closeControl(); }

    TalvikDBxZandor::Zandor& control() override { return *mControl; }
    platform::Toolkit& toolkit() override { return mToolkit; }
    comforts::Comforts& comforts() override { return mToolkit.comforts; }
    void closeControl() override {
        mToolkit.onPaint = nullptr;
        mToolkit.onResize = nullptr;
        if (!mControl) return;
        mControl->End();
        mControl = nullptr;
        mToolkit.close();
        mToolkit.comforts.detach();
        mHouse.reset();
    }

    bool exists(const std::string& name) override { return mToolkit.exists(name); }

    Seen look(const std::string& name) override {
        if (!exists(name)) {
            ADD_FAILURE() << "there is no " << name;
            return {};
        }
        const headless::Object& object = mToolkit.find(name);
        Seen seen;
        seen.text = object.look().text;
        seen.font = object.look().font.Name;
        seen.visible = object.look().visible;
        seen.enabled = object.look().enabled;
        if (const auto* element = dynamic_cast<const headless::Element*>(&object))
            lookAt(*element, seen);
        lookAtKind(object, seen);
        return seen;
    }

    String cell(std::int32_t row, std::int32_t col) override {
        return mToolkit.find<headless::Grid>("sprColumn").cell(row, col).text;
    }

    void resizeControl(float width, float height) override { mUser.resizeControl(width, height); }
    void repaint() override { mUser.repaint(); }
    void clickButton(const std::string& name) override { mUser.clickButton(name); }
    void focus(const std::string& name) override { mUser.focus(name); }
    void scrollBarTo(const std::string& name, std::int16_t value) override {
        mUser.scrollBarTo(name, value);
    }
    void moveTable(std::int16_t index, float left, float top) override {
        mUser.moveTable(tableName(index), left, top);
    }
    void resizeTable(std::int16_t index, float width, float height) override {
        mUser.resizeTable(tableName(index), width, height);
    }
    void closeTable(std::int16_t index) override { mUser.closeTable(tableName(index)); }
    void scrollList(std::int16_t index, std::int32_t firstEntry) override {
        mUser.scrollList(tableName(index), firstEntry);
    }
    void scrollGrid(std::int32_t topRow, std::int32_t leftCol) override {
        mUser.scrollGrid("sprColumn", topRow, leftCol);
    }
    void selectEntries(std::int16_t index, const std::vector<std::int32_t>& entries) override {
        mUser.selectEntries(tableName(index), entries);
    }
    void pressEntry(std::int16_t index, std::int32_t entry, std::int16_t button) override {
        mUser.pressEntry(tableName(index), entry, button);
    }
    void releaseEntry(std::int16_t index, std::int32_t entry, std::int16_t button) override {
        mUser.releaseEntry(tableName(index), entry, button);
    }
    void moveOverEntry(std::int16_t index, std::int32_t entry, std::int16_t button) override {
        mUser.moveOverEntry(tableName(index), entry, button);
    }
    void doubleClickEntry(std::int16_t index, std::int32_t entry) override {
        mUser.doubleClickEntry(tableName(index), entry);
    }
    void dragToEntry(std::int16_t from, std::int32_t entry, std::int16_t to,
                     std::int32_t target) override {
        mUser.dragToEntry(tableName(from), entry, tableName(to), target);
    }
    void dragAcross(std::int16_t from, std::int32_t entry, std::int16_t across, std::int32_t passed,
                    std::int32_t row, std::int32_t col) override {
        mUser.dragAcross(tableName(from), entry, tableName(across), passed, "sprColumn", row, col);
    }
    void dragToCell(std::int16_t from, std::int32_t entry, std::int32_t row,
                    std::int32_t col) override {
        mUser.dragToCell(tableName(from), entry, "sprColumn", row, col);
    }
    void pressCanvas(std::int16_t button, float x, float y) override {
        mUser.pressFrame("fraTable", button, x, y);
    }
    void releaseCanvas(std::int16_t button, float x, float y) override {
        mUser.releaseFrame("fraTable", button, x, y);
    }
    void pressCell(std::int16_t button, std::int32_t row, std::int32_t col) override {
        mUser.pressCell("sprColumn", button, row, col);
    }
    void releaseCell(std::int16_t button, std::int32_t row, std::int32_t col) override {
        mUser.releaseCell("sprColumn", button, row, col);
    }
    void type(const std::string& name, const String& text) override { mUser.type(name, text); }
    void choose(const std::string& name, std::int16_t listIndex) override {
        mUser.choose(name, listIndex);
    }
    void pick(const std::string& name, std::int16_t listIndex) override {
        mUser.pick(name, listIndex);
    }
    void key(const std::string& name, std::int16_t keyCode, std::int16_t shift) override {
        mUser.key(name, keyCode, shift);
    }
    void typeInGrid(const String& text) override { mUser.typeInGrid("sprColumn", text); }
    void pickField(const String& text) override { mUser.pickItem("lstFields", text); }
    void clickField(std::int32_t col) override { mUser.clickField("sprColumn", col); }
    void dragField(std::int32_t col, std::int32_t to) override {
        mUser.dragField("sprColumn", col, to);
    }
    void dragBorder(std::int32_t col, float width) override {
        mUser.dragBorder("sprColumn", col, width);
    }
    void editCell() override { mUser.editCell("sprColumn"); }
    void moveCurrentColumn(std::int32_t step) override {
        mUser.moveCurrentColumn("sprColumn", step);
    }
    String note(std::int32_t row, std::int32_t col) override {
        return mToolkit.find<headless::Grid>("sprColumn").cell(row, col).note;
    }
    void leaveControl() override { mUser.leaveControl(); }

private:
    std::string chooseFrom(const headless::PopupMenu& menu) {
        transcript.push_back("menu");
        if (!onMenu) return {};
        std::vector<Entry> entries;
        for (const std::string& name : menu.entries()) {
            const headless::Look& look = mToolkit.find(name).look();
            entries.push_back({platform::fromUtf8(name), look.text, look.enabled, look.visible});
        }
        return platform::toUtf8(onMenu(entries));
    }

    static void lookAt(const headless::Element& element, Seen& seen) {
        seen.bounds = element.placement();
        seen.visible = element.shown();
        seen.enabled = element.usable();
        seen.focused = element.focused();
    }

    static void lookAtKind(const headless::Object& object, Seen& seen) {
        if (const auto* bar = dynamic_cast<const headless::ScrollBar*>(&object)) {
            seen.value = bar->value();
            seen.max = bar->max();
            seen.largeChange = bar->largeChange();
        } else if (const auto* combo = dynamic_cast<const headless::ComboBox*>(&object)) {
            seen.listIndex = combo->chosen();
            seen.dropped = combo->dropped();
            seen.items = combo->items();
        } else if (const auto* line = dynamic_cast<const headless::Line*>(&object)) {
            seen.X1 = line->ends().X1;
            seen.Y1 = line->ends().Y1;
            seen.X2 = line->ends().X2;
            seen.Y2 = line->ends().Y2;
            seen.borderWidth = line->borderWidth();
        } else if (const auto* shape = dynamic_cast<const headless::Shape*>(&object)) {
            seen.shape = shape->style();
        } else if (const auto* list = dynamic_cast<const headless::PickList*>(&object)) {
            seen.items = list->items();
        } else if (const auto* table = dynamic_cast<const headless::Tabulet*>(&object)) {
            for (std::size_t i = 1; i <= table->entries().size(); ++i) {
                const auto& entry = table->entry(static_cast<std::int32_t>(i));
                seen.items.push_back(entry.text());
                if (entry.selected()) seen.selected.push_back(entry.text());
                if (entry.comesOut()) seen.output.push_back(entry.text());
                if (entry.picture() == platform::Picture::key) seen.keys.push_back(entry.text());
            }
        }
    }

    headless::Toolkit mToolkit;
    headless::User mUser;
    StageEvents mEvents;
    Passing mPassing{mToolkit, mEvents};

    /// What a procedure of the control keeps while it runs.
    struct House {
        std::optional<TalvikDBxZandor::Zandor> control;
    };
    std::shared_ptr<House> mHouse;
    TalvikDBxZandor::Zandor* mControl = nullptr;
};

} // namespace

std::unique_ptr<Stage> Stage::open(TalvikZandorLib::Library& library) {
    return std::make_unique<HeadlessStage>(library);
}
