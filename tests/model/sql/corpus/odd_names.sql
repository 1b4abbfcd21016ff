-- Tables whose names and columns are traps for quoting. One statement a line.
CREATE TABLE "Order" (id INTEGER PRIMARY KEY, "select" TEXT, "Group By" INTEGER, "x?y" TEXT, ":name" TEXT, "it's" TEXT, "a""b" TEXT, "[c]" INTEGER, "back`tick" TEXT)
INSERT INTO "Order" VALUES (1, 'first', 10, 'q', 'n', 's', 'd', 7, 'b'), (2, 'second', 20, NULL, 'n', 's''s', 'd"d', 8, NULL), (3, '100 % sure', 30, 'a_b', ':n', '?', 'A\B', 9, 'x'), (4, '[draft]', 40, 'A*B', '', 'it''s', '--', NULL, ';')
CREATE TABLE "weird ""table"" -- ; '" ("Größe" INTEGER, "naïve ☃ 😀" TEXT, "*" TEXT, "UPPER" TEXT, "Mixed_Case9" TEXT, "9lives" TEXT)
INSERT INTO "weird ""table"" -- ; '" VALUES (1, 'snow', 'star', 'U', 'M', 'cat'), (2, '😀', NULL, 'u', NULL, NULL), (3, 'line' || char(10) || 'break', '*', '', 'm', 'nine')
