"""Zandor: a visual query designer as a widget of PyQt6, with a ready-made query model.

A program makes a ZandorWidget over a library and gives it a query:

    widget = zandor.ZandorWidget(zandor.Library())
    widget.setModel(query)

Query is the ready-made model; one of your own derives from the classes of zandor.TalvikZandorLib.
"""

from zandor import TalvikZandorLib, _bound, errors
from zandor._zandor import (
    Column,
    ColumnDefinition,
    ColumnType,
    Database,
    Dialect,
    FieldColumn,
    FindingKind,
    Flags,
    Format,
    Join,
    Library,
    OutputName,
    Query,
    QueryDocument,
    RowCriterium,
    Table,
    Total,
    ValueForm,
    ZandorWidget,
    dialectName,
    fromJson,
    loadQuery,
    openDatabase,
    saveQuery,
    statementText,
    toJson,
    validate,
)
from zandor.errors import DatabaseError, Error, FileError, NumberedError
from zandor.records import (
    CellFinding,
    ColumnDescription,
    Finding,
    ForeignKey,
    LeftOut,
    Parameter,
    Statement,
    TableDescription,
    TableEntry,
    TableId,
)
from zandor.TalvikZandorLib import CompareOperator, JoinType, SortOrder

__all__ = [
    "CellFinding",
    "Column",
    "ColumnDefinition",
    "ColumnDescription",
    "ColumnType",
    "CompareOperator",
    "Database",
    "DatabaseError",
    "Dialect",
    "Error",
    "FieldColumn",
    "FileError",
    "Finding",
    "FindingKind",
    "Flags",
    "ForeignKey",
    "Format",
    "Join",
    "JoinType",
    "LeftOut",
    "Library",
    "NumberedError",
    "OutputName",
    "Parameter",
    "Query",
    "QueryDocument",
    "RowCriterium",
    "SortOrder",
    "Statement",
    "Table",
    "TableDescription",
    "TableEntry",
    "TableId",
    "TalvikZandorLib",
    "Total",
    "ValueForm",
    "ZandorWidget",
    "dialectName",
    "errors",
    "fromJson",
    "loadQuery",
    "openDatabase",
    "saveQuery",
    "statementText",
    "toJson",
    "validate",
]
