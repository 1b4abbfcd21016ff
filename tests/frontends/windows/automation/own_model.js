// The same in the other language, whose objects have members of any kind at any time.
function List() { this.items = []; this.Count = 0; }
List.prototype.place = function (index) {
    if (typeof index == "number") return index - 1;
    for (var n = 0; n < this.items.length; ++n)
        if (this.items[n].Key == index) return n;
    throw new Error(5, "Nobody has this key");
};
List.prototype.Item = function (index) { return this.items[this.place(index)]; };
List.prototype.Remove = function (index) {
    this.items.splice(this.place(index), 1);
    this.Count = this.items.length;
};
List.prototype.Add = function (item) {
    this.items.push(item);
    this.Count = this.items.length;
    return item;
};

function newTable(name, columns) {
    var table = {Name: name, Key: "t-" + name, Left: 300, Top: 300, Width: 1800, Height: 1500,
                 Selected: 0, Columns: new List()};
    for (var n = 0; n < columns.length; ++n)
        table.Columns.Add({Name: columns[n], Key: name + "." + columns[n], Selected: false,
                           activated: 0});
    return table;
}

var model = {
    Tables: new List(), Joins: new List(), ColumnDefinitions: new List(),
    AddJoin: function (join) { return this.Joins.Add(join); },
    AddColumnDefinition: function (definition) { return this.ColumnDefinitions.Add(definition); },
    DeleteTable: function (table) { this.Tables.Remove(table.Key); }
};
model.Tables.Add(newTable("orders", ["id", "total"]));
model.Tables.Add(newTable("customers", ["id", "name"]));

var control = new ActiveXObject("TalvikDBxZandor.Zandor");
control.DebugSwitch = 0;
control.Zandor = model;
control.SelectColumnNames("orders", "total");
control.SetCurrentTable("customers");
WScript.Echo(model.Tables.Item(1).Columns.Item("orders.total").Selected,
             model.Tables.Item(1).Columns.Item("orders.id").Selected,
             model.Tables.Item(1).Selected, model.Tables.Item(2).Selected);
control.Terminate();
