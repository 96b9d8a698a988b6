<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de">
<context>
    <name></name>
    <message id="57671">
        <source>Are you sure you want to delete the database "%1" and all data it contains?</source>
        <extracomment>DeleteDatabase</extracomment>
        <translation>Möchten Sie die Datenbank „%1“ mit allen Daten darin wirklich löschen?</translation>
    </message>
    <message id="57672">
        <source>The database "%1" will be permanently deleted.
Are you really sure?</source>
        <extracomment>DeleteDatabaseReally</extracomment>
        <translation>Die Datenbank „%1“ wird endgültig gelöscht.
Sind Sie ganz sicher?</translation>
    </message>
    <message id="57679">
        <source>Please open a Database first.</source>
        <extracomment>OpenDatabaseFirst</extracomment>
        <translation>Bitte öffnen Sie zuerst eine Datenbank.</translation>
    </message>
    <message id="57680">
        <source>Please choose a Database and Table first.</source>
        <extracomment>ChooseDatabaseAndTableFirst</extracomment>
        <translation>Bitte wählen Sie zuerst eine Datenbank und eine Tabelle.</translation>
    </message>
    <message id="57681">
        <source>Please choose a Table first.</source>
        <extracomment>ChooseTableFirst</extracomment>
        <translation>Bitte wählen Sie zuerst eine Tabelle.</translation>
    </message>
    <message id="57682">
        <source>Create a form based on the table "%1" ?</source>
        <extracomment>CreateFormForTable</extracomment>
        <translation>Ein Formular zur Tabelle „%1“ anlegen?</translation>
    </message>
    <message id="57683">
        <source>Error: </source>
        <extracomment>ErrorPrefix</extracomment>
        <translation>Fehler: </translation>
    </message>
    <message id="57684">
        <source>A literal value in the command could not be converted to the correct type due to a reason other than data overflow</source>
        <extracomment>ErrorBadLiteral</extracomment>
        <translation>Ein Wert im Befehl konnte nicht in den richtigen Typ umgewandelt werden; der Grund ist kein Überlauf</translation>
    </message>
    <message id="57685">
        <source>A literal value in the command overflowed the range of the type of the associated column</source>
        <extracomment>ErrorOverflow</extracomment>
        <translation>Ein Wert im Befehl liegt außerhalb des Bereichs der zugehörigen Spalte</translation>
    </message>
    <message id="57686">
        <source>Out of memory</source>
        <extracomment>ErrorOutOfMemory</extracomment>
        <translation>Nicht genug Speicher</translation>
    </message>
    <message id="57687">
        <source>Access is denied</source>
        <extracomment>ErrorAccessDenied</extracomment>
        <translation>Der Zugriff wurde verweigert</translation>
    </message>
    <message id="57688">
        <source>The specified table does not exist</source>
        <extracomment>ErrorNoSuchTable</extracomment>
        <translation>Die angegebene Tabelle gibt es nicht</translation>
    </message>
    <message id="57689">
        <source>Invalid column ID</source>
        <extracomment>ErrorNoSuchColumn</extracomment>
        <translation>Ungültige Spalte</translation>
    </message>
    <message id="57690">
        <source>The specified table already exists</source>
        <extracomment>ErrorTableExists</extracomment>
        <translation>Die angegebene Tabelle gibt es schon</translation>
    </message>
    <message id="57691">
        <source>The specified index already exists</source>
        <extracomment>ErrorIndexExists</extracomment>
        <translation>Den angegebenen Index gibt es schon</translation>
    </message>
    <message id="57692">
        <source>Inner joins require that at least one of the tables is indexed on the joined terms</source>
        <extracomment>ErrorJoinNeedsIndex</extracomment>
        <translation>Für eine innere Verknüpfung muss wenigstens eine der Tabellen einen Index auf den verknüpften Feldern haben</translation>
    </message>
    <message id="57693">
        <source>The specified index does not exist</source>
        <extracomment>ErrorNoSuchIndex</extracomment>
        <translation>Den angegebenen Index gibt es nicht</translation>
    </message>
    <message id="57694">
        <source>A column ID was occurred more than once in the specification</source>
        <extracomment>ErrorDuplicateColumn</extracomment>
        <translation>Eine Spalte kommt in der Angabe mehrmals vor</translation>
    </message>
    <message id="57695">
        <source>Invalid field comparison</source>
        <extracomment>ErrorBadComparison</extracomment>
        <translation>Ungültiger Feldvergleich</translation>
    </message>
    <message id="57696">
        <source>Exceeded maximum columns in table</source>
        <extracomment>ErrorTooManyColumns</extracomment>
        <translation>Die Tabelle hat zu viele Spalten</translation>
    </message>
    <message id="57697">
        <source>The recordset is read-only. If the recordset returned by a JOIN statement with one or more columns from more than one table, it is read-only and cannot be updated.</source>
        <extracomment>ErrorReadOnlyJoin</extracomment>
        <translation>Das Ergebnis ist schreibgeschützt. Liefert eine JOIN-Anweisung Spalten aus mehr als einer Tabelle, lässt es sich nicht ändern.</translation>
    </message>
    <message id="57698">
        <source>The command contained one or more errors</source>
        <extracomment>ErrorInCommand</extracomment>
        <translation>Der Befehl enthielt einen oder mehrere Fehler</translation>
    </message>
    <message id="57704">
        <source>Query "%1" exists:
Do you want to replace the existing query?</source>
        <extracomment>QueryExists</extracomment>
        <translation>Die Abfrage „%1“ ist vorhanden.
Möchten Sie sie ersetzen?</translation>
    </message>
    <message id="57707">
        <source>You are about to ignore changes you have made.
Continue?</source>
        <extracomment>IgnoreChangesQuestion</extracomment>
        <translation>Ihre Änderungen gehen verloren.
Fortfahren?</translation>
    </message>
    <message id="57708">
        <source>Delete this control?</source>
        <extracomment>DeleteControlQuestion</extracomment>
        <translation>Dieses Steuerelement löschen?</translation>
    </message>
    <message id="57710">
        <source>Save changes?</source>
        <extracomment>SaveChangesQuestion</extracomment>
        <translation>Änderungen speichern?</translation>
    </message>
    <message id="57711">
        <source>Form "%1" exists:
Do you want to replace the existing form?</source>
        <extracomment>FormExists</extracomment>
        <translation>Das Formular „%1“ ist vorhanden.
Möchten Sie es ersetzen?</translation>
    </message>
    <message id="57714">
        <source>Are you sure you want to delete all controls?</source>
        <extracomment>DeleteAllControlsQuestion</extracomment>
        <translation>Möchten Sie wirklich alle Steuerelemente löschen?</translation>
    </message>
    <message id="57724">
        <source>Syntax Error:
Make sure that every open parenthesis/square bracket/quotation mark has a matching closing parenthesis/sqaure bracket/quotation mark.</source>
        <extracomment>StatementUnbalanced</extracomment>
        <translation>Syntaxfehler:
Jede öffnende Klammer, eckige Klammer und jedes Anführungszeichen braucht ein schließendes Gegenstück.</translation>
    </message>
    <message id="57725">
        <source>Continue ?</source>
        <extracomment>ContinueQuestion</extracomment>
        <translation>Fortfahren?</translation>
    </message>
    <message id="57754">
        <source>AaBbCcXxYyZz</source>
        <extracomment>FontSampleText</extracomment>
        <translation>AaBbCcXxYyZz</translation>
    </message>
    <message id="60100">
        <source>at character %1, near "%2"</source>
        <extracomment>SyntaxErrorNear</extracomment>
        <translation>bei Zeichen %1, nahe „%2“</translation>
    </message>
    <message id="60101">
        <source>at the end of the statement</source>
        <extracomment>SyntaxErrorAtEnd</extracomment>
        <translation>am Ende der Anweisung</translation>
    </message>
    <message id="60102">
        <source>at character %1: nested too deeply</source>
        <extracomment>SyntaxTooDeep</extracomment>
        <translation>bei Zeichen %1: zu tief verschachtelt</translation>
    </message>
    <message id="60103">
        <source>the statement is too long</source>
        <extracomment>StatementTooLong</extracomment>
        <translation>die Anweisung ist zu lang</translation>
    </message>
    <message id="60104">
        <source>at character %1: more than one table has a column "%2"</source>
        <extracomment>AmbiguousColumn</extracomment>
        <translation>bei Zeichen %1: mehr als eine Tabelle hat eine Spalte „%2“</translation>
    </message>
    <message id="60105">
        <source>at character %1: "%2" is neither grouped nor part of an aggregate</source>
        <extracomment>NeitherGroupedNorAggregated</extracomment>
        <translation>bei Zeichen %1: „%2“ ist weder gruppiert noch Teil eines Aggregats</translation>
    </message>
    <message id="60106">
        <source>at character %1: an aggregate cannot stand here</source>
        <extracomment>AggregateMisplaced</extracomment>
        <translation>bei Zeichen %1: ein Aggregat kann hier nicht stehen</translation>
    </message>
    <message id="60107">
        <source>the table "%1" belongs to the catalog and cannot be changed</source>
        <extracomment>CatalogTableIsReadOnly</extracomment>
        <translation>die Tabelle „%1“ gehört zum Katalog und lässt sich nicht ändern</translation>
    </message>
    <message id="60108">
        <source>%1 columns, but %2 values</source>
        <extracomment>ValueCountDiffers</extracomment>
        <translation>%1 Spalten, aber %2 Werte</translation>
    </message>
    <message id="60109">
        <source>a table cannot be named "%1"</source>
        <extracomment>ReservedTableName</extracomment>
        <translation>eine Tabelle kann nicht „%1“ heißen</translation>
    </message>
    <message id="60110">
        <source>no database is open for this statement</source>
        <extracomment>NeedsADatabase</extracomment>
        <translation>für diese Anweisung ist keine Datenbank offen</translation>
    </message>
    <message id="60200">
        <source>%1 is in use by another program</source>
        <extracomment>DatabaseIsBusy</extracomment>
        <translation>%1 wird von einem anderen Programm benutzt</translation>
    </message>
    <message id="60201">
        <source>%1 is read-only</source>
        <extracomment>DatabaseIsReadOnly</extracomment>
        <translation>%1 ist schreibgeschützt</translation>
    </message>
    <message id="60202">
        <source>%1: %2</source>
        <extracomment>DatabaseFailure</extracomment>
        <translation>%1: %2</translation>
    </message>
    <message id="60203">
        <source>%1 is no database</source>
        <extracomment>FileIsNoDatabase</extracomment>
        <translation>%1 ist keine Datenbank</translation>
    </message>
    <message id="60204">
        <source>%1 is damaged: %2</source>
        <extracomment>DatabaseIsDamaged</extracomment>
        <translation>%1 ist beschädigt: %2</translation>
    </message>
    <message id="60205">
        <source>%1: there is no such file</source>
        <extracomment>DatabaseNotFound</extracomment>
        <translation>%1: diese Datei gibt es nicht</translation>
    </message>
    <message id="60206">
        <source>%1 is no file</source>
        <extracomment>DatabaseIsNoFile</extracomment>
        <translation>%1 ist keine Datei</translation>
    </message>
    <message id="60207">
        <source>%1 exists already</source>
        <extracomment>DatabaseExists</extracomment>
        <translation>%1 ist schon vorhanden</translation>
    </message>
    <message id="60208">
        <source>no database file is named</source>
        <extracomment>NoDatabaseNamed</extracomment>
        <translation>keine Datenbankdatei ist genannt</translation>
    </message>
    <message id="60209">
        <source>the record has been deleted meanwhile</source>
        <extracomment>RecordIsGone</extracomment>
        <translation>der Datensatz wurde inzwischen gelöscht</translation>
    </message>
    <message id="60210">
        <source>%1: the changes since the run began were undone</source>
        <extracomment>BulkRunUndone</extracomment>
        <translation>%1: die Änderungen seit Beginn wurden zurückgenommen</translation>
    </message>
    <message id="60211">
        <source>the record has been changed meanwhile</source>
        <extracomment>RecordIsChanged</extracomment>
        <translation>der Datensatz wurde inzwischen geändert</translation>
    </message>
    <message id="60212">
        <source>there are more records than before</source>
        <extracomment>ResultHasGrown</extracomment>
        <translation>es sind mehr Datensätze als vorher</translation>
    </message>
    <message id="60300">
        <source>Another program is changing "%1". Please try again.</source>
        <extracomment>StoreIsLocked</extracomment>
        <translation>Ein anderes Programm ändert gerade „%1“. Bitte versuchen Sie es noch einmal.</translation>
    </message>
    <message id="60301">
        <source>"%1" cannot be written.</source>
        <extracomment>StoreNotWritable</extracomment>
        <translation>„%1“ lässt sich nicht schreiben.</translation>
    </message>
    <message id="60302">
        <source>"%1" cannot be read.</source>
        <extracomment>StoreNotReadable</extracomment>
        <translation>„%1“ lässt sich nicht lesen.</translation>
    </message>
    <message id="60400">
        <source>Invalid datetime format.</source>
        <extracomment>InvalidDateTime</extracomment>
        <translation>Ungültiges Datum oder ungültige Uhrzeit.</translation>
    </message>
    <message id="60401" numerus="yes">
        <source>%1 record(s) imported.</source>
        <extracomment>RecordsImported</extracomment>
        <translation>
            <numerusform>%1 Datensatz importiert.</numerusform>
            <numerusform>%1 Datensätze importiert.</numerusform>
        </translation>
    </message>
    <message id="60402">
        <source>%1
Line %2, column %3 (%4). %5 record(s) imported.</source>
        <extracomment>ImportFailedAt</extracomment>
        <translation>%1
Zeile %2, Spalte %3 (%4). Importierte Datensätze: %5.</translation>
    </message>
    <message id="60403">
        <source>%1
Line %2. %3 record(s) imported.</source>
        <extracomment>ImportFailedOnLine</extracomment>
        <translation>%1
Zeile %2. Importierte Datensätze: %3.</translation>
    </message>
    <message id="60404">
        <source>The file "%1" cannot be read: %2</source>
        <extracomment>ImportCannotOpen</extracomment>
        <translation>Die Datei „%1“ lässt sich nicht lesen: %2</translation>
    </message>
    <message id="60405">
        <source>The file cannot be read: %1</source>
        <extracomment>ImportCannotRead</extracomment>
        <translation>Die Datei lässt sich nicht lesen: %1</translation>
    </message>
    <message id="60406">
        <source>This is no text in the encoding %1.</source>
        <extracomment>ImportNotText</extracomment>
        <translation>Dies ist kein Text in der Kodierung %1.</translation>
    </message>
    <message id="60407">
        <source>The line is too long.</source>
        <extracomment>ImportRecordTooLong</extracomment>
        <translation>Die Zeile ist zu lang.</translation>
    </message>
    <message id="60408">
        <source>The quotation mark is never closed.</source>
        <extracomment>ImportQuoteNeverClosed</extracomment>
        <translation>Das Anführungszeichen wird nie geschlossen.</translation>
    </message>
    <message id="60409" numerus="yes">
        <source>%1 texts of more than %2 characters were cut.</source>
        <extracomment>ImportTextsCut</extracomment>
        <translation>
            <numerusform>%1 Text mit mehr als %2 Zeichen wurde gekürzt.</numerusform>
            <numerusform>%1 Texte mit mehr als %2 Zeichen wurden gekürzt.</numerusform>
        </translation>
    </message>
    <message id="60410" numerus="yes">
        <source>%1 texts held more than the number at their beginning; the rest was left out.</source>
        <extracomment>ImportNumbersCut</extracomment>
        <translation>
            <numerusform>%1 Text enthielt mehr als die Zahl an seinem Anfang; der Rest entfiel.</numerusform>
            <numerusform>%1 Texte enthielten mehr als die Zahl an ihrem Anfang; der Rest entfiel.</numerusform>
        </translation>
    </message>
    <message id="60411">
        <source>The table "%1" has no field "%2".</source>
        <extracomment>ImportNoSuchField</extracomment>
        <translation>Die Tabelle „%1“ hat kein Feld „%2“.</translation>
    </message>
    <message id="60412">
        <source>The file has %1 columns, the table "%2" has %3 fields.</source>
        <extracomment>ImportMoreColumnsThanFields</extracomment>
        <translation>Die Datei hat %1 Spalten, die Tabelle „%2“ hat %3 Felder.</translation>
    </message>
    <message id="60413">
        <source>Field "%1" is already assigned</source>
        <extracomment>ImportFieldAssigned</extracomment>
        <translation>Das Feld „%1“ ist schon zugeordnet</translation>
    </message>
    <message id="60414">
        <source>There is no column to import.</source>
        <extracomment>ImportNoColumns</extracomment>
        <translation>Es gibt keine Spalte zu importieren.</translation>
    </message>
    <message id="60415">
        <source>"%1" is no field type. The types are %2.</source>
        <extracomment>ImportUnknownType</extracomment>
        <translation>„%1“ ist kein Feldtyp. Die Typen sind %2.</translation>
    </message>
    <message id="60416">
        <source>Text field can contain
1 - 255 characters.
For more than 255, choose Memo field.</source>
        <extracomment>ImportTextSize</extracomment>
        <translation>Ein Textfeld fasst
