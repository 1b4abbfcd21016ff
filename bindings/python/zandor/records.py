"""Plain values that go between the program, the ready-made model and the widget."""

from enum import IntEnum
from typing import Any, Callable, NamedTuple, Optional, Sequence, Tuple, Union

from zandor._zandor import ColumnType, FindingKind
from zandor.TalvikZandorLib import ZDColumn, ZDColumnDefinition, ZDJoin, ZDTable


class ColumnDescription(NamedTuple):
    """A column as a database describes it."""

    name: str
    type: ColumnType = ColumnType.Unknown
    #: As the database words it; may be empty.
    declaredType: str = ""
    primaryKey: bool = False


class TableDescription(NamedTuple):
    """A table as a database describes it, before it stands in a query."""

    name: str
    columns: Sequence[ColumnDescription] = ()
    #: Empty: the database's default one.
    schema: str = ""


class TableId(NamedTuple):
    """A table or view by name; an empty schema is the database's default one."""

    name: str
    schema: str = ""


class TableEntry(NamedTuple):
    """What a database lists."""

    id: TableId
    isView: bool = False


class ForeignKey(NamedTuple):
    """The names as the foreign key words them, which may differ in case from those of the tables."""

    child: TableId
    parent: TableId
    #: Child's and parent's, pair by pair.
    columns: Sequence[Tuple[str, str]]


class LeftOut(NamedTuple):
    """A foreign key that was not drawn, because another one joins the same tables."""

    drawn: ForeignKey
    other: ForeignKey


class CellFinding(NamedTuple):
    """What a host has to say about a cell of the widget's grid."""

    definition: str
    row: int
    text: str


class Finding(NamedTuple):
    """Something about a query that a person should know, and where it is."""

    kind: FindingKind
    #: Stays as it is from version to version.
    code: str
    #: One line in English.
    text: str
    #: Whether the statement would not say what the user drew, or could not be written.
    isError: bool
    #: Keys of what is concerned, empty where there is none.
    table: str = ""
    join: str = ""
    definition: str = ""
    #: Grid row of a criterion; 0 where it is about none.
    row: int = 0
    #: In the criterion's text, UTF-16 code units from 0.
    position: int = 0


class Parameter(NamedTuple):
    """A value that is asked for before the statement runs."""

    name: str
    #: Of the column that it is compared with.
    type: ColumnType
    #: Whether the value asked for is a pattern as people type them.
    pattern: bool


class Statement(NamedTuple):
    """A query as SQL."""

    #: Empty when there is none.
    text: str
    #: In the order of the placeholders: a value as the engine takes it, or a Parameter to be asked.
    bindings: Sequence[Union[int, float, bool, str, Parameter]]
    findings: Sequence[Finding]
    #: Whether the statement is there and says what was drawn.
    runnable: bool


class JoinEnd(NamedTuple):
    """A column of a table on the canvas: one end of a join."""

    Table: ZDTable
    Column: ZDColumn


class MenuSource(IntEnum):
    """What the menu opens over."""

    #: Over a table's list.
    Table = 0
    #: Over the canvas beside them.
    Canvas = 1
    Grid = 2


class MenuPlace(NamedTuple):
    """Where the menu is about to open. What is not there is None."""

    Source: MenuSource
    #: Whose list it is.
    Table: Optional[ZDTable] = None
    #: Its first selected one.
    Column: Optional[ZDColumn] = None
    #: Whose line was hit.
    Join: Optional[ZDJoin] = None
    #: Of the grid's column.
    Definition: Optional[ZDColumnDefinition] = None
    #: Of the grid, from 0; -1 elsewhere.
    Row: int = -1
    #: On the canvas, in twips.
    X: float = 0
    Y: float = 0


class HostEntry(NamedTuple):
    """An entry of the program's in the widget's menu."""

    #: "-" makes a separator; an ampersand marks the mnemonic.
    Caption: str
    #: Called without arguments when the menu has closed. An exception is shown in the control's box.
    Chosen: Optional[Callable[[], object]] = None
    #: Whether it can be chosen.
    Enabled: bool = True
