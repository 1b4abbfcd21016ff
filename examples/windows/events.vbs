' Procedures named after the control's events hear them:
'   cscript //nologo events.vbs
Option Explicit

Dim control
Set control = WScript.CreateObject("TalvikDBxZandor.Zandor", "Designer_")
control.DebugSwitch = 0
Set control.Zandor = Nothing ' which the control tells its host of
WScript.DisconnectObject control
Set control.Zandor = Nothing ' and now nobody hears it
control.Terminate

Sub Designer_TableDeleted()
    WScript.Echo "A table has gone"
End Sub

Sub Designer_TableMoved()
    WScript.Echo "A table stands elsewhere"
End Sub

Sub Designer_Activate()
    WScript.Echo "Columns were dropped, or the menu has opened"
End Sub

Sub Designer_ColumnCreated(definition)
    WScript.Echo "A column " & definition.Synonym
End Sub

Sub Designer_ColumnModified(definition)
    WScript.Echo "Another column " & definition.Synonym
End Sub

Sub Designer_ColumnRemoved(definition)
    WScript.Echo "No column " & definition.Synonym
End Sub

Sub Designer_Error(text, number)
    WScript.Echo text & " (" & number & ")"
End Sub

Sub Designer_JoinCreated(join)
    WScript.Echo "A join of type " & join.JoinType
End Sub

Sub Designer_JoinModified(join)
    WScript.Echo "Now a join of type " & join.JoinType
End Sub

Sub Designer_JoinRemoved(join)
    WScript.Echo "No join of type " & join.JoinType
End Sub