1 bis 255 Zeichen.
Für mehr als 255 wählen Sie ein Memofeld.</translation>
    </message>
    <message id="60417">
        <source>Column %1 has no name.</source>
        <extracomment>ImportColumnWithoutName</extracomment>
        <translation>Spalte %1 hat keinen Namen.</translation>
    </message>
    <message id="60418">
        <source>The name "%1" stands twice.</source>
        <extracomment>ImportColumnTwice</extracomment>
        <translation>Der Name „%1“ kommt zweimal vor.</translation>
    </message>
    <message id="60419">
        <source>Importing</source>
        <extracomment>ImportProgress</extracomment>
        <translation>Import läuft</translation>
    </message>
    <message id="60420">
        <source>"%1" is no known encoding.</source>
        <extracomment>ImportUnknownEncoding</extracomment>
        <translation>„%1“ ist keine bekannte Kodierung.</translation>
    </message>
    <message id="60422">
        <source>Looking at the data</source>
        <extracomment>ImportScanProgress</extracomment>
        <translation>Die Daten werden durchgesehen</translation>
    </message>
    <message id="60440">
        <source>mirel-cli [--home DIR] COMMAND ARGUMENTS [OPTIONS]</source>
        <extracomment>CliUsage</extracomment>
        <translation>mirel-cli [--home ORDNER] BEFEHL ARGUMENTE [OPTIONEN]</translation>
    </message>
    <message id="60441">
        <source>"mirel-cli%1 --help" shows how to use it.</source>
        <extracomment>CliSeeHelp</extracomment>
        <translation>„mirel-cli%1 --help“ zeigt, wie es geht.</translation>
    </message>
    <message id="60442">
        <source>There is no option %1.</source>
        <extracomment>CliUnknownOption</extracomment>
        <translation>Eine Option %1 gibt es nicht.</translation>
    </message>
    <message id="60443">
        <source>The option %1 takes no value.</source>
        <extracomment>CliFlagTakesNoValue</extracomment>
        <translation>Die Option %1 hat keinen Wert.</translation>
    </message>
    <message id="60444">
        <source>The option %1 needs a value: %2.</source>
        <extracomment>CliValueMissing</extracomment>
        <translation>Die Option %1 braucht einen Wert: %2.</translation>
    </message>
    <message id="60445">
        <source>"%1" is no value for %2: %3.</source>
        <extracomment>CliValueWrong</extracomment>
        <translation>„%1“ ist kein Wert für %2: %3.</translation>
    </message>
    <message id="60446">
        <source>There is no command "%1".</source>
        <extracomment>CliUnknownCommand</extracomment>
        <translation>Einen Befehl „%1“ gibt es nicht.</translation>
    </message>
    <message id="60447">
        <source>This command does not take the option %1.</source>
        <extracomment>CliOptionNotHere</extracomment>
        <translation>Dieser Befehl kennt die Option %1 nicht.</translation>
    </message>
    <message id="60448">
        <source>Which command?</source>
        <extracomment>CliCommandMissing</extracomment>
        <translation>Welcher Befehl?</translation>
    </message>
    <message id="60449">
        <source>The command needs more arguments: %1.</source>
        <extracomment>CliArgumentsMissing</extracomment>
        <translation>Dem Befehl fehlen Argumente: %1.</translation>
    </message>
    <message id="60450">
        <source>The argument "%1" is one too many.</source>
        <extracomment>CliArgumentTooMany</extracomment>
        <translation>Das Argument „%1“ ist eines zu viel.</translation>
    </message>
    <message id="60451">
        <source>This command needs the option %1.</source>
        <extracomment>CliOptionNeeded</extracomment>
        <translation>Dieser Befehl braucht die Option %1.</translation>
    </message>
    <message id="60452">
        <source>The output cannot be written: %1</source>
        <extracomment>CliCannotWrite</extracomment>
        <translation>Die Ausgabe lässt sich nicht schreiben: %1</translation>
    </message>
    <message id="60453">
        <source>The file "%1" cannot be written.</source>
        <extracomment>CliCannotWriteFile</extracomment>
        <translation>Die Datei „%1“ lässt sich nicht schreiben.</translation>
    </message>
    <message id="60454">
        <source>There is no setting %1 %2.</source>
        <extracomment>CliNoSuchSetting</extracomment>
        <translation>Eine Einstellung %1 %2 gibt es nicht.</translation>
    </message>
    <message id="60455">
        <source>"%1" is no value for the setting %2 %3: it takes %4.</source>
        <extracomment>CliSettingWrong</extracomment>
        <translation>„%1“ ist kein Wert für die Einstellung %2 %3; erlaubt ist %4.</translation>
    </message>
    <message id="60500">
        <source>Are you sure you want to delete this record?</source>
        <extracomment>DeleteRecordQuestion</extracomment>
        <translation>Möchten Sie diesen Datensatz wirklich löschen?</translation>
    </message>
    <message id="60501">
        <source>%1:</source>
        <extracomment>FieldLabel</extracomment>
        <translation>%1:</translation>
    </message>
    <message id="60502">
        <source>Field</source>
        <extracomment>DetailFieldColumn</extracomment>
        <translation>Feld</translation>
    </message>
    <message id="60503">
        <source>Value</source>
        <extracomment>DetailValueColumn</extracomment>
        <translation>Wert</translation>
    </message>
    <message id="60504">
        <source>&amp;Zoom</source>
        <extracomment>ZoomIn</extracomment>
        <translation>&amp;Zoom</translation>
    </message>
    <message id="60505">
        <source>&amp;Back</source>
        <extracomment>ZoomBack</extracomment>
        <translation>&amp;Zurück</translation>
    </message>
    <message id="60506">
        <source>Edit the value in a large box</source>
        <extracomment>ZoomTip</extracomment>
        <translation>Den Wert in einem großen Feld bearbeiten</translation>
    </message>
    <message id="60507">
        <source>Choose the day from a calendar</source>
        <extracomment>CalendarTip</extracomment>
        <translation>Den Tag aus einem Kalender auswählen</translation>
    </message>
    <message id="60510">
        <source>Filter: %1</source>
        <extracomment>FilterChip</extracomment>
        <translation>Filter: %1</translation>
    </message>
    <message id="60511">
        <source>&amp;Tools</source>
        <extracomment>MenuTools</extracomment>
        <translation>E&amp;xtras</translation>
    </message>
    <message id="60512">
        <source>&amp;First record</source>
        <extracomment>ActionFirst</extracomment>
        <translation>&amp;Erster Datensatz</translation>
    </message>
    <message id="60513">
        <source>&amp;Previous record</source>
        <extracomment>ActionPrevious</extracomment>
        <translation>&amp;Voriger Datensatz</translation>
    </message>
    <message id="60514">
        <source>Ne&amp;xt record</source>
        <extracomment>ActionNext</extracomment>
        <translation>&amp;Nächster Datensatz</translation>
    </message>
    <message id="60515">
        <source>&amp;Last record</source>
        <extracomment>ActionLast</extracomment>
        <translation>&amp;Letzter Datensatz</translation>
    </message>
    <message id="60516">
        <source>&amp;New</source>
        <extracomment>ActionNewRecord</extracomment>
        <translation>Ne&amp;u</translation>
    </message>
    <message id="60517">
        <source>Add a record</source>
        <extracomment>ActionNewRecordTip</extracomment>
        <translation>Einen Datensatz hinzufügen</translation>
    </message>
    <message id="60518">
        <source>&amp;Delete</source>
        <extracomment>ActionDeleteRecord</extracomment>
        <translation>&amp;Löschen</translation>
    </message>
    <message id="60519">
        <source>Delete the selected record</source>
        <extracomment>ActionDeleteRecordTip</extracomment>
        <translation>Den ausgewählten Datensatz löschen</translation>
    </message>
    <message id="60520">
        <source>D&amp;etail</source>
        <extracomment>ActionDetail</extracomment>
        <translation>E&amp;inzelansicht</translation>
    </message>
    <message id="60521">
        <source>&amp;List</source>
        <extracomment>ActionList</extracomment>
        <translation>&amp;Liste</translation>
    </message>
    <message id="60522">
        <source>Change between the list and a single record</source>
        <extracomment>ActionDetailTip</extracomment>
        <translation>Zwischen der Liste und einem einzelnen Datensatz wechseln</translation>
    </message>
    <message id="60523">
        <source>&amp;Go To Record ...</source>
        <extracomment>ActionGoToRecord</extracomment>
        <translation>&amp;Gehe zu Datensatz ...</translation>
    </message>
    <message id="60524">
        <source>Show a record by its number</source>
        <extracomment>ActionGoToRecordTip</extracomment>
        <translation>Einen Datensatz nach seiner Nummer zeigen</translation>
    </message>
    <message id="60525">
        <source>&amp;Insert Current DateTime</source>
        <extracomment>ActionInsertDateTime</extracomment>
        <translation>Datum und Uhr&amp;zeit einfügen</translation>
    </message>
    <message id="60526">
        <source>Put the current date and time into the selected cell</source>
        <extracomment>ActionInsertDateTimeTip</extracomment>
        <translation>Das aktuelle Datum mit Uhrzeit in die ausgewählte Zelle einfügen</translation>
    </message>
    <message id="60527">
        <source>&amp;Repeat Value Above</source>
        <extracomment>ActionRepeatAbove</extracomment>
        <translation>Wert von &amp;oben wiederholen</translation>
    </message>
    <message id="60528">
        <source>Put the value of the record before into the selected cell</source>
        <extracomment>ActionRepeatAboveTip</extracomment>
        <translation>Den Wert des vorigen Datensatzes in die ausgewählte Zelle einfügen</translation>
    </message>
    <message id="60529">
        <source>R&amp;un Again</source>
        <extracomment>ActionRunAgain</extracomment>
        <translation>E&amp;rneut ausführen</translation>
    </message>
    <message id="60530">
        <source>Read the records again</source>
        <extracomment>ActionRunAgainTip</extracomment>
        <translation>Die Datensätze neu lesen</translation>
    </message>
    <message id="60531">
        <source>&amp;Auto Size Column</source>
        <extracomment>ActionFitAll</extracomment>
        <translation>Spaltenbreite an&amp;passen</translation>
    </message>
    <message id="60532">
        <source>Fit all columns to their content</source>
        <extracomment>ActionFitAllTip</extracomment>
        <translation>Alle Spalten an ihren Inhalt anpassen</translation>
    </message>
    <message id="60533">
        <source>AutoSize &amp;this Column</source>
        <extracomment>ActionFitColumn</extracomment>
        <translation>Diese Spalte an&amp;passen</translation>
    </message>
    <message id="60534">
        <source>Fit the selected column to its content</source>
        <extracomment>ActionFitColumnTip</extracomment>
        <translation>Die ausgewählte Spalte an ihren Inhalt anpassen</translation>
    </message>
    <message id="60535">
        <source>&amp;Hide this Column</source>
        <extracomment>ActionHideColumn</extracomment>
        <translation>Spalte ausblen&amp;den</translation>
    </message>
    <message id="60536">
        <source>Leave the selected column out of the list</source>
        <extracomment>ActionHideColumnTip</extracomment>
        <translation>Die ausgewählte Spalte aus der Liste nehmen</translation>
    </message>
    <message id="60537">
        <source>&amp;Show All Columns</source>
        <extracomment>ActionShowAll</extracomment>
        <translation>Alle &amp;Spalten zeigen</translation>
    </message>
    <message id="60538">
        <source>Bring the hidden columns back</source>
        <extracomment>ActionShowAllTip</extracomment>
        <translation>Die ausgeblendeten Spalten zurückholen</translation>
    </message>
    <message id="60539">
        <source>&amp;Copy</source>
        <extracomment>ActionCopy</extracomment>
        <translation>&amp;Kopieren</translation>
    </message>
    <message id="60540">
        <source>Copy the selected cells</source>
        <extracomment>ActionCopyTip</extracomment>
        <translation>Die ausgewählten Zellen kopieren</translation>
    </message>
    <message id="60541">
        <source>&amp;Paste</source>
        <extracomment>ActionPaste</extracomment>
        <translation>E&amp;infügen</translation>
    </message>
    <message id="60542">
        <source>Put what was copied into the selected cells</source>
        <extracomment>ActionPasteTip</extracomment>
        <translation>Das Kopierte in die ausgewählten Zellen einfügen</translation>
    </message>
    <message id="60543">
        <source>&amp;Options...</source>
        <extracomment>ActionOptions</extracomment>
        <translation>&amp;Optionen...</translation>
    </message>
    <message id="60544">
        <source>Change how the table view works</source>
        <extracomment>ActionOptionsTip</extracomment>
        <translation>Ändern, wie die Tabellenansicht arbeitet</translation>
    </message>
    <message id="60545">
        <source>Next part of the window</source>
        <extracomment>ActionNextPane</extracomment>
        <translation>Nächster Teil des Fensters</translation>
    </message>
    <message id="60546">
        <source>&amp;Close</source>
        <extracomment>ActionClose</extracomment>
        <translation>Schl&amp;ießen</translation>
    </message>
    <message id="60547">
        <source>Close this window</source>
        <extracomment>ActionCloseTip</extracomment>
        <translation>Dieses Fenster schließen</translation>
    </message>
    <message id="60548">
        <source>Records</source>
        <extracomment>GridName</extracomment>
        <translation>Datensätze</translation>
    </message>
    <message id="60549">
        <source>%1[*]</source>
        <extracomment>TableViewTitle</extracomment>
        <translation>%1[*]</translation>
    </message>
    <message id="60550">
        <source>Are you sure you want to drop this table "%1"?</source>
        <extracomment>DropTable</extracomment>
        <translation>Möchten Sie die Tabelle „%1“ wirklich löschen?</translation>
    </message>
    <message id="60551">
        <source>Are you sure you want to delete the form "%1"?</source>
        <extracomment>DeleteFormQuestion</extracomment>
        <translation>Möchten Sie das Formular „%1“ wirklich löschen?</translation>
    </message>
    <message id="60552">
        <source>Are you sure you want to delete the query "%1"?</source>
        <extracomment>DeleteQueryQuestion</extracomment>
        <translation>Möchten Sie die Abfrage „%1“ wirklich löschen?</translation>
    </message>
    <message id="60554">
        <source>The sample could not be made: %1</source>
        <extracomment>SampleFailed</extracomment>
        <translation>Das Beispiel konnte nicht angelegt werden: %1</translation>
    </message>
    <message id="60560">
        <source>&amp;File</source>
        <extracomment>MenuFile</extracomment>
        <translation>&amp;Datei</translation>
    </message>
    <message id="60561">
        <source>&amp;Database</source>
        <extracomment>MenuDatabase</extracomment>
        <translation>Date&amp;nbank</translation>
    </message>
    <message id="60562">
        <source>&amp;Help</source>
        <extracomment>MenuHelp</extracomment>
        <translation>&amp;Hilfe</translation>
    </message>
    <message id="60563">
        <source>&amp;Layout</source>
        <extracomment>MenuLayout</extracomment>
        <translation>&amp;Aussehen</translation>
    </message>
    <message id="60564">
        <source>&amp;Recent Databases</source>
        <extracomment>MenuRecent</extracomment>
        <translation>&amp;Zuletzt verwendet</translation>
    </message>
    <message id="60565">
        <source>&amp;Add Favorites</source>
        <extracomment>CommandAddFavorites</extracomment>
        <translation>Zu Favoriten &amp;hinzufügen</translation>
    </message>
    <message id="60566">
        <source>&amp;Remove from Favorites</source>
        <extracomment>CommandRemoveFavorites</extracomment>
        <translation>Aus Favoriten &amp;entfernen</translation>
    </message>
    <message id="60567">
        <source>Open by &amp;Double-Clicking</source>
        <extracomment>CommandOpenByDoubleClicking</extracomment>
        <translation>Mit &amp;Doppelklick öffnen</translation>
    </message>
    <message id="60568">
        <source>&amp;Font</source>
        <extracomment>CommandFont</extracomment>
        <translation>&amp;Schrift</translation>
    </message>
    <message id="60569">
        <source>&amp;Background Color</source>
        <extracomment>CommandBackgroundColor</extracomment>
        <translation>&amp;Hintergrundfarbe</translation>
    </message>
    <message id="60570">
        <source>&amp;List Background Color</source>
        <extracomment>CommandListBackgroundColor</extracomment>
        <translation>Hintergrundfarbe der &amp;Liste</translation>
    </message>
    <message id="60571">
        <source>B&amp;utton Background Color</source>
        <extracomment>CommandButtonBackgroundColor</extracomment>
        <translation>Hintergrundfarbe der S&amp;chaltflächen</translation>
    </message>
    <message id="60572">
        <source>&amp;Current DB Text Color</source>
        <extracomment>CommandDatabaseTextColor</extracomment>
        <translation>Textfarbe der &amp;Datenbankzeile</translation>
    </message>
    <message id="60573">
        <source>List &amp;Text Color</source>
        <extracomment>CommandListTextColor</extracomment>
        <translation>Textfarbe der L&amp;iste</translation>
    </message>
    <message id="60574">
        <source>Button Te&amp;xt Color</source>
        <extracomment>CommandButtonTextColor</extracomment>
        <translation>Te&amp;xtfarbe der Schaltflächen</translation>
    </message>
    <message id="60575">
        <source>Import &amp;from CSV ...</source>
        <extracomment>CommandImportCsv</extracomment>
        <translation>Aus CS&amp;V importieren ...</translation>
    </message>
    <message id="60576">
        <source>&amp;Export to CSV ...</source>
        <extracomment>CommandExportCsv</extracomment>
        <translation>Nach &amp;CSV exportieren ...</translation>
    </message>
    <message id="60577">
        <source>E&amp;xit</source>
        <extracomment>CommandExit</extracomment>
        <translation>&amp;Beenden</translation>
    </message>
    <message id="60578">
        <source>&amp;Open Database</source>
        <extracomment>CommandOpenDatabase</extracomment>
        <translation>Datenbank ö&amp;ffnen</translation>
    </message>
    <message id="60579">
        <source>&amp;New Database</source>
        <extracomment>CommandNewDatabase</extracomment>
        <translation>&amp;Neue Datenbank</translation>
    </message>
    <message id="60580">
        <source>&amp;Delete Database</source>
        <extracomment>CommandDeleteDatabase</extracomment>
        <translation>Datenbank &amp;löschen</translation>
    </message>
    <message id="60581">
        <source>Open the &amp;Sample</source>
        <extracomment>CommandOpenSample</extracomment>
        <translation>&amp;Beispiel öffnen</translation>
    </message>
    <message id="60582">
        <source>&amp;About Mirel</source>
        <extracomment>CommandAbout</extracomment>
        <translation>Ü&amp;ber Mirel</translation>
    </message>
    <message id="60583">
        <source>&amp;Help</source>
        <extracomment>CommandHelp</extracomment>
        <translation>&amp;Hilfe</translation>
    </message>
    <message id="60584">
        <source>&amp;Keys</source>
        <extracomment>CommandKeys</extracomment>
        <translation>&amp;Tasten</translation>
    </message>
    <message id="60585">
        <source>&amp;Open</source>
        <extracomment>CommandOpen</extracomment>
        <translation>Ö&amp;ffnen</translation>
    </message>
    <message id="60586">
        <source>&amp;New</source>
        <extracomment>CommandNew</extracomment>
        <translation>Ne&amp;u</translation>
    </message>
    <message id="60587">
        <source>&amp;Edit</source>
        <extracomment>CommandEdit</extracomment>
        <translation>&amp;Bearbeiten</translation>
    </message>
    <message id="60588">
        <source>De&amp;lete</source>
        <extracomment>CommandDelete</extracomment>
        <translation>&amp;Löschen</translation>
    </message>
    <message id="60589">
        <source>Fa&amp;vorites</source>
        <extracomment>TabFavorites</extracomment>
        <translation>Fa&amp;voriten</translation>
    </message>
    <message id="60590">
        <source>&amp;Table</source>
        <extracomment>TabTable</extracomment>
        <translation>&amp;Tabelle</translation>
    </message>
    <message id="60591">
        <source>Fo&amp;rm</source>
        <extracomment>TabForm</extracomment>
        <translation>Fo&amp;rmular</translation>
    </message>
    <message id="60592">
        <source>&amp;Query</source>
        <extracomment>TabQuery</extracomment>
        <translation>&amp;Abfrage</translation>
    </message>
    <message id="60593">
        <source>No database is open</source>
        <extracomment>NoDatabase</extracomment>
        <translation>Keine Datenbank ist offen</translation>
    </message>
    <message id="60594">
        <source>Recent databases</source>
        <extracomment>RecentHeading</extracomment>
        <translation>Zuletzt verwendete Datenbanken</translation>
    </message>
    <message id="60595">
        <source>Search</source>
        <extracomment>SearchEntries</extracomment>
        <translation>Suchen</translation>
    </message>
    <message id="60596">
        <source>Table</source>
        <extracomment>KindTable</extracomment>
        <translation>Tabelle</translation>
    </message>
    <message id="60597">
        <source>Form of %1</source>
        <extracomment>KindForm</extracomment>
        <translation>Formular zu %1</translation>
    </message>
    <message id="60598">
        <source>Query on %1</source>
        <extracomment>KindQuery</extracomment>
        <translation>Abfrage zu %1</translation>
    </message>
    <message id="60599">
        <source>Not in this database any more</source>
        <extracomment>KindMissing</extracomment>
        <translation>Nicht mehr in dieser Datenbank</translation>
    </message>
    <message id="60600">
        <source>At %1: "%2" has no place here and was left out.</source>
        <extracomment>ExplainNoPlace</extracomment>
        <translation>An Stelle %1: „%2“ passt hier nicht und wurde ausgelassen.</translation>
    </message>
    <message id="60601">
        <source>At %1: "%2" lost its place to what follows and was left out.</source>
        <extracomment>ExplainReplaced</extracomment>
        <translation>An Stelle %1: „%2“ wurde vom Folgenden verdrängt und ausgelassen.</translation>
    </message>
    <message id="60602">
        <source>At %1: this parenthesis closes nothing; from here on all was left out: %2</source>
        <extracomment>ExplainAfterTheEnd</extracomment>
        <translation>An Stelle %1: Diese Klammer schließt nichts; ab hier wurde alles ausgelassen: %2</translation>
    </message>
    <message id="60603">
        <source>At %1: NOT stands before no comparison and no group, and changes nothing.</source>
        <extracomment>ExplainLostNot</extracomment>
        <translation>An Stelle %1: NOT steht vor keinem Vergleich und keiner Gruppe und bewirkt nichts.</translation>
    </message>
    <message id="60604">
        <source>At %1: the expression is too long or too deeply nested from here on; its value is null.</source>
        <extracomment>ExplainTooLong</extracomment>
        <translation>An Stelle %1: Der Ausdruck ist ab hier zu lang oder zu tief verschachtelt; sein Wert ist null.</translation>
    </message>
    <message id="60605">
        <source>At %1: there is nothing to evaluate; the value is null.</source>
        <extracomment>ExplainNothing</extracomment>
        <translation>An Stelle %1: Hier gibt es nichts auszuwerten; der Wert ist null.</translation>
    </message>
    <message id="60606">
        <source>At %1: no field is called %2; it counts as the empty text.</source>
        <extracomment>ExplainUnknownName</extracomment>
        <translation>An Stelle %1: Kein Feld heißt %2; es zählt als leerer Text.</translation>
    </message>
    <message id="60607">
        <source>At %1: %2 has a value on a form only, in a control over all records.</source>
        <extracomment>ExplainAggregate</extracomment>
        <translation>An Stelle %1: %2 hat nur in einem Formular einen Wert, in einem Steuerelement über alle Datensätze.</translation>
    </message>
    <message id="60608">
        <source>At %1: %2 lacks its argument %3; the value is null.</source>
        <extracomment>ExplainMissingArgument</extracomment>
        <translation>An Stelle %1: %2 fehlt das Argument %3; der Wert ist null.</translation>
    </message>
    <message id="60609">
        <source>At %1: %2 takes a text here, and a number counts as the empty text; TO_CHAR makes a text of it.</source>
        <extracomment>ExplainNumberForText</extracomment>
        <translation>An Stelle %1: %2 erwartet hier einen Text, eine Zahl zählt als leerer Text; TO_CHAR macht einen Text daraus.</translation>
    </message>
    <message id="60610">
        <source>At %1: %2 takes a number here, and a text counts as 0; TO_NUMBER reads the number in it.</source>
        <extracomment>ExplainTextForNumber</extracomment>
        <translation>An Stelle %1: %2 erwartet hier eine Zahl, ein Text zählt als 0; TO_NUMBER liest die Zahl darin.</translation>
    </message>
    <message id="60611">
        <source>At %1: "%2" takes the whole condition before it as its left side; put what belongs together into parentheses.</source>
        <extracomment>ExplainSwallowed</extracomment>
        <translation>An Stelle %1: „%2“ nimmt die ganze Bedingung davor als linke Seite; setzen Sie in Klammern, was zusammengehört.</translation>
    </message>
    <message id="60612">
        <source>At %1: "%2" lacks an operand; the value is null.</source>
        <extracomment>ExplainMissingOperand</extracomment>
        <translation>An Stelle %1: „%2“ fehlt ein Operand; der Wert ist null.</translation>
    </message>
    <message id="60613">
        <source>At %1: this minus takes an operand away from "%2"; put what it negates into parentheses.</source>
        <extracomment>ExplainLeadingMinus</extracomment>
        <translation>An Stelle %1: Dieses Minus nimmt „%2“ einen Operanden weg; setzen Sie in Klammern, was es umkehren soll.</translation>
    </message>
    <message id="60614">
        <source>At %1: %2 is a text, and a text never holds as a condition; compare it with something.</source>
        <extracomment>ExplainTextAsCondition</extracomment>
        <translation>An Stelle %1: %2 ist ein Text, und ein Text trifft als Bedingung nie zu; vergleichen Sie ihn mit etwas.</translation>
    </message>
    <message id="60615">
        <source>At %1: a Yes/No field is a text, which "%2" never matches with a number; compare it with '%3' or '%4'.</source>
        <extracomment>ExplainYesNoAndNumber</extracomment>
        <translation>An Stelle %1: Ein Ja/Nein-Feld ist ein Text, für „%2“ also nie gleich einer Zahl; vergleichen Sie es mit '%3' oder '%4'.</translation>
    </message>
    <message id="60616">
        <source>At %1: "%2" stands between a text and a number, and so never holds.</source>
        <extracomment>ExplainTextAndNumber</extracomment>
        <translation>An Stelle %1: „%2“ steht zwischen einem Text und einer Zahl und trifft daher nie zu.</translation>
    </message>
    <message id="60617">
        <source>At %1: the pattern '%2' has no % at either end, and so fits nothing.</source>
        <extracomment>ExplainNoPercent</extracomment>
        <translation>An Stelle %1: Das Muster '%2' hat an keinem Ende ein % und passt daher auf nichts.</translation>
    </message>
    <message id="60618">
        <source>At %1: %2 is null because there is no record.</source>
        <extracomment>ExplainNoRecord</extracomment>
        <translation>An Stelle %1: %2 ist null, weil es keinen Datensatz gibt.</translation>
    </message>
    <message id="60619">
        <source>At %1: the value is null because %2 is NULL in this record.</source>
        <extracomment>ExplainFieldIsNull</extracomment>
        <translation>An Stelle %1: Der Wert ist null, weil %2 in diesem Datensatz NULL ist.</translation>
    </message>
    <message id="60620">
        <source>At %1: the value is null because %2 has no value; IS NULL tests for it.</source>
        <extracomment>ExplainNullWord</extracomment>
        <translation>An Stelle %1: Der Wert ist null, weil %2 keinen Wert hat; IS NULL prüft darauf.</translation>
    </message>
    <message id="60621">
        <source>At %1: the value is null because "%2" calculates with numbers, and one side is a text.</source>
        <extracomment>ExplainTextInArithmetic</extracomment>
        <translation>An Stelle %1: Der Wert ist null, weil „%2“ mit Zahlen rechnet und eine Seite ein Text ist.</translation>
    </message>
    <message id="60622">
        <source>At %1: the value is null because "%2" divides by 0.</source>
        <extracomment>ExplainDivisionByZero</extracomment>
        <translation>An Stelle %1: Der Wert ist null, weil „%2“ durch 0 teilt.</translation>
    </message>
    <message id="60623">
        <source>At %1: the value is null because "%2" has no result for these operands.</source>
        <extracomment>ExplainNoValue</extracomment>
        <translation>An Stelle %1: Der Wert ist null, weil „%2“ für diese Operanden kein Ergebnis hat.</translation>
    </message>
    <message id="60640">
        <source>There is no record %1.</source>
        <extracomment>CliNoSuchRecord</extracomment>
        <translation>Einen Datensatz %1 gibt es nicht.</translation>
    </message>
    <message id="60641">
        <source>"%1" sets no control: NAME=TEXT.</source>
        <extracomment>CliControlWithoutValue</extracomment>
        <translation>„%1“ setzt kein Steuerelement: NAME=TEXT.</translation>
    </message>
    <message id="60642">
        <source>The option %1 needs the option %2.</source>
        <extracomment>CliOptionsTogether</extracomment>
        <translation>Die Option %1 braucht die Option %2.</translation>
    </message>
    <message id="60643">
        <source>The options %1 and %2 exclude each other.</source>
        <extracomment>CliOptionsExclude</extracomment>
        <translation>Die Optionen %1 und %2 schließen einander aus.</translation>
    </message>
    <message id="60700">
        <source>Puts the selected table, form or query into the favorites of this database</source>
        <extracomment>TipAddFavorites</extracomment>
        <translation>Nimmt die ausgewählte Tabelle, das Formular oder die Abfrage in die Favoriten dieser Datenbank auf</translation>
    </message>
    <message id="60701">
        <source>Takes the selected entry out of the favorites; the entry itself stays</source>
        <extracomment>TipRemoveFavorites</extracomment>
        <translation>Nimmt den ausgewählten Eintrag aus den Favoriten; er selbst bleibt</translation>
    </message>
    <message id="60702">
        <source>Ticked: a double tap opens an entry; otherwise a single tap does</source>
        <extracomment>TipOpenByDoubleClicking</extracomment>
        <translation>Angekreuzt: Doppeltippen öffnet einen Eintrag; sonst genügt einmal</translation>
    </message>
    <message id="60703">
        <source>Choose the font and the colors of this view</source>
        <extracomment>TipLayout</extracomment>
        <translation>Schrift und Farben dieser Ansicht auswählen</translation>
    </message>
    <message id="60704">
        <source>Read a CSV file into a new or an existing table</source>
        <extracomment>TipImportCsv</extracomment>
        <translation>Eine CSV-Datei in eine neue oder vorhandene Tabelle einlesen</translation>
    </message>
    <message id="60705">
        <source>Write the selected table or query as a CSV file</source>
        <extracomment>TipExportCsv</extracomment>
        <translation>Die ausgewählte Tabelle oder Abfrage als CSV-Datei schreiben</translation>
    </message>
    <message id="60706">
        <source>Closes Mirel; every change is saved already</source>
        <extracomment>TipExit</extracomment>
        <translation>Beendet Mirel; alle Änderungen sind schon gespeichert</translation>
    </message>
    <message id="60707">
        <source>Opens a database file</source>
        <extracomment>TipOpenDatabase</extracomment>
        <translation>Öffnet eine Datenbankdatei</translation>
    </message>
    <message id="60708">
        <source>Makes a new, empty database file and opens it</source>
        <extracomment>TipNewDatabase</extracomment>
        <translation>Legt eine neue, leere Datenbankdatei an und öffnet sie</translation>
    </message>
    <message id="60709">
        <source>Deletes a database file with its forms and queries, after asking twice</source>
        <extracomment>TipDeleteDatabase</extracomment>
        <translation>Löscht eine Datenbankdatei mit ihren Formularen und Abfragen, nach zwei Rückfragen</translation>
    </message>
    <message id="60710">
        <source>Opens a small database to try things on: bird strikes, airports, contacts</source>
        <extracomment>TipOpenSample</extracomment>
        <translation>Öffnet eine kleine Datenbank zum Ausprobieren: Vogelschläge, Flughäfen, Kontakte</translation>
    </message>
    <message id="60711">
        <source>Version of Mirel, path and stamp of the open database</source>
        <extracomment>TipAbout</extracomment>
        <translation>Version von Mirel, Pfad und Kennung der offenen Datenbank</translation>
    </message>
    <message id="60712">
        <source>Shows the help page of this view</source>
        <extracomment>TipHelp</extracomment>
        <translation>Zeigt die Hilfeseite dieser Ansicht</translation>
    </message>
    <message id="60713">
        <source>Lists the keys of this view</source>
        <extracomment>TipKeys</extracomment>
        <translation>Listet die Tasten dieser Ansicht auf</translation>
    </message>
    <message id="60714">
        <source>Opens the selected entry</source>
        <extracomment>TipOpen</extracomment>
        <translation>Öffnet den ausgewählten Eintrag</translation>
    </message>
    <message id="60716">
        <source>Makes a new table, form or query, whichever tab is shown</source>
        <extracomment>TipNew</extracomment>
        <translation>Legt eine neue Tabelle, ein neues Formular oder eine neue Abfrage an, je nach Seite</translation>
    </message>
    <message id="60717">
        <source>Design a new table</source>
        <extracomment>TipNewTable</extracomment>
        <translation>Eine neue Tabelle entwerfen</translation>
    </message>
    <message id="60718">
        <source>Make a form for the table that is selected under Table</source>
        <extracomment>TipNewForm</extracomment>
        <translation>Ein Formular für die Tabelle anlegen, die unter Tabelle ausgewählt ist</translation>
    </message>
    <message id="60719">
        <source>Build a query on the selected table</source>
        <extracomment>TipNewQuery</extracomment>
        <translation>Eine Abfrage zur ausgewählten Tabelle erstellen</translation>
    </message>
    <message id="60720">
        <source>Favorites are added with Add Favorites in the menu of an entry</source>
        <extracomment>TipNewFavorite</extracomment>
        <translation>Favoriten kommen mit „Zu Favoriten hinzufügen“ im Menü eines Eintrags hierher</translation>
    </message>
    <message id="60721">
        <source>Changes the selected entry</source>
        <extracomment>TipEdit</extracomment>
        <translation>Ändert den ausgewählten Eintrag</translation>
    </message>
    <message id="60722">
        <source>Change the fields and indexes of the selected table</source>
        <extracomment>TipEditTable</extracomment>
        <translation>Felder und Indizes der ausgewählten Tabelle ändern</translation>
    </message>
    <message id="60723">
        <source>Change the selected form in the form maker</source>
        <extracomment>TipEditForm</extracomment>
        <translation>Das ausgewählte Formular im Entwurf ändern</translation>
    </message>
    <message id="60724">
        <source>Open the selected query in the query builder</source>
        <extracomment>TipEditQuery</extracomment>
        <translation>Die ausgewählte Abfrage im Abfrageeditor öffnen</translation>
    </message>
    <message id="60725">
        <source>Deletes the selected entry, after asking</source>
        <extracomment>TipDelete</extracomment>
        <translation>Löscht den ausgewählten Eintrag nach einer Rückfrage</translation>
    </message>
    <message id="60726">
        <source>Select an entry of the list first</source>
        <extracomment>TipSelectFirst</extracomment>
        <translation>Wählen Sie zuerst einen Eintrag der Liste aus</translation>
    </message>
    <message id="60727">
        <source>No favorites yet. Add Favorites, in the menu of a table, form or query, puts it here.</source>
        <extracomment>EmptyFavorites</extracomment>
        <translation>Noch keine Favoriten. „Zu Favoriten hinzufügen“ im Menü eines Eintrags setzt ihn hierher.</translation>
    </message>
    <message id="60728">
        <source>No tables yet. New makes one.</source>
        <extracomment>EmptyTables</extracomment>
        <translation>Noch keine Tabellen. „Neu“ legt eine an.</translation>
    </message>
    <message id="60729">
        <source>No forms yet. New makes one for the table that is selected under Table.</source>
        <extracomment>EmptyForms</extracomment>
        <translation>Noch keine Formulare. „Neu“ legt eines für die Tabelle an, die unter Tabelle ausgewählt ist.</translation>
    </message>
    <message id="60730">
        <source>No queries yet. New makes one for the table that is selected under Table.</source>
        <extracomment>EmptyQueries</extracomment>
        <translation>Noch keine Abfragen. „Neu“ legt eine für die Tabelle an, die unter Tabelle ausgewählt ist.</translation>
    </message>
    <message id="60731">
        <source>Nothing here bears "%1" in its name.</source>
        <extracomment>NothingFound</extracomment>
        <translation>Nichts hier trägt „%1“ im Namen.</translation>
    </message>
    <message id="60732">
        <source>Open a database, make a new one, or look around in the sample.</source>
        <extracomment>WelcomeHint</extracomment>
        <translation>Öffnen Sie eine Datenbank, legen Sie eine neue an oder sehen Sie sich das Beispiel an.</translation>
    </message>
    <message id="60733">
        <source>Database (*.cdb)</source>
        <extracomment>DatabaseFilter</extracomment>
        <translation>Datenbank (*.cdb)</translation>
    </message>
    <message id="60734">
        <source>About Mirel</source>
        <extracomment>AboutTitle</extracomment>
        <translation>Über Mirel</translation>
    </message>
    <message id="60735">
        <source>Mirel %1</source>
        <extracomment>AboutVersion</extracomment>
        <translation>Mirel %1</translation>
    </message>
    <message id="60736">
        <source>A personal database: tables, forms and queries in one file.</source>
        <extracomment>AboutWhat</extracomment>
        <translation>Eine persönliche Datenbank: Tabellen, Formulare und Abfragen in einer Datei.</translation>
    </message>
    <message id="60737">
        <source>Database: %1</source>
        <extracomment>AboutDatabase</extracomment>
        <translation>Datenbank: %1</translation>
    </message>
    <message id="60738">
        <source>Stamp: %1</source>
        <extracomment>AboutStamp</extracomment>
        <translation>Kennung: %1</translation>
    </message>
    <message id="60739">
        <source>none (the database cannot be written)</source>
        <extracomment>AboutNoStamp</extracomment>
        <translation>keine (die Datenbank lässt sich nicht beschreiben)</translation>
    </message>
    <message id="60740">
        <source>Keys</source>
        <extracomment>KeysTitle</extracomment>
        <translation>Tasten</translation>
    </message>
    <message id="60741">
        <source>%1 - Mirel</source>
        <extracomment>WindowTitle</extracomment>
        <translation>%1 - Mirel</translation>
    </message>
    <message id="60742">
        <source>%1 of %2</source>
        <extracomment>ProgressCount</extracomment>
        <translation>%1 von %2</translation>
    </message>
    <message id="60743">
        <source>Favorites need a database that can be written.</source>
        <extracomment>FavoritesReadOnly</extracomment>
        <translation>Favoriten brauchen eine Datenbank, die sich beschreiben lässt.</translation>
    </message>
    <message id="60744">
        <source>Entries of the tab %1</source>
        <extracomment>EntriesOf</extracomment>
        <translation>Einträge der Seite %1</translation>
    </message>
    <message id="60745">
        <source>&amp;%1 %2</source>
        <extracomment>RecentEntry</extracomment>
        <translation>&amp;%1 %2</translation>
    </message>
    <message id="60748">
        <source>%1 (%2)</source>
        <extracomment>TipWithKeys</extracomment>
        <translation>%1 (%2)</translation>
    </message>
    <message id="60749">
        <source>Folder above</source>
        <extracomment>FolderUp</extracomment>
        <translation>Ordner darüber</translation>
    </message>
    <message id="60750">
        <source>Folders and files</source>
        <extracomment>FolderContents</extracomment>
        <translation>Ordner und Dateien</translation>
    </message>
    <message id="60751">
        <source>File name</source>
        <extracomment>FileName</extracomment>
        <translation>Dateiname</translation>
    </message>
    <message id="60900">
        <source>%1 (read-only)[*]</source>
        <extracomment>TableViewTitleReadOnly</extracomment>
        <translation>%1 (schreibgeschützt)[*]</translation>
    </message>
    <message id="60901">
        <source>%1 %2, record %3</source>
        <extracomment>CellDescription</extracomment>
        <translation>%1 %2, Datensatz %3</translation>
    </message>
    <message id="60902">
        <source>Go</source>
        <extracomment>GoTitle</extracomment>
        <translation>Gehe zu</translation>
    </message>
    <message id="60903">
        <source>&amp;Go to Record:</source>
        <extracomment>GoToRecordChoice</extracomment>
        <translation>&amp;Gehe zu Datensatz:</translation>
    </message>
    <message id="60904">
        <source>Go to &amp;First Record.</source>
        <extracomment>GoToFirstChoice</extracomment>
        <translation>Zum &amp;ersten Datensatz.</translation>
    </message>
    <message id="60905">
        <source>Go to &amp;Last Record.</source>
        <extracomment>GoToLastChoice</extracomment>
        <translation>Zum &amp;letzten Datensatz.</translation>
    </message>
    <message id="60906">
        <source>Go to &amp;Previous Record.</source>
        <extracomment>GoToPreviousChoice</extracomment>
        <translation>Zum &amp;vorigen Datensatz.</translation>
    </message>
    <message id="60907">
        <source>Go to &amp;Next Record.</source>
        <extracomment>GoToNextChoice</extracomment>
        <translation>Zum &amp;nächsten Datensatz.</translation>
    </message>
    <message id="60908">
        <source>Tabie View Options</source>
        <extracomment>OptionsTitle</extracomment>
        <translation>Optionen der Tabellenansicht</translation>
    </message>
    <message id="60909">
        <source>&amp;Confirm before record deletion.</source>
        <extracomment>OptionConfirmDelete</extracomment>
        <translation>Vor dem Löschen eines Datensatzes &amp;fragen.</translation>
    </message>
    <message id="60910">
        <source>Maximum characters in a column</source>
        <extracomment>OptionColumnGroup</extracomment>
        <translation>Zeichen je Spalte</translation>
    </message>
    <message id="60911">
        <source>&amp;maximum</source>
        <extracomment>OptionMaximum</extracomment>
        <translation>&amp;höchstens</translation>
    </message>
    <message id="60912">
        <source>characters.</source>
        <extracomment>OptionCharacters</extracomment>
        <translation>Zeichen.</translation>
    </message>
    <message id="60913">
        <source>String for &amp;Yes/No Field:</source>
        <extracomment>OptionYesNoWords</extracomment>
        <translation>&amp;Wörter für Ja/Nein-Felder:</translation>
    </message>
    <message id="60914">
        <source>&amp;Tap'n Hold Popup Menu</source>
        <extracomment>OptionHoldPopup</extracomment>
        <translation>&amp;Menü nach Halten von</translation>
    </message>
    <message id="60915">
        <source>ms.</source>
        <extracomment>OptionMilliseconds</extracomment>
        <translation>ms.</translation>
    </message>
    <message id="60916">
        <source>&amp;Sort by tapping list column header.</source>
        <extracomment>OptionSortByHeader</extracomment>
        <translation>&amp;Tippen auf den Spaltenkopf sortiert.</translation>
    </message>
    <message id="60917">
        <source>&amp;Filter By Selection</source>
        <extracomment>ActionFilterBy</extracomment>
        <translation>Nach Auswahl &amp;filtern</translation>
    </message>
    <message id="60918">
        <source>Keep the records that have the value of the selected cell</source>
        <extracomment>ActionFilterByTip</extracomment>
        <translation>Nur die Datensätze mit dem Wert der ausgewählten Zelle behalten</translation>
    </message>
    <message id="60919">
        <source>Filter E&amp;xcluding Selection</source>
        <extracomment>ActionFilterExcluding</extracomment>
        <translation>Aus&amp;wahl ausschließen</translation>
    </message>
    <message id="60920">
        <source>Leave out the records that have the value of the selected cell</source>
        <extracomment>ActionFilterExcludingTip</extracomment>
        <translation>Die Datensätze mit dem Wert der ausgewählten Zelle ausblenden</translation>
    </message>
    <message id="60921">
        <source>&amp;Remove Filter</source>
        <extracomment>ActionRemoveFilter</extracomment>
        <translation>Filter &amp;entfernen</translation>
    </message>
    <message id="60922">
        <source>Show all records again, in their first order</source>
        <extracomment>ActionRemoveFilterTip</extracomment>
        <translation>Wieder alle Datensätze zeigen, in ihrer ersten Reihenfolge</translation>
    </message>
    <message id="60923">
        <source>Sort &amp;Ascending</source>
        <extracomment>ActionSortAscending</extracomment>
        <translation>&amp;Aufsteigend sortieren</translation>
    </message>
    <message id="60924">
        <source>Order the records by the selected column</source>
        <extracomment>ActionSortAscendingTip</extracomment>
        <translation>Die Datensätze nach der ausgewählten Spalte ordnen</translation>
    </message>
    <message id="60925">
        <source>Sort Des&amp;cending</source>
        <extracomment>ActionSortDescending</extracomment>
        <translation>A&amp;bsteigend sortieren</translation>
    </message>
    <message id="60926">
        <source>Order the records by the selected column, the last first</source>
        <extracomment>ActionSortDescendingTip</extracomment>
        <translation>Die Datensätze nach der ausgewählten Spalte ordnen, die letzten zuerst</translation>
    </message>
    <message id="60927">
        <source>More buttons</source>
        <extracomment>ActionMore</extracomment>
        <translation>Weitere Schaltflächen</translation>
    </message>
    <message id="61000">
        <source>The aggregate functions are not supported on the '%1' field.</source>
        <extracomment>AggregateNotSupported</extracomment>
        <translation>Aggregatfunktionen sind für das Feld '%1' nicht möglich.</translation>
    </message>
    <message id="61001">
        <source>SUM: </source>
        <extracomment>AggregateSum</extracomment>
        <translation>SUM: </translation>
    </message>
    <message id="61002">
        <source>MAX: </source>
        <extracomment>AggregateMax</extracomment>
        <translation>MAX: </translation>
    </message>
    <message id="61003">
        <source>MIN: </source>
        <extracomment>AggregateMin</extracomment>
        <translation>MIN: </translation>
    </message>
    <message id="61004">
        <source>AVG: </source>
        <extracomment>AggregateAvg</extracomment>
        <translation>AVG: </translation>
    </message>
    <message id="61005" numerus="yes">
        <source>Are you sure you want to delete %1 records in this result?</source>
        <extracomment>DeleteAllQuestion</extracomment>
        <translation>
            <numerusform>Möchten Sie %1 Datensatz dieses Ergebnisses wirklich löschen?</numerusform>
            <numerusform>Möchten Sie %1 Datensätze dieses Ergebnisses wirklich löschen?</numerusform>
        </translation>
    </message>
    <message id="61006" numerus="yes">
        <source>These %1 records will be permanently deleted.
Are you really sure?</source>
        <extracomment>DeleteAllReally</extracomment>
        <translation>
            <numerusform>Dieser %1 Datensatz wird endgültig gelöscht.
Sind Sie ganz sicher?</numerusform>
            <numerusform>Diese %1 Datensätze werden endgültig gelöscht.
Sind Sie ganz sicher?</numerusform>
        </translation>
    </message>
    <message id="61007" numerus="yes">
        <source>Are you sure you want to update %1 records in this result?

Update Field: %2
Set Value: %3</source>
        <extracomment>UpdateAllQuestion</extracomment>
        <translation>
            <numerusform>Möchten Sie %1 Datensatz dieses Ergebnisses wirklich ändern?

Feld: %2
Wert: %3</numerusform>
            <numerusform>Möchten Sie %1 Datensätze dieses Ergebnisses wirklich ändern?

Feld: %2
Wert: %3</numerusform>
        </translation>
    </message>
    <message id="61008" numerus="yes">
        <source>You are about to update %1 records.
Are you really sure?</source>
        <extracomment>UpdateAllReally</extracomment>
        <translation>
            <numerusform>Sie sind dabei, %1 Datensatz zu ändern.
Sind Sie ganz sicher?</numerusform>
            <numerusform>Sie sind dabei, %1 Datensätze zu ändern.
Sind Sie ganz sicher?</numerusform>
        </translation>
    </message>
    <message id="61009">
        <source>Deleting records …</source>
        <extracomment>DeletingRecords</extracomment>
        <translation>Datensätze werden gelöscht …</translation>
    </message>
    <message id="61010">
        <source>Updating records …</source>
        <extracomment>UpdatingRecords</extracomment>
        <translation>Datensätze werden geändert …</translation>
    </message>
    <message id="61020">
        <source>Filter Expression</source>
        <extracomment>FilterTitle</extracomment>
        <translation>Filterausdruck</translation>
    </message>
    <message id="61021">
        <source>&amp;Basic</source>
        <extracomment>FilterBasic</extracomment>
        <translation>Ein&amp;fach</translation>
    </message>
    <message id="61022">
        <source>&amp;Advanced</source>
        <extracomment>FilterAdvanced</extracomment>
        <translation>Er&amp;weitert</translation>
    </message>
    <message id="61023">
        <source>From-&amp;To</source>
        <extracomment>FilterFromTo</extracomment>
        <translation>Von-&amp;bis</translation>
    </message>
    <message id="61024">
        <source>F&amp;rom:</source>
        <extracomment>FilterFrom</extracomment>
        <translation>&amp;Von:</translation>
    </message>
    <message id="61025">
        <source>T&amp;o:</source>
        <extracomment>FilterTo</extracomment>
        <translation>B&amp;is:</translation>
    </message>
    <message id="61026">
        <source>&amp;Expression:</source>
        <extracomment>FilterExpressionLabel</extracomment>
        <translation>&amp;Ausdruck:</translation>
    </message>
    <message id="61027">
        <source>Enter a filter expression.</source>
        <extracomment>FilterPrompt</extracomment>
        <translation>Geben Sie einen Filterausdruck ein.</translation>
    </message>
    <message id="61028">
        <source>A&amp;nd/Or/Not:</source>
        <extracomment>FilterAndOrNot</extracomment>
        <translation>U&amp;nd/Oder/Nicht:</translation>
    </message>
    <message id="61029">
        <source>Value</source>
        <extracomment>FilterValueName</extracomment>
        <translation>Wert</translation>
    </message>
    <message id="61030">
        <source>&amp;Tables:</source>
        <extracomment>TablesLabel</extracomment>
        <translation>&amp;Tabellen:</translation>
    </message>
    <message id="61031">
        <source>&amp;Fields:</source>
        <extracomment>FieldsLabel</extracomment>
        <translation>&amp;Felder:</translation>
    </message>
    <message id="61032">
        <source>&amp;Operators:</source>
        <extracomment>OperatorsLabel</extracomment>
        <translation>&amp;Operatoren:</translation>
    </message>
    <message id="61033">
        <source>Sort Expression</source>
        <extracomment>SortTitle</extracomment>
        <translation>Sortierausdruck</translation>
    </message>
    <message id="61034">
        <source>&amp;ORDER BY:</source>
        <extracomment>SortOrderBy</extracomment>
        <translation>&amp;ORDER BY:</translation>
    </message>
    <message id="61035">
        <source>&amp;ASC/DESC:</source>
        <extracomment>SortDirection</extracomment>
        <translation>&amp;ASC/DESC:</translation>
    </message>
    <message id="61040">
        <source>Filter Ex&amp;pression ...</source>
        <extracomment>ActionFilterExpression</extracomment>
        <translation>Filterausdru&amp;ck ...</translation>
    </message>
    <message id="61041">
        <source>Filter by a condition that you put together</source>
        <extracomment>ActionFilterExpressionTip</extracomment>
        <translation>Nach einer selbst zusammengestellten Bedingung filtern</translation>
    </message>
    <message id="61042">
        <source>S&amp;ort Expression ...</source>
        <extracomment>ActionSortExpression</extracomment>
        <translation>So&amp;rtierausdruck ...</translation>
    </message>
    <message id="61043">
        <source>Sort by several fields</source>
        <extracomment>ActionSortExpressionTip</extracomment>
        <translation>Nach mehreren Feldern sortieren</translation>
    </message>
    <message id="61044">
        <source>Edit A&amp;ll</source>
        <extracomment>ActionEditAll</extracomment>
        <translation>Alle ä&amp;ndern</translation>
    </message>
    <message id="61045">
        <source>Change or delete all records of this result</source>
        <extracomment>ActionEditAllTip</extracomment>
        <translation>Alle Datensätze dieses Ergebnisses ändern oder löschen</translation>
    </message>
    <message id="61046">
        <source>Aggrega&amp;te</source>
        <extracomment>ActionAggregate</extracomment>
        <translation>Auswer&amp;ten</translation>
    </message>
    <message id="61047">
        <source>Sum up the selected column</source>
        <extracomment>ActionAggregateTip</extracomment>
        <translation>Die ausgewählte Spalte zusammenrechnen</translation>
    </message>
    <message id="61048">
        <source>New &amp;Query ...</source>
        <extracomment>ActionNewQuery</extracomment>
        <translation>Ne&amp;ue Abfrage ...</translation>
    </message>
    <message id="61049">
        <source>Build a query and show its result here</source>
        <extracomment>ActionNewQueryTip</extracomment>
        <translation>Eine Abfrage erstellen und ihr Ergebnis hier zeigen</translation>
    </message>
    <message id="61050">
        <source>Ope&amp;n Query ...</source>
        <extracomment>ActionOpenQuery</extracomment>
        <translation>Abfrage ö&amp;ffnen ...</translation>
    </message>
    <message id="61051">
        <source>Show the result of a saved query</source>
        <extracomment>ActionOpenQueryTip</extracomment>
        <translation>Das Ergebnis einer gespeicherten Abfrage zeigen</translation>
    </message>
    <message id="61052">
        <source>&amp;Save As Query ...</source>
        <extracomment>ActionSaveQuery</extracomment>
        <translation>Als Abfrage &amp;speichern ...</translation>
    </message>
    <message id="61053">
        <source>Keep what is shown now as a query</source>
        <extracomment>ActionSaveQueryTip</extracomment>
        <translation>Was jetzt gezeigt wird, als Abfrage behalten</translation>
    </message>
    <message id="61054">
        <source>&amp;Export to CSV ...</source>
        <extracomment>ActionExportCsv</extracomment>
        <translation>Nach &amp;CSV exportieren ...</translation>
    </message>
    <message id="61055">
        <source>Write this result as a CSV file</source>
        <extracomment>ActionExportCsvTip</extracomment>
        <translation>Dieses Ergebnis als CSV-Datei schreiben</translation>
    </message>
    <message id="61056">
        <source>La&amp;yout</source>
        <extracomment>ActionLayout</extracomment>
        <translation>&amp;Aussehen</translation>
    </message>
    <message id="61057">
        <source>Choose font and colors</source>
        <extracomment>ActionLayoutTip</extracomment>
        <translation>Schrift und Farben auswählen</translation>
    </message>
    <message id="61058">
        <source>&amp;Help</source>
        <extracomment>ActionHelp</extracomment>
        <translation>&amp;Hilfe</translation>
    </message>
    <message id="61059">
        <source>Shows the help page of this view</source>
        <extracomment>ActionHelpTip</extracomment>
        <translation>Zeigt die Hilfeseite dieser Ansicht</translation>
    </message>
    <message id="61060">
        <source>Reading records …</source>
        <extracomment>SummingRecords</extracomment>
        <translation>Datensätze werden gelesen …</translation>
    </message>
    <message id="61061">
        <source>&amp;Delete all</source>
        <extracomment>ActionDeleteAll</extracomment>
        <translation>Alle &amp;löschen</translation>
    </message>
    <message id="61062">
        <source>Delete all records of this result</source>
        <extracomment>ActionDeleteAllTip</extracomment>
        <translation>Alle Datensätze dieses Ergebnisses löschen</translation>
    </message>
    <message id="61063">
        <source>&amp;Update all</source>
        <extracomment>ActionUpdateAll</extracomment>
        <translation>Alle ä&amp;ndern</translation>
    </message>
    <message id="61064">
        <source>Set the selected field of all records to what the editor shows</source>
        <extracomment>ActionUpdateAllTip</extracomment>
        <translation>Das ausgewählte Feld aller Datensätze auf den Wert des Editors setzen</translation>
    </message>
    <message id="61065">
        <source>&amp;SUM</source>
        <extracomment>ActionSum</extracomment>
        <translation>&amp;SUM</translation>
    </message>
    <message id="61066">
        <source>Add up the selected column</source>
        <extracomment>ActionSumTip</extracomment>
        <translation>Die ausgewählte Spalte zusammenzählen</translation>
    </message>
    <message id="61067">
        <source>MA&amp;X</source>
        <extracomment>ActionMax</extracomment>
        <translation>MA&amp;X</translation>
    </message>
    <message id="61068">
        <source>The greatest value of the selected column</source>
        <extracomment>ActionMaxTip</extracomment>
        <translation>Der größte Wert der ausgewählten Spalte</translation>
    </message>
    <message id="61069">
        <source>M&amp;IN</source>
        <extracomment>ActionMin</extracomment>
        <translation>M&amp;IN</translation>
    </message>
    <message id="61070">
        <source>The smallest value of the selected column</source>
        <extracomment>ActionMinTip</extracomment>
        <translation>Der kleinste Wert der ausgewählten Spalte</translation>
    </message>
    <message id="61071">
        <source>&amp;AVG</source>
        <extracomment>ActionAvg</extracomment>
        <translation>&amp;AVG</translation>
    </message>
    <message id="61072">
        <source>The average of the selected column, without its empty cells</source>
        <extracomment>ActionAvgTip</extracomment>
        <translation>Der Durchschnitt der ausgewählten Spalte, ohne ihre leeren Zellen</translation>
    </message>
    <message id="61073">
        <source>Open</source>
        <extracomment>OpenQueryTitle</extracomment>
        <translation>Öffnen</translation>
    </message>
    <message id="61074">
        <source>&amp;Select a query you want to run:</source>
        <extracomment>OpenQueryPrompt</extracomment>
        <translation>&amp;Wählen Sie die Abfrage, die ausgeführt werden soll:</translation>
    </message>
    <message id="61075">
        <source>Save as</source>
        <extracomment>SaveQueryTitle</extracomment>
        <translation>Speichern unter</translation>
    </message>
    <message id="61076">
        <source>Query Name:</source>
        <extracomment>SaveQueryPrompt</extracomment>
        <translation>Name der Abfrage:</translation>
    </message>
    <message id="61077">
        <source>%1
