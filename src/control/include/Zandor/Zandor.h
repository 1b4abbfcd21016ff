#pragma once

#include <Zandor/Questions.h>
#include <Zandor/TalvikZandorLib.h>
#include <Zandor/control/ControlArray.h>
#include <Zandor/control/Events.h>
#include <Zandor/control/Hooks.h>
#include <Zandor/control/LineReaches.h>
#include <Zandor/control/ModelList.h>
#include <Zandor/control/Reached.h>
#include <Zandor/control/basZandor.h>
#include <Zandor/control/clsDragColumn.h>
#include <Zandor/control/clsFreeList.h>
#include <Zandor/control/clsJoinLine.h>
#include <Zandor/control/report.h>
#include <Zandor/platform/KeyedCollection.h>
#include <Zandor/platform/Toolkit.h>
#include <Zandor/platform/Words.h>
#include <Zandor/platform/export.h>

#include <map>
#include <optional>

namespace zandor::comforts {
class Door;
}

namespace TalvikDBxZandor {

class frmJoinDefinition;
struct QueryPicture;
struct TablePicture;
struct DefinitionPicture;

/// The query designer: tables on a canvas, joins between them, output columns in a grid.
///
/// No procedure throws. A failure is reported in a message box under the procedure's name; what
/// was done before it stays done, and a getter returns its result as it stood. All coordinates are
/// twips. The toolkit, the library and the event sink outlive the control.
///
/// A host may do anything at any time, in a message box or an event as well as in a call of its
/// model; what it bound last is what is shown. A front end whose host may destroy the control then,
/// too, keeps toolkit, events and control in one house, and hands the control a weak reference to
/// it: it calls `End`, lets go of the house, and the house stays until the last procedure has
/// returned. Without such a keeper the control is destroyed while no procedure runs.
class ZANDOR_CONTROL_EXPORT Zandor {
public:
    /// Name under which failures are reported.
    static constexpr platform::StringView ModuleName = u"TalvikDBxZandor.Zandor";

    using String = platform::String; ///< UTF-16
    /// An object that may be nothing.
    template <class T>
    using Ref = platform::Ref<T>;

    /// Makes its constituents, empty and laid out; with an empty query of the library once one is
    /// asked for. `keeper` is the house that it stands in.
    Zandor(platform::Toolkit& toolkit, TalvikZandorLib::Library& library, ZandorEvents& events,
           std::weak_ptr<void> keeper = {});
    Zandor(const Zandor&) = delete;
    Zandor& operator=(const Zandor&) = delete;
    /// Ends the control, unless `End` has.
    ~Zandor();

    // What a front end notifies; UserControl_Initialize runs within construction.
    /// The control comes to be shown, or its host asks for painting: what is shown is laid out and
    /// an open editor closes.
    void UserControl_Paint();
    /// The inner size is another one.
    void UserControl_Resize();

    /// Runs UserControl_Terminate, the first time. From then on no procedure does anything, and
    /// those that run, further down the stack, return without another call of toolkit, host or
    /// model.
    void End();
    /// Whether a procedure runs: what it stands on must stay until it has returned.
    bool Busy() const { return mLife.busy(); }

    // Texts and flags: plain values, read where they take effect.
    String LNGJoinForm = u"Join Defintion";
    String LNGJoinLeftTable = u"Left Table:";
    String LNGJoinLeftColumn = u"Left Column:";
    String LNGJoinRightTable = u"Right Table:";
    String LNGJoinRightColumn = u"Right Column:";
    String LNGJoinType = u"Join Type";
    String LNGJoinTypeNormal = u"Normal";
    String LNGJoinTypeLeftOuter = u"Left Outer";
    String LNGJoinTypeRightOuter = u"Right Outer";
    String LNGJoinTypeBothOuter = u"Both Outer";
    String LNGJoinOk = u"&Ok";
    String LNGJoinCancel = u"&Cancel";
    String LNGMnuShowJoinDef = u"Show Join Definition";
    String LNGMnuDelJoin = u"Delete Join";
    String LNGMnuCopyCol = u"Copy Column";
    String LNGMnuCreateJoin = u"Create Join";
    String LNGMnuDelTable = u"Delete Table";
    String LNGMnuPasteCol = u"Paste Column";
    String LNGMnuDelCol = u"Delete Coumn"; // spelled so on purpose: hosts compare with it
    String LNGSpreadField = u"Field:";
    String LNGSpreadSynonym = u"Synonym:";
    String LNGSpreadSort = u"Sort:";
    String LNGSpreadVisible = u"Visible:";
    String LNGSpreadCriteria = u"Criteria:";
    String LNGSpreadOr = u"Or:";
    bool LNGMnuShowJoinDefVis = true;
    bool LNGMnuDelJoinVis = true;
    bool LNGMnuCopyColVis = true;
    bool LNGMnuCreateJoinVis = true;
    bool LNGMnuDelTableVis = true;
    bool LNGMnuPasteColVis = true;
    bool LNGMnuDelColVis = true;
    bool LNGMnuSep1Vis = true;
    bool LNGMnuSep2Vis = true;
    std::int16_t MXHorzFrameSize = 16000; ///< width of the canvas
    std::int16_t MXVertFrameSize = 16000; ///< height of the canvas
    String DeletedTable = u"  ";          ///< name of the table deleted last

