' A query model that is written in the script itself, and handed to the control:
'   cscript //nologo own_model.vbs
Option Explicit

' What the control walks: Count, Item by number or by key, Remove by key.
Class List
    Private mCount
    Dim mItems(99)

    Public Property Get Count
        Count = mCount
    End Property

    Public Function Item(index)
        Set Item = mItems(PlaceOf(index))
    End Function

    Public Sub Remove(index)
        Dim place
        For place = PlaceOf(index) To mCount - 1
            Set mItems(place) = mItems(place + 1)
        Next
        mCount = mCount - 1
    End Sub

    Public Function Add(object)
        mCount = mCount + 1
        Set mItems(mCount) = object
        Set Add = object
    End Function

    Private Function PlaceOf(index)
        Dim place
        If VarType(index) <> vbString Then
            If index < 1 Or index > mCount Then Err.Raise 9
            PlaceOf = index
            Exit Function
        End If
        For place = 1 To mCount
            If mItems(place).Key = index Then
                PlaceOf = place
                Exit Function
            End If
        Next
        Err.Raise 5
    End Function
End Class

Class Column
    Public Name
    Public Key
    Public Selected
    Public activated
End Class

Class Table
    Public Name
    Public Key
    Public Left
    Public Top
    Public Width
    Public Height
    Public Selected
    Public Columns
End Class

Class Query
    Public Tables
    Public Joins
    Public ColumnDefinitions

    Private Sub Class_Initialize
        Set Tables = New List
        Set Joins = New List
        Set ColumnDefinitions = New List
    End Sub

    Public Function AddJoin(join)
        join.Key = "j" & (Joins.Count + 1)
        Set AddJoin = Joins.Add(join)
    End Function

    Public Function AddColumnDefinition(definition)
        definition.Key = "d" & (ColumnDefinitions.Count + 1)
        Set AddColumnDefinition = ColumnDefinitions.Add(definition)
    End Function

    Public Sub DeleteTable(table)
        Tables.Remove table.Key
    End Sub
End Class

Function NewTable(name, columns)
    Dim made, word, entry
    Set made = New Table
    made.Name = name
    made.Key = "t-" & name
    made.Left = 300
    made.Top = 300
    made.Width = 1800
    made.Height = 1500
    made.Selected = 0
    Set made.Columns = New List
    For Each word In columns
        Set entry = New Column
        entry.Name = word
        entry.Key = name & "." & word
        entry.Selected = False
        made.Columns.Add entry
    Next
    Set NewTable = made
End Function

Sub Show(table)
    Dim n, line
    line = table.Name
    If table.Selected <> 0 Then line = line & " (current)"
    For n = 1 To table.Columns.Count
        line = line & " " & table.Columns.Item(n).Name
        If table.Columns.Item(n).Selected Then line = line & " (selected)"
    Next
    WScript.Echo line
End Sub

Dim control, model, n
Set model = New Query
model.Tables.Add NewTable("orders", Array("id", "total"))
model.Tables.Add NewTable("customers", Array("id", "name"))

Set control = CreateObject("TalvikDBxZandor.Zandor")
control.DebugSwitch = 0
Set control.Zandor = model
control.SelectColumnNames "orders", "total"
control.SetCurrentTable "customers"
For n = 1 To model.Tables.Count
    Show model.Tables.Item(n)
Next
If control.Zandor Is model Then WScript.Echo "The control gives it back."
control.Terminate
