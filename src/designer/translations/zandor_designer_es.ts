<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="es" sourcelanguage="en">
<context>
    <name>ControlFlags</name>
    <message>
        <source>Show join definition</source>
        <translation>Definir la combinación</translation>
    </message>
    <message>
        <source>Delete join</source>
        <translation>Eliminar la combinación</translation>
    </message>
    <message>
        <source>Copy column</source>
        <translation>Copiar la columna</translation>
    </message>
    <message>
        <source>Create join</source>
        <translation>Crear una combinación</translation>
    </message>
    <message>
        <source>Delete table</source>
        <translation>Eliminar la tabla</translation>
    </message>
    <message>
        <source>Paste column</source>
        <translation>Pegar la columna</translation>
    </message>
    <message>
        <source>Delete output column</source>
        <translation>Eliminar la columna de salida</translation>
    </message>
    <message>
        <source>Separator below the join entries</source>
        <translation>Separador bajo las entradas de combinaciones</translation>
    </message>
    <message>
        <source>Separator below the table entries</source>
        <translation>Separador bajo las entradas de tablas</translation>
    </message>
    <message>
        <source>Type and operator of a join can be changed</source>
        <translation>Se pueden cambiar el tipo y el operador de una combinación</translation>
    </message>
    <message>
        <source>Tables and joins only, no output columns</source>
        <translation>Solo tablas y combinaciones, sin columnas de salida</translation>
    </message>
    <message>
        <source>Normal: only rows that match</source>
        <translation>Normal: solo las filas que coinciden</translation>
    </message>
    <message>
        <source>Left outer: all rows of the left table</source>
        <translation>Externa izquierda: todas las filas de la tabla izquierda</translation>
    </message>
    <message>
        <source>Right outer: all rows of the right table</source>
        <translation>Externa derecha: todas las filas de la tabla derecha</translation>
    </message>
    <message>
        <source>Both outer: all rows of both tables</source>
        <translation>Externa por ambos lados: todas las filas de ambas tablas</translation>
    </message>
    <message>
        <source>=  equal</source>
        <translation>=  igual</translation>
    </message>
    <message>
        <source>&lt;&gt;  not equal</source>
        <translation>&lt;&gt;  distinto</translation>
    </message>
    <message>
        <source>&lt;  less</source>
        <translation>&lt;  menor</translation>
    </message>
    <message>
        <source>&gt;  greater</source>
        <translation>&gt;  mayor</translation>
    </message>
    <message>
        <source>&lt;=  less or equal</source>
        <translation>&lt;=  menor o igual</translation>
    </message>
    <message>
        <source>&gt;=  greater or equal</source>
        <translation>&gt;=  mayor o igual</translation>
    </message>
    <message>
        <source>Show a box at each step of the control</source>
        <translation>Mostrar un mensaje en cada paso del control</translation>
    </message>
</context>
<context>
    <name>ControlTextUses</name>
    <message>
        <source>Join dialog: title</source>
        <translation>Ventana de combinación: título</translation>
    </message>
    <message>
        <source>Join dialog: left table</source>
        <translation>Ventana de combinación: tabla izquierda</translation>
    </message>
    <message>
        <source>Join dialog: left column</source>
        <translation>Ventana de combinación: columna izquierda</translation>
    </message>
    <message>
        <source>Join dialog: right table</source>
        <translation>Ventana de combinación: tabla derecha</translation>
    </message>
    <message>
        <source>Join dialog: right column</source>
        <translation>Ventana de combinación: columna derecha</translation>
    </message>
    <message>
        <source>Join dialog: join type</source>
        <translation>Ventana de combinación: tipo de combinación</translation>
    </message>
    <message>
        <source>Join type: only rows that match</source>
        <translation>Tipo de combinación: solo las filas que coinciden</translation>
    </message>
    <message>
        <source>Join type: all rows of the left table</source>
        <translation>Tipo de combinación: todas las filas de la tabla izquierda</translation>
    </message>
    <message>
        <source>Join type: all rows of the right table</source>
        <translation>Tipo de combinación: todas las filas de la tabla derecha</translation>
    </message>
    <message>
        <source>Join type: all rows of both tables</source>
        <translation>Tipo de combinación: todas las filas de ambas tablas</translation>
    </message>
    <message>
        <source>Join dialog: button that takes the changes over</source>
        <translation>Ventana de combinación: botón que acepta los cambios</translation>
    </message>
    <message>
        <source>Join dialog: button that drops the changes</source>
        <translation>Ventana de combinación: botón que descarta los cambios</translation>
    </message>
    <message>
        <source>Menu: open the join dialog</source>
        <translation>Menú: abrir la ventana de combinación</translation>
    </message>
    <message>
        <source>Menu: delete a join</source>
        <translation>Menú: eliminar una combinación</translation>
    </message>
    <message>
        <source>Menu: copy the selected columns</source>
        <translation>Menú: copiar las columnas seleccionadas</translation>
    </message>
    <message>
        <source>Menu: join the copied column to the selected one</source>
        <translation>Menú: combinar la columna copiada con la seleccionada</translation>
    </message>
    <message>
        <source>Menu: take a table out of the query</source>
        <translation>Menú: quitar una tabla de la consulta</translation>
    </message>
    <message>
        <source>Menu: make output columns of the copied columns</source>
        <translation>Menú: convertir las columnas copiadas en columnas de salida</translation>
    </message>
    <message>
        <source>Menu: delete an output column</source>
        <translation>Menú: eliminar una columna de salida</translation>
    </message>
    <message>
        <source>Grid: the column</source>
        <translation>Cuadrícula: la columna</translation>
    </message>
    <message>
        <source>Grid: the name that the column comes out under</source>
        <translation>Cuadrícula: el nombre con el que sale la columna</translation>
    </message>
    <message>
        <source>Grid: sort order</source>
        <translation>Cuadrícula: orden</translation>
    </message>
    <message>
        <source>Grid: whether the column comes out</source>
        <translation>Cuadrícula: si la columna sale</translation>
    </message>
    <message>
        <source>Grid: the first row of criteria</source>
        <translation>Cuadrícula: la primera fila de criterios</translation>
    </message>
    <message>
        <source>Grid: further rows of criteria</source>
        <translation>Cuadrícula: las demás filas de criterios</translation>
    </message>
</context>
<context>
    <name>ControlTexts</name>
    <message>
        <source>Left Table:</source>
        <translation>Tabla izquierda:</translation>
    </message>
    <message>
        <source>Left Column:</source>
        <translation>Columna izquierda:</translation>
    </message>
    <message>
        <source>Right Table:</source>
        <translation>Tabla derecha:</translation>
    </message>
    <message>
        <source>Right Column:</source>
        <translation>Columna derecha:</translation>
    </message>
    <message>
        <source>Join Type</source>
        <translation>Tipo de combinación</translation>
    </message>
    <message>
        <source>Normal</source>
        <translation>Normal</translation>
    </message>
    <message>
        <source>Left Outer</source>
        <translation>Externa izquierda</translation>
    </message>
    <message>
        <source>Right Outer</source>
        <translation>Externa derecha</translation>
    </message>
    <message>
        <source>Both Outer</source>
        <translation>Externa por ambos lados</translation>
    </message>
    <message>
        <source>&amp;Ok</source>
        <translation>&amp;Aceptar</translation>
    </message>
    <message>
        <source>&amp;Cancel</source>
        <translation>&amp;Cancelar</translation>
    </message>
    <message>
        <source>Field:</source>
        <translation>Campo:</translation>
    </message>
    <message>
        <source>Synonym:</source>
        <translation>Sinónimo:</translation>
    </message>
    <message>
        <source>Sort:</source>
        <translation>Orden:</translation>
    </message>
    <message>
        <source>Visible:</source>
        <translation>Visible:</translation>
    </message>
    <message>
        <source>Criteria:</source>
        <translation>Criterios:</translation>
    </message>
    <message>
        <source>Or:</source>
        <translation>O:</translation>
    </message>
    <message>
        <source>Join Definition</source>
        <translation>Definición de la combinación</translation>
    </message>
    <message>
        <source>Show &amp;Join Definition</source>
        <translation>&amp;Definir la combinación</translation>
    </message>
    <message>
        <source>Delete Jo&amp;in</source>
        <translation>&amp;Eliminar la combinación</translation>
    </message>
    <message>
        <source>&amp;Copy Column</source>
        <translation>&amp;Copiar la columna</translation>
    </message>
    <message>
        <source>C&amp;reate Join</source>
        <translation>C&amp;rear una combinación</translation>
    </message>
    <message>
        <source>Delete &amp;Table</source>
        <translation>Eliminar la &amp;tabla</translation>
    </message>
    <message>
        <source>&amp;Paste Column</source>
        <translation>&amp;Pegar la columna</translation>
    </message>
    <message>
        <source>&amp;Delete Column</source>
        <translation>Eliminar la co&amp;lumna</translation>
    </message>