    // Property procedures, each beside the name it reports under. Two pairs of names share one
    // flag each, and some of their report names are crossed; hosts' logs know them so.
    // clang-format off
    std::int16_t DebugSwitch() const { return Get(report::DebugSwitch.get, mDebugSwitch); }
    void DebugSwitch(std::int16_t v) { Let(report::DebugSwitch.let, mDebugSwitch, v); }
    std::int16_t JoinModifyDisabled() const { return Get(report::JoinModifyDisabled.get, mJoinModifyDisabled); }
    void JoinModifyDisabled(std::int16_t v) { Let(report::JoinModifyDisabled.let, mJoinModifyDisabled, v); }
    /// How far the canvas is scrolled to the left. A value past the end of the range goes to its
    /// end; a negative one is error 380.
    std::int16_t VisibleFrameLeft() const;
    void VisibleFrameLeft(std::int16_t v);
    /// The same for the top.
    std::int16_t VisibleFrameTop() const;
    void VisibleFrameTop(std::int16_t v);
    /// The query model; never nothing. Setting nothing raises Error and keeps the model held.
    Ref<TalvikZandorLib::Zandor> P_GET_Zandor();
    /// Keeps grid columns of the model before; ShowAnew behind it takes them away.
    void P_SET_Zandor(const Ref<TalvikZandorLib::Zandor>& model);
    /// Scroll range; the next layout overwrites it. A negative value is error 380.
    std::int16_t HorizMaxScrollPos() const;
    void HorizMaxScrollPos(std::int16_t v);
    std::int16_t VertMaxScrollPos() const;
    void VertMaxScrollPos(std::int16_t v);
    /// Scroll position; error 380 outside 0 to the range's end.
    std::int16_t HorizontalScrollbarPos() const;
    void HorizontalScrollbarPos(std::int16_t v);
    std::int16_t VerticalScrollbarPos() const;
    void VerticalScrollbarPos(std::int16_t v);
    /// Whether the canvas takes the whole height. Setting false shows the grid with the row titles
    /// of the moment.
    bool OnlyJoin() const { return Get(report::OnlyJoin.get, mOnlyJoin); }
    void OnlyJoin(bool v);
    bool UseJoinTypeNormal() const { return Get(report::UseJoinTypeNormal.get, mUseJoinType[0]); }
    void UseJoinTypeNormal(bool v) { Let(report::UseJoinTypeNormal.let, mUseJoinType[0], v); }
    bool UseJoinTypeLeft() const { return Get(report::UseJoinTypeLeft.get, mUseJoinType[1]); }
    void UseJoinTypeLeft(bool v) { Let(report::UseJoinTypeLeft.let, mUseJoinType[1], v); }
    bool UseJoinTypeRight() const { return Get(report::UseJoinTypeRight.get, mUseJoinType[2]); }
    void UseJoinTypeRight(bool v) { Let(report::UseJoinTypeRight.let, mUseJoinType[2], v); }
    bool UseJoinTypeBoth() const { return Get(report::UseJoinTypeBoth.get, mUseJoinType[3]); }
    void UseJoinTypeBoth(bool v) { Let(report::UseJoinTypeBoth.let, mUseJoinType[3], v); }
    bool UseJoinCompareOperatorEquals() const { return Get(report::UseJoinCompareOperatorEquals.get, mUseOperator[0]); }
    void UseJoinCompareOperatorEquals(bool v) { Let(report::UseJoinCompareOperatorEquals.let, mUseOperator[0], v); }
    bool UseJoinCompareOperatorNotEquals() const { return Get(report::UseJoinCompareOperatorNotEquals.get, mUseOperator[1]); }
    void UseJoinCompareOperatorNotEquals(bool v) { Let(report::UseJoinCompareOperatorNotEquals.let, mUseOperator[1], v); }
    bool UseJoinCompareOperatorLess() const { return Get(report::UseJoinCompareOperatorLess.get, mUseOperator[2]); }
    void UseJoinCompareOperatorLess(bool v) { Let(report::UseJoinCompareOperatorLess.let, mUseOperator[2], v); }
    bool UseJoinCompareOperatorGreater() const { return Get(report::UseJoinCompareOperatorGreater.get, mUseOperator[3]); }
    void UseJoinCompareOperatorGreater(bool v) { Let(report::UseJoinCompareOperatorGreater.let, mUseOperator[3], v); }
    bool UseJoinCompareOperatorLessEquals() const { return Get(report::UseJoinCompareOperatorLessEquals.get, mUseOperator[4]); }
    void UseJoinCompareOperatorLessEquals(bool v) { Let(report::UseJoinCompareOperatorLessEquals.let, mUseOperator[4], v); }
    bool UseJoinCompareOperatorGreaterEquals() const { return Get(report::UseJoinCompareOperatorGreaterEquals.get, mUseOperator[5]); }
    void UseJoinCompareOperatorGreaterEquals(bool v) { Let(report::UseJoinCompareOperatorGreaterEquals.let, mUseOperator[5], v); }
    bool UseJoinCompareOperatorLE() const { return Get(report::UseJoinCompareOperatorLE.get, mUseOperator[4]); }
    void UseJoinCompareOperatorLE(bool v) { Let(report::UseJoinCompareOperatorLE.let, mUseOperator[4], v); }
    bool UseJoinCompareOperatorGE() const { return Get(report::UseJoinCompareOperatorGE.get, mUseOperator[5]); }
    void UseJoinCompareOperatorGE(bool v) { Let(report::UseJoinCompareOperatorGE.let, mUseOperator[5], v); }
    /// Always nothing: hosts learn the object concerned from the events' arguments.
    Ref<TalvikZandorLib::ZDJoin> lastjoin() const { return Nothing<TalvikZandorLib::ZDJoin>(report::lastjoin.get); }
    Ref<TalvikZandorLib::ZDTable> activetable() const { return Nothing<TalvikZandorLib::ZDTable>(report::activetable.get); }
    Ref<TalvikZandorLib::ZDColumn> ActiveColumn() const { return Nothing<TalvikZandorLib::ZDColumn>(report::ActiveColumn.get); }
    // clang-format on

