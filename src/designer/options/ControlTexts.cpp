#include "designer/options/ControlTexts.h"

#include "designer/options/Languages.h"

#include <QCoreApplication>
#include <QTranslator>

namespace zandor::designer::controlTexts {

namespace {

constexpr Text texts[] = {
    {"LNGJoinForm", QT_TRANSLATE_NOOP("ControlTexts", "Join Definition"),
     QT_TRANSLATE_NOOP("ControlTextUses", "Join dialog: title")},
    {"LNGJoinLeftTable", QT_TRANSLATE_NOOP("ControlTexts", "Left Table:"),
     QT_TRANSLATE_NOOP("ControlTextUses", "Join dialog: left table")},
    {"LNGJoinLeftColumn", QT_TRANSLATE_NOOP("ControlTexts", "Left Column:"),
     QT_TRANSLATE_NOOP("ControlTextUses", "Join dialog: left column")},
    {"LNGJoinRightTable", QT_TRANSLATE_NOOP("ControlTexts", "Right Table:"),
     QT_TRANSLATE_NOOP("ControlTextUses", "Join dialog: right table")},
    {"LNGJoinRightColumn", QT_TRANSLATE_NOOP("ControlTexts", "Right Column:"),
     QT_TRANSLATE_NOOP("ControlTextUses", "Join dialog: right column")},
    {"LNGJoinType", QT_TRANSLATE_NOOP("ControlTexts", "Join Type"),
     QT_TRANSLATE_NOOP("ControlTextUses", "Join dialog: join type")},
    {"LNGJoinTypeNormal", QT_TRANSLATE_NOOP("ControlTexts", "Normal"),
     QT_TRANSLATE_NOOP("ControlTextUses", "Join type: only rows that match")},
    {"LNGJoinTypeLeftOuter", QT_TRANSLATE_NOOP("ControlTexts", "Left Outer"),
     QT_TRANSLATE_NOOP("ControlTextUses", "Join type: all rows of the left table")},
    {"LNGJoinTypeRightOuter", QT_TRANSLATE_NOOP("ControlTexts", "Right Outer"),
     QT_TRANSLATE_NOOP("ControlTextUses", "Join type: all rows of the right table")},
    {"LNGJoinTypeBothOuter", QT_TRANSLATE_NOOP("ControlTexts", "Both Outer"),
     QT_TRANSLATE_NOOP("ControlTextUses", "Join type: all rows of both tables")},
    {"LNGJoinOk", QT_TRANSLATE_NOOP("ControlTexts", "&Ok"),
     QT_TRANSLATE_NOOP("ControlTextUses", "Join dialog: button that takes the changes over")},
    {"LNGJoinCancel", QT_TRANSLATE_NOOP("ControlTexts", "&Cancel"),
     QT_TRANSLATE_NOOP("ControlTextUses", "Join dialog: button that drops the changes")},
    {"LNGMnuShowJoinDef", QT_TRANSLATE_NOOP("ControlTexts", "Show &Join Definition"),
     QT_TRANSLATE_NOOP("ControlTextUses", "Menu: open the join dialog")},
    {"LNGMnuDelJoin", QT_TRANSLATE_NOOP("ControlTexts", "Delete Jo&in"),
     QT_TRANSLATE_NOOP("ControlTextUses", "Menu: delete a join")},
    {"LNGMnuCopyCol", QT_TRANSLATE_NOOP("ControlTexts", "&Copy Column"),
     QT_TRANSLATE_NOOP("ControlTextUses", "Menu: copy the selected columns")},
    {"LNGMnuCreateJoin", QT_TRANSLATE_NOOP("ControlTexts", "C&reate Join"),
     QT_TRANSLATE_NOOP("ControlTextUses", "Menu: join the copied column to the selected one")},
    {"LNGMnuDelTable", QT_TRANSLATE_NOOP("ControlTexts", "Delete &Table"),
     QT_TRANSLATE_NOOP("ControlTextUses", "Menu: take a table out of the query")},
    {"LNGMnuPasteCol", QT_TRANSLATE_NOOP("ControlTexts", "&Paste Column"),
     QT_TRANSLATE_NOOP("ControlTextUses", "Menu: make output columns of the copied columns")},
    {"LNGMnuDelCol", QT_TRANSLATE_NOOP("ControlTexts", "&Delete Column"),
     QT_TRANSLATE_NOOP("ControlTextUses", "Menu: delete an output column")},
    {"LNGSpreadField", QT_TRANSLATE_NOOP("ControlTexts", "Field:"),
     QT_TRANSLATE_NOOP("ControlTextUses", "Grid: the column")},
    {"LNGSpreadSynonym", QT_TRANSLATE_NOOP("ControlTexts", "Synonym:"),
     QT_TRANSLATE_NOOP("ControlTextUses", "Grid: the name that the column comes out under")},
    {"LNGSpreadSort", QT_TRANSLATE_NOOP("ControlTexts", "Sort:"),
     QT_TRANSLATE_NOOP("ControlTextUses", "Grid: sort order")},
    {"LNGSpreadVisible", QT_TRANSLATE_NOOP("ControlTexts", "Visible:"),
     QT_TRANSLATE_NOOP("ControlTextUses", "Grid: whether the column comes out")},
    {"LNGSpreadCriteria", QT_TRANSLATE_NOOP("ControlTexts", "Criteria:"),
     QT_TRANSLATE_NOOP("ControlTextUses", "Grid: the first row of criteria")},
    {"LNGSpreadOr", QT_TRANSLATE_NOOP("ControlTexts", "Or:"),
     QT_TRANSLATE_NOOP("ControlTextUses", "Grid: further rows of criteria")},
};

constexpr Language known[] = {
    {"en", u"English"}, {"de", u"Deutsch"}, {"fr", u"Fran\u00e7ais"}, {"es", u"Espa\u00f1ol"}};

} // namespace

std::span<const Text> all() { return texts; }

QString useOf(const QString& property) {
    for (const Text& text : texts)
        if (property == QLatin1String(text.property))
            return QCoreApplication::translate("ControlTextUses", text.use);
    return property;
}

QString own(const Text& text) { return QCoreApplication::translate("ControlTexts", text.english); }

std::span<const Language> languages() { return known; }

QString inLanguage(const Text& text, const char* code) {
    QTranslator translator;
    if (!loadCatalogue(translator, QLocale(QString::fromLatin1(code))))
        return QString::fromLatin1(text.english);
    const QString translated = translator.translate("ControlTexts", text.english);
    return translated.isEmpty() ? QString::fromLatin1(text.english) : translated;
}

} // namespace zandor::designer::controlTexts