</context>
<context>
    <name>Model</name>
    <message>
        <source>The query has no tables: add one first.</source>
        <translation>La consulta no tiene tablas: añada primero una.</translation>
    </message>
    <message>
        <source>%1: At character %2: %3.</source>
        <translation>%1: en el carácter %2: %3.</translation>
    </message>
    <message>
        <source>a text</source>
        <translation>un texto</translation>
    </message>
    <message>
        <source>a number</source>
        <translation>un número</translation>
    </message>
    <message>
        <source>a date (2024-12-31)</source>
        <translation>una fecha (2024-12-31)</translation>
    </message>
    <message>
        <source>a time (23:59)</source>
        <translation>una hora (23:59)</translation>
    </message>
    <message>
        <source>a date and time (2024-12-31 23:59)</source>
        <translation>una fecha con hora (2024-12-31 23:59)</translation>
    </message>
    <message>
        <source>true or false</source>
        <translation>true o false</translation>
    </message>
    <message>
        <source>There is no file &quot;%1&quot;; check the path.</source>
        <translation>No existe el archivo «%1»; compruebe la ruta.</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is a folder; choose a database file in it.</source>
        <translation>«%1» es una carpeta; elija en ella un archivo de base de datos.</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is a device, not a file; choose a database file.</source>
        <translation>«%1» es un dispositivo, no un archivo; elija un archivo de base de datos.</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; cannot be read (%2); ask its owner for permission.</source>
        <translation>No se puede leer el archivo «%1» (%2); pida permiso a su propietario.</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; is empty; choose a file that holds a database.</source>
        <translation>El archivo «%1» está vacío; elija uno que contenga una base de datos.</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; is not an SQLite database, or it is encrypted; choose another file.</source>
        <translation>El archivo «%1» no es una base de datos SQLite, o está cifrado; elija otro.</translation>
    </message>
    <message>
        <source>The Qt driver for %1 is missing; install it (Debian: apt install %2).</source>
        <translation>Falta el controlador de Qt para %1; instálelo (Debian: apt install %2).</translation>
    </message>
    <message>
        <source>The list of tables cannot be read (the connection is closed): open the database afresh.</source>
        <translation>No se puede leer la lista de tablas (la conexión está cerrada): vuelva a abrir la base de datos.</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; is not in the database; read the list of tables afresh.</source>
        <translation>La tabla «%1» no está en la base de datos; vuelva a leer la lista de tablas.</translation>
    </message>
    <message>
        <source>The address has an unknown option &quot;%1&quot;; known are %2 and host.</source>
        <translation>La dirección tiene una opción desconocida «%1»; se conocen %2 y host.</translation>
    </message>
    <message>
        <source>The option %1 of the address has a semicolon in it; use a value without one.</source>
        <translation>La opción %1 de la dirección contiene un punto y coma; use un valor sin él.</translation>
    </message>
    <message>
        <source>The address of the database cannot be read; write it like %1, with %XX for a character that means something else there.</source>
        <translation>No se puede leer la dirección de la base de datos; escríbala como %1, con %XX para un carácter que ahí significa otra cosa.</translation>
    </message>
    <message>
        <source>There is no kind of database &quot;%1&quot;; write it like %2.</source>
        <translation>No existe el tipo de base de datos «%1»; escriba como %2.</translation>
    </message>
    <message>
        <source>%1 (%2): %3.</source>
        <translation>%1 (%2): %3.</translation>
    </message>
    <message>
        <source>The database %1 cannot be opened</source>
        <translation>No se puede abrir la base de datos %1</translation>
    </message>
    <message>
        <source>The list of tables cannot be read</source>
        <translation>No se puede leer la lista de tablas</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; cannot be read</source>
        <translation>No se puede leer la tabla «%1»</translation>
    </message>
    <message>
        <source>The primary key of &quot;%1&quot; cannot be read</source>
        <translation>No se puede leer la clave primaria de «%1»</translation>
    </message>
    <message>
        <source>The foreign keys of &quot;%1&quot; cannot be read</source>
        <translation>No se pueden leer las claves externas de «%1»</translation>
    </message>
    <message>
        <source>give a password</source>
        <translation>indique una contraseña</translation>
    </message>
    <message>
        <source>check the user name and the password</source>
        <translation>compruebe el usuario y la contraseña</translation>
    </message>
    <message>
        <source>ask the server&apos;s administrator to let you in</source>
        <translation>pida acceso al administrador del servidor</translation>
    </message>
    <message>
        <source>check the name of the host</source>
        <translation>compruebe el nombre del servidor</translation>
    </message>
    <message>
        <source>see that the server runs, and check host and port</source>
        <translation>vea si el servidor está en marcha y compruebe servidor y puerto</translation>
    </message>
    <message>
        <source>see that the server can be reached, and check host and port</source>
        <translation>vea si se puede acceder al servidor y compruebe servidor y puerto</translation>
    </message>
    <message>
        <source>check the name of the database</source>
        <translation>compruebe el nombre de la base de datos</translation>
    </message>
    <message>
        <source>ask the owner for permission</source>
        <translation>pida permiso al propietario</translation>
    </message>
    <message>
        <source>check the user name</source>
        <translation>compruebe el usuario</translation>
    </message>
    <message>
        <source>open the database afresh</source>
        <translation>vuelva a abrir la base de datos</translation>
    </message>
    <message>
        <source>another program is writing to it; try again in a moment</source>
        <translation>otro programa está escribiendo en ella; inténtelo de nuevo en un momento</translation>
    </message>
    <message>
        <source>see that you may read the file and its folder; a database in WAL mode also needs permission to write to the folder</source>
        <translation>vea si puede leer el archivo y su carpeta; una base de datos en modo WAL necesita además permiso para escribir en la carpeta</translation>
    </message>
    <message>
        <source>the file is damaged; restore it from a copy</source>
        <translation>el archivo está dañado; restáurelo desde una copia</translation>
    </message>
    <message>
        <source>it is damaged or encrypted; choose another file</source>
        <translation>está dañado o cifrado; elija otro archivo</translation>
    </message>
    <message>
        <source>put And or Or between two conditions, or quotes around a text</source>
        <translation>ponga And u Or entre dos condiciones, o comillas alrededor de un texto</translation>
    </message>
    <message>
        <source>this is nested too deep, 100 levels are the most</source>
        <translation>hay demasiados niveles anidados, 100 como máximo</translation>
    </message>
    <message>
        <source>a closing %1 is missing</source>
        <translation>falta %1 de cierre</translation>
    </message>
    <message>
        <source>after In comes a list in parentheses, as in In (1, 2)</source>
        <translation>después de In escriba una lista entre paréntesis, como en In (1, 2)</translation>
    </message>
    <message>
        <source>after Is comes Null or Not Null, and a text that begins so needs quotes</source>
        <translation>después de Is escriba Null o Not Null, y un texto que empieza así necesita comillas</translation>
    </message>
    <message>
        <source>Like works only on columns that hold text, use =, &lt; or &gt; here</source>
        <translation>Like solo sirve para columnas de texto, use aquí =, &lt; o &gt;</translation>
    </message>
    <message>
        <source>after Like comes a pattern, as in Like &apos;A*&apos;, not a column</source>
        <translation>después de Like escriba un patrón, como en Like &apos;A*&apos;, no una columna</translation>
    </message>
    <message>
        <source>after Like comes a pattern, as in Like &apos;A*&apos;</source>
        <translation>después de Like escriba un patrón, como en Like &apos;A*&apos;</translation>
    </message>
    <message>
        <source>Between needs And and a second value, as in Between 1 And 5</source>
        <translation>Between necesita And y un segundo valor, como en Between 1 And 5</translation>
    </message>
    <message>
        <source>a comma or a closing ) is missing</source>
        <translation>falta una coma o un ) de cierre</translation>
    </message>
    <message>
        <source>nothing is equal to Null, write Is Null for a missing value or &apos;Null&apos; for the word</source>
        <translation>nada es igual a Null, escriba Is Null para un valor que falta o &apos;Null&apos; para la palabra</translation>
    </message>
    <message>
        <source>a parameter needs a name, as in :year</source>
        <translation>un parámetro necesita un nombre, como en :fecha</translation>
    </message>
    <message>
        <source>the name of a column is missing behind the point</source>
        <translation>falta el nombre de una columna después del punto</translation>
    </message>
    <message>
        <source>the query has no column %1</source>
        <translation>la consulta no tiene ninguna columna %1</translation>
    </message>
    <message>
        <source>the table of this column was deleted from the query</source>
        <translation>la tabla de esta columna se eliminó de la consulta</translation>
    </message>
    <message>
        <source>several tables have this column, write the table too, as in %1</source>
        <translation>varias tablas tienen esta columna, escriba también la tabla, como en %1</translation>
    </message>
    <message>
        <source>compare it with a column that holds %1</source>
        <translation>compárelo con una columna que contenga %1</translation>
    </message>
    <message>
        <source>half a character stands here, type it afresh</source>
        <translation>aquí hay medio carácter, escríbalo de nuevo</translation>
    </message>
    <message>
        <source>a [ before this ] is missing</source>
        <translation>falta un [ antes de este ]</translation>
    </message>
    <message>
        <source>write &lt;&gt; for unequal</source>
        <translation>escriba &lt;&gt; para distinto</translation>
    </message>
    <message>
        <source>a name is missing between the brackets</source>
        <translation>falta un nombre entre los corchetes</translation>
    </message>
    <message>
        <source>a text is missing</source>
        <translation>falta un texto</translation>
    </message>
    <message>
        <source>a number is missing</source>
        <translation>falta un número</translation>
    </message>
    <message>
        <source>a date (2024-12-31) is missing</source>
        <translation>falta una fecha (2024-12-31)</translation>
    </message>
    <message>
        <source>a time (23:59) is missing</source>
        <translation>falta una hora (23:59)</translation>
    </message>
    <message>
        <source>a date and time (2024-12-31 23:59) is missing</source>
        <translation>falta una fecha con hora (2024-12-31 23:59)</translation>
    </message>
    <message>
        <source>true or false is missing</source>
        <translation>falta true o false</translation>
    </message>
    <message>
        <source>a value is missing</source>
        <translation>falta un valor</translation>
    </message>
    <message>
        <source>this is no number, write it like 12 or 1.5</source>
        <translation>esto no es un número, escríbalo como 12 o 1.5</translation>
    </message>
    <message>
        <source>decimals are written with a point, as in 1.5</source>
        <translation>escriba los decimales con punto, como en 1.5</translation>
    </message>
    <message>
        <source>this is no date, write it like 2024-12-31</source>
        <translation>esto no es una fecha, escríbala como 2024-12-31</translation>
    </message>
    <message>
        <source>this is no time, write it like 23:59</source>
        <translation>esto no es una hora, escríbala como 23:59</translation>
    </message>
    <message>
        <source>write true or false here</source>
        <translation>escriba aquí true o false</translation>
    </message>
    <message>
        <source>only dates and times stand between two #</source>
        <translation>entre dos # escriba solo fechas y horas</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is not a file; choose another name.</source>
        <translation>«%1» no es un archivo; elija otro nombre.</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is not a file; choose a query file.</source>
        <translation>«%1» no es un archivo; elija un archivo de consulta.</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; is write-protected; save under another name.</source>
        <translation>El archivo «%1» está protegido contra escritura; guarde con otro nombre.</translation>
    </message>
    <message>
        <source>%1 (%2); %3.</source>
        <translation>%1 (%2); %3.</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; cannot be saved</source>
        <translation>No se puede guardar el archivo «%1»</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; cannot be read</source>
        <translation>No se puede leer el archivo «%1»</translation>
    </message>
    <message>
        <source>The output cannot be written</source>
        <translation>No se puede escribir la salida</translation>
    </message>
    <message>
        <source>check the path</source>
        <translation>compruebe la ruta</translation>
    </message>
    <message>
        <source>ask the owner for permission, or choose another folder</source>
        <translation>pida permiso al propietario o elija otra carpeta</translation>
    </message>
    <message>
        <source>make room on the disk, or choose another one</source>
        <translation>haga sitio en el disco o elija otro</translation>
    </message>
    <message>
        <source>choose another disk</source>
        <translation>elija otro disco</translation>
    </message>
    <message>
        <source>choose a folder on another disk</source>
        <translation>elija una carpeta en otro disco</translation>
    </message>
    <message>
        <source>try again, or choose another folder</source>
        <translation>inténtelo de nuevo o elija otra carpeta</translation>
    </message>
    <message>
        <source>choose a shorter name</source>
        <translation>elija un nombre más corto</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; cannot be used: %2</source>
        <translation>No se puede usar el archivo «%1»: %2</translation>
    </message>
    <message>
        <source>%1. %2.</source>
        <translation>%1. %2.</translation>
    </message>
    <message>
        <source>Mend the file there, or restore it from a copy</source>
        <translation>Corrija ahí el archivo o restáurelo desde una copia</translation>
    </message>
    <message>
        <source>Choose a query file</source>
        <translation>Elija un archivo de consulta</translation>
    </message>
    <message>
        <source>Open the file with a newer version of this program</source>
        <translation>Abra el archivo con una versión más reciente de este programa</translation>
    </message>
    <message>
        <source>Type that text afresh and save again</source>
        <translation>Escriba de nuevo ese texto y vuelva a guardar</translation>
    </message>
    <message>
        <source>The query could not be read again: %1</source>
        <translation>No se pudo volver a leer la consulta: %1</translation>
    </message>
    <message>
        <source>The query would not be the same when read again. Report this, please.</source>
        <translation>La consulta no sería la misma al volver a leerla. Comunique este fallo, por favor.</translation>
    </message>
    <message>
        <source>The file</source>
        <translation>El archivo</translation>
    </message>
    <message>
        <source>Line %1, column %2: %3</source>
        <translation>Línea %1, columna %2: %3</translation>
    </message>
    <message>
        <source>a number is too large</source>
        <translation>un número es demasiado grande</translation>
    </message>
    <message>
        <source>%1 stands there twice</source>
        <translation>%1 aparece dos veces</translation>
    </message>
    <message>
        <source>%1 is longer than %2 characters</source>
        <translation>%1 tiene más de %2 caracteres</translation>
    </message>
    <message>
        <source>%1 has a NUL character in it</source>
        <translation>%1 contiene un carácter NUL</translation>
    </message>
    <message>
        <source>%1 is nested more than %2 levels deep</source>
        <translation>%1 está a más de %2 niveles de profundidad</translation>
    </message>
    <message>
        <source>%1 is one value too many: a file may have %2</source>
        <translation>%1 es un valor de más: un archivo puede tener %2</translation>
    </message>
    <message>
        <source>%1 is larger than %2 MiB</source>
        <translation>%1 ocupa más de %2 MiB</translation>
    </message>
    <message>
        <source>%1 is not an object</source>
        <translation>%1 no es un objeto</translation>
    </message>
    <message>
        <source>%1 is not a text</source>
        <translation>%1 no es un texto</translation>
    </message>
    <message>
        <source>%1 is neither a text nor null</source>
        <translation>%1 no es ni un texto ni null</translation>
    </message>
    <message>
        <source>%1 is not true or false</source>
        <translation>%1 no es true ni false</translation>
    </message>
    <message>
        <source>%1 is not a list</source>
        <translation>%1 no es una lista</translation>
    </message>
    <message>
        <source>%1 has more than %2 entries</source>
        <translation>%1 tiene más de %2 entradas</translation>
    </message>
    <message>
        <source>%1 is missing</source>
        <translation>Falta %1</translation>
    </message>
    <message>
        <source>%1 is not a whole number from %2 to %3</source>
        <translation>%1 no es un número entero entre %2 y %3</translation>
    </message>
    <message>
        <source>%1 is &quot;%2&quot; and none of %3</source>
        <translation>%1 es «%2» y no es ninguno de estos valores: %3</translation>
    </message>
    <message>
        <source>%1 makes the columns of all tables more than %2</source>
        <translation>%1 hace que todas las tablas juntas tengan más de %2 columnas</translation>
    </message>
    <message>
        <source>%1 is no length of a name in the text</source>
        <translation>%1 no es una longitud posible para un nombre del texto</translation>
    </message>
    <message>
        <source>%1 is not &quot;%2&quot;</source>
        <translation>%1 no es «%2»</translation>
    </message>
    <message>
        <source>%1 is less than 1</source>
        <translation>%1 es menor que 1</translation>
    </message>
    <message>
        <source>%1 is %2 and newer than %3, the newest that can be read here</source>
        <translation>%1 es %2 y más reciente que %3, la versión más reciente que se puede leer aquí</translation>
    </message>
    <message>
        <source>%1 has half a character in it (an unpaired surrogate)</source>
        <translation>%1 contiene medio carácter (un sustituto sin pareja)</translation>
    </message>
    <message>
        <source>%1</source>
        <translation>%1</translation>
    </message>
    <message>
        <source>The table of an output column is no longer in the query: delete the output column, or choose another field for it.</source>
        <translation>La tabla de una columna de salida ya no está en la consulta: elimine la columna de salida o elija otro campo para ella.</translation>
    </message>
    <message>
        <source>%1.* stands for all columns and cannot be sorted by: add the column that is to decide, and sort by that.</source>
        <translation>%1.* representa todas las columnas y no sirve para ordenar: añada la columna que debe decidir el orden y ordene por ella.</translation>
    </message>
    <message>
        <source>%1.* stands for all columns and cannot have a criterion: add the column that is meant, and write the criterion there.</source>
        <translation>%1.* representa todas las columnas y no puede tener un criterio: añada la columna a la que se refiere y escriba allí el criterio.</translation>
    </message>
    <message>
        <source>Two output columns are named %1, so that nobody can tell them apart: give one of them a synonym.</source>
        <translation>Dos columnas de salida se llaman %1 y nadie puede distinguirlas: dé un sinónimo a una de ellas.</translation>
    </message>
    <message>
        <source>%1 and %2 hold different kinds of values, so that their join finds nothing or fails: join columns that hold the same.</source>
        <translation>%1 y %2 contienen valores de distinto tipo, así que su combinación no encuentra nada o falla: combine columnas que contengan lo mismo.</translation>
    </message>
    <message>
        <source>The outer join between %1 and %2 keeps no more rows than a normal one, for normal joins connect these tables too: make it a normal join, or make the others outer ones.</source>
        <translation>La combinación externa entre %1 y %2 no conserva más filas que una normal, porque estas tablas también están unidas por combinaciones normales: conviértala en normal o convierta las otras en externas.</translation>
    </message>
    <message>
        <source>The outer joins around %1 and %2 contradict each other, and the one drawn first decides which rows are kept: let all of them keep the rows of the same table.</source>
        <translation>Las combinaciones externas en torno a %1 y %2 se contradicen, y la que se dibujó primero decide qué filas se conservan: haga que todas conserven las filas de la misma tabla.</translation>
    </message>
    <message>
        <source>The outer joins around %1 can be read in several ways, each with other rows: change the type of one of them.</source>
        <translation>Las combinaciones externas en torno a %1 se pueden entender de varias maneras, cada una con otras filas: cambie el tipo de una de ellas.</translation>
    </message>
    <message>
        <source>No join connects %1 with %2, so that every row of one comes with every row of the other: draw a join between them, add the table that lies between, or delete one.</source>
        <translation>Ninguna combinación une %1 con %2, así que cada fila de una sale con cada fila de la otra: dibuje una combinación entre ellas, añada la tabla que está en medio o elimine una.</translation>
    </message>
    <message>
        <source>Standard SQL</source>
        <translation>SQL estándar</translation>
    </message>
    <message>
        <source>MySQL/MariaDB has no join that keeps all rows of both tables: let this one keep those of one table.</source>
        <translation>MySQL/MariaDB no tiene ninguna combinación que conserve todas las filas de ambas tablas: haga que esta conserve las de una sola tabla.</translation>
    </message>
    <message>
        <source>PostgreSQL keeps all rows of both tables only where a join asks for equal values: choose the operator =, or let the join keep the rows of one table.</source>
        <translation>PostgreSQL solo conserva todas las filas de ambas tablas si la combinación pide valores iguales: elija el operador = o haga que la combinación conserve las filas de una sola tabla.</translation>
    </message>
    <message>
        <source>These are more conditions than SQLite takes, which is about 900: write a long list of values as In (1, 2, 3).</source>
        <translation>Son más condiciones de las que admite SQLite, unas 900: escriba una lista larga de valores como In (1, 2, 3).</translation>
    </message>
    <message>
        <source>%1 takes no name that is empty: write one.</source>
        <translation>%1 no admite nombres vacíos: escriba uno.</translation>
    </message>
    <message>
        <source>%1 takes no name with the character zero in it: choose another one.</source>
        <translation>%1 no admite nombres que contengan el carácter cero: elija otro.</translation>
    </message>
    <message>
        <source>%1 takes no name with half a character in it: type it afresh.</source>
        <translation>%1 no admite nombres que contengan medio carácter: escríbalo de nuevo.</translation>
    </message>
    <message>
        <source>The name &quot;%1&quot; is too long for %2, which takes %3 bytes (one for a letter from A to Z, more for most others): choose a shorter one.</source>
        <translation>El nombre «%1» es demasiado largo para %2, que admite %3 bytes (uno por cada letra de la A a la Z, más por casi todos los demás caracteres): elija uno más corto.</translation>
    </message>
    <message>
        <source>The name &quot;%1&quot; is too long for %2, which takes %3 characters: choose a shorter one.</source>
        <translation>El nombre «%1» es demasiado largo para %2, que admite %3 caracteres: elija uno más corto.</translation>
    </message>
    <message>
        <source>The name &quot;%1&quot; has a rare character in it that %2 does not take, such as an emoji: write it without.</source>
        <translation>El nombre «%1» contiene un carácter poco común que %2 no admite, como un emoji: escríbalo sin él.</translation>
    </message>
    <message>
        <source>The name &quot;%1&quot; ends with a blank, which %2 does not take: write it without.</source>
        <translation>El nombre «%1» termina con un espacio, que %2 no admite: escríbalo sin él.</translation>
    </message>
    <message>
        <source>* and % are ordinary characters here, write Like before a pattern, or quotes around a text</source>
        <translation>* y % son aquí caracteres normales, escriba Like delante de un patrón, o comillas alrededor de un texto</translation>
    </message>
    <message>
        <source>a value</source>
        <translation>un valor</translation>
    </message>
    <message>
        <source>this is no date and time, write it like 2024-12-31 or 2024-12-31 23:59</source>
        <translation>esto no es una fecha con hora, escríbala como 2024-12-31 o 2024-12-31 23:59</translation>
    </message>
    <message>
        <source>%1 is not from %2 to %3</source>
        <translation>%1 no está entre %2 y %3</translation>
    </message>
    <message>
        <source>%1 is not the letter %2 and a number from 1 to %3</source>
        <translation>%1 no es la letra %2 seguida de un número entre 1 y %3</translation>
    </message>
    <message>
        <source>%1 is beyond the last key %2 of its kind</source>
        <translation>%1 va más allá de la última clave de su tipo, %2</translation>
    </message>
    <message>
        <source>%1 is used before already</source>
        <translation>%1 ya se ha usado antes</translation>
    </message>
    <message>
        <source>%1 is empty</source>
        <translation>%1 está vacío</translation>
    </message>
    <message>
        <source>%1 is the name of another table too</source>
        <translation>%1 es también el nombre de otra tabla</translation>
    </message>
    <message>
        <source>%1 does not begin with the entry &quot;*&quot;</source>
        <translation>%1 no empieza con la entrada «*»</translation>
    </message>
    <message>
        <source>%1 is the key of no table</source>
        <translation>%1 no es la clave de ninguna tabla</translation>
    </message>
    <message>
        <source>%1 is the key of no column</source>
        <translation>%1 no es la clave de ninguna columna</translation>
    </message>
    <message>
        <source>%1 is the key of no column of that table</source>
        <translation>%1 no es la clave de ninguna columna de esa tabla</translation>
    </message>
    <message>
        <source>%1 is no type of join</source>
        <translation>%1 no es un tipo de combinación</translation>
    </message>
    <message>
        <source>%1 is no comparison</source>
        <translation>%1 no es una comparación</translation>
    </message>
    <message>
        <source>%1 is no sort order</source>
        <translation>%1 no es un tipo de orden</translation>
    </message>
    <message>
        <source>%1 is less than the first row, %2</source>
        <translation>%1 es menor que la primera fila, %2</translation>
    </message>
    <message>
        <source>%1 does not come behind the row before it</source>
        <translation>%1 no viene después de la fila anterior</translation>
    </message>
    <message>
        <source>%1 is no place in the text behind the name before it</source>
        <translation>%1 no es un lugar del texto situado después del nombre anterior</translation>
    </message>
    <message>
        <source>%1.* stands for all columns: count the rows with the total &quot;count&quot;, or add the columns that are meant.</source>
        <translation>%1.* representa todas las columnas: cuente las filas con el total «count» o añada las columnas que se quieren.</translation>
    </message>
    <message>
        <source>%1 holds no numbers, for which alone there is the total &quot;%2&quot;: choose another total.</source>
        <translation>%1 no contiene números, los únicos para los que hay el total «%2»: elija otro total.</translation>
    </message>
    <message>
        <source>%1 holds values that have no order, so that there is no total &quot;%2&quot; of them: choose another total.</source>
        <translation>%1 contiene valores sin orden, por lo que no hay total «%2» de ellos: elija otro total.</translation>
    </message>
    <message>
        <source>Where criteria stand in several rows, some of a total and some of a column that is only a condition, the latter must be the same in every row: repeat it, or make two queries of this one.</source>
        <translation>Donde hay criterios en varias filas, unos de un total y otros de una columna que es solo condición, estos últimos deben ser iguales en cada fila: repítalos o haga de esta dos consultas.</translation>
    </message>
    <message>
        <source>This criterion is asked of rows that were put together, and %1 has many values there: add it as a column of its own, or write a value.</source>
        <translation>Este criterio se aplica a filas agrupadas, y %1 tiene allí muchos valores: añádalo como columna propia o escriba un valor.</translation>
    </message>
    <message>
        <source>%1 sorts the rows and does not come out with them, which different rows need: show it, or take its sort away.</source>
        <translation>%1 ordena las filas y no sale con ellas, lo que las filas distintas necesitan: muéstrela o quite su orden.</translation>
    </message>
    <message>
        <source>%1 is only a condition, so that nothing can be sorted by it: choose another total, or take its sort away.</source>
        <translation>%1 es solo una condición, por lo que no se puede ordenar por ella: elija otro total o quite su orden.</translation>
    </message>
    <message>
        <source>The first %1 rows are any %1 as long as nothing is sorted: sort by what is to decide.</source>
        <translation>Las primeras %1 filas son %1 cualesquiera mientras nada se ordene: ordene por lo que ha de decidir.</translation>
    </message>
    <message>
        <source>%2 has nothing that says %1: leave it out, or calculate it from what was found.</source>
        <translation>%2 no tiene nada que diga %1: omítalo o calcúlelo a partir de lo encontrado.</translation>
    </message>
    <message>
        <source>The parameter %1 stands in an expression that rows are put together by: show that column, or write a value in the place of the parameter.</source>
        <translation>El parámetro %1 está en una expresión por la que se agrupan filas: muestre esa columna o escriba un valor en lugar del parámetro.</translation>
    </message>
    <message>
        <source>at most 10000 characters can stand here</source>
        <translation>aquí caben como máximo 10000 caracteres</translation>
    </message>
    <message>
        <source>the character zero cannot stand here</source>
        <translation>el carácter cero no puede estar aquí</translation>
    </message>
    <message>
        <source>%1 means nothing here</source>
        <translation>%1 no significa nada aquí</translation>
    </message>
    <message>
        <source>put an operator between two values, such as + or &amp;</source>
        <translation>ponga un operador entre dos valores, como + o &amp;</translation>
    </message>
    <message>
        <source>compare it with %1</source>
        <translation>compárelo con %1</translation>
    </message>
    <message>
        <source>a condition is needed here, as in [price] &gt; 5</source>
        <translation>aquí hace falta una condición, como en [price] &gt; 5</translation>
    </message>
    <message>
        <source>a number is needed here</source>
        <translation>aquí hace falta un número</translation>
    </message>
    <message>
        <source>a whole number is needed here</source>
        <translation>aquí hace falta un número entero</translation>
    </message>
    <message>
        <source>the number of decimals is needed here, from 0 to 15</source>
        <translation>aquí hace falta el número de decimales, de 0 a 15</translation>
    </message>
    <message>
        <source>a date is needed here, as in #2024-12-31#</source>
        <translation>aquí hace falta una fecha, como en #2024-12-31#</translation>
    </message>
    <message>
        <source>texts are joined by &amp;</source>
        <translation>los textos se unen con &amp;</translation>
    </message>
    <message>
        <source>the query has no column %1, and a text stands in quotes</source>
        <translation>la consulta no tiene ninguna columna %1, y un texto va entre comillas</translation>
    </message>
    <message>
        <source>there is no function %1</source>
        <translation>no hay ninguna función %1</translation>
    </message>
    <message>
        <source>a total is no function: write what is to be put together, and choose the total of the output column</source>
        <translation>un total no es una función: escriba lo que se ha de agrupar y elija el total de la columna de salida</translation>
    </message>
    <message>
        <source>this is written %1</source>
        <translation>esto se escribe %1</translation>
    </message>
    <message>
        <source>%1 is no total</source>
        <translation>%1 no es un total</translation>
    </message>
    <message>
        <source>%1 stands beside an expression, which takes its place</source>
        <translation>%1 está junto a una expresión, que ocupa su lugar</translation>
    </message>
    <message>
        <source>This is nested deeper than SQLite takes, which is about 30 levels of parentheses: divide it among several columns or rows of criteria.</source>
        <translation>Esto está anidado más hondo de lo que SQLite admite, unos 30 niveles de paréntesis: repártalo entre varias columnas o filas de criterios.</translation>
    </message>
    <message>
        <source>This is a statement of more than a million characters: put fewer functions into each other, or divide it among several columns.</source>
        <translation>Esto da una instrucción de más de un millón de caracteres: anide menos funciones o repártala entre varias columnas.</translation>
    </message>
    <message>
        <source>%1 is no format of values</source>
        <translation>%1 no es un formato de valores</translation>
    </message>
    <message>
        <source>The query &quot;%1&quot; would read from itself, by itself or by way of the saved queries in it: choose another one, or take one out.</source>
        <translation>La consulta «%1» leería de sí misma, directamente o a través de las consultas guardadas que contiene: elija otra, o quite una.</translation>
    </message>
    <message>
        <source>In %1: %2</source>
        <translation>En %1: %2</translation>
    </message>
    <message>
        <source>No column comes out of that query, so that it cannot stand as a table: give it output columns, and save it.</source>
        <translation>De esa consulta no sale ninguna columna, así que no puede estar como tabla: dele columnas de salida, y guárdela.</translation>
    </message>
    <message>
        <source>Saved queries stand more than %1 deep in each other then: make one query of some of them.</source>
        <translation>Las consultas guardadas estarían entonces anidadas en más de %1 niveles: haga de algunas una sola.</translation>
    </message>
    <message>
        <source>%1 gives no column %2 any more, which is used here: take it out of this query, or give it back to that one.</source>
        <translation>%1 ya no da ninguna columna %2, que se usa aquí: quítela de esta consulta, o devuélvala a la otra.</translation>
    </message>
    <message>
        <source>%1 has other columns here than its query gives: read it again from its file.</source>
        <translation>%1 tiene aquí otras columnas que las que da su consulta: léala de nuevo de su archivo.</translation>
    </message>
    <message>
        <source>%1 has saved queries more than %2 deep in each other</source>
        <translation>%1 tiene consultas guardadas anidadas en más de %2 niveles</translation>
    </message>
    <message>
        <source>this cannot be read as SQL (%1); mend it here or before.</source>
        <translation>esto no se puede leer como SQL (%1); corríjalo aquí o antes.</translation>
    </message>
    <message>
        <source>what begins here has no end; close it with %1.</source>
        <translation>lo que empieza aquí no tiene fin; ciérrelo con %1.</translation>
    </message>
    <message>
        <source>there is no statement; write a SELECT.</source>
        <translation>no hay ninguna instrucción; escriba un SELECT.</translation>
    </message>
    <message>
        <source>a drawing holds one statement; leave out all but one.</source>
        <translation>un dibujo contiene una sola instrucción; deje solo una.</translation>
    </message>
    <message>
        <source>a drawing holds a SELECT and nothing else.</source>
        <translation>un dibujo contiene un SELECT y nada más.</translation>
    </message>
    <message>
        <source>this name is too long to be read.</source>
        <translation>este nombre es demasiado largo para leerlo.</translation>
    </message>
    <message>
        <source>the text is too long to be drawn; at most %1 characters are read.</source>
        <translation>el texto es demasiado largo para dibujarlo; se leen %1 caracteres como máximo.</translation>
    </message>
    <message>
        <source>too much stands within each other here to be drawn.</source>
        <translation>aquí hay demasiado anidado para dibujarlo.</translation>
    </message>
    <message>
        <source>a drawing has no place for %1; it can be run as it is.</source>
        <translation>un dibujo no tiene lugar para %1; se puede ejecutar tal como está.</translation>
    </message>
    <message>
        <source>a window function</source>
        <translation>una función de ventana</translation>
    </message>
    <message>
        <source>UNION, INTERSECT or EXCEPT</source>
        <translation>UNION, INTERSECT o EXCEPT</translation>
    </message>
    <message>
        <source>WITH RECURSIVE</source>
        <translation>WITH RECURSIVE</translation>
    </message>
    <message>
        <source>a LATERAL source</source>
        <translation>una fuente LATERAL</translation>
    </message>
    <message>
        <source>a sub-select within a condition or value</source>
        <translation>un sub-SELECT en una condición o un valor</translation>
    </message>
    <message>
        <source>rows left out by OFFSET</source>
        <translation>filas omitidas por OFFSET</translation>
    </message>
    <message>
        <source>a limit that is no number from 1 to %1</source>
        <translation>un límite que no es un número de 1 a %1</translation>
    </message>
    <message>
        <source>PERCENT or WITH TIES</source>
        <translation>PERCENT o WITH TIES</translation>
    </message>
    <message>
        <source>a lock</source>
        <translation>un bloqueo</translation>
    </message>
    <message>
        <source>DISTINCT ON</source>
        <translation>DISTINCT ON</translation>
    </message>
    <message>
        <source>NULLS FIRST or NULLS LAST</source>
        <translation>NULLS FIRST o NULLS LAST</translation>
    </message>
    <message>
        <source>grouping sets</source>
        <translation>conjuntos de agrupación</translation>
    </message>
    <message>
        <source>a function in the place of a table</source>
        <translation>una función en lugar de una tabla</translation>
    </message>
    <message>
        <source>new names for the columns of a table</source>
        <translation>nombres nuevos para las columnas de una tabla</translation>
    </message>
    <message>
        <source>a SELECT that reads from no table</source>
        <translation>un SELECT que no lee de ninguna tabla</translation>
    </message>
    <message>
        <source>a SELECT of no columns</source>
        <translation>un SELECT sin columnas</translation>
    </message>
    <message>
        <source>a column that a FULL JOIN shares by USING or NATURAL</source>
        <translation>una columna que un FULL JOIN comparte por USING o NATURAL</translation>
    </message>
    <message>
        <source>a total within a calculation</source>
        <translation>un total dentro de un cálculo</translation>
    </message>
    <message>
        <source>this (%1)</source>
        <translation>esto (%1)</translation>
    </message>
    <message>
        <source>a drawing does not know the function %1 as it stands here; the statement can be run as it is.</source>
        <translation>un dibujo no conoce la función %1 tal como aparece aquí; la instrucción se puede ejecutar tal como está.</translation>
    </message>
    <message>
        <source>a drawing does not know this cast; the statement can be run as it is.</source>
        <translation>un dibujo no conoce esta conversión; la instrucción se puede ejecutar tal como está.</translation>
    </message>
    <message>
        <source>a drawing does not know the operator %1; the statement can be run as it is.</source>
        <translation>un dibujo no conoce el operador %1; la instrucción se puede ejecutar tal como está.</translation>
    </message>
    <message>
        <source>this division may give whole numbers or stop at 0, which one of a drawing does not; write %1.</source>
        <translation>esta división puede dar números enteros o detenerse en 0, lo que la de un dibujo no hace; escriba %1.</translation>
    </message>
    <message>
        <source>a drawing writes this as &apos;%1&apos;, which compares otherwise here; write it so.</source>
        <translation>un dibujo escribe esto como &apos;%1&apos;, que aquí se compara de otro modo; escríbalo así.</translation>
    </message>
    <message>
        <source>LIKE tells capitals from small letters here, which a drawing does not; write ILIKE if that is meant.</source>
        <translation>aquí LIKE distingue mayúsculas de minúsculas y un dibujo no; escriba ILIKE si eso es lo que se quiere.</translation>
    </message>
    <message>
        <source>a drawing has no NULL as a value; write IS NULL or leave it out.</source>
        <translation>un dibujo no tiene NULL como valor; escriba IS NULL u omítalo.</translation>
    </message>
    <message>
        <source>this column is neither grouped nor a total; write it into GROUP BY.</source>
        <translation>esta columna no está agrupada ni es un total; escríbala en GROUP BY.</translation>
    </message>
    <message>
        <source>a drawing cannot hold this: %1</source>
        <translation>un dibujo no puede contener esto: %1</translation>
    </message>
    <message>
        <source>the condition of an outer join can compare columns of its two sides and nothing else in a drawing.</source>
        <translation>en un dibujo la condición de una unión externa compara columnas de sus dos lados y nada más.</translation>
    </message>
    <message>
        <source>this condition has no place in the rows of a drawing.</source>
        <translation>esta condición no tiene lugar en las filas de un dibujo.</translation>
    </message>
    <message>
        <source>drawn, this would not say the same (%1); it can be run as it is.</source>
        <translation>dibujado, esto no diría lo mismo (%1); se puede ejecutar tal como está.</translation>
    </message>
    <message>
        <source>the order of its joins</source>
        <translation>el orden de sus uniones</translation>
    </message>
    <message>
        <source>its conditions</source>
        <translation>sus condiciones</translation>
    </message>
    <message>
        <source>its columns</source>
        <translation>sus columnas</translation>
    </message>
    <message>
        <source>its groups</source>
        <translation>sus grupos</translation>
    </message>
    <message>
        <source>its order</source>
        <translation>su orden</translation>
    </message>
    <message>
        <source>the database has no table &quot;%1&quot;.</source>
        <translation>la base de datos no tiene ninguna tabla «%1».</translation>
    </message>
    <message>
        <source>the database has no table &quot;%1&quot;; is &quot;%2&quot; meant?</source>
        <translation>la base de datos no tiene ninguna tabla «%1»; ¿se refiere a «%2»?</translation>
    </message>
    <message>
        <source>there is no table &quot;%1&quot; in the statement.</source>
        <translation>no hay ninguna tabla «%1» en la instrucción.</translation>
    </message>
    <message>
        <source>no table has a column &quot;%1&quot;.</source>
        <translation>ninguna tabla tiene una columna «%1».</translation>
    </message>
    <message>
        <source>no table has a column &quot;%1&quot;; is &quot;%2&quot; meant?</source>
        <translation>ninguna tabla tiene una columna «%1»; ¿se refiere a «%2»?</translation>
    </message>
    <message>
        <source>several tables have a column &quot;%1&quot;; write its table before it.</source>
        <translation>varias tablas tienen una columna «%1»; escriba su tabla delante.</translation>
    </message>
    <message>
        <source>two tables are called &quot;%1&quot; here; give one of them another name.</source>
        <translation>aquí dos tablas se llaman «%1»; dé otro nombre a una de ellas.</translation>
    </message>
    <message>
        <source>two columns come out as &quot;%1&quot;.</source>
        <translation>dos columnas salen como «%1».</translation>
    </message>
    <message>
        <source>there is no output column %1.</source>
        <translation>no hay columna de salida %1.</translation>
    </message>
    <message>
        <source>a comment that is run</source>
        <translation>un comentario que se ejecuta</translation>
    </message>
    <message>
        <source>no more than %1 comments can be kept; leave some out.</source>
        <translation>no se pueden conservar más de %1 comentarios; quite algunos.</translation>
    </message>
    <message>
        <source>the database takes these operators together in another order than they are read; write parentheses.</source>
        <translation>la base de datos agrupa estos operadores en otro orden que el de la lectura; ponga paréntesis.</translation>
    </message>
    <message>
        <source>a drawing takes a date for a moment beside one, which the database does not; the statement can be run as it is.</source>
        <translation>junto a una marca de tiempo, un dibujo toma una fecha por otra, lo que la base de datos no hace; la sentencia puede ejecutarse tal cual.</translation>
    </message>
    <message>
        <source>a drawing takes &apos;%1&apos; for no text here, which the database does; write it without quotes.</source>
        <translation>un dibujo no toma aquí &apos;%1&apos; por un texto, lo que la base de datos sí hace; escríbalo sin comillas.</translation>
    </message>