    /// The share of the height that the canvas has above the grid; not part of the public
    /// interface. Kept within 0.05 and 0.95; what is no number changes nothing.
    float UpperPaneShare() const { return mUpperPaneShare; }
    void UpperPaneShare(float share);

    /// Whether the user only looks: the canvas scrolls, entries are selected and copied, joins tell
    /// what they are; tables stand where they stand, and nothing comes into the model but what is
    /// selected. What the host does itself is as ever. A drag that is going on when it becomes so
    /// is taken back, and nothing tells of it. Not part of the public interface.
    bool ReadOnly() const { return mReadOnly; }
    void ReadOnly(bool value);

    /// Whom to ask before what the user does is done; nothing, as at first: nobody.
    void Ask(std::shared_ptr<Questions> questions) { mQuestions = std::move(questions); }

    /// Drops every table and replaces the model by an empty one.
    void Terminate();
    /// Selects the columns of a name in every shown and model table of a name, and no others there.
    void SelectColumnNames(const String& TabName, const String& ColName);
    /// Makes the first shown table of a name the current one; an unknown name changes nothing.
    void SetCurrentTable(const String& TabName);

    // Beyond the public interface: for front ends and what stands between them and the control.

    /// What is said in cells and editors. New words are shown at once, in the cells as in an open
    /// editor; the model does not know them.
    const platform::Words& Words() const { return mWords; }
    void Words(const platform::Words& words);

