#include <Zandor/Zandor.h>

// The control's parts and their design-time settings, each wired to its handlers.

namespace TalvikDBxZandor {

using platform::Orientation;

namespace {

constexpr platform::StringView arial = u"Arial";
constexpr platform::StringView sansSerif = u"MS Sans Serif";
constexpr platform::StringView comicSans = u"Comic Sans MS";

// Fixed when the control is designed: one label column and 255 definitions.
constexpr std::int32_t gridRows = 12;
constexpr std::int32_t gridCols = 256;

} // namespace

Zandor::Zandor(platform::Toolkit& toolkit, TalvikZandorLib::Library& library, ZandorEvents& events,
               std::weak_ptr<void> keeper)
    : mLife(toolkit, std::move(keeper)), mToolkit(mLife, &toolkit), mLibrary(mLife, &library),
      mEvents(mLife, &events), mTableEvents(TableEvents()),
      fraTable(mLife,
               toolkit.makeFrame({.Name = u"fraTable", .FontName = arial, .Caption = u"Frame1"},
                                 {.MouseDown = [this](auto... a) { fraTable_MouseDown(a...); },
                                  .MouseUp = [this](auto... a) { fraTable_MouseUp(a...); }})),
      linJoin(mLife,
              [this](std::int16_t index, const platform::Line*) {
                  return mToolkit->makeLine({.Name = u"linJoin", .Container = fraTable.get()},
                                            index);
              }),
      shpJoin(mLife,
              [this](std::int16_t index, const platform::Shape*) {
                  return mToolkit->makeShape({.Name = u"shpJoin", .Container = fraTable.get()},
                                             index);
              }),
      imgListTabulet(mLife,
                     toolkit.makeImageList({.Name = u"imgListTabulet"}, {platform::Picture::key})),
      lstTable(mLife,
               [this](std::int16_t index, const Tabulet* pattern) {
                   return mToolkit->makeTabulet(
                       {.Name = u"lstTable", .FontName = sansSerif, .Container = fraTable.get()},
                       index, pattern, mTableEvents);
               }),
      sprColumn(mLife,
                toolkit.makeGrid({.Name = u"sprColumn", .FontName = comicSans}, gridRows, gridCols,
                                 {.MouseDown = [this](auto... a) { sprColumn_MouseDown(a...); },
                                  .MouseUp = [this](auto... a) { sprColumn_MouseUp(a...); },
                                  .DragDrop = [this](auto... a) { sprColumn_DragDrop(a...); },
                                  .Scroll = [this] { sprColumn_Scroll(); }})),
      hsbTable(mLife, toolkit.makeScrollBar({.Name = u"hsbTable"}, Orientation::horizontal,
                                            {.Change = [this] { hsbTable_Change(); },
                                             .GotFocus = [this] { hsbTable_GotFocus(); }})),
      vsbTable(mLife, toolkit.makeScrollBar({.Name = u"vsbTable"}, Orientation::vertical,
                                            {.Change = [this] { vsbTable_Change(); },
                                             .GotFocus = [this] { vsbTable_GotFocus(); }})),
      cmdHome(mLife, toolkit.makeCommandButton({.Name = u"cmdHome", .FontName = sansSerif},
                                               {.Click = [this] { cmdHome_Click(); },
                                                .GotFocus = [this] { cmdHome_GotFocus(); }})),
      fraSortOrder(mLife, toolkit.makeFrame({.Name = u"fraSortOrder", .FontName = sansSerif}, {})),
      fraSortOrder2(
          mLife,
          toolkit.makeFrame(
              {.Name = u"fraSortOrder2", .FontName = arial, .Container = fraSortOrder.get()}, {})),
      cobSortOrder(
          mLife, toolkit.makeComboBox(
                     {.Name = u"cobSortOrder", .FontName = arial, .Container = fraSortOrder2.get()},
                     {mWords.None, mWords.Ascending, mWords.Descending},
                     [this](auto... a) { cobSortOrder_KeyDown(a...); })),
      cmdSetSortOrder(mLife, toolkit.makeCommandButton(
                                 {.Name = u"cmdSetSortOrder",
                                  .FontName = arial,
                                  .Caption = mWords.Set,
                                  .Container = fraSortOrder2.get()},
                                 {.Click = [this] { cmdSetSortOrder_Click(); }, .GotFocus = {}})),
      fraVisibility(mLife,
                    toolkit.makeFrame({.Name = u"fraVisibility", .FontName = sansSerif}, {})),
      fraVisibility2(mLife, toolkit.makeFrame({.Name = u"fraVisibility2",
                                               .FontName = arial,
                                               .Container = fraVisibility.get()},
                                              {})),
      cobVisibility(
          mLife,
          toolkit.makeComboBox(
              {.Name = u"cobVisibility", .FontName = arial, .Container = fraVisibility2.get()},
              {mWords.Visible, mWords.NotVisible},
              [this](auto... a) { cobVisibility_KeyDown(a...); })),
      cmdSetVisibility(mLife, toolkit.makeCommandButton(
                                  {.Name = u"cmdSetVisibility",
                                   .FontName = arial,
                                   .Caption = mWords.Set,
                                   .Container = fraVisibility2.get()},
                                  {.Click = [this] { cmdSetVisibility_Click(); }, .GotFocus = {}})),
      fraValue(mLife, toolkit.makeFrame({.Name = u"fraValue", .FontName = sansSerif}, {})),
      fraValue2(mLife,
                toolkit.makeFrame(
                    {.Name = u"fraValue2", .FontName = arial, .Container = fraValue.get()}, {})),
      txtValue(mLife, toolkit.makeTextBox(
                          {.Name = u"txtValue", .FontName = arial, .Container = fraValue2.get()},
                          [this](auto... a) { txtValue_KeyDown(a...); })),
      cmdSetTextValue(mLife, toolkit.makeCommandButton(
                                 {.Name = u"cmdSetTextValue",
                                  .FontName = sansSerif,
                                  .Caption = mWords.Set,
                                  .Container = fraValue2.get()},
                                 {.Click = [this] { cmdSetTextValue_Click(); }, .GotFocus = {}})),
      mnuZandor(mLife,
                toolkit.makePopupMenu({.Name = u"mnuZandor"}, [this] { mnuZandor_Click(); })) {
    lstTable(0)->Images(imgListTabulet);
    MakeMenu();
    UserControl_Initialize();
}

Zandor::~Zandor() { End(); }

TalvikTabulet::TabuletEvents Zandor::TableEvents() {
    return {.CloseClick = [this](auto... a) { lstTable_CloseClick(a...); },
            .GotFocus = [this](auto... a) { lstTable_GotFocus(a...); },
            .ColumnMouseDown = [this](auto&&... a) { lstTable_ColumnMouseDown(a...); },
            .ColumnMouseMove = [this](auto&&... a) { lstTable_ColumnMouseMove(a...); },
            .ColumnMouseUp = [this](auto&&... a) { lstTable_ColumnMouseUp(a...); },
            .SelectionChanged = [this](auto... a) { lstTable_SelectionChanged(a...); },
            .DragOver = [this](auto... a) { lstTable_DragOver(a...); },
            .DragDrop = [this](auto... a) { lstTable_DragDrop(a...); },
            .Moving = [this](auto... a) { lstTable_Moving(a...); },
            .Moved = [this](auto... a) { lstTable_Moved(a...); },
            .Resized = [this](auto... a) { lstTable_Resized(a...); },
            .Scroll = [this](auto... a) { lstTable_Scroll(a...); }};
}

void Zandor::MakeMenu() {
    const auto entry = [this](platform::StringView name, platform::StringView caption,
                              void (Zandor::*click)()) {
        return Part<platform::MenuEntry>(mLife, mnuZandor->makeEntry(
                                                    {.Name = name, .Caption = caption},
                                                    [this, click] {
                                                        if (click) (this->*click)();
                                                    },
                                                    nullptr));
    };
    mnuJoinShowDefinition = entry(u"mnuJoinShowDefinition", u"Show &Join Definition",
                                  &Zandor::mnuJoinShowDefinition_Click);
    mnuJoinDelete = entry(u"mnuJoinDelete", u"&Delete Join", &Zandor::mnuJoinDelete_Click);
    mnuJoinSep = entry(u"mnuJoinSep", u"-", nullptr);
    mnuTableDefinitionCopy =
        entry(u"mnuTableDefinitionCopy", u"&Copy Column", &Zandor::mnuTableDefinitionCopy_Click);
    mnuTableDefinitionPaste =
        entry(u"mnuTableDefinitionPaste", u"&Create Join", &Zandor::mnuTableDefinitionPaste_Click);
    mnuTableDefinitionDelete = entry(u"mnuTableDefinitionDelete", u"&Delete Table",
                                     &Zandor::mnuTableDefinitionDelete_Click);
    mnuTableDefinitionSep = entry(u"mnuTableDefinitionSep", u"-", nullptr);
    mnuColumnDefinitionPaste = entry(u"mnuColumnDefinitionPaste", u"&Paste Column",
                                     &Zandor::mnuColumnDefinitionPaste_Click);
    mnuColumnDefinitionDelete = entry(u"mnuColumnDefinitionDelete", u"&Delete Column",
                                      &Zandor::mnuColumnDefinitionDelete_Click);
}

} // namespace TalvikDBxZandor