</context>
<context>
    <name>ZandorWidget</name>
    <message>
        <source>Join %1 %2 %3</source>
        <translation>Combinación %1 %2 %3</translation>
    </message>
    <message>
        <source>Query designer</source>
        <translation>Diseñador de consultas</translation>
    </message>
    <message>
        <source>all</source>
        <comment>the rows of a table, at the end of a line</comment>
        <translation>todas</translation>
    </message>
    <message>
        <source>the rows of %1 and %2 that match</source>
        <translation>las filas de %1 y %2 que coinciden</translation>
    </message>
    <message>
        <source>all rows of %1, and those of %2 that match</source>
        <translation>todas las filas de %1, y las de %2 que coinciden</translation>
    </message>
    <message>
        <source>all rows of %1 and of %2, side by side where they match</source>
        <translation>todas las filas de %1 y de %2, emparejadas donde coinciden</translation>
    </message>
    <message>
        <source>Re&amp;name…</source>
        <translation>Cambiar el &amp;nombre…</translation>
    </message>
    <message>
        <source>(None)</source>
        <comment>no sort order</comment>
        <translation>(Ninguno)</translation>
    </message>
    <message>
        <source>Ascending</source>
        <translation>Ascendente</translation>
    </message>
    <message>
        <source>Descending</source>
        <translation>Descendente</translation>
    </message>
    <message>
        <source>Visible</source>
        <comment>an output column</comment>
        <translation>Visible</translation>
    </message>
    <message>
        <source>Not Visible</source>
        <translation>No visible</translation>
    </message>
    <message>
        <source>Invisible</source>
        <translation>Invisible</translation>
    </message>
    <message>
        <source>&amp;Set</source>
        <comment>the button of a cell&apos;s editor</comment>
        <translation>&amp;Fijar</translation>
    </message>
    <message>
        <source>Remove the table</source>
        <translation>Quitar la tabla</translation>
    </message>
    <message>
        <source>key column</source>
        <comment>an entry of a table</comment>
        <translation>columna clave</translation>
    </message>
    <message>
        <source>comes out</source>
        <comment>an entry of a table, in the rows</comment>
        <translation>columna de salida</translation>
    </message>
    <message>
        <source>Add field…</source>
        <translation>Añadir…</translation>
    </message>
    <message>
        <source>Type to find a field</source>
        <translation>Escriba para buscar un campo</translation>
    </message>
    <message>
        <source>Field</source>
        <translation>Campo</translation>
    </message>
    <message>
        <source>Fields</source>
        <translation>Campos</translation>
    </message>
    <message>
        <source>column %1</source>
        <translation>columna %1</translation>
    </message>
    <message>
        <source>Tables and joins</source>
        <translation>Tablas y combinaciones</translation>
    </message>
    <message>
        <source>Output columns</source>
        <translation>Columnas de salida</translation>
    </message>
    <message>
        <source>Scroll across</source>
        <translation>Desplazamiento horizontal</translation>
    </message>
    <message>
        <source>Scroll down</source>
        <translation>Desplazamiento vertical</translation>
    </message>
    <message>
        <source>Back to the origin</source>
        <translation>Volver al origen</translation>
    </message>
    <message>
        <source>Divider of canvas and grid</source>
        <translation>Divisor entre el lienzo y la cuadrícula</translation>
    </message>
    <message>
        <source>Drag to give the canvas or the grid more room</source>
        <translation>Arrastre para dar más espacio al lienzo o a la cuadrícula</translation>
    </message>