    /// Brings what is shown to what the model has now, whoever changed it: what has gone is taken
    /// away, what has come is added, and all else stays as it is, with the scroll positions, the
    /// current table, selected entries, the grid's current cell, an open editor and the text in it
    /// (which go with their cell, and close with it), widths of columns, and the order in which
    /// tables lie over each other. A table whose place or size the model leaves to the control
    /// keeps its own, or has it back when the model had one meanwhile; joins that no line can show
    /// are left out. Raises no event and shows no trace; takes and gives no focus. The model is
    /// read before anything is shown: with an error of it all stays as it was.
    void ShowAnew();

    /// Moves a column of the grid to another position, both from 1 to the last column, and its
    /// definition in the model with it; raises ColumnModified when it stands elsewhere then. A
    /// position behind the last definition is that of the last. Closes an open editor; the current
    /// cell stays the same cell. False, and nothing happens, for a column without a definition, a
    /// position below 1, and a model that keeps no order (OrderedDefinitions); error 30010 beyond
    /// the last column, 5 for a definition that the model has no longer.
    bool MoveColumn(std::int32_t column, std::int32_t position);

private:
    friend struct ZandorBackstage;       ///< tests reach the procedures below through it
    friend class zandor::comforts::Door; ///< what is built above the control acts through it

    using Tabulet = TalvikTabulet::Tabulet;
    using ColumnItem = TalvikTabulet::ColumnItem;
    using ZDTableRef = Ref<TalvikZandorLib::ZDTable>;
    using ZDColumnRef = Ref<TalvikZandorLib::ZDColumn>;

    static constexpr std::int16_t lastTableSlot = 16;
    static constexpr std::int16_t lastJoinSlot = LineReaches::most;

    // Errors and traces
    template <class Body>
    void Guard(platform::StringView procedure, Body&& body) const noexcept {
        if (mLife.ended()) return;
        const Life::Procedure running(mLife);
        basZandor::Guard(mLife, ModuleName, procedure, std::forward<Body>(body));
    }
    void Raise(Event event, const EventArguments& arguments = {});
    template <class T>
    Held<T> Hold(const Ref<T>& reference) const {
        return hold(mLife, reference);
    }
    template <class Owner, class Collection>
    auto List(const Held<Owner>& owner, Collection& (Owner::*collection)()) const {
        return ModelList<Owner, Collection>(mLife, owner, collection);
    }
    template <class T>
    T Get(platform::StringView procedure, const T& member) const {
        T result{};
        Guard(procedure, [&] { result = member; });
        return result;
    }
    template <class T>
    void Let(platform::StringView procedure, T& member, const T& value) {
        Guard(procedure, [&] { member = value; });
    }
    template <class T>
    Ref<T> Nothing(platform::StringView procedure) const {
        Guard(procedure, [] {});
        return {};
    }
    void Trace(platform::StringView text, platform::StringView title = ModuleName) const;

    // Lifecycle and layout
    void UserControl_Initialize();
    void UserControl_Terminate();
    void ResizeControls();
    void LayOut();
    float UpperPaneHeight() const;
    void WriteRowTitles();
    TalvikTabulet::TabuletEvents TableEvents();
    void MakeMenu();

    // Binding
    Held<TalvikZandorLib::Zandor> Model();
    auto Tables() { return List(Model(), &TalvikZandorLib::Zandor::Tables); }
    auto Joins() { return List(Model(), &TalvikZandorLib::Zandor::Joins); }
    auto Definitions() { return List(Model(), &TalvikZandorLib::Zandor::ColumnDefinitions); }
    void TakeModel(const Ref<TalvikZandorLib::Zandor>& model);
    void SetZandor();
    bool ShowTables();
    void ShowJoins();
    void ShowDefinitions();
    void ShowDefinition(std::int32_t column,
                        const Held<TalvikZandorLib::ZDColumnDefinition>& definition);
    void TieBoundColumns();
    bool RemoveAllTables();
    void ShowMenuEntries();
    void MakeCurrent(const Held<Tabulet>& table);
    void SelectColumn(const Held<Tabulet>& table, const String& name);

    // Showing anew
    class Untraced;
    class ShownTables;
    /// What the control gave a table whose place, or size, the model left to it.
    struct OwnPlace {
        std::optional<platform::Bounds> place, size;
        bool placed = false; ///< the model had a place when the table was last shown anew
        bool sized = false;
    };
    platform::Bounds PlaceAnew(std::int16_t slot, const TablePicture& table,
                               const platform::Bounds& now);
    void ShowTablesAnew(const QueryPicture& picture);
    void ShowTableAnew(std::int16_t slot, const TablePicture& table);
    void RemoveOtherJoins(const QueryPicture& picture, const ShownTables& shown);
    void ShowJoinsAnew(const QueryPicture& picture, const ShownTables& shown);
    void ShowDefinitionsAnew(const QueryPicture& picture);
    void ShowDefinitionAnew(std::int32_t column, const DefinitionPicture& definition);
    void RemoveOtherColumns(const QueryPicture& picture);
    bool IsBlank(std::int32_t column) const;

