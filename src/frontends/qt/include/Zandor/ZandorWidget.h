#pragma once

#include <Zandor/Zandor.h>
#include <Zandor/comforts/Field.h>
#include <Zandor/comforts/Flags.h>
#include <Zandor/qt/export.h>
#include <Zandor/qt/properties.h>

#include <QMap>
#include <QWidget>

#include <memory>
#include <vector>

Q_DECLARE_METATYPE(zandor::platform::Ref<TalvikZandorLib::Zandor>)
Q_DECLARE_METATYPE(zandor::platform::Ref<TalvikZandorLib::ZDJoin>)
Q_DECLARE_METATYPE(zandor::platform::Ref<TalvikZandorLib::ZDTable>)
Q_DECLARE_METATYPE(zandor::platform::Ref<TalvikZandorLib::ZDColumn>)
Q_DECLARE_METATYPE(zandor::platform::Ref<TalvikZandorLib::ZDColumnDefinition>)

namespace zandor::platform::qt {
class QtToolkit;
}

/// The query designer as a widget, to be put into any layout. Its properties, methods and signals
/// are the control's own under their own names; integers are 16-bit ones, and a value outside
/// -32768 to 32767 is refused as error 6 in a message box, the property staying as it was.
///
/// The properties are listed in docs/interface.md.
///
/// To the Tab key of the window around, the widget is a single stop; docs/keyboard.md lists its
/// keys.
///
/// The library outlives the widget. With DebugSwitch nonzero (its default) the widget shows trace
/// boxes, one of them while it is destroyed.
///
/// The widget may be deleted at any time, by `delete` and by deleteLater(): in a slot of any of its
/// signals, in a call of the model, while a message box, the join dialog, the menu or a drag of it
/// stands open, which then close. The one exception is the widget's own resizing, in which Qt does
/// not let any widget be deleted.
class ZANDOR_WIDGETS_EXPORT ZandorWidget : public QWidget {
    Q_OBJECT
    ZANDOR_WIDGET_PROPERTIES(ZANDOR_DECLARE_TEXT, ZANDOR_DECLARE_FLAG, ZANDOR_DECLARE_NUMBER,
                             ZANDOR_DECLARE_FLAG, ZANDOR_DECLARE_NUMBER)
    Q_PROPERTY(ZandorModel Zandor READ model WRITE setModel DESIGNABLE false)
    Q_PROPERTY(ZDJoin lastjoin READ lastjoin)
    Q_PROPERTY(ZDTable activetable READ activetable)
    Q_PROPERTY(ZDColumn ActiveColumn READ ActiveColumn)

public:
    /// A query model, counted.
    using ZandorModel = zandor::platform::Ref<TalvikZandorLib::Zandor>;
    /// A join of it.
    using ZDJoin = zandor::platform::Ref<TalvikZandorLib::ZDJoin>;
    /// A table of it.
    using ZDTable = zandor::platform::Ref<TalvikZandorLib::ZDTable>;
    /// A column of a table.
    using ZDColumn = zandor::platform::Ref<TalvikZandorLib::ZDColumn>;
    /// An output column.
    using ZDColumnDefinition = zandor::platform::Ref<TalvikZandorLib::ZDColumnDefinition>;

    /// Begins with an empty query of the library, the canvas alone, and no comforts.
    explicit ZandorWidget(TalvikZandorLib::Library& library, QWidget* parent = nullptr);
    /// For forms (.ui), which know of a parent only: setLibrary comes next.
    explicit ZandorWidget(QWidget* parent = nullptr);
    ~ZandorWidget() override;

    /// The control behind the widget, for hosts that prefer its C++ interface.
    TalvikDBxZandor::Zandor& control() { return *mControl; }
    /// What the control is built with, for tests and for front ends that add to this one.
    zandor::platform::qt::QtToolkit& toolkit() { return *mToolkit; }

    /// What people expect beyond the bare control; all off at first.
    const zandor::comforts::Flags& comforts() const;
    void setComforts(const zandor::comforts::Flags& flags);

    /// With the comfort of typing kept, what stands in an open editor goes into its cell, and the
    /// editor closes; ColumnModified is emitted when that changes anything. The widget does so
    /// by itself when the user turns to something else in its window, shortcuts included; hosts
    /// that are about to run, save or close the query for another reason call it first.
    void takeOver();
    /// With that comfort, writes what stands in an open text editor into the definition of the same
    /// key of another model, such as a copy that is kept safe; the editor stays open and the query
    /// as it is. Returns whether there was anything that is not in the query yet.
    bool writeTyping(const ZandorModel& copy);

    /// Marks tables on the canvas, by their names, as ones that something is wrong with; the note
    /// says what, as a tooltip and to screen readers. Tables that are not named lose their mark,
    /// and one that comes later has none.
    void setTableNotes(const QMap<QString, QString>& notes);

    /// What there is to say about cells of the grid, each shown at its cell, as a mark and in the
    /// tooltip; cells that are not named have nothing. Stays until it is set anew, and goes with
    /// the cells when their columns move.
    void setFindings(std::vector<zandor::comforts::Finding> findings);
    /// Makes a cell of the grid the current one, in view and with the focus: the row of the grid,
    /// and the column of the definition with a key. False when it is not there.
    bool showCell(const QString& definition, int row);

