#pragma once

// Scripts that hear all of a control's events by name and say what each carries. The control is
// lent to them as `control`.

inline constexpr wchar_t inVBScript[] = LR"(
Sub On_TableDeleted() : WScript.Echo "TableDeleted " & control.DeletedTable : End Sub
Sub On_TableMoved() : WScript.Echo "TableMoved" : End Sub
Sub On_Activate() : WScript.Echo "Activate" : End Sub
Sub On_ColumnCreated(d) : WScript.Echo "ColumnCreated " & d.Column.Name : End Sub
Sub On_ColumnModified(d) : WScript.Echo "ColumnModified " & d.Column.Name : End Sub
Sub On_ColumnRemoved(d) : WScript.Echo "ColumnRemoved " & d.Column.Name : End Sub
Sub On_Error(text, number) : WScript.Echo "Error " & text & " " & number : End Sub
Sub On_JoinCreated(j) : WScript.Echo "JoinCreated " & j.JoinType : End Sub
Sub On_JoinModified(j) : WScript.Echo "JoinModified " & j.JoinType : End Sub
Sub On_JoinRemoved(j) : WScript.Echo "JoinRemoved " & j.JoinType : End Sub
WScript.ConnectObject control, "On_"
)";

inline constexpr wchar_t inJScript[] = LR"(
function On_TableDeleted() { WScript.Echo("TableDeleted " + control.DeletedTable); }
function On_TableMoved() { WScript.Echo("TableMoved"); }
function On_Activate() { WScript.Echo("Activate"); }
function On_ColumnCreated(d) { WScript.Echo("ColumnCreated " + d.Column.Name); }
function On_ColumnModified(d) { WScript.Echo("ColumnModified " + d.Column.Name); }
function On_ColumnRemoved(d) { WScript.Echo("ColumnRemoved " + d.Column.Name); }
function On_Error(text, number) { WScript.Echo("Error " + text + " " + number); }
function On_JoinCreated(j) { WScript.Echo("JoinCreated " + j.JoinType); }
function On_JoinModified(j) { WScript.Echo("JoinModified " + j.JoinType); }
function On_JoinRemoved(j) { WScript.Echo("JoinRemoved " + j.JoinType); }
WScript.ConnectObject(control, "On_");
)";