%2</source>
        <extracomment>UnbalancedQuestion</extracomment>
        <translation>%1
%2</translation>
    </message>
    <message id="61078">
        <source>This database cannot be written: it has no forms and no saved queries.</source>
        <extracomment>StoreMissing</extracomment>
        <translation>Diese Datenbank lässt sich nicht beschreiben: Sie hat keine Formulare und keine gespeicherten Abfragen.</translation>
    </message>
    <message id="61079">
        <source>There is no query "%1".</source>
        <extracomment>NoSuchQuery</extracomment>
        <translation>Eine Abfrage „%1“ gibt es nicht.</translation>
    </message>
    <message id="61080">
        <source>Export</source>
        <extracomment>ExportTitle</extracomment>
        <translation>Export</translation>
    </message>
    <message id="61081">
        <source>%1 (step %2 of %3)</source>
        <extracomment>WizardStep</extracomment>
        <translation>%1 (Schritt %2 von %3)</translation>
    </message>
    <message id="61082">
        <source>Select Source/Dest.</source>
        <extracomment>ExportStepSource</extracomment>
        <translation>Quelle und Ziel</translation>
    </message>
    <message id="61083">
        <source>Field separator</source>
        <extracomment>ExportStepSeparator</extracomment>
        <translation>Feldtrennzeichen</translation>
    </message>
    <message id="61084">
        <source>Source Data:</source>
        <extracomment>ExportSource</extracomment>
        <translation>Quelldaten:</translation>
    </message>
    <message id="61085">
        <source>&amp;Query</source>
        <extracomment>ExportQuery</extracomment>
        <translation>&amp;Abfrage</translation>
    </message>
    <message id="61086">
        <source>Choose the records to export in the query builder</source>
        <extracomment>ExportQueryTip</extracomment>
        <translation>Die Datensätze zum Exportieren im Abfrageeditor auswählen</translation>
    </message>
    <message id="61087">
        <source>Destination:</source>
        <extracomment>ExportDestination</extracomment>
        <translation>Ziel:</translation>
    </message>
    <message id="61088">
        <source>&amp;Save As</source>
        <extracomment>ExportSaveAs</extracomment>
        <translation>&amp;Speichern unter</translation>
    </message>
    <message id="61089">
        <source>Choose the file to write</source>
        <extracomment>ExportSaveAsTip</extracomment>
        <translation>Die Datei zum Schreiben auswählen</translation>
    </message>
    <message id="61090">
        <source>Save as %1</source>
        <extracomment>ExportPath</extracomment>
        <translation>Speichern als %1</translation>
    </message>
    <message id="61091">
        <source>Field Name</source>
        <extracomment>ExportFieldName</extracomment>
        <translation>Feldname</translation>
    </message>
    <message id="61092">
        <source>Field Type</source>
        <extracomment>ExportFieldType</extracomment>
        <translation>Feldtyp</translation>
    </message>
    <message id="61093">
        <source>Field Data ...</source>
        <extracomment>ExportFieldData</extracomment>
        <translation>Felddaten …</translation>
    </message>
    <message id="61094" numerus="yes">
        <source>%1 record(s) selected.</source>
        <extracomment>RecordsSelected</extracomment>
        <translation>
            <numerusform>%1 Datensatz ausgewählt.</numerusform>
            <numerusform>%1 Datensätze ausgewählt.</numerusform>
        </translation>
    </message>
    <message id="61095">
        <source>&amp;Next</source>
        <extracomment>WizardNext</extracomment>
        <translation>&amp;Weiter</translation>
    </message>
    <message id="61096">
        <source>&amp;Back</source>
        <extracomment>WizardBack</extracomment>
        <translation>&amp;Zurück</translation>
    </message>
    <message id="61097">
        <source>E&amp;xport</source>
        <extracomment>ExportRun</extracomment>
        <translation>E&amp;xportieren</translation>
    </message>
    <message id="61098">
        <source>&amp;Advanced</source>
        <extracomment>CsvAdvanced</extracomment>
        <translation>&amp;Mehr</translation>
    </message>
    <message id="61099">
        <source>&amp;Tab</source>
        <extracomment>CsvSeparatorTab</extracomment>
        <translation>&amp;Tabulator</translation>
    </message>
    <message id="61100">
        <source>Se&amp;micolon</source>
        <extracomment>CsvSeparatorSemicolon</extracomment>
        <translation>Se&amp;mikolon</translation>
    </message>
    <message id="61101">
        <source>&amp;Comma</source>
        <extracomment>CsvSeparatorComma</extracomment>
        <translation>&amp;Komma</translation>
    </message>
    <message id="61102">
        <source>S&amp;pace</source>
        <extracomment>CsvSeparatorSpace</extracomment>
        <translation>L&amp;eerzeichen</translation>
    </message>
    <message id="61103">
        <source>&amp;Field names in first line.</source>
        <extracomment>CsvHeader</extracomment>
        <translation>&amp;Feldnamen in der ersten Zeile</translation>
    </message>
    <message id="61104">
        <source>Text data...</source>
        <extracomment>CsvPreview</extracomment>
        <translation>Textdaten …</translation>
    </message>
    <message id="61105">
        <source>File creation fail.
%1</source>
        <extracomment>FileCreationFail</extracomment>
        <translation>Die Datei konnte nicht angelegt werden.
%1</translation>
    </message>
    <message id="61106">
        <source>The file could not be written; what stood there before still does.
%1
%2</source>
        <extracomment>FileWriteFail</extracomment>
        <translation>Die Datei konnte nicht geschrieben werden; der alte Inhalt ist noch da.
%1
%2</translation>
    </message>
    <message id="61107" numerus="yes">
        <source>%1 record(s) exported.</source>
        <extracomment>RecordsExported</extracomment>
        <translation>
            <numerusform>%1 Datensatz exportiert.</numerusform>
            <numerusform>%1 Datensätze exportiert.</numerusform>
        </translation>
    </message>
    <message id="61108">
        <source>Exporting records …</source>
        <extracomment>ExportingRecords</extracomment>
        <translation>Datensätze werden exportiert …</translation>
    </message>
    <message id="61109">
        <source>The file "%1" exists:
Do you want to replace the existing file?</source>
        <extracomment>ReplaceFileQuestion</extracomment>
        <translation>Die Datei „%1“ ist vorhanden.
Möchten Sie sie ersetzen?</translation>
    </message>
    <message id="61110">
        <source>CSV File (*.csv);;Text File (*.txt)</source>
        <extracomment>CsvFilter</extracomment>
        <translation>CSV-Datei (*.csv);;Textdatei (*.txt)</translation>
    </message>
    <message id="61111">
        <source>Advanced Options</source>
        <extracomment>CsvAdvancedTitle</extracomment>
        <translation>Weitere Optionen</translation>
    </message>
    <message id="61112">
        <source>String &amp;Quotation mark:</source>
        <extracomment>CsvQuote</extracomment>
        <translation>&amp;Anführungszeichen:</translation>
    </message>
    <message id="61113">
        <source>DateTime Format</source>
        <extracomment>CsvDateGroup</extracomment>
        <translation>Datum und Uhrzeit</translation>
    </message>
    <message id="61114">
        <source>&amp;Date Format:</source>
        <extracomment>CsvDateFormat</extracomment>
        <translation>&amp;Datumsformat:</translation>
    </message>
    <message id="61115">
        <source>Date &amp;Separator:</source>
        <extracomment>CsvDateSeparator</extracomment>
        <translation>Datums&amp;trennzeichen:</translation>
    </message>
    <message id="61116">
        <source>&amp;Time Separator:</source>
        <extracomment>CsvTimeSeparator</extracomment>
        <translation>&amp;Zeittrennzeichen:</translation>
    </message>
    <message id="61117">
        <source>month-day-year</source>
        <extracomment>CsvDateMonthDayYear</extracomment>
        <translation>Monat-Tag-Jahr</translation>
    </message>
    <message id="61118">
        <source>month-year-day</source>
        <extracomment>CsvDateMonthYearDay</extracomment>
        <translation>Monat-Jahr-Tag</translation>
    </message>
    <message id="61119">
        <source>year-day-month</source>
        <extracomment>CsvDateYearDayMonth</extracomment>
        <translation>Jahr-Tag-Monat</translation>
    </message>
    <message id="61120">
        <source>year-month-day</source>
        <extracomment>CsvDateYearMonthDay</extracomment>
        <translation>Jahr-Monat-Tag</translation>
    </message>
    <message id="61121">
        <source>day-month-year</source>
        <extracomment>CsvDateDayMonthYear</extracomment>
        <translation>Tag-Monat-Jahr</translation>
    </message>
    <message id="61122">
        <source>day-year-month</source>
        <extracomment>CsvDateDayYearMonth</extracomment>
        <translation>Tag-Jahr-Monat</translation>
    </message>
    <message id="61123">
        <source>Current locale format</source>
        <extracomment>CsvDateLocale</extracomment>
        <translation>Format des Systems</translation>
    </message>
    <message id="61124">
        <source>(none)</source>
        <extracomment>CsvNone</extracomment>
        <translation>(keines)</translation>
    </message>
    <message id="61125">
        <source>Dou&amp;ble quotation marks inside text</source>
        <extracomment>CsvDoubledQuotes</extracomment>
        <translation>Anführungszeichen im Text &amp;verdoppeln</translation>
    </message>
    <message id="61126">
        <source>&amp;Encoding:</source>
        <extracomment>CsvEncoding</extracomment>
        <translation>&amp;Kodierung:</translation>
    </message>
    <message id="61127">
        <source>The result has no field "%1".</source>
        <extracomment>NoSuchField</extracomment>
        <translation>Das Ergebnis hat kein Feld „%1“.</translation>
    </message>
    <message id="61128">
        <source>The file "%1" exists; --yes replaces it.</source>
        <extracomment>CliFileExists</extracomment>
        <translation>Die Datei „%1“ ist vorhanden; --yes ersetzt sie.</translation>
    </message>
    <message id="61129">
        <source>"%1" is no value for a Yes/No field: %2, %3, 1 or 0.</source>
        <extracomment>CliYesNoValue</extracomment>
        <translation>„%1“ ist kein Wert für ein Ja/Nein-Feld: %2, %3, 1 oder 0.</translation>
    </message>
    <message id="61131">
        <source>"%1" is none of sum, max, min and avg.</source>
        <extracomment>CliNoSuchAggregate</extracomment>
        <translation>„%1“ ist weder sum noch max, min oder avg.</translation>
    </message>
    <message id="61132">
        <source>The query "%1" exists; --replace replaces it.</source>
        <extracomment>CliQueryExists</extracomment>
        <translation>Die Abfrage „%1“ ist vorhanden; --replace ersetzt sie.</translation>
    </message>
    <message id="61133">
        <source>Stopped: %1 of %2 records were changed, and stay so.</source>
        <extracomment>StoppedAt</extracomment>
        <translation>Abgebrochen: %1 von %2 Datensätzen wurden geändert und bleiben es.</translation>
    </message>
    <message id="61150" numerus="yes">
        <source>%1 records have been changed or deleted since, and were left as they are.</source>
        <extracomment>UndoLeftAlone</extracomment>
        <translation>
            <numerusform>%1 Datensatz wurde inzwischen geändert oder gelöscht und blieb, wie er war.</numerusform>
            <numerusform>%1 Datensätze wurden inzwischen geändert oder gelöscht und blieben, wie sie waren.</numerusform>
        </translation>
    </message>
    <message id="61151">
        <source>Copying cells …</source>
        <extracomment>CopyingCells</extracomment>
        <translation>Zellen werden kopiert …</translation>
    </message>
    <message id="61152">
        <source>Writing cells …</source>
        <extracomment>PastingCells</extracomment>
        <translation>Zellen werden geschrieben …</translation>
    </message>
    <message id="61153">
        <source>%1 columns were copied, but there are only %2 from the selected one on. Put in those that there is room for?</source>
        <extracomment>PasteTooWide</extracomment>
        <translation>Es wurden %1 Spalten kopiert, ab der ausgewählten gibt es aber nur %2. Nur so viele einfügen, wie Platz haben?</translation>
    </message>
    <message id="61154">
        <source>The field "%1" cannot be changed.</source>
        <extracomment>PasteReadOnly</extracomment>
        <translation>Das Feld „%1“ lässt sich nicht ändern.</translation>
    </message>
    <message id="61155">
        <source>%1 record(s) are to be put in, but there are only %2 from the selected one on. Add %3 new record(s)?</source>
        <extracomment>PasteAddsRecords</extracomment>
        <translation>Einzufügende Datensätze: %1, vorhanden ab dem ausgewählten: %2. Neue Datensätze anlegen: %3?</translation>
    </message>
    <message id="61156">
        <source>Stopped. %1 of %2 record(s) are written.</source>
        <extracomment>PasteStopped</extracomment>
        <translation>Abgebrochen. Geschriebene Datensätze: %1 von %2.</translation>
    </message>
    <message id="61157">
        <source>Field %1, record %2. %3 of %4 record(s) are written.</source>
        <extracomment>PasteFailedAt</extracomment>
        <translation>Feld %1, Datensatz %2. Geschriebene Datensätze: %3 von %4.</translation>
    </message>
    <message id="61158">
        <source>&amp;Edit</source>
        <extracomment>MenuEdit</extracomment>
        <translation>&amp;Bearbeiten</translation>
    </message>
    <message id="61159">
        <source>&amp;Undo</source>
        <extracomment>ActionUndo</extracomment>
        <translation>Rück&amp;gängig</translation>
    </message>
    <message id="61160">
        <source>Take back the last change of cells, or bring back the deleted record</source>
        <extracomment>ActionUndoTip</extracomment>
        <translation>Die letzte Änderung zurücknehmen oder den gelöschten Datensatz zurückholen</translation>
    </message>
    <message id="61161">
        <source>Copy &amp;With Field Names</source>
        <extracomment>ActionCopyWithNames</extracomment>
        <translation>Mit Feld&amp;namen kopieren</translation>
    </message>
    <message id="61162">
        <source>Copy the selected cells with the names of their fields above</source>
        <extracomment>ActionCopyWithNamesTip</extracomment>
        <translation>Die ausgewählten Zellen mit den Namen ihrer Felder kopieren</translation>
    </message>
    <message id="61163">
        <source>Select &amp;All</source>
        <extracomment>ActionSelectAll</extracomment>
        <translation>&amp;Alles auswählen</translation>
    </message>
    <message id="61164">
        <source>Select all cells of all records</source>
        <extracomment>ActionSelectAllTip</extracomment>
        <translation>Alle Zellen aller Datensätze auswählen</translation>
    </message>
    <message id="61165">
        <source>Select Recor&amp;ds</source>
        <extracomment>ActionSelectRecords</extracomment>
        <translation>&amp;Datensätze auswählen</translation>
    </message>
    <message id="61166">
        <source>Select all cells of the selected records</source>
        <extracomment>ActionSelectRecordsTip</extracomment>
        <translation>Alle Zellen der ausgewählten Datensätze auswählen</translation>
    </message>
    <message id="61167">
        <source>Select Co&amp;lumns</source>
        <extracomment>ActionSelectColumns</extracomment>
        <translation>&amp;Spalten auswählen</translation>
    </message>
    <message id="61168">
        <source>Select all cells of the selected columns</source>
        <extracomment>ActionSelectColumnsTip</extracomment>
        <translation>Alle Zellen der ausgewählten Spalten auswählen</translation>
    </message>
    <message id="61169">
        <source>&amp;Find ...</source>
        <extracomment>ActionFind</extracomment>
        <translation>S&amp;uchen ...</translation>
    </message>
    <message id="61170">
        <source>Look for a text in the records</source>
        <extracomment>ActionFindTip</extracomment>
        <translation>Einen Text in den Datensätzen suchen</translation>
    </message>
    <message id="61171">
        <source>Find &amp;Next</source>
        <extracomment>ActionFindNext</extracomment>
        <translation>Weitersu&amp;chen</translation>
    </message>
    <message id="61172">
        <source>Go on to the next place with that text</source>
        <extracomment>ActionFindNextTip</extracomment>
        <translation>Zur nächsten Stelle mit diesem Text</translation>
    </message>
    <message id="61173">
        <source>Find Pre&amp;vious</source>
        <extracomment>ActionFindPrevious</extracomment>
        <translation>&amp;Vorherige Stelle</translation>
    </message>
    <message id="61174">
        <source>Go back to the place before with that text</source>
        <extracomment>ActionFindPreviousTip</extracomment>
        <translation>Zur vorigen Stelle mit diesem Text</translation>
    </message>
    <message id="61175">
        <source>Find</source>
        <extracomment>FindPrompt</extracomment>
        <translation>Suchen</translation>
    </message>
    <message id="61176">
        <source>Close the line</source>
        <extracomment>FindClose</extracomment>
        <translation>Suchzeile schließen</translation>
    </message>
    <message id="61177">
        <source>%1 …</source>
        <extracomment>FindSearching</extracomment>
        <translation>%1 …</translation>
    </message>
    <message id="61178">
        <source>Went around</source>
        <extracomment>FindWrapped</extracomment>
        <translation>Von vorn weitergesucht</translation>
    </message>
    <message id="61179">
        <source>Not found</source>
        <extracomment>FindNothing</extracomment>
        <translation>Nicht gefunden</translation>
    </message>
    <message id="61180">
        <source>State&amp;ment ...</source>
        <extracomment>ActionStatement</extracomment>
        <translation>An&amp;weisung ...</translation>
    </message>
    <message id="61181">
        <source>Show the statement that this result comes from</source>
        <extracomment>ActionStatementTip</extracomment>
        <translation>Die Anweisung zeigen, aus der dieses Ergebnis stammt</translation>
    </message>
    <message id="61182">
        <source>Statement</source>
        <extracomment>StatementTitle</extracomment>
        <translation>Anweisung</translation>
    </message>
    <message id="61183">
        <source>&amp;Copy</source>
        <extracomment>StatementCopy</extracomment>
        <translation>&amp;Kopieren</translation>
    </message>
    <message id="61184">
        <source>AutoSize A&amp;ll Columns</source>
        <extracomment>ActionFitAllNow</extracomment>
        <translation>A&amp;lle Spalten anpassen</translation>
    </message>
    <message id="61185">
        <source>The record above</source>
        <extracomment>KeyRowUp</extracomment>
        <translation>Ein Datensatz nach oben</translation>
    </message>
    <message id="61186">
        <source>The record below</source>
        <extracomment>KeyRowDown</extracomment>
        <translation>Ein Datensatz nach unten</translation>
    </message>
    <message id="61187">
        <source>A page up</source>
        <extracomment>KeyPageUp</extracomment>
        <translation>Eine Seite nach oben</translation>
    </message>
    <message id="61188">
        <source>A page down</source>
        <extracomment>KeyPageDown</extracomment>
        <translation>Eine Seite nach unten</translation>
    </message>
    <message id="61189">
        <source>The column to the left</source>
        <extracomment>KeyColumnLeft</extracomment>
        <translation>Eine Spalte nach links</translation>
    </message>
    <message id="61190">
        <source>The column to the right</source>
        <extracomment>KeyColumnRight</extracomment>
        <translation>Eine Spalte nach rechts</translation>
    </message>
    <message id="61191">
        <source>The first column</source>
        <extracomment>KeyFirstColumn</extracomment>
        <translation>Zur ersten Spalte</translation>
    </message>
    <message id="61192">
        <source>The last column</source>
        <extracomment>KeyLastColumn</extracomment>
        <translation>Zur letzten Spalte</translation>
    </message>
    <message id="61193">
        <source>Select cells from here on</source>
        <extracomment>KeyExtend</extracomment>
        <translation>Zellen ab hier auswählen</translation>
    </message>
    <message id="61194">
        <source>Save and go to the next cell</source>
        <extracomment>KeyNextCell</extracomment>
        <translation>Speichern und zur nächsten Zelle</translation>
    </message>
    <message id="61195">
        <source>Save and go to the cell before</source>
        <extracomment>KeyPreviousCell</extracomment>
        <translation>Speichern und zur vorigen Zelle</translation>
    </message>
    <message id="61196">
        <source>Edit the cell; typing replaces it</source>
        <extracomment>KeyEditCell</extracomment>
        <translation>Die Zelle bearbeiten; Tippen ersetzt den Inhalt</translation>
    </message>
    <message id="61197">
        <source>Give the old value back</source>
        <extracomment>KeyRevertEdit</extracomment>
        <translation>Den alten Wert zurückholen</translation>
    </message>
    <message id="61198">
        <source>Clear the selected cells</source>
        <extracomment>KeyClearCell</extracomment>
        <translation>Die ausgewählten Zellen leeren</translation>
    </message>
    <message id="61199">
        <source>Text &amp;Color</source>
        <extracomment>LayoutTextColor</extracomment>
        <translation>&amp;Textfarbe</translation>
    </message>
    <message id="61200">
        <source>&amp;Reset to Defaults</source>
        <extracomment>LayoutReset</extracomment>
        <translation>&amp;Zurücksetzen</translation>
    </message>
    <message id="61201">
        <source>Take the font and the colors of the desktop again</source>
        <extracomment>LayoutResetTip</extracomment>
        <translation>Wieder Schrift und Farben des Systems verwenden</translation>
    </message>
    <message id="61202">
        <source>Choose the font of this view</source>
        <extracomment>TipFont</extracomment>
        <translation>Die Schrift dieser Ansicht auswählen</translation>
    </message>
    <message id="61203">
        <source>Choose this color</source>
        <extracomment>TipColor</extracomment>
        <translation>Diese Farbe auswählen</translation>
    </message>
    <message id="61204">
        <source>Fonts</source>
        <extracomment>FontsTitle</extracomment>
        <translation>Schrift</translation>
    </message>
    <message id="61205">
        <source>Font &amp;name:</source>
        <extracomment>FontName</extracomment>
        <translation>Schrift&amp;name:</translation>
    </message>
    <message id="61206">
        <source>&amp;Size:</source>
        <extracomment>FontSize</extracomment>
        <translation>&amp;Größe:</translation>
    </message>
    <message id="61207">
        <source>&amp;Bold</source>
        <extracomment>FontBold</extracomment>
        <translation>&amp;Fett</translation>
    </message>
    <message id="61208">
        <source>&amp;Italic</source>
        <extracomment>FontItalic</extracomment>
        <translation>&amp;Kursiv</translation>
    </message>
    <message id="61209">
        <source>Stri&amp;keout</source>
        <extracomment>FontStrikeout</extracomment>
        <translation>&amp;Durchgestrichen</translation>
    </message>
    <message id="61210">
        <source>&amp;Underline</source>
        <extracomment>FontUnderline</extracomment>
        <translation>&amp;Unterstrichen</translation>
    </message>
    <message id="61211">
        <source>Font &amp;Color</source>
        <extracomment>FontColor</extracomment>
        <translation>&amp;Textfarbe</translation>
    </message>
    <message id="61212">
        <source>Sample</source>
        <extracomment>FontSampleName</extracomment>
        <translation>Muster</translation>
    </message>
    <message id="61213">
        <source>Colors</source>
        <extracomment>ColorsTitle</extracomment>
        <translation>Farben</translation>
    </message>
    <message id="61214">
        <source>&amp;Code:</source>
        <extracomment>ColorCode</extracomment>
        <translation>&amp;Code:</translation>
    </message>
    <message id="61215">
        <source>&amp;The desktop's color</source>
        <extracomment>ColorUnset</extracomment>
        <translation>Farbe des &amp;Systems</translation>
    </message>
    <message id="61216">
        <source>Palette</source>
        <extracomment>ColorPalette</extracomment>
        <translation>Palette</translation>
    </message>
    <message id="61217">
        <source>Are you sure you want to delete these %1 records?</source>
        <extracomment>DeleteRecordsQuestion</extracomment>
        <translation>Möchten Sie diese %1 Datensätze wirklich löschen?</translation>
    </message>
    <message id="61218">
        <source>Deleting records …</source>
        <extracomment>DeletingSelected</extracomment>
        <translation>Datensätze werden gelöscht …</translation>
    </message>
    <message id="61219">
        <source>no value</source>
        <extracomment>CellHasNoValue</extracomment>
        <translation>kein Wert</translation>
    </message>
    <message id="61220">
        <source>This is too much to be taken back later. Go on?</source>
        <extracomment>BeyondUndo</extracomment>
        <translation>Das ist zu viel, um es später zurückzunehmen. Fortfahren?</translation>
    </message>
    <message id="61300" numerus="yes">
        <source>Are you sure you want to update %1 records in this result?</source>
        <extracomment>FormUpdateAllQuestion</extracomment>
        <translation>
            <numerusform>Möchten Sie %1 Datensatz dieses Ergebnisses wirklich ändern?</numerusform>
            <numerusform>Möchten Sie %1 Datensätze dieses Ergebnisses wirklich ändern?</numerusform>
        </translation>
    </message>
    <message id="61301">
        <source>Updating records …</source>
        <extracomment>FormUpdatingRecords</extracomment>
        <translation>Datensätze werden geändert …</translation>
    </message>
    <message id="61302">
        <source>Computing sums and averages …</source>
        <extracomment>ComputingAggregates</extracomment>
        <translation>Summen und Durchschnitte werden berechnet …</translation>
    </message>
    <message id="61303">
        <source>&amp;Save</source>
        <extracomment>SaveChangesAnswer</extracomment>
        <translation>&amp;Speichern</translation>
    </message>
    <message id="61304">
        <source>A form shows the records of a SELECT statement. This statement was not run:
%1</source>
        <extracomment>FormQueryMustRead</extracomment>
        <translation>Ein Formular zeigt die Datensätze einer SELECT-Anweisung. Diese wurde nicht ausgeführt:
%1</translation>
    </message>
    <message id="61305">
        <source>The result has no field "%1". Nothing was added.</source>
        <extracomment>FormNoSuchField</extracomment>
        <translation>Das Ergebnis hat kein Feld „%1“. Es wurde nichts hinzugefügt.</translation>
    </message>
    <message id="61306">
        <source>the field "%1"</source>
        <extracomment>FormFieldRefused</extracomment>
        <translation>das Feld „%1“</translation>
    </message>
    <message id="61307">
        <source>"%1" holds no form.</source>
        <extracomment>FormFileIsEmpty</extracomment>
        <translation>„%1“ enthält kein Formular.</translation>
    </message>
    <message id="61308">
        <source>There is no form "%1".</source>
        <extracomment>NoSuchForm</extracomment>
        <translation>Ein Formular „%1“ gibt es nicht.</translation>
    </message>
    <message id="61309">
        <source>There is a form "%1" already; --name gives it another name.</source>
        <extracomment>FormNameTaken</extracomment>
        <translation>Ein Formular „%1“ gibt es schon; --name gibt ihm einen anderen Namen.</translation>
    </message>
    <message id="61310">
        <source>The form has no control "%1".</source>
        <extracomment>NoSuchControl</extracomment>
        <translation>Das Formular hat kein Steuerelement „%1“.</translation>
    </message>
    <message id="61311">
        <source>The form has no button "%1".</source>
        <extracomment>NoSuchButton</extracomment>
        <translation>Das Formular hat keine Schaltfläche „%1“.</translation>
    </message>
    <message id="61312">
        <source>The button "%1" could not do its work on this record.</source>
        <extracomment>PressFailed</extracomment>
        <translation>Die Schaltfläche „%1“ konnte an diesem Datensatz nichts ausrichten.</translation>
    </message>
    <message id="61313">
        <source>"%1" sets no control: CONTROL=TEXT.</source>
        <extracomment>CliSetWithoutValue</extracomment>
        <translation>„%1“ setzt kein Steuerelement: ELEMENT=TEXT.</translation>
    </message>
    <message id="61314">
        <source>"%1" is no value for the control "%2".</source>
        <extracomment>CliCannotSet</extracomment>
        <translation>„%1“ ist kein Wert für das Steuerelement „%2“.</translation>
    </message>
    <message id="61315">
        <source>The form is closed; nothing can be pressed or set any more.</source>
        <extracomment>CliNoFormRuns</extracomment>
        <translation>Das Formular ist geschlossen; nichts lässt sich mehr drücken oder setzen.</translation>
    </message>
    <message id="61400">
        <source>&amp;First Record</source>
        <extracomment>FormFirst</extracomment>
        <translation>E&amp;rster Datensatz</translation>
    </message>
    <message id="61401">
        <source>First Record</source>
        <extracomment>FormFirstTip</extracomment>
        <translation>Erster Datensatz</translation>
    </message>
    <message id="61402">
        <source>&amp;Previous Record</source>
        <extracomment>FormPrevious</extracomment>
        <translation>&amp;Voriger Datensatz</translation>
    </message>
    <message id="61403">
        <source>Previous Record</source>
        <extracomment>FormPreviousTip</extracomment>
        <translation>Voriger Datensatz</translation>
    </message>
    <message id="61404">
        <source>&amp;Next Record</source>
        <extracomment>FormNext</extracomment>
        <translation>&amp;Nächster Datensatz</translation>
    </message>
    <message id="61405">
        <source>Next Record</source>
        <extracomment>FormNextTip</extracomment>
        <translation>Nächster Datensatz</translation>
    </message>
    <message id="61406">
        <source>&amp;Last Record</source>
        <extracomment>FormLast</extracomment>
        <translation>&amp;Letzter Datensatz</translation>
    </message>
    <message id="61407">
        <source>Last Record</source>
        <extracomment>FormLastTip</extracomment>
        <translation>Letzter Datensatz</translation>
    </message>
    <message id="61408">
        <source>&amp;Add New Record</source>
        <extracomment>FormAdd</extracomment>
        <translation>Datensatz &amp;hinzufügen</translation>
    </message>
    <message id="61409">
        <source>Add New Record</source>
        <extracomment>FormAddTip</extracomment>
        <translation>Neuen Datensatz hinzufügen</translation>
    </message>
    <message id="61410">
        <source>&amp;Delete Record</source>
        <extracomment>FormDelete</extracomment>
        <translation>Datensatz l&amp;öschen</translation>
    </message>
    <message id="61411">
        <source>Delete Record</source>
        <extracomment>FormDeleteTip</extracomment>
        <translation>Datensatz löschen</translation>
    </message>
    <message id="61412">
        <source>Scroll &amp;Up</source>
        <extracomment>FormScrollUp</extracomment>
        <translation>Nach &amp;oben rollen</translation>
    </message>
    <message id="61413">
        <source>Scroll Up</source>
        <extracomment>FormScrollUpTip</extracomment>
        <translation>Nach oben rollen</translation>
    </message>
    <message id="61414">
        <source>Scroll &amp;Down</source>
        <extracomment>FormScrollDown</extracomment>
        <translation>Nach &amp;unten rollen</translation>
    </message>
    <message id="61415">
        <source>Scroll Down</source>
        <extracomment>FormScrollDownTip</extracomment>
        <translation>Nach unten rollen</translation>
    </message>
    <message id="61416">
        <source>Form &amp;Scroll Bar</source>
        <extracomment>FormScrollBar</extracomment>
        <translation>&amp;Rollbalken</translation>
    </message>
    <message id="61417">
        <source>Form Scroll Bar</source>
        <extracomment>FormScrollBarTip</extracomment>
        <translation>Rollbalken des Formulars</translation>
    </message>
    <message id="61418">
        <source>&amp;Fit to Window</source>
        <extracomment>FormFit</extracomment>
        <translation>An Fenster an&amp;passen</translation>
    </message>
    <message id="61419">
        <source>Scale the form to the window; otherwise it has the size that it was designed in</source>
        <extracomment>FormFitTip</extracomment>
        <translation>Das Formular auf das Fenster vergrößern oder verkleinern; sonst hat es die Größe seines Entwurfs</translation>
    </message>
    <message id="61420">
        <source>D&amp;etail</source>
        <extracomment>FormDetail</extracomment>
        <translation>&amp;Einzelansicht</translation>
    </message>
    <message id="61421">
        <source>Change between the form and all fields of its record</source>
        <extracomment>FormDetailTip</extracomment>
        <translation>Zwischen dem Formular und allen Feldern seines Datensatzes wechseln</translation>
    </message>
    <message id="61422">
        <source>&amp;Save</source>
        <extracomment>FormSave</extracomment>
        <translation>&amp;Speichern</translation>
    </message>
    <message id="61423">
        <source>Press the first UPDATE button of the form</source>
        <extracomment>FormSaveTip</extracomment>
        <translation>Die erste UPDATE-Schaltfläche des Formulars drücken</translation>
    </message>
    <message id="61424">
        <source>This form has no UPDATE button</source>
        <extracomment>FormSaveNone</extracomment>
        <translation>Dieses Formular hat keine UPDATE-Schaltfläche</translation>
    </message>
    <message id="61425">
        <source>&amp;Recalculate</source>
        <extracomment>FormRecalculate</extracomment>
        <translation>Neu be&amp;rechnen</translation>
    </message>
    <message id="61426">
        <source>Read the records again, and compute sums and averages</source>
        <extracomment>FormRecalculateTip</extracomment>
        <translation>Die Datensätze neu lesen, Summen und Durchschnitte neu berechnen</translation>
    </message>
    <message id="61427">
        <source>&amp;Zoom</source>
        <extracomment>FormZoom</extracomment>
        <translation>&amp;Zoom</translation>
    </message>
    <message id="61428">
        <source>Copy the text of the control</source>
        <extracomment>FormCopyTip</extracomment>
        <translation>Den Text des Steuerelements kopieren</translation>
    </message>
    <message id="61429">
        <source>Put the copied text into the control</source>
        <extracomment>FormPasteTip</extracomment>
        <translation>Den kopierten Text in das Steuerelement einfügen</translation>
    </message>
    <message id="61430">
        <source>Filter &amp;By Field</source>
        <extracomment>FormFilterBy</extracomment>
        <translation>Nach &amp;Feld filtern</translation>
    </message>
    <message id="61431">
        <source>Keep the records that have the value of this control's field</source>
        <extracomment>FormFilterByTip</extracomment>
        <translation>Nur die Datensätze mit dem Wert dieses Feldes behalten</translation>
    </message>
    <message id="61432">
        <source>Filter E&amp;xcluding Field</source>
        <extracomment>FormFilterExcluding</extracomment>
        <translation>Feldwert aus&amp;schließen</translation>
    </message>
    <message id="61433">
        <source>Leave out the records that have the value of this control's field</source>
        <extracomment>FormFilterExcludingTip</extracomment>
        <translation>Die Datensätze mit dem Wert dieses Feldes ausblenden</translation>
    </message>
    <message id="61434">
        <source>Sor&amp;t Ascending</source>
        <extracomment>FormSortAscending</extracomment>
        <translation>&amp;Aufsteigend sortieren</translation>
    </message>
    <message id="61435">
        <source>Order the records by this control's field</source>
        <extracomment>FormSortAscendingTip</extracomment>
        <translation>Die Datensätze nach diesem Feld ordnen</translation>
    </message>
    <message id="61436">
        <source>Sort Des&amp;cending</source>
        <extracomment>FormSortDescending</extracomment>
        <translation>A&amp;bsteigend sortieren</translation>
    </message>
    <message id="61437">
        <source>Order the records by this control's field, the last first</source>
        <extracomment>FormSortDescendingTip</extracomment>
        <translation>Die Datensätze nach diesem Feld ordnen, die letzten zuerst</translation>
    </message>
    <message id="61438">
        <source>Change how running forms work</source>
        <extracomment>FormOptionsTip</extracomment>
        <translation>Ändern, wie laufende Formulare arbeiten</translation>
    </message>
    <message id="61439">
        <source>&amp;Edit Form</source>
        <extracomment>FormEdit</extracomment>
        <translation>For&amp;mular bearbeiten</translation>
    </message>
    <message id="61440">
        <source>Open this form in the form maker</source>
        <extracomment>FormEditTip</extracomment>
        <translation>Dieses Formular im Entwurf öffnen</translation>
    </message>
    <message id="61441">
        <source>Close this form</source>
        <extracomment>FormCloseTip</extracomment>
        <translation>Dieses Formular schließen</translation>
    </message>
    <message id="61442">
        <source>&amp;Record</source>
        <extracomment>FormMenuRecord</extracomment>
        <translation>Da&amp;tensatz</translation>
    </message>
    <message id="61443">
        <source>&amp;View</source>
        <extracomment>FormMenuView</extracomment>
        <translation>&amp;Ansicht</translation>
    </message>
    <message id="61444">
        <source>Edit the text in a large box</source>
        <extracomment>LongTextTip</extracomment>
        <translation>Den Text in einem großen Feld bearbeiten</translation>
    </message>
    <message id="61445">
        <source>Form View Options</source>
        <extracomment>FormOptionsTitle</extracomment>
        <translation>Optionen der Formularansicht</translation>
    </message>
    <message id="61446">
        <source>Ask before changes are &amp;ignored.</source>
        <extracomment>FormOptionConfirmSave</extracomment>
        <translation>Fragen, bevor Änderungen ver&amp;worfen werden.</translation>
    </message>
    <message id="61447">
        <source>Offer to &amp;save them there.</source>
        <extracomment>FormOptionThirdAnswer</extracomment>
        <translation>Dort auch &amp;Speichern anbieten.</translation>
    </message>
    <message id="61448">
        <source>&amp;Update aggregates after each change.</source>
        <extracomment>FormOptionAggregate</extracomment>
        <translation>&amp;Summen nach jeder Änderung neu berechnen.</translation>
    </message>
    <message id="61449">
        <source>&amp;Fit forms to the window.</source>
        <extracomment>FormOptionFit</extracomment>
        <translation>&amp;Formulare an das Fenster anpassen.</translation>
    </message>
    <message id="61450">
        <source>S&amp;croll Up and Scroll Down move by</source>
        <extracomment>FormOptionScroll</extracomment>
        <translation>&amp;Rollen bewegt das Formular um</translation>
    </message>
    <message id="61451">
        <source>pixels.</source>
        <extracomment>FormOptionPixels</extracomment>
        <translation>Pixel.</translation>
    </message>
    <message id="61452">
        <source>Sort the &amp;list of records by tapping a column header.</source>
        <extracomment>FormOptionSort</extracomment>
        <translation>Tippen auf den Spaltenkopf sortiert die &amp;Liste.</translation>
    </message>
    <message id="61453">
        <source>Runs the selected form</source>
        <extracomment>TipRunForm</extracomment>
        <translation>Führt das ausgewählte Formular aus</translation>
    </message>
    <message id="61454">
        <source>&amp;List</source>
        <extracomment>FormList</extracomment>
        <translation>&amp;Liste</translation>
    </message>
    <message id="61455">
        <source>Change between the form and the list of its records</source>
        <extracomment>FormListTip</extracomment>
        <translation>Zwischen dem Formular und der Liste seiner Datensätze wechseln</translation>
    </message>
    <message id="62000">
        <source>The record has been deleted meanwhile.</source>
        <extracomment>RecordDeletedMeanwhile</extracomment>
        <translation>Der Datensatz wurde inzwischen gelöscht.</translation>
    </message>
    <message id="62002">
        <source>The record has been changed meanwhile.
