"""A host's query model, written in Python. Every call of the control is recorded, under the names
that the transcript has for them, and can be made to fail."""

from zandor import errors
from zandor.TalvikZandorLib import (
    EditableCollection,
    Library,
    Zandor,
    ZDColumn,
    ZDColumnDefinition,
    ZDCriterium,
    ZDJoin,
    ZDTable,
)


class Calls:
    def __init__(self):
        self.made = []
        #: What is raised at the next call of a name.
        self.failures = {}
        self.told = None

    def pass_(self, name):
        self.made.append(name)
        if self.told is not None:
            self.told.append("  " + name)
        failure = self.failures.pop(name, None)
        if failure is not None:
            raise failure


def recorded(name, field, settable=True):
    """A property over a plain attribute."""

    def read(self):
        self.calls.pass_(name)
        return getattr(self, field)

    def write(self, value):
        self.calls.pass_(name + "=")
        setattr(self, field, value)

    return property(read, write if settable else None)


class Collection(EditableCollection):
    def __init__(self, calls, name):
        self.calls, self.name = calls, name
        self.items = {}

    @property
    def Count(self):
        self.calls.pass_(self.name + ".Count")
        return len(self.items)

    def Item(self, which):
        by_key = isinstance(which, str)
        self.calls.pass_(f"{self.name}.Item({'key' if by_key else 'position'})")
        if by_key:
            if which not in self.items:
                raise errors.invalidProcedureCall()
            return self.items[which]
        if not 1 <= which <= len(self.items):
            raise errors.subscriptOutOfRange()
        return list(self.items.values())[which - 1]

    def Remove(self, key):
        self.calls.pass_(self.name + ".Remove")
        if key not in self.items:
            raise errors.invalidProcedureCall()
        del self.items[key]


class Column(ZDColumn):
    def __init__(self, calls, name):
        self.calls = calls
        self.name, self.key = name, "k" + name
        self.marker = self.selected = False
        self.activatedValue = -1

    Name = recorded("ZDColumn.Name", "name", False)
    Key = recorded("ZDColumn.Key", "key", False)
    Marker = recorded("ZDColumn.Marker", "marker", False)
    Selected = recorded("ZDColumn.Selected", "selected")
    activated = recorded("ZDColumn.activated", "activatedValue")


class Table(ZDTable):
    def __init__(self, calls, name):
        self.calls = calls
        self.name, self.key = name, "t" + name
        self.left = self.top = -1.0
        self.width = self.height = 0.0
        self.selected = 0
        self.columns = Collection(calls, "Columns")

    Name = recorded("ZDTable.Name", "name", False)
    Key = recorded("ZDTable.Key", "key", False)
    Left = recorded("ZDTable.Left", "left")
    Top = recorded("ZDTable.Top", "top")
    Width = recorded("ZDTable.Width", "width")
    Height = recorded("ZDTable.Height", "height")
    Selected = recorded("ZDTable.Selected", "selected")
    Columns = recorded("ZDTable.Columns", "columns", False)


class Join(ZDJoin):
    def __init__(self, calls):
        self.calls = calls
        self.leftTable = self.rightTable = self.leftColumn = self.rightColumn = None
        self.joinType = self.compareOperator = 0
        self.key = ""

    LeftTable = recorded("ZDJoin.LeftTable", "leftTable")
    LeftColumn = recorded("ZDJoin.LeftColumn", "leftColumn")
    RightTable = recorded("ZDJoin.RightTable", "rightTable")
    RightColumn = recorded("ZDJoin.RightColumn", "rightColumn")
    JoinType = recorded("ZDJoin.JoinType", "joinType")
    CompareOperator = recorded("ZDJoin.CompareOperator", "compareOperator")
    Key = recorded("ZDJoin.Key", "key", False)


class Criterium(ZDCriterium):
    def __init__(self, calls, text):
        self.calls, self.text = calls, text

    Criterium = recorded("ZDCriterium.Criterium", "text")


class Definition(ZDColumnDefinition):
    def __init__(self, calls):
        self.calls = calls
        self.column = None
        self.synonym, self.key = "", ""
        self.sortOrder, self.visible = 0, True
        self.criteria = Collection(calls, "Criteria")

    Column = recorded("ZDColumnDefinition.Column", "column")
    Synonym = recorded("ZDColumnDefinition.Synonym", "synonym")
    SortOrder = recorded("ZDColumnDefinition.SortOrder", "sortOrder")
    Visible = recorded("ZDColumnDefinition.Visible", "visible")
    Key = recorded("ZDColumnDefinition.Key", "key", False)
    Criteria = recorded("ZDColumnDefinition.Criteria", "criteria", False)

    def HasCriterium(self, key):
        self.calls.pass_("ZDColumnDefinition.HasCriterium")
        return key in self.criteria.items

    def AddCriterium(self, text, key):
        self.calls.pass_("ZDColumnDefinition.AddCriterium")
        self.criteria.items[key] = Criterium(self.calls, text)


class Model(Zandor):
    def __init__(self, calls):
        self.calls = calls
        self.tables = Collection(calls, "Tables")
        self.joins = Collection(calls, "Joins")
        self.definitions = Collection(calls, "ColumnDefinitions")

    Tables = recorded("Zandor.Tables", "tables", False)
    Joins = recorded("Zandor.Joins", "joins", False)
    ColumnDefinitions = recorded("Zandor.ColumnDefinitions", "definitions", False)

    def table(self, name, columns, place):
        table = Table(self.calls, name)
        table.left, table.top, table.width, table.height = map(float, place)
        for each in columns:
            column = Column(self.calls, each)
            table.columns.items[column.key] = column
        self.tables.items[table.key] = table
        return table

    def AddJoin(self, join):
        self.calls.pass_("Zandor.AddJoin")
        join.key = f"j{len(self.joins.items) + 1}"
        self.joins.items[join.key] = join
        return join

    def AddColumnDefinition(self, definition):
        self.calls.pass_("Zandor.AddColumnDefinition")
        definition.key = f"x{len(self.definitions.items) + 1}"
        self.definitions.items[definition.key] = definition
        return definition

    def DeleteTable(self, table):
        self.calls.pass_("Zandor.DeleteTable")
        del self.tables.items[table.key]


class HostLibrary(Library):
    def __init__(self, calls):
        self.calls = calls

    def NewZandor(self):
        self.calls.pass_("Library.NewZandor")
        return Model(self.calls)

    def NewZDJoin(self):
        self.calls.pass_("Library.NewZDJoin")
        return Join(self.calls)

    def NewZDColumnDefinition(self):
        self.calls.pass_("Library.NewZDColumnDefinition")
        return Definition(self.calls)