</context>
<context>
    <name>zandor::designer</name>
    <message>
        <source>There is nothing to draw; add a table first.</source>
        <translation>No hay nada que dibujar; añada primero una tabla.</translation>
    </message>
    <message>
        <source>A picture ends in .png, .svg or .pdf; &quot;%1&quot; does not.</source>
        <translation>Una imagen termina en .png, .svg o .pdf; «%1» no.</translation>
    </message>
    <message>
        <source>The printer cannot be reached; choose another one.</source>
        <translation>No se puede acceder a la impresora; elija otra.</translation>
    </message>
    <message>
        <source>The page could not be printed; see the printer&apos;s own messages.</source>
        <translation>No se pudo imprimir la página; consulte los mensajes de la impresora.</translation>
    </message>
    <message>
        <source>%1 tables are too many; the canvas takes %2.</source>
        <translation>%1 tablas son demasiadas; el lienzo admite %2.</translation>
    </message>
    <message>
        <source>There is no table &quot;%1&quot; in %2.</source>
        <translation>No hay ninguna tabla «%1» en %2.</translation>
    </message>
    <message>
        <source>These tables have %1 joins, and the canvas takes %2; choose fewer tables with --tables.</source>
        <translation>Estas tablas tienen %1 combinaciones y el lienzo admite %2; elija menos tablas con --tables.</translation>
    </message>
    <message>
        <source>The drawing is too large for &quot;%1&quot;; choose a name that ends in .svg.</source>
        <translation>El dibujo es demasiado grande para «%1»; elija un nombre que termine en .svg.</translation>
    </message>
    <message>
        <source>Picture (*.png)</source>
        <translation>Imagen (*.png)</translation>
    </message>
    <message>
        <source>Scalable drawing (*.svg)</source>
        <translation>Dibujo vectorial (*.svg)</translation>
    </message>
    <message>
        <source>Document (*.pdf)</source>
        <translation>Documento (*.pdf)</translation>
    </message>
    <message>
        <source>The drawing takes %1 tables, and the statement has %2.</source>
        <translation>El dibujo admite %1 tablas, y la instrucción tiene %2.</translation>
    </message>
    <message>
        <source>The drawing takes %1 joins, and the statement has %2.</source>
        <translation>El dibujo admite %1 uniones, y la instrucción tiene %2.</translation>
    </message>
    <message>
        <source>The grid takes %1 columns, and the statement has %2.</source>
        <translation>La cuadrícula admite %1 columnas, y la instrucción tiene %2.</translation>
    </message>
    <message>
        <source>There is no file &quot;%1&quot;; check the path.</source>
        <translation>No hay ningún archivo «%1»; compruebe la ruta.</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is a folder; name a file with a statement.</source>
        <translation>«%1» es una carpeta; indique un archivo con una instrucción.</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; cannot be read: %2.</source>
        <translation>El archivo «%1» no se puede leer: %2.</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is too large for a statement.</source>
        <translation>«%1» es demasiado grande para una instrucción.</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is no text in UTF-8; save it as such.</source>
        <translation>«%1» no es un texto en UTF-8; guárdelo así.</translation>
    </message>
    <message>
        <source>A text that is not drawn is not run on this database, which nothing would keep from writing: go back to the drawing.</source>
        <translation>Un texto que no está dibujado no se ejecuta en esta base de datos, a la que nada impediría escribir: vuelva al dibujo.</translation>
    </message>
    <message>
        <source>The text is in %1, and the database speaks %2: choose that above the text.</source>
        <translation>El texto está en %1, y la base de datos habla %2: elíjalo encima del texto.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Autosave</name>
    <message>
        <source>The changes cannot be kept safe in &quot;%1&quot; (%2); save the query yourself.</source>
        <translation>Los cambios no se pueden poner a salvo en «%1» (%2); guarde usted la consulta.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Banner</name>
    <message>
        <source>Close</source>
        <translation>Cerrar</translation>
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
        <translation>(fuera del calendario)</translation>
    </message>