%1

Keep yours?</source>
        <extracomment>KeepMineQuestion</extracomment>
        <translation>Der Datensatz wurde inzwischen geändert.
%1

Ihre Änderung behalten?</translation>
    </message>
    <message id="62003">
        <source>
%1
Now: %2
Yours: %3</source>
        <extracomment>KeepMineField</extracomment>
        <translation>
%1
Jetzt: %2
Ihr Wert: %3</translation>
    </message>
    <message id="62004">
        <source>The record has been changed meanwhile.
%1

Delete it all the same?</source>
        <extracomment>DeleteChangedQuestion</extracomment>
        <translation>Der Datensatz wurde inzwischen geändert.
%1

Trotzdem löschen?</translation>
    </message>
    <message id="62005">
        <source>
%1
Now: %2
Before: %3</source>
        <extracomment>ChangedField</extracomment>
        <translation>
%1
Jetzt: %2
Vorher: %3</translation>
    </message>
    <message id="62006">
        <source>Taking changes back …</source>
        <extracomment>UndoingChanges</extracomment>
        <translation>Änderungen werden zurückgenommen …</translation>
    </message>
    <message id="62007" numerus="yes">
        <source>%1 records have been changed or deleted meanwhile, and were left as they are.</source>
        <extracomment>LeftAlone</extracomment>
        <translation>
            <numerusform>%1 Datensatz wurde inzwischen geändert oder gelöscht und blieb, wie er war.</numerusform>
            <numerusform>%1 Datensätze wurden inzwischen geändert oder gelöscht und blieben, wie sie waren.</numerusform>
        </translation>
    </message>
    <message id="62009">
        <source>There are %1 records now, not %2.
Go on with all of them?</source>
        <extracomment>ResultGrewQuestion</extracomment>
        <translation>Es sind jetzt %1 Datensätze, nicht %2.
Mit allen fortfahren?</translation>
    </message>
    <message id="62010">
        <source>There is no record to save to. Add what you typed as a new record?</source>
        <extracomment>SaveAsNewRecord</extracomment>
        <translation>Es gibt keinen Datensatz zum Speichern. Das Getippte als neuen Datensatz hinzufügen?</translation>
    </message>
    <message id="62013">
        <source>Red&amp;o</source>
        <extracomment>ActionRedo</extracomment>
        <translation>&amp;Wiederholen</translation>
    </message>
    <message id="62014">
        <source>Make the change again that was taken back last</source>
        <extracomment>ActionRedoTip</extracomment>
        <translation>Die zuletzt zurückgenommene Änderung noch einmal ausführen</translation>
    </message>
    <message id="62015">
        <source>Take back the last change that this form has saved</source>
        <extracomment>FormUndoTip</extracomment>
        <translation>Die letzte Änderung zurücknehmen, die dieses Formular gespeichert hat</translation>
    </message>
    <message id="62016">
        <source>&amp;Undo Change</source>
        <extracomment>FormUndo</extracomment>
        <translation>Änderung &amp;zurücknehmen</translation>
    </message>
    <message id="62017">
        <source>Undo can take this back.</source>
        <extracomment>UndoBringsBack</extracomment>
        <translation>„Rückgängig“ kann dies zurücknehmen.</translation>
    </message>
    <message id="62018">
        <source>Undo cannot take this back.</source>
        <extracomment>UndoCannotBringBack</extracomment>
        <translation>„Rückgängig“ kann dies nicht zurücknehmen.</translation>
    </message>
    <message id="62019">
        <source>New Record</source>
        <extracomment>RequiredValueTitle</extracomment>
        <translation>Neuer Datensatz</translation>
    </message>
    <message id="62020">
        <source>"%1" must have a value:</source>
        <extracomment>RequiredValue</extracomment>
        <translation>„%1“ braucht einen Wert:</translation>
    </message>
    <message id="62200">
        <source>"%1" is a view</source>
        <extracomment>ViewIsReadOnly</extracomment>
        <translation>„%1“ ist eine Sicht</translation>
    </message>
    <message id="62201">
        <source>the records of "%1" have no row id to be found by</source>
        <extracomment>TableHasNoRowIds</extracomment>
        <translation>die Datensätze von „%1“ haben keine Zeilennummer, an der sie zu finden wären</translation>
    </message>
    <message id="62202">
        <source>a record of a DISTINCT result may stand for several</source>
        <extracomment>DistinctIsReadOnly</extracomment>
        <translation>ein Datensatz eines DISTINCT-Ergebnisses kann für mehrere stehen</translation>
    </message>
    <message id="62203">
        <source>groups and totals cannot be changed</source>
        <extracomment>GroupsAreReadOnly</extracomment>
        <translation>Gruppen und Summen lassen sich nicht ändern</translation>
    </message>
    <message id="62204">
        <source>every column of the result is computed</source>
        <extracomment>ComputedIsReadOnly</extracomment>
        <translation>alle Spalten des Ergebnisses sind berechnet</translation>
    </message>
    <message id="62205">
        <source>the columns of the result come from several tables</source>
        <extracomment>JoinIsReadOnly</extracomment>
        <translation>die Spalten des Ergebnisses stammen aus mehreren Tabellen</translation>
    </message>
    <message id="62206">
        <source>the result was opened for reading</source>
        <extracomment>OpenedForReading</extracomment>
        <translation>das Ergebnis wurde nur zum Lesen geöffnet</translation>
    </message>
    <message id="62207">
        <source>the column "%1" is computed</source>
        <extracomment>ColumnIsComputed</extracomment>
        <translation>die Spalte „%1“ ist berechnet</translation>
    </message>
    <message id="62208">
        <source>"%1" is the name of the table that ties the database to its forms and queries</source>
        <extracomment>StampTableIsGuarded</extracomment>
        <translation>„%1“ heißt die Tabelle, die die Datenbank mit ihren Formularen und Abfragen verbindet</translation>
    </message>
    <message id="62400">
        <source>only a SELECT can be read here</source>
        <extracomment>OnlySelectIsRead</extracomment>
        <translation>hier lässt sich nur ein SELECT lesen</translation>
    </message>
    <message id="62401">
        <source>The query "%1" does not show records, it runs this statement:

%2

Run it?</source>
        <extracomment>RunQueryThatChanges</extracomment>
        <translation>Die Abfrage „%1“ zeigt keine Datensätze, sondern führt diese Anweisung aus:

%2

Ausführen?</translation>
    </message>
    <message id="62402">
        <source>The query "%1" is not a SELECT; --yes runs it.</source>
        <extracomment>CliQueryChanges</extracomment>
        <translation>Die Abfrage „%1“ ist kein SELECT; --yes führt sie aus.</translation>
    </message>
    <message id="62403">
        <source>mirel-cli [--home DIR] %1 COMMAND ARGUMENTS [OPTIONS]</source>
        <extracomment>CliGroupUsage</extracomment>
        <translation>mirel-cli [--home ORDNER] %1 BEFEHL ARGUMENTE [OPTIONEN]</translation>
    </message>
    <message id="62404">
        <source>Which command of "%1"?</source>
        <extracomment>CliGroupCommandMissing</extracomment>
        <translation>Welcher Befehl von „%1“?</translation>
    </message>
    <message id="62405">
        <source>Line %1 is not UTF-8: the script ends before it.</source>
        <extracomment>CliNotUtf8Line</extracomment>
        <translation>Zeile %1 ist kein UTF-8: Das Skript endet davor.</translation>
    </message>
    <message id="62406">
        <source>Argument %1 is not UTF-8.</source>
        <extracomment>CliNotUtf8Argument</extracomment>
        <translation>Argument %1 ist kein UTF-8.</translation>
    </message>
    <message id="62407">
        <source>A query needs a name.</source>
        <extracomment>CliQueryWithoutName</extracomment>
        <translation>Eine Abfrage braucht einen Namen.</translation>
    </message>
    <message id="62408">
        <source>A form needs a name.</source>
        <extracomment>CliFormWithoutName</extracomment>
        <translation>Ein Formular braucht einen Namen.</translation>
    </message>
    <message id="62409">
        <source>any text</source>
        <extracomment>SettingTakesText</extracomment>
        <translation>beliebiger Text</translation>
    </message>
    <message id="62410">
        <source>a whole number</source>
        <extracomment>SettingTakesInteger</extracomment>
        <translation>eine ganze Zahl</translation>
    </message>
    <message id="62411">
        <source>five colors, such as (0),(16777215),(0),(0),(12632256)</source>
        <extracomment>SettingTakesColors</extracomment>
        <translation>fünf Farben, etwa (0),(16777215),(0),(0),(12632256)</translation>
    </message>
    <message id="62412">
        <source>a font: (italic,bold,strikeout,underline,size,"face"), such as (0,1,0,0,9,"Tahoma")</source>
        <extracomment>SettingTakesFont</extracomment>
        <translation>eine Schrift: (kursiv,fett,durchgestrichen,unterstrichen,Größe,"Name"), etwa (0,1,0,0,9,"Tahoma")</translation>
    </message>
    <message id="62413">
        <source>two words, such as Yes/No</source>
        <extracomment>SettingTakesWords</extracomment>
        <translation>zwei Wörter, etwa Ja/Nein</translation>
    </message>
    <message id="62414">
        <source>There is no next record.</source>
        <extracomment>NoNextRecord</extracomment>
        <translation>Es gibt keinen nächsten Datensatz.</translation>
    </message>
    <message id="62415">
        <source>There is no previous record.</source>
        <extracomment>NoPreviousRecord</extracomment>
        <translation>Es gibt keinen vorigen Datensatz.</translation>
    </message>
    <message id="62600">
        <source>Mirel Create Table</source>
        <extracomment>DesignCreateTitle</extracomment>
        <translation>Mirel – Tabelle anlegen</translation>
    </message>
    <message id="62601">
        <source>Mirel Edit Table</source>
        <extracomment>DesignEditTitle</extracomment>
        <translation>Mirel – Tabelle bearbeiten</translation>
    </message>
    <message id="62602">
        <source>Create table "%1" ?</source>
        <extracomment>DesignCreateQuestion</extracomment>
        <translation>Die Tabelle „%1“ anlegen?</translation>
    </message>
    <message id="62603">
        <source>Table "%1" created.</source>
        <extracomment>DesignTableCreated</extracomment>
        <translation>Tabelle „%1“ angelegt.</translation>
    </message>
    <message id="62604">
        <source>Table "%1" renamed to "%2".</source>
        <extracomment>DesignTableRenamed</extracomment>
        <translation>Tabelle „%1“ in „%2“ umbenannt.</translation>
    </message>
    <message id="62605" numerus="yes">
        <source>Are you sure you want to drop this field "%1"?
It holds %2 values, which go with it.</source>
        <extracomment>DesignDropField</extracomment>
        <translation>
            <numerusform>Möchten Sie das Feld „%1“ wirklich löschen?
Es enthält %2 Wert, der mit ihm verloren geht.</numerusform>
            <numerusform>Möchten Sie das Feld „%1“ wirklich löschen?
Es enthält %2 Werte, die mit ihm verloren gehen.</numerusform>
        </translation>
    </message>
    <message id="62606" numerus="yes">
        <source>Are you sure you want to drop this table "%1"?
It holds %2 records, which go with it.</source>
        <extracomment>DesignDropTable</extracomment>
        <translation>
            <numerusform>Möchten Sie die Tabelle „%1“ wirklich löschen?
Sie enthält %2 Datensatz, der mit ihr verloren geht.</numerusform>
            <numerusform>Möchten Sie die Tabelle „%1“ wirklich löschen?
Sie enthält %2 Datensätze, die mit ihr verloren gehen.</numerusform>
        </translation>
    </message>
    <message id="62607" numerus="yes">
        <source>Change the field "%1" from %2 to %3?
Its %4 values keep their meaning.</source>
        <extracomment>DesignConvertSame</extracomment>
        <translation>
            <numerusform>Das Feld „%1“ von %2 in %3 ändern?
Sein %4 Wert behält seine Bedeutung.</numerusform>
            <numerusform>Das Feld „%1“ von %2 in %3 ändern?
Seine %4 Werte behalten ihre Bedeutung.</numerusform>
        </translation>
    </message>
    <message id="62608">
        <source>Change the field "%1" from %2 to %3?
%5 of its %4 value(s) will read differently, and cannot be got back.</source>
        <extracomment>DesignConvertAltered</extracomment>
        <translation>Das Feld „%1“ von %2 in %3 ändern?
%5 seiner %4 Werte werden anders lauten und sind nicht wiederherzustellen.</translation>
    </message>
    <message id="62609">
        <source>%1 of the %2 value(s) of "%4" in "%3" cannot become %5; the first is "%6".
The table stays as it is.</source>
        <extracomment>DesignValuesUnfit</extracomment>
        <translation>%1 von %2 Werten in „%4“ der Tabelle „%3“ können nicht %5 werden; der erste ist „%6“.
Die Tabelle bleibt, wie sie ist.</translation>
    </message>
    <message id="62610">
        <source>Looking at the values of "%1" …</source>
        <extracomment>DesignLooking</extracomment>
        <translation>Die Werte von „%1“ werden durchgesehen …</translation>
    </message>
    <message id="62611">
        <source>Please enter a name for the table.</source>
        <extracomment>DesignTableNameMissing</extracomment>
        <translation>Bitte geben Sie einen Namen für die Tabelle ein.</translation>
    </message>
    <message id="62612">
        <source>Please enter a name for the field.</source>
        <extracomment>DesignFieldNameMissing</extracomment>
        <translation>Bitte geben Sie einen Namen für das Feld ein.</translation>
    </message>
    <message id="62613">
        <source>"%1" cannot be a name: it must be typed without square brackets and without blanks at its ends.</source>
        <extracomment>DesignNameUnusable</extracomment>
        <translation>„%1“ kann kein Name sein: Er darf keine eckigen Klammern und an den Enden keine Leerzeichen haben.</translation>
    </message>
    <message id="62614">
        <source>The name "%1" is too long: %2 characters are the most.</source>
        <extracomment>DesignNameTooLong</extracomment>
        <translation>Der Name „%1“ ist zu lang: Höchstens %2 Zeichen sind möglich.</translation>
    </message>
    <message id="62615">
        <source>There is a field "%1" already.</source>
        <extracomment>DesignFieldTaken</extracomment>
        <translation>Ein Feld „%1“ gibt es schon.</translation>
    </message>
    <message id="62616">
        <source>There is a table "%1" already.</source>
        <extracomment>DesignTableTaken</extracomment>
        <translation>Eine Tabelle „%1“ gibt es schon.</translation>
    </message>
    <message id="62617">
        <source>A table needs a field.</source>
        <extracomment>DesignNoFields</extracomment>
        <translation>Eine Tabelle braucht ein Feld.</translation>
    </message>
    <message id="62618">
        <source>The table "%1" has been changed meanwhile. This is how it is now; please try again.</source>
        <extracomment>DesignStale</extracomment>
        <translation>Die Tabelle „%1“ wurde inzwischen geändert. So ist sie jetzt; bitte versuchen Sie es noch einmal.</translation>
    </message>
    <message id="62619">
        <source>The table "%1" is not there any more.</source>
        <extracomment>DesignGone</extracomment>
        <translation>Die Tabelle „%1“ ist nicht mehr da.</translation>
    </message>
    <message id="62620">
        <source>"%1" is the only field of the table. Drop the table instead.</source>
        <extracomment>DesignLastField</extracomment>
        <translation>„%1“ ist das einzige Feld der Tabelle. Löschen Sie stattdessen die Tabelle.</translation>
    </message>
    <message id="62621">
        <source>Are you sure you want to drop this field "%1"?</source>
        <extracomment>DesignDropEmptyField</extracomment>
        <translation>Möchten Sie das Feld „%1“ wirklich löschen?</translation>
    </message>
    <message id="62630">
        <source>"%1" is used here:
%2
Shall all of these say "%3" from now on?</source>
        <extracomment>RenameMendQuestion</extracomment>
        <translation>„%1“ wird hier verwendet:
%2
Soll dort überall künftig „%3“ stehen?</translation>
    </message>
    <message id="62631">
        <source>&amp;Rename Only</source>
        <extracomment>RenameAlone</extracomment>
        <translation>&amp;Nur umbenennen</translation>
    </message>
    <message id="62632" numerus="yes">
        <source>Form "%1": %2 places</source>
        <extracomment>RenameUseInForm</extracomment>
        <translation>
            <numerusform>Formular „%1“: %2 Stelle</numerusform>
            <numerusform>Formular „%1“: %2 Stellen</numerusform>
        </translation>
    </message>
    <message id="62633" numerus="yes">
        <source>Query "%1": %2 places</source>
        <extracomment>RenameUseInQuery</extracomment>
        <translation>
            <numerusform>Abfrage „%1“: %2 Stelle</numerusform>
            <numerusform>Abfrage „%1“: %2 Stellen</numerusform>
        </translation>
    </message>
    <message id="62634">
        <source>Favorites</source>
        <extracomment>RenameUseInFavorites</extracomment>
        <translation>Favoriten</translation>
    </message>
    <message id="62635">
        <source>… and %1 more</source>
        <extracomment>RenameMoreUses</extracomment>
        <translation>… und %1 weitere</translation>
    </message>
    <message id="62636">
        <source>Please enter a name for the form.</source>
        <extracomment>RenameFormNameMissing</extracomment>
        <translation>Bitte geben Sie einen Namen für das Formular ein.</translation>
    </message>
    <message id="62637">
        <source>Please enter a name for the query.</source>
        <extracomment>RenameQueryNameMissing</extracomment>
        <translation>Bitte geben Sie einen Namen für die Abfrage ein.</translation>
    </message>
    <message id="62638">
        <source>The name "%1" is taken.</source>
        <extracomment>RenameTaken</extracomment>
        <translation>Der Name „%1“ ist vergeben.</translation>
    </message>
    <message id="62639">
        <source>"%1" is not there any more.</source>
        <extracomment>RenameGone</extracomment>
        <translation>„%1“ ist nicht mehr da.</translation>
    </message>
    <message id="62640">
        <source>Re&amp;name</source>
        <extracomment>CommandRename</extracomment>
        <translation>U&amp;mbenennen</translation>
    </message>
    <message id="62641">
        <source>Gives the selected entry another name, and mends what refers to it where that is wanted</source>
        <extracomment>TipRename</extracomment>
        <translation>Gibt dem ausgewählten Eintrag einen anderen Namen und passt auf Wunsch an, was auf ihn verweist</translation>
    </message>
    <message id="62642">
        <source>New name of "%1":</source>
        <extracomment>RenameLabel</extracomment>
        <translation>Neuer Name von „%1“:</translation>
    </message>
    <message id="62643">
        <source>Rename</source>
        <extracomment>RenameTitle</extracomment>
        <translation>Umbenennen</translation>
    </message>
    <message id="62650">
        <source>The list of fields cannot be read: %1</source>
        <extracomment>DesignListUnreadable</extracomment>
        <translation>Die Feldliste lässt sich nicht lesen: %1</translation>
    </message>
    <message id="62651">
        <source>it is no JSON list</source>
        <extracomment>DesignListNotAList</extracomment>
        <translation>sie ist keine JSON-Liste</translation>
    </message>
    <message id="62652">
        <source>it is too long</source>
        <extracomment>DesignListTooLong</extracomment>
        <translation>sie ist zu lang</translation>
    </message>
    <message id="62653">
        <source>[%1].%2 is not understood</source>
        <extracomment>DesignListBadMember</extracomment>
        <translation>[%1].%2 ist nicht verständlich</translation>
    </message>
    <message id="62654">
        <source>[%1] is no field</source>
        <extracomment>DesignListBadField</extracomment>
        <translation>[%1] ist kein Feld</translation>
    </message>
    <message id="62655">
        <source>The table "%1" has no field "%2" that "%3" was.</source>
        <extracomment>DesignListNoSuchField</extracomment>
        <translation>Die Tabelle „%1“ hat kein Feld „%2“, aus dem „%3“ werden könnte.</translation>
    </message>
    <message id="62656">
        <source>Only one field can be what "%1" was.</source>
        <extracomment>DesignListFieldTwice</extracomment>
        <translation>Nur ein Feld kann aus „%1“ entstehen.</translation>
    </message>
    <message id="62657">
        <source>"%1" cannot be read: %2</source>
        <extracomment>DesignFileUnreadable</extracomment>
        <translation>„%1“ lässt sich nicht lesen: %2</translation>
    </message>
    <message id="62658">
        <source>These fields are not in the list and would go; --yes drops them: %1</source>
        <extracomment>DesignNeedsYes</extracomment>
        <translation>Diese Felder stehen nicht in der Liste und würden entfallen; --yes löscht sie: %1</translation>
    </message>
    <message id="62659">
        <source>The table is new: "%2" cannot have been "%1".</source>
        <extracomment>DesignListNoTable</extracomment>
        <translation>Die Tabelle ist neu: „%2“ kann nicht „%1“ gewesen sein.</translation>
    </message>
    <message id="62660">
        <source>&amp;Table name:</source>
        <extracomment>DesignTableName</extracomment>
        <translation>&amp;Tabellenname:</translation>
    </message>
    <message id="62661">
        <source>&amp;Rename</source>
        <extracomment>DesignRenameTable</extracomment>
        <translation>Um&amp;benennen</translation>
    </message>
    <message id="62662">
        <source>Fields of the table</source>
        <extracomment>DesignFields</extracomment>
        <translation>Felder der Tabelle</translation>
    </message>
    <message id="62663">
        <source>Name</source>
        <extracomment>DesignColumnName</extracomment>
        <translation>Name</translation>
    </message>
    <message id="62664">
        <source>Type</source>
        <extracomment>DesignColumnType</extracomment>
        <translation>Typ</translation>
    </message>
    <message id="62665">
        <source>Size</source>
        <extracomment>DesignColumnSize</extracomment>
        <translation>Größe</translation>
    </message>
    <message id="62666">
        <source>Indexed</source>
        <extracomment>DesignColumnIndexed</extracomment>
        <translation>Index</translation>
    </message>
    <message id="62667">
        <source>First values</source>
        <extracomment>DesignColumnValues</extracomment>
        <translation>Erste Werte</translation>
    </message>
    <message id="62668">
        <source>No fields yet. New Field makes one.</source>
        <extracomment>DesignEmpty</extracomment>
        <translation>Noch keine Felder. „Neues Feld“ legt eines an.</translation>
    </message>
    <message id="62669">
        <source>&amp;Create</source>
        <extracomment>DesignCreate</extracomment>
        <translation>&amp;Anlegen</translation>
    </message>
    <message id="62670">
        <source>Drop Ta&amp;ble</source>
        <extracomment>DesignDropTableCommand</extracomment>
        <translation>Tabelle &amp;löschen</translation>
    </message>
    <message id="62671">
        <source>&amp;New Field…</source>
        <extracomment>DesignNewField</extracomment>
        <translation>&amp;Neues Feld…</translation>
    </message>
    <message id="62672">
        <source>&amp;Edit Field…</source>
        <extracomment>DesignEditField</extracomment>
        <translation>Feld b&amp;earbeiten…</translation>
    </message>
    <message id="62673">
        <source>C&amp;hange Type…</source>
        <extracomment>DesignChangeType</extracomment>
        <translation>Ty&amp;p ändern…</translation>
    </message>
    <message id="62674">
        <source>&amp;Drop Field</source>
        <extracomment>DesignDropFieldCommand</extracomment>
        <translation>Fel&amp;d löschen</translation>
    </message>
    <message id="62675">
        <source>Move &amp;Up</source>
        <extracomment>DesignMoveUp</extracomment>
        <translation>Nach &amp;oben</translation>
    </message>
    <message id="62676">
        <source>Move Do&amp;wn</source>
        <extracomment>DesignMoveDown</extracomment>
        <translation>Nach &amp;unten</translation>
    </message>
    <message id="62677">
        <source>Add a field behind the last one (Ins)</source>
        <extracomment>TipDesignNewField</extracomment>
        <translation>Ein Feld hinter dem letzten hinzufügen (Einfg)</translation>
    </message>
    <message id="62678">
        <source>Change the name or the index of the selected field (F2)</source>
        <extracomment>TipDesignEditField</extracomment>
        <translation>Namen oder Index des ausgewählten Feldes ändern (F2)</translation>
    </message>
    <message id="62679">
        <source>Change the type or the size of the selected field; its values are converted (Ctrl+T)</source>
        <extracomment>TipDesignChangeType</extracomment>
        <translation>Typ oder Größe des ausgewählten Feldes ändern; seine Werte werden umgewandelt (Strg+T)</translation>
    </message>
    <message id="62680">
        <source>Remove the selected field with its values (Del)</source>
        <extracomment>TipDesignDropField</extracomment>
        <translation>Das ausgewählte Feld mit seinen Werten entfernen (Entf)</translation>
    </message>
    <message id="62681">
        <source>Move the selected field up (Ctrl+Up)</source>
        <extracomment>TipDesignMoveUp</extracomment>
        <translation>Das ausgewählte Feld nach oben schieben (Strg+Auf)</translation>
    </message>
    <message id="62682">
        <source>Move the selected field down (Ctrl+Down)</source>
        <extracomment>TipDesignMoveDown</extracomment>
        <translation>Das ausgewählte Feld nach unten schieben (Strg+Ab)</translation>
    </message>
    <message id="62683">
        <source>New Field</source>
        <extracomment>DesignNewFieldTitle</extracomment>
        <translation>Neues Feld</translation>
    </message>
    <message id="62684">
        <source>Edit Field</source>
        <extracomment>DesignEditFieldTitle</extracomment>
        <translation>Feld bearbeiten</translation>
    </message>
    <message id="62685">
        <source>Change Type</source>
        <extracomment>DesignChangeTypeTitle</extracomment>
        <translation>Typ ändern</translation>
    </message>
    <message id="62686">
        <source>&amp;Name:</source>
        <extracomment>DesignFieldName</extracomment>
        <translation>&amp;Name:</translation>
    </message>
    <message id="62687">
        <source>&amp;Type:</source>
        <extracomment>DesignFieldType</extracomment>
        <translation>&amp;Typ:</translation>
    </message>
    <message id="62688">
        <source>&amp;Size:</source>
        <extracomment>DesignFieldSize</extracomment>
        <translation>&amp;Größe:</translation>
    </message>
    <message id="62689">
        <source>&amp;Indexed:</source>
        <extracomment>DesignFieldIndexed</extracomment>
        <translation>&amp;Index:</translation>
    </message>
    <message id="62900">
        <source>Create and Edit a Query</source>
        <extracomment>QueryTitle</extracomment>
        <translation>Abfrage erstellen und bearbeiten</translation>
    </message>
    <message id="62901">
        <source>&amp;Name:</source>
        <extracomment>QueryName</extracomment>
        <translation>&amp;Name:</translation>
    </message>
    <message id="62902">
        <source>without a name it is only shown</source>
        <extracomment>QueryNameOffered</extracomment>
        <translation>ohne Namen wird sie nur gezeigt</translation>
    </message>
    <message id="62903">
        <source>S&amp;QL</source>
        <extracomment>QueryTabSql</extracomment>
        <translation>S&amp;QL</translation>
    </message>
    <message id="62904">
        <source>&amp;Builder</source>
        <extracomment>QueryTabBuilder</extracomment>
        <translation>&amp;Bausteine</translation>
    </message>
    <message id="62905">
        <source>&amp;Diagram</source>
        <extracomment>QueryTabDiagram</extracomment>
        <translation>&amp;Diagramm</translation>
    </message>
    <message id="62906">
        <source>S&amp;QL Command:</source>
        <extracomment>QuerySqlCommand</extracomment>
        <translation>S&amp;QL-Anweisung:</translation>
    </message>
    <message id="62907">
        <source>SELECT</source>
        <extracomment>ClauseSelect</extracomment>
        <translation>SELECT</translation>
    </message>
    <message id="62908">
        <source>FROM</source>
        <extracomment>ClauseFrom</extracomment>
        <translation>FROM</translation>
    </message>
    <message id="62909">
        <source>I.JOIN</source>
        <extracomment>ClauseJoin</extracomment>
        <translation>I.JOIN</translation>
    </message>
    <message id="62910">
        <source>ON</source>
        <extracomment>ClauseOn</extracomment>
        <translation>ON</translation>
    </message>
    <message id="62911">
        <source>WHERE</source>
        <extracomment>ClauseWhere</extracomment>
        <translation>WHERE</translation>
    </message>
    <message id="62912">
        <source>ORDER BY</source>
        <extracomment>ClauseOrder</extracomment>
        <translation>ORDER BY</translation>
    </message>
    <message id="62913">
        <source>Show the chosen field: adds it to the SELECT clause</source>
        <extracomment>ClauseSelectTip</extracomment>
        <translation>Das gewählte Feld zeigen: fügt es in SELECT ein</translation>
    </message>
    <message id="62914">
        <source>Read from the chosen table: adds it to the FROM clause</source>
        <extracomment>ClauseFromTip</extracomment>
        <translation>Aus der gewählten Tabelle lesen: fügt sie in FROM ein</translation>
    </message>
    <message id="62915">
        <source>Join the chosen table: proposes ON where both tables have a field of the same name and type</source>
        <extracomment>ClauseJoinTip</extracomment>
        <translation>Die gewählte Tabelle verknüpfen: schlägt ON vor, wo beide Tabellen ein Feld gleichen Namens und Typs haben</translation>
    </message>
    <message id="62916">
        <source>Make a condition on the chosen field: adds it to the WHERE clause</source>
        <extracomment>ClauseWhereTip</extracomment>
        <translation>Eine Bedingung für das gewählte Feld: fügt sie in WHERE ein</translation>
    </message>
    <message id="62917">
        <source>Order by the chosen field: adds it to the ORDER BY clause</source>
        <extracomment>ClauseOrderTip</extracomment>
        <translation>Nach dem gewählten Feld ordnen: fügt es in ORDER BY ein</translation>
    </message>
    <message id="62918">
        <source>&amp;Tables:</source>
        <extracomment>QueryTables</extracomment>
        <translation>&amp;Tabellen:</translation>
    </message>
    <message id="62919">
        <source>Table &amp;Fields:</source>
        <extracomment>QueryFields</extracomment>
        <translation>Tabellen&amp;felder:</translation>
    </message>
    <message id="62921">
        <source>&amp;Run</source>
        <extracomment>QueryRun</extracomment>
        <translation>&amp;Ausführen</translation>
    </message>
    <message id="62922">
        <source>Show the records of the statement as it is now, without saving it (F5)</source>
        <extracomment>QueryRunTip</extracomment>
        <translation>Die Datensätze der Anweisung zeigen, wie sie jetzt ist, ohne zu speichern (F5)</translation>
    </message>
    <message id="62923">
        <source>&amp;Save</source>
        <extracomment>QuerySave</extracomment>
        <translation>&amp;Speichern</translation>
    </message>
    <message id="62924">
        <source>Save the query and close (Ctrl+S)</source>
        <extracomment>QuerySaveTip</extracomment>
        <translation>Die Abfrage speichern und schließen (Strg+S)</translation>
    </message>
    <message id="62925">
        <source>Last Statements</source>
        <extracomment>QueryRecent</extracomment>
        <translation>Letzte Anweisungen</translation>
    </message>
    <message id="62926">
        <source>Take one of the statements that ran last</source>
        <extracomment>QueryRecentTip</extracomment>
        <translation>Eine der zuletzt ausgeführten Anweisungen nehmen</translation>
    </message>
    <message id="62927">
        <source>No statement has run yet</source>
        <extracomment>QueryRecentNone</extracomment>
        <translation>Noch keine Anweisung wurde ausgeführt</translation>
    </message>
    <message id="62928">
        <source>%1 …</source>
        <extracomment>QueryFixedSelect</extracomment>
        <translation>%1 …</translation>
    </message>
    <message id="62929">
        <source>There is no statement yet. Write one, or pick a table.</source>
        <extracomment>QueryNoStatement</extracomment>
        <translation>Noch gibt es keine Anweisung. Schreiben Sie eine oder wählen Sie eine Tabelle.</translation>
    </message>
    <message id="62930">
        <source>Result of the Query</source>
        <extracomment>QueryRunTitle</extracomment>
        <translation>Ergebnis der Abfrage</translation>
    </message>
    <message id="62931">
        <source>The statement has run. It yields no records.</source>
        <extracomment>QueryRan</extracomment>
        <translation>Die Anweisung wurde ausgeführt. Sie liefert keine Datensätze.</translation>
    </message>
    <message id="62933">
        <source>The Builder shows SELECT statements only. This one stays on the SQL tab.</source>
        <extracomment>BuilderOnlySelect</extracomment>
        <translation>Die Bausteine zeigen nur SELECT-Anweisungen. Diese bleibt auf der Seite SQL.</translation>
    </message>
    <message id="62934">
        <source>The Builder has no box for %1, so this statement stays on the SQL tab.</source>
        <extracomment>BuilderHasNoBox</extracomment>
        <translation>Die Bausteine haben kein Feld für %1, daher bleibt diese Anweisung auf der Seite SQL.</translation>
    </message>
    <message id="62935">
        <source>The Builder would lose a part of this statement, so it stays on the SQL tab.</source>
        <extracomment>BuilderWouldLose</extracomment>
        <translation>Die Bausteine würden einen Teil dieser Anweisung verlieren, daher bleibt sie auf der Seite SQL.</translation>
    </message>
    <message id="62936">
        <source>The Diagram shows SELECT statements only. This one stays on the SQL tab.</source>
        <extracomment>DiagramOnlySelect</extracomment>
        <translation>Das Diagramm zeigt nur SELECT-Anweisungen. Diese bleibt auf der Seite SQL.</translation>
    </message>
    <message id="62937">
        <source>The Diagram cannot draw all of this statement, so it stays on the SQL tab.</source>
        <extracomment>DiagramCannotDraw</extracomment>
        <translation>Das Diagramm kann nicht alles von dieser Anweisung zeichnen, daher bleibt sie auf der Seite SQL.</translation>
    </message>
    <message id="62939">
        <source>Tables and joins</source>
        <extracomment>DiagramName</extracomment>
        <translation>Tabellen und Verknüpfungen</translation>
    </message>
    <message id="62940">
        <source>Pick a table from the list to draw it here.