    // Canvas: tables
    bool Shows(std::int16_t slot, const Held<Tabulet>& element) const;
    bool Shows(const Held<Tabulet>& element) const;
    Held<Tabulet> ShowTable(std::int16_t slot, const Held<TalvikZandorLib::ZDTable>& table,
                            std::int32_t& cascade);
    void FillTable(const Held<Tabulet>& element, const Held<TalvikZandorLib::ZDTable>& table);
    bool FindTable(const String& TableName, Ref<Tabulet>& Table);
    bool FindColumn(const Ref<Tabulet>& Table, const String& ColumnName, Ref<ColumnItem>& Column);
    bool SetSelectedTable(const String& TableName);
    bool ShowSelectedTable();
    bool RemoveTable(std::int16_t Index);
    void RemoveColumnsOf(const String& tableName);
    void TerminateTable(std::int16_t Index);
    void UnloadTable(std::int16_t Index);
    void SetFocusBack();
    void lstTable_CloseClick(std::int16_t Index);
    void lstTable_GotFocus(std::int16_t Index);

    // Canvas: arranging
    void OrganizeTables();
    void lstTable_Moving(std::int16_t Index);
    void lstTable_Moved(std::int16_t Index);
    void lstTable_Resized(std::int16_t Index);
    void lstTable_Scroll(std::int16_t Index);
    void hsbTable_Change();
    void vsbTable_Change();
    void hsbTable_GotFocus();
    void vsbTable_GotFocus();
    void cmdHome_Click();
    void cmdHome_GotFocus();
    void fraTable_MouseDown(std::int16_t Button, std::int16_t Shift, float X, float Y);
    void fraTable_MouseUp(std::int16_t Button, std::int16_t Shift, float X, float Y);

    // Canvas: gestures
    void lstTable_ColumnMouseDown(std::int16_t Index, const Ref<ColumnItem>& Column,
                                  std::int16_t Button, std::int16_t Shift);
    void lstTable_ColumnMouseMove(std::int16_t Index, const Ref<ColumnItem>& Column,
                                  std::int16_t Button, std::int16_t Shift);
    void lstTable_ColumnMouseUp(std::int16_t Index, const Ref<ColumnItem>& Column,
                                std::int16_t Button, std::int16_t Shift);
    void lstTable_SelectionChanged(std::int16_t Index);
    bool ActivateSelected(const Held<Tabulet>& element,
                          const Held<TalvikZandorLib::ZDTable>& table);
    void CopySelection(std::int16_t Index, platform::StringView traceTitle);
    void lstTable_DragOver(std::int16_t Index, platform::Control* Source, float X, float Y,
                           std::int16_t State);
    void lstTable_DragDrop(std::int16_t Index, platform::Control* Source, float X, float Y);
    bool GetDragColumns(std::int16_t Index);
    Ref<clsDragColumn> DragRecord(std::int16_t Index, const Ref<Tabulet>& element,
                                  const Ref<ColumnItem>& entry);
    Held<TalvikZandorLib::ZDTable> TableOf(const Held<Tabulet>& element);
    void EmptyDragColumns();
    static bool IsAllColumns(const ColumnItem& entry);
    static Ref<ColumnItem> FirstSelected(Tabulet& table);