</context>
<context>
    <name>zandor::designer::CellTally</name>
    <message>
        <source>Cells: %1</source>
        <translation>Celdas: %1</translation>
    </message>
    <message>
        <source>Empty: %1</source>
        <translation>Vacías: %1</translation>
    </message>
    <message>
        <source>Numbers: %1</source>
        <translation>Números: %1</translation>
    </message>
    <message>
        <source>Sum: %1</source>
        <translation>Suma: %1</translation>
    </message>
    <message>
        <source>Average: %1</source>
        <translation>Promedio: %1</translation>
    </message>
    <message>
        <source>Smallest: %1</source>
        <translation>Menor: %1</translation>
    </message>
    <message>
        <source>Largest: %1</source>
        <translation>Mayor: %1</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ChartData</name>
    <message>
        <source>Drawn are the first %1 of %2 rows.</source>
        <translation>Están dibujadas las primeras %1 de %2 filas.</translation>
    </message>
    <message>
        <source>Rows left out because they have no date: %1.</source>
        <translation>Filas omitidas por no tener fecha: %1.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ChartPanel</name>
    <message>
        <source>Cop&amp;y</source>
        <translation>Cop&amp;iar</translation>
    </message>
    <message>
        <source>Copy the chart as a picture</source>
        <translation>Copiar el gráfico como imagen</translation>
    </message>
    <message>
        <source>E&amp;xport…</source>
        <translation>E&amp;xportar…</translation>
    </message>
    <message>
        <source>Export the chart as PNG, SVG or PDF</source>
        <translation>Exportar el gráfico como PNG, SVG o PDF</translation>
    </message>
    <message>
        <source>&amp;Kind:</source>
        <translation>&amp;Tipo:</translation>
    </message>
    <message>
        <source>Columns</source>
        <translation>Columnas</translation>
    </message>
    <message>
        <source>Lines</source>
        <translation>Líneas</translation>
    </message>
    <message>
        <source>&amp;Axis:</source>
        <translation>E&amp;je:</translation>
    </message>
    <message>
        <source>The column whose values stand below</source>
        <translation>La columna cuyos valores están abajo</translation>
    </message>
    <message>
        <source>Val&amp;ues</source>
        <translation>Valo&amp;res</translation>
    </message>
    <message>
        <source>The columns that are drawn</source>
        <translation>Las columnas que se dibujan</translation>
    </message>
    <message>
        <source>There are no rows to draw.</source>
        <translation>No hay filas que dibujar.</translation>
    </message>
    <message>
        <source>A chart needs a column of numbers, and these rows have none.</source>
        <translation>Un gráfico necesita una columna de números, y estas filas no tienen ninguna.</translation>
    </message>
    <message>
        <source>A chart needs a column of texts or dates beside the numbers, and these rows have none.</source>
        <translation>Un gráfico necesita una columna de textos o fechas junto a los números, y estas filas no tienen ninguna.</translation>
    </message>
    <message>
        <source>Choose under &quot;Values&quot; what is to be drawn.</source>
        <translation>Elija en «Valores» lo que se ha de dibujar.</translation>
    </message>
    <message>
        <source>Export chart</source>
        <translation>Exportar el gráfico</translation>
    </message>
    <message>
        <source>chart.png</source>
        <translation>grafico.png</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ChartView</name>
    <message>
        <source>Chart</source>
        <translation>Gráfico</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ColumnPanel</name>
    <message>
        <source>A column, or an expression such as price * (1 - discount)</source>
        <translation>Una columna o una expresión como price * (1 - discount)</translation>
    </message>
    <message>
        <source>What becomes of the values when rows are put together</source>
        <translation>Qué se hace con los valores cuando se agrupan filas</translation>
    </message>
    <message>
        <source>What the column is called in the rows</source>
        <translation>Cómo se llama la columna en las filas</translation>
    </message>
    <message>
        <source>Not sorted</source>
        <translation>Sin ordenar</translation>
    </message>
    <message>
        <source>Ascending</source>
        <translation>Ascendente</translation>
    </message>
    <message>
        <source>Descending</source>
        <translation>Descendente</translation>
    </message>
    <message>
        <source>as it stands</source>
        <translation>según su posición</translation>
    </message>
    <message>
        <source>Which column sorts first: 1 before 2, and both before those that sort as they stand, from left to right</source>
        <translation>Qué columna ordena primero: 1 antes que 2, y ambas antes que las que ordenan según su posición, de izquierda a derecha</translation>
    </message>
    <message>
        <source>Sho&amp;wn in the rows</source>
        <translation>Se &amp;muestra en las filas</translation>
    </message>
    <message>
        <source>&amp;Total:</source>
        <translation>&amp;Total:</translation>
    </message>
    <message>
        <source>&amp;Name:</source>
        <translation>&amp;Nombre:</translation>
    </message>
    <message>
        <source>&amp;Sort:</source>
        <translation>Or&amp;den:</translation>
    </message>
    <message>
        <source>&amp;Priority:</source>
        <translation>&amp;Prioridad:</translation>
    </message>
    <message>
        <source>a column or an expression</source>
        <translation>una columna o una expresión</translation>
    </message>
    <message>
        <source>How the values look in the rows; sorting, criteria and exported files go by the values themselves</source>
        <translation>Cómo se ven los valores en las filas; la ordenación, los criterios y los archivos exportados siguen los propios valores</translation>
    </message>
    <message>
        <source>as many as there are</source>
        <translation>tantos como haya</translation>
    </message>
    <message>
        <source>So many digits stand behind the point</source>
        <translation>Número de cifras tras la coma</translation>
    </message>
    <message>
        <source>For&amp;mat:</source>
        <translation>&amp;Formato:</translation>
    </message>
    <message>
        <source>De&amp;cimals:</source>
        <translation>Decima&amp;les:</translation>
    </message>
    <message>
        <source>Fie&amp;ld:</source>
        <translation>Camp&amp;o:</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ConnectionBanner</name>
    <message>
        <source>&amp;Reconnect</source>
        <translation>&amp;Reconectar</translation>
    </message>
    <message>
        <source>The connection to %1 is lost. Your query is kept.</source>
        <translation>Se ha perdido la conexión con %1. Su consulta se conserva.</translation>
    </message>
    <message>
        <source>The file of %1 is no longer there. Your query is kept.</source>
        <translation>El archivo de %1 ya no existe. Su consulta se conserva.</translation>
    </message>
    <message>
        <source>%1 has been replaced by another file since it was opened.</source>
        <translation>Otro archivo ha sustituido a %1 desde que se abrió.</translation>
    </message>
    <message>
        <source>The tables of %1 have been changed by another program.</source>
        <translation>Otro programa ha cambiado las tablas de %1.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ConnectionDialog</name>
    <message>
        <source>Open database</source>
        <translation>Abrir base de datos</translation>
    </message>
    <message>
        <source>usual</source>
        <translation>habitual</translation>
    </message>
    <message>
        <source>Port</source>
        <translation>Puerto</translation>
    </message>
    <message>
        <source>SQLite file</source>
        <translation>Archivo SQLite</translation>
    </message>
    <message>
        <source>PostgreSQL</source>
        <translation>PostgreSQL</translation>
    </message>
    <message>
        <source>MySQL or MariaDB</source>
        <translation>MySQL o MariaDB</translation>
    </message>
    <message>
        <source>ODBC</source>
        <translation>ODBC</translation>
    </message>
    <message>
        <source>%1 (install the package %2)</source>
        <translation>%1 (instale el paquete %2)</translation>
    </message>
    <message>
        <source>&amp;Browse…</source>
        <translation>E&amp;xaminar…</translation>
    </message>
    <message>
        <source>P&amp;ort:</source>
        <translation>Puert&amp;o:</translation>
    </message>
    <message>
        <source>&amp;Kind:</source>
        <translation>&amp;Tipo:</translation>
    </message>
    <message>
        <source>&amp;File:</source>
        <translation>&amp;Archivo:</translation>
    </message>
    <message>
        <source>&amp;Host:</source>
        <translation>&amp;Servidor:</translation>
    </message>
    <message>
        <source>Data &amp;source:</source>
        <translation>&amp;Origen de datos:</translation>
    </message>
    <message>
        <source>&amp;Database:</source>
        <translation>&amp;Base de datos:</translation>
    </message>
    <message>
        <source>&amp;User:</source>
        <translation>&amp;Usuario:</translation>
    </message>
    <message>
        <source>&amp;Password:</source>
        <translation>&amp;Contraseña:</translation>
    </message>
    <message>
        <source>&amp;Address:</source>
        <translation>&amp;Dirección:</translation>
    </message>
    <message>
        <source>SQLite databases (*.sqlite *.sqlite3 *.db *.db3);;All files (*)</source>
        <translation>Bases de datos SQLite (*.sqlite *.sqlite3 *.db *.db3);;Todos los archivos (*)</translation>
    </message>
</context>
<context>
    <name>zandor::designer::DatabaseCommands</name>
    <message>
        <source>Open SQLite &amp;file…</source>
        <translation>Abrir &amp;archivo SQLite…</translation>
    </message>
    <message>
        <source>&amp;Connect to a server…</source>
        <translation>&amp;Conectar con un servidor…</translation>
    </message>
    <message>
        <source>Open database</source>
        <translation>Abrir base de datos</translation>
    </message>
    <message>
        <source>The database was not opened.</source>
        <translation>No se abrió la base de datos.</translation>
    </message>
    <message>
        <source>Open SQLite file</source>
        <translation>Abrir archivo SQLite</translation>
    </message>
    <message>
        <source>SQLite databases (*.sqlite *.sqlite3 *.db *.db3);;All files (*)</source>
        <translation>Bases de datos SQLite (*.sqlite *.sqlite3 *.db *.db3);;Todos los archivos (*)</translation>
    </message>
    <message>
        <source>Reconnect</source>
        <translation>Reconectar</translation>
    </message>
    <message>
        <source>The query is open, but not its database. %1</source>
        <translation>La consulta está abierta, pero no su base de datos. %1</translation>
    </message>
    <message>
        <source>&amp;Choose database…</source>
        <translation>&amp;Elegir base de datos…</translation>
    </message>
    <message>
        <source>Reco&amp;nnect</source>
        <translation>Reco&amp;nectar</translation>
    </message>
    <message>
        <source>&amp;Try again</source>
        <translation>&amp;Intentar de nuevo</translation>
    </message>
</context>
<context>
    <name>zandor::designer::DesignerWindow</name>
    <message>
        <source>Tables</source>
        <translation>Tablas</translation>
    </message>
    <message>
        <source>SQL</source>
        <translation>SQL</translation>
    </message>
    <message>
        <source>Rows</source>
        <translation>Filas</translation>
    </message>
    <message>
        <source>Events</source>
        <translation>Eventos</translation>
    </message>
    <message>
        <source>&amp;File</source>
        <translation>&amp;Archivo</translation>
    </message>
    <message>
        <source>&amp;Quit</source>
        <translation>&amp;Salir</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>&amp;Editar</translation>
    </message>
    <message>
        <source>Copy &amp;SQL</source>
        <translation>Copiar &amp;SQL</translation>
    </message>
    <message>
        <source>&amp;Options…</source>
        <translation>&amp;Opciones…</translation>
    </message>
    <message>
        <source>&amp;Database</source>
        <translation>&amp;Base de datos</translation>
    </message>
    <message>
        <source>&amp;Query</source>
        <translation>&amp;Consulta</translation>
    </message>
    <message>
        <source>&amp;Arrange tables</source>
        <translation>&amp;Organizar las tablas</translation>
    </message>
    <message>
        <source>Re&amp;name table…</source>
        <translation>Cambiar el &amp;nombre de la tabla…</translation>
    </message>
    <message>
        <source>&amp;View</source>
        <translation>&amp;Ver</translation>
    </message>
    <message>
        <source>&amp;Help</source>
        <translation>Ay&amp;uda</translation>
    </message>
    <message>
        <source>&amp;About</source>
        <translation>Acerca &amp;de</translation>
    </message>
    <message>
        <source>Add tables</source>
        <translation>Añadir tablas</translation>
    </message>
    <message>
        <source>Output columns</source>
        <translation>Columnas de salida</translation>
    </message>
    <message>
        <source>The grid shows %1 output columns and is full. Delete one before you add another; it would take the place of the last.</source>
        <translation>La cuadrícula muestra %1 columnas de salida y está llena. Elimine una antes de añadir otra; ocuparía el lugar de la última.</translation>
    </message>
    <message>
        <source>About Zandor Designer</source>
        <translation>Acerca de Zandor Designer</translation>
    </message>
    <message>
        <source>Zandor Designer %1

Draw a query, read its SQL, run it. The database is only read.</source>
        <translation>Zandor Designer %1

Dibuje una consulta, lea su SQL, ejecútela. La base de datos solo se lee.</translation>
    </message>
    <message>
        <source>&amp;New query</source>
        <translation>&amp;Nueva consulta</translation>
    </message>
    <message>
        <source>&amp;Open query…</source>
        <translation>&amp;Abrir consulta…</translation>
    </message>
    <message>
        <source>&amp;Save</source>
        <translation>&amp;Guardar</translation>
    </message>
    <message>
        <source>Save &amp;as…</source>
        <translation>Guardar &amp;como…</translation>
    </message>
    <message>
        <source>Tables: %1   Joins: %2</source>
        <translation>Tablas: %1   Combinaciones: %2</translation>
    </message>
    <message>
        <source>&amp;Dark colours</source>
        <translation>Colores &amp;oscuros</translation>
    </message>
    <message>
        <source>&amp;Find table</source>
        <translation>&amp;Buscar tabla</translation>
    </message>
    <message>
        <source>&amp;Tables</source>
        <translation>&amp;Tablas</translation>
    </message>
    <message>
        <source>&amp;SQL</source>
        <translation>&amp;SQL</translation>
    </message>
    <message>
        <source>&amp;Rows</source>
        <translation>&amp;Filas</translation>
    </message>
    <message>
        <source>&amp;Events</source>
        <translation>&amp;Eventos</translation>
    </message>
    <message>
        <source>&amp;Go to</source>
        <translation>&amp;Ir a</translation>
    </message>
    <message>
        <source>&amp;Drawing</source>
        <translation>&amp;Dibujo</translation>
    </message>
    <message>
        <source>&amp;Criteria</source>
        <translation>&amp;Criterios</translation>
    </message>
    <message>
        <source>&amp;Keys</source>
        <translation>&amp;Teclado</translation>
    </message>
    <message>
        <source>&amp;Try again</source>
        <translation>&amp;Intentar de nuevo</translation>
    </message>
    <message>
        <source>Saved as %1.</source>
        <translation>Guardado como %1.</translation>
    </message>
    <message>
        <source>&amp;Chart</source>
        <translation>&amp;Gráfico</translation>
    </message>
    <message>
        <source>Column</source>
        <translation>Columna</translation>
    </message>
    <message>
        <source>Query</source>
        <translation>Consulta</translation>
    </message>
    <message>
        <source>C&amp;olumn</source>
        <translation>Co&amp;lumna</translation>
    </message>
    <message>
        <source>Total of the output column that the grid is in (Ctrl+T)</source>
        <translation>Total de la columna de salida en la que está la cuadrícula (Ctrl+T)</translation>
    </message>
    <message>
        <source>Total</source>
        <translation>Total</translation>
    </message>
    <message>
        <source>Add saved query</source>
        <translation>Añadir consulta guardada</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Document</name>
    <message>
        <source>&amp;Undo</source>
        <translation>&amp;Deshacer</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>&amp;Rehacer</translation>
    </message>
