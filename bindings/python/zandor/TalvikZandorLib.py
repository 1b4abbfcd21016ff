"""What the control asks of a query model: the interfaces of <Zandor/TalvikZandorLib.h>.

A program with queries of its own derives from these classes. What is an annotated attribute here is
a property: an attribute of the object, or a property of its class. The defaults stand for what a
model has no need of. Keys tell objects apart, so that an object may be made anew each time it is
asked for.

Places and sizes are in twips: 1/1440 inch, 15 to a logical pixel.
"""

from enum import IntEnum
from typing import TYPE_CHECKING, Generic, Iterator, List, Optional, TypeVar, Union

from zandor import errors

T = TypeVar("T")

# To type checkers the interfaces are protocols, so that the ready-made model, whose classes are
# made in C++, is one of them. At run time nothing keeps a class from having another base, QObject
# among them.
if TYPE_CHECKING:
    from typing import Protocol
else:
    Protocol = object


class JoinType(IntEnum):
    Normal = 0
    LeftOuter = 1
    RightOuter = 2
    BothOuter = 3


class CompareOperator(IntEnum):
    Equals = 0
    NotEquals = 1
    Less = 2
    Greater = 3
    LessEquals = 4
    GreaterEquals = 5


class SortOrder(IntEnum):
    Unsorted = 0
    Ascending = 1
    Descending = 2


class Collection(Generic[T]):
    """What a model lists. Count and Item are asked for; the rest is Python's way to the same."""

    @property
    def Count(self) -> int:
        raise NotImplementedError(f"{type(self).__name__} has no Count")

    def Item(self, which: Union[int, str]) -> T:
        """By position, from 1: error 9 outside. By key: error 5 when no item has it."""
        raise NotImplementedError(f"{type(self).__name__} has no Item")

    def __len__(self) -> int:
        return self.Count

    def __iter__(self) -> Iterator[T]:
        return (self.Item(position) for position in range(1, self.Count + 1))

    def __getitem__(self, key: str) -> T:
        return self.Item(key)

    def __contains__(self, key: object) -> bool:
        return any(item.Key == key for item in self)  # type: ignore[attr-defined]


class EditableCollection(Collection[T]):
    """What a model lists and the control takes things out of."""

    def Remove(self, key: str) -> None:
        """Error 5 when no item has the key."""
        raise NotImplementedError(f"{type(self).__name__} has no Remove")


class KeyedCollection(EditableCollection[T]):
    """A collection of the items of a list, which stays the program's own, by their Key."""

    def __init__(self, items: Optional[List[T]] = None):
        self.items: List[T] = [] if items is None else items

    @property
    def Count(self) -> int:
        return len(self.items)

    def Item(self, which: Union[int, str]) -> T:
        if isinstance(which, str):
            return self.items[self._position(which)]
        if not 1 <= which <= len(self.items):
            raise errors.subscriptOutOfRange()
        return self.items[which - 1]

    def Remove(self, key: str) -> None:
        del self.items[self._position(key)]

    def _position(self, key: str) -> int:
        for position, item in enumerate(self.items):
            if item.Key == key:  # type: ignore[attr-defined]
                return position
        raise errors.invalidProcedureCall()


class ZDColumn(Protocol):
    """A column of a table."""

    if TYPE_CHECKING:

        @property
        def Name(self) -> str: ...
        @property
        def Key(self) -> str: ...
        @property
        def Marker(self) -> bool: ...

    #: Whether the column is decorated in the list, as a key column is.
    Marker = False
    Selected: bool = False
    #: 1 while the user has the column's entry selected, 0 otherwise.
    activated: int = 0


class ZDTable(Protocol):
    """A table on the canvas. A negative Left or Top, and a Width or Height of 0 or less, leave the
    place, respectively the size, to the control, which then sets it, as a float."""

    if TYPE_CHECKING:

        @property
        def Name(self) -> str: ...
        @property
        def Key(self) -> str: ...
        @property
        def Columns(self) -> Collection[ZDColumn]: ...

    Left: float = -1
    Top: float = -1
    Width: float = 0
    Height: float = 0
    #: Nonzero when the table is the selected one.
    Selected: int = 0


class ZDJoin(Protocol):
    """A join. The control fills in a new one: tables, then columns."""

    if TYPE_CHECKING:

        @property
        def Key(self) -> str: ...

    LeftTable: Optional[ZDTable] = None
    LeftColumn: Optional[ZDColumn] = None
    RightTable: Optional[ZDTable] = None
    RightColumn: Optional[ZDColumn] = None
    #: A JoinType.
    JoinType: int = 0
    #: A CompareOperator.
    CompareOperator: int = 0


class ZDCriterium(Protocol):
    """The criterium of one cell, as people type it."""

    Criterium: str = ""


class ZDColumnDefinition(Protocol):
    """One output column."""

    if TYPE_CHECKING:

        @property
        def Key(self) -> str:
            """ "x" followed by a decimal number, for a definition that the grid can edit."""

        @property
        def Criteria(self) -> EditableCollection[ZDCriterium]: ...

    Column: Optional[ZDColumn] = None
    Synonym: str = ""
    #: A SortOrder.
    SortOrder: int = 0
    Visible: bool = True

    def HasCriterium(self, key: str) -> bool:
        """Criteria keys are grid row numbers in decimal: "4", "5" and so on."""
        raise NotImplementedError(f"{type(self).__name__} has no HasCriterium")

    def AddCriterium(self, text: str, key: str) -> None:
        raise NotImplementedError(f"{type(self).__name__} has no AddCriterium")


class SizedDefinition:
    """What a definition may be besides: one that keeps how wide its column of the grid is."""

    #: In twips; 0 leaves the width to the control.
    Width: int = 0


class Zandor(Protocol):
    """The query."""

    if TYPE_CHECKING:

        @property
        def Tables(self) -> Collection[ZDTable]: ...
        @property
        def Joins(self) -> EditableCollection[ZDJoin]: ...
        @property
        def ColumnDefinitions(self) -> EditableCollection[ZDColumnDefinition]: ...

    def AddJoin(self, join: ZDJoin) -> ZDJoin:
        """Stores the join and returns it as stored."""
        raise NotImplementedError(f"{type(self).__name__} has no AddJoin")

    def AddColumnDefinition(self, definition: ZDColumnDefinition) -> ZDColumnDefinition:
        """Stores the definition and returns it as stored."""
        raise NotImplementedError(f"{type(self).__name__} has no AddColumnDefinition")

    def DeleteTable(self, table: ZDTable) -> None:
        raise NotImplementedError(f"{type(self).__name__} has no DeleteTable")


class OrderedDefinitions:
    """What a query may be besides: one whose definitions have an order, which is to be that of the
    grid's columns. Without it, columns stand where they were dropped and cannot be moved."""

    def StandsBehind(
        self, definition: ZDColumnDefinition, predecessor: Optional[ZDColumnDefinition]
    ) -> None:
        """The definition now stands right behind the other, or before all others for None."""
        raise NotImplementedError(f"{type(self).__name__} has no StandsBehind")


class Library(Protocol):
    """Makes the model objects that the control needs of its own accord."""

    def NewZandor(self) -> Zandor:
        raise NotImplementedError(f"{type(self).__name__} has no NewZandor")

    def NewZDJoin(self) -> ZDJoin:
        raise NotImplementedError(f"{type(self).__name__} has no NewZDJoin")

    def NewZDColumnDefinition(self) -> ZDColumnDefinition:
        raise NotImplementedError(f"{type(self).__name__} has no NewZDColumnDefinition")
