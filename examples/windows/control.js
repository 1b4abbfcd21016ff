// The control as an object of automation, here without a form: texts and flags are set before it
// gets its query, and what its host hands over is what it gives back.
//   cscript //nologo control.js
var control = new ActiveXObject("TalvikDBxZandor.Zandor");
control.DebugSwitch = 0; // 1, as at first, shows trace boxes
control.LNGSpreadField = "Feld:";
control.UseJoinTypeBoth = false;
control.OnlyJoin = false;

var query = new ActiveXObject("TalvikZandorLib.Zandor");
var table = new ActiveXObject("TalvikZandorLib.ZDTableDescription");
table.Name = "orders";
table.AddColumn("id", 2, true);
table.AddColumn("total", 3);
query.AddTable(table);

control.Zandor = query;
control.SelectColumnNames("orders", "total");
for (var walk = new Enumerator(control.Zandor.Tables.Item("t1").Columns); !walk.atEnd();
     walk.moveNext())
    WScript.Echo(walk.item().Name + (walk.item().Selected ? " (selected)" : ""));

try {
    control.MXHorzFrameSize = 40000;
} catch (error) {
    WScript.Echo("beyond 16 bits: refused");
}
control.Terminate();