</context>
<context>
    <name>zandor::designer::EventPanel</name>
    <message>
        <source>Time</source>
        <translation>Hora</translation>
    </message>
    <message>
        <source>No.</source>
        <translation>N.º</translation>
    </message>
    <message>
        <source>Event</source>
        <translation>Evento</translation>
    </message>
    <message>
        <source>Arguments</source>
        <translation>Argumentos</translation>
    </message>
    <message>
        <source>Events of the control</source>
        <translation>Eventos del control</translation>
    </message>
    <message>
        <source>Clear</source>
        <translation>Vaciar</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Copiar</translation>
    </message>
    <message>
        <source>Copy the selected events, or all of them</source>
        <translation>Copiar los eventos seleccionados, o todos</translation>
    </message>
    <message>
        <source>DeletedTable: %1</source>
        <translation>DeletedTable: %1</translation>
    </message>
    <message>
        <source>%1 (number %2)</source>
        <translation>%1 (número %2)</translation>
    </message>
    <message>
        <source>wParam %1: the menu opens</source>
        <translation>wParam %1: se abre el menú</translation>
    </message>
    <message>
        <source>wParam %1: the menu is closed</source>
        <translation>wParam %1: el menú está cerrado</translation>
    </message>
</context>
<context>
    <name>zandor::designer::EventWords</name>
    <message>
        <source>(gone)</source>
        <translation>(eliminado)</translation>
    </message>
</context>
<context>
    <name>zandor::designer::FileDialogs</name>
    <message>
        <source>Zandor queries (*.json)</source>
        <translation>Consultas de Zandor (*.json)</translation>
    </message>
    <message>
        <source>All files (*)</source>
        <translation>Todos los archivos (*)</translation>
    </message>
    <message>
        <source>Open query</source>
        <translation>Abrir consulta</translation>
    </message>
    <message>
        <source>Save query</source>
        <translation>Guardar consulta</translation>
    </message>
    <message>
        <source>query.json</source>
        <translation>consulta.json</translation>
    </message>
    <message>
        <source>Save the changes to &quot;%1&quot;?</source>
        <translation>¿Guardar los cambios de «%1»?</translation>
    </message>
    <message>
        <source>Changes that are not saved are lost.</source>
        <translation>Los cambios que no se guarden se perderán.</translation>
    </message>
    <message>
        <source>To save your query overwrites these changes.</source>
        <translation>Si guarda su consulta, se sobrescriben esos cambios.</translation>
    </message>
    <message>
        <source>&amp;Overwrite them</source>
        <translation>&amp;Sobrescribirlos</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; is no longer there; save the query to have one.</source>
        <translation>El archivo «%1» ya no existe; guarde la consulta para volver a tenerlo.</translation>
    </message>
    <message>
        <source>To load it gives up your own changes.</source>
        <translation>Si carga el archivo, se pierden sus propios cambios.</translation>
    </message>
    <message>
        <source>You have not changed it since.</source>
        <translation>Usted no lo ha cambiado desde entonces.</translation>
    </message>
    <message>
        <source>&amp;Keep mine</source>
        <translation>Conservar lo &amp;mío</translation>
    </message>
    <message>
        <source>&amp;Decide later</source>
        <translation>&amp;Decidir más tarde</translation>
    </message>
    <message>
        <source>Changed file</source>
        <translation>Archivo cambiado</translation>
    </message>
    <message>
        <source>Another program has changed &quot;%1&quot; since you opened it.</source>
        <translation>Otro programa ha cambiado «%1» desde que usted lo abrió.</translation>
    </message>
    <message>
        <source>&amp;Load the file</source>
        <translation>Cargar el &amp;archivo</translation>
    </message>
    <message>
        <source>Save &amp;as…</source>
        <translation>Guardar &amp;como…</translation>
    </message>
</context>
<context>
    <name>zandor::designer::FindBar</name>
    <message>
        <source>Find in the statement</source>
        <translation>Buscar en la instrucción</translation>
    </message>
    <message>
        <source>Previous (Shift+Enter)</source>
        <translation>Anterior (Mayús+Intro)</translation>
    </message>
    <message>
        <source>Next (Enter)</source>
        <translation>Siguiente (Intro)</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Cerrar</translation>
    </message>
</context>
<context>
    <name>zandor::designer::FlagsPage</name>
    <message>
        <source>Join types offered</source>
        <translation>Tipos de combinación ofrecidos</translation>
    </message>
    <message>
        <source>Operators offered</source>
        <translation>Operadores ofrecidos</translation>
    </message>
    <message>
        <source>The join dialog counts what it offers: with one left out, each behind it counts as the one before. Leave out only from the end.</source>
        <translation>La ventana de combinación cuenta lo que ofrece: si falta una entrada, cada una de las siguientes vale por la anterior. Quítelas solo del final.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Format</name>
    <message>
        <source>As it is</source>
        <translation>Tal cual</translation>
    </message>
    <message>
        <source>Whole number</source>
        <translation>Número entero</translation>
    </message>
    <message>
        <source>Decimals</source>
        <translation>Decimales</translation>
    </message>
    <message>
        <source>Thousands</source>
        <translation>Millares</translation>
    </message>
    <message>
        <source>Percent</source>
        <translation>Porcentaje</translation>
    </message>
    <message>
        <source>Short date</source>
        <translation>Fecha corta</translation>
    </message>
    <message>
        <source>Long date</source>
        <translation>Fecha larga</translation>
    </message>
    <message>
        <source>Date and time</source>
        <translation>Fecha y hora</translation>
    </message>
    <message>
        <source>ISO date</source>
        <translation>Fecha ISO</translation>
    </message>
    <message>
        <source>Year and month</source>
        <translation>Año y mes</translation>
    </message>
    <message>
        <source>Weekday</source>
        <translation>Día de la semana</translation>
    </message>
    <message>
        <source>Time</source>
        <translation>Hora</translation>
    </message>
</context>
<context>
    <name>zandor::designer::GridHint</name>
    <message>
        <source>Double-click a column of a table, or drag it here, to choose what comes out. Until then all columns do.</source>
        <translation>Haga doble clic en una columna de una tabla, o arrástrela aquí, para elegir qué sale. Hasta entonces salen todas las columnas.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::HelpWindow</name>
    <message>
        <source>Help</source>
        <translation>Ayuda</translation>
    </message>
    <message>
        <source>&amp;Criteria</source>
        <translation>&amp;Criterios</translation>
    </message>
    <message>
        <source>&amp;Keys</source>
        <translation>&amp;Teclado</translation>
    </message>
    <message>
        <source>Find on this page</source>
        <translation>Buscar en esta página</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Invitation</name>
    <message>
        <source>Drag a table here from the list of tables, or double-click it there.
Then drag its columns into the grid below.</source>
        <translation>Arrastre aquí una tabla desde la lista de tablas, o haga doble clic en ella en la lista.
Después arrastre sus columnas a la cuadrícula de abajo.</translation>
    </message>
    <message>
        <source>Open a database to begin: see the menu &quot;Database&quot;.</source>
        <translation>Abra una base de datos para empezar: vea el menú «Base de datos».</translation>
    </message>
</context>
<context>
    <name>zandor::designer::JoinCommands</name>
    <message>
        <source>Only matching rows of %1</source>
        <translation>Solo las filas coincidentes de %1</translation>
    </message>
    <message>
        <source>All rows of %1</source>
        <translation>Todas las filas de %1</translation>
    </message>
</context>
<context>
    <name>zandor::designer::MenuQuestions</name>
    <message>
        <source>C&amp;olumn…</source>
        <translation>C&amp;olumna…</translation>
    </message>
</context>
<context>
    <name>zandor::designer::MissingTables</name>
    <message>
        <source>There is no table &quot;%1&quot; in %2.</source>
        <translation>No hay ninguna tabla «%1» en %2.</translation>
    </message>
    <message>
        <source>There is no file &quot;%1&quot; any more; the query is as it was read last.</source>
        <translation>El archivo «%1» ya no existe; la consulta está como se leyó por última vez.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::OneQuery</name>
    <message>
        <source>There is no statement: write one, or go back to the drawing.</source>
        <translation>No hay ninguna instrucción: escriba una, o vuelva al dibujo.</translation>
    </message>
    <message>
        <source>what begins here has no end: close it.</source>
        <translation>lo que empieza aquí no tiene fin: ciérrelo.</translation>
    </message>
    <message>
        <source>a NUL stands here: delete it.</source>
        <translation>aquí hay un NUL: bórrelo.</translation>
    </message>
    <message>
        <source>a second statement begins here: one is run at a time.</source>
        <translation>aquí empieza una segunda instrucción: se ejecuta una cada vez.</translation>
    </message>
    <message>
        <source>only a query is run: it begins with SELECT, WITH, VALUES or TABLE.</source>
        <translation>solo se ejecuta una consulta: empieza con SELECT, WITH, VALUES o TABLE.</translation>
    </message>
    <message>
        <source>INTO writes, and the database is only read: leave it out.</source>
        <translation>INTO escribe, y la base de datos solo se lee: omítalo.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Opening</name>
    <message>
        <source>Connecting to %1…</source>
        <translation>Conectando con %1…</translation>
    </message>
</context>
<context>
    <name>zandor::designer::OptionsDialog</name>
    <message>
        <source>The entries of the context menu that are shown:</source>
        <translation>Entradas que muestra el menú contextual:</translation>
    </message>
    <message>
        <source>What can be done with joins:</source>
        <translation>Qué se puede hacer con las combinaciones:</translation>
    </message>
    <message>
        <source>For developers: each box must be answered before the control goes on, and there may be hundreds when a large query is shown.</source>
        <translation>Para desarrolladores: hay que responder a cada mensaje antes de que el control siga, y con una consulta grande puede haber cientos.</translation>
    </message>
    <message>
        <source>Options</source>
        <translation>Opciones</translation>
    </message>
    <message>
        <source>Texts</source>
        <translation>Textos</translation>
    </message>
    <message>
        <source>Menu</source>
        <translation>Menú</translation>
    </message>
    <message>
        <source>Joins</source>
        <translation>Combinaciones</translation>
    </message>
    <message>
        <source>Debug</source>
        <translation>Depuración</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ParameterDialog</name>
    <message>
        <source>Values for the query</source>
        <translation>Valores para la consulta</translation>
    </message>
    <message>
        <source>&amp;Run</source>
        <translation>&amp;Ejecutar</translation>
    </message>
    <message>
        <source>%1 has to be %2.</source>
        <translation>%1 debe ser %2.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::PasswordPrompt</name>
    <message>
        <source>Password</source>
        <translation>Contraseña</translation>
    </message>
    <message>
        <source>The database %1 on %2 asks for a password.</source>
        <translation>La base de datos %1 en %2 pide una contraseña.</translation>
    </message>
    <message>
        <source>The database %1 on %2 asks for the password of %3.</source>
        <translation>La base de datos %1 en %2 pide la contraseña de %3.</translation>
    </message>
    <message>
        <source>&amp;Password:</source>
        <translation>&amp;Contraseña:</translation>
    </message>
</context>
<context>
    <name>zandor::designer::QueryFile</name>
    <message>
        <source>Untitled</source>
        <translation>Sin título</translation>
    </message>
</context>
<context>
    <name>zandor::designer::QueryPanel</name>
    <message>
        <source>all</source>
        <translation>todas</translation>
    </message>
    <message>
        <source>The query itself gives no more rows than these, in the order in which it is sorted</source>
        <translation>La consulta misma no da más filas que estas, en el orden en que se ordena</translation>
    </message>
    <message>
        <source>What the query is for. The file keeps it.</source>
        <translation>Para qué sirve la consulta. El archivo lo guarda.</translation>
    </message>
    <message>
        <source>Fi&amp;rst rows:</source>
        <translation>P&amp;rimeras filas:</translation>
    </message>
    <message>
        <source>Equal rows onl&amp;y once</source>
        <translation>Filas i&amp;guales una sola vez</translation>
    </message>
    <message>
        <source>Descripti&amp;on:</source>
        <translation>De&amp;scripción:</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Question</name>
    <message>
        <source>a pattern: * for any characters, ? for one</source>
        <translation>un patrón: * para cualquier texto, ? para un carácter</translation>
    </message>
    <message>
        <source>a text</source>
        <translation>un texto</translation>
    </message>
    <message>
        <source>a number</source>
        <translation>un número</translation>
    </message>
    <message>
        <source>a date such as 2024-12-31</source>
        <translation>una fecha como 2024-12-31</translation>
    </message>
    <message>
        <source>a time such as 23:59</source>
        <translation>una hora como 23:59</translation>
    </message>
    <message>
        <source>a date and time such as 2024-12-31 23:59</source>
        <translation>una fecha con hora como 2024-12-31 23:59</translation>
    </message>
    <message>
        <source>true or false</source>
        <translation>true o false</translation>
    </message>
    <message>
        <source>a value</source>
        <translation>un valor</translation>
    </message>
</context>
<context>
    <name>zandor::designer::RecentMenu</name>
    <message>
        <source>Open &amp;recent</source>
        <translation>Abrir &amp;recientes</translation>
    </message>
    <message>
        <source>&amp;Clear list</source>
        <translation>&amp;Vaciar la lista</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Recovery</name>
    <message>
        <source>A query was drawn and never saved.</source>
        <translation>Se dibujó una consulta y nunca se guardó.</translation>
    </message>
    <message>
        <source>Recover query</source>
        <translation>Recuperar consulta</translation>
    </message>
    <message>
        <source>&quot;%1&quot; has changes that were not saved.</source>
        <translation>«%1» tiene cambios que no se guardaron.</translation>
    </message>
    <message>
        <source>The designer ended unexpectedly. The changes up to %1 can be recovered.</source>
        <translation>El programa terminó de forma inesperada. Se pueden recuperar los cambios hasta %1.</translation>
    </message>
    <message>
        <source>&amp;Recover</source>
        <translation>&amp;Recuperar</translation>
    </message>
    <message>
        <source>&amp;Ask later</source>
        <translation>&amp;Preguntar más tarde</translation>
    </message>
    <message>
        <source>The designer ended unexpectedly, and the changes that were kept safe cannot be read. They stay in the file &quot;%1&quot;.</source>
        <translation>El programa terminó de forma inesperada y no se pueden leer los cambios puestos a salvo. Siguen en el archivo «%1».</translation>
    </message>