    /// Brings what is shown to what the bound model has now: for a host that has changed the model
    /// itself, or has bound another one and wants nothing left of the one before. What is the same
    /// stays as it is, with scroll positions, selections, focus, and an open editor with its text.
    /// No signals, no traces. See TalvikDBxZandor::Zandor::ShowAnew.
    void showAnew();

    QSize sizeHint() const override;
    QSize minimumSizeHint() const override;

    using QWidget::repaint;
    using QWidget::update;

    /// The query model; never nothing. Setting nothing emits Error and keeps the model held.
    /// Setting another one keeps grid columns of the one before; showAnew takes them away.
    ZandorModel model() const;
    void setModel(const ZandorModel& model);
    /// Always nothing: the signals carry the object concerned.
    ZDJoin lastjoin() const;
    /// Always nothing, as lastjoin.
    ZDTable activetable() const;
    /// Always nothing, as lastjoin.
    ZDColumn ActiveColumn() const;

    /// Drops every table and replaces the model by an empty one.
    Q_INVOKABLE void Terminate();
    /// Selects the columns of a name in every table of a name, and no others there.
    Q_INVOKABLE void SelectColumnNames(const QString& TabName, const QString& ColName);
    /// Makes the first table of a name the current one; nothing happens when there is none.
    Q_INVOKABLE void SetCurrentTable(const QString& TabName);

    /// Painting anew is for the control to lay itself out and close an open editor, as when it is
    /// first shown. Painting that its own work causes is not, nor is the painting of a part.
    void update();
    /// As update, at once.
    void repaint();

    // Beside the interface
    /// Whom to ask before what the user does is done, and for entries of the menu; nothing, as at
    /// first: nobody. Questions.h has the rules. Takes effect with the next act.
    void setQuestions(std::shared_ptr<TalvikDBxZandor::Questions> questions);
    /// Whether the user only looks: the canvas scrolls, entries are selected and copied, joins tell
    /// what they are; tables stand where they stand, cells open no editors, and nothing comes into
    /// the model but what is selected. False at first. What the host does itself is as ever. A drag
    /// that is going on when it becomes so is taken back, with no signal.
    bool isReadOnly() const;
    void setReadOnly(bool readOnly);
    /// A place in this widget, in logical pixels, as one on the canvas, in twips, as tables have
    /// theirs in the model; and back, to the nearest pixel. Goes with the scrolling, and beyond
    /// what is in sight.
    QPointF toCanvas(QPointF place) const;
    /// The way back of toCanvas.
    QPoint fromCanvas(QPointF twips) const;
    /// Who makes the model's objects, for a widget that was made without: before its model is asked
    /// for or set. Until then the model is an empty one, and a join or an output column that the
    /// user makes in another is reported as error 91. The library outlives the widget. The titles
    /// of the grid, when it is shown, become those of the moment.
    void setLibrary(TalvikZandorLib::Library& library);
    /// Leaves out the message boxes, errors and traces alike: for where nobody is at work with the
    /// control, as in an editor of forms.
    void setSilent(bool silent);
    /// The share of the height that the canvas has above the grid; half of it at first. Kept
    /// within 0.05 and 0.95.
    double upperPaneShare() const;
    void setUpperPaneShare(double share);
    /// What is shown and spoken that no property says. At first it is what the translators that
    /// are installed have for it, in this class's context; another language that the application
    /// takes is followed until a host sets words of its own. See docs/words.md.
    const zandor::platform::Words& words() const;
    void setWords(const zandor::platform::Words& words);
    /// Back to what the translators have, for a host that has set its own.
    void resetWords();

Q_SIGNALS:
    /// A table was taken out of the query. DeletedTable has the name.
    void TableDeleted();
    /// The user has moved a table.
    void TableMoved();
    /// The user has dropped columns or opened the context menu.
    void Activate();
    /// An output column was added; once for each.
    void ColumnCreated(const ZDColumnDefinition& definition);
    /// Sort order, visibility, synonym, place or a criterion of one was changed.
    void ColumnModified(const ZDColumnDefinition& definition);
    /// An output column was deleted by the user.
    void ColumnRemoved(const ZDColumnDefinition& definition);
    /// The host handed over nothing as its model.
    void Error(const QString& text, int number);
    /// The user has joined two columns.
    void JoinCreated(const ZDJoin& join);
    /// The user has changed type or operator in the join dialog.
    void JoinModified(const ZDJoin& join);
    /// The user has deleted a join.
    void JoinRemoved(const ZDJoin& join);

    // Beside the interface
    /// The user has moved the divider of the panes.
    void upperPaneShareChanged(double share);
    /// The user wants another name for the table of a key. Comes when the menu has closed.
    void renameRequested(const QString& key);

protected:
    bool event(QEvent* event) override;
    void changeEvent(QEvent* event) override;
    bool focusNextPrevChild(bool next) override;
    void focusInEvent(QFocusEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void showEvent(QShowEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;

private:
    class Events;
    class House;

    QPoint canvasOrigin() const;
    void queuePaint();
    void moveDivider(int down);
    void say(const zandor::platform::Words& words);
    void setInteger(zandor::platform::StringView procedure, int value,
                    void (*set)(TalvikDBxZandor::Zandor&, std::int16_t));

    std::shared_ptr<House> mHouse;
    zandor::platform::qt::QtToolkit* mToolkit;
    TalvikDBxZandor::Zandor* mControl = nullptr;
    bool mPaintQueued = false;
    bool mOwnWords = false; ///< the host has set them
};
