<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de" sourcelanguage="en">
<context>
    <name>ControlFlags</name>
    <message>
        <source>Show join definition</source>
        <translation>Verknüpfung bearbeiten</translation>
    </message>
    <message>
        <source>Delete join</source>
        <translation>Verknüpfung löschen</translation>
    </message>
    <message>
        <source>Copy column</source>
        <translation>Spalte kopieren</translation>
    </message>
    <message>
        <source>Create join</source>
        <translation>Verknüpfung erstellen</translation>
    </message>
    <message>
        <source>Delete table</source>
        <translation>Tabelle löschen</translation>
    </message>
    <message>
        <source>Paste column</source>
        <translation>Spalte einfügen</translation>
    </message>
    <message>
        <source>Delete output column</source>
        <translation>Ausgabespalte löschen</translation>
    </message>
    <message>
        <source>Separator below the join entries</source>
        <translation>Trennlinie unter den Einträgen für Verknüpfungen</translation>
    </message>
    <message>
        <source>Separator below the table entries</source>
        <translation>Trennlinie unter den Einträgen für Tabellen</translation>
    </message>
    <message>
        <source>Type and operator of a join can be changed</source>
        <translation>Art und Operator einer Verknüpfung lassen sich ändern</translation>
    </message>
    <message>
        <source>Tables and joins only, no output columns</source>
        <translation>Nur Tabellen und Verknüpfungen, keine Ausgabespalten</translation>
    </message>
    <message>
        <source>Normal: only rows that match</source>
        <translation>Normal: nur Zeilen, die zueinander passen</translation>
    </message>
    <message>
        <source>Left outer: all rows of the left table</source>
        <translation>Links außen: alle Zeilen der linken Tabelle</translation>
    </message>
    <message>
        <source>Right outer: all rows of the right table</source>
        <translation>Rechts außen: alle Zeilen der rechten Tabelle</translation>
    </message>
    <message>
        <source>Both outer: all rows of both tables</source>
        <translation>Beide außen: alle Zeilen beider Tabellen</translation>
    </message>
    <message>
        <source>=  equal</source>
        <translation>=  gleich</translation>
    </message>
    <message>
        <source>&lt;&gt;  not equal</source>
        <translation>&lt;&gt;  ungleich</translation>
    </message>
    <message>
        <source>&lt;  less</source>
        <translation>&lt;  kleiner</translation>
    </message>
    <message>
        <source>&gt;  greater</source>
        <translation>&gt;  größer</translation>
    </message>
    <message>
        <source>&lt;=  less or equal</source>
        <translation>&lt;=  kleiner oder gleich</translation>
    </message>
    <message>
        <source>&gt;=  greater or equal</source>
        <translation>&gt;=  größer oder gleich</translation>
    </message>
    <message>
        <source>Show a box at each step of the control</source>
        <translation>Bei jedem Schritt des Steuerelements ein Meldungsfenster zeigen</translation>
    </message>
</context>
<context>
    <name>ControlTextUses</name>
    <message>
        <source>Join dialog: title</source>
        <translation>Verknüpfungsfenster: Titel</translation>
    </message>
    <message>
        <source>Join dialog: left table</source>
        <translation>Verknüpfungsfenster: linke Tabelle</translation>
    </message>
    <message>
        <source>Join dialog: left column</source>
        <translation>Verknüpfungsfenster: linke Spalte</translation>
    </message>
    <message>
        <source>Join dialog: right table</source>
        <translation>Verknüpfungsfenster: rechte Tabelle</translation>
    </message>
    <message>
        <source>Join dialog: right column</source>
        <translation>Verknüpfungsfenster: rechte Spalte</translation>
    </message>
    <message>
        <source>Join dialog: join type</source>
        <translation>Verknüpfungsfenster: Art der Verknüpfung</translation>
    </message>
    <message>
        <source>Join type: only rows that match</source>
        <translation>Art der Verknüpfung: nur Zeilen, die zueinander passen</translation>
    </message>
    <message>
        <source>Join type: all rows of the left table</source>
        <translation>Art der Verknüpfung: alle Zeilen der linken Tabelle</translation>
    </message>
    <message>
        <source>Join type: all rows of the right table</source>
        <translation>Art der Verknüpfung: alle Zeilen der rechten Tabelle</translation>
    </message>
    <message>
        <source>Join type: all rows of both tables</source>
        <translation>Art der Verknüpfung: alle Zeilen beider Tabellen</translation>
    </message>
    <message>
        <source>Join dialog: button that takes the changes over</source>
        <translation>Verknüpfungsfenster: Knopf, der die Änderungen übernimmt</translation>
    </message>
    <message>
        <source>Join dialog: button that drops the changes</source>
        <translation>Verknüpfungsfenster: Knopf, der die Änderungen verwirft</translation>
    </message>
    <message>
        <source>Menu: open the join dialog</source>
        <translation>Menü: Verknüpfungsfenster öffnen</translation>
    </message>
    <message>
        <source>Menu: delete a join</source>
        <translation>Menü: eine Verknüpfung löschen</translation>
    </message>
    <message>
        <source>Menu: copy the selected columns</source>
        <translation>Menü: die ausgewählten Spalten kopieren</translation>
    </message>
    <message>
        <source>Menu: join the copied column to the selected one</source>
        <translation>Menü: die kopierte Spalte mit der ausgewählten verknüpfen</translation>
    </message>
    <message>
        <source>Menu: take a table out of the query</source>
        <translation>Menü: eine Tabelle aus der Abfrage nehmen</translation>
    </message>
    <message>
        <source>Menu: make output columns of the copied columns</source>
        <translation>Menü: die kopierten Spalten zu Ausgabespalten machen</translation>
    </message>
    <message>
        <source>Menu: delete an output column</source>
        <translation>Menü: eine Ausgabespalte löschen</translation>
    </message>
    <message>
        <source>Grid: the column</source>
        <translation>Raster: die Spalte</translation>
    </message>
    <message>
        <source>Grid: the name that the column comes out under</source>
        <translation>Raster: der Name, unter dem die Spalte ausgegeben wird</translation>
    </message>
    <message>
        <source>Grid: sort order</source>
        <translation>Raster: Sortierung</translation>
    </message>
    <message>
        <source>Grid: whether the column comes out</source>
        <translation>Raster: ob die Spalte ausgegeben wird</translation>
    </message>
    <message>
        <source>Grid: the first row of criteria</source>
        <translation>Raster: die erste Zeile der Kriterien</translation>
    </message>
    <message>
        <source>Grid: further rows of criteria</source>
        <translation>Raster: weitere Zeilen mit Kriterien</translation>
    </message>
</context>
<context>
    <name>ControlTexts</name>
    <message>
        <source>Left Table:</source>
        <translation>Linke Tabelle:</translation>
    </message>
    <message>
        <source>Left Column:</source>
        <translation>Linke Spalte:</translation>
    </message>
    <message>
        <source>Right Table:</source>
        <translation>Rechte Tabelle:</translation>
    </message>
    <message>
        <source>Right Column:</source>
        <translation>Rechte Spalte:</translation>
    </message>
    <message>
        <source>Join Type</source>
        <translation>Art der Verknüpfung</translation>
    </message>
    <message>
        <source>Normal</source>
        <translation>Normal</translation>
    </message>
    <message>
        <source>Left Outer</source>
        <translation>Links außen</translation>
    </message>
    <message>
        <source>Right Outer</source>
        <translation>Rechts außen</translation>
    </message>
    <message>
        <source>Both Outer</source>
        <translation>Beide außen</translation>
    </message>
    <message>
        <source>&amp;Ok</source>
        <translation>&amp;OK</translation>
    </message>
    <message>
        <source>&amp;Cancel</source>
        <translation>&amp;Abbrechen</translation>
    </message>
    <message>
        <source>Field:</source>
        <translation>Feld:</translation>
    </message>
    <message>
        <source>Synonym:</source>
        <translation>Synonym:</translation>
    </message>
    <message>
        <source>Sort:</source>
        <translation>Sortierung:</translation>
    </message>
    <message>
        <source>Visible:</source>
        <translation>Sichtbar:</translation>
    </message>
    <message>
        <source>Criteria:</source>
        <translation>Kriterien:</translation>
    </message>
    <message>
        <source>Or:</source>
        <translation>Oder:</translation>
    </message>
    <message>
        <source>Join Definition</source>
        <translation>Verknüpfung bearbeiten</translation>
    </message>
    <message>
        <source>Show &amp;Join Definition</source>
        <translation>Verknüpfung &amp;bearbeiten</translation>
    </message>
    <message>
        <source>Delete Jo&amp;in</source>
        <translation>Verknüpfung &amp;löschen</translation>
    </message>
    <message>
        <source>&amp;Copy Column</source>
        <translation>Spalte &amp;kopieren</translation>
    </message>
    <message>
        <source>C&amp;reate Join</source>
        <translation>Verknüpfung &amp;erstellen</translation>
    </message>
    <message>
        <source>Delete &amp;Table</source>
        <translation>&amp;Tabelle löschen</translation>
    </message>
    <message>
        <source>&amp;Paste Column</source>
        <translation>Spalte e&amp;infügen</translation>
    </message>
    <message>
        <source>&amp;Delete Column</source>
        <translation>&amp;Ausgabespalte löschen</translation>
    </message>
