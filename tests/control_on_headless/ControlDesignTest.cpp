#include "control/ShellFixture.h"

#include <Zandor/headless/Toolkit.h>

using namespace zandor;

namespace {

class TheDesign : public AControl {
protected:
    platform::headless::Toolkit& headless() {
        return dynamic_cast<platform::headless::Toolkit&>(toolkit());
    }
    std::string containerOf(const std::string& name) {
        const auto* container = headless().find<platform::headless::Element>(name).container();
        return container ? container->name() : "";
    }
};

} // namespace

TEST_F(TheDesign, GivesEachControlItsFont) {
    struct Row {
        const char* name;
        StringView font;
    };
    const Row rows[] = {
        {"fraTable", u"Arial"},
        {"lstTable(0)", u"MS Sans Serif"},
        {"cmdHome", u"MS Sans Serif"},
        {"sprColumn", u"Comic Sans MS"},
        {"fraSortOrder", u"MS Sans Serif"},
        {"fraSortOrder2", u"Arial"},
        {"cobSortOrder", u"Arial"},
        {"cmdSetSortOrder", u"Arial"},
        {"fraVisibility", u"MS Sans Serif"},
        {"fraVisibility2", u"Arial"},
        {"cobVisibility", u"Arial"},
        {"cmdSetVisibility", u"Arial"},
        {"fraValue", u"MS Sans Serif"},
        {"fraValue2", u"Arial"},
        {"txtValue", u"Arial"},
        {"cmdSetTextValue", u"MS Sans Serif"},
    };
    for (const Row& row : rows) EXPECT_EQ(look(row.name).font, row.font) << row.name;
}

TEST_F(TheDesign, PutsTheTablesAndTheJoinsIntoTheCanvas) {
    auto model = library.newModel();
    auto table = model->table(u"ORDERS", {u"ID", u"PARENT"});
    model->join(table, u"ID", table, u"PARENT");
    bind(model);
    for (const char* name :
         {"lstTable(0)", "lstTable(1)", "linJoin(1)", "shpJoin(1)", "shpJoin(2)"})
        EXPECT_EQ(containerOf(name), "fraTable") << name;
}

TEST_F(TheDesign, HasAKeyAsTheFirstImageForTheTables) {
    using platform::Picture;
    const auto& images = headless().find<platform::headless::ImageList>("imgListTabulet");
    EXPECT_EQ(images.pictures(), std::vector<Picture>{Picture::key});
}

TEST_F(TheDesign, CaptionsTheCanvas) { EXPECT_EQ(look("fraTable").text, u"Frame1"); }

TEST_F(TheDesign, PutsTheOtherPartsOntoItsOwnSurface) {
    for (const char* name : {"fraTable", "hsbTable", "vsbTable", "cmdHome", "sprColumn",
                             "fraSortOrder", "fraVisibility", "fraValue"})
        EXPECT_EQ(containerOf(name), "UserControl") << name;
}
