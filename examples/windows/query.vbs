' A query of two tables, built and written as SQL, with no window at all:
'   cscript //nologo query.vbs
Option Explicit

Const zdInteger = 2, zdPostgreSQL = 1

Function Described(name, others)
    Dim table, column
    Set table = CreateObject("TalvikZandorLib.ZDTableDescription")
    table.Name = name
    table.AddColumn "id", zdInteger, True
    For Each column In others
        table.AddColumn column
    Next
    Set Described = table
End Function

Function ColumnNamed(table, name)
    Dim column
    For Each column In table.Columns
        If column.Name = name Then Set ColumnNamed = column
    Next
End Function

Dim query, orders, customers, join, output
Set query = CreateObject("TalvikZandorLib.Zandor")
Set orders = query.AddTable(Described("orders", Array("customer", "total")))
Set customers = query.AddTable(Described("customers", Array("name")))

Set join = CreateObject("TalvikZandorLib.ZDJoin")
Set join.LeftColumn = ColumnNamed(orders, "customer")
Set join.RightColumn = ColumnNamed(customers, "id")
query.AddJoin join

Set output = CreateObject("TalvikZandorLib.ZDColumnDefinition")
Set output.Column = ColumnNamed(customers, "name")
output.SortOrder = 1
query.AddColumnDefinition output
output.AddCriterium "Like ""A*""", "4"

WScript.Echo query.SQL(zdPostgreSQL)

' What the library refuses comes with the number and the text of the classic runtime.
On Error Resume Next
join.JoinType = 7
WScript.Echo Err.Number & ": " & Err.Description
