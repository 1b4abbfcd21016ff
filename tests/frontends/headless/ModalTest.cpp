#include "frontends/headless/Bench.h"

using namespace zandor;

namespace {

struct Menu : Bench {
    std::string log;
    std::unique_ptr<platform::PopupMenu> menu =
        toolkit.makePopupMenu({.Name = u"mnuZandor"}, [this] { log += "opens "; });
    std::unique_ptr<platform::MenuEntry> copy = entry(u"mnuCopy", u"&Copy");
    std::unique_ptr<platform::MenuEntry> line = entry(u"mnuSep", u"-");
    std::unique_ptr<platform::MenuEntry> paste = entry(u"mnuPaste", u"&Paste");

    std::unique_ptr<platform::MenuEntry> entry(platform::StringView name,
                                               platform::StringView caption,
                                               const platform::MenuEntry* before = nullptr) {
        return menu->makeEntry(
            {.Name = name, .Caption = caption},
            [this, called = platform::toUtf8(name)] {
                EXPECT_FALSE(toolkit.menuOpen());
                log += called + " ";
            },
            before);
    }
    void choose(const std::string& name) {
        toolkit.onMenu = [this, name](const headless::PopupMenu&) {
            EXPECT_TRUE(toolkit.menuOpen());
            log += "asks ";
            return name;
        };
        menu->PopupMenuAtMouse();
    }
};

TEST(APopupMenu, FiresItsOwnClickAndThenTheChosenEntry) {
    Menu m;
    m.choose("mnuPaste");
    EXPECT_EQ(m.log, "opens asks mnuPaste ");
}

TEST(APopupMenu, IsDismissedWhenNobodyChooses) {
    Menu m;
    m.menu->PopupMenuAtMouse();
    m.choose("");
    EXPECT_EQ(m.log, "opens opens asks ");
}

TEST(APopupMenu, LetsOnlyEnabledAndVisibleEntriesBeChosen) {
    Menu m;
    m.copy->Enabled(false);
    m.paste->Visible(false);
    for (const char* name : {"mnuCopy", "mnuPaste", "mnuSep"}) m.choose(name);
    EXPECT_EQ(m.log, "opens asks opens asks opens asks ");
    EXPECT_THROW(m.choose("mnuNone"), std::logic_error);
}

TEST(APopupMenu, ShowsItsEntriesInTheOrderOfTheirMakingUnlessOneIsToStandBeforeAnother) {
    Menu m;
    m.copy->Caption(u"Kopieren");
    EXPECT_EQ(m.look<headless::PopupMenu>("mnuZandor").entries(),
              (std::vector<std::string>{"mnuCopy", "mnuSep", "mnuPaste"}));
    const auto move = m.entry(u"mnuMove", u"&Move", m.line.get());
    EXPECT_EQ(m.look<headless::PopupMenu>("mnuZandor").entries(),
              (std::vector<std::string>{"mnuCopy", "mnuMove", "mnuSep", "mnuPaste"}));
    EXPECT_EQ(m.look<headless::MenuEntry>("mnuCopy").look().text, u"Kopieren");
}

struct Dialogs : Bench {
    int closes = 0;
    std::unique_ptr<platform::Dialog> dialog;
    std::unique_ptr<platform::CommandButton> ok, behind;
    std::unique_ptr<platform::TextBox> inside;

    Dialogs() {
        dialog = toolkit.makeDialog({.Name = u"frmJoin"}, {.Close = [this] {
                                        ++closes;
                                        dialog->Hide();
                                    }});
        ok = toolkit.makeCommandButton({.Name = u"cmdOk", .Container = dialog.get()},
                                       {.Click = [this] { dialog->Hide(); }, .GotFocus = {}});
        inside = toolkit.makeTextBox({.Name = u"txtIn", .Container = dialog.get()}, {});
        behind = toolkit.makeCommandButton({.Name = u"cmdHome"}, {});
    }
};

TEST(ADialog, ReturnsWhenTheUserHasHiddenIt) {
    Dialogs d;
    d.toolkit.onDialog = [&](headless::Dialog& open) {
        EXPECT_EQ(open.name(), "frmJoin");
        EXPECT_TRUE(open.shown());
        d.user.clickButton("cmdOk");
    };
    EXPECT_FALSE(d.look<headless::Dialog>("frmJoin").shown());
    d.dialog->ShowModal();
    EXPECT_FALSE(d.look<headless::Dialog>("frmJoin").shown());
    EXPECT_EQ(d.closes, 0);
}

TEST(ADialog, IsClosedByItsFrameWhenTheUserDoesNothingElse) {
    Dialogs d;
    d.dialog->ShowModal();
    EXPECT_EQ(d.closes, 1);
}

TEST(ADialog, IsClosedByEscape) {
    Dialogs d;
    d.toolkit.onDialog = [&](headless::Dialog&) { d.user.key("txtIn", platform::keyEscape); };
    d.dialog->ShowModal();
    EXPECT_EQ(d.closes, 1);
}

TEST(ADialog, KeepsTheUserFromEverythingBehindIt) {
    Dialogs d;
    d.toolkit.onDialog = [&](headless::Dialog&) {
        EXPECT_THROW(d.user.clickButton("cmdHome"), std::logic_error);
    };
    d.dialog->ShowModal();
    d.user.clickButton("cmdHome");
}

TEST(ADialog, GivesTheFocusBack) {
    Dialogs d;
    d.user.focus("cmdHome");
    d.toolkit.onDialog = [&](headless::Dialog&) { d.user.focus("txtIn"); };
    d.dialog->ShowModal();
    EXPECT_TRUE(d.look<headless::CommandButton>("cmdHome").focused());
}

TEST(ADialog, ThatStaysOpenWhenItIsClosedIsAnError) {
    Bench bench;
    auto stubborn = bench.toolkit.makeDialog({.Name = u"frmStubborn"}, {});
    EXPECT_THROW(stubborn->ShowModal(), std::logic_error);
}

TEST(AMessageBox, IsKeptWithItsStyleAndTitle) {
    Bench bench;
    int seen = 0;
    bench.toolkit.onBox = [&](const headless::MessageBox& box) { seen = box.style; };
    bench.toolkit.MsgBox(u"text", platform::styleSystemModal, u"title");
    EXPECT_EQ(bench.toolkit.boxes(),
              (std::vector<headless::MessageBox>{{u"text", platform::styleSystemModal, u"title"}}));
    EXPECT_EQ(seen, platform::styleSystemModal);
}

} // namespace