    // Joins
    bool DrawJoin(clsJoinLine& JoinLine);
    void PlaceJoin(clsJoinLine& JoinLine);
    void FollowJoin(clsJoinLine& JoinLine);
    void FindEnds(clsJoinLine& JoinLine);
    Tabulet* TableAt(const DrawnEnd& end, std::int32_t handle) const;
    platform::Line& PlaceLine(clsJoinLine& JoinLine, float X1, float Y1, float X2, float Y2);
    void DrawJoins();
    float DeltaJoinLine(float X, float Y, float X1, float Y1, float X2, float Y2);
    bool JoinHitTest(Ref<clsJoinLine>& JoinLine, float X, float Y);
    bool JoinAllreadyExists(const Ref<Tabulet>& leftTable, const Ref<ColumnItem>& leftColumn,
                            const Ref<Tabulet>& rightTable, const Ref<ColumnItem>& rightColumn);
    bool DrawNewJoin(Ref<clsJoinLine>& NewJoinLine, const Ref<Tabulet>& leftTable,
                     const Ref<ColumnItem>& leftColumn, const Ref<Tabulet>& rightTable,
                     const Ref<ColumnItem>& rightColumn, std::int16_t joinType,
                     std::int16_t compareOperator);
    bool AddNewJoin(const Ref<clsJoinLine>& record, const ZDTableRef& leftTable,
                    const ZDColumnRef& leftColumn, const ZDTableRef& rightTable,
                    const ZDColumnRef& rightColumn);
    Ref<clsJoinLine> JoinTo(const clsDragColumn& source, const Held<Tabulet>& table,
                            const Ref<ColumnItem>& target);
    bool RemoveJoin(Ref<clsJoinLine> record);
    bool Draws(const Ref<clsJoinLine>& record) const;
    static bool HasTag(const clsJoinLine& record);
    void SetLanguageOfJoinDefinition(frmJoinDefinition& dialog);
    void SetEnabledJoinTypes(frmJoinDefinition& dialog);
    void SetEnabledJoinOperators(frmJoinDefinition& dialog);
    void mnuJoinDelete_Click();
    void mnuJoinShowDefinition_Click();
    Held<TalvikZandorLib::ZDJoin> ModelJoin(const clsJoinLine& record);

    // Grid: cells and editors
    void AddNewAndCriterium(const ZDColumnRef& sourceColumn, std::int32_t column);
    void MakeGetValueFieldsInvisible();
    void GetTextValue(const String& cellText);
    void GetSortOrder(const String& cellText);
    void GetVisibility(const String& cellText);
    void EditCell();
    void HideEditors();
    void OpenEditor(const Part<platform::Frame>& frame, const Part<platform::CommandButton>& set);
    void PlaceEditor(const Part<platform::Frame>& frame);
    Held<TalvikZandorLib::ZDColumnDefinition> DefinitionOf(std::int32_t column);
    void sprColumn_MouseDown(std::int16_t Button, std::int16_t Shift, float X, float Y);
    void sprColumn_MouseUp(std::int16_t Button, std::int16_t Shift, float X, float Y);
    void sprColumn_Scroll();
    void cmdSetSortOrder_Click();
    void cmdSetVisibility_Click();
    void cmdSetTextValue_Click();
    void cobSortOrder_KeyDown(std::int16_t KeyCode, std::int16_t Shift);
    void cobVisibility_KeyDown(std::int16_t KeyCode, std::int16_t Shift);
    void txtValue_KeyDown(std::int16_t KeyCode, std::int16_t Shift);
    void SetCell(const String& text, std::int16_t alignment) const;
    class EditedCell;
    bool StoreText(const Held<TalvikZandorLib::ZDColumnDefinition>& definition, std::int32_t row,
                   const String& text);

    // Grid: definitions
    void sprColumn_DragDrop(platform::Control* Source, float X, float Y);
    void mnuColumnDefinitionPaste_Click();
    void mnuColumnDefinitionDelete_Click();
    void mnuTableDefinitionCopy_Click();
    void mnuTableDefinitionDelete_Click();
    void mnuTableDefinitionPaste_Click();
    void InsertDragColumns(float X, float Y);
    void InsertRecords(const std::vector<Ref<clsDragColumn>>& records, std::int32_t column);
    Held<TalvikZandorLib::OrderedDefinitions> Ordered();
    Held<TalvikZandorLib::ZDColumnDefinition> DefinitionBefore(std::int32_t column);
    bool InsertColumnDefinition(const String& fieldName, std::int32_t column);
    bool RemoveColumn(std::int32_t column);
    void ClearColumn(std::int32_t column);
    void FitColumn(std::int32_t column, const String& fieldName);

    // What the host says
    template <class Question>
    auto Answer(Question question);
    template <class T>
    bool May(bool (Questions::*question)(const Ref<T>&), const Ref<T>& about);
    bool MayJoin(const clsDragColumn& source, const Held<Tabulet>& table,
                 const Ref<ColumnItem>& target);
    bool MayRemoveJoin(const Ref<TalvikZandorLib::ZDJoin>& join);
    bool MayCloseTable(const Ref<TalvikZandorLib::ZDTable>& table);
    bool MayComeOut(const ZDColumnRef& column);
    bool MayRemoveColumn(const Ref<TalvikZandorLib::ZDColumnDefinition>& definition);
    MenuPlace PlaceOfMenu(std::int16_t source, float X, float Y);
    void OfferHostEntries(std::int16_t source, float X, float Y);
    void mnuHost_Click(std::size_t entry);