</context>
<context>
    <name>zandor::designer::RenameDialog</name>
    <message>
        <source>Rename table</source>
        <translation>Cambiar el nombre de la tabla</translation>
    </message>
    <message>
        <source>&amp;Rename</source>
        <translation>&amp;Cambiar</translation>
    </message>
    <message>
        <source>The name is the table&apos;s in this query only; the database stays as it is.</source>
        <translation>El nombre vale solo en esta consulta; la base de datos queda como está.</translation>
    </message>
    <message>
        <source>&amp;Table:</source>
        <translation>&amp;Tabla:</translation>
    </message>
    <message>
        <source>&amp;New name:</source>
        <translation>&amp;Nombre nuevo:</translation>
    </message>
    <message>
        <source>A table needs a name; type one.</source>
        <translation>Una tabla necesita un nombre; escriba uno.</translation>
    </message>
    <message>
        <source>Another table of this query is called &quot;%1&quot;; choose another name.</source>
        <translation>Otra tabla de esta consulta se llama «%1»; elija otro nombre.</translation>
    </message>
    <message>
        <source>Rename table %1</source>
        <translation>Cambiar el nombre de la tabla %1</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ResultModel</name>
    <message>
        <source>(blob, %1 bytes)</source>
        <translation>(blob, %1 bytes)</translation>
    </message>
    <message>
        <source>%1
Click to sort the rows that are shown; the query stays as it is.</source>
        <translation>%1
Haga clic para ordenar las filas que se muestran; la consulta queda como está.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ResultTable</name>
    <message>
        <source>&amp;Copy</source>
        <translation>&amp;Copiar</translation>
    </message>
    <message>
        <source>Copy &amp;with all columns</source>
        <translation>Copiar con &amp;todas las columnas</translation>
    </message>
    <message>
        <source>Select c&amp;olumn</source>
        <translation>&amp;Seleccionar la columna</translation>
    </message>
    <message>
        <source>Sort &amp;ascending</source>
        <translation>Orden &amp;ascendente</translation>
    </message>
    <message>
        <source>Sort &amp;descending</source>
        <translation>Orden &amp;descendente</translation>
    </message>
    <message>
        <source>As the &amp;query gives them</source>
        <translation>C&amp;omo las da la consulta</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ResultsPanel</name>
    <message>
        <source>These are too many cells to copy; export the rows instead.</source>
        <translation>Son demasiadas celdas para copiarlas; exporte las filas.</translation>
    </message>
    <message>
        <source>No database is open: open one first.</source>
        <translation>No hay ninguna base de datos abierta: abra primero una.</translation>
    </message>
    <message>
        <source>The query cannot be run yet:</source>
        <translation>La consulta aún no se puede ejecutar:</translation>
    </message>
    <message>
        <source>Cancelling…</source>
        <translation>Cancelando…</translation>
    </message>
    <message>
        <source>Exporting…</source>
        <translation>Exportando…</translation>
    </message>
    <message>
        <source>Running…</source>
        <translation>Ejecutando…</translation>
    </message>
    <message>
        <source>%1  Rows so far: %2 · %3</source>
        <translation>%1  Filas hasta ahora: %2 · %3</translation>
    </message>
    <message>
        <source>The server does not answer.</source>
        <translation>El servidor no responde.</translation>
    </message>
    <message>
        <source>Exported to %1. Rows: %2 · %3</source>
        <translation>Exportado a %1. Filas: %2 · %3</translation>
    </message>
    <message>
        <source>Rows: %1 · %2</source>
        <translation>Filas: %1 · %2</translation>
    </message>
    <message>
        <source>First %1 rows; there are more · %2</source>
        <translation>Primeras %1 filas; hay más · %2</translation>
    </message>
    <message>
        <source>Cancelled; nothing was exported · %1</source>
        <translation>Cancelado; no se exportó nada · %1</translation>
    </message>
    <message>
        <source>Cancelled. Rows that came: %1 · %2</source>
        <translation>Cancelado. Filas recibidas: %1 · %2</translation>
    </message>
    <message>
        <source>The database did not run the statement:
%1</source>
        <translation>La base de datos no ejecutó la instrucción:
%1</translation>
    </message>
    <message>
        <source>The connection to the database has broken down:
%1</source>
        <translation>Se ha roto la conexión con la base de datos:
%1</translation>
    </message>
    <message>
        <source>Export all rows</source>
        <translation>Exportar todas las filas</translation>
    </message>
    <message>
        <source>Comma-separated values (*.csv)</source>
        <translation>Valores separados por comas (*.csv)</translation>
    </message>
    <message>
        <source>Run the query to see its rows here.</source>
        <translation>Ejecute la consulta para ver aquí sus filas.</translation>
    </message>
    <message>
        <source>%1 s</source>
        <translation>%1 s</translation>
    </message>
    <message>
        <source>&amp;Run</source>
        <translation>&amp;Ejecutar</translation>
    </message>
    <message>
        <source>Run the query and show its rows (F5)</source>
        <translation>Ejecutar la consulta y mostrar sus filas (F5)</translation>
    </message>
    <message>
        <source>&amp;Cancel</source>
        <translation>&amp;Cancelar</translation>
    </message>
    <message>
        <source>Run the query and write all its rows into a CSV file</source>
        <translation>Ejecutar la consulta y escribir todas sus filas en un archivo CSV</translation>
    </message>
    <message>
        <source>So many rows are shown at most</source>
        <translation>Cuántas filas se muestran como máximo</translation>
    </message>
    <message>
        <source>%1 rows</source>
        <translation>%1 filas</translation>
    </message>
    <message>
        <source>All rows</source>
        <translation>Todas las filas</translation>
    </message>
    <message>
        <source>Run the query again without the limit</source>
        <translation>Ejecutar de nuevo la consulta sin el límite</translation>
    </message>
    <message>
        <source>&amp;Export rows…</source>
        <translation>E&amp;xportar las filas…</translation>
    </message>
    <message>
        <source>Export…</source>
        <translation>Exportar…</translation>
    </message>
    <message>
        <source>rows.csv</source>
        <translation>filas.csv</translation>
    </message>
    <message>
        <source>the rows can be sorted when all of them have come</source>
        <translation>las filas se pueden ordenar cuando hayan llegado todas</translation>
    </message>
    <message>
        <source>these are too many rows to sort here; use the row &quot;Sort:&quot; of the drawing</source>
        <translation>son demasiadas filas para ordenarlas aquí; use la fila «Orden:» del dibujo</translation>
    </message>
    <message>
        <source>Sorting the rows…</source>
        <translation>Ordenando las filas…</translation>
    </message>
    <message>
        <source>these rows are sorted by %1 here, the query is not</source>
        <translation>aquí estas filas están ordenadas por %1, la consulta no</translation>
    </message>
    <message>
        <source>these rows are sorted by %1 descending here, the query is not</source>
        <translation>aquí estas filas están ordenadas por %1 en orden descendente, la consulta no</translation>
    </message>
    <message>
        <source>the drawing has changed since</source>
        <translation>el dibujo ha cambiado desde entonces</translation>
    </message>
    <message>
        <source>Stop what is running, on the database too (Esc)</source>
        <translation>Detener lo que se está ejecutando, también en la base de datos (Esc)</translation>
    </message>
    <message>
        <source>The query finds no rows.</source>
        <translation>La consulta no encuentra ninguna fila.</translation>
    </message>
    <message>
        <source>A text has to be the same as a whole, and on most databases in capital and small letters: Like *berlin* finds Berlin wherever it stands.</source>
        <translation>Un texto tiene que coincidir entero y, en la mayoría de las bases de datos, también en mayúsculas y minúsculas: Like *berlin* encuentra Berlin esté donde esté.</translation>
    </message>
    <message>
        <source>Copy s&amp;ummary</source>
        <translation>Copiar el res&amp;umen</translation>
    </message>
    <message>
        <source>The chart is drawn when the rows have come.</source>
        <translation>El gráfico se dibuja cuando han llegado las filas.</translation>
    </message>
    <message>
        <source>C&amp;hart</source>
        <translation>&amp;Gráfico</translation>
    </message>
    <message>
        <source>Show the rows as a chart (Ctrl+5), and as a table again (Ctrl+4)</source>
        <translation>Mostrar las filas como gráfico (Ctrl+5) y de nuevo como tabla (Ctrl+4)</translation>
    </message>
    <message>
        <source>The text that was typed cannot be run:
%1</source>
        <translation>El texto escrito no se puede ejecutar:
%1</translation>
    </message>
    <message>
        <source>of the text that was typed, not of the drawing</source>
        <translation>del texto escrito, no del dibujo</translation>
    </message>
    <message>
        <source>the text has changed since</source>
        <translation>el texto ha cambiado desde entonces</translation>
    </message>
</context>
<context>
    <name>zandor::designer::SavedQueryCommands</name>
    <message>
        <source>Add saved &amp;query…</source>
        <translation>&amp;Añadir consulta guardada…</translation>
    </message>
    <message>
        <source>Read saved queries a&amp;gain</source>
        <translation>&amp;Leer de nuevo las consultas guardadas</translation>
    </message>
    <message>
        <source>Add saved query</source>
        <translation>Añadir consulta guardada</translation>
    </message>
    <message>
        <source>The saved queries are as they are here.</source>
        <translation>Las consultas guardadas están tal como aquí.</translation>
    </message>
    <message>
        <source>Read again: %1.</source>
        <translation>Leídas de nuevo: %1.</translation>
    </message>
    <message>
        <source>Read saved queries again</source>
        <translation>Leer de nuevo las consultas guardadas</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ShowCommands</name>
    <message>
        <source>&amp;Export drawing…</source>
        <translation>&amp;Exportar el dibujo…</translation>
    </message>
    <message>
        <source>&amp;Print…</source>
        <translation>Im&amp;primir…</translation>
    </message>
    <message>
        <source>Copy as p&amp;icture</source>
        <translation>Copiar como &amp;imagen</translation>
    </message>
    <message>
        <source>Export drawing</source>
        <translation>Exportar el dibujo</translation>
    </message>
    <message>
        <source>Query</source>
        <translation>Consulta</translation>
    </message>
    <message>
        <source>Print</source>
        <translation>Imprimir</translation>
    </message>
    <message>
        <source>Pictures &amp;with all columns</source>
        <translation>Imágenes con &amp;todas las columnas</translation>
    </message>
    <message>
        <source>drawing.png</source>
        <translation>dibujo.png</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Spool</name>
    <message>
        <source>No file for the rows can be made in &quot;%1&quot; (%2): set TMPDIR to a folder that you may write to.</source>
        <translation>No se puede crear un archivo para las filas en «%1» (%2): ponga en TMPDIR una carpeta en la que pueda escribir.</translation>
    </message>
    <message>
        <source>The rows would fill the disk with the folder &quot;%1&quot;: make room there, or ask for fewer rows.</source>
        <translation>Las filas llenarían el disco de la carpeta «%1»: haga sitio allí, o pida menos filas.</translation>
    </message>
    <message>
        <source>The rows cannot be written</source>
        <translation>No se pueden escribir las filas</translation>
    </message>
</context>
<context>
    <name>zandor::designer::SqlCommands</name>
    <message>
        <source>SQL statements (*.sql)</source>
        <translation>Instrucciones SQL (*.sql)</translation>
    </message>
    <message>
        <source>All files (*)</source>
        <translation>Todos los archivos (*)</translation>
    </message>
    <message>
        <source>Open SQ&amp;L…</source>
        <translation>Abrir SQ&amp;L…</translation>
    </message>
    <message>
        <source>Paste S&amp;QL</source>
        <translation>Pegar S&amp;QL</translation>
    </message>
    <message>
        <source>Sa&amp;ve SQL as…</source>
        <translation>Guardar S&amp;QL como…</translation>
    </message>
    <message>
        <source>Open SQL</source>
        <translation>Abrir SQL</translation>
    </message>
    <message>
        <source>Paste SQL</source>
        <translation>Pegar SQL</translation>
    </message>
    <message>
        <source>The clipboard has no text; copy a SELECT statement first.</source>
        <translation>El portapapeles no tiene texto; copie antes una instrucción SELECT.</translation>
    </message>
    <message>
        <source>Save SQL</source>
        <translation>Guardar SQL</translation>
    </message>
    <message>
        <source>statement.sql</source>
        <translation>instruccion.sql</translation>
    </message>
</context>
<context>
    <name>zandor::designer::StatementPanel</name>
    <message>
        <source>The dialect of SQL that the statement is written in</source>
        <translation>El dialecto de SQL en que está escrita la instrucción</translation>
    </message>
    <message>
        <source>Dialect</source>
        <translation>Dialecto</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Copiar</translation>
    </message>
    <message>
        <source>Copy the statement to the clipboard</source>
        <translation>Copiar la instrucción al portapapeles</translation>
    </message>
    <message>
        <source>SQL statement</source>
        <translation>Instrucción SQL</translation>
    </message>
    <message>
        <source>Findings</source>
        <translation>Observaciones</translation>
    </message>
    <message>
        <source>Click a finding to see its place</source>
        <translation>Haga clic en una observación para ver el lugar</translation>
    </message>
    <message>
        <source>Add a table to begin: the statement appears here.</source>
        <translation>Añada una tabla para empezar: la instrucción aparece aquí.</translation>
    </message>
    <message>
        <source>%1 cannot say this query:</source>
        <translation>%1 no puede expresar esta consulta:</translation>
    </message>
    <message>
        <source>Error: %1</source>
        <translation>Error: %1</translation>
    </message>
    <message>
        <source>Warning: %1</source>
        <translation>Advertencia: %1</translation>
    </message>
    <message>
        <source>%1 (as the database)</source>
        <translation>%1 (como la base de datos)</translation>
    </message>
    <message>
        <source>Format</source>
        <translation>Dar formato</translation>
    </message>
    <message>
        <source>Write the statement as the drawing says it</source>
        <translation>Escribir la instrucción como la dice el dibujo</translation>
    </message>
    <message>
        <source>&amp;Back to the drawing</source>
        <translation>&amp;Volver al dibujo</translation>
    </message>
    <message>
        <source>The drawing&apos;s own statement takes the place of the text (Esc)</source>
        <translation>La instrucción del dibujo ocupa el lugar del texto (Esc)</translation>
    </message>
    <message>
        <source>Add a table to begin, or write a SELECT here: it becomes the drawing.</source>
        <translation>Añada una tabla para empezar, o escriba aquí un SELECT: se convierte en el dibujo.</translation>
    </message>
    <message>
        <source>%1 The drawing sleeps until this can be read; Run takes the text as it is.</source>
        <translation>%1 El dibujo queda en reposo hasta que esto se pueda leer; «Ejecutar» toma el texto tal como está.</translation>
    </message>
    <message>
        <source>This text is not drawn, and the drawing sleeps: open a database, and it is read.</source>
        <translation>Este texto no está dibujado, y el dibujo queda en reposo: abra una base de datos, y se leerá.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::StatementTyping</name>
    <message>
        <source>Change the SQL</source>
        <translation>Cambiar el SQL</translation>
    </message>
    <message>
        <source>Back to the drawing</source>
        <translation>Volver al dibujo</translation>
    </message>
