"""What a designer asks its host before what its user does is done."""

from typing import Iterable

from zandor.records import HostEntry, JoinEnd, MenuPlace
from zandor.TalvikZandorLib import ZDColumn, ZDColumnDefinition, ZDJoin, ZDTable


class Questions:
    """Asked before the user's acts are done, beside the signals, which tell what has been done.

    A program derives from it and gives the answers that it has; each that it does not give leaves
    everything as it is. What is refused does not happen: the model is not called for it and no
    signal tells of it. What the program does to the model itself is nobody's question.

    An exception in an answer is shown in the control's box, as one in a model is, and refuses; of
    the menu it costs the program's entries. A program that sets a model, or shows its own anew,
    before it answers has refused as well.
    """

    def MayJoin(self, left: JoinEnd, right: JoinEnd) -> bool:
        """May a join be made, from the column that was dragged or copied to the one it came to?"""
        return True

    def MayRemoveJoin(self, join: ZDJoin) -> bool:
        """May a join be deleted?"""
        return True

    def MayCloseTable(self, table: ZDTable) -> bool:
        """May a table be closed, and what hangs on it with it?"""
        return True

    def MayComeOut(self, column: ZDColumn) -> bool:
        """May a column become an output column, or take the place of another one's field?"""
        return True

    def MayRemoveColumn(self, definition: ZDColumnDefinition) -> bool:
        """May an output column be deleted?"""
        return True

    def MenuEntries(self, place: MenuPlace) -> Iterable[HostEntry]:
        """Entries behind the menu's own and a separator."""
        return ()
