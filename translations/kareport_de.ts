<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de" sourcelanguage="en">
<context>
    <name>KaReport</name>
    <message>
        <location filename="../host/app/LinkTargetPosix.cpp"/>
        <source>the link "%1" belongs to another user and is in a folder that everybody can write to</source>
        <translation>Die Verknüpfung „%1“ gehört einem anderen Benutzer und steht in einem Ordner, in den jeder schreiben kann</translation>
    </message>
    <message>
        <location filename="../host/app/NearestName.cpp"/>
        <source>did you mean "%1"?</source>
        <translation>meinten Sie "%1"?</translation>
    </message>
    <message>
        <location filename="../host/app/NearestName.cpp"/>
        <source>one of %1 was expected</source>
        <translation>einer dieser Werte wurde erwartet: %1</translation>
    </message>
    <message>
        <location filename="../host/app/NearestName.cpp"/>
        <source>none</source>
        <translation>keine</translation>
    </message>
    <message>
        <location filename="../host/app/ReplaceFile.cpp"/>
        <source>not all of it could be written</source>
        <translation>nicht alles konnte geschrieben werden</translation>
    </message>
    <message>
        <location filename="../host/app/StandardText.cpp"/>
        <source>All Files (*.*)</source>
        <translation>Alle Dateien (*.*)</translation>
    </message>
    <message>
        <location filename="../host/app/StandardText.cpp"/>
        <source>The file is too large to open.</source>
        <translation>Die Datei ist zu groß und kann nicht geöffnet werden.</translation>
    </message>
    <message>
        <location filename="../host/app/StandardText.cpp"/>
        <source>there is not enough memory for it</source>
        <translation>Der Speicher reicht dafür nicht aus</translation>
    </message>
    <message>
        <location filename="../host/frame/PaneDock.cpp"/>
        <source>%1, not saved</source>
        <translation>%1, nicht gespeichert</translation>
    </message>
    <message>
        <location filename="../host/frame/UDocumentFiles.cpp"/>
        <source>Save changes to %1?</source>
        <translation>Änderungen an %1 speichern?</translation>
    </message>
    <message>
        <location filename="../host/frame/UDocumentFiles.cpp"/>
        <source>Untitled</source>
        <translation>Unbenannt</translation>
    </message>
    <message>
        <location filename="../templates/ScanNoteText.cpp"/>
        <source>an empty %1 ends its list: what follows in the list is not read</source>
        <translation>ein leeres %1 beendet seine Liste: was in der Liste folgt, wird nicht gelesen</translation>
    </message>
    <message>
        <location filename="../templates/ScanNoteText.cpp"/>
        <source>%1 is not read: a closing tag of that name comes before it</source>
        <translation>%1 wird nicht gelesen: davor steht ein schließendes Tag dieses Namens</translation>
    </message>
    <message>
        <location filename="../templates/ScanNoteText.cpp"/>
        <source>%1 is not read: its closing tag was expected</source>
        <translation>%1 wird nicht gelesen: das schließende Tag dazu wurde erwartet</translation>
    </message>
    <message>
        <location filename="../templates/ScanNoteText.cpp"/>
        <source>%1 is inside another %1: the outer one ends at the first closing tag</source>
        <translation>%1 steht in einem anderen %1: das äußere endet schon beim ersten schließenden Tag</translation>
    </message>
    <message>
        <location filename="../templates/ScanNoteText.cpp"/>
        <source>"%1" is dropped with the short closing tag of %2</source>
        <translation>„%1“ entfällt mit dem verkürzten schließenden Tag von %2</translation>
    </message>
    <message>
        <location filename="../templates/TemplateChecker.cpp"/>
        <source>no template was read: a &lt;ReportTemplate&gt; element was expected</source>
        <translation>es wurde keine Vorlage gelesen: ein Element &lt;ReportTemplate&gt; wurde erwartet</translation>
    </message>
    <message>
        <location filename="../templates/TemplateChecker.cpp"/>
        <source>the text "%1" is outside of all elements and is not read</source>
        <translation>der Text "%1" steht außerhalb aller Elemente und wird nicht gelesen</translation>
    </message>
    <message>
        <location filename="../templates/TemplateChecker.cpp"/>
        <source>this text is in no template: %1 characters in %2 lines are not read</source>
        <translation>dieser Text steht in keiner Vorlage: %1 Zeichen in %2 Zeilen werden nicht gelesen</translation>
    </message>
    <message>
        <location filename="../templates/TemplateChecker.cpp"/>
        <source>no template follows: the last %1 characters, in %2 lines, are not read</source>
        <translation>es folgt keine Vorlage mehr: die letzten %1 Zeichen in %2 Zeilen werden nicht gelesen</translation>
    </message>
    <message>
        <location filename="../templates/TemplateChecker.cpp"/>
        <source>unknown element %1: it is not read</source>
        <translation>unbekanntes Element %1: es wird nicht gelesen</translation>
    </message>
    <message>
        <location filename="../templates/TemplateChecker.cpp"/>
        <source>unknown element %1: %2</source>
        <translation>unbekanntes Element %1: %2</translation>
    </message>
    <message>
        <location filename="../templates/TemplateChecker.cpp"/>
        <source>%1 is read although it is in a comment</source>
        <translation>%1 wird gelesen, obwohl es in einem Kommentar steht</translation>
    </message>
    <message>
        <location filename="../templates/TemplateChecker.cpp"/>
        <source>%1 is not a tag: a tag has no blanks and no attributes</source>
        <translation>%1 ist kein Tag: ein Tag hat weder Leerzeichen noch Attribute</translation>
    </message>
    <message>
        <location filename="../templates/TemplateChecker.cpp"/>
        <source>the template has no &lt;Name&gt;, so it cannot be chosen</source>
        <translation>die Vorlage hat keinen &lt;Name&gt; und kann daher nicht gewählt werden</translation>
    </message>
    <message>
        <location filename="../templates/TemplateChecker.cpp"/>
        <source>a template named %1 comes before this one: the last one of a name is read</source>
        <translation>eine Vorlage namens %1 steht schon davor: von gleichnamigen wird die letzte gelesen</translation>
    </message>
    <message>
        <location filename="../templates/TemplateChecker.cpp"/>
        <source>the template's own &lt;Name&gt; must come before %1: this one was taken for it</source>
        <translation>der eigene &lt;Name&gt; der Vorlage muss vor %1 stehen: dieser hier wurde dafür gehalten</translation>
    </message>
    <message>
        <location filename="../templates/TemplateChecker.cpp"/>
        <source>the sort key %1 is not in the dictionary %2</source>
        <translation>der Sortierschlüssel %1 steht nicht im Wörterbuch %2</translation>
    </message>
    <message>
        <location filename="../templates/TemplateChecker.cpp"/>
        <source>no &lt;Separator&gt;: the columns are separated by the character 0</source>
        <translation>kein &lt;Separator&gt;: zwischen den Spalten steht das Zeichen mit dem Code 0</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>the dictionary has no &lt;DictionaryName&gt;</source>
        <translation>das Wörterbuch hat keinen &lt;DictionaryName&gt;</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>a dictionary named %1 comes before this one: the variables of both count together</source>
        <translation>vor diesem steht ein Wörterbuch namens %1: die Variablen beider zählen zusammen</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>unknown type %1: the variable %2 is left out</source>
        <translation>unbekannter Typ %1: die Variable %2 wird ausgelassen</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>the identifier %1 counts as %2: a whole number was expected</source>
        <translation>die Kennung %1 gilt als %2: eine ganze Zahl wurde erwartet</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>the variable %1 is in the dictionary twice: the last one counts</source>
        <translation>die Variable %1 steht zweimal im Wörterbuch: die letzte gilt</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>the variables %1 and %2 share the identifier %3</source>
        <translation>die Variablen %1 und %2 haben dieselbe Kennung %3</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>the table has no &lt;Name&gt;</source>
        <translation>die Tabelle hat keinen &lt;Name&gt;</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>the block has no &lt;Name&gt;</source>
        <translation>der Block hat keinen &lt;Name&gt;</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>there is no dictionary named %1: %2 cannot be written</source>
        <translation>es gibt kein Wörterbuch namens %1: %2 kann nicht geschrieben werden</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>%1 has no fields</source>
        <translation>%1 hat keine Felder</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>a table named %1 comes before this one: the first one of a name is written</source>
        <translation>vor dieser steht eine Tabelle namens %1: die erste eines Namens wird geschrieben</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>a block named %1 comes before this one: the first one of a name is written</source>
        <translation>vor diesem steht ein Block namens %1: der erste eines Namens wird geschrieben</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>the format %1 is beyond %2 characters</source>
        <translation>das Format %1 geht über %2 Zeichen hinaus</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>the format %1 counts as %2.%3: a width such as 12, or a width and decimals such as 12.3, was expected</source>
        <translation>das Format %1 gilt als %2.%3: eine Breite wie 12 oder eine Breite mit Nachkommastellen wie 12.3 wurde erwartet</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>the dictionary has no variable %1: the column cannot be filled</source>
        <translation>das Wörterbuch hat keine Variable %1: die Spalte kann nicht gefüllt werden</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>the dictionary has no variable %1: the line repeats the value before it</source>
        <translation>das Wörterbuch hat keine Variable %1: die Zeile wiederholt den Wert davor</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>the label %1 is wider than its column of %2: the column takes its width</source>
        <translation>die Beschriftung %1 ist breiter als ihre Spalte mit %2 Zeichen: die Spalte wird so breit wie die Beschriftung</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>the alignment %1 counts as LEFT</source>
        <translation>die Ausrichtung %1 gilt als LEFT</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>%1 is printed unchanged</source>
        <translation>%1 wird unverändert gedruckt</translation>
    </message>
    <message>
        <location filename="../page/PlaceholderPiece.cpp"/>
        <source>"%1" begins a placeholder that does not end: "}" was expected, or "{{" for a brace</source>
        <translation>"%1" beginnt einen Platzhalter, der nicht endet: "}" wurde erwartet, oder "{{" für eine Klammer</translation>
    </message>
    <message>
        <location filename="../page/PlaceholderPiece.cpp"/>
        <source>unknown placeholder %1: %2</source>
        <translation>unbekannter Platzhalter %1: %2</translation>
    </message>
    <message>
        <location filename="../formats/pdf/PdfExport.cpp"/>
        <source>the page has not been measured</source>
        <translation>die Seite wurde noch nicht ausgemessen</translation>
    </message>
    <message>
        <location filename="../formats/pdf/PdfExport.cpp"/>
        <source>a font size of 1 point or more was expected</source>
        <translation>eine Schriftgröße von mindestens 1 Punkt wurde erwartet</translation>
    </message>
    <message>
        <location filename="../formats/pdf/PdfExport.cpp"/>
        <source>the margins leave no room on the page: smaller margins were expected</source>
        <translation>die Ränder lassen auf der Seite keinen Platz: kleinere Ränder wurden erwartet</translation>
    </message>
    <message>
        <location filename="../formats/pdf/PdfExport.cpp"/>
        <source>the PDF library failed with error %1</source>
        <translation>die PDF-Bibliothek meldet den Fehler %1</translation>
    </message>
    <message>
        <location filename="../formats/pdf/PdfExport.cpp"/>
        <source>the font file "%1" cannot be used</source>
        <translation>die Schriftdatei „%1“ kann nicht verwendet werden</translation>
    </message>
    <message>
        <location filename="../formats/pdf/PdfExport.cpp"/>
        <source>no fixed-pitch font was found: one of %1 was expected</source>
        <translation>keine dicktengleiche Schrift wurde gefunden: eine von diesen wurde erwartet: %1</translation>
    </message>
    <message>
        <location filename="../formats/pdf/PdfExport.cpp"/>
        <source>stopped</source>
        <translation>abgebrochen</translation>
    </message>
    <message>
        <location filename="../formats/pdf/PdfNotes.cpp"/>
        <source>line %1 is</source>
        <translation>Zeile %1 ist</translation>
    </message>
    <message>
        <location filename="../formats/pdf/PdfNotes.cpp"/>
        <source>%1 lines, the first of them line %2, are</source>
        <translation>%1 Zeilen, zuerst Zeile %2, sind</translation>
    </message>
    <message>
        <location filename="../formats/pdf/PdfNotes.cpp"/>
        <source>no font has the character "%1" (U+%2), first in line %3, %4 times in all</source>
        <translation>keine Schrift enthält das Zeichen „%1“ (U+%2), zuerst in Zeile %3, insgesamt %4-mal</translation>
    </message>
    <message>
        <location filename="../formats/pdf/PdfNotes.cpp"/>
        <source>%1 wider than the page: the type is %2 points on all pages</source>
        <translation>%1 breiter als die Seite: die Schrift hat auf allen Seiten %2 Punkt</translation>
    </message>
    <message>
        <location filename="../formats/pdf/PdfNotes.cpp"/>
        <source>%1 wider than the page in type of %2 points: what is too wide continues below</source>
        <translation>%1 auch bei %2 Punkt breiter als die Seite: was zu breit ist, steht darunter</translation>
    </message>
    <message>
        <location filename="../formats/pdf/PdfNotes.cpp"/>
        <source>no font has %1 other characters, %2 times in all</source>
        <translation>%1 weitere Zeichen sind in keiner Schrift enthalten, insgesamt %2-mal</translation>
    </message>
    <message>
        <location filename="../formats/richtext/RichTextParser.cpp"/>
        <source>%1 bytes of data were expected after \bin</source>
        <translation>%1 Byte Daten wurden hinter \bin erwartet</translation>
    </message>
    <message>
        <location filename="../formats/richtext/RichTextParser.cpp"/>
        <source>a closing brace was expected: groups that are still open: %1</source>
        <translation>eine schließende geschweifte Klammer wurde erwartet: noch offene Gruppen: %1</translation>
    </message>
    <message>
        <location filename="../formats/richtext/RichTextParser.cpp"/>
        <source>at most %1 nested groups were expected</source>
        <translation>höchstens %1 ineinander geschachtelte Gruppen wurden erwartet</translation>
    </message>
    <message>
        <location filename="../formats/richtext/RichTextReader.cpp"/>
        <source>a rich text that begins with %1 was expected</source>
        <translation>%1 wurde erwartet, womit Rich-Text beginnt</translation>
    </message>
    <message>
        <location filename="../formats/richtext/RichTextReader.cpp"/>
        <source>Pictures are not shown: %1.</source>
        <translation>Bilder werden nicht angezeigt: %1.</translation>
    </message>
    <message>
        <location filename="../formats/richtext/RichTextReader.cpp"/>
        <source>Embedded objects and drawings are not shown: %1.</source>
        <translation>Eingebettete Objekte und Zeichnungen werden nicht angezeigt: %1.</translation>
    </message>
    <message>
        <location filename="../formats/richtext/RichTextReader.cpp"/>
        <source>Footnotes and comments are not shown: %1.</source>
        <translation>Fußnoten und Kommentare werden nicht angezeigt: %1.</translation>
    </message>
    <message>
        <location filename="../formats/richtext/RichTextReader.cpp"/>
        <source>Page headers and footers are not shown: %1.</source>
        <translation>Kopf- und Fußzeilen werden nicht angezeigt: %1.</translation>
    </message>
    <message>
        <location filename="../formats/richtext/RichTextReader.cpp"/>
        <source>Hidden text is not shown: %1.</source>
        <translation>Verborgener Text wird nicht angezeigt: %1.</translation>
    </message>
    <message>
        <location filename="../formats/richtext/RichTextReader.cpp"/>
        <source>Characters of symbol fonts are not known: %1.</source>
        <translation>Zeichen aus Symbolschriften sind nicht bekannt: %1.</translation>
    </message>
    <message>
        <location filename="../report/ReportSaveName.cpp"/>
        <source>RTF Files (*.rtf)|*.rtf|Report Files (*.rep)|*.rep|PDF (*.pdf)|*.pdf|</source>
        <translation>RTF-Dateien (*.rtf)|*.rtf|Berichtsdateien (*.rep)|*.rep|PDF (*.pdf)|*.pdf|</translation>
    </message>
    <message>
        <location filename="../report/ReportSaveName.cpp"/>
        <source>Report Files (*.rep)|*.rep|RTF Files (*.rtf)|*.rtf|PDF (*.pdf)|*.pdf|</source>
        <translation>Berichtsdateien (*.rep)|*.rep|RTF-Dateien (*.rtf)|*.rtf|PDF (*.pdf)|*.pdf|</translation>
    </message>
    <message>
        <location filename="../report/ReportSaveName.cpp"/>
        <source>"%1" could not be saved. Choose another folder, or make room on the disk.</source>
        <translation>„%1“ konnte nicht gespeichert werden. Einen anderen Ordner wählen oder Platz auf dem Datenträger schaffen.</translation>
    </message>
    <message>
        <location filename="../report/ReportSaveName.cpp"/>
        <source>"%1" could not be saved: %2.</source>
        <translation>„%1“ konnte nicht gespeichert werden: %2.</translation>
    </message>
    <message>
        <location filename="../report/ReportSaveName.cpp"/>
        <source>a part of the report was lost when memory ran out</source>
        <translation>ein Teil des Berichts ging verloren, als der Speicher ausging</translation>
    </message>
    <message>
        <location filename="../report/ReportSaveName.cpp"/>
        <source>the report is empty, and a PDF has at least one page</source>
        <translation>der Bericht ist leer, und eine PDF-Datei hat mindestens eine Seite</translation>
    </message>
    <message>
        <location filename="../report/UReportDoc.cpp"/>
        <source>Station</source>
        <translation>Station</translation>
    </message>
    <message>
        <location filename="../report/UReportDocText.cpp"/>
        <source>   Page:</source>
        <comment>Report Header</comment>
        <translation>   Seite:</translation>
    </message>
    <message>
        <location filename="../print/PageSetupDialog.cpp"/>
        <source>Page Setup</source>
        <translation>Seite einrichten</translation>
    </message>
    <message>
        <location filename="../print/PageSetupForm.cpp"/>
        <source>As the report was &amp;made</source>
        <translation>Wie im Bericht an&amp;gelegt</translation>
    </message>
    <message>
        <location filename="../print/PageSetupForm.cpp"/>
        <source>As the report was &amp;made (1 line)</source>
        <translation>Wie im Bericht an&amp;gelegt (1 Zeile)</translation>
    </message>
    <message>
        <location filename="../print/PageSetupForm.cpp"/>
        <source>As the report was &amp;made (%1 lines)</source>
        <translation>Wie im Bericht an&amp;gelegt (%1 Zeilen)</translation>
    </message>
    <message>
        <location filename="../print/PageSetupForm.cpp"/>
        <source>P&amp;ortrait</source>
        <translation>&amp;Hochformat</translation>
    </message>
    <message>
        <location filename="../print/PageSetupForm.cpp"/>
        <source>L&amp;andscape</source>
        <translation>&amp;Querformat</translation>
    </message>
    <message>
        <location filename="../print/PageSetupForm.cpp"/>
        <source>As the &amp;sheet takes them</source>
        <translation>Wie sie auf das &amp;Blatt passen</translation>
    </message>
    <message>
        <location filename="../print/PageSetupForm.cpp"/>
        <source>Paper: %1 x %2 in</source>
        <translation>Papier: %1 x %2 Zoll</translation>
    </message>
    <message>
        <location filename="../print/PageSetupForm.cpp"/>
        <source>Paper: %1 x %2 mm</source>
        <translation>Papier: %1 x %2 mm</translation>
    </message>
    <message>
        <location filename="../print/PageSetupForm.cpp"/>
        <source>These margins leave no room for text on the paper. Choose smaller margins.</source>
        <translation>Diese Ränder lassen auf dem Papier keinen Platz für Text. Bitte kleinere Ränder wählen.</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>Pr&amp;inter:</source>
        <translation>&amp;Drucker:</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>Printer</source>
        <translation>Drucker</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>Pa&amp;per:</source>
        <translation>Pa&amp;pier:</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>Paper</source>
        <translation>Papier</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>Orientation</source>
        <translation>Ausrichtung</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>Margins</source>
        <translation>Seitenränder</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>&amp;Left:</source>
        <translation>&amp;Links:</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>&amp;Top:</source>
        <translation>&amp;Oben:</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>&amp;Right:</source>
        <translation>&amp;Rechts:</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>&amp;Bottom:</source>
        <translation>&amp;Unten:</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>Left margin</source>
        <translation>Linker Rand</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>Top margin</source>
        <translation>Oberer Rand</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>Right margin</source>
        <translation>Rechter Rand</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>Bottom margin</source>
        <translation>Unterer Rand</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source> in</source>
        <comment>inches, after a number</comment>
        <translation> in</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source> mm</source>
        <translation> mm</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>Pages</source>
        <translation>Seiten</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>Pages: %1</source>
        <translation>Seiten: %1</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>Each page of the report is printed on a sheet of its own, in smaller type where it has to be.</source>
        <translation>Jede Seite des Berichts wird auf ein eigenes Blatt gedruckt, wo nötig in kleinerer Schrift.</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>Each sheet takes as many lines as fit, and the next sheet goes on from there.</source>
        <translation>Jedes Blatt nimmt so viele Zeilen auf, wie darauf passen, und das nächste fährt dort fort.</translation>
    </message>
    <message>
        <location filename="../print/PrintDialogs.cpp"/>
        <source>Print</source>
        <translation>Drucken</translation>
    </message>
    <message>
        <location filename="../print/PrintDialogs.cpp"/>
        <source>Print Preview</source>
        <translation>Druckvorschau</translation>
    </message>
    <message>
        <location filename="../print/PrintProgress.cpp"/>
        <source>Printing</source>
        <translation>Drucken</translation>
    </message>
    <message>
        <location filename="../print/PrintProgress.cpp"/>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <location filename="../print/PrintProgress.cpp"/>
        <source>Page %1 of %2</source>
        <translation>Seite %1 von %2</translation>
    </message>
    <message>
        <location filename="../print/PrintTarget.cpp"/>
        <source>There is not enough room for the pages on the disk.</source>
        <translation>Für die Seiten ist kein Speicherplatz mehr frei.</translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>Previous match</source>
        <translation>Vorherige Fundstelle</translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>Next match</source>
        <translation>Nächste Fundstelle</translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>Match &amp;case</source>
        <translation>Groß-/&amp;Kleinschreibung</translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>Whole wor&amp;d</source>
        <translation>Nur ganze &amp;Wörter</translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>Close the find bar</source>
        <translation>Suchleiste schließen</translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>Find</source>
        <translation>Suchen</translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>Text to find</source>
        <translation>Suchtext</translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>Matches</source>
        <translation>Fundstellen</translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>No match</source>
        <translation>Keine Fundstelle</translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>%1 of %2</source>
        <comment>number of a match, number of all matches</comment>
        <translation>%1 von %2</translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>%1 in all</source>
        <comment>number of all matches</comment>
        <translation>%1 insgesamt</translation>
    </message>
    <message>
        <location filename="../view/PageBar.cpp"/>
        <source>Go to page</source>
        <translation>Gehe zu Seite</translation>
    </message>
    <message>
        <location filename="../view/PageBar.cpp"/>
        <source>Page to go to</source>
        <translation>Zielseite</translation>
    </message>
    <message>
        <location filename="../view/PageBar.cpp"/>
        <source>&amp;Go to page</source>
        <translation>&amp;Gehe zu Seite</translation>
    </message>
    <message>
        <location filename="../view/PageBar.cpp"/>
        <source>G&amp;o</source>
        <translation>&amp;Los</translation>
    </message>
    <message>
        <location filename="../view/PageBar.cpp"/>
        <source>of %1</source>
        <comment>number of pages</comment>
        <translation>von %1</translation>
    </message>
    <message>
        <location filename="../view/ReportEdit.cpp"/>
        <source>Report text</source>
        <translation>Berichtstext</translation>
    </message>
    <message>
        <location filename="../view/ReportEditCopy.cpp"/>
        <source>There is not enough memory to copy this. The clipboard is as it was.</source>
        <translation>Der Speicher reicht nicht aus, um dies zu kopieren. Die Zwischenablage ist unverändert.</translation>
    </message>
    <message>
        <location filename="../view/ReportEditPageLines.cpp"/>
        <source>Page %1</source>
        <translation>Seite %1</translation>
    </message>
    <message>
        <location filename="../view/ReportViewWidget.cpp"/>
        <source>Page</source>
        <translation>Seite</translation>
    </message>
    <message>
        <location filename="../view/ReportViewWidget.cpp"/>
        <source>Line</source>
        <translation>Zeile</translation>
    </message>
    <message>
        <location filename="../view/ReportViewWidget.cpp"/>
        <source>Line %1</source>
        <translation>Zeile %1</translation>
    </message>
    <message>
        <location filename="../view/ReportViewWidget.cpp"/>
        <source>Column</source>
        <translation>Spalte</translation>
    </message>
    <message>
        <location filename="../view/ReportViewWidget.cpp"/>
        <source>Column %1</source>
        <translation>Spalte %1</translation>
    </message>
    <message>
        <location filename="../view/ReportViewWidget.cpp"/>
        <source>Loading</source>
        <translation>Wird geladen</translation>
    </message>
    <message>
        <location filename="../view/ReportViewWidget.cpp"/>
        <source>Loading %1 %</source>
        <comment>percent of a report</comment>
        <translation>%1 % geladen</translation>
    </message>
    <message>
        <location filename="../view/ReportViewWidget.cpp"/>
        <source>Zoom</source>
        <translation>Zoom</translation>
    </message>
    <message>
        <location filename="../view/ReportViewWidget.cpp"/>
        <source>%1 %</source>
        <comment>zoom in percent</comment>
        <translation>%1 %</translation>
    </message>
    <message>
        <location filename="../view/UReportViewPageSetup.cpp"/>
        <source>Failed to get default printer settings.</source>
        <translation>Die Einstellungen des Standarddruckers konnten nicht abgerufen werden.</translation>
    </message>
    <message>
        <location filename="../view/UReportViewPrint.cpp"/>
        <source>The margins leave no room for text on the paper. Choose smaller margins under Page Setup.</source>
        <translation>Die Ränder lassen auf dem Papier keinen Platz für Text. Bitte unter „Seite einrichten“ kleinere Ränder wählen.</translation>
    </message>
    <message>
        <location filename="../view/UReportViewPrint.cpp"/>
        <source>There is nothing to print on the chosen pages.</source>
        <translation>Auf den gewählten Seiten gibt es nichts zu drucken.</translation>
    </message>
    <message>
        <location filename="../view/UReportViewPrint.cpp"/>
        <source>The report has changed while it was printed, and nothing of it was sent to the printer. Print it again.</source>
        <translation>Der Bericht wurde während des Druckens geändert; es wurde nichts an den Drucker gesendet. Bitte erneut drucken.</translation>
    </message>
    <message>
        <location filename="../view/UReportViewPrint.cpp"/>
        <source>The report could not be printed on "%1". Check the printer, or choose another one, and print again. Nothing of the report is lost.</source>
        <translation>Der Bericht konnte auf „%1“ nicht gedruckt werden. Bitte den Drucker prüfen oder einen anderen wählen und erneut drucken. Vom Bericht ist nichts verloren gegangen.</translation>
    </message>
    <message>
        <location filename="../view/UReportViewPrint.cpp"/>
        <source>The preview shows the first %1 pages. All pages are printed.</source>
        <translation>Die Vorschau zeigt die ersten %1 Seiten. Gedruckt werden alle Seiten.</translation>
    </message>
    <message>
        <location filename="../ui/CReportToolBar.cpp"/>
        <source>Report</source>
        <translation>Bericht</translation>
    </message>
    <message>
        <location filename="../ui/CReportViewPane.cpp"/>
        <source>The Report can only be closed when the associated editor is closed</source>
        <translation>Der Bericht kann erst geschlossen werden, wenn der zugehörige Editor geschlossen ist</translation>
    </message>
    <message>
        <location filename="../ui/CReportViewPane.cpp"/>
        <source>Error</source>
        <comment>Alert Message title</comment>
        <translation>Fehler</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;File</source>
        <translation>&amp;Datei</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;New	Ctrl+N</source>
        <translation>&amp;Neu	Ctrl+N</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Open...	Ctrl+O</source>
        <translation>Ö&amp;ffnen...	Ctrl+O</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Close</source>
        <translation>S&amp;chließen</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Save	Ctrl+S</source>
        <translation>&amp;Speichern	Ctrl+S</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>Save &amp;As...</source>
        <translation>Speichern &amp;unter...</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>Update Text</source>
        <translation>Text aktualisieren</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Print...	Ctrl+P</source>
        <translation>&amp;Drucken...	Ctrl+P</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>Print Pre&amp;view</source>
        <translation>Druckv&amp;orschau</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>Pa&amp;ge Setup...</source>
        <translation>Seite ein&amp;richten...</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>Recent File</source>
        <translation>Zuletzt verwendete Dateien</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>E&amp;xit</source>
        <translation>&amp;Beenden</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Edit</source>
        <translation>&amp;Bearbeiten</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Undo	Ctrl+Z</source>
        <translation>&amp;Rückgängig	Ctrl+Z</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>Cu&amp;t	Ctrl+X</source>
        <translation>A&amp;usschneiden	Ctrl+X</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Copy	Ctrl+C</source>
        <translation>&amp;Kopieren	Ctrl+C</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Paste	Ctrl+V</source>
        <translation>&amp;Einfügen	Ctrl+V</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;View</source>
        <translation>&amp;Ansicht</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Toolbar</source>
        <translation>&amp;Symbolleiste</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Status Bar</source>
        <translation>S&amp;tatusleiste</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Window</source>
        <translation>&amp;Fenster</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;New Window</source>
        <translation>&amp;Neues Fenster</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Cascade</source>
        <translation>Ü&amp;berlappend</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Tile Horizontally</source>
        <translation>&amp;Untereinander</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>Tile Vertically</source>
        <translation>Nebeneinander</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Arrange Icons</source>
        <translation>&amp;Symbole anordnen</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Help</source>
        <translation>&amp;Hilfe</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;About...</source>
        <translation>Ü&amp;ber KaReport...</translation>
    </message>
    <message>
        <location filename="../ui/ReportResources.cpp"/>
        <source>KaReport</source>
        <translation>KaReport</translation>
    </message>
    <message>
        <location filename="../ui/ReportResources.cpp"/>
        <source>Save</source>
        <translation>Speichern</translation>
    </message>
    <message>
        <location filename="../ui/ReportResources.cpp"/>
        <source>View\Edit Report</source>
        <translation>Bericht anzeigen/bearbeiten</translation>
    </message>
    <message>
        <location filename="../ui/UReportWindowDlg.cpp"/>
        <source>Report lines</source>
        <translation>Zeilen des Berichts</translation>
    </message>
    <message>
        <location filename="../ui/UReportWindowDlgCommands.cpp"/>
        <source>Save changes</source>
        <translation>Änderungen speichern</translation>
    </message>
    <message>
        <location filename="../ui/UReportWindowDlgCommands.cpp"/>
        <source>to</source>
        <translation>in</translation>
    </message>
    <message>
        <location filename="../sources/ColumnBinding.cpp"/>
        <source>there is no column %1: one of 1 to %2 was expected</source>
        <translation>es gibt keine Spalte %1: erwartet wurde eine von 1 bis %2</translation>
    </message>
    <message>
        <location filename="../sources/ColumnBinding.cpp"/>
        <source>there is no column "%1"</source>
        <translation>es gibt keine Spalte "%1"</translation>
    </message>
    <message>
        <location filename="../sources/ColumnBinding.cpp"/>
        <source>the columns %1 and %2 are both named "%3": each variable was expected once</source>
        <translation>die Spalten %1 und %2 heißen beide „%3“: jede Variable wurde nur einmal erwartet</translation>
    </message>
    <message>
        <location filename="../sources/ColumnBinding.cpp"/>
        <source>the dictionary has no variable "%1"</source>
        <translation>das Wörterbuch hat keine Variable "%1"</translation>
    </message>
    <message>
        <location filename="../sources/ColumnBinding.cpp"/>
        <source>the variable "%1" has two columns: each variable was expected once</source>
        <translation>die Variable "%1" hat zwei Spalten: jede Variable wurde einmal erwartet</translation>
    </message>
    <message>
        <location filename="../sources/FileBytes.cpp"/>
        <source>the file was cut short while it was read</source>
        <translation>die Datei wurde beim Lesen abgeschnitten</translation>
    </message>
    <message>
        <location filename="../sources/FileBytes.cpp"/>
        <source>the pipe or device gives more than %1 MB, the most that was expected</source>
        <translation>mehr als %1 MB kommen aus einer Quelle, die keine Datei ist</translation>
    </message>
    <message>
        <location filename="../sources/GeometryColumns.cpp"/>
        <source>the value "%1" of the column "%2" does not fit: %3 was expected</source>
        <translation>der Wert "%1" der Spalte "%2" passt nicht: %3 wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/GeometryColumns.cpp"/>
        <source>no column is a variable of the dictionary; the columns are: %1</source>
        <translation>keine Spalte ist eine Variable des Wörterbuchs; die Spalten sind: %1</translation>
    </message>
    <message>
        <location filename="../sources/PointGeometry.cpp"/>
        <source>bytes that are not a geometry</source>
        <translation>Bytes, die keine Geometrie sind</translation>
    </message>
    <message>
        <location filename="../sources/PointGeometry.cpp"/>
        <source>a line string</source>
        <translation>ein Linienzug</translation>
    </message>
    <message>
        <location filename="../sources/PointGeometry.cpp"/>
        <source>a polygon</source>
        <translation>ein Polygon</translation>
    </message>
    <message>
        <location filename="../sources/PointGeometry.cpp"/>
        <source>several points</source>
        <translation>mehrere Punkte</translation>
    </message>
    <message>
        <location filename="../sources/PointGeometry.cpp"/>
        <source>several line strings</source>
        <translation>mehrere Linienzüge</translation>
    </message>
    <message>
        <location filename="../sources/PointGeometry.cpp"/>
        <source>several polygons</source>
        <translation>mehrere Polygone</translation>
    </message>
    <message>
        <location filename="../sources/PointGeometry.cpp"/>
        <source>a collection of geometries</source>
        <translation>eine Sammlung von Geometrien</translation>
    </message>
    <message>
        <location filename="../sources/PointGeometry.cpp"/>
        <source>a geometry of another kind</source>
        <translation>eine Geometrie anderer Art</translation>
    </message>
    <message>
        <location filename="../sources/RowReader.cpp"/>
        <source>a row has values in several columns whose variables have one ID: that of "%1", the last one, shows</source>
        <translation>eine Zeile hat Werte in mehreren Spalten, deren Variablen eine ID haben: der von "%1", der letzten, erscheint</translation>
    </message>
    <message>
        <location filename="../sources/SpooledBytes.cpp"/>
        <source>the data cannot be kept in a temporary file: %1</source>
        <translation>die Daten können nicht in einer temporären Datei gehalten werden: %1</translation>
    </message>
    <message>
        <location filename="../sources/TextEncoding.cpp"/>
        <source>the file is not UTF-16</source>
        <translation>die Datei ist nicht UTF-16</translation>
    </message>
    <message>
        <location filename="../sources/TextEncoding.cpp"/>
        <source>the file is not Windows-1252: it contains a byte that this encoding does not use</source>
        <translation>die Datei ist nicht Windows-1252: sie enthält ein Byte, das diese Codierung nicht verwendet</translation>
    </message>
    <message>
        <location filename="../sources/TextEncoding.cpp"/>
        <source>the file has no byte-order mark: UTF-16 with its mark was expected</source>
        <translation>die Datei hat keine Bytereihenfolge-Marke: UTF-16 mit seiner Marke wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/ValueParser.cpp"/>
        <source>a whole number</source>
        <translation>eine ganze Zahl</translation>
    </message>
    <message>
        <location filename="../sources/ValueParser.cpp"/>
        <source>a text</source>
        <translation>ein Text</translation>
    </message>
    <message>
        <location filename="../sources/ValueParser.cpp"/>
        <source>yes or no</source>
        <translation>yes oder no</translation>
    </message>
    <message>
        <location filename="../sources/ValueParser.cpp"/>
        <source>a station such as 12+345.678</source>
        <translation>eine Station wie 12+345.678</translation>
    </message>
    <message>
        <location filename="../sources/ValueParser.cpp"/>
        <source>a number, or an offset such as 12.5R</source>
        <translation>eine Zahl oder ein Abstand wie 12.5R</translation>
    </message>
    <message>
        <location filename="../sources/ValueParser.cpp"/>
        <source>a number, or ByLayer</source>
        <translation>eine Zahl oder ByLayer</translation>
    </message>
    <message>
        <location filename="../sources/ValueParser.cpp"/>
        <source>a number, or an angle such as 45°30'15"</source>
        <translation>eine Zahl oder ein Winkel wie 45°30'15"</translation>
    </message>
    <message>
        <location filename="../sources/ValueParser.cpp"/>
        <source>a number, or a bearing such as N45-30-15E</source>
        <translation>eine Zahl oder eine Richtung wie N45-30-15E</translation>
    </message>
    <message>
        <location filename="../sources/ValueParser.cpp"/>
        <source>an angle such as 45-30-15</source>
        <translation>ein Winkel wie 45-30-15</translation>
    </message>
    <message>
        <location filename="../sources/ValueParser.cpp"/>
        <source>a bearing such as 45-30-15 or N45-30-15E</source>
        <translation>eine Richtung wie 45-30-15 oder N45-30-15E</translation>
    </message>
    <message>
        <location filename="../sources/ValueParser.cpp"/>
        <source>a number</source>
        <translation>eine Zahl</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvPreview.cpp"/>
        <source>%1 was expected</source>
        <translation>%1 wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvPreview.cpp"/>
        <source>the row has %1 cells: %2 were expected</source>
        <translation>die Zeile hat %1 Zellen: %2 wurden erwartet</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvReader.cpp"/>
        <source>the file is not UTF-8</source>
        <translation>die Datei ist nicht in UTF-8 kodiert</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvReader.cpp"/>
        <source>a delimiter was expected after the closing quote</source>
        <translation>hinter dem schließenden Anführungszeichen wurde ein Trennzeichen erwartet</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvReader.cpp"/>
        <source>a quote inside a cell was not expected: put the whole cell in quotes and double the quote</source>
        <translation>ein Anführungszeichen in einer Zelle wurde nicht erwartet: die ganze Zelle muss in Anführungszeichen stehen und das Zeichen selbst doppelt</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvReader.cpp"/>
        <source>the file contains a zero byte: a text file was expected</source>
        <translation>die Datei enthält ein Nullbyte: eine Textdatei wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvReader.cpp"/>
        <source>a carriage return without a line feed was not expected</source>
        <translation>ein Wagenrücklauf (CR) ohne Zeilenvorschub (LF) wurde nicht erwartet</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvReader.cpp"/>
        <source>the row is longer than %1 bytes: a table of rows was expected</source>
        <translation>die Zeile ist länger als %1 Byte: eine Tabelle aus Zeilen wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvReaderCells.cpp"/>
        <source>the quoted cell has no closing quote</source>
        <translation>der Zelle in Anführungszeichen fehlt das schließende Anführungszeichen</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvRows.cpp"/>
        <source>the row has %1 cells: %2 were expected, as in the header row</source>
        <translation>die Zeile hat %1 Zellen: wie in der Kopfzeile wurden %2 erwartet</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvRows.cpp"/>
        <source>the row has %1 cells: %2 were expected, as in all rows</source>
        <translation>die Zeile hat %1 Zellen: %2 wurden erwartet, wie in allen Zeilen</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvRows.cpp"/>
        <source>the cell "%1" of the column "%2" does not fit: %3 was expected</source>
        <translation>die Zelle „%1“ der Spalte „%2“ passt nicht: %3 wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvRowsColumns.cpp"/>
        <source>"%1" is not an order of columns: each of the letters P, N, E, Z and D at most once, and - for a column that is skipped, was expected, such as PNEZD</source>
        <translation>"%1" ist keine Reihenfolge von Spalten: erwartet wurden die Buchstaben P, N, E, Z und D je höchstens einmal, und - für eine Spalte, die übergangen wird, wie PNEZD</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvRowsColumns.cpp"/>
        <source>a header row of variable names was expected</source>
        <translation>eine Kopfzeile mit Variablennamen wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvRowsColumns.cpp"/>
        <source>a header row was expected</source>
        <translation>eine Kopfzeile wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvRowsColumns.cpp"/>
        <source>no column of the header row is a variable of the dictionary: variable names separated by the delimiter were expected</source>
        <translation>keine Spalte der Kopfzeile ist eine Variable des Wörterbuchs: durch das Trennzeichen getrennte Variablennamen wurden erwartet</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvRowsColumns.cpp"/>
        <source>no column is a variable of the dictionary: without a header row, column numbers or an order such as PNEZD were expected</source>
        <translation>keine Spalte ist eine Variable des Wörterbuchs: ohne Kopfzeile wurden Spaltennummern oder eine Reihenfolge wie PNEZD erwartet</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvRowsColumns.cpp"/>
        <source>the header row holds values that fit the columns, and may be data. If it is data, set "header" to false (--no-header), and use "skip" for lines that are not data; otherwise set "header" to true</source>
        <translation>die Kopfzeile enthält Werte, die zu den Spalten passen, und kann Daten enthalten. Wenn sie Daten enthält, "header" auf false setzen (--no-header) und "skip" für Zeilen ohne Daten verwenden; sonst "header" auf true setzen</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvRowsColumns.cpp"/>
        <source>the header row holds %1 value that fits its column, and may be data: set "header" to true if it is a header row, or to false if it is data</source>
        <translation>die Kopfzeile enthält %1 Wert, der zu seiner Spalte passt, und kann Daten enthalten: "header" auf true setzen, wenn sie eine Kopfzeile ist, oder auf false, wenn sie Daten enthält</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvRowsColumns.cpp"/>
        <source>the header row holds %1 values that fit their columns, and may be data: set "header" to true if it is a header row, or to false if it is data</source>
        <translation>die Kopfzeile enthält %1 Werte, die zu ihren Spalten passen, und kann Daten enthalten: "header" auf true setzen, wenn sie eine Kopfzeile ist, oder auf false, wenn sie Daten enthält</translation>
    </message>
    <message>
        <location filename="../sources/csv/DelimiterGuess.cpp"/>
        <source>blanks and tabs</source>
        <translation>Leerzeichen und Tabulatoren</translation>
    </message>
    <message>
        <location filename="../sources/csv/DelimiterGuess.cpp"/>
        <source>the comma</source>
        <translation>das Komma</translation>
    </message>
    <message>
        <location filename="../sources/csv/DelimiterGuess.cpp"/>
        <source>the semicolon</source>
        <translation>das Semikolon</translation>
    </message>
    <message>
        <location filename="../sources/csv/DelimiterGuess.cpp"/>
        <source>the tab</source>
        <translation>der Tabulator</translation>
    </message>
    <message>
        <location filename="../sources/csv/DelimiterGuess.cpp"/>
        <source>the vertical bar</source>
        <translation>der senkrechte Strich</translation>
    </message>
    <message>
        <location filename="../sources/csv/DelimiterGuess.cpp"/>
        <source>the delimiter cannot be determined: with a comma, a semicolon, a tab, a vertical bar, or blanks and tabs, the first rows do not have the same number of cells that fit their variables. Specify the delimiter</source>
        <translation>das Trennzeichen ist nicht zu ermitteln: mit Komma, Semikolon, Tabulator, senkrechtem Strich oder Leerzeichen und Tabulatoren haben die ersten Zeilen nicht gleich viele Zellen, die zu ihren Variablen passen. Geben Sie das Trennzeichen an</translation>
    </message>
    <message>
        <location filename="../sources/csv/DelimiterGuess.cpp"/>
        <source>with %1, in line %2: %3</source>
        <translation>mit %1, in Zeile %2: %3</translation>
    </message>
    <message>
        <location filename="../sources/csv/DelimiterGuess.cpp"/>
        <source>the delimiter cannot be determined: it may be %1. Specify the delimiter</source>
        <translation>das Trennzeichen ist nicht zu ermitteln: möglich sind %1. Geben Sie das Trennzeichen an</translation>
    </message>
    <message>
        <location filename="../sources/csv/DelimiterGuess.cpp"/>
        <source> or </source>
        <comment>between two delimiters</comment>
        <translation> oder </translation>
    </message>
    <message>
        <location filename="../sources/json/JsonFileRows.cpp"/>
        <source>a list of objects, or an object a line, was expected</source>
        <translation>eine Liste von Objekten oder ein Objekt je Zeile wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/json/JsonFileRows.cpp"/>
        <source>a comma or the end of the list was expected</source>
        <translation>ein Komma oder das Ende der Liste wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/json/JsonFileRows.cpp"/>
        <source>the end of the line was expected: each object has a line of its own</source>
        <translation>das Ende der Zeile wurde erwartet: jedes Objekt steht in einer eigenen Zeile</translation>
    </message>
    <message>
        <location filename="../sources/json/JsonFileRows.cpp"/>
        <source>an object was expected</source>
        <translation>ein Objekt wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/json/JsonFileRows.cpp"/>
        <source>nothing was expected after the list</source>
        <translation>hinter der Liste wurde nichts erwartet</translation>
    </message>
    <message>
        <location filename="../sources/json/JsonFileRows.cpp"/>
        <source>the object is longer than %1 bytes: a list of rows was expected</source>
        <translation>das Objekt ist länger als %1 Bytes: eine Liste von Zeilen wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/json/JsonFileValues.cpp"/>
        <source>the key "%1" occurs twice in an object</source>
        <translation>der Schlüssel "%1" steht zweimal in einem Objekt</translation>
    </message>
    <message>
        <location filename="../sources/json/JsonFileValues.cpp"/>
        <source>the variable "%1" occurs twice: each variable was expected once</source>
        <translation>die Variable „%1“ kommt zweimal vor: jede Variable wurde nur einmal erwartet</translation>
    </message>
    <message>
        <location filename="../sources/json/JsonFileValues.cpp"/>
        <source>this is not JSON: %1</source>
        <translation>das ist kein JSON: %1</translation>
    </message>
    <message>
        <location filename="../sources/json/JsonFileValues.cpp"/>
        <source>the value of "%1" does not fit: %2 was expected</source>
        <translation>der Wert von „%1“ passt nicht: %2 wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/json/JsonKeys.cpp"/>
        <source>the columns of JSON have no numbers: the name of a key was expected</source>
        <translation>die Spalten von JSON haben keine Nummern: der Name eines Schlüssels wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/json/JsonKeys.cpp"/>
        <source>no object has the key "%1"</source>
        <translation>kein Objekt hat den Schlüssel "%1"</translation>
    </message>
    <message>
        <location filename="../sources/json/JsonKeys.cpp"/>
        <source>no key of the objects is a variable of the dictionary; the keys are: %1</source>
        <translation>kein Schlüssel der Objekte ist eine Variable des Wörterbuchs; die Schlüssel sind: %1</translation>
    </message>
    <message>
        <location filename="../sources/landxml/ElementRows.cpp"/>
        <source>the tangents of the element are parallel: it has no PI</source>
        <translation>die Tangenten des Elements sind parallel: es hat keinen Tangentenschnittpunkt</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlArc.cpp"/>
        <source>the element has no geometry: its radius does not reach from its start to its end</source>
        <translation>das Element hat keine Geometrie: sein Halbmesser reicht nicht vom Anfang zum Ende</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlComparison.cpp"/>
        <source>%1 is %2 in the file, but %3 by its geometry</source>
        <translation>%1 ist in der Datei %2, nach der Geometrie aber %3</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlComparison.cpp"/>
        <source>the element begins %1 from the end of the element before: at %2, but that ends at %3</source>
        <translation>das Element beginnt %1 vom Ende des vorigen Elements entfernt: bei %2, doch jenes endet bei %3</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlComparison.cpp"/>
        <source>the curve has no Center, length, delta or PI that says which way round it goes: the shorter arc of its radius was taken</source>
        <translation>der Bogen hat weder Center noch length, delta oder PI, die sagen, wie herum er geht: der kürzere Bogen seines Radius wurde genommen</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlComparison.cpp"/>
        <source>the element begins at an angle of %1 to the end of the element before, with bearing %2 after %3: perhaps one of them bends to the other side</source>
        <translation>das Element beginnt in einem Winkel von %1 zum Ende des Elements davor, mit der Richtung %2 nach %3: vielleicht biegt eines der beiden zur anderen Seite</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlComparison.cpp"/>
        <source>the element begins at an angle of %1 to the end of the element before, with bearing %2 after %3</source>
        <translation>das Element beginnt in einem Winkel von %1 zum Ende des Elements davor, mit der Richtung %2 nach %3</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlComparison.cpp"/>
        <source>PI is %1 in the file, but %2 by its geometry: %3 beside the tangents of the element, which perhaps bends to the other side</source>
        <translation>PI ist %1 in der Datei, doch %2 nach der Geometrie: %3 neben den Tangenten des Elements, das vielleicht zur anderen Seite biegt</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlComparison.cpp"/>
        <source>PI is %1 in the file, but the tangents of the element are parallel</source>
        <translation>PI ist %1 in der Datei, doch die Tangenten des Elements sind parallel</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlCurveParts.cpp"/>
        <source>the element has no geometry: a radius above zero was expected</source>
        <translation>das Element hat keine Geometrie: ein Halbmesser über null wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlCurveParts.cpp"/>
        <source>the element has no geometry: a length above zero was expected</source>
        <translation>das Element hat keine Geometrie: eine Länge über null wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlCurveParts.cpp"/>
        <source>the element turns too many times</source>
        <translation>das Element dreht sich zu oft im Kreis</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlCurveParts.cpp"/>
        <source>the element turns by more than 45 degrees from its tangent: its form allows less</source>
        <translation>das Element dreht um mehr als 45 Grad von seiner Tangente ab: seine Form lässt weniger zu</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlCurveParts.cpp"/>
        <source>the element is curved at both ends: its form needs a straight end</source>
        <translation>das Element ist an beiden Enden gekrümmt: seine Form braucht ein gerades Ende</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlCurveParts.cpp"/>
        <source>the element has no geometry: %1 was expected</source>
        <translation>das Element hat keine Geometrie: %1 wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlGeometry.cpp"/>
        <source>not supported: a transition of the form "%1"</source>
        <translation>nicht unterstützt: ein Übergangsbogen der Form „%1“</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlGeometry.cpp"/>
        <source>not supported: an element "%1" of an alignment or a border</source>
        <translation>nicht unterstützt: ein Element „%1“ einer Achse oder einer Grenze</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlListColumns.cpp"/>
        <source>the dictionary has none of the variables of this list, which are: %1</source>
        <translation>das Verzeichnis hat keine der Variablen dieser Liste; das sind: %1</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlListColumns.cpp"/>
        <source>the value of the variable "%1" does not fit: %2 was expected</source>
        <translation>der Wert der Variablen „%1“ passt nicht: %2 wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlNames.cpp"/>
        <source>the file has no group of points "%1"</source>
        <translation>die Datei hat keine Punktgruppe „%1“</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlNames.cpp"/>
        <source>the file has no surface "%1" for this list</source>
        <translation>die Datei hat für diese Liste keine Oberfläche „%1“</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlNames.cpp"/>
        <source>the file has no parcel "%1"</source>
        <translation>die Datei hat kein Flurstück „%1“</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlNames.cpp"/>
        <source>the file has no alignment "%1"</source>
        <translation>die Datei hat keine Achse „%1“</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlNames.cpp"/>
        <source>the file has no grade line "%1" in the alignments that are listed</source>
        <translation>die Datei hat in den Achsen der Liste keine Gradiente „%1“</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlNames.cpp"/>
        <source>there are no names to choose from</source>
        <translation>es gibt keine Namen zur Auswahl</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlNotes.cpp"/>
        <source>and %1 more such difference</source>
        <translation>und %1 weitere solche Abweichung</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlNotes.cpp"/>
        <source>and %1 more such differences</source>
        <translation>und %1 weitere solche Abweichungen</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlNotes.cpp"/>
        <source>%1: %2 in the file, which no list reads</source>
        <translation>%1: %2 in der Datei, die keine Liste liest</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlNotes.cpp"/>
        <source>elements of other kinds: %1 in the file, which no list reads</source>
        <translation>Elemente anderer Arten: %1 in der Datei, die keine Liste liest</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlProfile.cpp"/>
        <source>the grade line has fewer than two points</source>
        <translation>die Gradiente hat weniger als zwei Punkte</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlProfile.cpp"/>
        <source>the grade line has no heights: a length or a radius above zero was expected</source>
        <translation>die Gradiente hat keine Höhen: eine Länge oder ein Halbmesser über null wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlProfile.cpp"/>
        <source>the grade line has no heights: a station ahead of that of the point before was expected</source>
        <translation>die Gradiente hat keine Höhen: eine Station hinter der des vorigen Punkts wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlProfile.cpp"/>
        <source>the first or the last point of the grade line has a curve, where only one grade meets</source>
        <translation>der erste oder letzte Punkt der Gradiente hat eine Ausrundung, wo nur eine Neigung ist</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlProfile.cpp"/>
        <source>the vertical curve begins before the curve of the point before has ended</source>
        <translation>die Ausrundung beginnt, bevor die des vorigen Punkts zu Ende ist</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlReader.cpp"/>
        <source>the element holds more than %1 bytes of text</source>
        <translation>das Element enthält mehr als %1 Byte Text</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlReader.cpp"/>
        <source>the file has too many elements without content</source>
        <translation>die Datei hat zu viele Elemente ohne Inhalt</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlReaderAttributes.cpp"/>
        <source>not supported: coordinates of a cross section that lies at a skew to its alignment</source>
        <translation>nicht unterstützt: Koordinaten eines Querprofils, das schräg zu seiner Achse liegt</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlReaderAttributes.cpp"/>
        <source>the attribute %1 was expected</source>
        <translation>das Attribut %1 wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlReaderNumbers.cpp"/>
        <source>the attribute %1="%2" does not fit: a number was expected</source>
        <translation>das Attribut %1="%2" passt nicht: eine Zahl wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlReaderNumbers.cpp"/>
        <source>the attribute %1="%2" does not fit: an angle in the file's unit was expected</source>
        <translation>das Attribut %1="%2" passt nicht: ein Winkel in der Einheit der Datei wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlReaderText.cpp"/>
        <source>"%1" does not fit: a number was expected</source>
        <translation>„%1“ passt nicht: eine Zahl wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlReaderText.cpp"/>
        <source>signs are separated from their numbers by blanks, and were taken with them</source>
        <translation>Vorzeichen sind durch Leerzeichen von ihren Zahlen getrennt und wurden zu ihnen genommen</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlReaderText.cpp"/>
        <source>the coordinates "%1" do not fit: northing, easting and perhaps a height were expected</source>
        <translation>die Koordinaten „%1“ passen nicht: Hochwert, Rechtswert und vielleicht eine Höhe wurden erwartet</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlReaderText.cpp"/>
        <source>"%1" does not fit: two numbers were expected</source>
        <translation>„%1“ passt nicht: zwei Zahlen wurden erwartet</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlReaderText.cpp"/>
        <source>the list of numbers ends in the middle of a point, which was left out</source>
        <translation>die Zahlenliste endet mitten in einem Punkt, der weggelassen wurde</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlReferences.cpp"/>
        <source>the coordinates of the point "%1" cannot be read</source>
        <translation>die Koordinaten des Punkts „%1“ sind nicht lesbar</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlReferences.cpp"/>
        <source>the point "%1" is not in the file</source>
        <translation>der Punkt „%1“ ist nicht in der Datei</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlReferences.cpp"/>
        <source>several points have the name "%1" that is referred to: the first one was taken</source>
        <translation>mehrere Punkte haben den Namen „%1“, auf den verwiesen wird: der erste wurde genommen</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlRouteMaker.cpp"/>
        <source>the alignment has no staStart: its stations count from 0</source>
        <translation>die Achse hat kein staStart: ihre Stationen zählen ab 0</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlRouteMaker.cpp"/>
        <source>the element has no length and was left out</source>
        <translation>das Element hat keine Länge und wurde weggelassen</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlRouteMaker.cpp"/>
        <source>the elements turn too many times</source>
        <translation>die Elemente drehen sich zu oft im Kreis</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlRouteMaker.cpp"/>
        <source>the station equation is before the start or not ahead of the equation before it, or has no numbers: staInternal or staBack, and staAhead were expected</source>
        <translation>die Stationsgleichung liegt vor dem Anfang oder nicht hinter der vorigen Gleichung, oder ihr fehlen Zahlen: staInternal oder staBack, und staAhead wurden erwartet</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlRouteMaker.cpp"/>
        <source>the station equation is after the end of the alignment, where no station counts by it</source>
        <translation>die Stationsgleichung liegt hinter dem Ende der Achse, wo keine Station nach ihr zählt</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlRouteMaker.cpp"/>
        <source>the stations of the surface "%1" do not ascend: no heights are taken from it</source>
        <translation>die Stationen der Oberfläche „%1“ steigen nicht an: ihr werden keine Höhen entnommen</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlRows.cpp"/>
        <source>the file is of version %1: versions 1.0 to 2.0 are known</source>
        <translation>die Datei ist von Version %1: bekannt sind die Versionen 1.0 bis 2.0</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlRows.cpp"/>
        <source>elevationUnit is "%1": heights are taken to be in the unit of lengths</source>
        <translation>elevationUnit ist „%1“: Höhen werden in der Längeneinheit angenommen</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlRowsAlignments.cpp"/>
        <source>the alignment has %1 grade lines: the first one, "%2", was taken, as the job names none</source>
        <translation>die Achse hat %1 Gradienten: die erste, „%2“, wurde genommen, da der Auftrag keine nennt</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlRowsAlignments.cpp"/>
        <source>several grade lines of the alignment have the name "%1": the first one was taken</source>
        <translation>mehrere Gradienten der Achse haben den Namen „%1“: die erste wurde genommen</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlRowsAlignments.cpp"/>
        <source>the alignment has %1 surfaces: the first one, "%2", was taken, as the job names none</source>
        <translation>die Achse hat %1 Oberflächen: die erste, „%2“, wurde genommen, da der Auftrag keine nennt</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlRowsAlignments.cpp"/>
        <source>several surfaces of the alignment have the name "%1": the first one was taken</source>
        <translation>mehrere Oberflächen der Achse haben den Namen „%1“: die erste wurde genommen</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlUnits.cpp"/>
        <source>the file has no units: Metric or Imperial in Units was expected</source>
        <translation>die Datei hat keine Einheiten: Metric oder Imperial in Units wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlUnits.cpp"/>
        <source>the outermost element is "%1": LandXML was expected</source>
        <translation>das äußerste Element ist „%1“: LandXML wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlUnits.cpp"/>
        <source>the unit %1="%2" is not known</source>
        <translation>die Einheit %1="%2" ist nicht bekannt</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlWidths.cpp"/>
        <source>the width is left out: staStart, a larger staEnd, startWidth and endWidth were expected</source>
        <translation>die Breite wird ausgelassen: staStart, ein größeres staEnd, startWidth und endWidth wurden erwartet</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlWidths.cpp"/>
        <source>the widths belong to the alignment "%1", which is not in the file</source>
        <translation>die Breiten gehören zur Achse „%1“, die nicht in der Datei ist</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlWidths.cpp"/>
        <source>the alignment "%1" has %2 more grade surface, whose widths are not listed</source>
        <translation>die Achse „%1“ hat %2 weitere Oberfläche, deren Breiten nicht aufgeführt werden</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlWidths.cpp"/>
        <source>the alignment "%1" has %2 more grade surfaces, whose widths are not listed</source>
        <translation>die Achse „%1“ hat %2 weitere Oberflächen, deren Breiten nicht aufgeführt werden</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlWidths.cpp"/>
        <source>the alignment has too many zones: the widths of the last ones are not listed</source>
        <translation>die Achse hat zu viele Zonen: die Breiten der letzten werden nicht aufgeführt</translation>
    </message>
    <message>
        <location filename="../sources/landxml/ParcelRows.cpp"/>
        <source>the border of the parcel does not close: there is a gap of %1 metres</source>
        <translation>die Grenze des Flurstücks schließt sich nicht: es bleibt eine Lücke von %1 Metern</translation>
    </message>
    <message>
        <location filename="../sources/landxml/PointRows.cpp"/>
        <source>several points have the name "%1"</source>
        <translation>mehrere Punkte haben den Namen „%1“</translation>
    </message>
    <message>
        <location filename="../sources/landxml/ProfileRows.cpp"/>
        <source>high point</source>
        <translation>Hochpunkt</translation>
    </message>
    <message>
        <location filename="../sources/landxml/ProfileRows.cpp"/>
        <source>low point</source>
        <translation>Tiefpunkt</translation>
    </message>
    <message>
        <location filename="../sources/landxml/ProjectedRows.cpp"/>
        <source>the file has several alignments: the name of one was expected</source>
        <translation>die Datei hat mehrere Achsen: der Name von einer wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/landxml/ProjectedRows.cpp"/>
        <source>several alignments have the name "%1": the first one was taken</source>
        <translation>mehrere Achsen haben den Namen „%1“: die erste wurde genommen</translation>
    </message>
    <message>
        <location filename="../sources/landxml/ProjectedRows.cpp"/>
        <source>the file has no alignment</source>
        <translation>die Datei hat keine Achse</translation>
    </message>
    <message>
        <location filename="../sources/landxml/ProjectedRows.cpp"/>
        <source>the alignment has no elements</source>
        <translation>die Achse hat keine Elemente</translation>
    </message>
    <message>
        <location filename="../sources/landxml/ProjectedRows.cpp"/>
        <source>too far away</source>
        <translation>zu weit entfernt</translation>
    </message>
    <message>
        <location filename="../sources/landxml/ProjectedRows.cpp"/>
        <source>outside of a corner</source>
        <translation>außen an einem Knick</translation>
    </message>
    <message>
        <location filename="../sources/landxml/ProjectedRows.cpp"/>
        <source>before the start</source>
        <translation>vor dem Anfang</translation>
    </message>
    <message>
        <location filename="../sources/landxml/ProjectedRows.cpp"/>
        <source>after the end</source>
        <translation>hinter dem Ende</translation>
    </message>
    <message>
        <location filename="../sources/landxml/ProjectedRows.cpp"/>
        <source>at a centre</source>
        <translation>an einem Mittelpunkt</translation>
    </message>
    <message>
        <location filename="../sources/landxml/SectionRows.cpp"/>
        <source>the cross section is before the start or after the end of the alignment: its points have no coordinates</source>
        <translation>das Querprofil liegt vor dem Anfang oder hinter dem Ende der Achse: seine Punkte haben keine Koordinaten</translation>
    </message>
    <message>
        <location filename="../sources/landxml/StationPlaces.cpp"/>
        <source>the alignment has no station %1</source>
        <translation>die Achse hat keine Station %1</translation>
    </message>
    <message>
        <location filename="../sources/landxml/StationPlaces.cpp"/>
        <source>the alignment has the station %1 at several places</source>
        <translation>die Achse hat die Station %1 an mehreren Stellen</translation>
    </message>
    <message>
        <location filename="../sources/landxml/StationRowsLoad.cpp"/>
        <source>the alignment has no elements, and therefore no stations</source>
        <translation>die Achse hat keine Elemente und deshalb keine Stationen</translation>
    </message>
    <message>
        <location filename="../sources/landxml/StationRowsLoad.cpp"/>
        <source>the interval gives more than %1 stations</source>
        <translation>der Abstand ergibt mehr als %1 Stationen</translation>
    </message>
    <message>
        <location filename="../sources/landxml/StationRowsLoad.cpp"/>
        <source>the line at the offset %1 does not run forward here: the radius of the element is %2</source>
        <translation>die Linie im Abstand %1 läuft hier nicht vorwärts: der Halbmesser des Elements ist %2</translation>
    </message>
    <message>
        <location filename="../sources/landxml/XmlStream.cpp"/>
        <source>the tag has more than %1 bytes</source>
        <translation>das Element hat in seiner Marke mehr als %1 Byte</translation>
    </message>
    <message>
        <location filename="../sources/landxml/XmlStream.cpp"/>
        <source>the file is not well-formed XML: %1</source>
        <translation>die Datei ist kein wohlgeformtes XML: %1</translation>
    </message>
    <message>
        <location filename="../sources/landxml/XmlStream.cpp"/>
        <source>the encoding of the file is not known: UTF-8, UTF-16, ISO-8859-1, US-ASCII or windows-1252 was expected</source>
        <translation>die Zeichencodierung der Datei ist nicht bekannt: UTF-8, UTF-16, ISO-8859-1, US-ASCII oder windows-1252 wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/landxml/XmlStream.cpp"/>
        <source>the elements are nested more than %1 deep</source>
        <translation>die Elemente sind tiefer als %1 ineinander geschachtelt</translation>
    </message>
    <message>
        <location filename="../sources/landxml/XmlStreamCallbacks.h"/>
        <source>the document type is in another file, "%1", which is not read: a file without an external document type was expected</source>
        <translation>der Dokumenttyp steht in einer anderen Datei, „%1“, die nicht gelesen wird: erwartet wurde eine Datei ohne externen Dokumenttyp</translation>
    </message>
    <message>
        <location filename="../sources/landxml/XmlStreamCallbacks.h"/>
        <source>the file declares the entity "%1": a file without entities was expected</source>
        <translation>die Datei erklärt die Entität „%1“: eine Datei ohne Entitäten wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/landxml/XmlStreamCallbacks.h"/>
        <source>the entity "%1" is not known</source>
        <translation>die Entität „%1“ ist nicht bekannt</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresColumns.cpp"/>
        <source>the columns "%1" and "%2" both have geometries: a query with one of them was expected</source>
        <translation>die Spalten "%1" und "%2" haben beide Geometrien: eine Abfrage mit einer davon wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresColumns.cpp"/>
        <source>%1 bytes</source>
        <translation>%1 Bytes</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresConnection.cpp"/>
        <source>the library libpq cannot be loaded: the package libpq5 was expected</source>
        <translation>die Bibliothek libpq kann nicht geladen werden: das Paket libpq5 wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresConnection.cpp"/>
        <source>this is not a connection: %1. Words such as service=survey, host=..., port=..., dbname=... and user=... were expected</source>
        <translation>das ist keine Verbindung: %1. Erwartet wurden Angaben wie service=survey, host=..., port=..., dbname=... und user=...</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresConnection.cpp"/>
        <source>a connection cannot contain "%1": remove it, and put the password into your password file (~/.pgpass) or into PGPASSWORD</source>
        <translation>eine Verbindung kann "%1" nicht enthalten: entfernen Sie es, und schreiben Sie das Passwort in Ihre Passwortdatei (~/.pgpass) oder in PGPASSWORD</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresConnection.cpp"/>
        <source>the server does not answer</source>
        <translation>der Server antwortet nicht</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresConnection.cpp"/>
        <source>the server asks for a password: it was expected in the user's own password file (~/.pgpass) or in PGPASSWORD</source>
        <translation>der Server verlangt ein Passwort: es wurde in der eigenen Passwortdatei des Benutzers (~/.pgpass) oder in PGPASSWORD erwartet</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresConnection.cpp"/>
        <source>the server cannot be connected to: %1</source>
        <translation>mit dem Server kann keine Verbindung hergestellt werden: %1</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresConnection.cpp"/>
        <source>the connection to the server is lost: %1</source>
        <translation>die Verbindung zum Server ist verloren: %1</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresConnection.cpp"/>
        <source>the database does not answer the query: %1</source>
        <translation>die Datenbank beantwortet die Abfrage nicht: %1</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresPreview.cpp"/>
        <source>(bytes)</source>
        <translation>(Bytes)</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresPreview.cpp"/>
        <source>there is %1: a point was expected</source>
        <translation>es steht dort %1: ein Punkt wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresPreview.cpp"/>
        <source>row %1: </source>
        <translation>Zeile %1: </translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresResult.cpp"/>
        <source>(character %1 of the query)</source>
        <translation>(Zeichen %1 der Abfrage)</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresRows.cpp"/>
        <source>a point was expected instead of %1</source>
        <translation>ein Punkt wurde erwartet, nicht %1</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresRowsColumns.cpp"/>
        <source>the query has %1 parameters: values of %2 are given</source>
        <translation>die Abfrage hat %1 Parameter: Werte von %2 sind angegeben</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresRowsColumns.cpp"/>
        <source>the query is not a single SELECT, which was expected</source>
        <translation>die Abfrage ist kein einzelnes SELECT, wie es erwartet wurde</translation>
    </message>
    <message>
        <location filename="../sources/sqlite/SqliteColumns.cpp"/>
        <source>the database has no tables: the table "%1" was expected</source>
        <translation>die Datenbank hat keine Tabellen: die Tabelle "%1" wurde erwartet</translation>
    </message>
    <message>
        <location filename="../sources/sqlite/SqliteColumns.cpp"/>
        <source>the database has no table "%1"</source>
        <translation>die Datenbank hat keine Tabelle "%1"</translation>
    </message>
    <message>
        <location filename="../sources/sqlite/SqliteFile.cpp"/>
        <source>a database file was expected, not a folder or a device</source>
        <translation>eine Datenbankdatei wurde erwartet, kein Ordner und kein Gerät</translation>
    </message>
    <message>
        <location filename="../sources/sqlite/SqliteFile.cpp"/>
        <source>the query has parameters: values were expected in their places</source>
        <translation>die Abfrage hat Parameter: an ihrer Stelle wurden Werte erwartet</translation>
    </message>
    <message>
        <location filename="../sources/sqlite/SqliteFile.cpp"/>
        <source>the database is locked: another program writes to it</source>
        <translation>die Datenbank ist gesperrt: ein anderes Programm schreibt hinein</translation>
    </message>
    <message>
        <location filename="../sources/sqlite/SqliteFile.cpp"/>
        <source>the file is not a SQLite database, or it is encrypted</source>
        <translation>die Datei ist keine SQLite-Datenbank, oder sie ist verschlüsselt</translation>
    </message>
    <message>
        <location filename="../sources/sqlite/SqliteFile.cpp"/>
        <source>the database is broken: %1</source>
        <translation>die Datenbank ist beschädigt: %1</translation>
    </message>
    <message>
        <location filename="../sources/sqlite/SqliteFile.cpp"/>
        <source>a program that wrote to the database did not finish its work: open the database with that program first</source>
        <translation>ein Programm, das in die Datenbank schrieb, hat seine Arbeit nicht beendet: öffnen Sie die Datenbank zuerst mit diesem Programm</translation>
    </message>
    <message>
        <location filename="../sources/sqlite/SqliteFile.cpp"/>
        <source>the database cannot be opened: %1</source>
        <translation>die Datenbank kann nicht geöffnet werden: %1</translation>
    </message>
    <message>
        <location filename="../sources/sqlite/SqliteFile.cpp"/>
        <source>the database cannot be read: %1</source>
        <translation>die Datenbank kann nicht gelesen werden: %1</translation>
    </message>
    <message>
        <location filename="../sources/sqlite/SqliteFile.cpp"/>
        <source>reading was stopped</source>
        <translation>das Lesen wurde abgebrochen</translation>
    </message>
    <message>
        <location filename="../sources/sqlite/SqliteFile.cpp"/>
        <source>the database was changed while it was read, by a program that does not use SQLite</source>
        <translation>die Datenbank wurde beim Lesen verändert, von einem Programm, das nicht SQLite verwendet</translation>
    </message>
    <message>
        <location filename="../exports/CsvResult.cpp"/>
        <source>%1 texts begin with = or @: a spreadsheet program that opens the file takes them for formulas</source>
        <translation>%1 Texte beginnen mit = oder @: ein Tabellenprogramm, das die Datei öffnet, hält sie für Formeln</translation>
    </message>
    <message>
        <location filename="../exports/XlsxBook.cpp"/>
        <source>the workbook could not be put together: %1</source>
        <translation>die Arbeitsmappe konnte nicht zusammengestellt werden: %1</translation>
    </message>
    <message>
        <location filename="../exports/XlsxResult.cpp"/>
        <source>%1 texts are longer than a cell of a workbook holds, and are cut</source>
        <translation>%1 Texte sind länger als eine Zelle einer Arbeitsmappe fasst und wurden gekürzt</translation>
    </message>
    <message>
        <location filename="../exports/XlsxResult.cpp"/>
        <source>%1 columns are more than a sheet of a workbook holds, and are left out</source>
        <translation>%1 Spalten sind mehr, als ein Blatt einer Arbeitsmappe fasst, und fehlen</translation>
    </message>
    <message>
        <location filename="../exports/XlsxResult.cpp"/>
        <source>%1 totals are values: a formula would show other digits, or does not reach their rows</source>
        <translation>%1 Summen sind Werte: eine Formel würde andere Ziffern zeigen oder erreicht ihre Zeilen nicht</translation>
    </message>
    <message>
        <location filename="../exports/XlsxResult.cpp"/>
        <source>Lengths in %1, areas in %2, angles in %3</source>
        <translation>Längen in %1, Flächen in %2, Winkel in %3</translation>
    </message>
    <message>
        <location filename="../jobs/ColumnChoices.cpp"/>
        <source>the name of a column, or its number from 1, was expected</source>
        <translation>der Name einer Spalte oder ihre Nummer ab 1 wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/ColumnChoices.cpp"/>
        <source>a text without a zero character was expected</source>
        <translation>ein Text ohne das Zeichen 0 wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/ColumnNotes.cpp"/>
        <source>the column "%1" is not a variable of the dictionary "%2"</source>
        <translation>die Spalte „%1“ ist keine Variable des Wörterbuchs „%2“</translation>
    </message>
    <message>
        <location filename="../jobs/ColumnNotes.cpp"/>
        <source>%1 more column is not a variable of the dictionary "%2"</source>
        <translation>%1 weitere Spalte ist keine Variable des Wörterbuchs "%2"</translation>
    </message>
    <message>
        <location filename="../jobs/ColumnNotes.cpp"/>
        <source>%1 more columns are not variables of the dictionary "%2"</source>
        <translation>%1 weitere Spalten sind keine Variablen des Wörterbuchs "%2"</translation>
    </message>
    <message>
        <location filename="../jobs/ConditionBinding.cpp"/>
        <source>the variable "%1" does not hold numbers: a numeric variable was expected</source>
        <translation>die Variable „%1“ enthält keine Zahlen: eine numerische Variable wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/ConditionBinding.cpp"/>
        <source>a tolerance of 0 or more was expected</source>
        <translation>eine Toleranz ab 0 wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/ConditionBinding.cpp"/>
        <source>a number was expected: nothing is above or below NAN</source>
        <translation>eine Zahl wurde erwartet: nichts liegt über oder unter NAN</translation>
    </message>
    <message>
        <location filename="../jobs/ConditionBinding.cpp"/>
        <source>"%1" and "%2" cannot be compared: they have different units</source>
        <translation>„%1“ und „%2“ können nicht verglichen werden: sie haben verschiedene Einheiten</translation>
    </message>
    <message>
        <location filename="../jobs/CsvData.cpp"/>
        <source>a row was expected after the header row: a block shows the first one</source>
        <translation>nach der Kopfzeile wurde eine Zeile erwartet: ein Block zeigt die erste</translation>
    </message>
    <message>
        <location filename="../jobs/CsvData.cpp"/>
        <source>a row was expected: a block shows the first one</source>
        <translation>eine Zeile wurde erwartet: ein Block zeigt die erste</translation>
    </message>
    <message>
        <location filename="../jobs/CsvOptions.cpp"/>
        <source>the character is that of "%1": another one was expected</source>
        <translation>das Zeichen ist das von "%1": ein anderes wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/CsvOptions.cpp"/>
        <source>the names of the columns in their order were expected</source>
        <translation>die Namen der Spalten in ihrer Reihenfolge wurden erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/CsvOptions.cpp"/>
        <source>one character was expected, other than a digit, a letter, a sign, a quote, a line end or the decimal sign</source>
        <translation>erwartet wurde ein Zeichen, aber keine Ziffer, kein Buchstabe, kein Vorzeichen, kein Anführungszeichen, kein Zeilenende und nicht das Dezimalzeichen</translation>
    </message>
    <message>
        <location filename="../jobs/CsvOptions.cpp"/>
        <source>one ASCII character was expected, other than a letter, a digit, a sign, a quote or a line end, or one of the words %1</source>
        <translation>erwartet wurde ein ASCII-Zeichen, aber kein Buchstabe, keine Ziffer, kein Vorzeichen, kein Anführungszeichen und kein Zeilenende, oder eines der Wörter %1</translation>
    </message>
    <message>
        <location filename="../jobs/CsvOptions.cpp"/>
        <source>an order of columns such as PNEZD was expected: each of the letters P, N, E, Z and D at most once, and - for a column that is skipped</source>
        <translation>eine Reihenfolge von Spalten wie PNEZD wurde erwartet: die Buchstaben P, N, E, Z und D je höchstens einmal, und - für eine Spalte, die übergangen wird</translation>
    </message>
    <message>
        <location filename="../jobs/CsvOptions.cpp"/>
        <source>the columns have names already: either an order or a list of columns was expected</source>
        <translation>die Spalten haben schon Namen: entweder eine Reihenfolge oder eine Liste von Spalten wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/CsvOptions.cpp"/>
        <source>one ASCII character was expected, other than a letter, a digit, a sign, a quote or a line end</source>
        <translation>erwartet wurde ein ASCII-Zeichen, aber kein Buchstabe, keine Ziffer, kein Vorzeichen, kein Anführungszeichen und kein Zeilenende</translation>
    </message>
    <message>
        <location filename="../jobs/DataFiles.cpp"/>
        <source>the data file "%1" cannot be read: %2</source>
        <translation>die Datendatei „%1“ kann nicht gelesen werden: %2</translation>
    </message>
    <message>
        <location filename="../jobs/DataKind.cpp"/>
        <source>Reading %1</source>
        <translation>%1 wird gelesen</translation>
    </message>
    <message>
        <location filename="../jobs/FormulaBinding.cpp"/>
        <source>the variable "%1" does not fit the result: a variable of the same measure was expected, such as a length for lengths</source>
        <translation>die Variable „%1“ passt nicht zum Ergebnis: eine Variable der gleichen Größenart wurde erwartet, etwa eine Länge für Längen</translation>
    </message>
    <message>
        <location filename="../jobs/FormulaBinding.cpp"/>
        <source>a variable cannot be computed from itself: another variable was expected</source>
        <translation>eine Variable kann nicht aus sich selbst berechnet werden: eine andere Variable wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/FormulaBinding.cpp"/>
        <source>the variables cannot be combined: variables of the same measure were expected, such as lengths, or for a product two lengths or a number and another variable</source>
        <translation>die Variablen lassen sich nicht verknüpfen: erwartet wurden Variablen der gleichen Größenart, etwa Längen, oder für ein Produkt zwei Längen oder eine Zahl und eine andere Variable</translation>
    </message>
    <message>
        <location filename="../jobs/GroupBinding.cpp"/>
        <source>"rounding" was expected only with totals</source>
        <translation>"rounding" wurde nur mit Summen erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/GroupBinding.cpp"/>
        <source>groups by %1 need rows that are sorted by them first</source>
        <translation>Gruppen nach %1 brauchen Zeilen, die zuerst danach sortiert sind</translation>
    </message>
    <message>
        <location filename="../jobs/GroupBinding.cpp"/>
        <source>the key "sort" was expected in the step</source>
        <translation>der Schlüssel "sort" wurde im Schritt erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/GroupBinding.cpp"/>
        <source>they are sorted by %1</source>
        <translation>sie sind nach %1 sortiert</translation>
    </message>
    <message>
        <location filename="../jobs/GroupBinding.cpp"/>
        <source>values of the variable "%1" cannot be added up: a number, a length, an area or an angle was expected, or "count"</source>
        <translation>Werte der Variablen „%1“ können nicht addiert werden: eine Zahl, eine Länge, eine Fläche oder ein Winkel wurde erwartet, oder "count"</translation>
    </message>
    <message>
        <location filename="../jobs/GroupBinding.cpp"/>
        <source>the table "%1" has no column "%2" for a total</source>
        <translation>die Tabelle „%1“ hat keine Spalte „%2“ für eine Summe</translation>
    </message>
    <message>
        <location filename="../jobs/GroupBinding.cpp"/>
        <source>the column "%1" has a total already: another line was expected for a second one</source>
        <translation>die Spalte „%1“ hat schon eine Summe: für eine zweite wurde eine weitere Zeile erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JobData.cpp"/>
        <source>the data "%1" has no row: a block shows the first one</source>
        <translation>der Datenbestand „%1“ hat keine Zeile: ein Block zeigt die erste</translation>
    </message>
    <message>
        <location filename="../jobs/JobDataReader.cpp"/>
        <source>one of the keys %1 was expected</source>
        <translation>einer der Schlüssel %1 wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JobDataReader.cpp"/>
        <source>only one of the keys %1 was expected</source>
        <translation>nur einer der Schlüssel %1 wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JobDataReader.cpp"/>
        <source>standard input is the job itself: a file was expected</source>
        <translation>die Standardeingabe ist der Auftrag selbst: eine Datei wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JobFileName.cpp"/>
        <source>a file name without a character 0 was expected</source>
        <translation>ein Dateiname ohne das Zeichen 0 wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JobFiles.cpp"/>
        <source>"%1" is the job itself: another file was expected</source>
        <translation>„%1“ ist der Auftrag selbst: eine andere Datei wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JobFiles.cpp"/>
        <source>"%1" is the template of the job: another file was expected</source>
        <translation>„%1“ ist die Vorlage des Auftrags: eine andere Datei wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JobFiles.cpp"/>
        <source>"%1" is data of the job: another file was expected</source>
        <translation>„%1“ enthält Daten des Auftrags: eine andere Datei wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JobFiles.cpp"/>
        <source>"%1" is the file of the output "%2" already: another file was expected</source>
        <translation>„%1“ ist schon die Datei der Ausgabe „%2“: eine andere Datei wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JobList.cpp"/>
        <source>standard input cannot be read: %1</source>
        <translation>die Standardeingabe kann nicht gelesen werden: %1</translation>
    </message>
    <message>
        <location filename="../jobs/JobList.cpp"/>
        <source>the list of jobs cannot be read: %1</source>
        <translation>die Liste der Aufträge kann nicht gelesen werden: %1</translation>
    </message>
    <message>
        <location filename="../jobs/JobList.cpp"/>
        <source>the list of jobs contains both line breaks and NUL characters: either one name per line or a NUL character after each name was expected</source>
        <translation>die Auftragsliste enthält sowohl Zeilenumbrüche als auch NUL-Zeichen: erwartet wurde entweder ein Name je Zeile oder ein NUL-Zeichen nach jedem Namen</translation>
    </message>
    <message>
        <location filename="../jobs/JobOutputs.cpp"/>
        <source>"%1" was not written: it would have more than %2</source>
        <translation>„%1“ wurde nicht geschrieben: die Datei hätte mehr als %2</translation>
    </message>
    <message>
        <location filename="../jobs/JobOutputs.cpp"/>
        <source>"%1" could not be written: %2</source>
        <translation>„%1“ konnte nicht geschrieben werden: %2</translation>
    </message>
    <message>
        <location filename="../jobs/JobOutputs.cpp"/>
        <source>the report could not be written to standard output: %1</source>
        <translation>der Bericht konnte nicht in die Standardausgabe geschrieben werden: %1</translation>
    </message>
    <message>
        <location filename="../jobs/JobOutputs.cpp"/>
        <source>the report begins as rich text, but %1 (line %2, column %3)</source>
        <translation>der Bericht beginnt als Rich-Text, aber %1 (Zeile %2, Spalte %3)</translation>
    </message>
    <message>
        <location filename="../jobs/JobPdfReader.cpp"/>
        <source>a language such as de or en-GB was expected</source>
        <translation>eine Sprache wie de oder en-GB wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JobReader.cpp"/>
        <source>a list of four margins (left, top, right, bottom) was expected</source>
        <translation>eine Liste von vier Seitenrändern (links, oben, rechts, unten) wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JobReader.cpp"/>
        <source>a character code or a text of one character was expected</source>
        <translation>ein Zeichencode oder ein Text aus einem Zeichen wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JobReader.cpp"/>
        <source>the key "file" was expected</source>
        <translation>der Schlüssel "file" wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JobReader.cpp"/>
        <source>the ending of "%1" does not say the kind: the key "as" with one of %2 was expected</source>
        <translation>die Endung von „%1“ nennt keine Art: der Schlüssel "as" mit einem dieser Werte wurde erwartet: %2</translation>
    </message>
    <message>
        <location filename="../jobs/JobReader.cpp"/>
        <source>a date and time such as 2024-03-05T14:07:00 was expected</source>
        <translation>Datum und Uhrzeit in der Form 2024-03-05T14:07:00 wurden erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JobReader.cpp"/>
        <source>the key "%1" with a text was expected</source>
        <translation>der Schlüssel "%1" mit einem Text wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JobReader.cpp"/>
        <source>a text that begins with "%1" was expected</source>
        <translation>ein Text, der mit „%1“ beginnt, wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JobRunner.cpp"/>
        <source>the margins leave no room on the page: smaller margins or a smaller font were expected</source>
        <translation>die Ränder lassen auf der Seite keinen Platz: kleinere Ränder oder eine kleinere Schrift wurden erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JobRunner.cpp"/>
        <source>there is no template file "%1"</source>
        <translation>es gibt keine Vorlagendatei „%1“</translation>
    </message>
    <message>
        <location filename="../jobs/JobSaving.cpp"/>
        <source>the file could not be written: %1</source>
        <translation>die Datei konnte nicht geschrieben werden: %1</translation>
    </message>
    <message>
        <location filename="../jobs/JobSettings.cpp"/>
        <source>a list of three texts was expected</source>
        <translation>eine Liste von drei Texten wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JobSettings.cpp"/>
        <source>one character with a code up to 255, or an empty text, was expected</source>
        <translation>ein Zeichen mit einem Code bis 255 oder ein leerer Text wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JobStepNotes.cpp"/>
        <source>the data "%1" does not say the unit of its numbers: %2 was taken</source>
        <translation>die Daten „%1“ sagen die Einheit ihrer Zahlen nicht: %2 wurde angenommen</translation>
    </message>
    <message>
        <location filename="../jobs/JobStepNotes.cpp"/>
        <source>the field "%1" of the %2 "%3" is not a variable of the dictionary "%4"</source>
        <translation>das Feld „%1“ (%2 „%3“) ist keine Variable des Wörterbuchs „%4“</translation>
    </message>
    <message>
        <location filename="../jobs/JobStepNotes.cpp"/>
        <source>no column fills the field "%1" of the %2 "%3"</source>
        <translation>keine Spalte füllt das Feld „%1“ (%2 „%3“)</translation>
    </message>
    <message>
        <location filename="../jobs/JobStepNotes.cpp"/>
        <source>"%1" has the same ID and shows there</source>
        <translation>"%1" hat dieselbe ID und wird dort gezeigt</translation>
    </message>
    <message>
        <location filename="../jobs/JobStepNotes.cpp"/>
        <source>the sort key "%1" of the table "%2" is not a variable of the dictionary "%3"</source>
        <translation>der Sortierschlüssel "%1" der Tabelle "%2" ist keine Variable des Wörterbuchs "%3"</translation>
    </message>
    <message>
        <location filename="../jobs/JobSteps.cpp"/>
        <source>block</source>
        <translation>Block</translation>
    </message>
    <message>
        <location filename="../jobs/JobSteps.cpp"/>
        <source>the template has no %1 named "%2": %3</source>
        <translation>die Vorlage hat nichts namens "%2" (%1): %3</translation>
    </message>
    <message>
        <location filename="../jobs/JobSteps.cpp"/>
        <source>the %1 "%2" cannot be written: the template has no dictionary named "%3"</source>
        <translation>%1 „%2“ kann nicht geschrieben werden: die Vorlage hat kein Wörterbuch namens „%3“</translation>
    </message>
    <message>
        <location filename="../jobs/JobSteps.cpp"/>
        <source>the %1 "%2" cannot be written: the format of its field "%3" is beyond %4 characters</source>
        <translation>%1 „%2“ kann nicht geschrieben werden: das Format des Felds „%3“ geht über %4 Zeichen hinaus</translation>
    </message>
    <message>
        <location filename="../jobs/JobStepsReader.cpp"/>
        <source>true was expected</source>
        <translation>true wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JobStepsReader.cpp"/>
        <source>a step was expected: one of heading, line, lineFeed, newPage, block, table, clear</source>
        <translation>ein Schritt wurde erwartet: einer von heading, line, lineFeed, newPage, block, table, clear</translation>
    </message>
    <message>
        <location filename="../jobs/JobStepsReader.cpp"/>
        <source>a "%1" needs a template: the key "template" was expected in the job</source>
        <translation>"%1" benötigt eine Vorlage: im Auftrag wurde der Schlüssel "template" erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JobStepsReader.cpp"/>
        <source>the key "data" with the name of a data set was expected</source>
        <translation>der Schlüssel "data" mit dem Namen eines Datenbestands wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JobStepsReader.cpp"/>
        <source>there is no data set named "%1" in the job: %2</source>
        <translation>im Auftrag gibt es keinen Datensatz namens "%1": %2</translation>
    </message>
    <message>
        <location filename="../jobs/JobStepsReader.cpp"/>
        <source>the key "report" with a list of steps was expected</source>
        <translation>der Schlüssel "report" mit einer Liste von Schritten wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JobTableStep.cpp"/>
        <source>table</source>
        <translation>Tabelle</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 value is wider than the field "%2" of the %3 "%4", in row %5, line %6 of the report</source>
        <translation>%1 Wert ist breiter als das Feld "%2" (%3 "%4"), in Datenzeile %5, Zeile %6 des Berichts</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 values are wider than the field "%2" of the %3 "%4", the first one in row %5, line %6 of the report</source>
        <translation>%1 Werte sind breiter als das Feld "%2" (%3 "%4"), der erste in Datenzeile %5, Zeile %6 des Berichts</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 value is wider than the field "%2" of the %3 "%4" and shows as #, in row %5, line %6 of the report</source>
        <translation>%1 Wert ist breiter als das Feld "%2" (%3 "%4") und erscheint als #, in Datenzeile %5, Zeile %6 des Berichts</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 values are wider than the field "%2" of the %3 "%4" and show as #, the first one in row %5, line %6 of the report</source>
        <translation>%1 Werte sind breiter als das Feld "%2" (%3 "%4") und erscheinen als #, der erste in Datenzeile %5, Zeile %6 des Berichts</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 total is wider than the field "%2" of the %3 "%4", under row %5, line %6 of the report</source>
        <translation>%1 Summe ist breiter als das Feld "%2" (%3 "%4"), unter Datenzeile %5, Zeile %6 des Berichts</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 totals are wider than the field "%2" of the %3 "%4", the first one under row %5, line %6 of the report</source>
        <translation>%1 Summen sind breiter als das Feld "%2" (%3 "%4"), die erste unter Datenzeile %5, Zeile %6 des Berichts</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 total is wider than the field "%2" of the %3 "%4" and shows as #, under row %5, line %6 of the report</source>
        <translation>%1 Summe ist breiter als das Feld "%2" (%3 "%4") und erscheint als #, unter Datenzeile %5, Zeile %6 des Berichts</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 totals are wider than the field "%2" of the %3 "%4" and show as #, the first one under row %5, line %6 of the report</source>
        <translation>%1 Summen sind breiter als das Feld "%2" (%3 "%4") und erscheinen als #, die erste unter Datenzeile %5, Zeile %6 des Berichts</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 value of the field "%2" of the %3 "%4" is infinite or not a number, in row %5, line %6 of the report</source>
        <translation>%1 Wert des Felds "%2" (%3 "%4") ist unendlich oder keine Zahl, in Datenzeile %5, Zeile %6 des Berichts</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 values of the field "%2" of the %3 "%4" are infinite or not a number, the first one in row %5, line %6 of the report</source>
        <translation>%1 Werte des Felds "%2" (%3 "%4") sind unendlich oder keine Zahl, der erste in Datenzeile %5, Zeile %6 des Berichts</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 value of the field "%2" of the %3 "%4" is missing and shows as 0, in row %5, line %6 of the report</source>
        <translation>%1 Wert des Felds "%2" (%3 "%4") fehlt und erscheint als 0, in Datenzeile %5, Zeile %6 des Berichts</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 values of the field "%2" of the %3 "%4" are missing and show as 0, the first one in row %5, line %6 of the report</source>
        <translation>%1 Werte des Felds "%2" (%3 "%4") fehlen und erscheinen als 0, der erste in Datenzeile %5, Zeile %6 des Berichts</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 value of the field "%2" of the %3 "%4" is missing and shows as blanks, in row %5, line %6 of the report</source>
        <translation>%1 Wert des Felds "%2" (%3 "%4") fehlt und erscheint als Leerzeichen, in Datenzeile %5, Zeile %6 des Berichts</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 values of the field "%2" of the %3 "%4" are missing and show as blanks, the first one in row %5, line %6 of the report</source>
        <translation>%1 Werte des Felds "%2" (%3 "%4") fehlen und erscheinen als Leerzeichen, der erste in Datenzeile %5, Zeile %6 des Berichts</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 value of the variable "%2" is missing and in no total of the table "%3", in row %4</source>
        <translation>%1 Wert der Variablen „%2“ fehlt und ist in keiner Summe der Tabelle „%3“, in Zeile %4</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 values of the variable "%2" are missing and in no total of the table "%3", the first one in row %4</source>
        <translation>%1 Werte der Variablen „%2“ fehlen und sind in keiner Summe der Tabelle „%3“, der erste in Zeile %4</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 value of the variable "%2" is infinite or not a number and in no total of the table "%3", in row %4</source>
        <translation>%1 Wert der Variablen „%2“ ist unendlich oder keine Zahl und in keiner Summe der Tabelle „%3“, in Zeile %4</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 values of the variable "%2" are infinite or not a number and in no total of the table "%3", the first one in row %4</source>
        <translation>%1 Werte der Variablen „%2“ sind unendlich oder keine Zahl und in keiner Summe der Tabelle „%3“, der erste in Zeile %4</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 value of the variable "%2" is missing and in no running sum of the table "%3", in row %4</source>
        <translation>%1 Wert der Variablen "%2" fehlt und ist in keiner laufenden Summe der Tabelle "%3", in Datenzeile %4</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 values of the variable "%2" are missing and in no running sum of the table "%3", the first one in row %4</source>
        <translation>%1 Werte der Variablen "%2" fehlen und sind in keiner laufenden Summe der Tabelle "%3", der erste in Datenzeile %4</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 value of the variable "%2" is infinite or not a number and in no running sum of the table "%3", in row %4</source>
        <translation>%1 Wert der Variablen "%2" ist unendlich oder keine Zahl und in keiner laufenden Summe der Tabelle "%3", in Datenzeile %4</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 values of the variable "%2" are infinite or not a number and in no running sum of the table "%3", the first one in row %4</source>
        <translation>%1 Werte der Variablen "%2" sind unendlich oder keine Zahlen und in keiner laufenden Summe der Tabelle "%3", der erste in Datenzeile %4</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>the field "%1" of the %2 "%3" has no value: its line is left out</source>
        <translation>das Feld "%1" (%2 "%3") hat keinen Wert: seine Zeile fehlt im Bericht</translation>
    </message>
    <message>
        <location filename="../jobs/JsonNode.cpp"/>
        <source>a text was expected</source>
        <translation>ein Text wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JsonNode.cpp"/>
        <source>true or false was expected</source>
        <translation>true oder false wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JsonNode.cpp"/>
        <source>a whole number from %1 to %2 was expected</source>
        <translation>eine ganze Zahl von %1 bis %2 wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JsonNode.cpp"/>
        <source>a list was expected</source>
        <translation>eine Liste wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JsonNode.cpp"/>
        <source>unknown key "%1": %2 expected</source>
        <translation>unbekannter Schlüssel "%1": erwartet: %2</translation>
    </message>
    <message>
        <location filename="../jobs/JsonObjectList.cpp"/>
        <source>a row has values of several variables that have one ID: that of "%1" is shown</source>
        <translation>eine Zeile hat Werte mehrerer Variablen, die eine ID haben: der von "%1" erscheint</translation>
    </message>
    <message>
        <location filename="../jobs/JsonSource.cpp"/>
        <source>the key "%1" occurs twice in "%2"</source>
        <translation>der Schlüssel „%1“ kommt in „%2“ zweimal vor</translation>
    </message>
    <message>
        <location filename="../jobs/JsonSource.cpp"/>
        <source>the file cannot be read: %1</source>
        <translation>die Datei kann nicht gelesen werden: %1</translation>
    </message>
    <message>
        <location filename="../jobs/JsonSource.cpp"/>
        <source>the file is larger than %1 MB: a job was expected</source>
        <translation>die Datei ist größer als %1 MB: ein Auftrag wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JsonSource.cpp"/>
        <source>a JSON object was expected: %1</source>
        <translation>ein JSON-Objekt wurde erwartet: %1</translation>
    </message>
    <message>
        <location filename="../jobs/JsonSource.cpp"/>
        <source>a JSON object was expected</source>
        <translation>ein JSON-Objekt wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JsonSource.cpp"/>
        <source>the key "%1" is in line %2 already: each key was expected once</source>
        <translation>der Schlüssel „%1“ steht schon in Zeile %2: jeder Schlüssel wurde nur einmal erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JsonSource.cpp"/>
        <source>the key "%1" has %2 steps: at most %3 were expected</source>
        <translation>der Schlüssel „%1“ hat %2 Stufen: höchstens %3 wurden erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/JsonSource.cpp"/>
        <source>the key "%1" cannot be set in the job: names of keys, and numbers of existing elements of a list, were expected between the dots</source>
        <translation>der Schlüssel "%1" kann im Auftrag nicht gesetzt werden: zwischen den Punkten wurden Schlüsselnamen und Nummern vorhandener Listenelemente erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/LandXmlData.cpp"/>
        <source>a LandXML file states its own units: only "length" was expected, the unit of lengths in the job</source>
        <translation>eine LandXML-Datei nennt ihre Einheiten selbst: nur „length“ wurde erwartet, die Einheit der Längen im Auftrag</translation>
    </message>
    <message>
        <location filename="../jobs/LandXmlQueryReader.cpp"/>
        <source>the list "%1" does not use the key "%2": remove the key, or choose another list</source>
        <translation>die Liste „%1“ verwendet den Schlüssel „%2“ nicht: den Schlüssel entfernen oder eine andere Liste wählen</translation>
    </message>
    <message>
        <location filename="../jobs/LandXmlQueryReader.cpp"/>
        <source>a number from %1 to %2 was expected</source>
        <translation>eine Zahl von %1 bis %2 wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/LandXmlQueryReader.cpp"/>
        <source>a station such as 12345.678 or "12+345.678" was expected</source>
        <translation>eine Station wie 12345.678 oder „12+345.678“ wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/LandXmlQueryReader.cpp"/>
        <source>the key "%1" was expected</source>
        <translation>der Schlüssel „%1“ wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/LandXmlQueryReader.cpp"/>
        <source>the key "%1" with one of %2 was expected</source>
        <translation>der Schlüssel „%1“ mit einem von %2 wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/PostgresData.cpp"/>
        <source>a text, a number, true, false or null was expected</source>
        <translation>ein Text, eine Zahl, true, false oder null wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/ResultOptionsReader.cpp"/>
        <source>a text that is not empty was expected</source>
        <translation>erwartet wurde ein Text, der nicht leer ist</translation>
    </message>
    <message>
        <location filename="../jobs/ResultOptionsReader.cpp"/>
        <source>the tag of a language such as de or pt-BR was expected</source>
        <translation>erwartet wurde das Kürzel einer Sprache wie de oder pt-BR</translation>
    </message>
    <message>
        <location filename="../jobs/ResultOptionsReader.cpp"/>
        <source>one ASCII character was expected, other than a letter, a digit, a sign, a point, a quote, a blank or a line end</source>
        <translation>erwartet wurde ein ASCII-Zeichen, aber kein Buchstabe, keine Ziffer, kein Vorzeichen, kein Punkt, kein Anführungszeichen, kein Leerzeichen und kein Zeilenende</translation>
    </message>
    <message>
        <location filename="../jobs/ResultOptionsReader.cpp"/>
        <source>"table" or "block" was expected, not both</source>
        <translation>erwartet wurde "table" oder "block", nicht beides</translation>
    </message>
    <message>
        <location filename="../jobs/ResultOptionsReader.cpp"/>
        <source>the name of a file was expected</source>
        <translation>erwartet wurde der Name einer Datei</translation>
    </message>
    <message>
        <location filename="../jobs/ResultOutputs.cpp"/>
        <source>"%1" has the rows of a table or a block, and no such step of the job writes one</source>
        <translation>"%1" hat die Zeilen einer Tabelle oder eines Blocks, und kein solcher Schritt des Auftrags schreibt welche</translation>
    </message>
    <message>
        <location filename="../jobs/ResultOutputs.cpp"/>
        <source>"%1" has the rows of one step, and %2 steps may be meant: keys "table", "block" or "data" that leave one of them were expected</source>
        <translation>"%1" hat die Zeilen eines Schritts, und %2 Schritte können gemeint sein: erwartet wurden Schlüssel "table", "block" oder "data", die einen davon übrig lassen</translation>
    </message>
    <message>
        <location filename="../jobs/SavedText.cpp"/>
        <source>a saved report was expected; this is a PDF</source>
        <translation>ein gespeicherter Bericht wurde erwartet; dies ist eine PDF-Datei</translation>
    </message>
    <message>
        <location filename="../jobs/SavedText.cpp"/>
        <source>a report file was expected; this is not UTF-8</source>
        <translation>eine Berichtsdatei wurde erwartet; dies ist kein UTF-8-Text</translation>
    </message>
    <message>
        <location filename="../jobs/ShapeBinding.cpp"/>
        <source>the template sorts the table "%1": "sort" is for tables that it does not sort</source>
        <translation>die Vorlage sortiert die Tabelle „%1“: "sort" ist für Tabellen, die sie nicht sortiert</translation>
    </message>
    <message>
        <location filename="../jobs/ShapeBinding.cpp"/>
        <source>rows are sorted before "%1" is computed: a variable of the data was expected</source>
        <translation>Zeilen werden sortiert, bevor „%1“ berechnet wird: eine Variable der Daten wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/ShapeBinding.cpp"/>
        <source>"per": "group" needs groups: the key "groups" was expected in the step</source>
        <translation>"per": "group" braucht Gruppen: im Schritt wurde der Schlüssel "groups" erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/ShapeBinding.cpp"/>
        <source>another variable with numbers, lengths, areas or angles was expected</source>
        <translation>eine andere Variable mit Zahlen, Längen, Flächen oder Winkeln wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/ShapeBinding.cpp"/>
        <source>a flag needs a text, or a mark: the variable "%1" is neither</source>
        <translation>eine Markierung braucht einen Text oder ein Zeichen: die Variable „%1“ ist keines von beiden</translation>
    </message>
    <message>
        <location filename="../jobs/ShapeBinding.cpp"/>
        <source>the key "text" with the text of the flag was expected</source>
        <translation>der Schlüssel "text" mit dem Text der Markierung wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/ShapeBinding.cpp"/>
        <source>the variable "%1" has a mark and no text</source>
        <translation>die Variable „%1“ hat ein Zeichen und keinen Text</translation>
    </message>
    <message>
        <location filename="../jobs/SqliteData.cpp"/>
        <source>there is no database "%1"</source>
        <translation>es gibt keine Datenbank „%1“</translation>
    </message>
    <message>
        <location filename="../jobs/SqliteData.cpp"/>
        <source>either "table" or "query" was expected</source>
        <translation>entweder "table" oder "query" wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/StandardInput.cpp"/>
        <source>a window has no standard input: a file was expected</source>
        <translation>ein Fenster hat keine Standardeingabe: eine Datei wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/TableShapeReader.cpp"/>
        <source>the name of a variable was expected</source>
        <translation>der Name einer Variablen wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/TableShapeReader.cpp"/>
        <source>one of %1 was expected, not two</source>
        <translation>einer dieser Schlüssel wurde erwartet, nicht zwei: %1</translation>
    </message>
    <message>
        <location filename="../jobs/TableShapeReader.cpp"/>
        <source>"beside" was expected only with above, below or outside</source>
        <translation>"beside" wurde nur mit above, below oder outside erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/TableShapeReader.cpp"/>
        <source>two variables were expected</source>
        <translation>zwei Variablen wurden erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/TableShapeReader.cpp"/>
        <source>two variables or more were expected</source>
        <translation>zwei oder mehr Variablen wurden erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/TableShapeReader.cpp"/>
        <source>the northing and easting, or the northing, easting and elevation, of two points were expected</source>
        <translation>Hochwert und Rechtswert, oder Hochwert, Rechtswert und Höhe, zweier Punkte wurden erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/TableShapeReader.cpp"/>
        <source>the northing and easting of two points were expected</source>
        <translation>Hochwert und Rechtswert zweier Punkte wurden erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/TableShapeReader.cpp"/>
        <source>"%1" needs a heading: the key "heading" was expected</source>
        <translation>"%1" braucht eine Überschrift: der Schlüssel "heading" wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/TemplateSource.cpp"/>
        <source>the template file cannot be read: there is no such file</source>
        <translation>die Vorlagendatei kann nicht gelesen werden: es gibt sie nicht</translation>
    </message>
    <message>
        <location filename="../jobs/TemplateSource.cpp"/>
        <source>a template file was expected; this is a folder, a pipe or a device</source>
        <translation>eine Vorlagendatei wurde erwartet; dies ist ein Ordner, eine Pipe oder ein Gerät</translation>
    </message>
    <message>
        <location filename="../jobs/TemplateSource.cpp"/>
        <source>the template file has %1 MB: at most %2 MB were expected</source>
        <translation>die Vorlagendatei hat %1 MB: höchstens %2 MB wurden erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/TemplateSource.cpp"/>
        <source>the template file cannot be read</source>
        <translation>die Vorlagendatei kann nicht gelesen werden</translation>
    </message>
    <message>
        <location filename="../jobs/TemplateSource.cpp"/>
        <source>the template file is empty: a &lt;ReportTemplate&gt; element was expected</source>
        <translation>die Vorlagendatei ist leer: ein Element &lt;ReportTemplate&gt; wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/TemplateSource.cpp"/>
        <source>the template "%1" cannot be loaded: %2</source>
        <translation>die Vorlage „%1“ kann nicht geladen werden: %2</translation>
    </message>
    <message>
        <location filename="../jobs/TemplateSource.cpp"/>
        <source>the file holds no template: a &lt;ReportTemplate&gt; element was expected</source>
        <translation>die Datei enthält keine Vorlage: ein Element &lt;ReportTemplate&gt; wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/TemplateSource.cpp"/>
        <source>there is no template named "%1": %2</source>
        <translation>es gibt keine Vorlage namens "%1": %2</translation>
    </message>
    <message>
        <location filename="../jobs/ValuesData.cpp"/>
        <source>an object or a list of objects was expected</source>
        <translation>ein Objekt oder eine Liste von Objekten wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/VariableLookup.cpp"/>
        <source>the dictionary "%1" has no variable "%2": %3</source>
        <translation>das Wörterbuch „%1“ hat keine Variable „%2“: %3</translation>
    </message>
    <message>
        <location filename="../jobs/VariableLookup.cpp"/>
        <source>the step sets "%1" only after this: a variable of the data, or one that is set before, was expected</source>
        <translation>der Schritt setzt "%1" erst danach: eine Variable der Daten oder eine zuvor gesetzte wurde erwartet</translation>
    </message>
    <message>
        <location filename="../jobs/VariableLookup.cpp"/>
        <source>%1 was expected, as the variable "%2" has it</source>
        <translation>%1 wurde erwartet, wie die Variable „%2“ es hat</translation>
    </message>
    <message>
        <location filename="../sheets/PlaceFields.cpp"/>
        <source>Previous page</source>
        <translation>Vorige Seite</translation>
    </message>
    <message>
        <location filename="../sheets/PlaceFields.cpp"/>
        <source>Next page</source>
        <translation>Nächste Seite</translation>
    </message>
    <message>
        <location filename="../sheets/PlaceFields.cpp"/>
        <source>Page shown</source>
        <translation>Angezeigte Seite</translation>
    </message>
    <message>
        <location filename="../sheets/PlaceFields.cpp"/>
        <source>Smaller</source>
        <translation>Kleiner</translation>
    </message>
    <message>
        <location filename="../sheets/PlaceFields.cpp"/>
        <source>Larger</source>
        <translation>Größer</translation>
    </message>
    <message>
        <location filename="../sheets/PlaceFields.cpp"/>
        <source>Fit to Width</source>
        <translation>Auf Breite einpassen</translation>
    </message>
    <message>
        <location filename="../sheets/PlaceFields.cpp"/>
        <source>Fit to Page</source>
        <translation>Auf Seite einpassen</translation>
    </message>
    <message>
        <location filename="../sheets/ReportSheets.cpp"/>
        <source>There is no page to show.</source>
        <translation>Es gibt keine Seite, die gezeigt werden kann.</translation>
    </message>
    <message>
        <location filename="../sheets/ReportSheets.cpp"/>
        <source>This report is empty.</source>
        <translation>Dieser Bericht ist leer.</translation>
    </message>
    <message>
        <location filename="../sheets/ReportSheets.cpp"/>
        <source>Finding the sheets: %1 %</source>
        <translation>Die Blätter werden ermittelt: %1 %</translation>
    </message>
    <message>
        <location filename="../sheets/SheetReportView.cpp"/>
        <source>Sheet</source>
        <translation>Blatt</translation>
    </message>
    <message>
        <location filename="../sheets/SheetThumbnails.cpp"/>
        <source>Small pictures of the sheets</source>
        <translation>Kleine Bilder der Blätter</translation>
    </message>
    <message>
        <location filename="../sheets/SheetThumbnails.cpp"/>
        <source>Sheet %1 of %2</source>
        <translation>Blatt %1 von %2</translation>
    </message>
    <message>
        <location filename="../sheets/SheetView.cpp"/>
        <source>Sheets</source>
        <translation>Blätter</translation>
    </message>
    <message>
        <location filename="../preview/TemplateEdits.cpp"/>
        <source>A field belongs to a table or a block: put the cursor into one.</source>
        <translation>Ein Feld gehört in eine Tabelle oder einen Block: setzen Sie die Schreibmarke dorthin.</translation>
    </message>
    <message>
        <location filename="../preview/TemplateEdits.cpp"/>
        <source>The table or block needs a name first.</source>
        <translation>Die Tabelle oder der Block braucht zuerst einen Namen.</translation>
    </message>
    <message>
        <location filename="../preview/TemplateEdits.cpp"/>
        <source>The template cannot be read: correct what the list of remarks says first.</source>
        <translation>Die Vorlage kann nicht gelesen werden: beheben Sie zuerst, was in der Liste der Anmerkungen steht.</translation>
    </message>
    <message>
        <location filename="../preview/TemplatePreview.cpp"/>
        <source>a job with this template was expected</source>
        <translation>ein Auftrag mit dieser Vorlage wurde erwartet</translation>
    </message>
    <message>
        <location filename="../preview/TemplatePreview.cpp"/>
        <source>a job with this template was expected: it has "%1"</source>
        <translation>ein Auftrag mit dieser Vorlage wurde erwartet: er hat „%1“</translation>
    </message>
    <message>
        <location filename="../preview/TemplatePreview.cpp"/>
        <source>the template file cannot be written for its preview: %1</source>
        <translation>die Vorlagendatei kann für ihre Vorschau nicht geschrieben werden: %1</translation>
    </message>
    <message>
        <location filename="../preview/TemplateVariables.cpp"/>
        <source>A name without blanks at its ends was expected.</source>
        <translation>Ein Name ohne Leerzeichen an seinen Enden wurde erwartet.</translation>
    </message>
    <message>
        <location filename="../preview/TemplateVariables.cpp"/>
        <source>A name without &lt; and &gt; was expected.</source>
        <translation>Ein Name ohne &lt; und &gt; wurde erwartet.</translation>
    </message>
    <message>
        <location filename="../preview/TemplateVariables.cpp"/>
        <source>"%1" cannot be the name of a variable: it has a meaning of its own.</source>
        <translation>„%1“ ist keine Variable: der Name hat eine eigene Bedeutung.</translation>
    </message>
    <message>
        <location filename="../preview/TemplateVariables.cpp"/>
        <source>There is already a variable "%1".</source>
        <translation>Es gibt schon eine Variable „%1“.</translation>
    </message>
    <message>
        <location filename="../preview/TemplateVariables.cpp"/>
        <source>Put the cursor on a variable first: in a field, a sort key or a dictionary.</source>
        <translation>Setzen Sie die Schreibmarke zuerst auf eine Variable: in einem Feld, einem Sortierschlüssel oder einem Wörterbuch.</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CheckCommand.cpp"/>
        <source>standard input is one job: - was expected once</source>
        <translation>die Standardeingabe ist ein einziger Auftrag: - wurde einmal erwartet</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CheckCommand.cpp"/>
        <source>kareport: stopped; nothing more was checked</source>
        <translation>kareport: abgebrochen; mehr wurde nicht geprüft</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CheckOutput.cpp"/>
        <source>%1 too wide</source>
        <translation>%1 zu breit</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CheckOutput.cpp"/>
        <source>label too wide</source>
        <translation>Beschriftung zu breit</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CheckOutput.cpp"/>
        <source>fits</source>
        <translation>passt</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CheckOutput.cpp"/>
        <source>%1: table "%2", %3 rows of the data "%4"</source>
        <translation>%1: Tabelle "%2", %3 Reihen der Daten "%4"</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CheckOutput.cpp"/>
        <source>%1: block "%2", %3 row of the data "%4"</source>
        <translation>%1: Block "%2", %3 Reihe der Daten "%4"</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CheckOutput.cpp"/>
        <source>field</source>
        <translation>Feld</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CheckOutput.cpp"/>
        <source>label</source>
        <comment>Text over a column</comment>
        <translation>Beschriftung</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CheckOutput.cpp"/>
        <source>width</source>
        <translation>Breite</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CheckOutput.cpp"/>
        <source>widest</source>
        <translation>breitester</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CheckOutput.cpp"/>
        <source>row</source>
        <translation>Reihe</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CheckOutput.cpp"/>
        <source>value</source>
        <translation>Wert</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandLineErrors.cpp"/>
        <source>%1 has no option "%2"</source>
        <translation>%1 hat keine Option "%2"</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandLineErrors.cpp"/>
        <source>"%1" was expected after "%2"</source>
        <translation>"%1" wurde nach "%2" erwartet</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandLineErrors.cpp"/>
        <source>%1: "%2" was not expected</source>
        <translation>%1: "%2" wurde nicht erwartet</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandLineErrors.cpp"/>
        <source>%1: %2 was expected</source>
        <translation>%1: %2 wurde erwartet</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandLineErrors.cpp"/>
        <source>%1 was given more than once</source>
        <translation>%1 wurde mehr als einmal angegeben</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandLineErrors.cpp"/>
        <source>%1 "%2": a whole number was expected</source>
        <translation>%1 "%2": eine ganze Zahl wurde erwartet</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandLineErrors.cpp"/>
        <source>"%1" is not a command: %2</source>
        <translation>"%1" ist kein Befehl: %2</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandLineErrors.cpp"/>
        <source>a command was expected: %1</source>
        <translation>ein Befehl wurde erwartet: %1</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandLineJob.cpp"/>
        <source>kareport: stopped; nothing was written</source>
        <translation>kareport: abgebrochen; es wurde nichts geschrieben</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandLineJobChecks.cpp"/>
        <source>kareport: the report will have at least %1</source>
        <translation>kareport: der Bericht wird mindestens %1 haben</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandLineJobChecks.cpp"/>
        <source>kareport: nothing was written: the report has at least %1, more than the limit of %2</source>
        <translation>kareport: nichts wurde geschrieben: der Bericht hat mindestens %1, mehr als die Grenze von %2</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandOutputs.cpp"/>
        <source>kareport: stopped before "%1" was written</source>
        <translation>kareport: abgebrochen, bevor „%1“ geschrieben wurde</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandOutputs.cpp"/>
        <source>kareport: the report is empty: "%1" was not written</source>
        <translation>kareport: der Bericht ist leer: „%1“ wurde nicht geschrieben</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandOutputs.cpp"/>
        <source>kareport: the report is empty, and a PDF has at least one page: "%1" was not written</source>
        <translation>kareport: Der Bericht ist leer, und eine PDF-Datei hat mindestens eine Seite: „%1“ wurde nicht geschrieben</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandOutputs.cpp"/>
        <source>Writing %1</source>
        <translation>%1 wird geschrieben</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandOutputs.cpp"/>
        <source>kareport: warning: "%1": %2</source>
        <translation>kareport: Warnung: „%1“: %2</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandSetup.cpp"/>
        <source>the ending of "%1" does not say the kind: --as with one of %2 was expected</source>
        <translation>die Endung von „%1“ nennt keine Art: --as mit einem dieser Werte wurde erwartet: %2</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandSetup.cpp"/>
        <source>--set "%1": KEY=VALUE was expected</source>
        <translation>--set "%1": KEY=VALUE wurde erwartet</translation>
    </message>
    <message>
        <location filename="../apps/kareport/ConvertCommand.cpp"/>
        <source>the output "%1" is the report being read: another file was expected</source>
        <translation>Die Ausgabe „%1“ ist der Bericht, der gelesen wird: eine andere wurde erwartet</translation>
    </message>
    <message>
        <location filename="../apps/kareport/ConvertCommand.cpp"/>
        <source>--set "%1": a key of the page was expected, such as page.linesPerPage=60</source>
        <translation>--set "%1": ein Schlüssel der Seite wurde erwartet, etwa page.linesPerPage=60</translation>
    </message>
    <message>
        <location filename="../apps/kareport/ConvertCommand.cpp"/>
        <source>"%1" cannot be made from a saved report, which holds only text: use "render" with the job of the report</source>
        <translation>"%1" kann nicht aus einem gespeicherten Bericht gemacht werden, der nur Text enthält: verwenden Sie "render" mit dem Auftrag des Berichts</translation>
    </message>
    <message>
        <location filename="../apps/kareport/ConvertCommand.cpp"/>
        <source>--set: %1</source>
        <translation>--set: %1</translation>
    </message>
    <message>
        <location filename="../apps/kareport/DataOptions.cpp"/>
        <source>--units "%1": QUANTITY=UNIT was expected, as in length=usft</source>
        <translation>--units "%1": GRÖSSE=EINHEIT wurde erwartet, wie in length=usft</translation>
    </message>
    <message>
        <location filename="../apps/kareport/DataOptions.cpp"/>
        <source>%1: "%2" was given twice: each was expected once</source>
        <translation>%1: "%2" wurde zweimal angegeben: jedes wurde einmal erwartet</translation>
    </message>
    <message>
        <location filename="../apps/kareport/DataOptions.cpp"/>
        <source>--columns "%1": the names of the columns in their order, or VARIABLE=COLUMN for each, were expected</source>
        <translation>--columns "%1": die Namen der Spalten in ihrer Reihenfolge oder VARIABLE=SPALTE für jede wurden erwartet</translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobWatch.cpp"/>
        <source>standard output</source>
        <translation>Standardausgabe</translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobWatch.cpp"/>
        <source>1 note</source>
        <translation>1 Hinweis</translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobWatch.cpp"/>
        <source>%1 notes</source>
        <translation>%1 Hinweise</translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobWatch.cpp"/>
        <source>kareport: the system has no more descriptors</source>
        <translation>kareport: das System hat keine Deskriptoren mehr</translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobWatch.cpp"/>
        <source>standard input can be read only once: a file was expected for each data set</source>
        <translation>die Standardeingabe kann nur einmal gelesen werden: für jeden Datensatz wurde eine Datei erwartet</translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobWatch.cpp"/>
        <source>kareport: %1: made in %2 s: %3</source>
        <translation>kareport: %1: erstellt in %2 s: %3</translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobWatch.cpp"/>
        <source>kareport: %1: not all outputs were written</source>
        <translation>kareport: %1: nicht alle Ausgaben wurden geschrieben</translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobWatch.cpp"/>
        <source>kareport: %1: failed; earlier outputs are unchanged</source>
        <translation>kareport: %1: fehlgeschlagen; frühere Ausgaben sind unverändert</translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobWatch.cpp"/>
        <source>kareport: watching %1; press Ctrl+C to stop</source>
        <translation>kareport: beobachtet werden %1; Strg+C beendet</translation>
    </message>
    <message>
        <location filename="../apps/kareport/NewCommand.cpp"/>
        <source>"%1" already exists; nothing was written</source>
        <translation>"%1" gibt es schon; nichts wurde geschrieben</translation>
    </message>
    <message>
        <location filename="../apps/kareport/NewCommand.cpp"/>
        <source>"%1" could not be created: %2</source>
        <translation>"%1" konnte nicht angelegt werden: %2</translation>
    </message>
    <message>
        <location filename="../apps/kareport/NewCommand.cpp"/>
        <source>Created %1 (template), %2 (data), %3 (job)</source>
        <translation>Angelegt: %1 (Vorlage), %2 (Daten), %3 (Auftrag)</translation>
    </message>
    <message>
        <location filename="../apps/kareport/NewCommand.cpp"/>
        <source>Next: %1</source>
        <translation>Als Nächstes: %1</translation>
    </message>
    <message>
        <location filename="../apps/kareport/NotesFile.cpp"/>
        <source>--notes "%1": the name of a file was expected</source>
        <translation>--notes "%1": der Name einer Datei wurde erwartet</translation>
    </message>
    <message>
        <location filename="../apps/kareport/NotesFile.cpp"/>
        <source>--notes "%1" is one file for several jobs: a name with {} was expected, which is replaced by the name of the job file</source>
        <translation>--notes "%1" ist eine Datei für mehrere Aufträge: ein Name mit {} wurde erwartet; {} wird durch den Namen der Auftragsdatei ersetzt</translation>
    </message>
    <message>
        <location filename="../apps/kareport/NotesFile.cpp"/>
        <source>kareport: "%1" could not be written: %2</source>
        <translation>kareport: „%1“ konnte nicht geschrieben werden: %2</translation>
    </message>
    <message>
        <location filename="../apps/kareport/OutputFolders.cpp"/>
        <source>there is no folder "%1"; --parents creates it</source>
        <translation>den Ordner "%1" gibt es nicht; --parents legt ihn an</translation>
    </message>
    <message>
        <location filename="../apps/kareport/OutputFolders.cpp"/>
        <source>the folder "%1" could not be created: %2</source>
        <translation>der Ordner "%1" konnte nicht angelegt werden: %2</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderBatch.cpp"/>
        <source>"%1" is the file "%2" of this batch: another file was expected</source>
        <translation>„%1“ ist die Datei „%2“ dieses Stapels: eine andere Datei wurde erwartet</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderBatch.cpp"/>
        <source>"%1" is written by the job "%2" already: another file was expected</source>
        <translation>„%1“ wird schon vom Auftrag „%2“ geschrieben: eine andere Datei wurde erwartet</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderBatch.cpp"/>
        <source>kareport: there was no job to run</source>
        <translation>kareport: es gab keinen Auftrag auszuführen</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderBatch.cpp"/>
        <source>%1 of %2 jobs made</source>
        <translation>%1 von %2 Aufträgen ausgeführt</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderBatch.cpp"/>
        <source>%1 up to date</source>
        <translation>%1 auf dem neuesten Stand</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderBatch.cpp"/>
        <source>%1 failed</source>
        <translation>%1 fehlgeschlagen</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderBatch.cpp"/>
        <source>%1 not made when stopped</source>
        <translation>%1 beim Anhalten nicht ausgeführt</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderCommand.cpp"/>
        <source>--limit "%1": a number of bytes was expected, such as 500000, 800K, 20M or 1G</source>
        <translation>--limit „%1“: eine Zahl von Bytes wurde erwartet, wie 500000, 800K, 20M oder 1G</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderCommand.cpp"/>
        <source>either job files or --template, --name, --table or --block, and --data were expected</source>
        <translation>entweder Auftragsdateien oder --template, --name, --table oder --block und --data wurden erwartet</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderCommand.cpp"/>
        <source>--template, --name, --data and one of --table and --block were expected</source>
        <translation>--template, --name, --data und entweder --table oder --block wurden erwartet</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderCommand.cpp"/>
        <source>standard input is the list of jobs: no job is read from it</source>
        <translation>die Standardeingabe ist die Liste der Aufträge: kein Auftrag wird von dort gelesen</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderCommand.cpp"/>
        <source>--slice takes a part of several job files: job files were expected</source>
        <translation>--slice nimmt einen Teil mehrerer Auftragsdateien: diese wurden erwartet</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderCommand.cpp"/>
        <source>--slice "%1": a number, a slash and the count of slices were expected, such as 3/8</source>
        <translation>--slice "%1": eine Zahl, ein Schrägstrich und die Anzahl der Teile wurden erwartet, wie in 3/8</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderCommand.cpp"/>
        <source>-o "%1" is one file for several jobs: a name with {} was expected, which is replaced by the name of the job file</source>
        <translation>-o "%1" ist eine Datei für mehrere Aufträge: ein Name mit {} wurde erwartet; {} wird durch den Namen der Auftragsdatei ersetzt</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderCommand.cpp"/>
        <source>kareport: all is up to date; nothing was written</source>
        <translation>kareport: alles ist auf dem neuesten Stand; nichts wurde geschrieben</translation>
    </message>
    <message>
        <location filename="../apps/kareport/ViewCommand.cpp"/>
        <source>there is no file "%1"</source>
        <translation>es gibt keine Datei „%1“</translation>
    </message>
    <message>
        <location filename="../apps/kareport/ViewCommand.cpp"/>
        <source>A PDF cannot be opened as a report</source>
        <translation>Eine PDF-Datei kann nicht als Bericht geöffnet werden</translation>
    </message>
    <message>
        <location filename="../apps/kareport/ViewCommand.cpp"/>
        <source>the program kareport-desk is not installed</source>
        <translation>das Programm kareport-desk ist nicht installiert</translation>
    </message>
    <message>
        <location filename="../apps/kareport/ViewCommand.cpp"/>
        <source>there is no display to show a window on: DISPLAY or WAYLAND_DISPLAY was expected</source>
        <translation>es gibt keine Anzeige für ein Fenster: DISPLAY oder WAYLAND_DISPLAY wurde erwartet</translation>
    </message>
    <message>
        <location filename="../apps/kareport/ViewCommand.cpp"/>
        <source>"%1" could not be started</source>
        <translation>„%1“ konnte nicht gestartet werden</translation>
    </message>
    <message>
        <location filename="../apps/kareport/WatchCommand.cpp"/>
        <source>standard input can be read only once: a job file was expected</source>
        <translation>die Standardeingabe kann nur einmal gelesen werden: eine Auftragsdatei wurde erwartet</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/ChangedFile.cpp"/>
        <source>"%1" was changed by another program, and it has unsaved changes here. Load it again and lose the changes made here?</source>
        <translation>„%1“ wurde von einem anderen Programm geändert, und hier gibt es Änderungen, die nicht gespeichert sind. Neu laden und die hier gemachten Änderungen verwerfen?</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/ChangedFile.cpp"/>
        <source>"%1" was changed by another program. Load it again?</source>
        <translation>„%1“ wurde von einem anderen Programm geändert. Neu laden?</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrame.cpp"/>
        <source>Open</source>
        <translation>Öffnen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrame.cpp"/>
        <source>Reports, jobs and templates (*.rep *.rtf *.json *.xml)</source>
        <translation>Berichte, Aufträge und Vorlagen (*.rep *.rtf *.json *.xml)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrame.cpp"/>
        <source>All files (*)</source>
        <translation>Alle Dateien (*)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameFiles.cpp"/>
        <source>"%1" could not be opened.</source>
        <translation>„%1“ konnte nicht geöffnet werden.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameFiles.cpp"/>
        <source>"%1" could not be opened: %2</source>
        <translation>„%1“ konnte nicht geöffnet werden: %2</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameFiles.cpp"/>
        <source>"%1" was opened, but not all of it is shown:

%2</source>
        <translation>„%1“ wurde geöffnet, aber nicht alles daraus wird angezeigt:

%2</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameFiles.cpp"/>
        <source>"%1" was saved, but it differs from the report:

%2</source>
        <translation>„%1“ wurde gespeichert, weicht aber vom Bericht ab:

%2</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameFiles.cpp"/>
        <source>Exported to "%1".</source>
        <translation>Exportiert nach „%1“.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Zoom &amp;In	Ctrl++</source>
        <translation>&amp;Vergrößern	Ctrl++</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Zoom &amp;Out	Ctrl+-</source>
        <translation>Ver&amp;kleinern	Ctrl+-</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Usual Size	Ctrl+0</source>
        <translation>&amp;Normale Größe	Ctrl+0</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>All &amp;Commands...	Ctrl+Shift+P</source>
        <translation>Alle &amp;Befehle...	Ctrl+Shift+P</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Keep Report Windows</source>
        <translation>Berichtsfenster &amp;behalten</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Ne&amp;xt Report	Ctrl+Tab</source>
        <translation>Nächster &amp;Bericht	Ctrl+Tab</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Pre&amp;vious Report	Ctrl+Shift+Tab</source>
        <translation>&amp;Voriger Bericht	Ctrl+Shift+Tab</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>New from &amp;Template...	Ctrl+T</source>
        <translation>Neu aus &amp;Vorlage...	Ctrl+T</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Expo&amp;rt</source>
        <translation>Expo&amp;rtieren</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;PDF...</source>
        <translation>&amp;PDF...</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Rich Text...</source>
        <translation>&amp;Rich-Text...</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Plain &amp;Text...</source>
        <translation>Reiner &amp;Text...</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Values...	Ctrl+E</source>
        <translation>&amp;Werte...	Ctrl+E</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Redo	Ctrl+Shift+Z</source>
        <translation>&amp;Wiederholen	Ctrl+Shift+Z</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Select &amp;All	Ctrl+A</source>
        <translation>&amp;Alles auswählen	Ctrl+A</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Find...	Ctrl+F</source>
        <translation>&amp;Suchen...	Ctrl+F</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Find &amp;Next	F3</source>
        <translation>&amp;Nächste Fundstelle	F3</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Find Pre&amp;vious	Shift+F3</source>
        <translation>&amp;Vorherige Fundstelle	Shift+F3</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Go to Page...	Ctrl+G</source>
        <translation>&amp;Gehe zu Seite...	Ctrl+G</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Pr&amp;eferences...	Ctrl+,</source>
        <translation>E&amp;instellungen...	Ctrl+,</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Toolbar</source>
        <translation>Symbolleiste</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameRecovery.cpp"/>
        <source>These reports could not be opened again:

%1</source>
        <translation>Diese Berichte konnten nicht wieder geöffnet werden:

%1</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameRecovery.cpp"/>
        <source>Their unsaved changes are kept and will be offered again at the next start.</source>
        <translation>Ihre nicht gespeicherten Änderungen sind aufbewahrt und werden beim nächsten Start wieder angeboten.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameRecovery.cpp"/>
        <source>KaReport did not end properly, and what it had open cannot be read. These folders were not changed:

%1</source>
        <translation>KaReport wurde nicht ordentlich beendet, und was offen war, ist nicht lesbar. Diese Ordner bleiben, wie sie sind:

%1</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameRecovery.cpp"/>
        <source> (with unsaved changes)</source>
        <translation> (mit nicht gespeicherten Änderungen)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameRecovery.cpp"/>
        <source>KaReport did not end properly the last time. These reports were open:

%1

Open them again?</source>
        <translation>KaReport wurde beim letzten Mal nicht ordnungsgemäß beendet. Diese Berichte waren geöffnet:

%1

Sollen sie wieder geöffnet werden?</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskSheets.cpp"/>
        <source>Print Se&amp;lection...</source>
        <translation>Aus&amp;wahl drucken...</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskSheets.cpp"/>
        <source>S&amp;heets	F8</source>
        <translation>&amp;Blätter	F8</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskSheets.cpp"/>
        <source>Sheets &amp;Beside the Text	Shift+F8</source>
        <translation>Blätter neben &amp;dem Text	Shift+F8</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskSheets.cpp"/>
        <source>Small &amp;Pictures of the Sheets</source>
        <translation>Kleine B&amp;ilder der Blätter</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskSheets.cpp"/>
        <source>Page &amp;Lines in the Text</source>
        <translation>Seiten&amp;linien im Text</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskSheets.cpp"/>
        <source>Fit to &amp;Width</source>
        <translation>Auf B&amp;reite einpassen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskSheets.cpp"/>
        <source>Fit to Pa&amp;ge</source>
        <translation>Auf S&amp;eite einpassen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorHold.cpp"/>
        <source>"%1" could not be started. Choose another program under Preferences.</source>
        <translation>„%1“ konnte nicht gestartet werden. In den Einstellungen ein anderes Programm wählen.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>&amp;Show reports in this program:</source>
        <translation>&amp;Berichte in diesem Programm anzeigen:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>Bro&amp;wse...</source>
        <translation>D&amp;urchsuchen...</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>&amp;Keep a report open while the program is</source>
        <translation>Bericht &amp;offen halten, solange das Programm geöffnet ist</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>Program that shows reports</source>
        <translation>Programm, das Berichte anzeigt</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>Choose a program, or clear the box above.</source>
        <translation>Bitte ein Programm wählen oder das Häkchen oben entfernen.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>There is no program "%1". Choose one from the list, or with Browse.</source>
        <translation>Es gibt kein Programm „%1“. Bitte eines aus der Liste oder mit „Durchsuchen“ wählen.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>Choose a program</source>
        <translation>Programm wählen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>Reports are shown in their own window.</source>
        <translation>Berichte werden im eigenen Fenster angezeigt.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>It gets reports as rich text.</source>
        <translation>Es erhält Berichte als Rich-Text.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>It gets reports as plain text.</source>
        <translation>Es erhält Berichte als reinen Text.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/JobExport.cpp"/>
        <source>"%1" already exists and is not a page of "%2": choose another name</source>
        <translation>"%1" ist schon vorhanden und keine Seite von "%2": wählen Sie einen anderen Namen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/JobExport.cpp"/>
        <source>Workbook</source>
        <translation>Arbeitsmappe</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/JobExport.cpp"/>
        <source>Web Page</source>
        <translation>Webseite</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/JobExport.cpp"/>
        <source>Rows as CSV</source>
        <translation>Zeilen als CSV</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/JobExport.cpp"/>
        <source>Rows as JSON Lines</source>
        <translation>Zeilen als JSON Lines</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/JobExport.cpp"/>
        <source>"%1": one of the endings .xlsx, .html, .csv and .jsonl was expected</source>
        <translation>"%1": erwartet wurde eine der Endungen .xlsx, .html, .csv und .jsonl</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/JobLauncher.cpp"/>
        <source>the report could not be made</source>
        <translation>der Bericht konnte nicht erstellt werden</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/KeptReport.cpp"/>
        <source>its saved copy no longer exists</source>
        <translation>Was davon aufbewahrt wurde, ist nicht mehr vorhanden</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Points</source>
        <translation>Punkte</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Points of surfaces</source>
        <translation>Punkte von Oberflächen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Parcels</source>
        <translation>Flurstücke</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Sides of parcels</source>
        <translation>Seiten von Flurstücken</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Alignments</source>
        <translation>Achsen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Elements of alignments</source>
        <translation>Elemente von Achsen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Stations</source>
        <translation>Stationen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Profile</source>
        <translation>Längsschnitt</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Cross sections</source>
        <translation>Querprofile</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Points beside an alignment</source>
        <translation>Punkte neben einer Achse</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>&amp;List:</source>
        <translation>&amp;Liste:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>List</source>
        <translation>Liste</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>&amp;Group:</source>
        <translation>&amp;Gruppe:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Group</source>
        <translation>Gruppe</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>&amp;Parcel:</source>
        <translation>&amp;Flurstück:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Parcel</source>
        <translation>Flurstück</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>&amp;Alignment:</source>
        <translation>&amp;Achse:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Alignment</source>
        <translation>Achse</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Grade li&amp;ne:</source>
        <translation>G&amp;radiente:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Grade line</source>
        <translation>Gradiente</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>S&amp;urface:</source>
        <translation>&amp;Oberfläche:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Surface</source>
        <translation>Oberfläche</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>&amp;Interval:</source>
        <translation>&amp;Intervall:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Interval</source>
        <translation>Intervall</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>The distance of regular stations, in the unit of the file</source>
        <translation>Der Abstand regelmäßiger Stationen, in der Einheit der Datei</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>(the first)</source>
        <translation>(die erste)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>(all)</source>
        <translation>(alle)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>Of the printer, else of the country (%1)</source>
        <translation>Vom Drucker, sonst vom Land (%1)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>&amp;Keep the report window when a job is done</source>
        <translation>Das Berichtsfenster nach dem Lauf eines Auftrags &amp;behalten</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>Open at the &amp;start what was open at the end</source>
        <translation>Beim &amp;Start öffnen, was am Ende offen war</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>Preferences</source>
        <translation>Einstellungen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>&amp;Units and Formats</source>
        <translation>&amp;Einheiten und Formate</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>&amp;Page</source>
        <translation>&amp;Seite</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>&amp;Editor</source>
        <translation>Ed&amp;itor</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>Pro&amp;gram</source>
        <translation>Pro&amp;gramm</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source> pt</source>
        <translation> pt</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>Font size</source>
        <translation>Schriftgröße</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>Millimetres</source>
        <translation>Millimeter</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>Inches</source>
        <translation>Zoll</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>Unit of margins</source>
        <translation>Einheit der Ränder</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>&amp;Font size of new reports:</source>
        <translation>Schri&amp;ftgröße neuer Berichte:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>Unit of &amp;margins:</source>
        <translation>Ei&amp;nheit der Ränder:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>As the system</source>
        <translation>Wie im System</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>Language</source>
        <translation>Sprache</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>&amp;Language (from the next start):</source>
        <translation>S&amp;prache (ab dem nächsten Start):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/ReportExport.cpp"/>
        <source>PDF</source>
        <translation>PDF</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/ReportExport.cpp"/>
        <source>Rich Text</source>
        <translation>Rich-Text</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/ReportExport.cpp"/>
        <source>Plain Text</source>
        <translation>Reiner Text</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/ReportExport.cpp"/>
        <source>it is the report's own file, which is written by Save</source>
        <translation>es ist die eigene Datei des Berichts, die mit „Speichern“ geschrieben wird</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/SaveAs.cpp"/>
        <source>PDF with outline and page numbers (%1)</source>
        <translation>PDF mit Gliederung und Seitenzahlen (%1)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/SaveAs.cpp"/>
        <source>There is no folder "%1". Choose another one, or create it first.</source>
        <translation>Der Ordner „%1“ ist nicht vorhanden. Wählen Sie einen anderen, oder legen Sie ihn zuerst an.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/SaveAs.cpp"/>
        <source>"%1" is open as another report. Close that one first, or choose another name.</source>
        <translation>„%1“ ist als anderer Bericht geöffnet. Schließen Sie ihn zuerst, oder wählen Sie einen anderen Namen.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/SaveAs.cpp"/>
        <source>"%1" already exists. Replace it?</source>
        <translation>Die Datei „%1“ gibt es schon. Ersetzen?</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/SaveAs.cpp"/>
        <source>Save As</source>
        <translation>Speichern unter</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/SavedReports.cpp"/>
        <source>it is too large</source>
        <translation>Die Datei ist zu groß</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/SavedReports.cpp"/>
        <source>There is no file "%1".</source>
        <translation>Es gibt keine Datei „%1“.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/SavedReports.cpp"/>
        <source>"%1" is a folder, a pipe or a device. Only files can be opened here.</source>
        <translation>„%1“ ist ein Ordner, eine Pipe oder ein Gerät. Hier lassen sich nur Dateien öffnen.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TableQuestion.cpp"/>
        <source>Export Values</source>
        <translation>Werte exportieren</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TableQuestion.cpp"/>
        <source>A file of this kind has the rows of &amp;one table:</source>
        <translation>Eine Datei dieser Art hat die Zeilen &amp;einer Tabelle:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Report from Template</source>
        <translation>Bericht aus Vorlage</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Template file</source>
        <translation>Vorlagendatei</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Template</source>
        <translation>Vorlage</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Table or block</source>
        <translation>Tabelle oder Block</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Data file</source>
        <translation>Datendatei</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>&amp;Edit Template</source>
        <translation>Vorlage &amp;bearbeiten</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Choose a template file</source>
        <translation>Vorlagendatei wählen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Brow&amp;se...</source>
        <translation>Dur&amp;chsuchen...</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Choose a data file</source>
        <translation>Datendatei wählen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Ser&amp;ver...</source>
        <translation>&amp;Server...</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Choose a table of a database server</source>
        <translation>Tabelle eines Datenbankservers wählen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Tables of a PostgreSQL server</source>
        <translation>Tabellen eines PostgreSQL-Servers</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>&amp;File:</source>
        <translation>&amp;Datei:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>&amp;Template:</source>
        <translation>&amp;Vorlage:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Table or &amp;block:</source>
        <translation>&amp;Tabelle oder Block:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>&amp;Data:</source>
        <translation>Date&amp;n:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Templates (*.xml);;All files (*)</source>
        <translation>Vorlagen (*.xml);;Alle Dateien (*)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Data (*.csv *.txt *.xml *.landxml *.gpkg *.sqlite *.db);;All files (*)</source>
        <translation>Daten (*.csv *.txt *.xml *.landxml *.gpkg *.sqlite *.db);;Alle Dateien (*)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialogFiles.cpp"/>
        <source>Press Server to list the tables of this connection.</source>
        <translation>„Server“ listet die Tabellen dieser Verbindung auf.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialogFiles.cpp"/>
        <source>The data file was not read to its end.</source>
        <translation>Die Datendatei wurde nicht zu Ende gelesen.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialogFiles.cpp"/>
        <source>The data file holds nothing that is listed.</source>
        <translation>Die Datendatei enthält nichts, was aufgelistet wird.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialogFiles.cpp"/>
        <source>This template has neither a table nor a block.</source>
        <translation>Diese Vorlage hat weder eine Tabelle noch einen Block.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialogFiles.cpp"/>
        <source>There is no data file "%1".</source>
        <translation>Es gibt keine Datendatei „%1“.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Metre</source>
        <translation>Meter</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Millimetre</source>
        <translation>Millimeter</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Kilometre</source>
        <translation>Kilometer</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>International foot</source>
        <translation>Internationaler Fuß</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>US survey foot</source>
        <translation>US-Vermessungsfuß</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Square metre</source>
        <translation>Quadratmeter</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Hectare</source>
        <translation>Hektar</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Square kilometre</source>
        <translation>Quadratkilometer</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Square foot</source>
        <translation>Quadratfuß</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Acre</source>
        <translation>Acre</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Degree</source>
        <translation>Grad</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Gon</source>
        <translation>Gon</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Radian</source>
        <translation>Radiant</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Easting, northing</source>
        <translation>Rechtswert (E), Hochwert (N)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Northing, easting</source>
        <translation>Hochwert (N), Rechtswert (E)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Degrees, minutes, seconds</source>
        <translation>Grad, Minuten, Sekunden</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Decimal degrees</source>
        <translation>Dezimalgrad</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Whole circle</source>
        <translation>Vollkreis</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Quadrant</source>
        <translation>Quadrant</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>From north</source>
        <translation>Von Norden</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>From south</source>
        <translation>Von Süden</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Leading &amp;zeros</source>
        <translation>Führende &amp;Nullen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Angle &amp;marks:</source>
        <translation>Winkel&amp;zeichen:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>&amp;Lengths:</source>
        <translation>&amp;Längen:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Decimals:</source>
        <translation>Nachkommastellen:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>&amp;Areas:</source>
        <translation>&amp;Flächen:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Decimals of numbers:</source>
        <translation>Nachkommastellen der Zahlen:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>A&amp;ngles:</source>
        <translation>&amp;Winkel:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>&amp;Stations:</source>
        <translation>S&amp;tationen:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>&amp;Coordinates:</source>
        <translation>&amp;Koordinaten:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>&amp;Bearings:</source>
        <translation>&amp;Richtungswinkel:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Degree mark</source>
        <translation>Gradzeichen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Minute mark</source>
        <translation>Minutenzeichen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Second mark</source>
        <translation>Sekundenzeichen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Looks like</source>
        <translation>Beispiel</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Unit of lengths</source>
        <translation>Längeneinheit</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Decimals of lengths</source>
        <translation>Nachkommastellen der Längen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Unit of areas</source>
        <translation>Flächeneinheit</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Decimals of numbers and areas</source>
        <translation>Nachkommastellen der Zahlen und Flächen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Unit of angles</source>
        <translation>Winkeleinheit</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Form of stations</source>
        <translation>Form der Stationen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Decimals of stations</source>
        <translation>Nachkommastellen der Stationen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Order of coordinates</source>
        <translation>Reihenfolge der Koordinaten</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Unit of bearings</source>
        <translation>Einheit der Richtungswinkel</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Decimals of bearings</source>
        <translation>Nachkommastellen der Richtungswinkel</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Style of bearings</source>
        <translation>Darstellung der Richtungswinkel</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Reference of bearings</source>
        <translation>Bezugsrichtung der Richtungswinkel</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Length</source>
        <translation>Länge</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Area</source>
        <translation>Fläche</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Angle</source>
        <translation>Winkel</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Bearing</source>
        <translation>Richtungswinkel</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Columns</source>
        <translation>Spalten</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>E, N</source>
        <translation>E, N</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>N, E</source>
        <translation>N, E</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandList.cpp"/>
        <source>Commands</source>
        <translation>Befehle</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandList.cpp"/>
        <source>Type a part of a command or of its keys</source>
        <translation>Teil eines Befehls oder seiner Tasten eingeben</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandList.cpp"/>
        <source>Find a command</source>
        <translation>Befehl suchen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandList.cpp"/>
        <source>Command</source>
        <translation>Befehl</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandList.cpp"/>
        <source>Keys</source>
        <translation>Tasten</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandList.cpp"/>
        <source>Why the command cannot be chosen</source>
        <translation>Warum der Befehl nicht gewählt werden kann</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandList.cpp"/>
        <source>No command has this name.</source>
        <translation>Kein Befehl heißt so.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>No file has been opened yet.</source>
        <translation>Es wurde noch keine Datei geöffnet.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>No report is open.</source>
        <translation>Es ist kein Bericht offen.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>The report is still being made.</source>
        <translation>Der Bericht wird noch erzeugt.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>No other report is open.</source>
        <translation>Es ist kein anderer Bericht offen.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>There is only one window.</source>
        <translation>Es gibt nur ein Fenster.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>The report has no changes that are not saved.</source>
        <translation>Der Bericht hat keine ungespeicherten Änderungen.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>The report is open in another program. Close it there first.</source>
        <translation>Der Bericht ist in einem anderen Programm offen. Schließen Sie ihn zuerst dort.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>This report was not made by a job, so its values are not known.</source>
        <translation>Dieser Bericht stammt aus keinem Auftrag, daher sind seine Werte nicht bekannt.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>This report was not made by a job.</source>
        <translation>Dieser Bericht stammt aus keinem Auftrag.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>The report was not made from an object of another program.</source>
        <translation>Der Bericht stammt nicht aus einem Objekt eines anderen Programms.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>The lines of a report window can only be read. Press View\Edit Report.</source>
        <translation>Die Zeilen eines Berichtsfensters können nur gelesen werden. Drücken Sie „Bericht anzeigen/bearbeiten“.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>The report is still being loaded.</source>
        <translation>Der Bericht wird noch geladen.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>There is nothing to undo.</source>
        <translation>Es gibt nichts rückgängig zu machen.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>There is nothing to redo.</source>
        <translation>Es gibt nichts zu wiederholen.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>No text is selected.</source>
        <translation>Es ist kein Text markiert.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>The sheets are not shown. Choose View &gt; Sheets.</source>
        <translation>Die Blätter werden nicht gezeigt. Wählen Sie Ansicht &gt; Blätter.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/AboutDialog.cpp"/>
        <source>Built as %1 with %2 for %3, Qt %4.</source>
        <translation>Gebaut als %1 mit %2 für %3, Qt %4.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/AboutDialog.cpp"/>
        <source>About KaReport</source>
        <translation>Über KaReport</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/AboutDialog.cpp"/>
        <source>The program's icon</source>
        <translation>Das Symbol des Programms</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/AboutDialog.cpp"/>
        <source>Version %1</source>
        <translation>Version %1</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/AboutDialog.cpp"/>
        <source>Fixed-pitch reports for civil engineering and surveying.</source>
        <translation>Berichte in fester Zeichenbreite für Tiefbau und Vermessung.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/AboutDialog.cpp"/>
        <source>Qt is used under the LGPL, version 3. All libraries and their licences are listed under Licences.</source>
        <translation>Qt wird unter der LGPL, Version 3, verwendet. Alle Bibliotheken und ihre Lizenzen stehen unter „Lizenzen“.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/AboutDialog.cpp"/>
        <source>&amp;Licences</source>
        <translation>&amp;Lizenzen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/GuideBrowser.cpp"/>
        <source>Guide</source>
        <translation>Handbuch</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/GuidePages.cpp"/>
        <source>Working with KaReport</source>
        <translation>Arbeiten mit KaReport</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/GuidePages.cpp"/>
        <source>Templates</source>
        <translation>Vorlagen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/GuidePages.cpp"/>
        <source>Data</source>
        <translation>Daten</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/GuidePages.cpp"/>
        <source>LandXML</source>
        <translation>LandXML</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/GuidePages.cpp"/>
        <source>Lists of LandXML files</source>
        <translation>Listen aus LandXML-Dateien</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/GuidePages.cpp"/>
        <source>Groups and totals</source>
        <translation>Gruppen und Summen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/GuidePages.cpp"/>
        <source>The job file</source>
        <translation>Die Auftragsdatei</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/GuidePages.cpp"/>
        <source>The command line</source>
        <translation>Die Kommandozeile</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/GuidePages.cpp"/>
        <source>Many jobs</source>
        <translation>Viele Aufträge</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/GuidePages.cpp"/>
        <source>Examples</source>
        <translation>Beispiele</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/GuidePages.cpp"/>
        <source>Licences</source>
        <translation>Lizenzen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/HelpWindow.cpp"/>
        <source>Back</source>
        <translation>Zurück</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/HelpWindow.cpp"/>
        <source>Forward</source>
        <translation>Vor</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/HelpWindow.cpp"/>
        <source>Find on this page</source>
        <translation>Auf dieser Seite suchen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/HelpWindow.cpp"/>
        <source>Pages of the guide</source>
        <translation>Seiten des Handbuchs</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/HelpWindow.cpp"/>
        <source>Not on this page</source>
        <translation>Nicht auf dieser Seite</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportDatabase.cpp"/>
        <source>the table was not read. Choose it again to read it</source>
        <translation>die Tabelle wurde nicht gelesen. Wählen Sie sie noch einmal, um sie zu lesen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Comma</source>
        <translation>Komma</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Semicolon</source>
        <translation>Semikolon</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Tab</source>
        <translation>Tabulator</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Vertical bar</source>
        <translation>Senkrechter Strich</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Blanks and tabs</source>
        <translation>Leerzeichen und Tabulatoren</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Point: 1.5</source>
        <translation>Punkt: 1.5</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Comma: 1,5</source>
        <translation>Komma: 1,5</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>First &amp;row names the columns</source>
        <translation>&amp;Erste Zeile benennt die Spalten</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Tabl&amp;e:</source>
        <translation>Tab&amp;elle:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Table of the database</source>
        <translation>Tabelle der Datenbank</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Deli&amp;miter:</source>
        <translation>Trenn&amp;zeichen:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Delimiter</source>
        <translation>Trennzeichen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Decimal s&amp;ign:</source>
        <translation>Dez&amp;imalzeichen:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Decimal sign</source>
        <translation>Dezimalzeichen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>En&amp;coding:</source>
        <translation>&amp;Kodierung:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Encoding</source>
        <translation>Kodierung</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>&amp;Order:</source>
        <translation>Rei&amp;henfolge:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Order of the columns</source>
        <translation>Reihenfolge der Spalten</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>&amp;Lengths are:</source>
        <translation>&amp;Längen sind in:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Unit of lengths in the data</source>
        <translation>Einheit der Längen in den Daten</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>&amp;Areas are:</source>
        <translation>Fl&amp;ächen sind in:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Unit of areas in the data</source>
        <translation>Einheit der Flächen in den Daten</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>A&amp;ngles are:</source>
        <translation>&amp;Winkel sind in:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Unit of angles in the data</source>
        <translation>Einheit der Winkel in den Daten</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>First row names the columns</source>
        <translation>Erste Zeile benennt die Spalten</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>P number, N northing, E easting, Z elevation, D description, - not read</source>
        <translation>P Nummer, N Hochwert, E Rechtswert, Z Höhe, D Beschreibung, - nicht gelesen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportPanel.cpp"/>
        <source>First rows of the data</source>
        <translation>Erste Zeilen der Daten</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportPanel.cpp"/>
        <source>Database</source>
        <translation>Datenbank</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportPanel.cpp"/>
        <source>Text file</source>
        <translation>Textdatei</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportPanel.cpp"/>
        <source>the database has no table</source>
        <translation>die Datenbank hat keine Tabelle</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportPanel.cpp"/>
        <source>Line %1, column %2: %3</source>
        <translation>Zeile %1, Spalte %2: %3</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportPanelRows.cpp"/>
        <source>(not read)</source>
        <translation>(nicht gelesen)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportPanelRows.cpp"/>
        <source>Variable of the column %1</source>
        <translation>Variable der Spalte %1</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>Tables of a PostgreSQL Server</source>
        <translation>Tabellen eines PostgreSQL-Servers</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>&amp;Service:</source>
        <translation>&amp;Dienst:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>Service</source>
        <translation>Dienst</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>an entry of ~/.pg_service.conf, or the fields below</source>
        <translation>ein Eintrag von ~/.pg_service.conf, oder die Felder darunter</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>&amp;Host:</source>
        <translation>&amp;Host:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>Host</source>
        <translation>Host</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>&amp;Port:</source>
        <translation>&amp;Port:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>Port</source>
        <translation>Port</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>&amp;Database:</source>
        <translation>D&amp;atenbank:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>&amp;User:</source>
        <translation>&amp;Benutzer:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>User</source>
        <translation>Benutzer</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>&amp;More:</source>
        <translation>&amp;Weiteres:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>More of the connection</source>
        <translation>Weiteres zur Verbindung</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>A password is read from your password file (~/.pgpass) or from PGPASSWORD. It is part of no job.</source>
        <translation>Ein Kennwort wird aus Ihrer Kennwortdatei (~/.pgpass) oder aus PGPASSWORD gelesen. Es steht in keinem Auftrag.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>Why there are no tables</source>
        <translation>Warum es keine Tabellen gibt</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>&amp;List Tables</source>
        <translation>Tabellen auf&amp;listen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>Listing the tables of the server</source>
        <translation>Die Tabellen des Servers werden aufgelistet</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>The server was not waited for.</source>
        <translation>Auf den Server wurde nicht gewartet.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>The database has no table that this user may read.</source>
        <translation>Die Datenbank hat keine Tabelle, die dieser Benutzer lesen darf.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/main.cpp"/>
        <source>Runs report jobs, and shows, edits and prints reports.</source>
        <translation>Führt Berichtsaufträge aus und zeigt, bearbeitet und druckt Berichte.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/main.cpp"/>
        <source>Jobs (.json), saved reports (.rep, .rtf) and templates (.xml) to open</source>
        <translation>Zu öffnende Aufträge (.json), gespeicherte Berichte (.rep, .rtf) und Vorlagen (.xml)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRuns.cpp"/>
        <source>Number of notes</source>
        <translation>Anzahl der Hinweise</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRuns.cpp"/>
        <source>"%1" has changes that were made by hand. Make it again and lose them?</source>
        <translation>„%1“ wurde von Hand geändert. Neu erstellen und diese Änderungen verlieren?</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRuns.cpp"/>
        <source>"%1" was not made again: %2</source>
        <translation>„%1“ wurde nicht neu erstellt: %2</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRunsFiles.cpp"/>
        <source>Files of "%1" have changed. Press F5 to make it again.</source>
        <translation>Woraus „%1“ erstellt wurde, hat sich geändert. F5 erstellt es neu.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRunsFiles.cpp"/>
        <source>Jobs</source>
        <translation>Aufträge</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRunsFiles.cpp"/>
        <source>The job was saved as "%1".</source>
        <translation>Der Auftrag wurde als „%1“ gespeichert.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRunsFront.cpp"/>
        <source>Save as &amp;Job...</source>
        <translation>Als Auf&amp;trag speichern...</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRunsFront.cpp"/>
        <source>&amp;Run Again	F5</source>
        <translation>Neu a&amp;usführen	F5</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRunsFront.cpp"/>
        <source>Run W&amp;hen Files Change</source>
        <translation>Bei Dateiänderungen aus&amp;führen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRunsFront.cpp"/>
        <source>U&amp;nits Bar</source>
        <translation>&amp;Einheitenleiste</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRunsFront.cpp"/>
        <source>&amp;Choose Units	Ctrl+U</source>
        <translation>Einheiten &amp;wählen	Ctrl+U</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRunsFront.cpp"/>
        <source>N&amp;otes</source>
        <translation>&amp;Hinweise</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRunsFront.cpp"/>
        <source>&amp;Go to Notes	F4</source>
        <translation>&amp;Zu den Hinweisen	F4</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRunsFront.cpp"/>
        <source>Shows the notes on the report</source>
        <translation>Zeigt, was beim Erstellen des Berichts zu sagen war</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRunsFront.cpp"/>
        <source>There is no file with a place for this note.</source>
        <translation>Zu diesem Hinweis gibt es keine Stelle in einer Datei.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/FilePlace.cpp"/>
        <source>%1, line %2</source>
        <translation>%1, Zeile %2</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/FilePlace.cpp"/>
        <source>Lines of the file</source>
        <translation>Zeilen der Datei</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/JobWork.cpp"/>
        <source>it is a folder, a pipe or a device</source>
        <translation>das ist ein Ordner, eine Pipe oder ein Gerät</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/JobWork.cpp"/>
        <source>Another job is running. Wait until it has finished, or cancel it.</source>
        <translation>Ein anderer Auftrag läuft gerade. Sein Ende abwarten oder ihn abbrechen.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/JobWork.cpp"/>
        <source>There is not enough memory for this input.</source>
        <translation>Der Arbeitsspeicher reicht für diese Eingabe nicht aus.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Unknown column</source>
        <translation>Unbekannte Spalte</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Field without data</source>
        <translation>Feld ohne Daten</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Value too wide</source>
        <translation>Wert zu breit</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Missing value</source>
        <translation>Fehlender Wert</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>No finite number</source>
        <translation>Keine endliche Zahl</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Unknown sort key</source>
        <translation>Unbekannter Sortierschlüssel</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Not in a total</source>
        <translation>In keiner Summe</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Character not shown</source>
        <translation>Zeichen nicht dargestellt</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Difference in the data</source>
        <translation>Widerspruch in den Daten</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Not read</source>
        <translation>Nicht gelesen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Assumed unit</source>
        <translation>Angenommene Einheit</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Notes</source>
        <translation>Hinweise</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Show &amp;Line</source>
        <translation>&amp;Zeile zeigen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Show Pla&amp;ce in File</source>
        <translation>&amp;Stelle in der Datei zeigen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Kind</source>
        <translation>Art</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Text</source>
        <translation>Text</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Line</source>
        <comment>of a report</comment>
        <translation>Zeile</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Place</source>
        <translation>Stelle</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Not made again</source>
        <translation>Nicht neu erstellt</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/UnitsBar.cpp"/>
        <source>Units</source>
        <translation>Einheiten</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/start/StartPage.cpp"/>
        <source>%1 — not there</source>
        <translation>%1 — nicht vorhanden</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/start/StartPage.cpp"/>
        <source>Start</source>
        <translation>Start</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/start/StartPage.cpp"/>
        <source>Recent files</source>
        <translation>Zuletzt benutzte Dateien</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/start/StartPage.cpp"/>
        <source>Files that you open are listed here.</source>
        <translation>Hier stehen die Dateien, die Sie öffnen.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/start/StartPage.cpp"/>
        <source>Start page</source>
        <translation>Startseite</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/start/StartPage.cpp"/>
        <source>Open a job or a saved report, or drop a file here.</source>
        <translation>Öffnen Sie einen Auftrag oder einen gespeicherten Bericht, oder legen Sie eine Datei hier ab.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/start/StartPage.cpp"/>
        <source>Recent Files</source>
        <translation>Zuletzt benutzt</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateFindBar.cpp"/>
        <source>Find and replace</source>
        <translation>Suchen und ersetzen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateFindBar.cpp"/>
        <source>Replacement text</source>
        <translation>Text, der an seine Stelle kommt</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateFindBar.cpp"/>
        <source>Replace with</source>
        <translation>Ersetzen durch</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateFindBar.cpp"/>
        <source>&amp;Next</source>
        <translation>&amp;Nächster</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateFindBar.cpp"/>
        <source>&amp;Previous</source>
        <translation>&amp;Voriger</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateFindBar.cpp"/>
        <source>&amp;Replace</source>
        <translation>&amp;Ersetzen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateFindBar.cpp"/>
        <source>Replace &amp;All</source>
        <translation>&amp;Alle ersetzen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateFindBar.cpp"/>
        <source>Matches: %1</source>
        <translation>Treffer: %1</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplatePage.cpp"/>
        <source>First pages of the report</source>
        <translation>Erste Seiten des Berichts</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplatePage.cpp"/>
        <source>Enter on a value or a label goes to its field in the template.</source>
        <translation>Die Eingabetaste auf einem Wert oder einer Beschriftung führt zu ihrem Feld in der Vorlage.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateTextEdit.cpp"/>
        <source>Text of the template</source>
        <translation>Text der Vorlage</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateTextEdit.cpp"/>
        <source>What can be written here</source>
        <translation>Was hier stehen kann</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindow.cpp"/>
        <source>Working…</source>
        <translation>In Arbeit …</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindow.cpp"/>
        <source>Sample rows are shown: %1</source>
        <translation>Erfundene Zeilen werden gezeigt: %1</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindow.cpp"/>
        <source>The last pages that could be made are shown: %1</source>
        <translation>Die letzten Seiten, die gemacht werden konnten, werden gezeigt: %1</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindow.cpp"/>
        <source>error</source>
        <translation>Fehler</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindow.cpp"/>
        <source>warning</source>
        <translation>Warnung</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindow.cpp"/>
        <source>Line %1, column %2</source>
        <translation>Zeile %1, Spalte %2</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowFile.cpp"/>
        <source>"%1" has characters that cannot be shown here. It can be read, but not edited.</source>
        <translation>„%1“ hat Zeichen, die hier nicht gezeigt werden können. Die Datei kann gelesen, aber nicht bearbeitet werden.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowFile.cpp"/>
        <source>"%1" could not be saved: %2</source>
        <translation>„%1“ konnte nicht gespeichert werden: %2</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowFile.cpp"/>
        <source>"%1" has characters that are not in Latin-1. It was saved as UTF-8.</source>
        <translation>„%1“ hat Zeichen, die es in Latin-1 nicht gibt. Die Datei wurde als UTF-8 gespeichert.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowFile.cpp"/>
        <source>Sample rows</source>
        <translation>Erfundene Zeilen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowFile.cpp"/>
        <source>Choose a job or a data file...</source>
        <translation>Auftrag oder Datendatei wählen ...</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowLayout.cpp"/>
        <source>Rename Variable</source>
        <translation>Variable umbenennen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowLayout.cpp"/>
        <source>New name</source>
        <translation>Neuer Name</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowLayout.cpp"/>
        <source>&amp;New name of "%1":</source>
        <translation>&amp;Neuer Name von „%1“:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowLayout.cpp"/>
        <source>Choose a job or a data file</source>
        <translation>Auftrag oder Datendatei wählen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowLayout.cpp"/>
        <source>Jobs and data (*.json *.csv *.txt)</source>
        <translation>Aufträge und Daten (*.json *.csv *.txt)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowLayout.cpp"/>
        <source>Remarks on the template</source>
        <translation>Anmerkungen zur Vorlage</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowLayout.cpp"/>
        <source>Remark</source>
        <translation>Anmerkung</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowLayout.cpp"/>
        <source>Data of the pages</source>
        <translation>Daten der Seiten</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowLayout.cpp"/>
        <source>State of the pages</source>
        <translation>Stand der Seiten</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>The template can only be read: it has characters that cannot be shown here.</source>
        <translation>Die Vorlage kann nur gelesen werden: sie hat Zeichen, die hier nicht gezeigt werden können.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>The template has no changes that are not saved.</source>
        <translation>Die Vorlage hat keine ungespeicherten Änderungen.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>Save &amp;As...	Ctrl+Shift+S</source>
        <translation>Speichern &amp;unter ...	Ctrl+Shift+S</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>Choose &amp;Data...	Ctrl+D</source>
        <translation>&amp;Daten wählen ...	Ctrl+D</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>&amp;Close	Ctrl+W</source>
        <translation>S&amp;chließen	Ctrl+W</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>C&amp;omplete	Ctrl+Space</source>
        <translation>&amp;Vervollständigen	Ctrl+Space</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>Rena&amp;me Variable...	F2</source>
        <translation>Variable &amp;umbenennen ...	F2</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>No text has been looked for yet.</source>
        <translation>Es wurde noch kein Text gesucht.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>&amp;Find and Replace...	Ctrl+F</source>
        <translation>&amp;Suchen und Ersetzen ...	Ctrl+F</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>&amp;Insert</source>
        <translation>&amp;Einfügen</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>&amp;Field	Ctrl+Shift+F</source>
        <translation>&amp;Feld	Ctrl+Shift+F</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>&amp;Table	Ctrl+Shift+T</source>
        <translation>&amp;Tabelle	Ctrl+Shift+T</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>&amp;Block	Ctrl+Shift+B</source>
        <translation>&amp;Block	Ctrl+Shift+B</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>&amp;Dictionary	Ctrl+Shift+D</source>
        <translation>&amp;Wörterbuch	Ctrl+Shift+D</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>There are no remarks on the template.</source>
        <translation>Zur Vorlage gibt es keine Anmerkungen.</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>&amp;Next Remark	F8</source>
        <translation>&amp;Nächste Anmerkung	F8</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>&amp;Previous Remark	Shift+F8</source>
        <translation>&amp;Vorige Anmerkung	Shift+F8</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>Text, &amp;Pages, Remarks	F6</source>
        <translation>Text, &amp;Seiten, Anmerkungen	F6</translation>
    </message>
</context>
</TS>