Tick its fields to show them; drag a field onto another one to join two tables.</source>
        <extracomment>DiagramEmpty</extracomment>
        <translation>Wählen Sie eine Tabelle der Liste, um sie hier zu zeichnen.
Kreuzen Sie Felder an, um sie zu zeigen; ziehen Sie ein Feld auf ein anderes, um zwei Tabellen zu verknüpfen.</translation>
    </message>
    <message id="62941">
        <source>Fields of the query</source>
        <extracomment>DiagramGrid</extracomment>
        <translation>Felder der Abfrage</translation>
    </message>
    <message id="62942">
        <source>Field</source>
        <extracomment>DiagramField</extracomment>
        <translation>Feld</translation>
    </message>
    <message id="62943">
        <source>Total</source>
        <extracomment>DiagramTotal</extracomment>
        <translation>Funktion</translation>
    </message>
    <message id="62944">
        <source>Order</source>
        <extracomment>DiagramOrder</extracomment>
        <translation>Ordnung</translation>
    </message>
    <message id="62945">
        <source>Condition</source>
        <extracomment>DiagramCondition</extracomment>
        <translation>Bedingung</translation>
    </message>
    <message id="62946">
        <source>Show</source>
        <extracomment>DiagramShow</extracomment>
        <translation>Zeigen</translation>
    </message>
    <message id="62947">
        <source></source>
        <extracomment>DiagramTotalNone</extracomment>
        <translation></translation>
    </message>
    <message id="62948">
        <source>Group</source>
        <extracomment>DiagramTotalGroup</extracomment>
        <translation>Gruppe</translation>
    </message>
    <message id="62949">
        <source>Count</source>
        <extracomment>DiagramTotalCount</extracomment>
        <translation>Anzahl</translation>
    </message>
    <message id="62950">
        <source>Sum</source>
        <extracomment>DiagramTotalSum</extracomment>
        <translation>Summe</translation>
    </message>
    <message id="62951">
        <source>Average</source>
        <extracomment>DiagramTotalAverage</extracomment>
        <translation>Durchschnitt</translation>
    </message>
    <message id="62952">
        <source>Minimum</source>
        <extracomment>DiagramTotalMinimum</extracomment>
        <translation>Minimum</translation>
    </message>
    <message id="62953">
        <source>Maximum</source>
        <extracomment>DiagramTotalMaximum</extracomment>
        <translation>Maximum</translation>
    </message>
    <message id="62954">
        <source>Ascending</source>
        <extracomment>DiagramAscending</extracomment>
        <translation>Aufsteigend</translation>
    </message>
    <message id="62955">
        <source>Descending</source>
        <extracomment>DiagramDescending</extracomment>
        <translation>Absteigend</translation>
    </message>
    <message id="62956">
        <source>Other &amp;conditions:</source>
        <extracomment>DiagramAlso</extracomment>
        <translation>Weitere Bedin&amp;gungen:</translation>
    </message>
    <message id="62957">
        <source>Take this table out of the query</source>
        <extracomment>DiagramRemoveTable</extracomment>
        <translation>Diese Tabelle aus der Abfrage nehmen</translation>
    </message>
    <message id="62960">
        <source>Only the &amp;matching records of both</source>
        <extracomment>DiagramJoinMatching</extracomment>
        <translation>Nur die &amp;passenden Datensätze beider</translation>
    </message>
    <message id="62961">
        <source>&amp;All records of %1</source>
        <extracomment>DiagramJoinAll</extracomment>
        <translation>&amp;Alle Datensätze von %1</translation>
    </message>
    <message id="62962">
        <source>&amp;Remove Join</source>
        <extracomment>DiagramJoinRemove</extracomment>
        <translation>Verknüpfung &amp;entfernen</translation>
    </message>
    <message id="62963">
        <source>%1 = %2</source>
        <extracomment>DiagramJoinText</extracomment>
        <translation>%1 = %2</translation>
    </message>
    <message id="62964">
        <source>First records</source>
        <extracomment>DiagramFirst</extracomment>
        <translation>Erste Datensätze</translation>
    </message>
    <message id="62965">
        <source>The query yields no record.</source>
        <extracomment>DiagramFirstNone</extracomment>
        <translation>Die Abfrage liefert keinen Datensatz.</translation>
    </message>
    <message id="62966">
        <source>The first records take longer than %1 s. Run shows them.</source>
        <extracomment>DiagramFirstSlow</extracomment>
        <translation>Die ersten Datensätze brauchen länger als %1 s. „Ausführen“ zeigt sie.</translation>
    </message>
    <message id="62967">
        <source>&amp;Edit ...</source>
        <extracomment>StatementEdit</extracomment>
        <translation>&amp;Ändern ...</translation>
    </message>
    <message id="62968">
        <source>Change the statement in the query builder and show its result here</source>
        <extracomment>StatementEditTip</extracomment>
        <translation>Die Anweisung im Abfrageeditor ändern und ihr Ergebnis hier zeigen</translation>
    </message>
    <message id="62969">
        <source>%1 clause</source>
        <extracomment>ClauseBoxName</extracomment>
        <translation>Abschnitt %1</translation>
    </message>
    <message id="62970">
        <source>Write the statement clause by clause</source>
        <extracomment>BuilderTip</extracomment>
        <translation>Die Anweisung Abschnitt für Abschnitt schreiben</translation>
    </message>
    <message id="62971">
        <source>Write the statement whole</source>
        <extracomment>SqlTip</extracomment>
        <translation>Die Anweisung als Ganzes schreiben</translation>
    </message>
    <message id="62972">
        <source>Draw the tables and their joins</source>
        <extracomment>DiagramTip</extracomment>
        <translation>Die Tabellen und ihre Verknüpfungen zeichnen</translation>
    </message>
    <message id="62985">
        <source>Join to %1</source>
        <extracomment>DiagramJoinTo</extracomment>
        <translation>Verknüpfen mit %1</translation>
    </message>
    <message id="62986">
        <source>Pick another table to join this one to</source>
        <extracomment>DiagramNoOtherTable</extracomment>
        <translation>Wählen Sie eine andere Tabelle zum Verknüpfen</translation>
    </message>
    <message id="63200">
        <source>Only a file that can be read again and again can be looked through first.</source>
        <extracomment>ImportDetectNeedsFile</extracomment>
        <translation>Nur eine Datei, die sich mehrmals lesen lässt, kann vorher durchgesehen werden.</translation>
    </message>
    <message id="63201">
        <source>The file holds no text.</source>
        <extracomment>ImportNoText</extracomment>
        <translation>Die Datei enthält keinen Text.</translation>
    </message>
    <message id="63202">
        <source>%1 record(s) imported, %2 updated.</source>
        <extracomment>RecordsImportedUpdated</extracomment>
        <translation>Importierte Datensätze: %1, geänderte: %2.</translation>
    </message>
    <message id="63203">
        <source>%1 record(s) imported, %2 line(s) skipped.</source>
        <extracomment>RecordsImportedSkipped</extracomment>
        <translation>Importierte Datensätze: %1, übersprungene Zeilen: %2.</translation>
    </message>
    <message id="63204">
        <source>%1 record(s) imported, %2 updated, %3 line(s) skipped.</source>
        <extracomment>RecordsImportedUpdatedSkipped</extracomment>
        <translation>Importierte Datensätze: %1, geänderte: %2, übersprungene Zeilen: %3.</translation>
    </message>
    <message id="63205">
        <source>The key on line %1 names several records. Nothing was imported.</source>
        <extracomment>ImportKeyOfSeveral</extracomment>
        <translation>Der Schlüssel in Zeile %1 trifft auf mehrere Datensätze zu. Es wurde nichts importiert.</translation>
    </message>
    <message id="63206">
        <source>The key field "%1" is filled by no column of the file.</source>
        <extracomment>ImportKeyNotFilled</extracomment>
        <translation>Das Schlüsselfeld „%1“ wird von keiner Spalte der Datei gefüllt.</translation>
    </message>
    <message id="63208">
        <source>The lines that fail cannot be written to "%1": it is the file to import, or the database.</source>
        <extracomment>ImportSkipIsSource</extracomment>
        <translation>Die fehlerhaften Zeilen lassen sich nicht in „%1“ schreiben: Das ist die Importdatei oder die Datenbank.</translation>
    </message>
    <message id="63209">
        <source>Found: %1</source>
        <extracomment>ImportFound</extracomment>
        <translation>Erkannt: %1</translation>
    </message>
    <message id="63210" numerus="yes">
        <source>%1 lines are no text in this encoding.</source>
        <extracomment>ImportFoundFailing</extracomment>
        <translation>
            <numerusform>%1 Zeile ist kein Text in dieser Kodierung.</numerusform>
            <numerusform>%1 Zeilen sind kein Text in dieser Kodierung.</numerusform>
        </translation>
    </message>
    <message id="63211">
        <source>Imported</source>
        <extracomment>ImportPastedName</extracomment>
        <translation>Importiert</translation>
    </message>
    <message id="63212">
        <source>Please enter field separator.</source>
        <extracomment>ImportEnterSeparator</extracomment>
        <translation>Bitte ein Feldtrennzeichen eingeben.</translation>
    </message>
    <message id="63213">
        <source>Please enter new table name.</source>
        <extracomment>ImportEnterTable</extracomment>
        <translation>Bitte einen Namen für die neue Tabelle eingeben.</translation>
    </message>
    <message id="63214">
        <source>Please choose a table.</source>
        <extracomment>ImportChooseTable</extracomment>
        <translation>Bitte eine Tabelle auswählen.</translation>
    </message>
    <message id="63215">
        <source>%1 record(s) will be added to "%3" and %2 changed. Import them?</source>
        <extracomment>ImportKeyQuestion</extracomment>
        <translation>In „%3“ werden Datensätze hinzugefügt: %1, geändert: %2. Importieren?</translation>
    </message>
    <message id="63216">
        <source>The lines that failed are in "%1".</source>
        <extracomment>ImportSkippedTo</extracomment>
        <translation>Die fehlerhaften Zeilen stehen in „%1“.</translation>
    </message>
    <message id="63217">
        <source>Import </source>
        <extracomment>ImportTitle</extracomment>
        <translation>Import </translation>
    </message>
    <message id="63218">
        <source>Select Source/Dest.</source>
        <extracomment>ImportStepSource</extracomment>
        <translation>Quelle und Ziel</translation>
    </message>
    <message id="63219">
        <source>Field separator</source>
        <extracomment>ImportStepSeparator</extracomment>
        <translation>Feldtrennzeichen</translation>
    </message>
    <message id="63220">
        <source>Destination Table</source>
        <extracomment>ImportStepDestination</extracomment>
        <translation>Zieltabelle</translation>
    </message>
    <message id="63221">
        <source>Define Fields</source>
        <extracomment>ImportStepFields</extracomment>
        <translation>Felder festlegen</translation>
    </message>
    <message id="63222">
        <source>I&amp;mport</source>
        <extracomment>ImportRun</extracomment>
        <translation>&amp;Import</translation>
    </message>
    <message id="63223">
        <source>&amp;Open File ...</source>
        <extracomment>ImportOpenFile</extracomment>
        <translation>Datei ö&amp;ffnen ...</translation>
    </message>
    <message id="63224">
        <source>Choose the file to import</source>
        <extracomment>ImportOpenFileTip</extracomment>
        <translation>Die Datei auswählen, die importiert werden soll</translation>
    </message>
    <message id="63225">
        <source>Open</source>
        <extracomment>ImportOpenFileAccept</extracomment>
        <translation>Öffnen</translation>
    </message>
    <message id="63226">
        <source>From &amp;Clipboard</source>
        <extracomment>ImportPaste</extracomment>
        <translation>&amp;Zwischenablage</translation>
    </message>
    <message id="63227">
        <source>Import the table or text that was copied</source>
        <extracomment>ImportPasteTip</extracomment>
        <translation>Die kopierte Tabelle oder den kopierten Text importieren</translation>
    </message>
    <message id="63228">
        <source>Source Data:</source>
        <extracomment>ImportSourceLabel</extracomment>
        <translation>Quelldaten:</translation>
    </message>
    <message id="63229">
        <source>Text from the clipboard</source>
        <extracomment>ImportClipboardText</extracomment>
        <translation>Text aus der Zwischenablage</translation>
    </message>
    <message id="63230">
        <source>CSV File (*.csv *.tsv);;Text File (*.txt *.tab);;All Files (*)</source>
        <extracomment>ImportFileFilter</extracomment>
        <translation>CSV-Datei (*.csv *.tsv);;Textdatei (*.txt *.tab);;Alle Dateien (*)</translation>
    </message>
    <message id="63231">
        <source>Choose a file, or drop one here. Its separator, names and types are found out by themselves.</source>
        <extracomment>ImportNoSource</extracomment>
        <translation>Wählen Sie eine Datei oder ziehen Sie sie hierher. Trennzeichen, Namen und Typen werden von selbst erkannt.</translation>
    </message>
    <message id="63232">
        <source>%1 record(s) in %2 column(s), encoding %3</source>
        <extracomment>ImportSummary</extracomment>
        <translation>Datensätze: %1, Spalten: %2, Kodierung %3</translation>
    </message>
    <message id="63233" numerus="yes">
        <source>%1 lines are no text in the encoding %2.</source>
        <extracomment>ImportSummaryFailing</extracomment>
        <translation>
            <numerusform>%1 Zeile ist kein Text in der Kodierung %2.</numerusform>
            <numerusform>%1 Zeilen sind kein Text in der Kodierung %2.</numerusform>
        </translation>
    </message>
    <message id="63234">
        <source>&amp;Etc:</source>
        <extracomment>ImportSeparatorEtc</extracomment>
        <translation>&amp;Anderes:</translation>
    </message>
    <message id="63235">
        <source>Other field separator</source>
        <extracomment>ImportSeparatorEtcName</extracomment>
        <translation>Anderes Feldtrennzeichen</translation>
    </message>
    <message id="63236">
        <source>&amp;Detect</source>
        <extracomment>ImportDetect</extracomment>
        <translation>&amp;Erkennen</translation>
    </message>
    <message id="63237">
        <source>Find out separator, marks, names and types from the file</source>
        <extracomment>ImportDetectTip</extracomment>
        <translation>Trennzeichen, Zeichen, Namen und Typen aus der Datei ermitteln</translation>
    </message>
    <message id="63238">
        <source>Text data...</source>
        <extracomment>ImportPreview</extracomment>
        <translation>Textdaten …</translation>
    </message>
    <message id="63239">
        <source>Ne&amp;w Table</source>
        <extracomment>ImportNewTable</extracomment>
        <translation>&amp;Neue Tabelle</translation>
    </message>
    <message id="63240">
        <source>Name of the new table</source>
        <extracomment>ImportNewTableName</extracomment>
        <translation>Name der neuen Tabelle</translation>
    </message>
    <message id="63241">
        <source>E&amp;xisting Table</source>
        <extracomment>ImportExistingTable</extracomment>
        <translation>V&amp;orhandene Tabelle</translation>
    </message>
    <message id="63242">
        <source>Tables of this database</source>
        <extracomment>ImportTables</extracomment>
        <translation>Tabellen dieser Datenbank</translation>
    </message>
    <message id="63243">
        <source>-</source>
        <extracomment>ImportColumnMark</extracomment>
        <translation>-</translation>
    </message>
    <message id="63244">
        <source>Field Name</source>
        <extracomment>ImportColumnName</extracomment>
        <translation>Feldname</translation>
    </message>
    <message id="63245">
        <source>Field Type</source>
        <extracomment>ImportColumnType</extracomment>
        <translation>Feldtyp</translation>
    </message>
    <message id="63246">
        <source>Size</source>
        <extracomment>ImportColumnSize</extracomment>
        <translation>Größe</translation>
    </message>
    <message id="63247">
        <source>Data</source>
        <extracomment>ImportColumnData</extracomment>
        <translation>Daten</translation>
    </message>
    <message id="63248">
        <source>Ignore field.</source>
        <extracomment>ImportIgnoreField</extracomment>
        <translation>Feld auslassen</translation>
    </message>
    <message id="63249">
        <source>N&amp;ame:</source>
        <extracomment>ImportFieldName</extracomment>
        <translation>&amp;Name:</translation>
    </message>
    <message id="63250">
        <source>T&amp;ype:</source>
        <extracomment>ImportFieldType</extracomment>
        <translation>&amp;Typ:</translation>
    </message>
    <message id="63251">
        <source>Si&amp;ze:</source>
        <extracomment>ImportFieldSize</extracomment>
        <translation>&amp;Größe:</translation>
    </message>
    <message id="63252">
        <source>&amp;Key</source>
        <extracomment>ImportFieldKey</extracomment>
        <translation>Sch&amp;lüssel</translation>
    </message>
    <message id="63253">
        <source>A record with the same value here is changed; others are added</source>
        <extracomment>ImportFieldKeyTip</extracomment>
        <translation>Ein Datensatz mit demselben Wert wird geändert; andere werden hinzugefügt</translation>
    </message>
    <message id="63254">
        <source>&amp;Skip lines that fail</source>
        <extracomment>ImportSkipFailing</extracomment>
        <translation>Fehlerhafte Zeilen über&amp;springen</translation>
    </message>
    <message id="63255">
        <source>Lines that fail are written to a file beside the source, the others are imported</source>
        <extracomment>ImportSkipFailingTip</extracomment>
        <translation>Fehlerhafte Zeilen werden in eine Datei neben der Quelle geschrieben, die anderen importiert</translation>
    </message>
    <message id="63256">
        <source>Checking the lines ...</source>
        <extracomment>ImportChecking</extracomment>
        <translation>Die Zeilen werden geprüft …</translation>
    </message>
    <message id="63257" numerus="yes">
        <source>All %1 lines fit.</source>
        <extracomment>ImportAllFit</extracomment>
        <translation>
            <numerusform>Die Zeile passt.</numerusform>
            <numerusform>Alle %1 Zeilen passen.</numerusform>
        </translation>
    </message>
    <message id="63258" numerus="yes">
        <source>%1 lines will fail. Line %2, column %3: %4</source>
        <extracomment>ImportSomeFail</extracomment>
        <translation>
            <numerusform>%1 Zeile wird fehlschlagen. Zeile %2, Spalte %3: %4</numerusform>
            <numerusform>%1 Zeilen werden fehlschlagen. Zeile %2, Spalte %3: %4</numerusform>
        </translation>
    </message>
    <message id="63259" numerus="yes">
        <source>%1 lines will fail. Line %2: %3</source>
        <extracomment>ImportLineFails</extracomment>
        <translation>
            <numerusform>%1 Zeile wird fehlschlagen. Zeile %2: %3</numerusform>
            <numerusform>%1 Zeilen werden fehlschlagen. Zeile %2: %3</numerusform>
        </translation>
    </message>
    <message id="63260">
        <source>Quoted text may span &amp;lines</source>
        <extracomment>ImportQuotedLines</extracomment>
        <translation>Zitierter Text darf über &amp;mehrere Zeilen gehen</translation>
    </message>
    <message id="63261">
        <source>Quotation marks inside quoted texts are doubled then, as most programs write them</source>
        <extracomment>ImportQuotedLinesTip</extracomment>
        <translation>Anführungszeichen in zitierten Texten sind dann verdoppelt, wie die meisten Programme sie schreiben</translation>
    </message>
    <message id="63262">
        <source>De&amp;cimal sign:</source>
        <extracomment>ImportDecimal</extracomment>
        <translation>De&amp;zimalzeichen:</translation>
    </message>
    <message id="63263">
        <source>Point (1234.5)</source>
        <extracomment>ImportDecimalPoint</extracomment>
        <translation>Punkt (1234.5)</translation>
    </message>
    <message id="63264">
        <source>Comma (1.234,5)</source>
        <extracomment>ImportDecimalComma</extracomment>
        <translation>Komma (1.234,5)</translation>
    </message>
    <message id="63265">
        <source>Columns of the file</source>
        <extracomment>ImportFieldsList</extracomment>
        <translation>Spalten der Datei</translation>
    </message>
    <message id="63266">
        <source>Will fail on line %1: %2</source>
        <extracomment>ImportFailingField</extracomment>
        <translation>Schlägt in Zeile %1 fehl: %2</translation>
    </message>
    <message id="63267">
        <source>Paste as Ne&amp;w Table ...</source>
        <extracomment>CommandPasteTable</extracomment>
        <translation>Als neue &amp;Tabelle einfügen ...</translation>
    </message>
    <message id="63268">
        <source>Makes a table of what was copied in a spreadsheet</source>
        <extracomment>TipPasteTable</extracomment>
        <translation>Macht eine Tabelle aus dem, was in einer Tabellenkalkulation kopiert wurde</translation>
    </message>
    <message id="63269">
        <source>Source file</source>
        <extracomment>ImportFileName</extracomment>
        <translation>Quelldatei</translation>
    </message>
    <message id="63270">
        <source>Keep texts of more than 8192 characters w&amp;hole</source>
        <extracomment>ImportWholeTexts</extracomment>
        <translation>Texte von mehr als 8192 Zeichen &amp;ganz behalten</translation>
    </message>
    <message id="63271">
        <source>Nothing was copied: there is no text on the clipboard.</source>
        <extracomment>ImportNothingCopied</extracomment>
        <translation>Es wurde nichts kopiert: In der Zwischenablage ist kein Text.</translation>
    </message>
    <message id="63272">
        <source>&amp;Byte-order mark</source>
        <extracomment>CsvByteOrderMark</extracomment>
        <translation>&amp;Bytereihenfolge-Marke (BOM)</translation>
    </message>
    <message id="63273">
        <source>Tells other programs the encoding; spreadsheets want it for UTF-8</source>
        <extracomment>CsvByteOrderMarkTip</extracomment>
        <translation>Sagt anderen Programmen die Kodierung; Tabellenkalkulationen brauchen sie bei UTF-8</translation>
    </message>
    <message id="63274">
        <source>&amp;Format:</source>
        <extracomment>ExportKind</extracomment>
        <translation>&amp;Format:</translation>
    </message>
    <message id="63275">
        <source>CSV text</source>
        <extracomment>ExportKindCsv</extracomment>
        <translation>CSV-Text</translation>
    </message>
    <message id="63276">
        <source>JSON</source>
        <extracomment>ExportKindJson</extracomment>
        <translation>JSON</translation>
    </message>
    <message id="63277">
        <source>Web page (HTML)</source>
        <extracomment>ExportKindHtml</extracomment>
        <translation>Webseite (HTML)</translation>
    </message>
    <message id="63278">
        <source>Document (PDF)</source>
        <extracomment>ExportKindPdf</extracomment>
        <translation>Dokument (PDF)</translation>
    </message>
    <message id="63279">
        <source>JSON File (*.json)</source>
        <extracomment>ExportFilterJson</extracomment>
        <translation>JSON-Datei (*.json)</translation>
    </message>
    <message id="63280">
        <source>Web Page (*.html *.htm)</source>
        <extracomment>ExportFilterHtml</extracomment>
        <translation>Webseite (*.html *.htm)</translation>
    </message>
    <message id="63281">
        <source>PDF Document (*.pdf)</source>
        <extracomment>ExportFilterPdf</extracomment>
        <translation>PDF-Dokument (*.pdf)</translation>
    </message>
    <message id="63282">
        <source>Page %1 of %2</source>
        <extracomment>ExportPdfPage</extracomment>
        <translation>Seite %1 von %2</translation>
    </message>
    <message id="63283">
        <source>Page %1</source>
        <extracomment>ExportPdfPageOnly</extracomment>
        <translation>Seite %1</translation>
    </message>
    <message id="63600">
        <source>Label</source>
        <extracomment>TypeLabel</extracomment>
        <translation>Beschriftung</translation>
    </message>
    <message id="63601">
        <source>Edit Box</source>
        <extracomment>TypeEditBox</extracomment>
        <translation>Eingabefeld</translation>
    </message>
    <message id="63602">
        <source>List</source>
        <extracomment>TypeList</extracomment>
        <translation>Liste</translation>
    </message>
    <message id="63603">
        <source>Drop-Down Box</source>
        <extracomment>TypeDropDownBox</extracomment>
        <translation>Auswahlfeld</translation>
    </message>
    <message id="63604">
        <source>Button</source>
        <extracomment>TypeButton</extracomment>
        <translation>Schaltfläche</translation>
    </message>
    <message id="63605">
        <source>Check Box</source>
        <extracomment>TypeCheckBox</extracomment>
        <translation>Kontrollkästchen</translation>
    </message>
    <message id="63606">
        <source>Control of type %1</source>
        <extracomment>TypeOther</extracomment>
        <translation>Steuerelement vom Typ %1</translation>
    </message>
    <message id="63607">
        <source>Form</source>
        <extracomment>TypeForm</extracomment>
        <translation>Formular</translation>
    </message>
    <message id="63610">
        <source>F&amp;orm</source>
        <extracomment>MakerMenuForm</extracomment>
        <translation>F&amp;ormular</translation>
    </message>
    <message id="63611">
        <source>&amp;Control</source>
        <extracomment>MakerMenuControl</extracomment>
        <translation>&amp;Steuerelement</translation>
    </message>
    <message id="63612">
        <source>&amp;Properties</source>
        <extracomment>MakerMenuProperties</extracomment>
        <translation>&amp;Eigenschaften</translation>
    </message>
    <message id="63613">
        <source>&amp;Edit</source>
        <extracomment>MakerMenuEdit</extracomment>
        <translation>&amp;Bearbeiten</translation>
    </message>
    <message id="63614">
        <source>&amp;Save</source>
        <extracomment>MakerSave</extracomment>
        <translation>&amp;Speichern</translation>
    </message>
    <message id="63615">
        <source>Save the form in the database</source>
        <extracomment>MakerSaveTip</extracomment>
        <translation>Das Formular in der Datenbank speichern</translation>
    </message>
    <message id="63616">
        <source>Save &amp;As</source>
        <extracomment>MakerSaveAs</extracomment>
        <translation>Speichern &amp;unter</translation>
    </message>
    <message id="63617">
        <source>Save the form under another name</source>
        <extracomment>MakerSaveAsTip</extracomment>
        <translation>Das Formular unter einem anderen Namen speichern</translation>
    </message>
    <message id="63618">
        <source>&amp;Import Form</source>
        <extracomment>MakerImport</extracomment>
        <translation>Formular im&amp;portieren</translation>
    </message>
    <message id="63619">
        <source>Replace this form by one from a form file</source>
        <extracomment>MakerImportTip</extracomment>
        <translation>Dieses Formular durch eines aus einer Formulardatei ersetzen</translation>
    </message>
    <message id="63620">
        <source>&amp;Export Form</source>
        <extracomment>MakerExport</extracomment>
        <translation>Formular e&amp;xportieren</translation>
    </message>
    <message id="63621">
        <source>Write this form to a form file</source>
        <extracomment>MakerExportTip</extracomment>
        <translation>Dieses Formular in eine Formulardatei schreiben</translation>
    </message>
    <message id="63622">
        <source>&amp;Run</source>
        <extracomment>MakerRun</extracomment>
        <translation>&amp;Ausführen</translation>
    </message>
    <message id="63623">
        <source>Run the form as it is now, without saving it</source>
        <extracomment>MakerRunTip</extracomment>
        <translation>Das Formular ausführen, wie es jetzt ist, ohne es zu speichern</translation>
    </message>
    <message id="63624">
        <source>Form Scro&amp;ll Bar</source>
        <extracomment>MakerScrollBar</extracomment>
        <translation>&amp;Rollbalken</translation>
    </message>
    <message id="63625">
        <source>Show the scroll bar of the design</source>
        <extracomment>MakerScrollBarTip</extracomment>
        <translation>Den Rollbalken des Entwurfs zeigen</translation>
    </message>
    <message id="63626">
        <source>Delete All Con&amp;trols</source>
        <extracomment>MakerDeleteAll</extracomment>
        <translation>Alle &amp;Elemente löschen</translation>
    </message>
    <message id="63627">
        <source>Delete everything on the form</source>
        <extracomment>MakerDeleteAllTip</extracomment>
        <translation>Alles auf dem Formular löschen</translation>
    </message>
    <message id="63628">
        <source>Hel&amp;p</source>
        <extracomment>MakerHelp</extracomment>
        <translation>Hil&amp;fe</translation>
    </message>
    <message id="63629">
        <source>Shows the help page of the form maker</source>
        <extracomment>MakerHelpTip</extracomment>
        <translation>Zeigt die Hilfeseite des Formularentwurfs</translation>
    </message>
    <message id="63630">
        <source>Form &amp;Properties ...</source>
        <extracomment>MakerFormProperties</extracomment>
        <translation>&amp;Formulareigenschaften ...</translation>
    </message>
    <message id="63631">
        <source>Name, table, size, query and start of the form</source>
        <extracomment>MakerFormPropertiesTip</extracomment>
        <translation>Name, Tabelle, Größe, Abfrage und Start des Formulars</translation>
    </message>
    <message id="63632">
        <source>Form &amp;Color</source>
        <extracomment>MakerFormColor</extracomment>
        <translation>Fa&amp;rbe des Formulars</translation>
    </message>
    <message id="63633">
        <source>Choose the color behind the controls</source>
        <extracomment>MakerFormColorTip</extracomment>
        <translation>Die Farbe hinter den Steuerelementen auswählen</translation>
    </message>
    <message id="63634">
        <source>Form &amp;Font</source>
        <extracomment>MakerFormFont</extracomment>
        <translation>&amp;Schrift des Formulars</translation>
    </message>
    <message id="63635">
        <source>Choose the font that new controls get</source>
        <extracomment>MakerFormFontTip</extracomment>
        <translation>Die Schrift auswählen, die neue Steuerelemente bekommen</translation>
    </message>
    <message id="63636">
        <source>Create &amp;Default Form</source>
        <extracomment>MakerDefaultForm</extracomment>
        <translation>Stan&amp;dardformular anlegen</translation>
    </message>
    <message id="63637">
        <source>Replace the controls by a counter, the first five fields and a SAVE button</source>
        <extracomment>MakerDefaultFormTip</extracomment>
        <translation>Die Steuerelemente durch einen Zähler, die ersten fünf Felder und eine SAVE-Schaltfläche ersetzen</translation>
    </message>
    <message id="63638">
        <source>&amp;Lay Out All Fields</source>
        <extracomment>MakerLayOut</extracomment>
        <translation>Alle Felder &amp;anordnen</translation>
    </message>
    <message id="63639">
        <source>Replace the controls by a form with every field of the table</source>
        <extracomment>MakerLayOutTip</extracomment>
        <translation>Die Steuerelemente durch ein Formular mit allen Feldern der Tabelle ersetzen</translation>
    </message>
    <message id="63640">
        <source>New &amp;Button</source>
        <extracomment>MakerNewButton</extracomment>
        <translation>Neue Schal&amp;tfläche</translation>
    </message>
    <message id="63641">
        <source>New &amp;EditBox</source>
        <extracomment>MakerNewEditBox</extracomment>
        <translation>Neues &amp;Eingabefeld</translation>
    </message>
    <message id="63642">
        <source>New Chec&amp;kBox</source>
        <extracomment>MakerNewCheckBox</extracomment>
        <translation>Neues &amp;Kontrollkästchen</translation>
    </message>
    <message id="63643">
        <source>New &amp;Label</source>
        <extracomment>MakerNewLabel</extracomment>
        <translation>Neue &amp;Beschriftung</translation>
    </message>
    <message id="63644">
        <source>New L&amp;ist</source>
        <extracomment>MakerNewList</extracomment>
        <translation>Neue &amp;Liste</translation>
    </message>
    <message id="63645">
        <source>New &amp;DropDownBox</source>
        <extracomment>MakerNewDropDown</extracomment>
        <translation>Neues Auswa&amp;hlfeld</translation>
    </message>
    <message id="63646">
        <source>Then tap the place for it</source>
        <extracomment>MakerNewTip</extracomment>
        <translation>Dann auf die Stelle dafür tippen</translation>
    </message>
    <message id="63647">
        <source>Insert &amp;Record Counter</source>
        <extracomment>MakerInsertCounter</extracomment>
        <translation>Datensatz&amp;zähler einfügen</translation>
    </message>
    <message id="63648">
        <source>Add a box that shows the record's number and how many there are</source>
        <extracomment>MakerInsertCounterTip</extracomment>
        <translation>Ein Feld hinzufügen, das die Nummer des Datensatzes und ihre Anzahl zeigt</translation>
    </message>
    <message id="63649">
        <source>&amp;Fields ...</source>
        <extracomment>MakerFields</extracomment>
        <translation>&amp;Felder ...</translation>
    </message>
    <message id="63650">
        <source>Add fields of the table, each with its label</source>
        <extracomment>MakerFieldsTip</extracomment>
        <translation>Felder der Tabelle mit ihrer Beschriftung hinzufügen</translation>
    </message>
    <message id="63651">
        <source>&amp;Paste</source>
        <extracomment>MakerPaste</extracomment>
        <translation>E&amp;infügen</translation>
    </message>
    <message id="63652">
        <source>Add the controls that were copied</source>
        <extracomment>MakerPasteTip</extracomment>
        <translation>Die kopierten Steuerelemente hinzufügen</translation>
    </message>
    <message id="63653">
        <source>&amp;Copy</source>
        <extracomment>MakerCopy</extracomment>
        <translation>&amp;Kopieren</translation>
    </message>
    <message id="63654">
        <source>Copy the selected controls, for this form or another one</source>
        <extracomment>MakerCopyTip</extracomment>
        <translation>Die ausgewählten Steuerelemente kopieren, für dieses oder ein anderes Formular</translation>
    </message>
    <message id="63655">
        <source>&amp;Delete</source>
        <extracomment>MakerDelete</extracomment>
        <translation>L&amp;öschen</translation>
    </message>
    <message id="63656">
        <source>Delete the selected controls</source>
        <extracomment>MakerDeleteTip</extracomment>
        <translation>Die ausgewählten Steuerelemente löschen</translation>
    </message>
    <message id="63657">
        <source>Control &amp;Properties ...</source>
        <extracomment>MakerControlProperties</extracomment>
        <translation>&amp;Eigenschaften ...</translation>
    </message>
    <message id="63658">
        <source>What the selected control shows and does</source>
        <extracomment>MakerControlPropertiesTip</extracomment>
        <translation>Was das ausgewählte Steuerelement zeigt und tut</translation>
    </message>
    <message id="63659">
        <source>Control &amp;Color</source>
        <extracomment>MakerControlColor</extracomment>
        <translation>Fa&amp;rbe des Elements</translation>
    </message>
    <message id="63660">
        <source>Control &amp;Font</source>
        <extracomment>MakerControlFont</extracomment>
        <translation>Schri&amp;ft des Elements</translation>
    </message>
    <message id="63661">
        <source>&amp;Color</source>
        <extracomment>MakerColor</extracomment>
        <translation>Fa&amp;rbe</translation>
    </message>
    <message id="63662">
        <source>&amp;Font</source>
        <extracomment>MakerFont</extracomment>
        <translation>Schri&amp;ft</translation>
    </message>
    <message id="63663">
        <source>Choose the color behind the text</source>
        <extracomment>MakerColorTip</extracomment>
        <translation>Die Farbe hinter dem Text auswählen</translation>
    </message>
    <message id="63664">
        <source>Choose the font and the color of the text</source>
        <extracomment>MakerFontTip</extracomment>
        <translation>Schrift und Farbe des Textes auswählen</translation>
    </message>
    <message id="63665">
        <source>Align &amp;Left</source>
        <extracomment>MakerAlignLeft</extracomment>
        <translation>&amp;Links ausrichten</translation>
    </message>
    <message id="63666">
        <source>Align &amp;Right</source>
        <extracomment>MakerAlignRight</extracomment>
        <translation>&amp;Rechts ausrichten</translation>
    </message>
    <message id="63667">
        <source>Align &amp;Top</source>
        <extracomment>MakerAlignTop</extracomment>
        <translation>&amp;Oben ausrichten</translation>
    </message>
    <message id="63668">
        <source>Align &amp;Bottom</source>
        <extracomment>MakerAlignBottom</extracomment>
        <translation>&amp;Unten ausrichten</translation>
    </message>
    <message id="63669">
        <source>Bring the edges in line with the control that was selected first</source>
        <extracomment>MakerAlignTip</extracomment>
        <translation>Die Kanten am zuerst ausgewählten Steuerelement ausrichten</translation>
    </message>
    <message id="63670">
        <source>Make Same &amp;Size</source>
        <extracomment>MakerSameSize</extracomment>
        <translation>Gleiche &amp;Größe</translation>
    </message>
    <message id="63671">
        <source>Make Same &amp;Height</source>
        <extracomment>MakerSameHeight</extracomment>
        <translation>Gleiche &amp;Höhe</translation>
    </message>
    <message id="63672">
        <source>Make Same &amp;Width</source>
        <extracomment>MakerSameWidth</extracomment>
        <translation>Gleiche &amp;Breite</translation>
    </message>
    <message id="63673">
        <source>As large as the control that was selected first</source>
        <extracomment>MakerSameTip</extracomment>
        <translation>So groß wie das zuerst ausgewählte Steuerelement</translation>
    </message>
    <message id="63674">
        <source>&amp;Undo</source>
        <extracomment>MakerUndo</extracomment>
        <translation>Rü&amp;ckgängig</translation>
    </message>
    <message id="63675">
        <source>Take the last change back</source>
        <extracomment>MakerUndoTip</extracomment>
        <translation>Die letzte Änderung zurücknehmen</translation>
    </message>
    <message id="63676">
        <source>Red&amp;o</source>
        <extracomment>MakerRedo</extracomment>
        <translation>&amp;Wiederholen</translation>
    </message>
    <message id="63677">
        <source>Make the change again</source>
        <extracomment>MakerRedoTip</extracomment>
        <translation>Die Änderung noch einmal ausführen</translation>
    </message>
    <message id="63678">
        <source>Select &amp;All</source>
        <extracomment>MakerSelectAll</extracomment>
        <translation>&amp;Alles auswählen</translation>
    </message>
    <message id="63679">
        <source>Select all controls</source>
        <extracomment>MakerSelectAllTip</extracomment>
        <translation>Alle Steuerelemente auswählen</translation>
    </message>
    <message id="63680">
        <source>&amp;Select</source>
        <extracomment>MakerSelect</extracomment>
        <translation>Au&amp;swählen</translation>
    </message>
    <message id="63681">
        <source>Select and move controls</source>
        <extracomment>MakerSelectTip</extracomment>
        <translation>Steuerelemente auswählen und verschieben</translation>
    </message>
    <message id="63682">
        <source>&amp;Next Control</source>
        <extracomment>MakerNextControl</extracomment>
        <translation>&amp;Nächstes Element</translation>
    </message>
    <message id="63683">
        <source>Select the next control in the order of the Tab key</source>
        <extracomment>MakerNextControlTip</extracomment>
        <translation>Das nächste Steuerelement in der Reihenfolge der Tabulatortaste auswählen</translation>
    </message>
    <message id="63684">
        <source>Pre&amp;vious Control</source>
        <extracomment>MakerPreviousControl</extracomment>
        <translation>&amp;Voriges Element</translation>
    </message>
    <message id="63685">
        <source>Select the one before</source>
        <extracomment>MakerPreviousControlTip</extracomment>
        <translation>Das Steuerelement davor auswählen</translation>
    </message>
    <message id="63686">
        <source>Earlier in &amp;Tab Order</source>
        <extracomment>MakerEarlier</extracomment>
        <translation>Frü&amp;her in der Tab-Reihenfolge</translation>
    </message>
    <message id="63687">
        <source>The Tab key comes to it sooner; it is drawn further below</source>
        <extracomment>MakerEarlierTip</extracomment>
        <translation>Die Tabulatortaste kommt eher hierher; es wird weiter unten gezeichnet</translation>
    </message>
    <message id="63688">
        <source>Later in Tab Ord&amp;er</source>
        <extracomment>MakerLater</extracomment>
        <translation>S&amp;päter in der Tab-Reihenfolge</translation>
    </message>
    <message id="63689">
        <source>The Tab key comes to it later; it is drawn further above</source>
        <extracomment>MakerLaterTip</extracomment>
        <translation>Die Tabulatortaste kommt später hierher; es wird weiter oben gezeichnet</translation>
    </message>
    <message id="63690">
        <source>&amp;Zoom In</source>
        <extracomment>MakerZoomIn</extracomment>
        <translation>Ver&amp;größern</translation>
    </message>
    <message id="63691">
        <source>Zoom O&amp;ut</source>
        <extracomment>MakerZoomOut</extracomment>
        <translation>Ver&amp;kleinern</translation>
    </message>
    <message id="63692">
        <source>Change how large the design is drawn</source>
        <extracomment>MakerZoomTip</extracomment>
        <translation>Ändern, wie groß der Entwurf gezeichnet wird</translation>
    </message>
    <message id="63693">
        <source>Controls</source>
        <extracomment>MakerPalette</extracomment>
        <translation>Steuerelemente</translation>
    </message>
    <message id="63720">
        <source>All controls on this form will be deleted.