</context>
<context>
    <name>Model</name>
    <message>
        <source>The query has no tables: add one first.</source>
        <translation>Die Abfrage hat keine Tabellen: Fügen Sie zuerst eine hinzu.</translation>
    </message>
    <message>
        <source>%1: At character %2: %3.</source>
        <translation>%1: Bei Zeichen %2: %3.</translation>
    </message>
    <message>
        <source>a text</source>
        <translation>ein Text</translation>
    </message>
    <message>
        <source>a number</source>
        <translation>eine Zahl</translation>
    </message>
    <message>
        <source>a date (2024-12-31)</source>
        <translation>ein Datum (2024-12-31)</translation>
    </message>
    <message>
        <source>a time (23:59)</source>
        <translation>eine Uhrzeit (23:59)</translation>
    </message>
    <message>
        <source>a date and time (2024-12-31 23:59)</source>
        <translation>Datum und Uhrzeit (2024-12-31 23:59)</translation>
    </message>
    <message>
        <source>true or false</source>
        <translation>true oder false</translation>
    </message>
    <message>
        <source>There is no file &quot;%1&quot;; check the path.</source>
        <translation>Es gibt keine Datei „%1“; prüfen Sie den Pfad.</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is a folder; choose a database file in it.</source>
        <translation>„%1“ ist ein Ordner; wählen Sie eine Datenbankdatei darin.</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is a device, not a file; choose a database file.</source>
        <translation>„%1“ ist ein Gerät, keine Datei; wählen Sie eine Datenbankdatei.</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; cannot be read (%2); ask its owner for permission.</source>
        <translation>Die Datei „%1“ kann nicht gelesen werden (%2); bitten Sie ihren Eigentümer um die Erlaubnis.</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; is empty; choose a file that holds a database.</source>
        <translation>Die Datei „%1“ ist leer; wählen Sie eine, die eine Datenbank enthält.</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; is not an SQLite database, or it is encrypted; choose another file.</source>
        <translation>Die Datei „%1“ ist keine SQLite-Datenbank oder ist verschlüsselt; wählen Sie eine andere.</translation>
    </message>
    <message>
        <source>The Qt driver for %1 is missing; install it (Debian: apt install %2).</source>
        <translation>Der Qt-Treiber für %1 fehlt; installieren Sie ihn (Debian: apt install %2).</translation>
    </message>
    <message>
        <source>The list of tables cannot be read (the connection is closed): open the database afresh.</source>
        <translation>Die Liste der Tabellen kann nicht gelesen werden (die Verbindung ist geschlossen): Öffnen Sie die Datenbank neu.</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; is not in the database; read the list of tables afresh.</source>
        <translation>Die Tabelle „%1“ ist nicht in der Datenbank; lesen Sie die Liste der Tabellen neu.</translation>
    </message>
    <message>
        <source>The address has an unknown option &quot;%1&quot;; known are %2 and host.</source>
        <translation>Die Adresse hat eine unbekannte Option „%1“; bekannt sind %2 und host.</translation>
    </message>
    <message>
        <source>The option %1 of the address has a semicolon in it; use a value without one.</source>
        <translation>Die Option %1 der Adresse enthält ein Semikolon; nehmen Sie einen Wert ohne.</translation>
    </message>
    <message>
        <source>The address of the database cannot be read; write it like %1, with %XX for a character that means something else there.</source>
        <translation>Die Adresse der Datenbank kann nicht gelesen werden; schreiben Sie sie wie %1, mit %XX für ein Zeichen, das dort etwas anderes bedeutet.</translation>
    </message>
    <message>
        <source>There is no kind of database &quot;%1&quot;; write it like %2.</source>
        <translation>Eine Art von Datenbank „%1“ gibt es nicht; schreiben Sie wie %2.</translation>
    </message>
    <message>
        <source>%1 (%2): %3.</source>
        <translation>%1 (%2): %3.</translation>
    </message>
    <message>
        <source>The database %1 cannot be opened</source>
        <translation>Die Datenbank %1 kann nicht geöffnet werden</translation>
    </message>
    <message>
        <source>The list of tables cannot be read</source>
        <translation>Die Liste der Tabellen kann nicht gelesen werden</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; cannot be read</source>
        <translation>Die Tabelle „%1“ kann nicht gelesen werden</translation>
    </message>
    <message>
        <source>The primary key of &quot;%1&quot; cannot be read</source>
        <translation>Der Primärschlüssel von „%1“ kann nicht gelesen werden</translation>
    </message>
    <message>
        <source>The foreign keys of &quot;%1&quot; cannot be read</source>
        <translation>Die Fremdschlüssel von „%1“ können nicht gelesen werden</translation>
    </message>
    <message>
        <source>give a password</source>
        <translation>geben Sie ein Passwort an</translation>
    </message>
    <message>
        <source>check the user name and the password</source>
        <translation>prüfen Sie Benutzernamen und Passwort</translation>
    </message>
    <message>
        <source>ask the server&apos;s administrator to let you in</source>
        <translation>bitten Sie den Administrator des Servers um Zugang</translation>
    </message>
    <message>
        <source>check the name of the host</source>
        <translation>prüfen Sie den Namen des Servers</translation>
    </message>
    <message>
        <source>see that the server runs, and check host and port</source>
        <translation>sehen Sie nach, ob der Server läuft, und prüfen Sie Server und Port</translation>
    </message>
    <message>
        <source>see that the server can be reached, and check host and port</source>
        <translation>sehen Sie nach, ob der Server erreichbar ist, und prüfen Sie Server und Port</translation>
    </message>
    <message>
        <source>check the name of the database</source>
        <translation>prüfen Sie den Namen der Datenbank</translation>
    </message>
    <message>
        <source>ask the owner for permission</source>
        <translation>bitten Sie den Eigentümer um die Erlaubnis</translation>
    </message>
    <message>
        <source>check the user name</source>
        <translation>prüfen Sie den Benutzernamen</translation>
    </message>
    <message>
        <source>open the database afresh</source>
        <translation>öffnen Sie die Datenbank neu</translation>
    </message>
    <message>
        <source>another program is writing to it; try again in a moment</source>
        <translation>ein anderes Programm schreibt gerade hinein; versuchen Sie es gleich noch einmal</translation>
    </message>
    <message>
        <source>see that you may read the file and its folder; a database in WAL mode also needs permission to write to the folder</source>
        <translation>sehen Sie nach, ob Sie die Datei und ihren Ordner lesen dürfen; eine Datenbank im WAL-Modus braucht auch das Recht, in den Ordner zu schreiben</translation>
    </message>
    <message>
        <source>the file is damaged; restore it from a copy</source>
        <translation>die Datei ist beschädigt; stellen Sie sie aus einer Kopie wieder her</translation>
    </message>
    <message>
        <source>it is damaged or encrypted; choose another file</source>
        <translation>sie ist beschädigt oder verschlüsselt; wählen Sie eine andere Datei</translation>
    </message>
    <message>
        <source>put And or Or between two conditions, or quotes around a text</source>
        <translation>setzen Sie And oder Or zwischen zwei Bedingungen oder Anführungszeichen um einen Text</translation>
    </message>
    <message>
        <source>this is nested too deep, 100 levels are the most</source>
        <translation>das ist zu tief verschachtelt, höchstens 100 Ebenen sind möglich</translation>
    </message>
    <message>
        <source>a closing %1 is missing</source>
        <translation>hier fehlt ein schließendes %1</translation>
    </message>
    <message>
        <source>after In comes a list in parentheses, as in In (1, 2)</source>
        <translation>nach In kommt eine Liste in Klammern, wie in In (1, 2)</translation>
    </message>
    <message>
        <source>after Is comes Null or Not Null, and a text that begins so needs quotes</source>
        <translation>nach Is kommt Null oder Not Null, und ein Text, der so beginnt, braucht Anführungszeichen</translation>
    </message>
    <message>
        <source>Like works only on columns that hold text, use =, &lt; or &gt; here</source>
        <translation>Like geht nur bei Spalten, die Text enthalten, nehmen Sie hier =, &lt; oder &gt;</translation>
    </message>
    <message>
        <source>after Like comes a pattern, as in Like &apos;A*&apos;, not a column</source>
        <translation>nach Like kommt ein Muster, wie in Like &apos;A*&apos;, keine Spalte</translation>
    </message>
    <message>
        <source>after Like comes a pattern, as in Like &apos;A*&apos;</source>
        <translation>nach Like kommt ein Muster, wie in Like &apos;A*&apos;</translation>
    </message>
    <message>
        <source>Between needs And and a second value, as in Between 1 And 5</source>
        <translation>Between braucht And und einen zweiten Wert, wie in Between 1 And 5</translation>
    </message>
    <message>
        <source>a comma or a closing ) is missing</source>
        <translation>hier fehlt ein Komma oder ein schließendes )</translation>
    </message>
    <message>
        <source>nothing is equal to Null, write Is Null for a missing value or &apos;Null&apos; for the word</source>
        <translation>nichts ist gleich Null, schreiben Sie Is Null für einen fehlenden Wert oder &apos;Null&apos; für das Wort</translation>
    </message>
    <message>
        <source>a parameter needs a name, as in :year</source>
        <translation>ein Parameter braucht einen Namen, wie in :jahr</translation>
    </message>
    <message>
        <source>the name of a column is missing behind the point</source>
        <translation>hinter dem Punkt fehlt der Name einer Spalte</translation>
    </message>
    <message>
        <source>the query has no column %1</source>
        <translation>die Abfrage hat keine Spalte %1</translation>
    </message>
    <message>
        <source>the table of this column was deleted from the query</source>
        <translation>die Tabelle dieser Spalte wurde aus der Abfrage gelöscht</translation>
    </message>
    <message>
        <source>several tables have this column, write the table too, as in %1</source>
        <translation>mehrere Tabellen haben diese Spalte, schreiben Sie auch die Tabelle, wie in %1</translation>
    </message>
    <message>
        <source>compare it with a column that holds %1</source>
        <translation>vergleichen Sie mit einer Spalte, die Werte dieser Art enthält: %1</translation>
    </message>
    <message>
        <source>half a character stands here, type it afresh</source>
        <translation>hier steht ein halbes Zeichen, tippen Sie es neu</translation>
    </message>
    <message>
        <source>a [ before this ] is missing</source>
        <translation>vor diesem ] fehlt ein [</translation>
    </message>
    <message>
        <source>write &lt;&gt; for unequal</source>
        <translation>schreiben Sie &lt;&gt; für ungleich</translation>
    </message>
    <message>
        <source>a name is missing between the brackets</source>
        <translation>zwischen den Klammern fehlt ein Name</translation>
    </message>
    <message>
        <source>a text is missing</source>
        <translation>hier fehlt ein Text</translation>
    </message>
    <message>
        <source>a number is missing</source>
        <translation>hier fehlt eine Zahl</translation>
    </message>
    <message>
        <source>a date (2024-12-31) is missing</source>
        <translation>hier fehlt ein Datum (2024-12-31)</translation>
    </message>
    <message>
        <source>a time (23:59) is missing</source>
        <translation>hier fehlt eine Uhrzeit (23:59)</translation>
    </message>
    <message>
        <source>a date and time (2024-12-31 23:59) is missing</source>
        <translation>hier fehlen Datum und Uhrzeit (2024-12-31 23:59)</translation>
    </message>
    <message>
        <source>true or false is missing</source>
        <translation>hier fehlt true oder false</translation>
    </message>
    <message>
        <source>a value is missing</source>
        <translation>hier fehlt ein Wert</translation>
    </message>
    <message>
        <source>this is no number, write it like 12 or 1.5</source>
        <translation>das ist keine Zahl, schreiben Sie sie wie 12 oder 1.5</translation>
    </message>
    <message>
        <source>decimals are written with a point, as in 1.5</source>
        <translation>Dezimalzahlen schreibt man mit einem Punkt, wie in 1.5</translation>
    </message>
    <message>
        <source>this is no date, write it like 2024-12-31</source>
        <translation>das ist kein Datum, schreiben Sie es wie 2024-12-31</translation>
    </message>
    <message>
        <source>this is no time, write it like 23:59</source>
        <translation>das ist keine Uhrzeit, schreiben Sie sie wie 23:59</translation>
    </message>
    <message>
        <source>write true or false here</source>
        <translation>schreiben Sie hier true oder false</translation>
    </message>
    <message>
        <source>only dates and times stand between two #</source>
        <translation>zwischen zwei # stehen nur Datum und Uhrzeit</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is not a file; choose another name.</source>
        <translation>„%1“ ist keine Datei; wählen Sie einen anderen Namen.</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is not a file; choose a query file.</source>
        <translation>„%1“ ist keine Datei; wählen Sie eine Abfragedatei.</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; is write-protected; save under another name.</source>
        <translation>Die Datei „%1“ ist schreibgeschützt; speichern Sie unter einem anderen Namen.</translation>
    </message>
    <message>
        <source>%1 (%2); %3.</source>
        <translation>%1 (%2); %3.</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; cannot be saved</source>
        <translation>Die Datei „%1“ kann nicht gespeichert werden</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; cannot be read</source>
        <translation>Die Datei „%1“ kann nicht gelesen werden</translation>
    </message>
    <message>
        <source>The output cannot be written</source>
        <translation>Die Ausgabe kann nicht geschrieben werden</translation>
    </message>
    <message>
        <source>check the path</source>
        <translation>prüfen Sie den Pfad</translation>
    </message>
    <message>
        <source>ask the owner for permission, or choose another folder</source>
        <translation>bitten Sie den Eigentümer um die Erlaubnis oder wählen Sie einen anderen Ordner</translation>
    </message>
    <message>
        <source>make room on the disk, or choose another one</source>
        <translation>schaffen Sie Platz auf dem Datenträger oder wählen Sie einen anderen</translation>
    </message>
    <message>
        <source>choose another disk</source>
        <translation>wählen Sie einen anderen Datenträger</translation>
    </message>
    <message>
        <source>choose a folder on another disk</source>
        <translation>wählen Sie einen Ordner auf einem anderen Datenträger</translation>
    </message>
    <message>
        <source>try again, or choose another folder</source>
        <translation>versuchen Sie es noch einmal oder wählen Sie einen anderen Ordner</translation>
    </message>
    <message>
        <source>choose a shorter name</source>
        <translation>wählen Sie einen kürzeren Namen</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; cannot be used: %2</source>
        <translation>Die Datei „%1“ kann nicht verwendet werden: %2</translation>
    </message>
    <message>
        <source>%1. %2.</source>
        <translation>%1. %2.</translation>
    </message>
    <message>
        <source>Mend the file there, or restore it from a copy</source>
        <translation>Berichtigen Sie die Datei an dieser Stelle oder stellen Sie sie aus einer Kopie wieder her</translation>
    </message>
    <message>
        <source>Choose a query file</source>
        <translation>Wählen Sie eine Abfragedatei</translation>
    </message>
    <message>
        <source>Open the file with a newer version of this program</source>
        <translation>Öffnen Sie die Datei mit einer neueren Version dieses Programms</translation>
    </message>
    <message>
        <source>Type that text afresh and save again</source>
        <translation>Tippen Sie diesen Text neu und speichern Sie noch einmal</translation>
    </message>
    <message>
        <source>The query could not be read again: %1</source>
        <translation>Die Abfrage konnte nicht wieder gelesen werden: %1</translation>
    </message>
    <message>
        <source>The query would not be the same when read again. Report this, please.</source>
        <translation>Die Abfrage wäre nach dem Wiederlesen nicht dieselbe. Bitte melden Sie das.</translation>
    </message>
    <message>
        <source>The file</source>
        <translation>Die Datei</translation>
    </message>
    <message>
        <source>Line %1, column %2: %3</source>
        <translation>Zeile %1, Spalte %2: %3</translation>
    </message>
    <message>
        <source>a number is too large</source>
        <translation>eine Zahl ist zu groß</translation>
    </message>
    <message>
        <source>%1 stands there twice</source>
        <translation>%1 steht dort zweimal</translation>
    </message>
    <message>
        <source>%1 is longer than %2 characters</source>
        <translation>%1 ist länger als %2 Zeichen</translation>
    </message>
    <message>
        <source>%1 has a NUL character in it</source>
        <translation>%1 enthält ein NUL-Zeichen</translation>
    </message>
    <message>
        <source>%1 is nested more than %2 levels deep</source>
        <translation>%1 ist mehr als %2 Ebenen tief verschachtelt</translation>
    </message>
    <message>
        <source>%1 is one value too many: a file may have %2</source>
        <translation>%1 ist ein Wert zu viel: Eine Datei darf %2 haben</translation>
    </message>
    <message>
        <source>%1 is larger than %2 MiB</source>
        <translation>%1 ist größer als %2 MiB</translation>
    </message>
    <message>
        <source>%1 is not an object</source>
        <translation>%1 ist kein Objekt</translation>
    </message>
    <message>
        <source>%1 is not a text</source>
        <translation>%1 ist kein Text</translation>
    </message>
    <message>
        <source>%1 is neither a text nor null</source>
        <translation>%1 ist weder ein Text noch null</translation>
    </message>
    <message>
        <source>%1 is not true or false</source>
        <translation>%1 ist weder true noch false</translation>
    </message>
    <message>
        <source>%1 is not a list</source>
        <translation>%1 ist keine Liste</translation>
    </message>
    <message>
        <source>%1 has more than %2 entries</source>
        <translation>%1 hat mehr als %2 Einträge</translation>
    </message>
    <message>
        <source>%1 is missing</source>
        <translation>%1 fehlt</translation>
    </message>
    <message>
        <source>%1 is not a whole number from %2 to %3</source>
        <translation>%1 ist keine ganze Zahl von %2 bis %3</translation>
    </message>
    <message>
        <source>%1 is &quot;%2&quot; and none of %3</source>
        <translation>%1 ist „%2“ und keines von %3</translation>
    </message>
    <message>
        <source>%1 makes the columns of all tables more than %2</source>
        <translation>%1 bringt die Spalten aller Tabellen auf mehr als %2</translation>
    </message>
    <message>
        <source>%1 is no length of a name in the text</source>
        <translation>%1 ist keine Länge eines Namens im Text</translation>
    </message>
    <message>
        <source>%1 is not &quot;%2&quot;</source>
        <translation>%1 ist nicht „%2“</translation>
    </message>
    <message>
        <source>%1 is less than 1</source>
        <translation>%1 ist kleiner als 1</translation>
    </message>
    <message>
        <source>%1 is %2 and newer than %3, the newest that can be read here</source>
        <translation>%1 ist %2 und neuer als %3, die neueste Version, die sich hier lesen lässt</translation>
    </message>
    <message>
        <source>%1 has half a character in it (an unpaired surrogate)</source>
        <translation>%1 enthält ein halbes Zeichen (ein Surrogat ohne Gegenstück)</translation>
    </message>
    <message>
        <source>%1</source>
        <translation>%1</translation>
    </message>
    <message>
        <source>The table of an output column is no longer in the query: delete the output column, or choose another field for it.</source>
        <translation>Die Tabelle einer Ausgabespalte ist nicht mehr in der Abfrage: Löschen Sie die Ausgabespalte oder wählen Sie ein anderes Feld für sie.</translation>
    </message>
    <message>
        <source>%1.* stands for all columns and cannot be sorted by: add the column that is to decide, and sort by that.</source>
        <translation>%1.* steht für alle Spalten, danach lässt sich nicht sortieren: Fügen Sie die Spalte hinzu, die entscheiden soll, und sortieren Sie nach ihr.</translation>
    </message>
    <message>
        <source>%1.* stands for all columns and cannot have a criterion: add the column that is meant, and write the criterion there.</source>
        <translation>%1.* steht für alle Spalten und kann kein Kriterium haben: Fügen Sie die Spalte hinzu, die gemeint ist, und schreiben Sie das Kriterium dorthin.</translation>
    </message>
    <message>
        <source>Two output columns are named %1, so that nobody can tell them apart: give one of them a synonym.</source>
        <translation>Zwei Ausgabespalten heißen %1, sodass niemand sie unterscheiden kann: Geben Sie einer von ihnen ein Synonym.</translation>
    </message>
    <message>
        <source>%1 and %2 hold different kinds of values, so that their join finds nothing or fails: join columns that hold the same.</source>
        <translation>%1 und %2 enthalten verschiedene Arten von Werten, sodass ihre Verknüpfung nichts findet oder scheitert: Verknüpfen Sie Spalten, die Werte derselben Art enthalten.</translation>
    </message>
    <message>
        <source>The outer join between %1 and %2 keeps no more rows than a normal one, for normal joins connect these tables too: make it a normal join, or make the others outer ones.</source>
        <translation>Die äußere Verknüpfung zwischen %1 und %2 behält nicht mehr Zeilen als eine normale, denn auch normale Verknüpfungen verbinden diese Tabellen: Machen Sie eine normale Verknüpfung daraus oder aus den anderen äußere.</translation>
    </message>
    <message>
        <source>The outer joins around %1 and %2 contradict each other, and the one drawn first decides which rows are kept: let all of them keep the rows of the same table.</source>
        <translation>Die äußeren Verknüpfungen um %1 und %2 widersprechen sich, und die zuerst gezeichnete entscheidet, welche Zeilen bleiben: Lassen Sie alle die Zeilen derselben Tabelle behalten.</translation>
    </message>
    <message>
        <source>The outer joins around %1 can be read in several ways, each with other rows: change the type of one of them.</source>
        <translation>Die äußeren Verknüpfungen um %1 lassen sich auf mehrere Weisen lesen, jede mit anderen Zeilen: Ändern Sie die Art einer von ihnen.</translation>
    </message>
    <message>
        <source>No join connects %1 with %2, so that every row of one comes with every row of the other: draw a join between them, add the table that lies between, or delete one.</source>
        <translation>Keine Verknüpfung verbindet %1 mit %2, sodass jede Zeile der einen mit jeder Zeile der anderen kommt: Zeichnen Sie eine Verknüpfung zwischen ihnen, fügen Sie die Tabelle hinzu, die dazwischen liegt, oder löschen Sie eine der beiden.</translation>
    </message>
    <message>
        <source>Standard SQL</source>
        <translation>Standard-SQL</translation>
    </message>
    <message>
        <source>MySQL/MariaDB has no join that keeps all rows of both tables: let this one keep those of one table.</source>
        <translation>MySQL/MariaDB hat keine Verknüpfung, die alle Zeilen beider Tabellen behält: Lassen Sie diese hier nur die Zeilen einer Tabelle behalten.</translation>
    </message>
    <message>
        <source>PostgreSQL keeps all rows of both tables only where a join asks for equal values: choose the operator =, or let the join keep the rows of one table.</source>
        <translation>PostgreSQL behält alle Zeilen beider Tabellen nur, wo eine Verknüpfung gleiche Werte verlangt: Wählen Sie den Operator = oder lassen Sie die Verknüpfung nur die Zeilen einer Tabelle behalten.</translation>
    </message>
    <message>
        <source>These are more conditions than SQLite takes, which is about 900: write a long list of values as In (1, 2, 3).</source>
        <translation>Das sind mehr Bedingungen, als SQLite nimmt, nämlich etwa 900: Schreiben Sie eine lange Liste von Werten als In (1, 2, 3).</translation>
    </message>
    <message>
        <source>%1 takes no name that is empty: write one.</source>
        <translation>%1 nimmt keinen leeren Namen: Schreiben Sie einen.</translation>
    </message>
    <message>
        <source>%1 takes no name with the character zero in it: choose another one.</source>
        <translation>%1 nimmt keinen Namen, in dem das Zeichen null steht: Wählen Sie einen anderen.</translation>
    </message>
    <message>
        <source>%1 takes no name with half a character in it: type it afresh.</source>
        <translation>%1 nimmt keinen Namen, in dem ein halbes Zeichen steht: Tippen Sie ihn neu.</translation>
    </message>
    <message>
        <source>The name &quot;%1&quot; is too long for %2, which takes %3 bytes (one for a letter from A to Z, more for most others): choose a shorter one.</source>
        <translation>Der Name „%1“ ist zu lang für %2, das %3 Bytes nimmt (eines für einen Buchstaben von A bis Z, mehr für die meisten anderen Zeichen): Wählen Sie einen kürzeren.</translation>
    </message>
    <message>
        <source>The name &quot;%1&quot; is too long for %2, which takes %3 characters: choose a shorter one.</source>
        <translation>Der Name „%1“ ist zu lang für %2, das %3 Zeichen nimmt: Wählen Sie einen kürzeren.</translation>
    </message>
    <message>
        <source>The name &quot;%1&quot; has a rare character in it that %2 does not take, such as an emoji: write it without.</source>
        <translation>Der Name „%1“ enthält ein seltenes Zeichen, das %2 nicht nimmt, etwa ein Emoji: Schreiben Sie ihn ohne.</translation>
    </message>
    <message>
        <source>The name &quot;%1&quot; ends with a blank, which %2 does not take: write it without.</source>
        <translation>Der Name „%1“ endet mit einem Leerzeichen, was %2 nicht nimmt: Schreiben Sie ihn ohne.</translation>
    </message>
    <message>
        <source>* and % are ordinary characters here, write Like before a pattern, or quotes around a text</source>
        <translation>* und % sind hier gewöhnliche Zeichen, schreiben Sie Like vor ein Muster oder Anführungszeichen um einen Text</translation>
    </message>
    <message>
        <source>a value</source>
        <translation>ein Wert</translation>
    </message>
    <message>
        <source>this is no date and time, write it like 2024-12-31 or 2024-12-31 23:59</source>
        <translation>das ist keine Angabe von Datum und Uhrzeit, schreiben Sie sie wie 2024-12-31 oder 2024-12-31 23:59</translation>
    </message>
    <message>
        <source>%1 is not from %2 to %3</source>
        <translation>%1 liegt nicht im Bereich von %2 bis %3</translation>
    </message>
    <message>
        <source>%1 is not the letter %2 and a number from 1 to %3</source>
        <translation>%1 ist nicht der Buchstabe %2 und eine Zahl von 1 bis %3</translation>
    </message>
    <message>
        <source>%1 is beyond the last key %2 of its kind</source>
        <translation>%1 liegt hinter dem letzten Schlüssel %2 seiner Art</translation>
    </message>
    <message>
        <source>%1 is used before already</source>
        <translation>%1 wird vorher schon verwendet</translation>
    </message>
    <message>
        <source>%1 is empty</source>
        <translation>%1 ist leer</translation>
    </message>
    <message>
        <source>%1 is the name of another table too</source>
        <translation>%1 ist auch der Name einer anderen Tabelle</translation>
    </message>
    <message>
        <source>%1 does not begin with the entry &quot;*&quot;</source>
        <translation>%1 beginnt nicht mit dem Eintrag „*“</translation>
    </message>
    <message>
        <source>%1 is the key of no table</source>
        <translation>%1 ist der Schlüssel keiner Tabelle</translation>
    </message>
    <message>
        <source>%1 is the key of no column</source>
        <translation>%1 ist der Schlüssel keiner Spalte</translation>
    </message>
    <message>
        <source>%1 is the key of no column of that table</source>
        <translation>%1 ist der Schlüssel keiner Spalte dieser Tabelle</translation>
    </message>
    <message>
        <source>%1 is no type of join</source>
        <translation>%1 ist keine Art der Verknüpfung</translation>
    </message>
    <message>
        <source>%1 is no comparison</source>
        <translation>%1 ist kein Vergleich</translation>
    </message>
    <message>
        <source>%1 is no sort order</source>
        <translation>%1 ist keine Sortierung</translation>
    </message>
    <message>
        <source>%1 is less than the first row, %2</source>
        <translation>%1 ist kleiner als die erste Zeile, %2</translation>
    </message>
    <message>
        <source>%1 does not come behind the row before it</source>
        <translation>%1 kommt nicht hinter der Zeile davor</translation>
    </message>
    <message>
        <source>%1 is no place in the text behind the name before it</source>
        <translation>%1 ist keine Stelle im Text hinter dem Namen davor</translation>
    </message>
    <message>
        <source>%1.* stands for all columns: count the rows with the total &quot;count&quot;, or add the columns that are meant.</source>
        <translation>%1.* steht für alle Spalten: die Zeilen mit der Auswertung „count“ zählen oder die gemeinten Spalten hinzufügen.</translation>
    </message>
    <message>
        <source>%1 holds no numbers, for which alone there is the total &quot;%2&quot;: choose another total.</source>
        <translation>%1 enthält keine Zahlen, und nur für sie gibt es die Auswertung „%2“: eine andere wählen.</translation>
    </message>
    <message>
        <source>%1 holds values that have no order, so that there is no total &quot;%2&quot; of them: choose another total.</source>
        <translation>%1 enthält Werte ohne Reihenfolge, darum gibt es für sie keine Auswertung „%2“: eine andere wählen.</translation>
    </message>
    <message>
        <source>Where criteria stand in several rows, some of a total and some of a column that is only a condition, the latter must be the same in every row: repeat it, or make two queries of this one.</source>
        <translation>Wo Kriterien in mehreren Zeilen stehen, teils einer Auswertung und teils einer Spalte, die nur Bedingung ist, muss letzteres in jeder Zeile gleich sein: wiederholen oder zwei Abfragen daraus machen.</translation>
    </message>
    <message>
        <source>This criterion is asked of rows that were put together, and %1 has many values there: add it as a column of its own, or write a value.</source>
        <translation>Dieses Kriterium wird auf zusammengefasste Zeilen angewandt, und %1 hat dort viele Werte: als eigene Spalte hinzufügen oder einen Wert schreiben.</translation>
    </message>
    <message>
        <source>%1 sorts the rows and does not come out with them, which different rows need: show it, or take its sort away.</source>
        <translation>%1 sortiert die Zeilen und kommt nicht mit heraus, was verschiedene Zeilen aber brauchen: die Spalte zeigen oder ihre Sortierung wegnehmen.</translation>
    </message>
    <message>
        <source>%1 is only a condition, so that nothing can be sorted by it: choose another total, or take its sort away.</source>
        <translation>%1 ist nur eine Bedingung, danach kann nicht sortiert werden: eine andere Auswertung wählen oder die Sortierung wegnehmen.</translation>
    </message>
    <message>
        <source>The first %1 rows are any %1 as long as nothing is sorted: sort by what is to decide.</source>
        <translation>Die ersten %1 Zeilen sind irgendwelche %1, solange nichts sortiert ist: nach dem sortieren, was entscheiden soll.</translation>
    </message>
    <message>
        <source>%2 has nothing that says %1: leave it out, or calculate it from what was found.</source>
        <translation>%2 hat nichts, das %1 sagt: weglassen oder aus dem Gefundenen berechnen.</translation>
    </message>
    <message>
        <source>The parameter %1 stands in an expression that rows are put together by: show that column, or write a value in the place of the parameter.</source>
        <translation>Der Parameter %1 steht in einem Ausdruck, nach dem Zeilen zusammengefasst werden: diese Spalte zeigen oder statt des Parameters einen Wert schreiben.</translation>
    </message>
    <message>
        <source>at most 10000 characters can stand here</source>
        <translation>hier können höchstens 10000 Zeichen stehen</translation>
    </message>
    <message>
        <source>the character zero cannot stand here</source>
        <translation>das Zeichen Null kann hier nicht stehen</translation>
    </message>
    <message>
        <source>%1 means nothing here</source>
        <translation>%1 bedeutet hier nichts</translation>
    </message>
    <message>
        <source>put an operator between two values, such as + or &amp;</source>
        <translation>zwischen zwei Werte einen Operator setzen, etwa + oder &amp;</translation>
    </message>
    <message>
        <source>compare it with %1</source>
        <translation>mit %1 vergleichen</translation>
    </message>
    <message>
        <source>a condition is needed here, as in [price] &gt; 5</source>
        <translation>hier wird eine Bedingung gebraucht, wie in [price] &gt; 5</translation>
    </message>
    <message>
        <source>a number is needed here</source>
        <translation>hier wird eine Zahl gebraucht</translation>
    </message>
    <message>
        <source>a whole number is needed here</source>
        <translation>hier wird eine ganze Zahl gebraucht</translation>
    </message>
    <message>
        <source>the number of decimals is needed here, from 0 to 15</source>
        <translation>hier wird die Zahl der Nachkommastellen gebraucht, von 0 bis 15</translation>
    </message>
    <message>
        <source>a date is needed here, as in #2024-12-31#</source>
        <translation>hier wird ein Datum gebraucht, wie in #2024-12-31#</translation>
    </message>
    <message>
        <source>texts are joined by &amp;</source>
        <translation>Texte werden mit &amp; verbunden</translation>
    </message>
    <message>
        <source>the query has no column %1, and a text stands in quotes</source>
        <translation>die Abfrage hat keine Spalte %1, und ein Text steht in Anführungszeichen</translation>
    </message>
    <message>
        <source>there is no function %1</source>
        <translation>es gibt keine Funktion %1</translation>
    </message>
    <message>
        <source>a total is no function: write what is to be put together, and choose the total of the output column</source>
        <translation>eine Auswertung ist keine Funktion: schreiben, was zusammengefasst werden soll, und die Auswertung der Ausgabespalte wählen</translation>
    </message>
    <message>
        <source>this is written %1</source>
        <translation>das schreibt man %1</translation>
    </message>
    <message>
        <source>%1 is no total</source>
        <translation>%1 ist keine Auswertung</translation>
    </message>
    <message>
        <source>%1 stands beside an expression, which takes its place</source>
        <translation>%1 steht neben einem Ausdruck, der an seine Stelle tritt</translation>
    </message>
    <message>
        <source>This is nested deeper than SQLite takes, which is about 30 levels of parentheses: divide it among several columns or rows of criteria.</source>
        <translation>Das ist tiefer geschachtelt, als SQLite es nimmt, etwa 30 Ebenen von Klammern: auf mehrere Spalten oder Zeilen von Kriterien verteilen.</translation>
    </message>
    <message>
        <source>This is a statement of more than a million characters: put fewer functions into each other, or divide it among several columns.</source>
        <translation>Das ergibt eine Anweisung von mehr als einer Million Zeichen: weniger Funktionen ineinander setzen oder auf mehrere Spalten verteilen.</translation>
    </message>
    <message>
        <source>%1 is no format of values</source>
        <translation>%1 ist kein Format für Werte</translation>
    </message>
    <message>
        <source>The query &quot;%1&quot; would read from itself, by itself or by way of the saved queries in it: choose another one, or take one out.</source>
        <translation>Die Abfrage „%1“ würde aus sich selbst lesen, unmittelbar oder über die gespeicherten Abfragen in ihr: Wählen Sie eine andere, oder nehmen Sie eine heraus.</translation>
    </message>
    <message>
        <source>In %1: %2</source>
        <translation>In %1: %2</translation>
    </message>
    <message>
        <source>No column comes out of that query, so that it cannot stand as a table: give it output columns, and save it.</source>
        <translation>Aus dieser Abfrage kommt keine Spalte heraus, also kann sie nicht als Tabelle stehen: Geben Sie ihr Ausgabespalten, und speichern Sie sie.</translation>
    </message>
    <message>
        <source>Saved queries stand more than %1 deep in each other then: make one query of some of them.</source>
        <translation>Gespeicherte Abfragen stünden dann mehr als %1 tief ineinander: Machen Sie aus einigen eine einzige.</translation>
    </message>
    <message>
        <source>%1 gives no column %2 any more, which is used here: take it out of this query, or give it back to that one.</source>
        <translation>%1 liefert keine Spalte %2 mehr, die hier verwendet wird: Nehmen Sie sie aus dieser Abfrage heraus, oder geben Sie sie jener zurück.</translation>
    </message>
    <message>
        <source>%1 has other columns here than its query gives: read it again from its file.</source>
        <translation>%1 hat hier andere Spalten, als ihre Abfrage liefert: Lesen Sie sie neu aus ihrer Datei.</translation>
    </message>
    <message>
        <source>%1 has saved queries more than %2 deep in each other</source>
        <translation>%1 hat gespeicherte Abfragen mehr als %2 tief ineinander</translation>
    </message>
    <message>
        <source>this cannot be read as SQL (%1); mend it here or before.</source>
        <translation>das lässt sich nicht als SQL lesen (%1); berichtigen Sie es hier oder davor.</translation>
    </message>
    <message>
        <source>what begins here has no end; close it with %1.</source>
        <translation>was hier beginnt, hat kein Ende; schließen Sie es mit %1.</translation>
    </message>
    <message>
        <source>there is no statement; write a SELECT.</source>
        <translation>es gibt keine Anweisung; schreiben Sie ein SELECT.</translation>
    </message>
    <message>
        <source>a drawing holds one statement; leave out all but one.</source>
        <translation>eine Zeichnung fasst eine Anweisung; lassen Sie alle bis auf eine weg.</translation>
    </message>
    <message>
        <source>a drawing holds a SELECT and nothing else.</source>
        <translation>eine Zeichnung fasst ein SELECT und nichts anderes.</translation>
    </message>
    <message>
        <source>this name is too long to be read.</source>
        <translation>dieser Name ist zu lang, um gelesen zu werden.</translation>
    </message>
    <message>
        <source>the text is too long to be drawn; at most %1 characters are read.</source>
        <translation>der Text ist zu lang, um gezeichnet zu werden; höchstens %1 Zeichen werden gelesen.</translation>
    </message>
    <message>
        <source>too much stands within each other here to be drawn.</source>
        <translation>hier ist zu viel ineinander verschachtelt, um gezeichnet zu werden.</translation>
    </message>
    <message>
        <source>a drawing has no place for %1; it can be run as it is.</source>
        <translation>eine Zeichnung hat keinen Platz für %1; ausführen lässt es sich, wie es ist.</translation>
    </message>
    <message>
        <source>a window function</source>
        <translation>eine Fensterfunktion</translation>
    </message>
    <message>
        <source>UNION, INTERSECT or EXCEPT</source>
        <translation>UNION, INTERSECT oder EXCEPT</translation>
    </message>
    <message>
        <source>WITH RECURSIVE</source>
        <translation>WITH RECURSIVE</translation>
    </message>
    <message>
        <source>a LATERAL source</source>
        <translation>eine LATERAL-Quelle</translation>
    </message>
    <message>
        <source>a sub-select within a condition or value</source>
        <translation>ein Unter-SELECT in einer Bedingung oder einem Wert</translation>
    </message>
    <message>
        <source>rows left out by OFFSET</source>
        <translation>Zeilen, die OFFSET auslässt</translation>
    </message>
    <message>
        <source>a limit that is no number from 1 to %1</source>
        <translation>eine Grenze, die keine Zahl von 1 bis %1 ist</translation>
    </message>
    <message>
        <source>PERCENT or WITH TIES</source>
        <translation>PERCENT oder WITH TIES</translation>
    </message>
    <message>
        <source>a lock</source>
        <translation>eine Sperre</translation>
    </message>
    <message>
        <source>DISTINCT ON</source>
        <translation>DISTINCT ON</translation>
    </message>
    <message>
        <source>NULLS FIRST or NULLS LAST</source>
        <translation>NULLS FIRST oder NULLS LAST</translation>
    </message>
    <message>
        <source>grouping sets</source>
        <translation>Gruppierungsmengen</translation>
    </message>
    <message>
        <source>a function in the place of a table</source>
        <translation>eine Funktion anstelle einer Tabelle</translation>
    </message>
    <message>
        <source>new names for the columns of a table</source>
        <translation>neue Namen für die Spalten einer Tabelle</translation>
    </message>
    <message>
        <source>a SELECT that reads from no table</source>
        <translation>ein SELECT, das aus keiner Tabelle liest</translation>
    </message>
    <message>
        <source>a SELECT of no columns</source>
        <translation>ein SELECT ohne Spalten</translation>
    </message>
    <message>
        <source>a column that a FULL JOIN shares by USING or NATURAL</source>
        <translation>eine Spalte, die ein FULL JOIN durch USING oder NATURAL teilt</translation>
    </message>
    <message>
        <source>a total within a calculation</source>
        <translation>eine Zusammenfassung in einer Berechnung</translation>
    </message>
    <message>
        <source>this (%1)</source>
        <translation>das hier (%1)</translation>
    </message>
    <message>
        <source>a drawing does not know the function %1 as it stands here; the statement can be run as it is.</source>
        <translation>eine Zeichnung kennt die Funktion %1 nicht, wie sie hier steht; die Anweisung lässt sich ausführen, wie sie ist.</translation>
    </message>
    <message>
        <source>a drawing does not know this cast; the statement can be run as it is.</source>
        <translation>eine Zeichnung kennt diese Umwandlung nicht; die Anweisung lässt sich ausführen, wie sie ist.</translation>
    </message>
    <message>
        <source>a drawing does not know the operator %1; the statement can be run as it is.</source>
        <translation>eine Zeichnung kennt den Operator %1 nicht; die Anweisung lässt sich ausführen, wie sie ist.</translation>
    </message>
    <message>
        <source>this division may give whole numbers or stop at 0, which one of a drawing does not; write %1.</source>
        <translation>diese Division ergibt vielleicht ganze Zahlen oder bricht bei 0 ab, was die einer Zeichnung nicht tut; schreiben Sie %1.</translation>
    </message>
    <message>
        <source>a drawing writes this as &apos;%1&apos;, which compares otherwise here; write it so.</source>
        <translation>eine Zeichnung schreibt das als &apos;%1&apos;, was sich hier anders vergleicht; schreiben Sie es so.</translation>
    </message>
    <message>
        <source>LIKE tells capitals from small letters here, which a drawing does not; write ILIKE if that is meant.</source>
        <translation>LIKE unterscheidet hier große und kleine Buchstaben, eine Zeichnung nicht; schreiben Sie ILIKE, wenn das gemeint ist.</translation>
    </message>
    <message>
        <source>a drawing has no NULL as a value; write IS NULL or leave it out.</source>
        <translation>eine Zeichnung kennt kein NULL als Wert; schreiben Sie IS NULL oder lassen Sie es weg.</translation>
    </message>
    <message>
        <source>this column is neither grouped nor a total; write it into GROUP BY.</source>
        <translation>diese Spalte ist weder gruppiert noch zusammengefasst; schreiben Sie sie in GROUP BY.</translation>
    </message>
    <message>
        <source>a drawing cannot hold this: %1</source>
        <translation>eine Zeichnung kann das nicht fassen: %1</translation>
    </message>
    <message>
        <source>the condition of an outer join can compare columns of its two sides and nothing else in a drawing.</source>
        <translation>die Bedingung einer äußeren Verknüpfung kann in einer Zeichnung Spalten ihrer beiden Seiten vergleichen und sonst nichts.</translation>
    </message>
    <message>
        <source>this condition has no place in the rows of a drawing.</source>
        <translation>diese Bedingung hat in den Zeilen einer Zeichnung keinen Platz.</translation>
    </message>
    <message>
        <source>drawn, this would not say the same (%1); it can be run as it is.</source>
        <translation>gezeichnet würde das nicht dasselbe sagen (%1); ausführen lässt es sich, wie es ist.</translation>
    </message>
    <message>
        <source>the order of its joins</source>
        <translation>die Reihenfolge seiner Verknüpfungen</translation>
    </message>
    <message>
        <source>its conditions</source>
        <translation>seine Bedingungen</translation>
    </message>
    <message>
        <source>its columns</source>
        <translation>seine Spalten</translation>
    </message>
    <message>
        <source>its groups</source>
        <translation>seine Gruppen</translation>
    </message>
    <message>
        <source>its order</source>
        <translation>seine Sortierung</translation>
    </message>
    <message>
        <source>the database has no table &quot;%1&quot;.</source>
        <translation>die Datenbank hat keine Tabelle „%1“.</translation>
    </message>
    <message>
        <source>the database has no table &quot;%1&quot;; is &quot;%2&quot; meant?</source>
        <translation>die Datenbank hat keine Tabelle „%1“; ist „%2“ gemeint?</translation>
    </message>
    <message>
        <source>there is no table &quot;%1&quot; in the statement.</source>
        <translation>es gibt keine Tabelle „%1“ in der Anweisung.</translation>
    </message>
    <message>
        <source>no table has a column &quot;%1&quot;.</source>
        <translation>keine Tabelle hat eine Spalte „%1“.</translation>
    </message>
    <message>
        <source>no table has a column &quot;%1&quot;; is &quot;%2&quot; meant?</source>
        <translation>keine Tabelle hat eine Spalte „%1“; ist „%2“ gemeint?</translation>
    </message>
    <message>
        <source>several tables have a column &quot;%1&quot;; write its table before it.</source>
        <translation>mehrere Tabellen haben eine Spalte „%1“; schreiben Sie ihre Tabelle davor.</translation>
    </message>
    <message>
        <source>two tables are called &quot;%1&quot; here; give one of them another name.</source>
        <translation>zwei Tabellen heißen hier „%1“; geben Sie einer einen anderen Namen.</translation>
    </message>
    <message>
        <source>two columns come out as &quot;%1&quot;.</source>
        <translation>zwei Spalten kommen als „%1“ heraus.</translation>
    </message>
    <message>
        <source>there is no output column %1.</source>
        <translation>es gibt keine Ausgabespalte %1.</translation>
    </message>
    <message>
        <source>a comment that is run</source>
        <translation>einen Kommentar, der ausgeführt wird</translation>
    </message>
    <message>
        <source>no more than %1 comments can be kept; leave some out.</source>
        <translation>mehr als %1 Kommentare lassen sich nicht aufbewahren; lassen Sie einige weg.</translation>
    </message>
    <message>
        <source>the database takes these operators together in another order than they are read; write parentheses.</source>
        <translation>die Datenbank fasst diese Operatoren in einer anderen Reihenfolge zusammen, als sie gelesen werden; setzen Sie Klammern.</translation>
    </message>
    <message>
        <source>a drawing takes a date for a moment beside one, which the database does not; the statement can be run as it is.</source>
        <translation>eine Zeichnung macht aus einem Datum neben einem Zeitpunkt auch einen, die Datenbank nicht; die Anweisung kann ausgeführt werden, wie sie ist.</translation>
    </message>
    <message>
        <source>a drawing takes &apos;%1&apos; for no text here, which the database does; write it without quotes.</source>
        <translation>eine Zeichnung nimmt &apos;%1&apos; hier nicht als Text, die Datenbank schon; schreiben Sie es ohne Anführungszeichen.</translation>
    </message>
</context>
<context>
    <name>ZandorWidget</name>
    <message>
        <source>Join %1 %2 %3</source>
        <translation>Verknüpfung %1 %2 %3</translation>
    </message>
    <message>
        <source>Query designer</source>
        <translation>Abfrageentwurf</translation>
    </message>
    <message>
        <source>all</source>
        <comment>the rows of a table, at the end of a line</comment>
        <translation>alle</translation>
    </message>
    <message>
        <source>the rows of %1 and %2 that match</source>
        <translation>die Zeilen von %1 und %2, die zueinander passen</translation>
    </message>
    <message>
        <source>all rows of %1, and those of %2 that match</source>
        <translation>alle Zeilen von %1 und die passenden von %2</translation>
    </message>
    <message>
        <source>all rows of %1 and of %2, side by side where they match</source>
        <translation>alle Zeilen von %1 und von %2, nebeneinander, wo sie zueinander passen</translation>
    </message>
    <message>
        <source>Re&amp;name…</source>
        <translation>&amp;Umbenennen…</translation>
    </message>
    <message>
        <source>(None)</source>
        <comment>no sort order</comment>
        <translation>(Keine)</translation>
    </message>
    <message>
        <source>Ascending</source>
        <translation>Aufsteigend</translation>
    </message>
    <message>
        <source>Descending</source>
        <translation>Absteigend</translation>
    </message>
    <message>
        <source>Visible</source>
        <comment>an output column</comment>
        <translation>Sichtbar</translation>
    </message>
    <message>
        <source>Not Visible</source>
        <translation>Nicht sichtbar</translation>
    </message>
    <message>
        <source>Invisible</source>
        <translation>Unsichtbar</translation>
    </message>
    <message>
        <source>&amp;Set</source>
        <comment>the button of a cell&apos;s editor</comment>
        <translation>&amp;Setzen</translation>
    </message>
    <message>
        <source>Remove the table</source>
        <translation>Tabelle entfernen</translation>
    </message>
    <message>
        <source>key column</source>
        <comment>an entry of a table</comment>
        <translation>Schlüsselspalte</translation>
    </message>
    <message>
        <source>comes out</source>
        <comment>an entry of a table, in the rows</comment>
        <translation>wird ausgegeben</translation>
    </message>
    <message>
        <source>Add field…</source>
        <translation>Neues Feld…</translation>
    </message>
    <message>
        <source>Type to find a field</source>
        <translation>Tippen Sie, um ein Feld zu finden</translation>
    </message>
    <message>
        <source>Field</source>
        <translation>Feld</translation>
    </message>
    <message>
        <source>Fields</source>
        <translation>Felder</translation>
    </message>
    <message>
        <source>column %1</source>
        <translation>Spalte %1</translation>
    </message>
    <message>
        <source>Tables and joins</source>
        <translation>Tabellen und Verknüpfungen</translation>
    </message>
    <message>
        <source>Output columns</source>
        <translation>Ausgabespalten</translation>
    </message>
    <message>
        <source>Scroll across</source>
        <translation>Waagerecht blättern</translation>
    </message>
    <message>
        <source>Scroll down</source>
        <translation>Senkrecht blättern</translation>
    </message>
    <message>
        <source>Back to the origin</source>
        <translation>Zurück zum Anfang</translation>
    </message>
    <message>
        <source>Divider of canvas and grid</source>
        <translation>Trennleiste zwischen Zeichenfläche und Raster</translation>
    </message>
    <message>
        <source>Drag to give the canvas or the grid more room</source>
        <translation>Ziehen Sie, um der Zeichenfläche oder dem Raster mehr Platz zu geben</translation>
    </message>
</context>
<context>
    <name>zandor::designer</name>
    <message>
        <source>There is nothing to draw; add a table first.</source>
        <translation>Es gibt nichts zu zeichnen; fügen Sie zuerst eine Tabelle hinzu.</translation>
    </message>
    <message>
        <source>A picture ends in .png, .svg or .pdf; &quot;%1&quot; does not.</source>
        <translation>Ein Bild endet auf .png, .svg oder .pdf; „%1“ nicht.</translation>
    </message>
    <message>
        <source>The printer cannot be reached; choose another one.</source>
        <translation>Der Drucker ist nicht erreichbar; wählen Sie einen anderen.</translation>
    </message>
    <message>
        <source>The page could not be printed; see the printer&apos;s own messages.</source>
        <translation>Die Seite konnte nicht gedruckt werden; beachten Sie die Meldungen des Druckers.</translation>
    </message>
    <message>
        <source>%1 tables are too many; the canvas takes %2.</source>
        <translation>%1 Tabellen sind zu viele; die Zeichenfläche nimmt %2.</translation>
    </message>
    <message>
        <source>There is no table &quot;%1&quot; in %2.</source>
        <translation>In %2 gibt es keine Tabelle „%1“.</translation>
    </message>
    <message>
        <source>These tables have %1 joins, and the canvas takes %2; choose fewer tables with --tables.</source>
        <translation>Diese Tabellen haben %1 Verknüpfungen, die Zeichenfläche nimmt %2; wählen Sie mit --tables weniger Tabellen.</translation>
    </message>
    <message>
        <source>The drawing is too large for &quot;%1&quot;; choose a name that ends in .svg.</source>
        <translation>Die Zeichnung ist zu groß für „%1“; wählen Sie einen Namen, der auf .svg endet.</translation>
    </message>
    <message>
        <source>Picture (*.png)</source>
        <translation>Bild (*.png)</translation>
    </message>
    <message>
        <source>Scalable drawing (*.svg)</source>
        <translation>Skalierbare Zeichnung (*.svg)</translation>
    </message>
    <message>
        <source>Document (*.pdf)</source>
        <translation>Dokument (*.pdf)</translation>
    </message>
    <message>
        <source>The drawing takes %1 tables, and the statement has %2.</source>
        <translation>Die Zeichnung fasst %1 Tabellen, und die Anweisung hat %2.</translation>
    </message>
    <message>
        <source>The drawing takes %1 joins, and the statement has %2.</source>
        <translation>Die Zeichnung fasst %1 Verknüpfungen, und die Anweisung hat %2.</translation>
    </message>
    <message>
        <source>The grid takes %1 columns, and the statement has %2.</source>
        <translation>Das Raster fasst %1 Spalten, und die Anweisung hat %2.</translation>
    </message>
    <message>
        <source>There is no file &quot;%1&quot;; check the path.</source>
        <translation>Es gibt keine Datei „%1“; prüfen Sie den Pfad.</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is a folder; name a file with a statement.</source>
        <translation>„%1“ ist ein Ordner; nennen Sie eine Datei mit einer Anweisung.</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; cannot be read: %2.</source>
        <translation>Die Datei „%1“ lässt sich nicht lesen: %2.</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is too large for a statement.</source>
        <translation>„%1“ ist zu groß für eine Anweisung.</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is no text in UTF-8; save it as such.</source>
        <translation>„%1“ ist kein Text in UTF-8; speichern Sie die Datei so.</translation>
    </message>
    <message>
        <source>A text that is not drawn is not run on this database, which nothing would keep from writing: go back to the drawing.</source>
        <translation>Ein Text, der nicht gezeichnet ist, läuft auf dieser Datenbank nicht, denn nichts hielte sie vom Schreiben ab: gehen Sie zurück zur Zeichnung.</translation>
    </message>
    <message>
        <source>The text is in %1, and the database speaks %2: choose that above the text.</source>
        <translation>Der Text ist in %1, und die Datenbank spricht %2: wählen Sie das über dem Text.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Autosave</name>
    <message>
        <source>The changes cannot be kept safe in &quot;%1&quot; (%2); save the query yourself.</source>
        <translation>Die Änderungen können in „%1“ nicht gesichert werden (%2); speichern Sie die Abfrage selbst.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Banner</name>
    <message>
        <source>Close</source>
        <translation>Schließen</translation>
    </message>
</context>
<context>
    <name>zandor::designer::CellFormat</name>
    <message>
        <source>%1%</source>
        <comment>of hundred</comment>
        <translation>%1&#xa0;%</translation>
    </message>
</context>
<context>
    <name>zandor::designer::CellReader</name>
    <message>
        <source>(outside the calendar)</source>
        <translation>(außerhalb des Kalenders)</translation>
    </message>
</context>
<context>
    <name>zandor::designer::CellTally</name>
    <message>
        <source>Cells: %1</source>
        <translation>Zellen: %1</translation>
    </message>
    <message>
        <source>Empty: %1</source>
        <translation>Leer: %1</translation>
    </message>
    <message>
        <source>Numbers: %1</source>
        <translation>Zahlen: %1</translation>
    </message>
    <message>
        <source>Sum: %1</source>
        <translation>Summe: %1</translation>
    </message>
    <message>
        <source>Average: %1</source>
        <translation>Durchschnitt: %1</translation>
    </message>
    <message>
        <source>Smallest: %1</source>
        <translation>Kleinste: %1</translation>
    </message>
    <message>
        <source>Largest: %1</source>
        <translation>Größte: %1</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ChartData</name>
    <message>
        <source>Drawn are the first %1 of %2 rows.</source>
        <translation>Gezeichnet sind die ersten %1 von %2 Zeilen.</translation>
    </message>
    <message>
        <source>Rows left out because they have no date: %1.</source>
        <translation>Ohne Datum und darum ausgelassene Zeilen: %1.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ChartPanel</name>
    <message>
        <source>Cop&amp;y</source>
        <translation>Kop&amp;ieren</translation>
    </message>
    <message>
        <source>Copy the chart as a picture</source>
        <translation>Das Diagramm als Bild kopieren</translation>
    </message>
    <message>
        <source>E&amp;xport…</source>
        <translation>E&amp;xportieren…</translation>
    </message>
    <message>
        <source>Export the chart as PNG, SVG or PDF</source>
        <translation>Das Diagramm als PNG, SVG oder PDF exportieren</translation>
    </message>
    <message>
        <source>&amp;Kind:</source>
        <translation>A&amp;rt:</translation>
    </message>
    <message>
        <source>Columns</source>
        <translation>Säulen</translation>
    </message>
    <message>
        <source>Lines</source>
        <translation>Linien</translation>
    </message>
    <message>
        <source>&amp;Axis:</source>
        <translation>A&amp;chse:</translation>
    </message>
    <message>
        <source>The column whose values stand below</source>
        <translation>Die Spalte, deren Werte unten stehen</translation>
    </message>
    <message>
        <source>Val&amp;ues</source>
        <translation>&amp;Werte</translation>
    </message>
    <message>
        <source>The columns that are drawn</source>
        <translation>Die Spalten, die gezeichnet werden</translation>
    </message>
    <message>
        <source>There are no rows to draw.</source>
        <translation>Es gibt keine Zeilen zu zeichnen.</translation>
    </message>
    <message>
        <source>A chart needs a column of numbers, and these rows have none.</source>
        <translation>Ein Diagramm braucht eine Spalte mit Zahlen, und diese Zeilen haben keine.</translation>
    </message>
    <message>
        <source>A chart needs a column of texts or dates beside the numbers, and these rows have none.</source>
        <translation>Ein Diagramm braucht neben den Zahlen eine Spalte mit Texten oder Daten, und diese Zeilen haben keine.</translation>
    </message>
    <message>
        <source>Choose under &quot;Values&quot; what is to be drawn.</source>
        <translation>Unter „Werte“ wählen, was gezeichnet werden soll.</translation>
    </message>
    <message>
        <source>Export chart</source>
        <translation>Diagramm exportieren</translation>
    </message>
    <message>
        <source>chart.png</source>
        <translation>diagramm.png</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ChartView</name>
    <message>
        <source>Chart</source>
        <translation>Diagramm</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ColumnPanel</name>
    <message>
        <source>A column, or an expression such as price * (1 - discount)</source>
        <translation>Eine Spalte oder ein Ausdruck wie price * (1 - discount)</translation>
    </message>
    <message>
        <source>What becomes of the values when rows are put together</source>
        <translation>Was aus den Werten wird, wenn Zeilen zusammengefasst werden</translation>
    </message>
    <message>
        <source>What the column is called in the rows</source>
        <translation>Wie die Spalte in den Zeilen heißt</translation>
    </message>
    <message>
        <source>Not sorted</source>
        <translation>Nicht sortiert</translation>
    </message>
    <message>
        <source>Ascending</source>
        <translation>Aufsteigend</translation>
    </message>
    <message>
        <source>Descending</source>
        <translation>Absteigend</translation>
    </message>
    <message>
        <source>as it stands</source>
        <translation>wie sie steht</translation>
    </message>
    <message>
        <source>Which column sorts first: 1 before 2, and both before those that sort as they stand, from left to right</source>
        <translation>Welche Spalte zuerst sortiert: 1 vor 2, und beide vor denen, die sortieren, wie sie stehen, von links nach rechts</translation>
    </message>
    <message>
        <source>Sho&amp;wn in the rows</source>
        <translation>In den &amp;Zeilen gezeigt</translation>
    </message>
    <message>
        <source>&amp;Total:</source>
        <translation>Aus&amp;wertung:</translation>
    </message>
    <message>
        <source>&amp;Name:</source>
        <translation>&amp;Name:</translation>
    </message>
    <message>
        <source>&amp;Sort:</source>
        <translation>&amp;Sortierung:</translation>
    </message>
    <message>
        <source>&amp;Priority:</source>
        <translation>Ran&amp;g:</translation>
    </message>
    <message>
        <source>a column or an expression</source>
        <translation>eine Spalte oder ein Ausdruck</translation>
    </message>
    <message>
        <source>How the values look in the rows; sorting, criteria and exported files go by the values themselves</source>
        <translation>Wie die Werte in den Zeilen aussehen; Sortierung, Kriterien und exportierte Dateien richten sich nach den Werten selbst</translation>
    </message>
    <message>
        <source>as many as there are</source>
        <translation>so viele wie vorhanden</translation>
    </message>
    <message>
        <source>So many digits stand behind the point</source>
        <translation>So viele Ziffern stehen hinter dem Komma</translation>
    </message>
    <message>
        <source>For&amp;mat:</source>
        <translation>For&amp;mat:</translation>
    </message>
    <message>
        <source>De&amp;cimals:</source>
        <translation>Nach&amp;kommastellen:</translation>
    </message>
    <message>
        <source>Fie&amp;ld:</source>
        <translation>F&amp;eld:</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ConnectionBanner</name>
    <message>
        <source>&amp;Reconnect</source>
        <translation>&amp;Neu verbinden</translation>
    </message>
    <message>
        <source>The connection to %1 is lost. Your query is kept.</source>
        <translation>Die Verbindung zu %1 ist abgebrochen. Ihre Abfrage bleibt erhalten.</translation>
    </message>
    <message>
        <source>The file of %1 is no longer there. Your query is kept.</source>
        <translation>Die Datei von %1 ist nicht mehr da. Ihre Abfrage bleibt erhalten.</translation>
    </message>
    <message>
        <source>%1 has been replaced by another file since it was opened.</source>
        <translation>%1 wurde seit dem Öffnen durch eine andere Datei ersetzt.</translation>
    </message>
    <message>
        <source>The tables of %1 have been changed by another program.</source>
        <translation>Die Tabellen von %1 wurden von einem anderen Programm geändert.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ConnectionDialog</name>
    <message>
        <source>Open database</source>
        <translation>Datenbank öffnen</translation>
    </message>
    <message>
        <source>usual</source>
        <translation>wie üblich</translation>
    </message>
    <message>
        <source>Port</source>
        <translation>Port</translation>
    </message>
    <message>
        <source>SQLite file</source>
        <translation>SQLite-Datei</translation>
    </message>
    <message>
        <source>PostgreSQL</source>
        <translation>PostgreSQL</translation>
    </message>
    <message>
        <source>MySQL or MariaDB</source>
        <translation>MySQL oder MariaDB</translation>
    </message>
    <message>
        <source>ODBC</source>
        <translation>ODBC</translation>
    </message>
    <message>
        <source>%1 (install the package %2)</source>
        <translation>%1 (installieren Sie das Paket %2)</translation>
    </message>
    <message>
        <source>&amp;Browse…</source>
        <translation>D&amp;urchsuchen…</translation>
    </message>
    <message>
        <source>P&amp;ort:</source>
        <translation>P&amp;ort:</translation>
    </message>
    <message>
        <source>&amp;Kind:</source>
        <translation>&amp;Art:</translation>
    </message>
    <message>
        <source>&amp;File:</source>
        <translation>&amp;Datei:</translation>
    </message>
    <message>
        <source>&amp;Host:</source>
        <translation>&amp;Server:</translation>
    </message>
    <message>
        <source>Data &amp;source:</source>
        <translation>Datenq&amp;uelle:</translation>
    </message>
    <message>
        <source>&amp;Database:</source>
        <translation>Da&amp;tenbank:</translation>
    </message>
    <message>
        <source>&amp;User:</source>
        <translation>&amp;Benutzer:</translation>
    </message>
    <message>
        <source>&amp;Password:</source>
        <translation>&amp;Passwort:</translation>
    </message>
    <message>
        <source>&amp;Address:</source>
        <translation>Ad&amp;resse:</translation>
    </message>
    <message>
        <source>SQLite databases (*.sqlite *.sqlite3 *.db *.db3);;All files (*)</source>
        <translation>SQLite-Datenbanken (*.sqlite *.sqlite3 *.db *.db3);;Alle Dateien (*)</translation>
    </message>
</context>
<context>
    <name>zandor::designer::DatabaseCommands</name>
    <message>
        <source>Open SQLite &amp;file…</source>
        <translation>SQLite-&amp;Datei öffnen…</translation>
    </message>
    <message>
        <source>&amp;Connect to a server…</source>
        <translation>Mit einem &amp;Server verbinden…</translation>
    </message>
    <message>
        <source>Open database</source>
        <translation>Datenbank öffnen</translation>
    </message>
    <message>
        <source>The database was not opened.</source>
        <translation>Die Datenbank wurde nicht geöffnet.</translation>
    </message>
    <message>
        <source>Open SQLite file</source>
        <translation>SQLite-Datei öffnen</translation>
    </message>
    <message>
        <source>SQLite databases (*.sqlite *.sqlite3 *.db *.db3);;All files (*)</source>
        <translation>SQLite-Datenbanken (*.sqlite *.sqlite3 *.db *.db3);;Alle Dateien (*)</translation>
    </message>
    <message>
        <source>Reconnect</source>
        <translation>Neu verbinden</translation>
    </message>
    <message>
        <source>The query is open, but not its database. %1</source>
        <translation>Die Abfrage ist geöffnet, ihre Datenbank aber nicht. %1</translation>
    </message>
    <message>
        <source>&amp;Choose database…</source>
        <translation>Datenbank &amp;wählen…</translation>
    </message>
    <message>
        <source>Reco&amp;nnect</source>
        <translation>&amp;Neu verbinden</translation>
    </message>
    <message>
        <source>&amp;Try again</source>
        <translation>&amp;Erneut versuchen</translation>
    </message>
</context>
<context>
    <name>zandor::designer::DesignerWindow</name>
    <message>
        <source>Tables</source>
        <translation>Tabellen</translation>
    </message>
    <message>
        <source>SQL</source>
        <translation>SQL</translation>
    </message>
    <message>
        <source>Rows</source>
        <translation>Zeilen</translation>
    </message>
    <message>
        <source>Events</source>
        <translation>Ereignisse</translation>
    </message>
    <message>
        <source>&amp;File</source>
        <translation>&amp;Datei</translation>
    </message>
    <message>
        <source>&amp;Quit</source>
        <translation>&amp;Beenden</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>&amp;Bearbeiten</translation>
    </message>
    <message>
        <source>Copy &amp;SQL</source>
        <translation>&amp;SQL kopieren</translation>
    </message>
    <message>
        <source>&amp;Options…</source>
        <translation>&amp;Optionen…</translation>
    </message>
    <message>
        <source>&amp;Database</source>
        <translation>Da&amp;tenbank</translation>
    </message>
    <message>
        <source>&amp;Query</source>
        <translation>Ab&amp;frage</translation>
    </message>
    <message>
        <source>&amp;Arrange tables</source>
        <translation>Tabellen an&amp;ordnen</translation>
    </message>
    <message>
        <source>Re&amp;name table…</source>
        <translation>Tabelle &amp;umbenennen…</translation>
    </message>
    <message>
        <source>&amp;View</source>
        <translation>&amp;Ansicht</translation>
    </message>
    <message>
        <source>&amp;Help</source>
        <translation>&amp;Hilfe</translation>
    </message>
    <message>
        <source>&amp;About</source>
        <translation>&amp;Über</translation>
    </message>
    <message>
        <source>Add tables</source>
        <translation>Tabellen hinzufügen</translation>
    </message>
    <message>
        <source>Output columns</source>
        <translation>Ausgabespalten</translation>
    </message>
    <message>
        <source>The grid shows %1 output columns and is full. Delete one before you add another; it would take the place of the last.</source>
        <translation>Das Raster zeigt %1 Ausgabespalten und ist voll. Löschen Sie eine, bevor Sie eine weitere hinzufügen; sie träte an die Stelle der letzten.</translation>
    </message>
    <message>
        <source>About Zandor Designer</source>
        <translation>Über Zandor Designer</translation>
    </message>
    <message>
        <source>Zandor Designer %1

Draw a query, read its SQL, run it. The database is only read.</source>
        <translation>Zandor Designer %1

Zeichnen Sie eine Abfrage, lesen Sie ihr SQL, führen Sie sie aus. Die Datenbank wird nur gelesen.</translation>
    </message>
    <message>
        <source>&amp;New query</source>
        <translation>&amp;Neue Abfrage</translation>
    </message>
    <message>
        <source>&amp;Open query…</source>
        <translation>Abfrage &amp;öffnen…</translation>
    </message>
    <message>
        <source>&amp;Save</source>
        <translation>&amp;Speichern</translation>
    </message>
    <message>
        <source>Save &amp;as…</source>
        <translation>Speichern &amp;unter…</translation>
    </message>
    <message>
        <source>Tables: %1   Joins: %2</source>
        <translation>Tabellen: %1   Verknüpfungen: %2</translation>
    </message>
    <message>
        <source>&amp;Dark colours</source>
        <translation>&amp;Dunkle Farben</translation>
    </message>
    <message>
        <source>&amp;Find table</source>
        <translation>Tabelle s&amp;uchen</translation>
    </message>
    <message>
        <source>&amp;Tables</source>
        <translation>&amp;Tabellen</translation>
    </message>
    <message>
        <source>&amp;SQL</source>
        <translation>&amp;SQL</translation>
    </message>
    <message>
        <source>&amp;Rows</source>
        <translation>&amp;Zeilen</translation>
    </message>
    <message>
        <source>&amp;Events</source>
        <translation>&amp;Ereignisse</translation>
    </message>
    <message>
        <source>&amp;Go to</source>
        <translation>&amp;Wechseln zu</translation>
    </message>
    <message>
        <source>&amp;Drawing</source>
        <translation>Zeich&amp;nung</translation>
    </message>
    <message>
        <source>&amp;Criteria</source>
        <translation>&amp;Kriterien</translation>
    </message>
    <message>
        <source>&amp;Keys</source>
        <translation>&amp;Tasten</translation>
    </message>
    <message>
        <source>&amp;Try again</source>
        <translation>&amp;Erneut versuchen</translation>
    </message>
    <message>
        <source>Saved as %1.</source>
        <translation>Gespeichert als %1.</translation>
    </message>
    <message>
        <source>&amp;Chart</source>
        <translation>&amp;Diagramm</translation>
    </message>
    <message>
        <source>Column</source>
        <translation>Spalte</translation>
    </message>
    <message>
        <source>Query</source>
        <translation>Abfrage</translation>
    </message>
    <message>
        <source>C&amp;olumn</source>
        <translation>S&amp;palte</translation>
    </message>
    <message>
        <source>Total of the output column that the grid is in (Ctrl+T)</source>
        <translation>Auswertung der Ausgabespalte, in der das Gitter ist (Strg+T)</translation>
    </message>
    <message>
        <source>Total</source>
        <translation>Auswertung</translation>
    </message>
    <message>
        <source>Add saved query</source>
        <translation>Gespeicherte Abfrage hinzufügen</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Document</name>
    <message>
        <source>&amp;Undo</source>
        <translation>&amp;Rückgängig</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>&amp;Wiederholen</translation>
    </message>
</context>
<context>
    <name>zandor::designer::EventPanel</name>
    <message>
        <source>Time</source>
        <translation>Zeit</translation>
    </message>
    <message>
        <source>No.</source>
        <translation>Nr.</translation>
    </message>
    <message>
        <source>Event</source>
        <translation>Ereignis</translation>
    </message>
    <message>
        <source>Arguments</source>
        <translation>Argumente</translation>
    </message>
    <message>
        <source>Events of the control</source>
        <translation>Ereignisse des Steuerelements</translation>
    </message>
    <message>
        <source>Clear</source>
        <translation>Leeren</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Kopieren</translation>
    </message>
    <message>
        <source>Copy the selected events, or all of them</source>
        <translation>Die ausgewählten Ereignisse oder alle kopieren</translation>
    </message>
    <message>
        <source>DeletedTable: %1</source>
        <translation>DeletedTable: %1</translation>
    </message>
    <message>
        <source>%1 (number %2)</source>
        <translation>%1 (Nummer %2)</translation>
    </message>
    <message>
        <source>wParam %1: the menu opens</source>
        <translation>wParam %1: Das Menü öffnet sich</translation>
    </message>
    <message>
        <source>wParam %1: the menu is closed</source>
        <translation>wParam %1: Das Menü ist geschlossen</translation>
    </message>
</context>
<context>
    <name>zandor::designer::EventWords</name>
    <message>
        <source>(gone)</source>
        <translation>(gelöscht)</translation>
    </message>
</context>
<context>
    <name>zandor::designer::FileDialogs</name>
    <message>
        <source>Zandor queries (*.json)</source>
        <translation>Zandor-Abfragen (*.json)</translation>
    </message>
    <message>
        <source>All files (*)</source>
        <translation>Alle Dateien (*)</translation>
    </message>
    <message>
        <source>Open query</source>
        <translation>Abfrage öffnen</translation>
    </message>
    <message>
        <source>Save query</source>
        <translation>Abfrage speichern</translation>
    </message>
    <message>
        <source>query.json</source>
        <translation>abfrage.json</translation>
    </message>
    <message>
        <source>Save the changes to &quot;%1&quot;?</source>
        <translation>Die Änderungen an „%1“ speichern?</translation>
    </message>
    <message>
        <source>Changes that are not saved are lost.</source>
        <translation>Änderungen, die nicht gespeichert sind, gehen verloren.</translation>
    </message>
    <message>
        <source>To save your query overwrites these changes.</source>
        <translation>Wenn Sie Ihre Abfrage speichern, werden diese Änderungen überschrieben.</translation>
    </message>
    <message>
        <source>&amp;Overwrite them</source>
        <translation>Änderungen ü&amp;berschreiben</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; is no longer there; save the query to have one.</source>
        <translation>Die Datei „%1“ ist nicht mehr da; speichern Sie die Abfrage, um wieder eine zu haben.</translation>
    </message>
    <message>
        <source>To load it gives up your own changes.</source>
        <translation>Wenn Sie sie laden, gehen Ihre eigenen Änderungen verloren.</translation>
    </message>
    <message>
        <source>You have not changed it since.</source>
        <translation>Sie selbst haben seitdem nichts geändert.</translation>
    </message>
    <message>
        <source>&amp;Keep mine</source>
        <translation>Meine Fassung &amp;behalten</translation>
    </message>
    <message>
        <source>&amp;Decide later</source>
        <translation>Spä&amp;ter entscheiden</translation>
    </message>
    <message>
        <source>Changed file</source>
        <translation>Geänderte Datei</translation>
    </message>
    <message>
        <source>Another program has changed &quot;%1&quot; since you opened it.</source>
        <translation>Ein anderes Programm hat „%1“ geändert, seit Sie die Datei geöffnet haben.</translation>
    </message>
    <message>
        <source>&amp;Load the file</source>
        <translation>Datei &amp;laden</translation>
    </message>
    <message>
        <source>Save &amp;as…</source>
        <translation>Speichern &amp;unter…</translation>
    </message>
</context>
<context>
    <name>zandor::designer::FindBar</name>
    <message>
        <source>Find in the statement</source>
        <translation>In der Anweisung suchen</translation>
    </message>
    <message>
        <source>Previous (Shift+Enter)</source>
        <translation>Vorherige Stelle (Umschalt+Eingabe)</translation>
    </message>
    <message>
        <source>Next (Enter)</source>
        <translation>Nächste Stelle (Eingabe)</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Schließen</translation>
    </message>
</context>
<context>
    <name>zandor::designer::FlagsPage</name>
    <message>
        <source>Join types offered</source>
        <translation>Angebotene Arten der Verknüpfung</translation>
    </message>
    <message>
        <source>Operators offered</source>
        <translation>Angebotene Operatoren</translation>
    </message>
    <message>
        <source>The join dialog counts what it offers: with one left out, each behind it counts as the one before. Leave out only from the end.</source>
        <translation>Das Verknüpfungsfenster zählt, was es anbietet: Fehlt ein Eintrag, so gilt jeder dahinter als der davor. Lassen Sie nur am Ende welche weg.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Format</name>
    <message>
        <source>As it is</source>
        <translation>Unverändert</translation>
    </message>
    <message>
        <source>Whole number</source>
        <translation>Ganze Zahl</translation>
    </message>
    <message>
        <source>Decimals</source>
        <translation>Nachkommastellen</translation>
    </message>
    <message>
        <source>Thousands</source>
        <translation>Tausender</translation>
    </message>
    <message>
        <source>Percent</source>
        <translation>Prozent</translation>
    </message>
    <message>
        <source>Short date</source>
        <translation>Kurzes Datum</translation>
    </message>
    <message>
        <source>Long date</source>
        <translation>Langes Datum</translation>
    </message>
    <message>
        <source>Date and time</source>
        <translation>Datum und Zeit</translation>
    </message>
    <message>
        <source>ISO date</source>
        <translation>ISO-Datum</translation>
    </message>
    <message>
        <source>Year and month</source>
        <translation>Jahr und Monat</translation>
    </message>
    <message>
        <source>Weekday</source>
        <translation>Wochentag</translation>
    </message>
    <message>
        <source>Time</source>
        <translation>Zeit</translation>
    </message>
</context>
<context>
    <name>zandor::designer::GridHint</name>
    <message>
        <source>Double-click a column of a table, or drag it here, to choose what comes out. Until then all columns do.</source>
        <translation>Klicken Sie doppelt auf eine Spalte einer Tabelle oder ziehen Sie sie hierher, um zu wählen, was ausgegeben wird. Bis dahin sind es alle Spalten.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::HelpWindow</name>
    <message>
        <source>Help</source>
        <translation>Hilfe</translation>
    </message>
    <message>
        <source>&amp;Criteria</source>
        <translation>&amp;Kriterien</translation>
    </message>
    <message>
        <source>&amp;Keys</source>
        <translation>&amp;Tasten</translation>
    </message>
    <message>
        <source>Find on this page</source>
        <translation>Auf dieser Seite suchen</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Invitation</name>
    <message>
        <source>Drag a table here from the list of tables, or double-click it there.
Then drag its columns into the grid below.</source>
        <translation>Ziehen Sie eine Tabelle aus der Liste der Tabellen hierher, oder klicken Sie dort doppelt auf sie.
Ziehen Sie dann ihre Spalten in das Raster darunter.</translation>
    </message>
    <message>
        <source>Open a database to begin: see the menu &quot;Database&quot;.</source>
        <translation>Öffnen Sie zuerst eine Datenbank: siehe das Menü „Datenbank“.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::JoinCommands</name>
    <message>
        <source>Only matching rows of %1</source>
        <translation>Nur passende Zeilen von %1</translation>
    </message>
    <message>
        <source>All rows of %1</source>
        <translation>Alle Zeilen von %1</translation>
    </message>
</context>
<context>
    <name>zandor::designer::MenuQuestions</name>
    <message>
        <source>C&amp;olumn…</source>
        <translation>S&amp;palte…</translation>
    </message>
</context>
<context>
    <name>zandor::designer::MissingTables</name>
    <message>
        <source>There is no table &quot;%1&quot; in %2.</source>
        <translation>In %2 gibt es keine Tabelle „%1“.</translation>
    </message>
    <message>
        <source>There is no file &quot;%1&quot; any more; the query is as it was read last.</source>
        <translation>Die Datei „%1“ gibt es nicht mehr; die Abfrage ist, wie sie zuletzt gelesen wurde.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::OneQuery</name>
    <message>
        <source>There is no statement: write one, or go back to the drawing.</source>
        <translation>Es gibt keine Anweisung: schreiben Sie eine, oder gehen Sie zurück zur Zeichnung.</translation>
    </message>
    <message>
        <source>what begins here has no end: close it.</source>
        <translation>was hier beginnt, hat kein Ende: schließen Sie es.</translation>
    </message>
    <message>
        <source>a NUL stands here: delete it.</source>
        <translation>hier steht ein NUL: löschen Sie es.</translation>
    </message>
    <message>
        <source>a second statement begins here: one is run at a time.</source>
        <translation>hier beginnt eine zweite Anweisung: ausgeführt wird eine auf einmal.</translation>
    </message>
    <message>
        <source>only a query is run: it begins with SELECT, WITH, VALUES or TABLE.</source>
        <translation>ausgeführt wird nur eine Abfrage: sie beginnt mit SELECT, WITH, VALUES oder TABLE.</translation>
    </message>
    <message>
        <source>INTO writes, and the database is only read: leave it out.</source>
        <translation>INTO schreibt, und die Datenbank wird nur gelesen: lassen Sie es weg.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Opening</name>
    <message>
        <source>Connecting to %1…</source>
        <translation>Verbindung zu %1 wird hergestellt…</translation>
    </message>
</context>
<context>
    <name>zandor::designer::OptionsDialog</name>
    <message>
        <source>The entries of the context menu that are shown:</source>
        <translation>Diese Einträge zeigt das Kontextmenü:</translation>
    </message>
    <message>
        <source>What can be done with joins:</source>
        <translation>Was mit Verknüpfungen möglich ist:</translation>
    </message>
    <message>
        <source>For developers: each box must be answered before the control goes on, and there may be hundreds when a large query is shown.</source>
        <translation>Für Entwickler: Jedes Meldungsfenster muss beantwortet werden, bevor das Steuerelement fortfährt, und bei einer großen Abfrage können es Hunderte sein.</translation>
    </message>
    <message>
        <source>Options</source>
        <translation>Optionen</translation>
    </message>
    <message>
        <source>Texts</source>
        <translation>Texte</translation>
    </message>
    <message>
        <source>Menu</source>
        <translation>Menü</translation>
    </message>
    <message>
        <source>Joins</source>
        <translation>Verknüpfungen</translation>
    </message>
    <message>
        <source>Debug</source>
        <translation>Fehlersuche</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ParameterDialog</name>
    <message>
        <source>Values for the query</source>
        <translation>Werte für die Abfrage</translation>
    </message>
    <message>
        <source>&amp;Run</source>
        <translation>Aus&amp;führen</translation>
    </message>
    <message>
        <source>%1 has to be %2.</source>
        <translation>Für %1 wird verlangt: %2.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::PasswordPrompt</name>
    <message>
        <source>Password</source>
        <translation>Passwort</translation>
    </message>
    <message>
        <source>The database %1 on %2 asks for a password.</source>
        <translation>Die Datenbank %1 auf %2 verlangt ein Passwort.</translation>
    </message>
    <message>
        <source>The database %1 on %2 asks for the password of %3.</source>
        <translation>Die Datenbank %1 auf %2 verlangt das Passwort von %3.</translation>
    </message>
    <message>
        <source>&amp;Password:</source>
        <translation>&amp;Passwort:</translation>
    </message>
</context>
<context>
    <name>zandor::designer::QueryFile</name>
    <message>
        <source>Untitled</source>
        <translation>Unbenannt</translation>
    </message>
</context>
<context>
    <name>zandor::designer::QueryPanel</name>
    <message>
        <source>all</source>
        <translation>alle</translation>
    </message>
    <message>
        <source>The query itself gives no more rows than these, in the order in which it is sorted</source>
        <translation>Die Abfrage selbst gibt nicht mehr Zeilen als diese, in der Reihenfolge, in der sie sortiert ist</translation>
    </message>
    <message>
        <source>What the query is for. The file keeps it.</source>
        <translation>Wofür die Abfrage da ist. Die Datei bewahrt es auf.</translation>
    </message>
    <message>
        <source>Fi&amp;rst rows:</source>
        <translation>E&amp;rste Zeilen:</translation>
    </message>
    <message>
        <source>Equal rows onl&amp;y once</source>
        <translation>Glei&amp;che Zeilen nur einmal</translation>
    </message>
    <message>
        <source>Descripti&amp;on:</source>
        <translation>Beschreib&amp;ung:</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Question</name>
    <message>
        <source>a pattern: * for any characters, ? for one</source>
        <translation>ein Muster: * für beliebige Zeichen, ? für eines</translation>
    </message>
    <message>
        <source>a text</source>
        <translation>ein Text</translation>
    </message>
    <message>
        <source>a number</source>
        <translation>eine Zahl</translation>
    </message>
    <message>
        <source>a date such as 2024-12-31</source>
        <translation>ein Datum wie 2024-12-31</translation>
    </message>
    <message>
        <source>a time such as 23:59</source>
        <translation>eine Uhrzeit wie 23:59</translation>
    </message>
    <message>
        <source>a date and time such as 2024-12-31 23:59</source>
        <translation>Datum und Uhrzeit wie 2024-12-31 23:59</translation>
    </message>
    <message>
        <source>true or false</source>
        <translation>true oder false</translation>
    </message>
    <message>
        <source>a value</source>
        <translation>ein Wert</translation>
    </message>
</context>
<context>
    <name>zandor::designer::RecentMenu</name>
    <message>
        <source>Open &amp;recent</source>
        <translation>&amp;Zuletzt geöffnet</translation>
    </message>
    <message>
        <source>&amp;Clear list</source>
        <translation>Liste &amp;leeren</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Recovery</name>
    <message>
        <source>A query was drawn and never saved.</source>
        <translation>Eine Abfrage wurde gezeichnet und nie gespeichert.</translation>
    </message>
    <message>
        <source>Recover query</source>
        <translation>Abfrage wiederherstellen</translation>
    </message>
    <message>
        <source>&quot;%1&quot; has changes that were not saved.</source>
        <translation>„%1“ hat Änderungen, die nicht gespeichert wurden.</translation>
    </message>
    <message>
        <source>The designer ended unexpectedly. The changes up to %1 can be recovered.</source>
        <translation>Das Programm wurde unerwartet beendet. Die Änderungen bis %1 lassen sich wiederherstellen.</translation>
    </message>
    <message>
        <source>&amp;Recover</source>
        <translation>&amp;Wiederherstellen</translation>
    </message>
    <message>
        <source>&amp;Ask later</source>
        <translation>&amp;Später fragen</translation>
    </message>
    <message>
        <source>The designer ended unexpectedly, and the changes that were kept safe cannot be read. They stay in the file &quot;%1&quot;.</source>
        <translation>Das Programm wurde unerwartet beendet, und die gesicherten Änderungen können nicht gelesen werden. Sie bleiben in der Datei „%1“.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::RenameDialog</name>
    <message>
        <source>Rename table</source>
        <translation>Tabelle umbenennen</translation>
    </message>
    <message>
        <source>&amp;Rename</source>
        <translation>&amp;Umbenennen</translation>
    </message>
    <message>
        <source>The name is the table&apos;s in this query only; the database stays as it is.</source>
        <translation>Der Name gilt nur in dieser Abfrage; die Datenbank bleibt, wie sie ist.</translation>
    </message>
    <message>
        <source>&amp;Table:</source>
        <translation>&amp;Tabelle:</translation>
    </message>
    <message>
        <source>&amp;New name:</source>
        <translation>&amp;Neuer Name:</translation>
    </message>
    <message>
        <source>A table needs a name; type one.</source>
        <translation>Eine Tabelle braucht einen Namen; geben Sie einen ein.</translation>
    </message>
    <message>
        <source>Another table of this query is called &quot;%1&quot;; choose another name.</source>
        <translation>Eine andere Tabelle dieser Abfrage heißt „%1“; wählen Sie einen anderen Namen.</translation>
    </message>
    <message>
        <source>Rename table %1</source>
        <translation>Tabelle %1 umbenennen</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ResultModel</name>
    <message>
        <source>(blob, %1 bytes)</source>
        <translation>(BLOB, %1 Bytes)</translation>
    </message>
    <message>
        <source>%1
Click to sort the rows that are shown; the query stays as it is.</source>
        <translation>%1
Klicken Sie, um die gezeigten Zeilen zu sortieren; die Abfrage bleibt, wie sie ist.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ResultTable</name>
    <message>
        <source>&amp;Copy</source>
        <translation>&amp;Kopieren</translation>
    </message>
    <message>
        <source>Copy &amp;with all columns</source>
        <translation>Mit &amp;allen Spalten kopieren</translation>
    </message>
    <message>
        <source>Select c&amp;olumn</source>
        <translation>Spalte aus&amp;wählen</translation>
    </message>
    <message>
        <source>Sort &amp;ascending</source>
        <translation>Au&amp;fsteigend sortieren</translation>
    </message>
    <message>
        <source>Sort &amp;descending</source>
        <translation>A&amp;bsteigend sortieren</translation>
    </message>
    <message>
        <source>As the &amp;query gives them</source>
        <translation>In der &amp;Reihenfolge der Abfrage</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ResultsPanel</name>
    <message>
        <source>These are too many cells to copy; export the rows instead.</source>
        <translation>Das sind zu viele Zellen zum Kopieren; exportieren Sie stattdessen die Zeilen.</translation>
    </message>
    <message>
        <source>No database is open: open one first.</source>
        <translation>Keine Datenbank ist geöffnet: Öffnen Sie zuerst eine.</translation>
    </message>
    <message>
        <source>The query cannot be run yet:</source>
        <translation>Die Abfrage lässt sich noch nicht ausführen:</translation>
    </message>
    <message>
        <source>Cancelling…</source>
        <translation>Wird abgebrochen…</translation>
    </message>
    <message>
        <source>Exporting…</source>
        <translation>Wird exportiert…</translation>
    </message>
    <message>
        <source>Running…</source>
        <translation>Wird ausgeführt…</translation>
    </message>
    <message>
        <source>%1  Rows so far: %2 · %3</source>
        <translation>%1  Bisher Zeilen: %2 · %3</translation>
    </message>
    <message>
        <source>The server does not answer.</source>
        <translation>Der Server antwortet nicht.</translation>
    </message>
    <message>
        <source>Exported to %1. Rows: %2 · %3</source>
        <translation>Nach %1 exportiert. Zeilen: %2 · %3</translation>
    </message>
    <message>
        <source>Rows: %1 · %2</source>
        <translation>Zeilen: %1 · %2</translation>
    </message>
    <message>
        <source>First %1 rows; there are more · %2</source>
        <translation>Die ersten %1 Zeilen; es gibt mehr · %2</translation>
    </message>
    <message>
        <source>Cancelled; nothing was exported · %1</source>
        <translation>Abgebrochen; nichts wurde exportiert · %1</translation>
    </message>
    <message>
        <source>Cancelled. Rows that came: %1 · %2</source>
        <translation>Abgebrochen. Zeilen bis dahin: %1 · %2</translation>
    </message>
    <message>
        <source>The database did not run the statement:
%1</source>
        <translation>Die Datenbank hat die Anweisung nicht ausgeführt:
%1</translation>
    </message>
    <message>
        <source>The connection to the database has broken down:
%1</source>
        <translation>Die Verbindung zur Datenbank ist abgebrochen:
%1</translation>
    </message>
    <message>
        <source>Export all rows</source>
        <translation>Alle Zeilen exportieren</translation>
    </message>
    <message>
        <source>Comma-separated values (*.csv)</source>
        <translation>Durch Komma getrennte Werte (*.csv)</translation>
    </message>
    <message>
        <source>Run the query to see its rows here.</source>
        <translation>Führen Sie die Abfrage aus, um hier ihre Zeilen zu sehen.</translation>
    </message>
    <message>
        <source>%1 s</source>
        <translation>%1 s</translation>
    </message>
    <message>
        <source>&amp;Run</source>
        <translation>Aus&amp;führen</translation>
    </message>
    <message>
        <source>Run the query and show its rows (F5)</source>
        <translation>Die Abfrage ausführen und ihre Zeilen zeigen (F5)</translation>
    </message>
    <message>
        <source>&amp;Cancel</source>
        <translation>&amp;Abbrechen</translation>
    </message>
    <message>
        <source>Run the query and write all its rows into a CSV file</source>
        <translation>Die Abfrage ausführen und alle Zeilen in eine CSV-Datei schreiben</translation>
    </message>
    <message>
        <source>So many rows are shown at most</source>
        <translation>So viele Zeilen werden höchstens gezeigt</translation>
    </message>
    <message>
        <source>%1 rows</source>
        <translation>%1 Zeilen</translation>
    </message>
    <message>
        <source>All rows</source>
        <translation>Alle Zeilen</translation>
    </message>
    <message>
        <source>Run the query again without the limit</source>
        <translation>Die Abfrage ohne diese Grenze noch einmal ausführen</translation>
    </message>
    <message>
        <source>&amp;Export rows…</source>
        <translation>Zeilen e&amp;xportieren…</translation>
    </message>
    <message>
        <source>Export…</source>
        <translation>Exportieren…</translation>
    </message>
    <message>
        <source>rows.csv</source>
        <translation>zeilen.csv</translation>
    </message>
    <message>
        <source>the rows can be sorted when all of them have come</source>
        <translation>die Zeilen lassen sich sortieren, wenn alle da sind</translation>
    </message>
    <message>
        <source>these are too many rows to sort here; use the row &quot;Sort:&quot; of the drawing</source>
        <translation>das sind zu viele Zeilen, um sie hier zu sortieren; nehmen Sie die Zeile „Sortierung:“ der Zeichnung</translation>
    </message>
    <message>
        <source>Sorting the rows…</source>
        <translation>Zeilen werden sortiert…</translation>
    </message>
    <message>
        <source>these rows are sorted by %1 here, the query is not</source>
        <translation>diese Zeilen sind hier nach %1 sortiert, die Abfrage nicht</translation>
    </message>
    <message>
        <source>these rows are sorted by %1 descending here, the query is not</source>
        <translation>diese Zeilen sind hier nach %1 absteigend sortiert, die Abfrage nicht</translation>
    </message>
    <message>
        <source>the drawing has changed since</source>
        <translation>die Zeichnung hat sich seitdem geändert</translation>
    </message>
    <message>
        <source>Stop what is running, on the database too (Esc)</source>
        <translation>Abbrechen, was gerade läuft, auch in der Datenbank (Esc)</translation>
    </message>
    <message>
        <source>The query finds no rows.</source>
        <translation>Die Abfrage findet keine Zeilen.</translation>
    </message>
    <message>
        <source>A text has to be the same as a whole, and on most databases in capital and small letters: Like *berlin* finds Berlin wherever it stands.</source>
        <translation>Ein Text muss als Ganzes gleich sein, bei den meisten Datenbanken auch in Groß- und Kleinbuchstaben: Like *berlin* findet Berlin, wo immer es steht.</translation>
    </message>
    <message>
        <source>Copy s&amp;ummary</source>
        <translation>Z&amp;usammenfassung kopieren</translation>
    </message>
    <message>
        <source>The chart is drawn when the rows have come.</source>
        <translation>Das Diagramm wird gezeichnet, wenn die Zeilen da sind.</translation>
    </message>
    <message>
        <source>C&amp;hart</source>
        <translation>&amp;Diagramm</translation>
    </message>
    <message>
        <source>Show the rows as a chart (Ctrl+5), and as a table again (Ctrl+4)</source>
        <translation>Die Zeilen als Diagramm zeigen (Strg+5) und wieder als Tabelle (Strg+4)</translation>
    </message>
    <message>
        <source>The text that was typed cannot be run:
%1</source>
        <translation>Der geschriebene Text kann nicht ausgeführt werden:
%1</translation>
    </message>
    <message>
        <source>of the text that was typed, not of the drawing</source>
        <translation>vom geschriebenen Text, nicht von der Zeichnung</translation>
    </message>
    <message>
        <source>the text has changed since</source>
        <translation>der Text hat sich seitdem geändert</translation>
    </message>
</context>
<context>
    <name>zandor::designer::SavedQueryCommands</name>
    <message>
        <source>Add saved &amp;query…</source>
        <translation>Gespei&amp;cherte Abfrage hinzufügen…</translation>
    </message>
    <message>
        <source>Read saved queries a&amp;gain</source>
        <translation>&amp;Gespeicherte Abfragen neu lesen</translation>
    </message>
    <message>
        <source>Add saved query</source>
        <translation>Gespeicherte Abfrage hinzufügen</translation>
    </message>
    <message>
        <source>The saved queries are as they are here.</source>
        <translation>Die gespeicherten Abfragen sind so wie hier.</translation>
    </message>
    <message>
        <source>Read again: %1.</source>
        <translation>Neu gelesen: %1.</translation>
    </message>
    <message>
        <source>Read saved queries again</source>
        <translation>Gespeicherte Abfragen neu lesen</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ShowCommands</name>
    <message>
        <source>&amp;Export drawing…</source>
        <translation>Zeichnung e&amp;xportieren…</translation>
    </message>
    <message>
        <source>&amp;Print…</source>
        <translation>&amp;Drucken…</translation>
    </message>
    <message>
        <source>Copy as p&amp;icture</source>
        <translation>Als &amp;Bild kopieren</translation>
    </message>
    <message>
        <source>Export drawing</source>
        <translation>Zeichnung exportieren</translation>
    </message>
    <message>
        <source>Query</source>
        <translation>Abfrage</translation>
    </message>
    <message>
        <source>Print</source>
        <translation>Drucken</translation>
    </message>
    <message>
        <source>Pictures &amp;with all columns</source>
        <translation>Bilder mit &amp;allen Spalten</translation>
    </message>
    <message>
        <source>drawing.png</source>
        <translation>zeichnung.png</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Spool</name>
    <message>
        <source>No file for the rows can be made in &quot;%1&quot; (%2): set TMPDIR to a folder that you may write to.</source>
        <translation>In „%1“ lässt sich keine Datei für die Zeilen anlegen (%2): Setzen Sie TMPDIR auf einen Ordner, in den Sie schreiben dürfen.</translation>
    </message>
    <message>
        <source>The rows would fill the disk with the folder &quot;%1&quot;: make room there, or ask for fewer rows.</source>
        <translation>Die Zeilen würden den Datenträger mit dem Ordner „%1“ füllen: Schaffen Sie dort Platz oder verlangen Sie weniger Zeilen.</translation>
    </message>
    <message>
        <source>The rows cannot be written</source>
        <translation>Die Zeilen können nicht geschrieben werden</translation>
    </message>
</context>
<context>
    <name>zandor::designer::SqlCommands</name>
    <message>
        <source>SQL statements (*.sql)</source>
        <translation>SQL-Anweisungen (*.sql)</translation>
    </message>
    <message>
        <source>All files (*)</source>
        <translation>Alle Dateien (*)</translation>
    </message>
    <message>
        <source>Open SQ&amp;L…</source>
        <translation>SQ&amp;L öffnen …</translation>
    </message>
    <message>
        <source>Paste S&amp;QL</source>
        <translation>S&amp;QL einfügen</translation>
    </message>
    <message>
        <source>Sa&amp;ve SQL as…</source>
        <translation>SQL speic&amp;hern unter …</translation>
    </message>
    <message>
        <source>Open SQL</source>
        <translation>SQL öffnen</translation>
    </message>
    <message>
        <source>Paste SQL</source>
        <translation>SQL einfügen</translation>
    </message>
    <message>
        <source>The clipboard has no text; copy a SELECT statement first.</source>
        <translation>In der Zwischenablage ist kein Text; kopieren Sie zuerst eine SELECT-Anweisung.</translation>
    </message>
    <message>
        <source>Save SQL</source>
        <translation>SQL speichern</translation>
    </message>
    <message>
        <source>statement.sql</source>
        <translation>anweisung.sql</translation>
    </message>
</context>
<context>
    <name>zandor::designer::StatementPanel</name>
    <message>
        <source>The dialect of SQL that the statement is written in</source>
        <translation>Der SQL-Dialekt, in dem die Anweisung geschrieben ist</translation>
    </message>
    <message>
        <source>Dialect</source>
        <translation>Dialekt</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Kopieren</translation>
    </message>
    <message>
        <source>Copy the statement to the clipboard</source>
        <translation>Die Anweisung in die Zwischenablage kopieren</translation>
    </message>
    <message>
        <source>SQL statement</source>
        <translation>SQL-Anweisung</translation>
    </message>
    <message>
        <source>Findings</source>
        <translation>Hinweise</translation>
    </message>
    <message>
        <source>Click a finding to see its place</source>
        <translation>Klicken Sie auf einen Hinweis, um die Stelle zu sehen</translation>
    </message>
    <message>
        <source>Add a table to begin: the statement appears here.</source>
        <translation>Fügen Sie zum Anfang eine Tabelle hinzu: Hier erscheint die Anweisung.</translation>
    </message>
    <message>
        <source>%1 cannot say this query:</source>
        <translation>%1 kann diese Abfrage nicht ausdrücken:</translation>
    </message>
    <message>
        <source>Error: %1</source>
        <translation>Fehler: %1</translation>
    </message>
    <message>
        <source>Warning: %1</source>
        <translation>Warnung: %1</translation>
    </message>
    <message>
        <source>%1 (as the database)</source>
        <translation>%1 (wie die Datenbank)</translation>
    </message>
    <message>
        <source>Format</source>
        <translation>Formatieren</translation>
    </message>
    <message>
        <source>Write the statement as the drawing says it</source>
        <translation>Die Anweisung so schreiben, wie die Zeichnung sie sagt</translation>
    </message>
    <message>
        <source>&amp;Back to the drawing</source>
        <translation>&amp;Zurück zur Zeichnung</translation>
    </message>
    <message>
        <source>The drawing&apos;s own statement takes the place of the text (Esc)</source>
        <translation>Die Anweisung der Zeichnung tritt an die Stelle des Textes (Esc)</translation>
    </message>
    <message>
        <source>Add a table to begin, or write a SELECT here: it becomes the drawing.</source>
        <translation>Fügen Sie zuerst eine Tabelle hinzu, oder schreiben Sie hier ein SELECT: Es wird zur Zeichnung.</translation>
    </message>
    <message>
        <source>%1 The drawing sleeps until this can be read; Run takes the text as it is.</source>
        <translation>%1 Die Zeichnung ruht, bis sich das lesen lässt; „Ausführen“ nimmt den Text, wie er ist.</translation>
    </message>
    <message>
        <source>This text is not drawn, and the drawing sleeps: open a database, and it is read.</source>
        <translation>Dieser Text ist nicht gezeichnet, und die Zeichnung ruht: öffnen Sie eine Datenbank, dann wird er gelesen.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::StatementTyping</name>
    <message>
        <source>Change the SQL</source>
        <translation>SQL ändern</translation>
    </message>
    <message>
        <source>Back to the drawing</source>
        <translation>Zurück zur Zeichnung</translation>
    </message>
</context>
<context>
    <name>zandor::designer::StepName</name>
    <message>
        <source>Change the query</source>
        <translation>Abfrage ändern</translation>
    </message>
    <message>
        <source>Delete table %1</source>
        <translation>Tabelle %1 löschen</translation>
    </message>
    <message numerus="yes">
        <source>Delete %n table(s)</source>
        <translation>
            <numerusform>%n Tabelle löschen</numerusform>
            <numerusform>%n Tabellen löschen</numerusform>
        </translation>
    </message>
    <message>
        <source>Add table %1</source>
        <translation>Tabelle %1 hinzufügen</translation>
    </message>
    <message numerus="yes">
        <source>Add %n table(s)</source>
        <translation>
            <numerusform>%n Tabelle hinzufügen</numerusform>
            <numerusform>%n Tabellen hinzufügen</numerusform>
        </translation>
    </message>
    <message>
        <source>Rename table %1 to %2</source>
        <translation>Tabelle %1 in %2 umbenennen</translation>
    </message>
    <message numerus="yes">
        <source>Resize %n table(s)</source>
        <translation>
            <numerusform>Größe von %n Tabelle ändern</numerusform>
            <numerusform>Größe von %n Tabellen ändern</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Move %n table(s)</source>
        <translation>
            <numerusform>%n Tabelle verschieben</numerusform>
            <numerusform>%n Tabellen verschieben</numerusform>
        </translation>
    </message>
    <message>
        <source>Resize table %1</source>
        <translation>Größe der Tabelle %1 ändern</translation>
    </message>
    <message>
        <source>Move table %1</source>
        <translation>Tabelle %1 verschieben</translation>
    </message>
    <message>
        <source>Add join %1</source>
        <translation>Verknüpfung %1 hinzufügen</translation>
    </message>
    <message numerus="yes">
        <source>Add %n join(s)</source>
        <translation>
            <numerusform>%n Verknüpfung hinzufügen</numerusform>
            <numerusform>%n Verknüpfungen hinzufügen</numerusform>
        </translation>
    </message>
    <message>
        <source>Delete join %1</source>
        <translation>Verknüpfung %1 löschen</translation>
    </message>
    <message numerus="yes">
        <source>Delete %n join(s)</source>
        <translation>
            <numerusform>%n Verknüpfung löschen</numerusform>
            <numerusform>%n Verknüpfungen löschen</numerusform>
        </translation>
    </message>
    <message>
        <source>Change join %1</source>
        <translation>Verknüpfung %1 ändern</translation>
    </message>
    <message>
        <source>Change joins</source>
        <translation>Verknüpfungen ändern</translation>
    </message>
    <message numerus="yes">
        <source>Change %n column(s)</source>
        <translation>
            <numerusform>%n Spalte ändern</numerusform>
            <numerusform>%n Spalten ändern</numerusform>
        </translation>
    </message>
    <message>
        <source>Add column %1</source>
        <translation>Spalte %1 hinzufügen</translation>
    </message>
    <message numerus="yes">
        <source>Add %n column(s)</source>
        <translation>
            <numerusform>%n Spalte hinzufügen</numerusform>
            <numerusform>%n Spalten hinzufügen</numerusform>
        </translation>
    </message>
    <message>
        <source>Delete column %1</source>
        <translation>Spalte %1 löschen</translation>
    </message>
    <message numerus="yes">
        <source>Delete %n column(s)</source>
        <translation>
            <numerusform>%n Spalte löschen</numerusform>
            <numerusform>%n Spalten löschen</numerusform>
        </translation>
    </message>
    <message>
        <source>Change columns</source>
        <translation>Spalten ändern</translation>
    </message>
    <message>
        <source>Change criterion of %1</source>
        <translation>Kriterium von %1 ändern</translation>
    </message>
    <message>
        <source>Rename column %1</source>
        <translation>Spalte %1 umbenennen</translation>
    </message>
    <message>
        <source>Change sorting by %1</source>
        <translation>Sortierung nach %1 ändern</translation>
    </message>
    <message>
        <source>Show column %1</source>
        <translation>Spalte %1 zeigen</translation>
    </message>
    <message>
        <source>Hide column %1</source>
        <translation>Spalte %1 ausblenden</translation>
    </message>
    <message>
        <source>Change column %1</source>
        <translation>Spalte %1 ändern</translation>
    </message>
    <message>
        <source>Move column %1</source>
        <translation>Spalte %1 verschieben</translation>
    </message>
    <message numerus="yes">
        <source>Move %n column(s)</source>
        <translation>
            <numerusform>%n Spalte verschieben</numerusform>
            <numerusform>%n Spalten verschieben</numerusform>
        </translation>
    </message>
    <message>
        <source>Resize column %1</source>
        <translation>Breite der Spalte %1 ändern</translation>
    </message>
    <message>
        <source>Change total of %1</source>
        <translation>Auswertung von %1 ändern</translation>
    </message>
    <message>
        <source>Change field of %1</source>
        <translation>Feld von %1 ändern</translation>
    </message>
    <message>
        <source>Describe the query</source>
        <translation>Abfrage beschreiben</translation>
    </message>
    <message>
        <source>Change which rows come out</source>
        <translation>Ändern, welche Zeilen herauskommen</translation>
    </message>
    <message>
        <source>Change format of %1</source>
        <translation>Format von %1 ändern</translation>
    </message>
</context>
<context>
    <name>zandor::designer::SummaryLine</name>
    <message>
        <source>What the selected cells come to</source>
        <translation>Was die gewählten Zellen ergeben</translation>
    </message>
    <message>
        <source>Cells: %1 · adding up, %2 %</source>
        <translation>Zellen: %1 · wird berechnet, %2 %</translation>
    </message>
</context>
<context>
    <name>zandor::designer::TableAdding</name>
    <message>
        <source>Arrange tables</source>
        <translation>Tabellen anordnen</translation>
    </message>
    <message>
        <source>The drawing takes %1 tables, and has them; delete one first.</source>
        <translation>Die Zeichnung nimmt %1 Tabellen und hat so viele; löschen Sie zuerst eine.</translation>
    </message>
    <message>
        <source>The drawing takes %1 tables and has %2; choose fewer.</source>
        <translation>Die Zeichnung nimmt %1 Tabellen und hat %2; wählen Sie weniger.</translation>
    </message>
    <message>
        <source>Add table %1</source>
        <translation>Tabelle %1 hinzufügen</translation>
    </message>
    <message>
        <source>Add %1 tables</source>
        <translation>%1 Tabellen hinzufügen</translation>
    </message>
    <message>
        <source>Reading the tables…</source>
        <translation>Tabellen werden gelesen…</translation>
    </message>
    <message>
        <source>The drawing takes %1 joins, and with this there would be %2; delete tables or joins first.</source>
        <translation>Die Zeichnung nimmt %1 Verknüpfungen, und damit wären es %2; löschen Sie zuerst Tabellen oder Verknüpfungen.</translation>
    </message>
    <message>
        <source>%1 and %2 are joined by %3. Not joined by %4: draw those yourself if you need them.</source>
        <translation>%1 und %2 sind über %3 verknüpft. Nicht verknüpft über %4: Zeichnen Sie diese Verknüpfungen selbst, wenn Sie sie brauchen.</translation>
    </message>
    <message>
        <source>Add query %1</source>
        <translation>Abfrage %1 hinzufügen</translation>
    </message>
</context>
<context>
    <name>zandor::designer::TableListModel</name>
    <message>
        <source>%1, view</source>
        <translation>%1, Sicht</translation>
    </message>
    <message>
        <source>%1, table</source>
        <translation>%1, Tabelle</translation>
    </message>
</context>
<context>
    <name>zandor::designer::TableTip</name>
    <message>
        <source>%1 (view)</source>
        <translation>%1 (Sicht)</translation>
    </message>
    <message>
        <source>and %1 more</source>
        <translation>und %1 weitere</translation>
    </message>
</context>
<context>
    <name>zandor::designer::TablesPanel</name>
    <message>
        <source>Filter tables</source>
        <translation>Tabellen filtern</translation>
    </message>
    <message>
        <source>Read the list of tables again</source>
        <translation>Die Liste der Tabellen neu lesen</translation>
    </message>
    <message>
        <source>Tables</source>
        <translation>Tabellen</translation>
    </message>
    <message>
        <source>Open a database to see its tables.</source>
        <translation>Öffnen Sie eine Datenbank, um ihre Tabellen zu sehen.</translation>
    </message>
    <message>
        <source>There are no tables in this database.</source>
        <translation>In dieser Datenbank gibt es keine Tabellen.</translation>
    </message>
    <message>
        <source>No table has all of this in its name.</source>
        <translation>Keine Tabelle hat das alles in ihrem Namen.</translation>
    </message>
    <message>
        <source>%1 of %2 tables</source>
        <translation>%1 von %2 Tabellen</translation>
    </message>
    <message>
        <source>1 table</source>
        <translation>1 Tabelle</translation>
    </message>
    <message>
        <source>%1 tables</source>
        <translation>%1 Tabellen</translation>
    </message>
    <message>
        <source>&amp;Add to drawing</source>
        <translation>Zur Zeichnung &amp;hinzufügen</translation>
    </message>
</context>
<context>
    <name>zandor::designer::TextsPage</name>
    <message>
        <source>Where it is used</source>
        <translation>Wo er steht</translation>
    </message>
    <message>
        <source>Text</source>
        <translation>Text</translation>
    </message>
    <message>
        <source>Texts of the control</source>
        <translation>Texte des Steuerelements</translation>
    </message>
    <message>
        <source>Set of texts</source>
        <translation>Texte einsetzen</translation>
    </message>
    <message>
        <source>Texts that are left as they are follow the designer&apos;s language. Emptying one brings its text of that language back.</source>
        <translation>Texte, die so bleiben, folgen der Sprache des Programms. Wer einen leert, bekommt den Text dieser Sprache zurück.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Total</name>
    <message>
        <source>&amp;No total</source>
        <translation>&amp;Keine Auswertung</translation>
    </message>
    <message>
        <source>&amp;Group by it</source>
        <translation>Danach &amp;gruppieren</translation>
    </message>
    <message>
        <source>&amp;Count</source>
        <translation>&amp;Anzahl</translation>
    </message>
    <message>
        <source>Count &amp;different values</source>
        <translation>Anzahl &amp;verschiedener Werte</translation>
    </message>
    <message>
        <source>&amp;Sum</source>
        <translation>&amp;Summe</translation>
    </message>
    <message>
        <source>&amp;Average</source>
        <translation>&amp;Durchschnitt</translation>
    </message>
    <message>
        <source>S&amp;mallest</source>
        <translation>K&amp;leinster</translation>
    </message>
    <message>
        <source>&amp;Largest</source>
        <translation>&amp;Größter</translation>
    </message>
    <message>
        <source>C&amp;riteria only</source>
        <translation>Nur K&amp;riterien</translation>
    </message>
</context>
<context>
    <name>zandor::designer::TotalCommands</name>
    <message>
        <source>&amp;Total</source>
        <translation>Aus&amp;wertung</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Waiting</name>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
</context>
<context>
    <name>zandor::designer::shell</name>
    <message>
        <source>Password for %1: </source>
        <translation>Passwort für %1: </translation>
    </message>
    <message>
        <source>The query asks for &quot;%1&quot;; give it with --set &quot;%1=VALUE&quot;.</source>
        <translation>Die Abfrage fragt nach „%1“; geben Sie es mit --set &quot;%1=WERT&quot; an.</translation>
    </message>
    <message>
        <source>The query asks for &quot;%1&quot;, which has to be %2; &quot;%3&quot; is not.</source>
        <translation>Die Abfrage fragt nach „%1“, verlangt ist: %2; „%3“ ist es nicht.</translation>
    </message>
    <message>
        <source>The query does not ask for &quot;%1&quot;; leave out its --set.</source>
        <translation>Die Abfrage fragt nicht nach „%1“; lassen Sie dessen --set weg.</translation>
    </message>
    <message>
        <source>Cancelled.</source>
        <translation>Abgebrochen.</translation>
    </message>
    <message>
        <source>The query names no database; give one with --database.</source>
        <translation>Die Abfrage nennt keine Datenbank; geben Sie eine mit --database an.</translation>
    </message>
    <message>
        <source>There is no format &quot;%1&quot;; write --format csv or --format json.</source>
        <translation>Ein Format „%1“ gibt es nicht; schreiben Sie --format csv oder --format json.</translation>
    </message>
    <message>
        <source>--limit takes a number of rows; write --limit 100.</source>
        <translation>--limit nimmt eine Anzahl von Zeilen; schreiben Sie --limit 100.</translation>
    </message>
    <message>
        <source>&quot;%1&quot; sets nothing; write --set NAME=VALUE.</source>
        <translation>„%1“ setzt nichts; schreiben Sie --set NAME=WERT.</translation>
    </message>
    <message>
        <source>--%1 goes with --run only.</source>
        <translation>--%1 gilt nur mit --run.</translation>
    </message>
    <message>
        <source>--dialect goes with --sql only.</source>
        <translation>--dialect gilt nur mit --sql.</translation>
    </message>
    <message>
        <source>No query is named; write --%1 query.json.</source>
        <translation>Keine Abfrage ist genannt; schreiben Sie --%1 abfrage.json.</translation>
    </message>
    <message>
        <source>There is no dialect &quot;%1&quot;; known are sqlite, postgresql, mysql, sqlserver and standard.</source>
        <translation>Einen Dialekt „%1“ gibt es nicht; bekannt sind sqlite, postgresql, mysql, sqlserver und standard.</translation>
    </message>
    <message>
        <source>There is no folder &quot;%1&quot;; several statements are drawn into one that is there.</source>
        <translation>Es gibt keinen Ordner „%1“; mehrere Anweisungen werden in einen gezeichnet, den es gibt.</translation>
    </message>
    <message>
        <source>The standard input stream has no name; name a file to draw it into.</source>
        <translation>Die Standardeingabe hat keinen Namen; nennen Sie eine Datei, in die sie gezeichnet wird.</translation>
    </message>
    <message>
        <source>&quot;%1&quot; and &quot;%2&quot; would both become &quot;%3&quot;; draw them into two folders.</source>
        <translation>„%1“ und „%2“ würden beide zu „%3“; zeichnen Sie sie in zwei Ordner.</translation>
    </message>
    <message>
        <source>The standard input stream cannot be read.</source>
        <translation>Die Standardeingabe lässt sich nicht lesen.</translation>
    </message>
    <message>
        <source>--draw takes two files; write --draw statement.sql query.json.</source>
        <translation>--draw nimmt zwei Dateien; schreiben Sie --draw anweisung.sql abfrage.json.</translation>
    </message>
    <message>
        <source>--draw needs to know the tables; name their database with --database.</source>
        <translation>--draw muss die Tabellen kennen; nennen Sie ihre Datenbank mit --database.</translation>
    </message>
    <message>
        <source>--sql, --run and --draw go one at a time.</source>
        <translation>--sql, --run und --draw gehen nur einzeln.</translation>
    </message>
    <message>
        <source>--database goes with --run and --draw only.</source>
        <translation>--database geht nur mit --run und --draw.</translation>
    </message>
    <message>
        <source>The text that was typed beside the drawing is left out.</source>
        <translation>Der Text, der neben der Zeichnung geschrieben wurde, wird ausgelassen.</translation>
    </message>
</context>
</TS>
