"""Plain values that go between the program and the ready-made model."""

from typing import Any, NamedTuple, Optional, Sequence, Tuple, Union

from zandor._zandor import ColumnType, FindingKind


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