Are you sure you want to import a form ?</source>
        <extracomment>MakerImportQuestion</extracomment>
        <translation>Alle Steuerelemente dieses Formulars werden gelöscht.
Möchten Sie wirklich ein Formular importieren?</translation>
    </message>
    <message id="63721">
        <source>All controls on this form will be deleted.
Are you sure you want to create the default form ?</source>
        <extracomment>MakerDefaultQuestion</extracomment>
        <translation>Alle Steuerelemente dieses Formulars werden gelöscht.
Möchten Sie wirklich das Standardformular anlegen?</translation>
    </message>
    <message id="63722">
        <source>All controls on this form will be deleted.
Are you sure you want to lay out all fields ?</source>
        <extracomment>MakerLayOutQuestion</extracomment>
        <translation>Alle Steuerelemente dieses Formulars werden gelöscht.
Möchten Sie wirklich alle Felder anordnen?</translation>
    </message>
    <message id="63723">
        <source>Delete these %1 controls?</source>
        <extracomment>MakerDeleteSeveral</extracomment>
        <translation>Diese %1 Steuerelemente löschen?</translation>
    </message>
    <message id="63724">
        <source>Save as</source>
        <extracomment>MakerSaveAsTitle</extracomment>
        <translation>Speichern unter</translation>
    </message>
    <message id="63725">
        <source>Form Name:</source>
        <extracomment>MakerNamePrompt</extracomment>
        <translation>Name des Formulars:</translation>
    </message>
    <message id="63726">
        <source>Cancel</source>
        <extracomment>MakerCancel</extracomment>
        <translation>Abbrechen</translation>
    </message>
    <message id="63727">
        <source>A form needs a name.</source>
        <extracomment>MakerNameEmpty</extracomment>
        <translation>Ein Formular braucht einen Namen.</translation>
    </message>
    <message id="63728">
        <source>The form "%1" has been changed meanwhile.
Replace it by yours?</source>
        <extracomment>MakerChangedMeanwhile</extracomment>
        <translation>Das Formular „%1“ wurde inzwischen geändert.
Durch Ihres ersetzen?</translation>
    </message>
    <message id="63729">
        <source>The database cannot be written, so that forms cannot be saved in it.</source>
        <extracomment>MakerStoreMissing</extracomment>
        <translation>Die Datenbank lässt sich nicht beschreiben, Formulare können nicht darin gespeichert werden.</translation>
    </message>
    <message id="63730">
        <source>The form "%1" is no longer there.</source>
        <extracomment>MakerFormGone</extracomment>
        <translation>Das Formular „%1“ ist nicht mehr da.</translation>
    </message>
    <message id="63731">
        <source>Some expressions of this form will show nothing, or less than they say:
%1
Save it all the same?</source>
        <extracomment>MakerLossesQuestion</extracomment>
        <translation>Einige Ausdrücke dieses Formulars werden nichts oder weniger zeigen, als sie sagen:
%1
Trotzdem speichern?</translation>
    </message>
    <message id="63732">
        <source>%1: %2</source>
        <extracomment>MakerLoss</extracomment>
        <translation>%1: %2</translation>
    </message>
    <message id="63733">
        <source>The table "%1" cannot be read. Choose a table under Form Properties.</source>
        <extracomment>MakerNoFields</extracomment>
        <translation>Die Tabelle „%1“ lässt sich nicht lesen. Wählen Sie unter Formulareigenschaften eine Tabelle.</translation>
    </message>
    <message id="63734">
        <source>Mirel Form Files (*.pfs)</source>
        <extracomment>MakerFilter</extracomment>
        <translation>Mirel-Formulardateien (*.pfs)</translation>
    </message>
    <message id="63735">
        <source>The file "%1" exists.
Do you want to replace it?</source>
        <extracomment>MakerFileExists</extracomment>
        <translation>Die Datei „%1“ ist vorhanden.
Möchten Sie sie ersetzen?</translation>
    </message>
    <message id="63736">
        <source>%1 (design)</source>
        <extracomment>MakerDesignTitle</extracomment>
        <translation>%1 (Entwurf)</translation>
    </message>
    <message id="63737">
        <source>New form</source>
        <extracomment>MakerNewTitle</extracomment>
        <translation>Neues Formular</translation>
    </message>
    <message id="63738">
        <source>Form design</source>
        <extracomment>MakerSurfaceName</extracomment>
        <translation>Formularentwurf</translation>
    </message>
    <message id="63739">
        <source>Fields of %1</source>
        <extracomment>MakerFieldsOf</extracomment>
        <translation>Felder von %1</translation>
    </message>
    <message id="63740">
        <source>Drag a field onto the form, or tap it twice.</source>
        <extracomment>MakerFieldsHint</extracomment>
        <translation>Ziehen Sie ein Feld auf das Formular oder tippen Sie zweimal darauf.</translation>
    </message>
    <message id="63741">
        <source>Tap a kind of control above, then its place here.</source>
        <extracomment>MakerEmptyHint</extracomment>
        <translation>Tippen Sie oben auf eine Art von Steuerelement, dann hier auf seinen Platz.</translation>
    </message>
    <message id="63742">
        <source>Tap the place for the new control: %1</source>
        <extracomment>MakerPlaceHint</extracomment>
        <translation>Tippen Sie auf den Platz für das neue Steuerelement: %1</translation>
    </message>
    <message id="63743">
        <source>%1: %2   x %3 y %4   %5 x %6</source>
        <extracomment>MakerStatusControl</extracomment>
        <translation>%1: %2   x %3 y %4   %5 x %6</translation>
    </message>
    <message id="63744" numerus="yes">
        <source>%1   %2 x %3   %4 controls</source>
        <extracomment>MakerStatusForm</extracomment>
        <translation>
            <numerusform>%1   %2 x %3   %4 Steuerelement</numerusform>
            <numerusform>%1   %2 x %3   %4 Steuerelemente</numerusform>
        </translation>
    </message>
    <message id="63745">
        <source>%1 controls selected</source>
        <extracomment>MakerStatusSeveral</extracomment>
        <translation>%1 Steuerelemente ausgewählt</translation>
    </message>
    <message id="63746">
        <source>%1 %</source>
        <extracomment>MakerZoomText</extracomment>
        <translation>%1 %</translation>
    </message>
    <message id="63747">
        <source>&amp;Add</source>
        <extracomment>MakerDialogAdd</extracomment>
        <translation>&amp;Hinzufügen</translation>
    </message>
    <message id="63748">
        <source>&amp;Close</source>
        <extracomment>MakerDialogClose</extracomment>
        <translation>&amp;Schließen</translation>
    </message>
    <message id="63749">
        <source>Default</source>
        <extracomment>MakerColorDesktop</extracomment>
        <translation>Standard</translation>
    </message>
    <message id="63750">
        <source>%1, %2 pt</source>
        <extracomment>MakerFontText</extracomment>
        <translation>%1, %2 pt</translation>
    </message>
    <message id="63751">
        <source>Default</source>
        <extracomment>MakerFontDefault</extracomment>
        <translation>Standard</translation>
    </message>
    <message id="63752">
        <source>bold</source>
        <extracomment>MakerFontBold</extracomment>
        <translation>fett</translation>
    </message>
    <message id="63753">
        <source>italic</source>
        <extracomment>MakerFontItalic</extracomment>
        <translation>kursiv</translation>
    </message>
    <message id="63754">
        <source>underlined</source>
        <extracomment>MakerFontUnderline</extracomment>
        <translation>unterstrichen</translation>
    </message>
    <message id="63755">
        <source>struck out</source>
        <extracomment>MakerFontStrikeout</extracomment>
        <translation>durchgestrichen</translation>
    </message>
    <message id="63756">
        <source>Selected</source>
        <extracomment>MakerSelectedName</extracomment>
        <translation>Ausgewählt</translation>
    </message>
    <message id="63757">
        <source>Properties</source>
        <extracomment>MakerSheetTitle</extracomment>
        <translation>Eigenschaften</translation>
    </message>
    <message id="63780">
        <source>Name:</source>
        <extracomment>PropName</extracomment>
        <translation>Name:</translation>
    </message>
    <message id="63781">
        <source>Caption:</source>
        <extracomment>PropCaption</extracomment>
        <translation>Beschriftung:</translation>
    </message>
    <message id="63782">
        <source>Field:</source>
        <extracomment>PropField</extracomment>
        <translation>Feld:</translation>
    </message>
    <message id="63783">
        <source>– computed –</source>
        <extracomment>PropNoField</extracomment>
        <translation>– berechnet –</translation>
    </message>
    <message id="63784">
        <source>ControlSource Expression</source>
        <extracomment>PropHasSource</extracomment>
        <translation>Ausdruck als Quelle</translation>
    </message>
    <message id="63785">
        <source>Expression:</source>
        <extracomment>PropSource</extracomment>
        <translation>Ausdruck:</translation>
    </message>
    <message id="63786">
        <source>Evaluated:</source>
        <extracomment>PropScope</extracomment>
        <translation>Auswertung:</translation>
    </message>
    <message id="63787">
        <source>–</source>
        <extracomment>PropScopeNone</extracomment>
        <translation>–</translation>
    </message>
    <message id="63788">
        <source>on each record</source>
        <extracomment>PropScopeRecord</extracomment>
        <translation>je Datensatz</translation>
    </message>
    <message id="63789">
        <source>over all records</source>
        <extracomment>PropScopeWhole</extracomment>
        <translation>über alle Datensätze</translation>
    </message>
    <message id="63790">
        <source>Kind:</source>
        <extracomment>PropEditKind</extracomment>
        <translation>Art:</translation>
    </message>
    <message id="63791">
        <source>Plain</source>
        <extracomment>PropEditPlain</extracomment>
        <translation>Einfach</translation>
    </message>
    <message id="63792">
        <source>+Date Picker</source>
        <extracomment>PropEditDate</extracomment>
        <translation>+Kalender</translation>
    </message>
    <message id="63793">
        <source>+Extendable</source>
        <extracomment>PropEditExtendable</extracomment>
        <translation>+Erweiterbar</translation>
    </message>
    <message id="63794">
        <source>Lines:</source>
        <extracomment>PropLines</extracomment>
        <translation>Zeilen:</translation>
    </message>
    <message id="63795">
        <source>Default Value:</source>
        <extracomment>PropDefaultValue</extracomment>
        <translation>Vorgabewert:</translation>
    </message>
    <message id="63796">
        <source>Shows a table field</source>
        <extracomment>PropFieldBound</extracomment>
        <translation>Zeigt ein Tabellenfeld</translation>
    </message>
    <message id="63797">
        <source>+Data From Query</source>
        <extracomment>PropFromQuery</extracomment>
        <translation>+Daten aus Abfrage</translation>
    </message>
    <message id="63798">
        <source>Query:</source>
        <extracomment>PropQuery</extracomment>
        <translation>Abfrage:</translation>
    </message>
    <message id="63799">
        <source>Data:</source>
        <extracomment>PropData</extracomment>
        <translation>Daten:</translation>
    </message>
    <message id="63800">
        <source>Items or expression:</source>
        <extracomment>PropItems</extracomment>
        <translation>Einträge oder Ausdruck:</translation>
    </message>
    <message id="63801">
        <source>Columns:</source>
        <extracomment>PropColumns</extracomment>
        <translation>Spalten:</translation>
    </message>
    <message id="63802">
        <source>Column</source>
        <extracomment>PropColumnName</extracomment>
        <translation>Spalte</translation>
    </message>
    <message id="63803">
        <source>Expression</source>
        <extracomment>PropColumnExpression</extracomment>
        <translation>Ausdruck</translation>
    </message>
    <message id="63804">
        <source>Function:</source>
        <extracomment>PropFunction</extracomment>
        <translation>Funktion:</translation>
    </message>
    <message id="63805">
        <source>–</source>
        <extracomment>PropFunctionNone</extracomment>
        <translation>–</translation>
    </message>
    <message id="63806">
        <source>SELECT</source>
        <extracomment>PropFnSelect</extracomment>
        <translation>SELECT</translation>
    </message>
    <message id="63807">
        <source>DELETE RECORD</source>
        <extracomment>PropFnDelete</extracomment>
        <translation>DELETE RECORD</translation>
    </message>
    <message id="63808">
        <source>UPDATE</source>
        <extracomment>PropFnUpdate</extracomment>
        <translation>UPDATE</translation>
    </message>
    <message id="63809">
        <source>CLEAR FORM</source>
        <extracomment>PropFnClear</extracomment>
        <translation>CLEAR FORM</translation>
    </message>
    <message id="63810">
        <source>RECALC</source>
        <extracomment>PropFnRecalc</extracomment>
        <translation>RECALC</translation>
    </message>
    <message id="63811">
        <source>CALL FORM</source>
        <extracomment>PropFnCall</extracomment>
        <translation>CALL FORM</translation>
    </message>
    <message id="63812">
        <source>UPDATE ALL</source>
        <extracomment>PropFnUpdateAll</extracomment>
        <translation>UPDATE ALL</translation>
    </message>
    <message id="63813">
        <source>INSERT (kept)</source>
        <extracomment>PropFnInsert</extracomment>
        <translation>INSERT (beibehalten)</translation>
    </message>
    <message id="63814">
        <source>First record (kept)</source>
        <extracomment>PropFnFirst</extracomment>
        <translation>Erster Datensatz (beibehalten)</translation>
    </message>
    <message id="63815">
        <source>Last record (kept)</source>
        <extracomment>PropFnLast</extracomment>
        <translation>Letzter Datensatz (beibehalten)</translation>
    </message>
    <message id="63816">
        <source>Next record (kept)</source>
        <extracomment>PropFnNext</extracomment>
        <translation>Nächster Datensatz (beibehalten)</translation>
    </message>
    <message id="63817">
        <source>Previous record (kept)</source>
        <extracomment>PropFnPrevious</extracomment>
        <translation>Voriger Datensatz (beibehalten)</translation>
    </message>
    <message id="63818">
        <source>Close (kept)</source>
        <extracomment>PropFnClose</extracomment>
        <translation>Schließen (beibehalten)</translation>
    </message>
    <message id="63819">
        <source>Nothing (kept)</source>
        <extracomment>PropFnNothing</extracomment>
        <translation>Nichts (beibehalten)</translation>
    </message>
    <message id="63820">
        <source>Other (%1)</source>
        <extracomment>PropOther</extracomment>
        <translation>Andere (%1)</translation>
    </message>
    <message id="63821">
        <source>SELECT * </source>
        <extracomment>PropSelectText</extracomment>
        <translation>SELECT * </translation>
    </message>
    <message id="63822">
        <source>Default Query</source>
        <extracomment>PropDefaultQuery</extracomment>
        <translation>Standardabfrage</translation>
    </message>
    <message id="63823">
        <source>Assignments:</source>
        <extracomment>PropAssignments</extracomment>
        <translation>Zuweisungen:</translation>
    </message>
    <message id="63824">
        <source>Field</source>
        <extracomment>PropTarget</extracomment>
        <translation>Feld</translation>
    </message>
    <message id="63825">
        <source>Value</source>
        <extracomment>PropValue</extracomment>
        <translation>Wert</translation>
    </message>
    <message id="63826">
        <source>Form:</source>
        <extracomment>PropCalledForm</extracomment>
        <translation>Formular:</translation>
    </message>
    <message id="63827">
        <source>Call with Current Query Result</source>
        <extracomment>PropWithResult</extracomment>
        <translation>Mit aktuellem Abfrageergebnis aufrufen</translation>
    </message>
    <message id="63828">
        <source>Close current form</source>
        <extracomment>PropCloseCurrent</extracomment>
        <translation>Aktuelles Formular schließen</translation>
    </message>
    <message id="63829">
        <source>Align:</source>
        <extracomment>PropAlign</extracomment>
        <translation>Ausrichtung:</translation>
    </message>
    <message id="63830">
        <source>Left</source>
        <extracomment>PropAlignLeft</extracomment>
        <translation>Links</translation>
    </message>
    <message id="63831">
        <source>Center</source>
        <extracomment>PropAlignCentre</extracomment>
        <translation>Mitte</translation>
    </message>
    <message id="63832">
        <source>Right</source>
        <extracomment>PropAlignRight</extracomment>
        <translation>Rechts</translation>
    </message>
    <message id="63833">
        <source>Auto Horizontal Scroll</source>
        <extracomment>PropAutoScroll</extracomment>
        <translation>Automatisch waagerecht rollen</translation>
    </message>
    <message id="63834">
        <source>Vertical Scroll Bar</source>
        <extracomment>PropVerticalScroll</extracomment>
        <translation>Senkrechter Rollbalken</translation>
    </message>
    <message id="63835">
        <source>Border</source>
        <extracomment>PropBorder</extracomment>
        <translation>Rahmen</translation>
    </message>
    <message id="63836">
        <source>Font:</source>
        <extracomment>PropFont</extracomment>
        <translation>Schrift:</translation>
    </message>
    <message id="63837">
        <source>Background:</source>
        <extracomment>PropGround</extracomment>
        <translation>Hintergrund:</translation>
    </message>
    <message id="63838">
        <source>Left:</source>
        <extracomment>PropLeft</extracomment>
        <translation>Links:</translation>
    </message>
    <message id="63839">
        <source>Top:</source>
        <extracomment>PropTop</extracomment>
        <translation>Oben:</translation>
    </message>
    <message id="63840">
        <source>Width:</source>
        <extracomment>PropWidth</extracomment>
        <translation>Breite:</translation>
    </message>
    <message id="63841">
        <source>Height:</source>
        <extracomment>PropHeight</extracomment>
        <translation>Höhe:</translation>
    </message>
    <message id="63842">
        <source>Content</source>
        <extracomment>PropGroupContent</extracomment>
        <translation>Inhalt</translation>
    </message>
    <message id="63843">
        <source>Look</source>
        <extracomment>PropGroupLook</extracomment>
        <translation>Aussehen</translation>
    </message>
    <message id="63844">
        <source>Place</source>
        <extracomment>PropGroupPlace</extracomment>
        <translation>Platz</translation>
    </message>
    <message id="63845">
        <source>On Startup</source>
        <extracomment>PropGroupStart</extracomment>
        <translation>Beim Start</translation>
    </message>
    <message id="63846">
        <source>Table:</source>
        <extracomment>PropTable</extracomment>
        <translation>Tabelle:</translation>
    </message>
    <message id="63847">
        <source>Width:</source>
        <extracomment>PropFormWidth</extracomment>
        <translation>Breite:</translation>
    </message>
    <message id="63848">
        <source>Height:</source>
        <extracomment>PropFormHeight</extracomment>
        <translation>Höhe:</translation>
    </message>
    <message id="63849">
        <source>Raise Input Panel on Startup</source>
        <extracomment>PropRaisePanel</extracomment>
        <translation>Bildschirmtastatur beim Start</translation>
    </message>
    <message id="63850">
        <source>Form Scroll Bar on Startup</source>
        <extracomment>PropFormScrollBar</extracomment>
        <translation>Rollbalken beim Start</translation>
    </message>
    <message id="63851">
        <source>Default Query on Startup</source>
        <extracomment>PropQueryOnStartup</extracomment>
        <translation>Standardabfrage beim Start</translation>
    </message>
    <message id="63852">
        <source>Builder...</source>
        <extracomment>PropBuilder</extracomment>
        <translation>Abfrageeditor...</translation>
    </message>
    <message id="63853">
        <source>Opens the query builder on this query</source>
        <extracomment>PropBuilderTip</extracomment>
        <translation>Diese Abfrage im Abfrageeditor öffnen</translation>
    </message>
    <message id="63854">
        <source>Add</source>
        <extracomment>PropAddRow</extracomment>
        <translation>Hinzufügen</translation>
    </message>
    <message id="63855">
        <source>Remove</source>
        <extracomment>PropRemoveRow</extracomment>
        <translation>Entfernen</translation>
    </message>
    <message id="63856">
        <source>All Fields</source>
        <extracomment>PropAllFields</extracomment>
        <translation>Alle Felder</translation>
    </message>
    <message id="63857">
        <source>An assignment for each field that a control shows</source>
        <extracomment>PropAllFieldsTip</extracomment>
        <translation>Eine Zuweisung für jedes Feld, das ein Steuerelement zeigt</translation>
    </message>
    <message id="63858">
        <source>Up</source>
        <extracomment>PropRowUp</extracomment>
        <translation>Nach oben</translation>
    </message>
    <message id="63859">
        <source>Down</source>
        <extracomment>PropRowDown</extracomment>
        <translation>Nach unten</translation>
    </message>
    <message id="63860">
        <source>Expression...</source>
        <extracomment>PropDesk</extracomment>
        <translation>Ausdruck...</translation>
    </message>
    <message id="63861">
        <source>Write the expression with its value in sight</source>
        <extracomment>PropDeskTip</extracomment>
        <translation>Den Ausdruck schreiben und seinen Wert dabei sehen</translation>
    </message>
    <message id="63862">
        <source>Text color:</source>
        <extracomment>PropTextColor</extracomment>
        <translation>Textfarbe:</translation>
    </message>
    <message id="63863">
        <source>Text:</source>
        <extracomment>PropText</extracomment>
        <translation>Text:</translation>
    </message>
    <message id="63864">
        <source>Choose...</source>
        <extracomment>PropChoose</extracomment>
        <translation>Auswählen...</translation>
    </message>
    <message id="63865">
        <source>(no table)</source>
        <extracomment>PropNoTable</extracomment>
        <translation>(keine Tabelle)</translation>
    </message>
    <message id="63866">
        <source>Window style:</source>
        <extracomment>PropWindowStyle</extracomment>
        <translation>Fensterstil:</translation>
    </message>
    <message id="63867">
        <source>Control:</source>
        <extracomment>PropControl</extracomment>
        <translation>Steuerelement:</translation>
    </message>
    <message id="63868">
        <source>Form</source>
        <extracomment>PropFormItself</extracomment>
        <translation>Formular</translation>
    </message>
    <message id="63880">
        <source>Expression</source>
        <extracomment>DeskTitle</extracomment>
        <translation>Ausdruck</translation>
    </message>
    <message id="63881">
        <source>Expression</source>
        <extracomment>DeskText</extracomment>
        <translation>Ausdruck</translation>
    </message>
    <message id="63882">
        <source>Record %1: %2</source>
        <extracomment>DeskValue</extracomment>
        <translation>Datensatz %1: %2</translation>
    </message>
    <message id="63883">
        <source>All %1 records: %2</source>
        <extracomment>DeskWhole</extracomment>
        <translation>Alle %1 Datensätze: %2</translation>
    </message>
    <message id="63884">
        <source>null: shows nothing</source>
        <extracomment>DeskNull</extracomment>
        <translation>null: zeigt nichts</translation>
    </message>
    <message id="63885">
        <source>the empty text</source>
        <extracomment>DeskEmptyText</extracomment>
        <translation>der leere Text</translation>
    </message>
    <message id="63886">
        <source>ticked</source>
        <extracomment>DeskTicked</extracomment>
        <translation>angekreuzt</translation>
    </message>
    <message id="63887">
        <source>not ticked</source>
        <extracomment>DeskNotTicked</extracomment>
        <translation>nicht angekreuzt</translation>
    </message>
    <message id="63888">
        <source>There is no result to try it on.</source>
        <extracomment>DeskNoResult</extracomment>
        <translation>Es gibt kein Ergebnis, an dem er sich ausprobieren ließe.</translation>
    </message>
    <message id="63889">
        <source>The table holds no record to try it on.</source>
        <extracomment>DeskNoRecord</extracomment>
        <translation>Die Tabelle enthält keinen Datensatz, an dem er sich ausprobieren ließe.</translation>
    </message>
    <message id="63890">
        <source>Nothing: the control shows what is put into it.</source>
        <extracomment>DeskNothing</extracomment>
        <translation>Nichts: Das Steuerelement zeigt, was hineingeschrieben wird.</translation>
    </message>
    <message id="63891">
        <source>Previous Record</source>
        <extracomment>DeskPrevious</extracomment>
        <translation>Voriger Datensatz</translation>
    </message>
    <message id="63892">
        <source>Next Record</source>
        <extracomment>DeskNext</extracomment>
        <translation>Nächster Datensatz</translation>
    </message>
    <message id="63893">
        <source>Fields</source>
        <extracomment>DeskFields</extracomment>
        <translation>Felder</translation>
    </message>
    <message id="63894">
        <source>Functions</source>
        <extracomment>DeskFunctions</extracomment>
        <translation>Funktionen</translation>
    </message>
    <message id="63895">
        <source>Controls</source>
        <extracomment>DeskControls</extracomment>
        <translation>Elemente</translation>
    </message>
    <message id="63896">
        <source>Meaning</source>
        <extracomment>DeskMeaning</extracomment>
        <translation>Bedeutung</translation>
    </message>
    <message id="63897">
        <source>Notes</source>
        <extracomment>DeskNotes</extracomment>
        <translation>Hinweise</translation>
    </message>
    <message id="63898">
        <source>Nothing to remark.</source>
        <extracomment>DeskNoNotes</extracomment>
        <translation>Keine Hinweise.</translation>
    </message>
    <message id="63899">
        <source>Tap twice to insert.</source>
        <extracomment>DeskHelpHint</extracomment>
        <translation>Zum Einfügen zweimal tippen.</translation>
    </message>
    <message id="63900">
        <source>There is no control "%1" that holds a value; it counts as the empty text.</source>
        <extracomment>DeskUnknownControl</extracomment>
        <translation>Ein Steuerelement „%1“ mit einem Wert gibt es nicht; es zählt als leerer Text.</translation>
    </message>
    <message id="63901">
        <source>These controls refer to each other in a circle: %1. It is broken at the first one in the order of the form.</source>
        <extracomment>DeskCircle</extracomment>
        <translation>Diese Steuerelemente verweisen im Kreis aufeinander: %1. Er wird beim ersten in der Reihenfolge des Formulars durchbrochen.</translation>
    </message>
    <message id="63902">
        <source>%1 is computed over all records; choose "over all records", or it shows nothing.</source>
        <extracomment>DeskNoAggregateHere</extracomment>
        <translation>%1 wird über alle Datensätze berechnet; wählen Sie „über alle Datensätze“, sonst zeigt es nichts.</translation>
    </message>
    <message id="63903">
        <source>%1 has no value in a list: a row is one record.</source>
        <extracomment>DeskColumnAggregate</extracomment>
        <translation>%1 hat in einer Liste keinen Wert: Eine Zeile ist ein Datensatz.</translation>
    </message>
    <message id="63904">
        <source>The table has no field "%1": this assignment does nothing.</source>
        <extracomment>DeskNoSuchTarget</extracomment>
        <translation>Die Tabelle hat kein Feld „%1“: Diese Zuweisung bewirkt nichts.</translation>
    </message>
    <message id="63905">
        <source>This will show nothing, or less than it says:
%1
Use it all the same?</source>
        <extracomment>DeskUseAnyway</extracomment>
        <translation>Dies wird nichts oder weniger zeigen, als es sagt:
%1
Trotzdem verwenden?</translation>
    </message>
    <message id="63906">
        <source>The statement does not read: %1</source>
        <extracomment>DeskBad</extracomment>
        <translation>Die Anweisung ist nicht lesbar: %1</translation>
    </message>
    <message id="63907">
        <source>There is no form "%1".</source>
        <extracomment>DeskNoSuchForm</extracomment>
        <translation>Ein Formular „%1“ gibt es nicht.</translation>
    </message>
    <message id="63908">
        <source>&amp;Insert</source>
        <extracomment>DeskInsert</extracomment>
        <translation>&amp;Einfügen</translation>
    </message>
    <message id="63920">
        <source>the field %1</source>
        <extracomment>WordField</extracomment>
        <translation>das Feld %1</translation>
    </message>
    <message id="63921">
        <source>the text of the control %1</source>
        <extracomment>WordControl</extracomment>
        <translation>der Text des Steuerelements %1</translation>
    </message>
    <message id="63922">
        <source>the number %1</source>
        <extracomment>WordNumber</extracomment>
        <translation>die Zahl %1</translation>
    </message>
    <message id="63923">
        <source>the text '%1'</source>
        <extracomment>WordText</extracomment>
        <translation>der Text '%1'</translation>
    </message>
    <message id="63924">
        <source>NULL</source>
        <extracomment>WordNull</extracomment>
        <translation>NULL</translation>
    </message>
    <message id="63925">
        <source>(nothing)</source>
        <extracomment>WordMissing</extracomment>
        <translation>(nichts)</translation>
    </message>
    <message id="63926">
        <source>added or joined:</source>
        <extracomment>WordAdd</extracomment>
        <translation>addiert oder verkettet:</translation>
    </message>
    <message id="63927">
        <source>minus:</source>
        <extracomment>WordSubtract</extracomment>
        <translation>minus:</translation>
    </message>
    <message id="63928">
        <source>multiplied:</source>
        <extracomment>WordMultiply</extracomment>
        <translation>multipliziert:</translation>
    </message>
    <message id="63929">
        <source>divided:</source>
        <extracomment>WordDivide</extracomment>
        <translation>dividiert:</translation>
    </message>
    <message id="63930">
        <source>to the power of:</source>
        <extracomment>WordPower</extracomment>
        <translation>hoch:</translation>
    </message>
    <message id="63931">
        <source>the remainder of the division:</source>
        <extracomment>WordRemainder</extracomment>
        <translation>der Rest der Division:</translation>
    </message>
    <message id="63932">
        <source>the first, where the second holds:</source>
        <extracomment>WordWhere</extracomment>
        <translation>das Erste, wo das Zweite zutrifft:</translation>
    </message>
    <message id="63933">
        <source>both hold:</source>
        <extracomment>WordAnd</extracomment>
        <translation>beides trifft zu:</translation>
    </message>
    <message id="63934">
        <source>one of them holds:</source>
        <extracomment>WordOr</extracomment>
        <translation>eines davon trifft zu:</translation>
    </message>
    <message id="63935">
        <source>does not hold:</source>
        <extracomment>WordNot</extracomment>
        <translation>trifft nicht zu:</translation>
    </message>
    <message id="63936">
        <source>are equal:</source>
        <extracomment>WordEqual</extracomment>
        <translation>sind gleich:</translation>
    </message>
    <message id="63937">
        <source>differ:</source>
        <extracomment>WordNotEqual</extracomment>
        <translation>sind verschieden:</translation>
    </message>
    <message id="63938">
        <source>fits the pattern:</source>
        <extracomment>WordLike</extracomment>
        <translation>passt zum Muster:</translation>
    </message>
    <message id="63939">
        <source>is at least:</source>
        <extracomment>WordGreaterOrEqual</extracomment>
        <translation>ist mindestens:</translation>
    </message>
    <message id="63940">
        <source>is at most:</source>
        <extracomment>WordLessOrEqual</extracomment>
        <translation>ist höchstens:</translation>
    </message>
    <message id="63941">
        <source>is greater than:</source>
        <extracomment>WordGreater</extracomment>
        <translation>ist größer als:</translation>
    </message>
    <message id="63942">
        <source>is less than:</source>
        <extracomment>WordLess</extracomment>
        <translation>ist kleiner als:</translation>
    </message>
    <message id="63943">
        <source>the sum over all records of:</source>
        <extracomment>WordSum</extracomment>
        <translation>die Summe über alle Datensätze von:</translation>
    </message>
    <message id="63944">
        <source>the average over all records of:</source>
        <extracomment>WordAvg</extracomment>
        <translation>der Durchschnitt über alle Datensätze von:</translation>
    </message>
    <message id="63945">
        <source>the greatest over all records of:</source>
        <extracomment>WordMax</extracomment>
        <translation>der größte Wert über alle Datensätze von:</translation>
    </message>
    <message id="63946">
        <source>the least over all records of:</source>
        <extracomment>WordMin</extracomment>
        <translation>der kleinste Wert über alle Datensätze von:</translation>
    </message>
    <message id="63947">
        <source>%1 of:</source>
        <extracomment>WordFunction</extracomment>
        <translation>%1 von:</translation>
    </message>
    <message id="63948">
        <source>%1</source>
        <extracomment>WordFunctionAlone</extracomment>
        <translation>%1</translation>
    </message>
    <message id="63949">
        <source>%1</source>
        <extracomment>WordOther</extracomment>
        <translation>%1</translation>
    </message>
    <message id="63960">
        <source>The file "%1" cannot be read: %2</source>
        <extracomment>CliFormFileUnreadable</extracomment>
        <translation>Die Datei „%1“ lässt sich nicht lesen: %2</translation>
    </message>
    <message id="63961">
        <source>The file is no JSON: %1, at byte %2.</source>
        <extracomment>CliJsonFault</extracomment>
        <translation>Die Datei ist kein JSON: %1, bei Byte %2.</translation>
    </message>
    <message id="63962">
        <source>%1: %2</source>
        <extracomment>CliJsonMember</extracomment>
        <translation>%1: %2</translation>
    </message>
    <message id="63963">
        <source>an object is wanted</source>
        <extracomment>JsonNotObject</extracomment>
        <translation>hier gehört ein Objekt hin</translation>
    </message>
    <message id="63964">
        <source>an array is wanted</source>
        <extracomment>JsonNotArray</extracomment>
        <translation>hier gehört ein Array hin</translation>
    </message>
    <message id="63965">
        <source>a whole number from %1 to %2 is wanted</source>
        <extracomment>JsonNotNumber</extracomment>
        <translation>hier gehört eine ganze Zahl von %1 bis %2 hin</translation>
    </message>
    <message id="63966">
        <source>a text is wanted</source>
        <extracomment>JsonNotText</extracomment>
        <translation>hier gehört ein Text hin</translation>
    </message>
    <message id="63967">
        <source>at most %1 characters fit</source>
        <extracomment>JsonTextTooLong</extracomment>
        <translation>höchstens %1 Zeichen passen</translation>
    </message>
    <message id="63968">
        <source>there is no such member</source>
        <extracomment>JsonUnknown</extracomment>
        <translation>das gibt es hier nicht</translation>
    </message>
    <message id="63969">
        <source>one form is wanted, and %1 are there</source>
        <extracomment>JsonNotOneForm</extracomment>
        <translation>ein Formular gehört hierher, es sind aber %1</translation>
    </message>
    <message id="63970">
        <source>a NUL cannot be kept</source>
        <extracomment>JsonNulInText</extracomment>
        <translation>ein NUL-Zeichen lässt sich nicht speichern</translation>
    </message>
    <message id="63971">
        <source>queries cannot be replaced here</source>
        <extracomment>JsonNoQueries</extracomment>
        <translation>Abfragen lassen sich hier nicht ersetzen</translation>
    </message>
    <message id="64200">
        <source>&amp;Window</source>
        <extracomment>MenuWindow</extracomment>
        <translation>&amp;Fenster</translation>
    </message>
    <message id="64201">
        <source>&amp;Next View</source>
        <extracomment>CommandNextView</extracomment>
        <translation>&amp;Nächste Ansicht</translation>
    </message>
    <message id="64202">
        <source>Brings the next open view forward</source>
        <extracomment>TipNextView</extracomment>
        <translation>Bringt die nächste offene Ansicht nach vorn</translation>
    </message>
    <message id="64203">
        <source>&amp;Previous View</source>
        <extracomment>CommandPreviousView</extracomment>
        <translation>&amp;Vorige Ansicht</translation>
    </message>
    <message id="64204">
        <source>Brings the view before this one forward</source>
        <extracomment>TipPreviousView</extracomment>
        <translation>Bringt die vorige offene Ansicht nach vorn</translation>
    </message>
    <message id="64205">
        <source>&amp;Close</source>
        <extracomment>CommandCloseView</extracomment>
        <translation>Schl&amp;ießen</translation>
    </message>
    <message id="64206">
        <source>Closes the view in front</source>
        <extracomment>TipCloseView</extracomment>
        <translation>Schließt die vordere Ansicht</translation>
    </message>
    <message id="64207">
        <source>Close &amp;Others</source>
        <extracomment>CommandCloseOthers</extracomment>
        <translation>&amp;Andere schließen</translation>
    </message>
    <message id="64208">
        <source>Closes all views but the one in front</source>
        <extracomment>TipCloseOthers</extracomment>
        <translation>Schließt alle Ansichten außer der vorderen</translation>
    </message>
    <message id="64209">
        <source>Open in New &amp;Window</source>
        <extracomment>CommandOpenInWindow</extracomment>
        <translation>In neuem &amp;Fenster öffnen</translation>
    </message>
    <message id="64210">
        <source>Moves this view into a window of its own</source>
        <extracomment>TipOpenInWindow</extracomment>
        <translation>Verschiebt diese Ansicht in ein eigenes Fenster</translation>
    </message>
    <message id="64211">
        <source>Show as &amp;Tab</source>
        <extracomment>CommandShowAsTab</extracomment>
        <translation>Als &amp;Registerblatt zeigen</translation>
    </message>
    <message id="64212">
        <source>Moves this view back into the main window</source>
        <extracomment>TipShowAsTab</extracomment>
        <translation>Holt diese Ansicht in das Hauptfenster zurück</translation>
    </message>
    <message id="64213">
        <source>&amp;Lists of the Database</source>
        <extracomment>CommandShowLists</extracomment>
        <translation>&amp;Listen der Datenbank</translation>
    </message>
    <message id="64214">
        <source>Shows the tables, forms and queries; open views stay open</source>
        <extracomment>TipShowLists</extracomment>
        <translation>Zeigt die Tabellen, Formulare und Abfragen; offene Ansichten bleiben offen</translation>
    </message>
    <message id="64215">
        <source>%1 - %2</source>
        <extracomment>TitleOfView</extracomment>
        <translation>%1 - %2</translation>
    </message>
    <message id="64216">
        <source>Open views</source>
        <extracomment>OpenViews</extracomment>
        <translation>Offene Ansichten</translation>
    </message>
    <message id="64217">
        <source>&amp;%1 %2</source>
        <extracomment>ViewEntry</extracomment>
        <translation>&amp;%1 %2</translation>
    </message>
    <message id="64220">
        <source>Favorites, tables, forms and queries</source>
        <extracomment>SideBarName</extracomment>
        <translation>Favoriten, Tabellen, Formulare und Abfragen</translation>
    </message>
    <message id="64221">
        <source>Search tables, forms …</source>
        <extracomment>SideBarSearch</extracomment>
        <translation>Tabellen, Formulare suchen …</translation>
    </message>
    <message id="64222">
        <source>Favorites</source>
        <extracomment>SectionFavorites</extracomment>
        <translation>Favoriten</translation>
    </message>
    <message id="64223">
        <source>Tables</source>
        <extracomment>SectionTables</extracomment>
        <translation>Tabellen</translation>
    </message>
    <message id="64224">
        <source>Forms</source>
        <extracomment>SectionForms</extracomment>
        <translation>Formulare</translation>
    </message>
    <message id="64225">
        <source>Queries</source>
        <extracomment>SectionQueries</extracomment>
        <translation>Abfragen</translation>
    </message>
    <message id="64226">
        <source>table</source>
        <extracomment>FavoriteTable</extracomment>
        <translation>Tabelle</translation>
    </message>
    <message id="64227">
        <source>form</source>
        <extracomment>FavoriteForm</extracomment>
        <translation>Formular</translation>
    </message>
    <message id="64228">
        <source>query</source>
        <extracomment>FavoriteQuery</extracomment>
        <translation>Abfrage</translation>
    </message>
    <message id="64229">
        <source>gone</source>
        <extracomment>FavoriteGone</extracomment>
        <translation>fehlt</translation>
    </message>
    <message id="64241" numerus="yes">
        <source>%1 fields</source>
        <extracomment>SummaryFields</extracomment>
        <translation>
            <numerusform>%1 Feld</numerusform>
            <numerusform>%1 Felder</numerusform>
        </translation>
    </message>
    <message id="64243" numerus="yes">
        <source>%1 records</source>
        <extracomment>SummaryRecords</extracomment>
        <translation>
            <numerusform>%1 Datensatz</numerusform>
            <numerusform>%1 Datensätze</numerusform>
        </translation>
    </message>
    <message id="64244">
        <source>counting …</source>
        <extracomment>SummaryCounting</extracomment>
        <translation>wird gezählt …</translation>
    </message>
    <message id="64245">
        <source>%1, %2</source>
        <extracomment>SummaryFile</extracomment>
        <translation>%1, %2</translation>
    </message>
    <message id="64246">
        <source>changed %1</source>
        <extracomment>SummaryChanged</extracomment>
        <translation>geändert %1</translation>
    </message>
    <message id="64247">
        <source>changed today, %1</source>
        <extracomment>SummaryChangedToday</extracomment>
        <translation>heute geändert, %1</translation>
    </message>
    <message id="64248">
        <source>Form for %1</source>
        <extracomment>SummaryFormOf</extracomment>
        <translation>Formular zu %1</translation>
    </message>
    <message id="64249">
        <source>Query on %1</source>
        <extracomment>SummaryQueryOf</extracomment>
        <translation>Abfrage zu %1</translation>
    </message>
    <message id="64250">
        <source>It is not in this database any more.</source>
        <extracomment>SummaryGone</extracomment>
        <translation>Der Eintrag ist nicht mehr in dieser Datenbank.</translation>
    </message>
    <message id="64251">
        <source>About the selected entry</source>
        <extracomment>SummaryName</extracomment>
        <translation>Über den ausgewählten Eintrag</translation>
    </message>
    <message id="64260">
        <source>Open a table, form or query from the list beside.</source>
        <extracomment>EmptyTabsHint</extracomment>
        <translation>Öffnen Sie eine Tabelle, ein Formular oder eine Abfrage aus der Liste daneben.</translation>
    </message>
    <message id="64261">
        <source>This database has no tables yet. New makes the first one.</source>
        <extracomment>EmptyDatabaseHint</extracomment>
        <translation>Diese Datenbank hat noch keine Tabellen. „Neu“ legt die erste an.</translation>
    </message>
    <message id="64262">
        <source>%1 is gone: another program moved or deleted it. What is typed here is not saved to it.</source>
        <extracomment>FileGone</extracomment>
        <translation>%1 ist weg: Ein anderes Programm hat die Datei verschoben oder gelöscht. Was hier getippt wird, wird nicht darin gespeichert.</translation>
    </message>
    <message id="64263">
        <source>Remove from Favorites takes it off this list; delete it where it is listed by its kind</source>
        <extracomment>TipFavoriteNoDelete</extracomment>
        <translation>„Aus Favoriten entfernen“ nimmt den Eintrag von dieser Liste; gelöscht wird er dort, wo er nach seiner Art steht</translation>
    </message>
    <message id="64264">
        <source>Select it under Favorites to take it off that list</source>
        <extracomment>TipOnlyOnFavorites</extracomment>
        <translation>Wählen Sie ihn unter Favoriten aus, um ihn von dieser Liste zu nehmen</translation>
    </message>
    <message id="64265">
        <source>Side &amp;Bar</source>
        <extracomment>MenuSideBar</extracomment>
        <translation>Seiten&amp;leiste</translation>
    </message>
    <message id="64266">
        <source>The open views and the lists</source>
        <extracomment>MenuOfViews</extracomment>
        <translation>Die offenen Ansichten und die Listen</translation>
    </message>
    <message id="64800">
        <source>not a date: %1</source>
        <extracomment>WhyNotDate</extracomment>
        <translation>kein Datum: %1</translation>
    </message>
    <message id="64801">
        <source>not a number: %1</source>
        <extracomment>WhyNotNumber</extracomment>
        <translation>keine Zahl: %1</translation>
    </message>
    <message id="64802">
        <source>not a whole number: %1</source>
        <extracomment>WhyNotWhole</extracomment>
        <translation>keine ganze Zahl: %1</translation>
    </message>
    <message id="64803">
        <source>from %1 to %2, this is %3</source>
        <extracomment>WhyOutOfRange</extracomment>
        <translation>von %1 bis %2, dies ist %3</translation>
    </message>
    <message id="64804">
        <source>at most %1 characters, this has %2</source>
        <extracomment>WhyTooLong</extracomment>
        <translation>höchstens %1 Zeichen, dies sind %2</translation>
    </message>
    <message id="64805">
        <source>%1: %2</source>
        <extracomment>WhyOfField</extracomment>
        <translation>%1: %2</translation>
    </message>
    <message id="64806">
        <source>This result is read-only: its records cannot be changed here.</source>
        <extracomment>WhyReadOnly</extracomment>
        <translation>Dieses Ergebnis ist schreibgeschützt: Seine Datensätze lassen sich hier nicht ändern.</translation>
    </message>
    <message id="64807">
        <source>"%1" holds bytes: they cannot be typed.</source>
        <extracomment>WhyBytes</extracomment>
        <translation>„%1“ enthält Bytes: Sie lassen sich nicht tippen.</translation>
    </message>
    <message id="64808">
        <source>"%1" is computed: it cannot be changed.</source>
        <extracomment>WhyComputed</extracomment>
        <translation>„%1“ ist berechnet und lässt sich nicht ändern.</translation>
    </message>
    <message id="64809">
        <source>a value is missing</source>
        <extracomment>WhyMissing</extracomment>
        <translation>ein Wert fehlt</translation>
    </message>
    <message id="64810">
        <source>&amp;Restore %1</source>
        <extracomment>ErrorRestore</extracomment>
        <translation>%1 &amp;wiederherstellen</translation>
    </message>
    <message id="64811">
        <source>&amp;Restore the empty cell</source>
        <extracomment>ErrorRestoreEmpty</extracomment>
        <translation>Leere Zelle &amp;wiederherstellen</translation>
    </message>
    <message id="64812">
        <source>Gives the old value back, as Escape does</source>
        <extracomment>ErrorRestoreTip</extracomment>
        <translation>Holt den alten Wert zurück, wie Esc</translation>
    </message>
    <message id="64813">
        <source>Why this is not stored: %1</source>
        <extracomment>ErrorMarkTip</extracomment>
        <translation>Warum dies nicht gespeichert ist: %1</translation>
    </message>
    <message id="64820">
        <source>No record matches the filter.</source>
        <extracomment>EmptyFiltered</extracomment>
        <translation>Kein Datensatz passt zum Filter.</translation>
    </message>
    <message id="64821">
        <source>No records yet.</source>
        <extracomment>EmptyTable</extracomment>
        <translation>Noch keine Datensätze.</translation>
    </message>
    <message id="64822">
        <source>No records.</source>
        <extracomment>EmptyResult</extracomment>
        <translation>Keine Datensätze.</translation>
    </message>
    <message id="64830">
        <source>At character %1: "%2" cannot be read here.</source>
        <extracomment>WhyNoPlace</extracomment>
        <translation>Bei Zeichen %1: „%2“ ist hier nicht lesbar.</translation>
    </message>
    <message id="64831">
        <source>The expression breaks off at its end.</source>
        <extracomment>WhyBreaksOff</extracomment>
        <translation>Der Ausdruck bricht am Ende ab.</translation>
    </message>
    <message id="64840">
        <source>Record %1 again, where the list was left.</source>
        <extracomment>DetailLeft</extracomment>
        <translation>Wieder Datensatz %1, wo die Liste verlassen wurde.</translation>
    </message>
    <message id="64850">
        <source>%1: %2</source>
        <extracomment>ConditionIs</extracomment>
        <translation>%1: %2</translation>
    </message>
    <message id="64851">
        <source>%1: not %2</source>
        <extracomment>ConditionIsNot</extracomment>
        <translation>%1: nicht %2</translation>
    </message>
    <message id="64852">
        <source>%1: empty</source>
        <extracomment>ConditionEmpty</extracomment>
        <translation>%1: leer</translation>
    </message>
    <message id="64853">
        <source>%1: not empty</source>
        <extracomment>ConditionNotEmpty</extracomment>
        <translation>%1: nicht leer</translation>
    </message>
    <message id="64854">
        <source>%1 %2 %3</source>
        <extracomment>ConditionCompares</extracomment>
        <translation>%1 %2 %3</translation>
    </message>
    <message id="64855">
        <source>Filter, switched off: %1</source>
        <extracomment>FilterChipOff</extracomment>
        <translation>Filter, ausgeschaltet: %1</translation>
    </message>
    <message id="64856">
        <source>&amp;Remove</source>
        <extracomment>FilterTakeOff</extracomment>
        <translation>&amp;Entfernen</translation>
    </message>
    <message id="64857">
        <source>Take this filter off; the others stay</source>
        <extracomment>FilterTakeOffTip</extracomment>
        <translation>Diesen Filter wegnehmen; die anderen bleiben</translation>
    </message>
    <message id="64858">
        <source>Take off the filter %1</source>
        <extracomment>FilterTakeOffName</extracomment>
        <translation>Den Filter %1 wegnehmen</translation>
    </message>
    <message id="64859">
        <source>&amp;Change…</source>
        <extracomment>FilterChange</extracomment>
        <translation>&amp;Ändern…</translation>
    </message>
    <message id="64860">
        <source>Switch &amp;Off</source>
        <extracomment>FilterSwitchOff</extracomment>
        <translation>&amp;Ausschalten</translation>
    </message>
    <message id="64861">
        <source>Switch &amp;On</source>
        <extracomment>FilterSwitchOn</extracomment>
        <translation>&amp;Einschalten</translation>
    </message>
    <message id="64862">
        <source>Add a filter</source>
        <extracomment>FilterAddTip</extracomment>
        <translation>Einen Filter hinzufügen</translation>
    </message>
    <message id="64870">
        <source>%1…</source>
        <extracomment>CommandThatAsks</extracomment>
        <translation>%1…</translation>
    </message>
    <message id="65000">
        <source>"%1" is the database itself.</source>
        <extracomment>CopyOntoItself</extracomment>
        <translation>„%1“ ist die Datenbank selbst.</translation>
    </message>
    <message id="65001">
        <source>Copying the database …</source>
        <extracomment>BackingUp</extracomment>
        <translation>Die Datenbank wird kopiert …</translation>
    </message>
    <message id="65002">
        <source>%1: the file of forms and queries is empty</source>
        <extracomment>CheckStoreEmpty</extracomment>
        <translation>%1: Die Datei der Formulare und Abfragen ist leer</translation>
    </message>
    <message id="65003">
        <source>%1: the file of forms and queries breaks off</source>
        <extracomment>CheckStoreShort</extracomment>
        <translation>%1: Die Datei der Formulare und Abfragen bricht ab</translation>
    </message>
    <message id="65004">
        <source>%1: the file of forms and queries cannot be read: %2</source>
        <extracomment>CheckStoreUnread</extracomment>
        <translation>%1: Die Datei der Formulare und Abfragen lässt sich nicht lesen: %2</translation>
    </message>
    <message id="65005">
        <source>form "%1": there is no table "%2"</source>
        <extracomment>CheckFormTable</extracomment>
        <translation>Formular „%1“: Eine Tabelle „%2“ gibt es nicht</translation>
    </message>
    <message id="65006">
        <source>form "%1": its records cannot be read: %2</source>
        <extracomment>CheckFormQuery</extracomment>
        <translation>Formular „%1“: Die Datensätze lassen sich nicht lesen: %2</translation>
    </message>
    <message id="65007">
        <source>form "%1", control "%2": there is no field "%3"</source>
        <extracomment>CheckFormField</extracomment>
        <translation>Formular „%1“, Steuerelement „%2“: Ein Feld „%3“ gibt es nicht</translation>
    </message>
    <message id="65008">
        <source>form "%1", button "%2": there is no form "%3"</source>
        <extracomment>CheckFormCall</extracomment>
        <translation>Formular „%1“, Schaltfläche „%2“: Ein Formular „%3“ gibt es nicht</translation>
    </message>
    <message id="65009">
        <source>query "%1": %2</source>
        <extracomment>CheckQuery</extracomment>
        <translation>Abfrage „%1“: %2</translation>
    </message>
    <message id="66000">
        <source>SQLite database (*.db *.db3 *.sqlite *.sqlite3)</source>
        <extracomment>SqliteFilter</extracomment>
        <translation>SQLite-Datenbank (*.db *.db3 *.sqlite *.sqlite3)</translation>
    </message>
    <message id="66001">
        <source>All files (*)</source>
        <extracomment>AllFilesFilter</extracomment>
        <translation>Alle Dateien (*)</translation>
    </message>
    <message id="66002">
        <source>&amp;All files</source>
        <extracomment>ShowAllFiles</extracomment>
        <translation>&amp;Alle Dateien</translation>
    </message>
    <message id="66010">
        <source>&amp;Information</source>
        <extracomment>CommandInformation</extracomment>
        <translation>&amp;Informationen</translation>
    </message>
    <message id="66011">
        <source>Path, stamp and size of the open database, and what it holds</source>
        <extracomment>TipInformation</extracomment>
        <translation>Pfad, Stempel und Größe der offenen Datenbank, und was sie enthält</translation>
    </message>
    <message id="66012">
        <source>&amp;Back Up</source>
        <extracomment>CommandBackUp</extracomment>
        <translation>&amp;Sichern</translation>
    </message>
    <message id="66013">
        <source>Writes a copy with all forms and queries; the database stays open</source>
        <extracomment>TipBackUp</extracomment>
        <translation>Schreibt eine Kopie mit allen Formularen und Abfragen; die Datenbank bleibt offen</translation>
    </message>
    <message id="66014">
        <source>&amp;Compact</source>
        <extracomment>CommandCompact</extracomment>
        <translation>&amp;Komprimieren</translation>
    </message>
    <message id="66015">
        <source>Gives the unused space of the database back</source>
        <extracomment>TipCompact</extracomment>
        <translation>Gibt den ungenutzten Platz der Datenbank frei</translation>
    </message>
    <message id="66016">
        <source>C&amp;heck</source>
        <extracomment>CommandCheck</extracomment>
        <translation>&amp;Prüfen</translation>
    </message>
    <message id="66017">
        <source>Looks for damage, and for forms and queries that refer to what is missing</source>
        <extracomment>TipCheck</extracomment>
        <translation>Sucht nach Schäden und nach Formularen und Abfragen, die auf Fehlendes verweisen</translation>
    </message>
    <message id="66020">
        <source>Database Information</source>
        <extracomment>InformationTitle</extracomment>
        <translation>Informationen zur Datenbank</translation>
    </message>
    <message id="66021">
        <source>Name:</source>
        <extracomment>InformationName</extracomment>
        <translation>Name:</translation>
    </message>
    <message id="66022">
        <source>Folder:</source>
        <extracomment>InformationFolder</extracomment>
        <translation>Ordner:</translation>
    </message>
    <message id="66023">
        <source>Stamp:</source>
        <extracomment>InformationStamp</extracomment>
        <translation>Stempel:</translation>
    </message>
    <message id="66024">
        <source>Size:</source>
        <extracomment>InformationSize</extracomment>
        <translation>Größe:</translation>
    </message>
    <message id="66025">
        <source>Changed:</source>
        <extracomment>InformationChanged</extracomment>
        <translation>Geändert:</translation>
    </message>
    <message id="66026">
        <source>Tables:</source>
        <extracomment>InformationTables</extracomment>
        <translation>Tabellen:</translation>
    </message>
    <message id="66027">
        <source>Records:</source>
        <extracomment>InformationRecords</extracomment>
        <translation>Datensätze:</translation>
    </message>
    <message id="66028">
        <source>Forms:</source>
        <extracomment>InformationForms</extracomment>
        <translation>Formulare:</translation>
    </message>
    <message id="66029">
        <source>Queries:</source>
        <extracomment>InformationQueries</extracomment>
        <translation>Abfragen:</translation>
    </message>
    <message id="66030">
        <source>%1, counting …</source>
        <extracomment>InformationCounting</extracomment>
        <translation>%1, wird gezählt …</translation>
    </message>
    <message id="66031">
        <source>cannot be read</source>
        <extracomment>InformationUnread</extracomment>
        <translation>nicht lesbar</translation>
    </message>
    <message id="66041">
        <source>%1 (copy %2).cdb</source>
        <extracomment>BackUpName</extracomment>
        <translation>%1 (Kopie %2).cdb</translation>
    </message>
    <message id="66042">
        <source>"%1" exists:
Do you want to replace it?</source>
        <extracomment>BackUpReplace</extracomment>
        <translation>„%1“ ist bereits vorhanden:
Möchten Sie die Datei ersetzen?</translation>
    </message>
    <message id="66043">
        <source>The copy is complete: %1 (%2)</source>
        <extracomment>BackUpDone</extracomment>
        <translation>Die Kopie ist fertig: %1 (%2)</translation>
    </message>
    <message id="66044">
        <source>Stopped. No copy was written.</source>
        <extracomment>BackUpStopped</extracomment>
        <translation>Abgebrochen. Es wurde keine Kopie geschrieben.</translation>
    </message>
    <message id="66050">
        <source>Compacting the database …</source>
        <extracomment>Compacting</extracomment>
        <translation>Die Datenbank wird komprimiert …</translation>
    </message>
    <message id="66051">
        <source>Compacted: %1 before, %2 now</source>
        <extracomment>CompactDone</extracomment>
        <translation>Komprimiert: vorher %1, jetzt %2</translation>
    </message>
    <message id="66052">
        <source>Stopped. The database is as it was.</source>
        <extracomment>CompactStopped</extracomment>
        <translation>Abgebrochen. Die Datenbank ist unverändert.</translation>
    </message>
    <message id="66053">
        <source>Another program is using this database. Close it there, and try again.</source>
        <extracomment>CompactInUse</extracomment>
        <translation>Ein anderes Programm verwendet diese Datenbank. Schließen Sie sie dort, und versuchen Sie es noch einmal.</translation>
    </message>
    <message id="66060">
        <source>Checking the database …</source>
        <extracomment>Checking</extracomment>
        <translation>Die Datenbank wird geprüft …</translation>
    </message>
    <message id="66061">
        <source>Check</source>
        <extracomment>CheckTitle</extracomment>
        <translation>Prüfung</translation>
    </message>
    <message id="66062">
        <source>The database is sound, and its forms and queries find all that they refer to.</source>
        <extracomment>CheckClean</extracomment>
        <translation>Die Datenbank ist in Ordnung, und ihre Formulare und Abfragen finden alles, worauf sie verweisen.</translation>
    </message>
    <message id="66063">
        <source>1 finding</source>
        <extracomment>CheckOneFinding</extracomment>
        <translation>1 Befund</translation>
    </message>
    <message id="66064">
        <source>%1 findings</source>
        <extracomment>CheckFindings</extracomment>
        <translation>%1 Befunde</translation>
    </message>
    <message id="66065">
        <source>Stopped before the end.</source>
        <extracomment>CheckStopped</extracomment>
        <translation>Vor dem Ende abgebrochen.</translation>
    </message>
    <message id="66066">
        <source>What the check found</source>
        <extracomment>CheckListName</extracomment>
        <translation>Was die Prüfung gefunden hat</translation>
    </message>
    <message id="66068">
        <source>&amp;Copy All</source>
        <extracomment>CheckCopyAll</extracomment>
        <translation>Alles &amp;kopieren</translation>
    </message>
    <message id="66069">
        <source>… and %1 more</source>
        <extracomment>CheckEnough</extracomment>
        <translation>… und %1 weitere</translation>
    </message>
    <message id="66070">
        <source>The file is damaged. Go back to a copy made by Back Up. Without one, export what can still be read, table by table, and import it into a new database.</source>
        <extracomment>RemedyDamage</extracomment>
        <translation>Die Datei ist beschädigt. Kehren Sie zu einer Kopie zurück, die mit „Sichern“ entstanden ist. Gibt es keine, exportieren Sie Tabelle für Tabelle, was noch lesbar ist, und importieren Sie es in eine neue Datenbank.</translation>
    </message>
    <message id="66071">
        <source>The file with the forms and queries is damaged. Put back a copy of it, or a copy of the database made by Back Up, which carries them.</source>
        <extracomment>RemedyStore</extracomment>
        <translation>Die Datei mit den Formularen und Abfragen ist beschädigt. Setzen Sie eine Kopie davon ein, oder eine mit „Sichern“ entstandene Kopie der Datenbank, die sie mitführt.</translation>
    </message>
    <message id="66072">
        <source>Open the form with Edit and choose what is there, or delete the form.</source>
        <extracomment>RemedyForm</extracomment>
        <translation>Öffnen Sie das Formular mit „Bearbeiten“, und wählen Sie, was vorhanden ist, oder löschen Sie das Formular.</translation>
    </message>
    <message id="66073">
        <source>Open the query with Edit and change its statement, or delete the query.</source>
        <extracomment>RemedyQuery</extracomment>
        <translation>Öffnen Sie die Abfrage mit „Bearbeiten“, und ändern Sie ihre Anweisung, oder löschen Sie die Abfrage.</translation>
    </message>
    <message id="66074">
        <source>The tables cannot be listed. Try again when no other program uses the database.</source>
        <extracomment>RemedyTables</extracomment>
        <translation>Die Tabellen lassen sich nicht auflisten. Versuchen Sie es noch einmal, wenn kein anderes Programm die Datenbank verwendet.</translation>
    </message>
    <message id="66100">
        <source>Only one database can be open here. Drop one of them.</source>
        <extracomment>DropOneDatabase</extracomment>
        <translation>Hier kann nur eine Datenbank offen sein. Legen Sie nur eine davon ab.</translation>
    </message>
    <message id="66101">
        <source>"%1" is no database, no CSV file and no form file.</source>
        <extracomment>DropNotUsable</extracomment>
        <translation>„%1“ ist weder eine Datenbank noch eine CSV-Datei noch eine Formulardatei.</translation>
    </message>
    <message id="66110">
        <source>Settings and lists cannot be saved: %1 cannot be written.</source>
        <extracomment>SettingsNotKept</extracomment>
        <translation>Einstellungen und Listen lassen sich nicht speichern: %1 ist nicht beschreibbar.</translation>
    </message>
    <message id="66111">
        <source>"%1" is not in this database.</source>
        <extracomment>ViewNotThere</extracomment>
        <translation>„%1“ ist in dieser Datenbank nicht vorhanden.</translation>
    </message>
    <message id="66500">
        <source>Unsaved Text</source>
        <extracomment>DraftsTitle</extracomment>
        <translation>Nicht gespeicherter Text</translation>
    </message>
    <message id="66501">
        <source>Mirel ended while this was being typed:</source>
        <extracomment>DraftsIntro</extracomment>
        <translation>Mirel wurde beendet, während dies eingegeben wurde:</translation>
    </message>
    <message id="66502">
        <source>%1: %2</source>
        <extracomment>DraftEntry</extracomment>
        <translation>%1: %2</translation>
    </message>
    <message id="66503">
        <source>%1: %2 and %3 more</source>
        <extracomment>DraftFields</extracomment>
        <translation>%1: %2 und %3 weitere</translation>
    </message>
    <message id="66504">
        <source>Put Back types it into its record again. It is not saved by that alone.</source>
        <extracomment>DraftFits</extracomment>
        <translation>„Zurückholen“ gibt ihn wieder in seinen Datensatz ein. Gespeichert ist er damit noch nicht.</translation>
    </message>
    <message id="66505">
        <source>Its record has been deleted. The text can be copied.</source>
        <extracomment>DraftGone</extracomment>
        <translation>Der Datensatz wurde gelöscht. Der Text lässt sich kopieren.</translation>
    </message>
    <message id="66506">
        <source>Its record has been changed meanwhile, so the text is not put back. It can be copied.</source>
        <extracomment>DraftChanged</extracomment>
        <translation>Der Datensatz wurde inzwischen geändert, deshalb wird der Text nicht zurückgeholt. Er lässt sich kopieren.</translation>
    </message>
    <message id="66507">
        <source>Another database has this file's name now. The text can be copied.</source>
        <extracomment>DraftOtherDatabase</extracomment>
        <translation>Eine andere Datenbank trägt jetzt den Namen dieser Datei. Der Text lässt sich kopieren.</translation>
    </message>
    <message id="66508">
        <source>"%1" cannot be opened any more. The text can be copied.</source>
        <extracomment>DraftNoView</extracomment>
        <translation>„%1“ lässt sich nicht mehr öffnen. Der Text lässt sich kopieren.</translation>
    </message>
    <message id="66509">
        <source>"%1" holds other unsaved text. Save that first; this stays here until then.</source>
        <extracomment>DraftViewBusy</extracomment>
        <translation>„%1“ enthält anderen nicht gespeicherten Text. Speichern Sie zuerst diesen; dieser hier bleibt so lange erhalten.</translation>
    </message>
    <message id="66510">
        <source>&amp;Put Back</source>
        <extracomment>DraftPutBack</extracomment>
        <translation>&amp;Zurückholen</translation>
    </message>
    <message id="66511">
        <source>Opens the record and types the text into it again</source>
        <extracomment>DraftPutBackTip</extracomment>
        <translation>Öffnet den Datensatz und gibt den Text wieder ein</translation>
    </message>
    <message id="66512">
        <source>&amp;Copy</source>
        <extracomment>DraftCopy</extracomment>
        <translation>&amp;Kopieren</translation>
    </message>
    <message id="66513">
        <source>Copies the text, to be pasted wherever it belongs</source>
        <extracomment>DraftCopyTip</extracomment>
        <translation>Kopiert den Text, damit er eingefügt werden kann, wo er hingehört</translation>
    </message>
    <message id="66514">
        <source>&amp;Discard</source>
        <extracomment>DraftDiscard</extracomment>
        <translation>&amp;Verwerfen</translation>
    </message>
    <message id="66515">
        <source>Gives this text up for good</source>
        <extracomment>DraftDiscardTip</extracomment>
        <translation>Gibt diesen Text endgültig auf</translation>
    </message>
    <message id="66516">
        <source>&amp;Later</source>
        <extracomment>DraftLater</extracomment>
        <translation>&amp;Später</translation>
    </message>
    <message id="66517">
        <source>Keeps the text; the next start asks again</source>
        <extracomment>DraftLaterTip</extracomment>
        <translation>Behält den Text; der nächste Start fragt wieder</translation>
    </message>
    <message id="66518">
        <source>Records with unsaved text</source>
        <extracomment>DraftListName</extracomment>
        <translation>Datensätze mit nicht gespeichertem Text</translation>
    </message>
    <message id="66519">
        <source>The unsaved text</source>
        <extracomment>DraftTextName</extracomment>
        <translation>Der nicht gespeicherte Text</translation>
    </message>
    <message id="66520">
        <source>%1: %2</source>
        <extracomment>DraftTextLine</extracomment>
        <translation>%1: %2</translation>
    </message>
    <message id="66530">
        <source>What is typed now would be lost in a crash: %1 cannot be written.</source>
        <extracomment>DraftsNotKept</extracomment>
        <translation>Was jetzt eingegeben wird, ginge bei einem Absturz verloren: %1 ist nicht beschreibbar.</translation>
    </message>
    <message id="66531">
        <source>The unsaved text of an earlier run cannot be read. Its file is now %1.</source>
        <extracomment>DraftsDamaged</extracomment>
        <translation>Der nicht gespeicherte Text eines früheren Laufs lässt sich nicht lesen. Seine Datei heißt jetzt %1.</translation>
    </message>
    <message id="67000">
        <source>Help</source>
        <extracomment>HelpTitle</extracomment>
        <translation>Hilfe</translation>
    </message>
    <message id="67001">
        <source>&amp;Contents</source>
        <extracomment>HelpContents</extracomment>
        <translation>&amp;Inhalt</translation>
    </message>
    <message id="67002">
        <source>Shows the list of all pages</source>
        <extracomment>HelpContentsTip</extracomment>
        <translation>Zeigt die Liste aller Seiten</translation>
    </message>
    <message id="67003">
        <source>&amp;Back</source>
        <extracomment>HelpBack</extracomment>
        <translation>&amp;Zurück</translation>
    </message>
    <message id="67004">
        <source>Back to the place before</source>
        <extracomment>HelpBackTip</extracomment>
        <translation>Zurück zur vorigen Stelle</translation>
    </message>
    <message id="67005">
        <source>&amp;Forward</source>
        <extracomment>HelpForward</extracomment>
        <translation>&amp;Vor</translation>
    </message>
    <message id="67006">
        <source>Forward again</source>
        <extracomment>HelpForwardTip</extracomment>
        <translation>Wieder vorwärts</translation>
    </message>
    <message id="67007">
        <source>Find in the help</source>
        <extracomment>HelpFind</extracomment>
        <translation>In der Hilfe suchen</translation>
    </message>
    <message id="67008">
        <source>Next place with this text</source>
        <extracomment>HelpFindNextTip</extracomment>
        <translation>Nächste Stelle mit diesem Text</translation>
    </message>
    <message id="67009">
        <source>Place before with this text</source>
        <extracomment>HelpFindPreviousTip</extracomment>
        <translation>Vorige Stelle mit diesem Text</translation>
    </message>
    <message id="67010">
        <source>Pages of the help</source>
        <extracomment>HelpPages</extracomment>
        <translation>Seiten der Hilfe</translation>
    </message>
    <message id="67011">
        <source>Text of the help</source>
        <extracomment>HelpText</extracomment>
        <translation>Text der Hilfe</translation>
    </message>
    <message id="67012">
        <source>&amp;What Is This?</source>
        <extracomment>CommandWhatsThis</extracomment>
        <translation>&amp;Was ist das?</translation>
    </message>
    <message id="67013">
        <source>Then tap the part of the window you want to know about</source>
        <extracomment>TipWhatsThis</extracomment>
        <translation>Tippen Sie dann auf den Teil des Fensters, um den es geht</translation>
    </message>
    <message id="67014">
        <source>&amp;Tour</source>
        <extracomment>CommandTour</extracomment>
        <translation>&amp;Rundgang</translation>
    </message>
    <message id="67015">
        <source>Shows the parts of the window one by one</source>
        <extracomment>TipTour</extracomment>
        <translation>Zeigt die Teile des Fensters der Reihe nach</translation>
    </message>
    <message id="67016">
        <source>Shows the help page of this dialog</source>
        <extracomment>HelpOfDialogTip</extracomment>
        <translation>Zeigt die Hilfeseite dieses Dialogs</translation>
    </message>
    <message id="67017">
        <source>%1 of %2</source>
        <extracomment>TourStep</extracomment>
        <translation>%1 von %2</translation>
    </message>
    <message id="67018">
        <source>&amp;Next</source>
        <extracomment>TourNext</extracomment>
        <translation>&amp;Weiter</translation>
    </message>
    <message id="67019">
        <source>&amp;Back</source>
        <extracomment>TourBack</extracomment>
        <translation>&amp;Zurück</translation>
    </message>
    <message id="67020">
        <source>&amp;Done</source>
        <extracomment>TourDone</extracomment>
        <translation>&amp;Fertig</translation>
    </message>
    <message id="67021">
        <source>End the tour</source>
        <extracomment>TourClose</extracomment>
        <translation>Rundgang beenden</translation>
    </message>
    <message id="67022">
        <source>Welcome to Mirel</source>
        <extracomment>TourWelcomeTitle</extracomment>
        <translation>Willkommen bei Mirel</translation>
    </message>
    <message id="67023">
        <source>A short look around the window. Escape or the cross ends it at any time.</source>
        <extracomment>TourWelcome</extracomment>
        <translation>Ein kurzer Blick auf das Fenster. Esc oder das Kreuz beendet ihn jederzeit.</translation>
    </message>
    <message id="67024">
        <source>Your data is a file</source>
        <extracomment>TourDatabaseTitle</extracomment>
        <translation>Ihre Daten sind eine Datei</translation>
    </message>
    <message id="67025">
        <source>The menu Database opens a file or makes a new one. Open the Sample shows a small database to try things on.</source>
        <extracomment>TourDatabase</extracomment>
        <translation>Das Menü „Datenbank“ öffnet eine Datei oder legt eine neue an. „Beispiel öffnen“ zeigt eine kleine Datenbank zum Ausprobieren.</translation>
    </message>
    <message id="67026">
        <source>What is in it</source>
        <extracomment>TourListsTitle</extracomment>
        <translation>Was darin ist</translation>
    </message>
    <message id="67027">
        <source>Favorites, tables, forms and queries of the open database. A double tap opens an entry; its menu does the rest.</source>
        <extracomment>TourLists</extracomment>
        <translation>Favoriten, Tabellen, Formulare und Abfragen der offenen Datenbank. Doppeltippen öffnet einen Eintrag; sein Menü kann alles Weitere.</translation>
    </message>
    <message id="67028">
        <source>What you open</source>
        <extracomment>TourViewsTitle</extracomment>
        <translation>Was Sie öffnen</translation>
    </message>
    <message id="67029">
        <source>Each table, form and query opens here. Type into a cell, and it is saved when you leave it. Ctrl+Z takes it back.</source>
        <extracomment>TourViews</extracomment>
        <translation>Jede Tabelle, jedes Formular und jede Abfrage öffnet sich hier. Tippen Sie in eine Zelle: Beim Verlassen ist sie gespeichert. Strg+Z nimmt es zurück.</translation>
    </message>
    <message id="67030">
        <source>Help is near</source>
        <extracomment>TourHelpTitle</extracomment>
        <translation>Hilfe ist nah</translation>
    </message>
    <message id="67031">
        <source>F1 explains what is in front, Shift+F1 a single control. This tour is in the menu Help, too.</source>
        <extracomment>TourHelp</extracomment>
        <translation>F1 erklärt, was vorn ist, Umschalt+F1 ein einzelnes Element. Auch dieser Rundgang ist im Menü „Hilfe“.</translation>
    </message>
    <message id="67100">
        <source>Ticked: two conditions on the field, which must both hold, such as from 10 to 20.</source>
        <extracomment>WhatFilterFromTo</extracomment>
        <translation>Angekreuzt: zwei Bedingungen an das Feld, die beide zutreffen müssen, etwa von 10 bis 20.</translation>
    </message>
    <message id="67101">
        <source>What the field is compared with, typed as the grid shows it. Left empty with =, it finds the empty cells.</source>
        <extracomment>WhatFilterValue</extracomment>
        <translation>Womit das Feld verglichen wird, getippt wie im Raster gezeigt. Leer mit = findet die leeren Zellen.</translation>
    </message>
    <message id="67102">
        <source>Any condition of the SQL dialect. Fields, operators and words are put in with a double tap in the lists.</source>
        <extracomment>WhatFilterExpression</extracomment>
        <translation>Jede Bedingung des SQL-Dialekts. Felder, Operatoren und Wörter kommen per Doppeltippen aus den Listen.</translation>
    </message>
    <message id="67103">
        <source>Words that connect conditions: AND, both hold; OR, one of them holds; NOT, it does not hold.</source>
        <extracomment>WhatFilterAndOrNot</extracomment>
        <translation>Wörter, die Bedingungen verbinden: AND, beide treffen zu; OR, eine trifft zu; NOT, sie trifft nicht zu.</translation>
    </message>
    <message id="67104">
        <source>The fields to sort by, separated by commas. Records that are equal in the first field are sorted by the second, and so on.</source>
        <extracomment>WhatSortOrderBy</extracomment>
        <translation>Die Felder, nach denen sortiert wird, durch Kommas getrennt. Was im ersten gleich ist, ordnet das zweite, und so fort.</translation>
    </message>
    <message id="67105">
        <source>ASC sorts upward, from A to Z; DESC downward. It goes behind the field it belongs to.</source>
        <extracomment>WhatSortDirection</extracomment>
        <translation>ASC sortiert aufwärts, von A bis Z; DESC abwärts. Es steht hinter dem Feld, zu dem es gehört.</translation>
    </message>
    <message id="67106">
        <source>Ticked: Mirel asks before it deletes a record. Undo takes a deletion back either way.</source>
        <extracomment>WhatConfirmDelete</extracomment>
        <translation>Angekreuzt: Mirel fragt, bevor es einen Datensatz löscht. Rückgängig nimmt das Löschen in jedem Fall zurück.</translation>
    </message>
    <message id="67107">
        <source>How much of a long text a column shows. The cell keeps all of it; Zoom shows it whole.</source>
        <extracomment>WhatMaximumChars</extracomment>
        <translation>Wie viel von einem langen Text eine Spalte zeigt. Die Zelle behält alles; Zoom zeigt ihn ganz.</translation>
    </message>
    <message id="67108">
        <source>The two words for true and false, with a slash between them, in tables and forms alike.</source>
        <extracomment>WhatYesNoWords</extracomment>
        <translation>Die beiden Wörter für wahr und falsch, mit einem Schrägstrich dazwischen, für Tabellen und Formulare.</translation>
    </message>
    <message id="67109">
        <source>How long to hold the stylus or finger on a cell until its menu opens. Unticked: only the right button opens it.</source>
        <extracomment>WhatHoldPopup</extracomment>
        <translation>Wie lange Stift oder Finger auf einer Zelle bleiben müssen, bis sich ihr Menü öffnet. Nicht angekreuzt: nur mit der rechten Taste.</translation>
    </message>
    <message id="67110">
        <source>Ticked: a tap on a column's header sorts by it; a second tap turns the order round.</source>
        <extracomment>WhatSortByHeader</extracomment>
        <translation>Angekreuzt: Tippen auf einen Spaltenkopf sortiert danach; noch einmal kehrt die Reihenfolge um.</translation>
    </message>
    <message id="67111">
        <source>Ticked: leaving a record with unsaved changes asks first. Unticked: the changes are dropped.</source>
        <extracomment>WhatConfirmSave</extracomment>
        <translation>Angekreuzt: Vor dem Verlassen eines geänderten Datensatzes wird gefragt. Sonst gehen die Änderungen verloren.</translation>
    </message>
    <message id="67112">
        <source>Adds Save to that question: it presses the form's UPDATE button and then goes on.</source>
        <extracomment>WhatThirdAnswer</extracomment>
        <translation>Ergänzt die Frage um Speichern: Das drückt die UPDATE-Schaltfläche des Formulars und macht dann weiter.</translation>
    </message>
    <message id="67113">
        <source>Sums, averages and counts are computed again after every change. With many records that takes time; Recalculate does it once.</source>
        <extracomment>WhatAggregates</extracomment>
        <translation>Summen, Durchschnitte und Anzahlen werden nach jeder Änderung neu berechnet. Bei vielen Datensätzen dauert das; „Neu berechnen“ tut es einmal.</translation>
    </message>
    <message id="67114">
        <source>Ticked: a form grows and shrinks with its window. Unticked: it has the size of its design, and scrolls.</source>
        <extracomment>WhatFitForms</extracomment>
        <translation>Angekreuzt: Ein Formular wächst und schrumpft mit seinem Fenster. Sonst hat es die Größe des Entwurfs und rollt.</translation>
    </message>
    <message id="67115">
        <source>Stands around a text, so that it may hold the separator.</source>
        <extracomment>WhatCsvQuote</extracomment>
        <translation>Steht um einen Text, damit er das Trennzeichen enthalten darf.</translation>
    </message>
    <message id="67116">
        <source>Writes a quotation mark inside a text twice, as most programs expect it.</source>
        <extracomment>WhatCsvDoubledQuotes</extracomment>
        <translation>Schreibt ein Anführungszeichen im Text doppelt, wie es die meisten Programme erwarten.</translation>
    </message>
    <message id="67117">
        <source>How letters become bytes. UTF-8 knows all letters; choose another one only for a program that asks for it.</source>
        <extracomment>WhatCsvEncoding</extracomment>
        <translation>Wie aus Buchstaben Bytes werden. UTF-8 kennt alle; wählen Sie eine andere nur für ein Programm, das sie verlangt.</translation>
    </message>
    <message id="67118">
        <source>The order of day, month and year. Year-month-day is the one that every program understands.</source>
        <extracomment>WhatCsvDateFormat</extracomment>
        <translation>Die Reihenfolge von Tag, Monat und Jahr. Jahr-Monat-Tag versteht jedes Programm.</translation>
    </message>
    <message id="67119">
        <source>The mark around texts that may hold the separator. Detect finds it.</source>
        <extracomment>WhatImportQuote</extracomment>
        <translation>Das Zeichen um Texte, die das Trennzeichen enthalten dürfen. „Erkennen“ findet es.</translation>
    </message>
    <message id="67120">
        <source>What separates the whole part of a number from its fraction in this file.</source>
        <extracomment>WhatImportDecimal</extracomment>
        <translation>Was in dieser Datei den ganzen Teil einer Zahl vom Bruch trennt.</translation>
    </message>
    <message id="67121">
        <source>How the file's bytes become letters. If letters with marks look wrong in the preview, choose another one.</source>
        <extracomment>WhatImportEncoding</extracomment>
        <translation>Wie aus den Bytes der Datei Buchstaben werden. Sehen Umlaute in der Vorschau falsch aus, wählen Sie eine andere.</translation>
    </message>
    <message id="67122">
        <source>The order of day, month and year in the file. A value that does not fit it makes its line fail.</source>
        <extracomment>WhatImportDateFormat</extracomment>
        <translation>Die Reihenfolge von Tag, Monat und Jahr in der Datei. Passt ein Wert nicht dazu, schlägt seine Zeile fehl.</translation>
    </message>
    <message id="67123">
        <source>What the field holds: Text up to 255 characters, Memo text of any length, Integer whole numbers, Double numbers with a fraction, DateTime, Yes/No.</source>
        <extracomment>WhatFieldType</extracomment>
        <translation>Was das Feld enthält: Text bis 255 Zeichen, Memo beliebig langen Text, Integer ganze Zahlen, Double Zahlen mit Bruch, DateTime, Yes/No.</translation>
    </message>
    <message id="67124">
        <source>The most characters of a Text field, 1 to 255.</source>
        <extracomment>WhatFieldSize</extracomment>
        <translation>Wie viele Zeichen ein Textfeld höchstens hat, 1 bis 255.</translation>
    </message>
    <message id="67125">
        <source>An index makes searching and sorting by this field quick in a large table. ASC is upward, DESC downward.</source>
        <extracomment>WhatFieldIndexed</extracomment>
        <translation>Ein Index macht Suchen und Sortieren nach diesem Feld in einer großen Tabelle schnell. ASC aufwärts, DESC abwärts.</translation>
    </message>
    <message id="67126">
        <source>Ticked: the control shows the value of an expression. Unticked: it is empty until something is put into it.</source>
        <extracomment>WhatPropHasSource</extracomment>
        <translation>Angekreuzt: Das Element zeigt den Wert eines Ausdrucks. Sonst ist es leer, bis etwas hineinkommt.</translation>
    </message>
    <message id="67127">
        <source>On each record: the value belongs to the record shown. Over all records: SUM, AVG, MAX, MIN and counts of the whole result.</source>
        <extracomment>WhatPropScope</extracomment>
        <translation>Je Datensatz: Der Wert gehört zum gezeigten Datensatz. Über alle Datensätze: SUM, AVG, MAX, MIN und Anzahlen des ganzen Ergebnisses.</translation>
    </message>
    <message id="67128">
        <source>Plain: one line. +Date Picker: a calendar beside it. +Extendable: a button that opens a large box.</source>
        <extracomment>WhatPropEditKind</extracomment>
        <translation>Einfach: eine Zeile. +Kalender: ein Kalender daneben. +Erweiterbar: eine Schaltfläche, die ein großes Feld öffnet.</translation>
    </message>
    <message id="67129">
        <source>What a new record gets here. It can be an expression, such as SYSDATE().</source>
        <extracomment>WhatPropDefaultValue</extracomment>
        <translation>Was ein neuer Datensatz hier bekommt. Auch ein Ausdruck ist möglich, etwa SYSDATE().</translation>
    </message>
    <message id="67130">
        <source>What a press does: SELECT finds records, UPDATE saves this one, UPDATE ALL all of them, CALL FORM opens another form.</source>
        <extracomment>WhatPropFunction</extracomment>
        <translation>Was ein Druck bewirkt: SELECT sucht Datensätze, UPDATE speichert diesen, UPDATE ALL alle, CALL FORM öffnet ein anderes Formular.</translation>
    </message>
    <message id="67131">
        <source>Which field gets which value. &amp;name stands for the text of the control of that name.</source>
        <extracomment>WhatPropAssignments</extracomment>
        <translation>Welches Feld welchen Wert bekommt. &amp;name steht für den Text des Elements mit diesem Namen.</translation>
    </message>
    <message id="67132">
        <source>The entries of the list, one on each line.</source>
        <extracomment>WhatPropItems</extracomment>
        <translation>Die Einträge der Liste, einer je Zeile.</translation>
    </message>
    <message id="67133">
        <source>Ticked: the called form shows the records that this one has found.</source>
        <extracomment>WhatPropWithResult</extracomment>
        <translation>Angekreuzt: Das aufgerufene Formular zeigt die Datensätze, die dieses gefunden hat.</translation>
    </message>
    <message id="67134">
        <source>The name under which the query is saved. A new name makes a new query; the old one stays.</source>
        <extracomment>WhatQueryName</extracomment>
        <translation>Der Name, unter dem die Abfrage gespeichert wird. Ein neuer Name macht eine neue Abfrage; die alte bleibt.</translation>
    </message>
    <message id="67135">
        <source>The tables of the database. The buttons SELECT, FROM, WHERE put the chosen one or its field into the statement.</source>
        <extracomment>WhatQueryTables</extracomment>
        <translation>Die Tabellen der Datenbank. Die Schaltflächen SELECT, FROM, WHERE setzen die gewählte oder ihr Feld in die Anweisung.</translation>
    </message>
    <message id="67136">
        <source>Fields stand by their names, texts between single quotes. Below you see the value for the current record.</source>
        <extracomment>WhatDeskText</extracomment>
        <translation>Felder stehen mit ihrem Namen, Texte zwischen einfachen Anführungszeichen. Darunter steht der Wert für den aktuellen Datensatz.</translation>
    </message>
    <message id="67137">
        <source>The color as six hexadecimal digits: two each for red, green and blue.</source>
        <extracomment>WhatColorCode</extracomment>
        <translation>Die Farbe als sechs Hexadezimalziffern: je zwei für Rot, Grün und Blau.</translation>
    </message>
    <message id="67500">
        <source>SUM(expression): the sum over all records of a form's result</source>
        <extracomment>FunctionHelpSum</extracomment>
        <translation>SUM(expression): die Summe über alle Datensätze eines Formularergebnisses</translation>
    </message>
    <message id="67501">
        <source>AVG(expression): the average over all records of a form's result</source>
        <extracomment>FunctionHelpAvg</extracomment>
        <translation>AVG(expression): der Durchschnitt über alle Datensätze eines Formularergebnisses</translation>
    </message>
    <message id="67502">
        <source>MAX(expression): the greatest value over all records of a form's result</source>
        <extracomment>FunctionHelpMax</extracomment>
        <translation>MAX(expression): der größte Wert über alle Datensätze eines Formularergebnisses</translation>
    </message>
    <message id="67503">
        <source>MIN(expression): the smallest value over all records of a form's result</source>
        <extracomment>FunctionHelpMin</extracomment>
        <translation>MIN(expression): der kleinste Wert über alle Datensätze eines Formularergebnisses</translation>
    </message>
    <message id="67504">
        <source>SYSTIME(): the time of day, as text</source>
        <extracomment>FunctionHelpSystime</extracomment>
        <translation>SYSTIME(): die Uhrzeit als Text</translation>
    </message>
    <message id="67505">
        <source>SYSDATE(): today</source>
        <extracomment>FunctionHelpSysdate</extracomment>
        <translation>SYSDATE(): heute</translation>
    </message>
    <message id="67506">
        <source>SYSDATETIME(): today and the time of day</source>
        <extracomment>FunctionHelpSysdatetime</extracomment>
        <translation>SYSDATETIME(): heute mit Uhrzeit</translation>
    </message>
    <message id="67507">
        <source>UPPER(text): the text in upper case</source>
        <extracomment>FunctionHelpUpper</extracomment>
        <translation>UPPER(text): der Text in Großbuchstaben</translation>
    </message>
    <message id="67508">
        <source>LOWER(text): the text in lower case</source>
        <extracomment>FunctionHelpLower</extracomment>
        <translation>LOWER(text): der Text in Kleinbuchstaben</translation>
    </message>
    <message id="67509">
        <source>RTRIM(text): the text without trailing spaces</source>
        <extracomment>FunctionHelpRtrim</extracomment>
        <translation>RTRIM(text): der Text ohne Leerzeichen am Ende</translation>
    </message>
    <message id="67510">
        <source>LTRIM(text): the text without leading spaces</source>
        <extracomment>FunctionHelpLtrim</extracomment>
        <translation>LTRIM(text): der Text ohne Leerzeichen am Anfang</translation>
    </message>
    <message id="67511">
        <source>TO_CHAR(value): the value as text; the empty text for NULL</source>
        <extracomment>FunctionHelpToChar</extracomment>
        <translation>TO_CHAR(value): der Wert als Text; für NULL der leere Text</translation>
    </message>
    <message id="67512">
        <source>TO_NUMBER(text): the number at the start of the text, or 0</source>
        <extracomment>FunctionHelpToNumber</extracomment>
        <translation>TO_NUMBER(text): die Zahl am Anfang des Textes, sonst 0</translation>
    </message>
    <message id="67513">
        <source>YEAR(date): the year</source>
        <extracomment>FunctionHelpYear</extracomment>
        <translation>YEAR(date): das Jahr</translation>
    </message>
    <message id="67514">
        <source>MONTH(date): the month, 1 to 12</source>
        <extracomment>FunctionHelpMonth</extracomment>
        <translation>MONTH(date): der Monat, 1 bis 12</translation>
    </message>
    <message id="67515">
        <source>DAY(date): the day of the month</source>
        <extracomment>FunctionHelpDay</extracomment>
        <translation>DAY(date): der Tag des Monats</translation>
    </message>
    <message id="67516">
        <source>RECNO(): the number of the current record, from 1</source>
        <extracomment>FunctionHelpRecno</extracomment>
        <translation>RECNO(): die Nummer des aktuellen Datensatzes, ab 1</translation>
    </message>
    <message id="67517">
        <source>RECCOUNT(): the number of records in the result</source>
        <extracomment>FunctionHelpReccount</extracomment>
        <translation>RECCOUNT(): die Anzahl der Datensätze im Ergebnis</translation>
    </message>
    <message id="67518">
        <source>COUNT(): the same as RECCOUNT()</source>
        <extracomment>FunctionHelpCount</extracomment>
        <translation>COUNT(): dasselbe wie RECCOUNT()</translation>
    </message>
    <message id="67519">
        <source>SEEKTOTAL(): the same as RECCOUNT()</source>
        <extracomment>FunctionHelpSeektotal</extracomment>
        <translation>SEEKTOTAL(): dasselbe wie RECCOUNT()</translation>
    </message>
    <message id="67520">
        <source>SIN(x): the sine, x in radians</source>
        <extracomment>FunctionHelpSin</extracomment>
        <translation>SIN(x): der Sinus, x im Bogenmaß</translation>
    </message>
    <message id="67521">
        <source>COS(x): the cosine, x in radians</source>
        <extracomment>FunctionHelpCos</extracomment>
        <translation>COS(x): der Kosinus, x im Bogenmaß</translation>
    </message>
    <message id="67522">
        <source>TAN(x): the tangent, x in radians</source>
        <extracomment>FunctionHelpTan</extracomment>
        <translation>TAN(x): der Tangens, x im Bogenmaß</translation>
    </message>
    <message id="67523">
        <source>ASIN(x): the arc sine, in radians</source>
        <extracomment>FunctionHelpAsin</extracomment>
        <translation>ASIN(x): der Arkussinus im Bogenmaß</translation>
    </message>
    <message id="67524">
        <source>ACOS(x): the arc cosine, in radians</source>
        <extracomment>FunctionHelpAcos</extracomment>
        <translation>ACOS(x): der Arkuskosinus im Bogenmaß</translation>
    </message>
    <message id="67525">
        <source>ATAN(x): the arc tangent, in radians</source>
        <extracomment>FunctionHelpAtan</extracomment>
        <translation>ATAN(x): der Arkustangens im Bogenmaß</translation>
    </message>
    <message id="67526">
        <source>SINH(x): the hyperbolic sine</source>
        <extracomment>FunctionHelpSinh</extracomment>
        <translation>SINH(x): der Sinus hyperbolicus</translation>
    </message>
    <message id="67527">
        <source>COSH(x): the hyperbolic cosine</source>
        <extracomment>FunctionHelpCosh</extracomment>
        <translation>COSH(x): der Kosinus hyperbolicus</translation>
    </message>
    <message id="67528">
        <source>TANH(x): the hyperbolic tangent</source>
        <extracomment>FunctionHelpTanh</extracomment>
        <translation>TANH(x): der Tangens hyperbolicus</translation>
    </message>
    <message id="67529">
        <source>EXP(x): e to the power x</source>
        <extracomment>FunctionHelpExp</extracomment>
        <translation>EXP(x): e hoch x</translation>
    </message>
    <message id="67530">
        <source>SQRT(x): the square root</source>
        <extracomment>FunctionHelpSqrt</extracomment>
        <translation>SQRT(x): die Quadratwurzel</translation>
    </message>
    <message id="67531">
        <source>FLOOR(x): the largest whole number up to x</source>
        <extracomment>FunctionHelpFloor</extracomment>
        <translation>FLOOR(x): die größte ganze Zahl bis x</translation>
    </message>
    <message id="67532">
        <source>CEIL(x): the smallest whole number from x on</source>
        <extracomment>FunctionHelpCeil</extracomment>
        <translation>CEIL(x): die kleinste ganze Zahl ab x</translation>
    </message>
    <message id="67533">
        <source>TO_TIMESTR(seconds): a duration as hours, minutes and seconds</source>
        <extracomment>FunctionHelpToTimestr</extracomment>
        <translation>TO_TIMESTR(seconds): eine Dauer als Stunden, Minuten und Sekunden</translation>
    </message>
    <message id="67534">
        <source>LN(x): the natural logarithm</source>
        <extracomment>FunctionHelpLn</extracomment>
        <translation>LN(x): der natürliche Logarithmus</translation>
    </message>
    <message id="67535">
        <source>INITCAP(text): the text with each word capitalized</source>
        <extracomment>FunctionHelpInitcap</extracomment>
        <translation>INITCAP(text): der Text, jedes Wort mit großem Anfang</translation>
    </message>
    <message id="67536">
        <source>LENGTH(text): the number of characters</source>
        <extracomment>FunctionHelpLength</extracomment>
        <translation>LENGTH(text): die Anzahl der Zeichen</translation>
    </message>
    <message id="67537">
        <source>LAST_DAY(date): the number of days in its month; without a date, in the current month</source>
        <extracomment>FunctionHelpLastDay</extracomment>
        <translation>LAST_DAY(date): die Anzahl der Tage des Monats; ohne Datum die des laufenden</translation>
    </message>
    <message id="67538">
        <source>TO_DATE(text): the date in the text</source>
        <extracomment>FunctionHelpToDate</extracomment>
        <translation>TO_DATE(text): das Datum in dem Text</translation>
    </message>
    <message id="67539">
        <source>ABS(x): the whole part of x without its sign</source>
        <extracomment>FunctionHelpAbs</extracomment>
        <translation>ABS(x): der ganze Teil von x ohne Vorzeichen</translation>
    </message>
    <message id="67540">
        <source>LEFT(text, n): the first n characters</source>
        <extracomment>FunctionHelpLeft</extracomment>
        <translation>LEFT(text, n): die ersten n Zeichen</translation>
    </message>
    <message id="67541">
        <source>RIGHT(text, n): the last n characters</source>
        <extracomment>FunctionHelpRight</extracomment>
        <translation>RIGHT(text, n): die letzten n Zeichen</translation>
    </message>
    <message id="67542">
        <source>LOG(base, x): the logarithm of x to the base</source>
        <extracomment>FunctionHelpLog</extracomment>
        <translation>LOG(base, x): der Logarithmus von x zur Basis</translation>
    </message>
    <message id="67543">
        <source>POWER(x, y): x to the power y</source>
        <extracomment>FunctionHelpPower</extracomment>
        <translation>POWER(x, y): x hoch y</translation>
    </message>
    <message id="67544">
        <source>ROUND(x, digits): x rounded to that many decimals (default 0); a digit of 5 or more always rounds upward</source>
        <extracomment>FunctionHelpRound</extracomment>
        <translation>ROUND(x, digits): x auf so viele Nachkommastellen gerundet (ohne Angabe 0); eine Ziffer ab 5 rundet immer aufwärts</translation>
    </message>
    <message id="67545">
        <source>TRUNC(x, digits): x cut to that many decimals (default 0)</source>
        <extracomment>FunctionHelpTrunc</extracomment>
        <translation>TRUNC(x, digits): x nach so vielen Nachkommastellen abgeschnitten (ohne Angabe 0)</translation>
    </message>
    <message id="67546">
        <source>ADD_MONTH(date, n): the date n months later; a year counts 13 months, so twelve months after a December is not a date</source>
        <extracomment>FunctionHelpAddMonth</extracomment>
        <translation>ADD_MONTH(date, n): das Datum n Monate später; ein Jahr zählt 13 Monate, zwölf Monate nach einem Dezember ist also kein Datum</translation>
    </message>
    <message id="67547">
        <source>DIFF_TIME(date2, date1): the seconds from date1 to date2</source>
        <extracomment>FunctionHelpDiffTime</extracomment>
        <translation>DIFF_TIME(date2, date1): die Sekunden von date1 bis date2</translation>
    </message>
    <message id="67548">
        <source>SUBSTR(text, start, count): count characters from position start; a negative start counts from the end</source>
        <extracomment>FunctionHelpSubstr</extracomment>
        <translation>SUBSTR(text, start, count): count Zeichen ab Stelle start; ein negatives start zählt vom Ende</translation>
    </message>
    <message id="67549">
        <source>REPLACE(text, from, to): the text with each occurrence of from replaced by to</source>
        <extracomment>FunctionHelpReplace</extracomment>
        <translation>REPLACE(text, from, to): der Text, jedes Vorkommen von from durch to ersetzt</translation>
    </message>
    <message id="67550">
        <source>INSTR(text, search, start, occurrence): the position of search in text, or 0; a negative start searches backward</source>
        <extracomment>FunctionHelpInstr</extracomment>
        <translation>INSTR(text, search, start, occurrence): die Stelle von search im Text oder 0; ein negatives start sucht rückwärts</translation>
    </message>
    <message id="67560">
        <source>contains</source>
        <extracomment>OperatorContains</extracomment>
        <translation>enthält</translation>
    </message>
    <message id="67561">
        <source>begins with</source>
        <extracomment>OperatorBeginsWith</extracomment>
        <translation>beginnt mit</translation>
    </message>
    <message id="67562">
        <source>ends with</source>
        <extracomment>OperatorEndsWith</extracomment>
        <translation>endet mit</translation>
    </message>
    <message id="67563">
        <source>not contains</source>
        <extracomment>OperatorNotContains</extracomment>
        <translation>enthält nicht</translation>
    </message>
    <message id="67564">
        <source>not begins with</source>
        <extracomment>OperatorNotBeginsWith</extracomment>
        <translation>beginnt nicht mit</translation>
    </message>
    <message id="67565">
        <source>not ends with</source>
        <extracomment>OperatorNotEndsWith</extracomment>
        <translation>endet nicht mit</translation>
    </message>
    <message id="67566">
        <source>not =</source>
        <extracomment>OperatorNotEqual</extracomment>
        <translation>nicht =</translation>
    </message>
    <message id="67567">
        <source>is true</source>
        <extracomment>OperatorIsTrue</extracomment>
        <translation>ist wahr</translation>
    </message>
    <message id="67568">
        <source>is false</source>
        <extracomment>OperatorIsFalse</extracomment>
        <translation>ist falsch</translation>
    </message>
    <message id="67580">
        <source>Langua&amp;ge</source>
        <extracomment>CommandLanguage</extracomment>
        <translation>S&amp;prache</translation>
    </message>
    <message id="67581">
        <source>Choose the language of menus, dialogs and help</source>
        <extracomment>TipLanguage</extracomment>
        <translation>Die Sprache von Menüs, Dialogen und Hilfe auswählen</translation>
    </message>
    <message id="67582">
        <source>Language</source>
        <extracomment>LanguageTitle</extracomment>
        <translation>Sprache</translation>
    </message>
    <message id="67583">
        <source>&amp;Language of menus, dialogs and help:</source>
        <extracomment>LanguagePrompt</extracomment>
        <translation>&amp;Sprache von Menüs, Dialogen und Hilfe:</translation>
    </message>
    <message id="67584">
        <source>The system's language</source>
        <extracomment>LanguageOfSystem</extracomment>
        <translation>Sprache des Systems</translation>
    </message>
    <message id="67585">
        <source>Mirel speaks it from its next start on.</source>
        <extracomment>LanguageNextStart</extracomment>
        <translation>Mirel spricht sie ab dem nächsten Start.</translation>
    </message>
    <message id="67800">
        <source>No such file or directory</source>
        <extracomment>ReasonNotThere</extracomment>
        <translation>Datei oder Ordner nicht gefunden</translation>
    </message>
    <message id="67801">
        <source>Permission denied</source>
        <extracomment>ReasonNoPermission</extracomment>
        <translation>Keine Berechtigung</translation>
    </message>
    <message id="67802">
        <source>Operation not permitted</source>
        <extracomment>ReasonNotPermitted</extracomment>
        <translation>Vorgang nicht erlaubt</translation>
    </message>
    <message id="67803">
        <source>No space left on device</source>
        <extracomment>ReasonDiskFull</extracomment>
        <translation>Auf dem Datenträger ist kein Platz mehr</translation>
    </message>
    <message id="67804">
        <source>Disk quota exceeded</source>
        <extracomment>ReasonQuota</extracomment>
        <translation>Das zugeteilte Speicherkontingent ist erschöpft</translation>
    </message>
    <message id="67805">
        <source>Read-only file system</source>
        <extracomment>ReasonReadOnlyDisk</extracomment>
        <translation>Der Datenträger ist schreibgeschützt</translation>
    </message>
    <message id="67806">
        <source>Is a directory</source>
        <extracomment>ReasonIsFolder</extracomment>
        <translation>Das ist ein Ordner</translation>
    </message>
    <message id="67807">
        <source>Not a directory</source>
        <extracomment>ReasonNoFolder</extracomment>
        <translation>Ein Teil des Pfads ist kein Ordner</translation>
    </message>
    <message id="67808">
        <source>File exists</source>
        <extracomment>ReasonExists</extracomment>
        <translation>Die Datei gibt es schon</translation>
    </message>
    <message id="67809">
        <source>File name too long</source>
        <extracomment>ReasonNameTooLong</extracomment>
        <translation>Der Dateiname ist zu lang</translation>
    </message>
    <message id="67810">
        <source>File too large</source>
        <extracomment>ReasonFileTooLarge</extracomment>
        <translation>Die Datei ist zu groß</translation>
    </message>
    <message id="67811">
        <source>Device or resource busy</source>
        <extracomment>ReasonBusy</extracomment>
        <translation>Gerät oder Datei wird gerade benutzt</translation>
    </message>
    <message id="67812">
        <source>Too many open files</source>
        <extracomment>ReasonTooManyFiles</extracomment>
        <translation>Zu viele offene Dateien</translation>
    </message>
    <message id="67813">
        <source>Input/output error</source>
        <extracomment>ReasonDiskFault</extracomment>
        <translation>Ein-/Ausgabefehler des Datenträgers</translation>
    </message>
    <message id="67814">
        <source>Connection timed out</source>
        <extracomment>ReasonTimeIsUp</extracomment>
        <translation>Zeitüberschreitung</translation>
    </message>
</context>
</TS>