    // Context menu
    void PopupZandorMenu(std::int16_t source, float X, float Y);
    void CheckMenus(std::int16_t source, float X, float Y);
    void SwitchSpecialMenusOff();
    void mnuZandor_Click();

    mutable Life mLife; ///< first, so that it is there until the last of the others has gone
    bool mEnding = false;
    const Given<platform::Toolkit> mToolkit;
    const Given<TalvikZandorLib::Library> mLibrary;
    const Given<ZandorEvents> mEvents;
    std::shared_ptr<Questions> mQuestions;
    Hooks mHooks;
    platform::Words mWords;

    std::int16_t mDebugSwitch = 1;
    bool mTraces = true; ///< false for what is not traced even with DebugSwitch
    std::int16_t mJoinModifyDisabled = 0;
    bool mReadOnly = false;
    bool mOnlyJoin = true;
    static constexpr float half = 0.5F;
    float mUpperPaneShare = half;
    bool mUseJoinType[4] = {true, true, true, true};
    bool mUseOperator[6] = {true, true, true, true, true, true};

    Ref<TalvikZandorLib::Zandor> mModel;
    Ref<clsFreeList> mTableFreeList;
    Ref<clsFreeList> mJoinFreeList;
    platform::KeyedCollection<clsJoinLine> mJoinLines; ///< keyed by the digits of the join's number
    LineReaches mReaches;                              ///< of their lines, in the same order
    std::vector<Ref<clsDragColumn>> mDragColumns;
    std::int16_t mDragTableIndex = 0;
    std::int16_t mActiveTableIndex = 0;
    std::int32_t mBinding = 0;      ///< which one it is, counted: the last one is what is shown
    std::int32_t mBoundColumns = 0; ///< grid columns filled by the last binding
    std::map<std::int16_t, OwnPlace> mOwnPlaces; ///< by slot
    Ref<clsJoinLine> mLastJoin;
    float mPopupX = 0;
    float mPopupY = 0;
    bool mMenuPrepared = false;
    std::vector<HostEntry> mHostEntries; ///< of the menu that is open, or was last

    // Constituent controls, in stacking order
    const TalvikTabulet::TabuletEvents mTableEvents;
    Part<platform::Frame> fraTable;
    ControlArray<platform::Line> linJoin;
    ControlArray<platform::Shape> shpJoin;
    Held<platform::ImageList> imgListTabulet;
    ControlArray<Tabulet> lstTable;
    Part<MSFlexGridLib::MSFlexGrid> sprColumn;
    Part<platform::ScrollBar> hsbTable;
    Part<platform::ScrollBar> vsbTable;
    Part<platform::CommandButton> cmdHome;
    Part<platform::Frame> fraSortOrder, fraSortOrder2;
    Part<platform::ComboBox> cobSortOrder;
    Part<platform::CommandButton> cmdSetSortOrder;
    Part<platform::Frame> fraVisibility, fraVisibility2;
    Part<platform::ComboBox> cobVisibility;
    Part<platform::CommandButton> cmdSetVisibility;
    Part<platform::Frame> fraValue, fraValue2;
    Part<platform::TextBox> txtValue;
    Part<platform::CommandButton> cmdSetTextValue;
    Part<platform::PopupMenu> mnuZandor;
    Part<platform::MenuEntry> mnuJoinShowDefinition;
    Part<platform::MenuEntry> mnuJoinDelete;
    Part<platform::MenuEntry> mnuJoinSep;
    Part<platform::MenuEntry> mnuTableDefinitionCopy;
    Part<platform::MenuEntry> mnuTableDefinitionPaste;
    Part<platform::MenuEntry> mnuTableDefinitionDelete;
    Part<platform::MenuEntry> mnuTableDefinitionSep;
    Part<platform::MenuEntry> mnuColumnDefinitionPaste;
    Part<platform::MenuEntry> mnuColumnDefinitionDelete;
    std::vector<Part<platform::MenuEntry>> mnuHost; ///< made as they are needed
};

} // namespace TalvikDBxZandor
