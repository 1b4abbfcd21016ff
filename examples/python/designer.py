import sys

import zandor
from PyQt6.QtWidgets import QApplication

application = QApplication(sys.argv)
path = sys.argv[1] if len(sys.argv) > 1 else "/usr/share/zandor-designer/trading.sqlite"
query = zandor.Query()
try:
    database = zandor.openDatabase(path)  # read only
    tables = [entry.id for entry in database.tables()]
    if not tables:
        sys.exit(f"designer.py: {path} has no tables; name another database.")
    # The table with the most foreign keys, joined to what they lead to, on 800 pixels (in twips).
    most = max(tables, key=lambda each: len(database.foreignKeys(each)))
    parents = [key.parent for key in database.foreignKeys(most)]
    database.addTables(query, dict.fromkeys([most, *parents]), 12000)
except zandor.DatabaseError as error:
    sys.exit(f"designer.py: {error}")

def show_sql():
    print(zandor.statementText(query, database.dialect()).text)

designer = zandor.ZandorWidget(zandor.Library())
designer.setDebugSwitch(0)  # 1, the default, shows trace boxes
designer.setOnlyJoin(False)  # with the grid below the canvas
designer.setComforts(zandor.Flags.all())  # such as fields that a double click adds
designer.setModel(query)
for changed in (designer.ColumnCreated, designer.ColumnModified, designer.JoinCreated):
    changed.connect(show_sql)
show_sql()
designer.resize(900, 600)
designer.show()
sys.exit(application.exec())