</context>
<context>
    <name>zandor::designer::StepName</name>
    <message>
        <source>Change the query</source>
        <translation>Cambiar la consulta</translation>
    </message>
    <message>
        <source>Delete table %1</source>
        <translation>Eliminar la tabla %1</translation>
    </message>
    <message numerus="yes">
        <source>Delete %n table(s)</source>
        <translation>
            <numerusform>Eliminar %n tabla</numerusform>
            <numerusform>Eliminar %n tablas</numerusform>
        </translation>
    </message>
    <message>
        <source>Add table %1</source>
        <translation>Añadir la tabla %1</translation>
    </message>
    <message numerus="yes">
        <source>Add %n table(s)</source>
        <translation>
            <numerusform>Añadir %n tabla</numerusform>
            <numerusform>Añadir %n tablas</numerusform>
        </translation>
    </message>
    <message>
        <source>Rename table %1 to %2</source>
        <translation>Cambiar el nombre de la tabla %1 a %2</translation>
    </message>
    <message numerus="yes">
        <source>Resize %n table(s)</source>
        <translation>
            <numerusform>Cambiar el tamaño de %n tabla</numerusform>
            <numerusform>Cambiar el tamaño de %n tablas</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Move %n table(s)</source>
        <translation>
            <numerusform>Mover %n tabla</numerusform>
            <numerusform>Mover %n tablas</numerusform>
        </translation>
    </message>
    <message>
        <source>Resize table %1</source>
        <translation>Cambiar el tamaño de la tabla %1</translation>
    </message>
    <message>
        <source>Move table %1</source>
        <translation>Mover la tabla %1</translation>
    </message>
    <message>
        <source>Add join %1</source>
        <translation>Añadir la combinación %1</translation>
    </message>
    <message numerus="yes">
        <source>Add %n join(s)</source>
        <translation>
            <numerusform>Añadir %n combinación</numerusform>
            <numerusform>Añadir %n combinaciones</numerusform>
        </translation>
    </message>
    <message>
        <source>Delete join %1</source>
        <translation>Eliminar la combinación %1</translation>
    </message>
    <message numerus="yes">
        <source>Delete %n join(s)</source>
        <translation>
            <numerusform>Eliminar %n combinación</numerusform>
            <numerusform>Eliminar %n combinaciones</numerusform>
        </translation>
    </message>
    <message>
        <source>Change join %1</source>
        <translation>Cambiar la combinación %1</translation>
    </message>
    <message>
        <source>Change joins</source>
        <translation>Cambiar las combinaciones</translation>
    </message>
    <message numerus="yes">
        <source>Change %n column(s)</source>
        <translation>
            <numerusform>Cambiar %n columna</numerusform>
            <numerusform>Cambiar %n columnas</numerusform>
        </translation>
    </message>
    <message>
        <source>Add column %1</source>
        <translation>Añadir la columna %1</translation>
    </message>
    <message numerus="yes">
        <source>Add %n column(s)</source>
        <translation>
            <numerusform>Añadir %n columna</numerusform>
            <numerusform>Añadir %n columnas</numerusform>
        </translation>
    </message>
    <message>
        <source>Delete column %1</source>
        <translation>Eliminar la columna %1</translation>
    </message>
    <message numerus="yes">
        <source>Delete %n column(s)</source>
        <translation>
            <numerusform>Eliminar %n columna</numerusform>
            <numerusform>Eliminar %n columnas</numerusform>
        </translation>
    </message>
    <message>
        <source>Change columns</source>
        <translation>Cambiar las columnas</translation>
    </message>
    <message>
        <source>Change criterion of %1</source>
        <translation>Cambiar el criterio de %1</translation>
    </message>
    <message>
        <source>Rename column %1</source>
        <translation>Cambiar el nombre de la columna %1</translation>
    </message>
    <message>
        <source>Change sorting by %1</source>
        <translation>Cambiar el orden por %1</translation>
    </message>
    <message>
        <source>Show column %1</source>
        <translation>Mostrar la columna %1</translation>
    </message>
    <message>
        <source>Hide column %1</source>
        <translation>Ocultar la columna %1</translation>
    </message>
    <message>
        <source>Change column %1</source>
        <translation>Cambiar la columna %1</translation>
    </message>
    <message>
        <source>Move column %1</source>
        <translation>Mover la columna %1</translation>
    </message>
    <message numerus="yes">
        <source>Move %n column(s)</source>
        <translation>
            <numerusform>Mover %n columna</numerusform>
            <numerusform>Mover %n columnas</numerusform>
        </translation>
    </message>
    <message>
        <source>Resize column %1</source>
        <translation>Cambiar el ancho de la columna %1</translation>
    </message>
    <message>
        <source>Change total of %1</source>
        <translation>Cambiar el total de %1</translation>
    </message>
    <message>
        <source>Change field of %1</source>
        <translation>Cambiar el campo de %1</translation>
    </message>
    <message>
        <source>Describe the query</source>
        <translation>Describir la consulta</translation>
    </message>
    <message>
        <source>Change which rows come out</source>
        <translation>Cambiar qué filas salen</translation>
    </message>
    <message>
        <source>Change format of %1</source>
        <translation>Cambiar el formato de %1</translation>
    </message>
</context>
<context>
    <name>zandor::designer::SummaryLine</name>
    <message>
        <source>What the selected cells come to</source>
        <translation>Lo que suman las celdas seleccionadas</translation>
    </message>
    <message>
        <source>Cells: %1 · adding up, %2 %</source>
        <translation>Celdas: %1 · calculando, %2 %</translation>
    </message>
</context>
<context>
    <name>zandor::designer::TableAdding</name>
    <message>
        <source>Arrange tables</source>
        <translation>Organizar las tablas</translation>
    </message>
    <message>
        <source>The drawing takes %1 tables, and has them; delete one first.</source>
        <translation>El dibujo admite %1 tablas y ya las tiene; elimine primero una.</translation>
    </message>
    <message>
        <source>The drawing takes %1 tables and has %2; choose fewer.</source>
        <translation>El dibujo admite %1 tablas y tiene %2; elija menos.</translation>
    </message>
    <message>
        <source>Add table %1</source>
        <translation>Añadir la tabla %1</translation>
    </message>
    <message>
        <source>Add %1 tables</source>
        <translation>Añadir %1 tablas</translation>
    </message>
    <message>
        <source>Reading the tables…</source>
        <translation>Leyendo las tablas…</translation>
    </message>
    <message>
        <source>The drawing takes %1 joins, and with this there would be %2; delete tables or joins first.</source>
        <translation>El dibujo admite %1 combinaciones y así habría %2; elimine primero tablas o combinaciones.</translation>
    </message>
    <message>
        <source>%1 and %2 are joined by %3. Not joined by %4: draw those yourself if you need them.</source>
        <translation>%1 y %2 se combinan mediante %3. No se combinan mediante %4: dibuje usted esas combinaciones si las necesita.</translation>
    </message>
    <message>
        <source>Add query %1</source>
        <translation>Añadir la consulta %1</translation>
    </message>
</context>
<context>
    <name>zandor::designer::TableListModel</name>
    <message>
        <source>%1, view</source>
        <translation>%1, vista</translation>
    </message>
    <message>
        <source>%1, table</source>
        <translation>%1, tabla</translation>
    </message>
</context>
<context>
    <name>zandor::designer::TableTip</name>
    <message>
        <source>%1 (view)</source>
        <translation>%1 (vista)</translation>
    </message>
    <message>
        <source>and %1 more</source>
        <translation>y %1 más</translation>
    </message>
</context>
<context>
    <name>zandor::designer::TablesPanel</name>
    <message>
        <source>Filter tables</source>
        <translation>Filtrar tablas</translation>
    </message>
    <message>
        <source>Read the list of tables again</source>
        <translation>Volver a leer la lista de tablas</translation>
    </message>
    <message>
        <source>Tables</source>
        <translation>Tablas</translation>
    </message>
    <message>
        <source>Open a database to see its tables.</source>
        <translation>Abra una base de datos para ver sus tablas.</translation>
    </message>
    <message>
        <source>There are no tables in this database.</source>
        <translation>No hay tablas en esta base de datos.</translation>
    </message>
    <message>
        <source>No table has all of this in its name.</source>
        <translation>Ninguna tabla tiene todo esto en su nombre.</translation>
    </message>
    <message>
        <source>%1 of %2 tables</source>
        <translation>%1 de %2 tablas</translation>
    </message>
    <message>
        <source>1 table</source>
        <translation>1 tabla</translation>
    </message>
    <message>
        <source>%1 tables</source>
        <translation>%1 tablas</translation>
    </message>
    <message>
        <source>&amp;Add to drawing</source>
        <translation>&amp;Añadir al dibujo</translation>
    </message>
</context>
<context>
    <name>zandor::designer::TextsPage</name>
    <message>
        <source>Where it is used</source>
        <translation>Dónde se usa</translation>
    </message>
    <message>
        <source>Text</source>
        <translation>Texto</translation>
    </message>
    <message>
        <source>Texts of the control</source>
        <translation>Textos del control</translation>
    </message>
    <message>
        <source>Set of texts</source>
        <translation>Juego de textos</translation>
    </message>
    <message>
        <source>Texts that are left as they are follow the designer&apos;s language. Emptying one brings its text of that language back.</source>
        <translation>Los textos que se dejan como están siguen el idioma del programa. Al vaciar uno vuelve el texto de ese idioma.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Total</name>
    <message>
        <source>&amp;No total</source>
        <translation>&amp;Sin total</translation>
    </message>
    <message>
        <source>&amp;Group by it</source>
        <translation>&amp;Agrupar por ella</translation>
    </message>
    <message>
        <source>&amp;Count</source>
        <translation>&amp;Cuenta</translation>
    </message>
    <message>
        <source>Count &amp;different values</source>
        <translation>Cuenta de valores &amp;distintos</translation>
    </message>
    <message>
        <source>&amp;Sum</source>
        <translation>S&amp;uma</translation>
    </message>
    <message>
        <source>&amp;Average</source>
        <translation>&amp;Promedio</translation>
    </message>
    <message>
        <source>S&amp;mallest</source>
        <translation>M&amp;enor</translation>
    </message>
    <message>
        <source>&amp;Largest</source>
        <translation>Ma&amp;yor</translation>
    </message>
    <message>
        <source>C&amp;riteria only</source>
        <translation>Solo c&amp;riterios</translation>
    </message>
</context>
<context>
    <name>zandor::designer::TotalCommands</name>
    <message>
        <source>&amp;Total</source>
        <translation>&amp;Total</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Waiting</name>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
</context>
<context>
    <name>zandor::designer::shell</name>
    <message>
        <source>Password for %1: </source>
        <translation>Contraseña para %1: </translation>
    </message>
    <message>
        <source>The query asks for &quot;%1&quot;; give it with --set &quot;%1=VALUE&quot;.</source>
        <translation>La consulta pide «%1»; indíquelo con --set &quot;%1=VALOR&quot;.</translation>
    </message>
    <message>
        <source>The query asks for &quot;%1&quot;, which has to be %2; &quot;%3&quot; is not.</source>
        <translation>La consulta pide «%1», que debe ser %2; «%3» no lo es.</translation>
    </message>
    <message>
        <source>The query does not ask for &quot;%1&quot;; leave out its --set.</source>
        <translation>La consulta no pide «%1»; quite su --set.</translation>
    </message>
    <message>
        <source>Cancelled.</source>
        <translation>Cancelado.</translation>
    </message>
    <message>
        <source>The query names no database; give one with --database.</source>
        <translation>La consulta no nombra ninguna base de datos; indique una con --database.</translation>
    </message>
    <message>
        <source>There is no format &quot;%1&quot;; write --format csv or --format json.</source>
        <translation>No existe el formato «%1»; escriba --format csv o --format json.</translation>
    </message>
    <message>
        <source>--limit takes a number of rows; write --limit 100.</source>
        <translation>--limit espera un número de filas; escriba --limit 100.</translation>
    </message>
    <message>
        <source>&quot;%1&quot; sets nothing; write --set NAME=VALUE.</source>
        <translation>«%1» no fija nada; escriba --set NOMBRE=VALOR.</translation>
    </message>
    <message>
        <source>--%1 goes with --run only.</source>
        <translation>--%1 solo va con --run.</translation>
    </message>
    <message>
        <source>--dialect goes with --sql only.</source>
        <translation>--dialect solo va con --sql.</translation>
    </message>
    <message>
        <source>No query is named; write --%1 query.json.</source>
        <translation>No se nombra ninguna consulta; escriba --%1 consulta.json.</translation>
    </message>
    <message>
        <source>There is no dialect &quot;%1&quot;; known are sqlite, postgresql, mysql, sqlserver and standard.</source>
        <translation>No existe el dialecto «%1»; se conocen sqlite, postgresql, mysql, sqlserver y standard.</translation>
    </message>
    <message>
        <source>There is no folder &quot;%1&quot;; several statements are drawn into one that is there.</source>
        <translation>No hay ninguna carpeta «%1»; varias instrucciones se dibujan en una que exista.</translation>
    </message>
    <message>
        <source>The standard input stream has no name; name a file to draw it into.</source>
        <translation>La entrada estándar no tiene nombre; indique un archivo donde dibujarla.</translation>
    </message>
    <message>
        <source>&quot;%1&quot; and &quot;%2&quot; would both become &quot;%3&quot;; draw them into two folders.</source>
        <translation>«%1» y «%2» se convertirían ambos en «%3»; dibújelos en dos carpetas.</translation>
    </message>
    <message>
        <source>The standard input stream cannot be read.</source>
        <translation>La entrada estándar no se puede leer.</translation>
    </message>
    <message>
        <source>--draw takes two files; write --draw statement.sql query.json.</source>
        <translation>--draw toma dos archivos; escriba --draw instruccion.sql consulta.json.</translation>
    </message>
    <message>
        <source>--draw needs to know the tables; name their database with --database.</source>
        <translation>--draw necesita conocer las tablas; indique su base de datos con --database.</translation>
    </message>
    <message>
        <source>--sql, --run and --draw go one at a time.</source>
        <translation>--sql, --run y --draw van de uno en uno.</translation>
    </message>
    <message>
        <source>--database goes with --run and --draw only.</source>
        <translation>--database va solo con --run y --draw.</translation>
    </message>
    <message>
        <source>The text that was typed beside the drawing is left out.</source>
        <translation>El texto escrito junto al dibujo queda fuera.</translation>
    </message>
</context>
</TS>
