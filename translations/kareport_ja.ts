<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ja" sourcelanguage="en">
<context>
    <name>KaReport</name>
    <message>
        <location filename="../host/app/LinkTargetPosix.cpp"/>
        <source>the link "%1" belongs to another user and is in a folder that everybody can write to</source>
        <translation>リンク "%1" は別のユーザーのもので、だれでも書き込めるフォルダーにあります</translation>
    </message>
    <message>
        <location filename="../host/app/NearestName.cpp"/>
        <source>did you mean "%1"?</source>
        <translation>"%1" のことですか?</translation>
    </message>
    <message>
        <location filename="../host/app/NearestName.cpp"/>
        <source>one of %1 was expected</source>
        <translation>次のいずれかが必要です: %1</translation>
    </message>
    <message>
        <location filename="../host/app/NearestName.cpp"/>
        <source>none</source>
        <translation>なし</translation>
    </message>
    <message>
        <location filename="../host/app/ReplaceFile.cpp"/>
        <source>not all of it could be written</source>
        <translation>すべてを書き込むことはできませんでした</translation>
    </message>
    <message>
        <location filename="../host/app/StandardText.cpp"/>
        <source>All Files (*.*)</source>
        <translation>すべてのファイル (*.*)</translation>
    </message>
    <message>
        <location filename="../host/app/StandardText.cpp"/>
        <source>The file is too large to open.</source>
        <translation>ファイルが大きすぎて開けません。</translation>
    </message>
    <message>
        <location filename="../host/app/StandardText.cpp"/>
        <source>there is not enough memory for it</source>
        <translation>メモリが足りません</translation>
    </message>
    <message>
        <location filename="../host/frame/PaneDock.cpp"/>
        <source>%1, not saved</source>
        <translation>%1、未保存</translation>
    </message>
    <message>
        <location filename="../host/frame/UDocumentFiles.cpp"/>
        <source>Save changes to %1?</source>
        <translation>%1 への変更を保存しますか?</translation>
    </message>
    <message>
        <location filename="../host/frame/UDocumentFiles.cpp"/>
        <source>Untitled</source>
        <translation>無題</translation>
    </message>
    <message>
        <location filename="../templates/ScanNoteText.cpp"/>
        <source>an empty %1 ends its list: what follows in the list is not read</source>
        <translation>空の %1 でリストが終わります: リスト内のこれ以降は読み込まれません</translation>
    </message>
    <message>
        <location filename="../templates/ScanNoteText.cpp"/>
        <source>%1 is not read: a closing tag of that name comes before it</source>
        <translation>%1 は読み込まれません: 同じ名前の終了タグが前にあります</translation>
    </message>
    <message>
        <location filename="../templates/ScanNoteText.cpp"/>
        <source>%1 is not read: its closing tag was expected</source>
        <translation>%1 は読み込まれません: 終了タグが必要です</translation>
    </message>
    <message>
        <location filename="../templates/ScanNoteText.cpp"/>
        <source>%1 is inside another %1: the outer one ends at the first closing tag</source>
        <translation>%1 が別の %1 の中にあります: 外側の要素は最初の終了タグで打ち切られます</translation>
    </message>
    <message>
        <location filename="../templates/ScanNoteText.cpp"/>
        <source>"%1" is dropped with the short closing tag of %2</source>
        <translation>「%1」は %2 の省略形の終了タグとともに無視されます</translation>
    </message>
    <message>
        <location filename="../templates/TemplateChecker.cpp"/>
        <source>no template was read: a &lt;ReportTemplate&gt; element was expected</source>
        <translation>テンプレートが読み込まれませんでした: &lt;ReportTemplate&gt; 要素が必要です</translation>
    </message>
    <message>
        <location filename="../templates/TemplateChecker.cpp"/>
        <source>the text "%1" is outside of all elements and is not read</source>
        <translation>テキスト "%1" はすべての要素の外にあり、読み込まれません</translation>
    </message>
    <message>
        <location filename="../templates/TemplateChecker.cpp"/>
        <source>this text is in no template: %1 characters in %2 lines are not read</source>
        <translation>このテキストはどのテンプレートの中にもありません: %2 行の %1 文字は読み込まれません</translation>
    </message>
    <message>
        <location filename="../templates/TemplateChecker.cpp"/>
        <source>no template follows: the last %1 characters, in %2 lines, are not read</source>
        <translation>これより後にテンプレートはありません: 最後の %2 行の %1 文字は読み込まれません</translation>
    </message>
    <message>
        <location filename="../templates/TemplateChecker.cpp"/>
        <source>unknown element %1: it is not read</source>
        <translation>不明な要素 %1: 読み込まれません</translation>
    </message>
    <message>
        <location filename="../templates/TemplateChecker.cpp"/>
        <source>unknown element %1: %2</source>
        <translation>不明な要素 %1: %2</translation>
    </message>
    <message>
        <location filename="../templates/TemplateChecker.cpp"/>
        <source>%1 is read although it is in a comment</source>
        <translation>%1 はコメント内にありますが、読み込まれます</translation>
    </message>
    <message>
        <location filename="../templates/TemplateChecker.cpp"/>
        <source>%1 is not a tag: a tag has no blanks and no attributes</source>
        <translation>%1 はタグではありません: タグに空白や属性は使えません</translation>
    </message>
    <message>
        <location filename="../templates/TemplateChecker.cpp"/>
        <source>the template has no &lt;Name&gt;, so it cannot be chosen</source>
        <translation>テンプレートに &lt;Name&gt; がないため、選択できません</translation>
    </message>
    <message>
        <location filename="../templates/TemplateChecker.cpp"/>
        <source>a template named %1 comes before this one: the last one of a name is read</source>
        <translation>%1 という名前のテンプレートが前にもあります: 同名のものは最後の 1 つが読み込まれます</translation>
    </message>
    <message>
        <location filename="../templates/TemplateChecker.cpp"/>
        <source>the template's own &lt;Name&gt; must come before %1: this one was taken for it</source>
        <translation>テンプレート自身の &lt;Name&gt; は %1 より前に必要です: この &lt;Name&gt; がテンプレート名とみなされました</translation>
    </message>
    <message>
        <location filename="../templates/TemplateChecker.cpp"/>
        <source>the sort key %1 is not in the dictionary %2</source>
        <translation>並べ替えキー %1 は辞書 %2 にありません</translation>
    </message>
    <message>
        <location filename="../templates/TemplateChecker.cpp"/>
        <source>no &lt;Separator&gt;: the columns are separated by the character 0</source>
        <translation>&lt;Separator&gt; がありません: 列の間には文字コード 0 の文字が入ります</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>the dictionary has no &lt;DictionaryName&gt;</source>
        <translation>辞書に &lt;DictionaryName&gt; がありません</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>a dictionary named %1 comes before this one: the variables of both count together</source>
        <translation>%1 という名前の辞書がこの前にあります: 両方の変数が合わせて使われます</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>unknown type %1: the variable %2 is left out</source>
        <translation>不明な型 %1: 変数 %2 は除外されます</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>the identifier %1 counts as %2: a whole number was expected</source>
        <translation>識別子 %1 は %2 とみなされます: 整数が必要です</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>the variable %1 is in the dictionary twice: the last one counts</source>
        <translation>変数 %1 が辞書に 2 回あります: 最後のものが有効です</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>the variables %1 and %2 share the identifier %3</source>
        <translation>変数 %1 と %2 の識別子がどちらも %3 です</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>the table has no &lt;Name&gt;</source>
        <translation>表に &lt;Name&gt; がありません</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>the block has no &lt;Name&gt;</source>
        <translation>ブロックに &lt;Name&gt; がありません</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>there is no dictionary named %1: %2 cannot be written</source>
        <translation>%1 という名前の辞書がありません: %2 は出力できません</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>%1 has no fields</source>
        <translation>%1 にフィールドがありません</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>a table named %1 comes before this one: the first one of a name is written</source>
        <translation>%1 という名前の表がこの前にあります: 同じ名前では最初のものが書き込まれます</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>a block named %1 comes before this one: the first one of a name is written</source>
        <translation>%1 という名前のブロックがこの前にあります: 同じ名前では最初のものが書き込まれます</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>the format %1 is beyond %2 characters</source>
        <translation>書式 %1 が %2 文字を超えています</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>the format %1 counts as %2.%3: a width such as 12, or a width and decimals such as 12.3, was expected</source>
        <translation>書式 %1 は %2.%3 とみなされます: 12 のような幅、または 12.3 のような幅と小数桁数が必要です</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>the dictionary has no variable %1: the column cannot be filled</source>
        <translation>辞書に変数 %1 がありません: この列には値が入りません</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>the dictionary has no variable %1: the line repeats the value before it</source>
        <translation>辞書に変数 %1 がありません: この行には直前の値が繰り返されます</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>the label %1 is wider than its column of %2: the column takes its width</source>
        <translation>ラベル %1 が列幅 %2 文字を超えています: 列幅はラベルに合わせられます</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>the alignment %1 counts as LEFT</source>
        <translation>配置 %1 は LEFT とみなされます</translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheckerRecords.cpp"/>
        <source>%1 is printed unchanged</source>
        <translation>%1 はそのまま印字されます</translation>
    </message>
    <message>
        <location filename="../page/PlaceholderPiece.cpp"/>
        <source>"%1" begins a placeholder that does not end: "}" was expected, or "{{" for a brace</source>
        <translation>"%1" で始まるプレースホルダーが閉じられていません: "}"、または括弧そのものを表す "{{" が必要です</translation>
    </message>
    <message>
        <location filename="../page/PlaceholderPiece.cpp"/>
        <source>unknown placeholder %1: %2</source>
        <translation>不明なプレースホルダー %1: %2</translation>
    </message>
    <message>
        <location filename="../formats/pdf/PdfExport.cpp"/>
        <source>the page has not been measured</source>
        <translation>ページの寸法がまだ求められていません</translation>
    </message>
    <message>
        <location filename="../formats/pdf/PdfExport.cpp"/>
        <source>a font size of 1 point or more was expected</source>
        <translation>フォントサイズは 1 ポイント以上が必要です</translation>
    </message>
    <message>
        <location filename="../formats/pdf/PdfExport.cpp"/>
        <source>the margins leave no room on the page: smaller margins were expected</source>
        <translation>余白が大きく、ページに印字できる範囲がありません: 余白を小さくする必要があります</translation>
    </message>
    <message>
        <location filename="../formats/pdf/PdfExport.cpp"/>
        <source>the PDF library failed with error %1</source>
        <translation>PDF ライブラリでエラー %1 が発生しました</translation>
    </message>
    <message>
        <location filename="../formats/pdf/PdfExport.cpp"/>
        <source>the font file "%1" cannot be used</source>
        <translation>フォントファイル「%1」は使用できません</translation>
    </message>
    <message>
        <location filename="../formats/pdf/PdfExport.cpp"/>
        <source>no fixed-pitch font was found: one of %1 was expected</source>
        <translation>等幅フォントが見つかりません: 次のいずれかが必要です: %1</translation>
    </message>
    <message>
        <location filename="../formats/pdf/PdfExport.cpp"/>
        <source>stopped</source>
        <translation>中断されました</translation>
    </message>
    <message>
        <location filename="../formats/pdf/PdfNotes.cpp"/>
        <source>line %1 is</source>
        <translation>%1 行目が</translation>
    </message>
    <message>
        <location filename="../formats/pdf/PdfNotes.cpp"/>
        <source>%1 lines, the first of them line %2, are</source>
        <translation>%1 行 (最初は %2 行目) が</translation>
    </message>
    <message>
        <location filename="../formats/pdf/PdfNotes.cpp"/>
        <source>no font has the character "%1" (U+%2), first in line %3, %4 times in all</source>
        <translation>文字「%1」(U+%2) を含むフォントがありません (最初は %3 行目、全 %4 回)</translation>
    </message>
    <message>
        <location filename="../formats/pdf/PdfNotes.cpp"/>
        <source>%1 wider than the page: the type is %2 points on all pages</source>
        <translation>%1ページより幅が広いため、すべてのページの文字は %2 ポイントです</translation>
    </message>
    <message>
        <location filename="../formats/pdf/PdfNotes.cpp"/>
        <source>%1 wider than the page in type of %2 points: what is too wide continues below</source>
        <translation>%1 %2 ポイントの文字でもページより幅が広いため、はみ出す部分は下の行に続きます</translation>
    </message>
    <message>
        <location filename="../formats/pdf/PdfNotes.cpp"/>
        <source>no font has %1 other characters, %2 times in all</source>
        <translation>ほかに %1 種類の文字を含むフォントがありません (全 %2 回)</translation>
    </message>
    <message>
        <location filename="../formats/richtext/RichTextParser.cpp"/>
        <source>%1 bytes of data were expected after \bin</source>
        <translation>\bin の後に %1 バイトのデータが必要です</translation>
    </message>
    <message>
        <location filename="../formats/richtext/RichTextParser.cpp"/>
        <source>a closing brace was expected: groups that are still open: %1</source>
        <translation>閉じ波かっこが必要です: 閉じていないグループの数: %1</translation>
    </message>
    <message>
        <location filename="../formats/richtext/RichTextParser.cpp"/>
        <source>at most %1 nested groups were expected</source>
        <translation>グループの入れ子は %1 段以下である必要があります</translation>
    </message>
    <message>
        <location filename="../formats/richtext/RichTextReader.cpp"/>
        <source>a rich text that begins with %1 was expected</source>
        <translation>リッチテキストの先頭には %1 が必要です</translation>
    </message>
    <message>
        <location filename="../formats/richtext/RichTextReader.cpp"/>
        <source>Pictures are not shown: %1.</source>
        <translation>画像は表示されません: %1 個。</translation>
    </message>
    <message>
        <location filename="../formats/richtext/RichTextReader.cpp"/>
        <source>Embedded objects and drawings are not shown: %1.</source>
        <translation>埋め込みオブジェクトと図形は表示されません: %1 個。</translation>
    </message>
    <message>
        <location filename="../formats/richtext/RichTextReader.cpp"/>
        <source>Footnotes and comments are not shown: %1.</source>
        <translation>脚注とコメントは表示されません: %1 個。</translation>
    </message>
    <message>
        <location filename="../formats/richtext/RichTextReader.cpp"/>
        <source>Page headers and footers are not shown: %1.</source>
        <translation>ヘッダーとフッターは表示されません: %1 個。</translation>
    </message>
    <message>
        <location filename="../formats/richtext/RichTextReader.cpp"/>
        <source>Hidden text is not shown: %1.</source>
        <translation>隠し文字は表示されません: %1 個。</translation>
    </message>
    <message>
        <location filename="../formats/richtext/RichTextReader.cpp"/>
        <source>Characters of symbol fonts are not known: %1.</source>
        <translation>記号フォントの不明な文字: %1 個。</translation>
    </message>
    <message>
        <location filename="../report/ReportSaveName.cpp"/>
        <source>RTF Files (*.rtf)|*.rtf|Report Files (*.rep)|*.rep|PDF (*.pdf)|*.pdf|</source>
        <translation>RTF ファイル (*.rtf)|*.rtf|帳票ファイル (*.rep)|*.rep|PDF (*.pdf)|*.pdf|</translation>
    </message>
    <message>
        <location filename="../report/ReportSaveName.cpp"/>
        <source>Report Files (*.rep)|*.rep|RTF Files (*.rtf)|*.rtf|PDF (*.pdf)|*.pdf|</source>
        <translation>帳票ファイル (*.rep)|*.rep|RTF ファイル (*.rtf)|*.rtf|PDF (*.pdf)|*.pdf|</translation>
    </message>
    <message>
        <location filename="../report/ReportSaveName.cpp"/>
        <source>"%1" could not be saved. Choose another folder, or make room on the disk.</source>
        <translation>「%1」を保存できませんでした。別のフォルダーを選ぶか、ディスクの空き容量を増やしてください。</translation>
    </message>
    <message>
        <location filename="../report/ReportSaveName.cpp"/>
        <source>"%1" could not be saved: %2.</source>
        <translation>「%1」を保存できませんでした: %2</translation>
    </message>
    <message>
        <location filename="../report/ReportSaveName.cpp"/>
        <source>a part of the report was lost when memory ran out</source>
        <translation>メモリ不足でレポートの一部が失われました</translation>
    </message>
    <message>
        <location filename="../report/ReportSaveName.cpp"/>
        <source>the report is empty, and a PDF has at least one page</source>
        <translation>レポートが空です。PDFには少なくとも1ページ必要です</translation>
    </message>
    <message>
        <location filename="../report/UReportDoc.cpp"/>
        <source>Station</source>
        <translation>測点No.</translation>
    </message>
    <message>
        <location filename="../report/UReportDocText.cpp"/>
        <source>   Page:</source>
        <comment>Report Header</comment>
        <translation>   頁:</translation>
    </message>
    <message>
        <location filename="../print/PageSetupDialog.cpp"/>
        <source>Page Setup</source>
        <translation>ページ設定</translation>
    </message>
    <message>
        <location filename="../print/PageSetupForm.cpp"/>
        <source>As the report was &amp;made</source>
        <translation>作成時のページのまま(&amp;M)</translation>
    </message>
    <message>
        <location filename="../print/PageSetupForm.cpp"/>
        <source>As the report was &amp;made (1 line)</source>
        <translation>作成時のページのまま (1 行)(&amp;M)</translation>
    </message>
    <message>
        <location filename="../print/PageSetupForm.cpp"/>
        <source>As the report was &amp;made (%1 lines)</source>
        <translation>作成時のページのまま (%1 行)(&amp;M)</translation>
    </message>
    <message>
        <location filename="../print/PageSetupForm.cpp"/>
        <source>P&amp;ortrait</source>
        <translation>縦(&amp;O)</translation>
    </message>
    <message>
        <location filename="../print/PageSetupForm.cpp"/>
        <source>L&amp;andscape</source>
        <translation>横(&amp;A)</translation>
    </message>
    <message>
        <location filename="../print/PageSetupForm.cpp"/>
        <source>As the &amp;sheet takes them</source>
        <translation>用紙に入る行数で区切る(&amp;S)</translation>
    </message>
    <message>
        <location filename="../print/PageSetupForm.cpp"/>
        <source>Paper: %1 x %2 in</source>
        <translation>用紙: %1 x %2 インチ</translation>
    </message>
    <message>
        <location filename="../print/PageSetupForm.cpp"/>
        <source>Paper: %1 x %2 mm</source>
        <translation>用紙: %1 x %2 mm</translation>
    </message>
    <message>
        <location filename="../print/PageSetupForm.cpp"/>
        <source>These margins leave no room for text on the paper. Choose smaller margins.</source>
        <translation>余白が大きく、用紙に印字できる範囲がありません。余白を小さくしてください。</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>Pr&amp;inter:</source>
        <translation>プリンター(&amp;P):</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>Printer</source>
        <translation>プリンター</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>Pa&amp;per:</source>
        <translation>用紙(&amp;Z):</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>Paper</source>
        <translation>用紙</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>Orientation</source>
        <translation>印刷の向き</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>Margins</source>
        <translation>余白</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>&amp;Left:</source>
        <translation>左(&amp;L):</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>&amp;Top:</source>
        <translation>上(&amp;T):</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>&amp;Right:</source>
        <translation>右(&amp;R):</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>&amp;Bottom:</source>
        <translation>下(&amp;B):</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>Left margin</source>
        <translation>左余白</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>Top margin</source>
        <translation>上余白</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>Right margin</source>
        <translation>右余白</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>Bottom margin</source>
        <translation>下余白</translation>
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
        <translation>ページ数</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>Pages: %1</source>
        <translation>ページ: %1</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>Each page of the report is printed on a sheet of its own, in smaller type where it has to be.</source>
        <translation>レポートの各ページを 1 枚ずつの用紙に印刷します。入りきらない場合は文字を小さくします。</translation>
    </message>
    <message>
        <location filename="../print/PageSetupFormParts.cpp"/>
        <source>Each sheet takes as many lines as fit, and the next sheet goes on from there.</source>
        <translation>各用紙に入るだけの行を印刷し、続きを次の用紙に印刷します。</translation>
    </message>
    <message>
        <location filename="../print/PrintDialogs.cpp"/>
        <source>Print</source>
        <translation>印刷</translation>
    </message>
    <message>
        <location filename="../print/PrintDialogs.cpp"/>
        <source>Print Preview</source>
        <translation>印刷プレビュー</translation>
    </message>
    <message>
        <location filename="../print/PrintProgress.cpp"/>
        <source>Printing</source>
        <translation>印刷中</translation>
    </message>
    <message>
        <location filename="../print/PrintProgress.cpp"/>
        <source>Cancel</source>
        <translation>キャンセル</translation>
    </message>
    <message>
        <location filename="../print/PrintProgress.cpp"/>
        <source>Page %1 of %2</source>
        <translation>ページ %1 / %2</translation>
    </message>
    <message>
        <location filename="../print/PrintTarget.cpp"/>
        <source>There is not enough room for the pages on the disk.</source>
        <translation>ページを保存する空き容量がありません。</translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>Previous match</source>
        <translation>前の一致箇所</translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>Next match</source>
        <translation>次の一致箇所</translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>Match &amp;case</source>
        <translation>大文字と小文字を区別(&amp;C)</translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>Whole wor&amp;d</source>
        <translation>単語単位(&amp;D)</translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>Close the find bar</source>
        <translation>検索バーを閉じる</translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>Find</source>
        <translation>検索</translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>Text to find</source>
        <translation>検索する文字列</translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>Matches</source>
        <translation>一致箇所</translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>No match</source>
        <translation>見つかりません</translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>%1 of %2</source>
        <comment>number of a match, number of all matches</comment>
        <translation>%1 / %2 件</translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>%1 in all</source>
        <comment>number of all matches</comment>
        <translation>全 %1 件</translation>
    </message>
    <message>
        <location filename="../view/PageBar.cpp"/>
        <source>Go to page</source>
        <translation>ページへ移動</translation>
    </message>
    <message>
        <location filename="../view/PageBar.cpp"/>
        <source>Page to go to</source>
        <translation>移動先のページ</translation>
    </message>
    <message>
        <location filename="../view/PageBar.cpp"/>
        <source>&amp;Go to page</source>
        <translation>ページへ移動(&amp;G)</translation>
    </message>
    <message>
        <location filename="../view/PageBar.cpp"/>
        <source>G&amp;o</source>
        <translation>移動(&amp;O)</translation>
    </message>
    <message>
        <location filename="../view/PageBar.cpp"/>
        <source>of %1</source>
        <comment>number of pages</comment>
        <translation>/ %1 ページ</translation>
    </message>
    <message>
        <location filename="../view/ReportEdit.cpp"/>
        <source>Report text</source>
        <translation>帳票のテキスト</translation>
    </message>
    <message>
        <location filename="../view/ReportEditCopy.cpp"/>
        <source>There is not enough memory to copy this. The clipboard is as it was.</source>
        <translation>コピーするメモリが足りません。クリップボードの内容は変わっていません。</translation>
    </message>
    <message>
        <location filename="../view/ReportEditPageLines.cpp"/>
        <source>Page %1</source>
        <translation>%1 ページ</translation>
    </message>
    <message>
        <location filename="../view/ReportViewWidget.cpp"/>
        <source>Page</source>
        <translation>ページ</translation>
    </message>
    <message>
        <location filename="../view/ReportViewWidget.cpp"/>
        <source>Line</source>
        <translation>行</translation>
    </message>
    <message>
        <location filename="../view/ReportViewWidget.cpp"/>
        <source>Line %1</source>
        <translation>行 %1</translation>
    </message>
    <message>
        <location filename="../view/ReportViewWidget.cpp"/>
        <source>Column</source>
        <translation>桁</translation>
    </message>
    <message>
        <location filename="../view/ReportViewWidget.cpp"/>
        <source>Column %1</source>
        <translation>桁 %1</translation>
    </message>
    <message>
        <location filename="../view/ReportViewWidget.cpp"/>
        <source>Loading</source>
        <translation>読み込み中</translation>
    </message>
    <message>
        <location filename="../view/ReportViewWidget.cpp"/>
        <source>Loading %1 %</source>
        <comment>percent of a report</comment>
        <translation>読み込み中 %1 %</translation>
    </message>
    <message>
        <location filename="../view/ReportViewWidget.cpp"/>
        <source>Zoom</source>
        <translation>ズーム</translation>
    </message>
    <message>
        <location filename="../view/ReportViewWidget.cpp"/>
        <source>%1 %</source>
        <comment>zoom in percent</comment>
        <translation>%1%</translation>
    </message>
    <message>
        <location filename="../view/UReportViewPageSetup.cpp"/>
        <source>Failed to get default printer settings.</source>
        <translation>通常使うプリンターの設定を取得できませんでした。</translation>
    </message>
    <message>
        <location filename="../view/UReportViewPrint.cpp"/>
        <source>The margins leave no room for text on the paper. Choose smaller margins under Page Setup.</source>
        <translation>余白が大きく、用紙に印字できる範囲がありません。「ページ設定」で余白を小さくしてください。</translation>
    </message>
    <message>
        <location filename="../view/UReportViewPrint.cpp"/>
        <source>There is nothing to print on the chosen pages.</source>
        <translation>指定したページに印刷する内容がありません。</translation>
    </message>
    <message>
        <location filename="../view/UReportViewPrint.cpp"/>
        <source>The report has changed while it was printed, and nothing of it was sent to the printer. Print it again.</source>
        <translation>印刷中に帳票が変更されたため、プリンターには何も送信されていません。もう一度印刷してください。</translation>
    </message>
    <message>
        <location filename="../view/UReportViewPrint.cpp"/>
        <source>The report could not be printed on "%1". Check the printer, or choose another one, and print again. Nothing of the report is lost.</source>
        <translation>「%1」で帳票を印刷できませんでした。プリンターを確認するか別のプリンターを選んで、もう一度印刷してください。帳票の内容は失われていません。</translation>
    </message>
    <message>
        <location filename="../view/UReportViewPrint.cpp"/>
        <source>The preview shows the first %1 pages. All pages are printed.</source>
        <translation>プレビューには最初の %1 ページが表示されます。印刷は全ページに対して行われます。</translation>
    </message>
    <message>
        <location filename="../ui/CReportToolBar.cpp"/>
        <source>Report</source>
        <translation>帳票</translation>
    </message>
    <message>
        <location filename="../ui/CReportViewPane.cpp"/>
        <source>The Report can only be closed when the associated editor is closed</source>
        <translation>関連付けられたエディターを閉じるまで、この帳票は閉じられません</translation>
    </message>
    <message>
        <location filename="../ui/CReportViewPane.cpp"/>
        <source>Error</source>
        <comment>Alert Message title</comment>
        <translation>エラー</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;File</source>
        <translation>ファイル(&amp;F)</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;New	Ctrl+N</source>
        <translation>新規作成(&amp;N)	Ctrl+N</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Open...	Ctrl+O</source>
        <translation>開く(&amp;O)...	Ctrl+O</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Close</source>
        <translation>閉じる(&amp;C)</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Save	Ctrl+S</source>
        <translation>上書き保存(&amp;S)	Ctrl+S</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>Save &amp;As...</source>
        <translation>名前を付けて保存(&amp;A)...</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>Update Text</source>
        <translation>テキストを更新</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Print...	Ctrl+P</source>
        <translation>印刷(&amp;P)...	Ctrl+P</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>Print Pre&amp;view</source>
        <translation>印刷プレビュー(&amp;V)</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>Pa&amp;ge Setup...</source>
        <translation>ページ設定(&amp;G)...</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>Recent File</source>
        <translation>最近使ったファイル</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>E&amp;xit</source>
        <translation>終了(&amp;X)</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Edit</source>
        <translation>編集(&amp;E)</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Undo	Ctrl+Z</source>
        <translation>元に戻す(&amp;U)	Ctrl+Z</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>Cu&amp;t	Ctrl+X</source>
        <translation>切り取り(&amp;T)	Ctrl+X</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Copy	Ctrl+C</source>
        <translation>コピー(&amp;C)	Ctrl+C</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Paste	Ctrl+V</source>
        <translation>貼り付け(&amp;P)	Ctrl+V</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;View</source>
        <translation>表示(&amp;V)</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Toolbar</source>
        <translation>ツールバー(&amp;T)</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Status Bar</source>
        <translation>ステータスバー(&amp;S)</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Window</source>
        <translation>ウィンドウ(&amp;W)</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;New Window</source>
        <translation>新しいウィンドウ(&amp;N)</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Cascade</source>
        <translation>重ねて表示(&amp;C)</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Tile Horizontally</source>
        <translation>上下に並べて表示(&amp;T)</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>Tile Vertically</source>
        <translation>左右に並べて表示</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Arrange Icons</source>
        <translation>アイコンの整列(&amp;A)</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;Help</source>
        <translation>ヘルプ(&amp;H)</translation>
    </message>
    <message>
        <location filename="../ui/ReportMenu.cpp"/>
        <source>&amp;About...</source>
        <translation>バージョン情報(&amp;A)...</translation>
    </message>
    <message>
        <location filename="../ui/ReportResources.cpp"/>
        <source>KaReport</source>
        <translation>KaReport</translation>
    </message>
    <message>
        <location filename="../ui/ReportResources.cpp"/>
        <source>Save</source>
        <translation>保存</translation>
    </message>
    <message>
        <location filename="../ui/ReportResources.cpp"/>
        <source>View\Edit Report</source>
        <translation>帳票の表示/編集</translation>
    </message>
    <message>
        <location filename="../ui/UReportWindowDlg.cpp"/>
        <source>Report lines</source>
        <translation>帳票の行</translation>
    </message>
    <message>
        <location filename="../ui/UReportWindowDlgCommands.cpp"/>
        <source>Save changes</source>
        <translation>変更を保存しますか</translation>
    </message>
    <message>
        <location filename="../ui/UReportWindowDlgCommands.cpp"/>
        <source>to</source>
        <translation>→</translation>
    </message>
    <message>
        <location filename="../sources/ColumnBinding.cpp"/>
        <source>there is no column %1: one of 1 to %2 was expected</source>
        <translation>列 %1 はありません: 1 から %2 のいずれかが必要です</translation>
    </message>
    <message>
        <location filename="../sources/ColumnBinding.cpp"/>
        <source>there is no column "%1"</source>
        <translation>列 "%1" はありません</translation>
    </message>
    <message>
        <location filename="../sources/ColumnBinding.cpp"/>
        <source>the columns %1 and %2 are both named "%3": each variable was expected once</source>
        <translation>列 %1 と列 %2 の名前がどちらも「%3」です: 変数はそれぞれ 1 回だけ指定できます</translation>
    </message>
    <message>
        <location filename="../sources/ColumnBinding.cpp"/>
        <source>the dictionary has no variable "%1"</source>
        <translation>辞書に変数 "%1" はありません</translation>
    </message>
    <message>
        <location filename="../sources/ColumnBinding.cpp"/>
        <source>the variable "%1" has two columns: each variable was expected once</source>
        <translation>変数 "%1" に列が 2 つあります: 各変数は 1 回だけ必要です</translation>
    </message>
    <message>
        <location filename="../sources/FileBytes.cpp"/>
        <source>the file was cut short while it was read</source>
        <translation>読み込み中にファイルが切り詰められました</translation>
    </message>
    <message>
        <location filename="../sources/FileBytes.cpp"/>
        <source>the pipe or device gives more than %1 MB, the most that was expected</source>
        <translation>ファイルではない入力から %1 MB を超えるデータが読み込まれました</translation>
    </message>
    <message>
        <location filename="../sources/GeometryColumns.cpp"/>
        <source>the value "%1" of the column "%2" does not fit: %3 was expected</source>
        <translation>列 "%2" の値 "%1" は適合しません: %3 が必要です</translation>
    </message>
    <message>
        <location filename="../sources/GeometryColumns.cpp"/>
        <source>no column is a variable of the dictionary; the columns are: %1</source>
        <translation>辞書の変数である列がありません。列は次のとおりです: %1</translation>
    </message>
    <message>
        <location filename="../sources/PointGeometry.cpp"/>
        <source>bytes that are not a geometry</source>
        <translation>ジオメトリでないバイト列</translation>
    </message>
    <message>
        <location filename="../sources/PointGeometry.cpp"/>
        <source>a line string</source>
        <translation>折れ線</translation>
    </message>
    <message>
        <location filename="../sources/PointGeometry.cpp"/>
        <source>a polygon</source>
        <translation>ポリゴン</translation>
    </message>
    <message>
        <location filename="../sources/PointGeometry.cpp"/>
        <source>several points</source>
        <translation>複数の点</translation>
    </message>
    <message>
        <location filename="../sources/PointGeometry.cpp"/>
        <source>several line strings</source>
        <translation>複数の折れ線</translation>
    </message>
    <message>
        <location filename="../sources/PointGeometry.cpp"/>
        <source>several polygons</source>
        <translation>複数のポリゴン</translation>
    </message>
    <message>
        <location filename="../sources/PointGeometry.cpp"/>
        <source>a collection of geometries</source>
        <translation>ジオメトリの集まり</translation>
    </message>
    <message>
        <location filename="../sources/PointGeometry.cpp"/>
        <source>a geometry of another kind</source>
        <translation>別の種類のジオメトリ</translation>
    </message>
    <message>
        <location filename="../sources/RowReader.cpp"/>
        <source>a row has values in several columns whose variables have one ID: that of "%1", the last one, shows</source>
        <translation>ID が同じ変数の列に複数の値がある行があります: 最後の列 "%1" の値が表示されます</translation>
    </message>
    <message>
        <location filename="../sources/SpooledBytes.cpp"/>
        <source>the data cannot be kept in a temporary file: %1</source>
        <translation>データを一時ファイルに保持できません: %1</translation>
    </message>
    <message>
        <location filename="../sources/TextEncoding.cpp"/>
        <source>the file is not UTF-16</source>
        <translation>ファイルは UTF-16 ではありません</translation>
    </message>
    <message>
        <location filename="../sources/TextEncoding.cpp"/>
        <source>the file is not Windows-1252: it contains a byte that this encoding does not use</source>
        <translation>ファイルは Windows-1252 ではありません: この文字コードで使われないバイトが含まれています</translation>
    </message>
    <message>
        <location filename="../sources/TextEncoding.cpp"/>
        <source>the file has no byte-order mark: UTF-16 with its mark was expected</source>
        <translation>ファイルにバイト順マークがありません: マーク付きの UTF-16 が必要です</translation>
    </message>
    <message>
        <location filename="../sources/ValueParser.cpp"/>
        <source>a whole number</source>
        <translation>整数</translation>
    </message>
    <message>
        <location filename="../sources/ValueParser.cpp"/>
        <source>a text</source>
        <translation>テキスト</translation>
    </message>
    <message>
        <location filename="../sources/ValueParser.cpp"/>
        <source>yes or no</source>
        <translation>yes または no の値</translation>
    </message>
    <message>
        <location filename="../sources/ValueParser.cpp"/>
        <source>a station such as 12+345.678</source>
        <translation>12+345.678 のような測点</translation>
    </message>
    <message>
        <location filename="../sources/ValueParser.cpp"/>
        <source>a number, or an offset such as 12.5R</source>
        <translation>数値、または 12.5R のようなオフセット</translation>
    </message>
    <message>
        <location filename="../sources/ValueParser.cpp"/>
        <source>a number, or ByLayer</source>
        <translation>数値、または ByLayer</translation>
    </message>
    <message>
        <location filename="../sources/ValueParser.cpp"/>
        <source>a number, or an angle such as 45°30'15"</source>
        <translation>数値、または 45°30'15" のような角度</translation>
    </message>
    <message>
        <location filename="../sources/ValueParser.cpp"/>
        <source>a number, or a bearing such as N45-30-15E</source>
        <translation>数値、または N45-30-15E のような方位</translation>
    </message>
    <message>
        <location filename="../sources/ValueParser.cpp"/>
        <source>an angle such as 45-30-15</source>
        <translation>45-30-15 のような角度</translation>
    </message>
    <message>
        <location filename="../sources/ValueParser.cpp"/>
        <source>a bearing such as 45-30-15 or N45-30-15E</source>
        <translation>45-30-15 や N45-30-15E のような方位</translation>
    </message>
    <message>
        <location filename="../sources/ValueParser.cpp"/>
        <source>a number</source>
        <translation>数値</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvPreview.cpp"/>
        <source>%1 was expected</source>
        <translation>%1 が必要です</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvPreview.cpp"/>
        <source>the row has %1 cells: %2 were expected</source>
        <translation>行に %1 個のセルがあります: %2 個が必要です</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvReader.cpp"/>
        <source>the file is not UTF-8</source>
        <translation>ファイルが UTF-8 ではありません</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvReader.cpp"/>
        <source>a delimiter was expected after the closing quote</source>
        <translation>終わりの引用符の後に区切り文字が必要です</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvReader.cpp"/>
        <source>a quote inside a cell was not expected: put the whole cell in quotes and double the quote</source>
        <translation>セルの途中に引用符は使えません: セル全体を引用符で囲み、中の引用符を 2 つ重ねる必要があります</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvReader.cpp"/>
        <source>the file contains a zero byte: a text file was expected</source>
        <translation>ファイルにヌルバイトがあります: テキストファイルが必要です</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvReader.cpp"/>
        <source>a carriage return without a line feed was not expected</source>
        <translation>改行 (LF) を伴わない復帰 (CR) は使えません</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvReader.cpp"/>
        <source>the row is longer than %1 bytes: a table of rows was expected</source>
        <translation>行が %1 バイトを超えています: 行からなる表が必要です</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvReaderCells.cpp"/>
        <source>the quoted cell has no closing quote</source>
        <translation>引用符で始まるセルに終わりの引用符がありません</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvRows.cpp"/>
        <source>the row has %1 cells: %2 were expected, as in the header row</source>
        <translation>行のセル数が %1 です: 見出し行と同じ %2 が必要です</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvRows.cpp"/>
        <source>the row has %1 cells: %2 were expected, as in all rows</source>
        <translation>行に %1 個のセルがあります: すべての行と同じ %2 個が必要です</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvRows.cpp"/>
        <source>the cell "%1" of the column "%2" does not fit: %3 was expected</source>
        <translation>列「%2」のセル「%1」が不正です: %3が必要です</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvRowsColumns.cpp"/>
        <source>"%1" is not an order of columns: each of the letters P, N, E, Z and D at most once, and - for a column that is skipped, was expected, such as PNEZD</source>
        <translation>"%1" は列の順序ではありません: 文字 P、N、E、Z、D をそれぞれ 1 回まで、読み飛ばす列には - を使い、PNEZD のように指定する必要があります</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvRowsColumns.cpp"/>
        <source>a header row of variable names was expected</source>
        <translation>変数名の見出し行が必要です</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvRowsColumns.cpp"/>
        <source>a header row was expected</source>
        <translation>見出し行が必要です</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvRowsColumns.cpp"/>
        <source>no column of the header row is a variable of the dictionary: variable names separated by the delimiter were expected</source>
        <translation>見出し行に辞書の変数がありません: 区切り文字で区切られた変数名が必要です</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvRowsColumns.cpp"/>
        <source>no column is a variable of the dictionary: without a header row, column numbers or an order such as PNEZD were expected</source>
        <translation>辞書の変数である列がありません: 見出し行がない場合は、列番号、または PNEZD のような順序が必要です</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvRowsColumns.cpp"/>
        <source>the header row holds values that fit the columns, and may be data. If it is data, set "header" to false (--no-header), and use "skip" for lines that are not data; otherwise set "header" to true</source>
        <translation>見出し行に列に合う値があり、データの可能性があります。データであれば "header" を false (--no-header) にし、データでない行には "skip" を使ってください。データでなければ "header" を true にしてください</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvRowsColumns.cpp"/>
        <source>the header row holds %1 value that fits its column, and may be data: set "header" to true if it is a header row, or to false if it is data</source>
        <translation>見出し行に列に合う値が %1 個あり、データの可能性があります: 見出し行であれば "header" を true に、データであれば false にしてください</translation>
    </message>
    <message>
        <location filename="../sources/csv/CsvRowsColumns.cpp"/>
        <source>the header row holds %1 values that fit their columns, and may be data: set "header" to true if it is a header row, or to false if it is data</source>
        <translation>見出し行に列に合う値が %1 個あり、データの可能性があります: 見出し行であれば "header" を true に、データであれば false にしてください</translation>
    </message>
    <message>
        <location filename="../sources/csv/DelimiterGuess.cpp"/>
        <source>blanks and tabs</source>
        <translation>空白とタブ</translation>
    </message>
    <message>
        <location filename="../sources/csv/DelimiterGuess.cpp"/>
        <source>the comma</source>
        <translation>コンマ</translation>
    </message>
    <message>
        <location filename="../sources/csv/DelimiterGuess.cpp"/>
        <source>the semicolon</source>
        <translation>セミコロン</translation>
    </message>
    <message>
        <location filename="../sources/csv/DelimiterGuess.cpp"/>
        <source>the tab</source>
        <translation>タブ</translation>
    </message>
    <message>
        <location filename="../sources/csv/DelimiterGuess.cpp"/>
        <source>the vertical bar</source>
        <translation>縦棒</translation>
    </message>
    <message>
        <location filename="../sources/csv/DelimiterGuess.cpp"/>
        <source>the delimiter cannot be determined: with a comma, a semicolon, a tab, a vertical bar, or blanks and tabs, the first rows do not have the same number of cells that fit their variables. Specify the delimiter</source>
        <translation>区切り文字を特定できません: コンマ、セミコロン、タブ、縦棒、空白とタブのいずれでも、最初の行のセル数が一致して変数に合うことはありません。区切り文字を指定してください</translation>
    </message>
    <message>
        <location filename="../sources/csv/DelimiterGuess.cpp"/>
        <source>with %1, in line %2: %3</source>
        <translation>%1 の場合、%2 行目: %3</translation>
    </message>
    <message>
        <location filename="../sources/csv/DelimiterGuess.cpp"/>
        <source>the delimiter cannot be determined: it may be %1. Specify the delimiter</source>
        <translation>区切り文字を特定できません: %1 の可能性があります。区切り文字を指定してください</translation>
    </message>
    <message>
        <location filename="../sources/csv/DelimiterGuess.cpp"/>
        <source> or </source>
        <comment>between two delimiters</comment>
        <translation> または </translation>
    </message>
    <message>
        <location filename="../sources/json/JsonFileRows.cpp"/>
        <source>a list of objects, or an object a line, was expected</source>
        <translation>オブジェクトの一覧、または 1 行に 1 つのオブジェクトが必要です</translation>
    </message>
    <message>
        <location filename="../sources/json/JsonFileRows.cpp"/>
        <source>a comma or the end of the list was expected</source>
        <translation>コンマ、または一覧の終わりが必要です</translation>
    </message>
    <message>
        <location filename="../sources/json/JsonFileRows.cpp"/>
        <source>the end of the line was expected: each object has a line of its own</source>
        <translation>行の終わりが必要です: 各オブジェクトはそれぞれの行に置かれます</translation>
    </message>
    <message>
        <location filename="../sources/json/JsonFileRows.cpp"/>
        <source>an object was expected</source>
        <translation>オブジェクトが必要です</translation>
    </message>
    <message>
        <location filename="../sources/json/JsonFileRows.cpp"/>
        <source>nothing was expected after the list</source>
        <translation>一覧の後には何も必要ありません</translation>
    </message>
    <message>
        <location filename="../sources/json/JsonFileRows.cpp"/>
        <source>the object is longer than %1 bytes: a list of rows was expected</source>
        <translation>オブジェクトが %1 バイトより長いです: 行の一覧が必要です</translation>
    </message>
    <message>
        <location filename="../sources/json/JsonFileValues.cpp"/>
        <source>the key "%1" occurs twice in an object</source>
        <translation>キー "%1" がオブジェクトに 2 回あります</translation>
    </message>
    <message>
        <location filename="../sources/json/JsonFileValues.cpp"/>
        <source>the variable "%1" occurs twice: each variable was expected once</source>
        <translation>変数「%1」が 2 回あります: 変数はそれぞれ 1 回だけ指定できます</translation>
    </message>
    <message>
        <location filename="../sources/json/JsonFileValues.cpp"/>
        <source>this is not JSON: %1</source>
        <translation>これは JSON ではありません: %1</translation>
    </message>
    <message>
        <location filename="../sources/json/JsonFileValues.cpp"/>
        <source>the value of "%1" does not fit: %2 was expected</source>
        <translation>「%1」の値が不正です: %2が必要です</translation>
    </message>
    <message>
        <location filename="../sources/json/JsonKeys.cpp"/>
        <source>the columns of JSON have no numbers: the name of a key was expected</source>
        <translation>JSON の列に番号はありません: キーの名前が必要です</translation>
    </message>
    <message>
        <location filename="../sources/json/JsonKeys.cpp"/>
        <source>no object has the key "%1"</source>
        <translation>キー "%1" を持つオブジェクトがありません</translation>
    </message>
    <message>
        <location filename="../sources/json/JsonKeys.cpp"/>
        <source>no key of the objects is a variable of the dictionary; the keys are: %1</source>
        <translation>辞書の変数であるキーがオブジェクトにありません。キーは次のとおりです: %1</translation>
    </message>
    <message>
        <location filename="../sources/landxml/ElementRows.cpp"/>
        <source>the tangents of the element are parallel: it has no PI</source>
        <translation>要素の接線が平行です: PIはありません</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlArc.cpp"/>
        <source>the element has no geometry: its radius does not reach from its start to its end</source>
        <translation>要素の形状を求められません: 半径が始点から終点まで届きません</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlComparison.cpp"/>
        <source>%1 is %2 in the file, but %3 by its geometry</source>
        <translation>%1 はファイルでは %2 ですが、形状からは %3 です</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlComparison.cpp"/>
        <source>the element begins %1 from the end of the element before: at %2, but that ends at %3</source>
        <translation>要素の始点が前の要素の終点から %1 離れています: 始点は %2、前の要素の終点は %3 です</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlComparison.cpp"/>
        <source>the curve has no Center, length, delta or PI that says which way round it goes: the shorter arc of its radius was taken</source>
        <translation>曲線に、回る向きを示す Center、length、delta、PI のいずれもありません: 半径の短い方の円弧としました</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlComparison.cpp"/>
        <source>the element begins at an angle of %1 to the end of the element before, with bearing %2 after %3: perhaps one of them bends to the other side</source>
        <translation>要素の始点の方向が、前の要素の終点の方向と%1だけ異なります (方向角は %3 から %2): どちらかの要素が反対側に曲がっている可能性があります</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlComparison.cpp"/>
        <source>the element begins at an angle of %1 to the end of the element before, with bearing %2 after %3</source>
        <translation>要素の始点の方向が、前の要素の終点の方向と%1だけ異なります (方向角は %3 から %2)</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlComparison.cpp"/>
        <source>PI is %1 in the file, but %2 by its geometry: %3 beside the tangents of the element, which perhaps bends to the other side</source>
        <translation>PI はファイルでは %1 ですが、幾何形状からは %2 です: 要素の接線から %3 離れており、要素は反対側に曲がっている可能性があります</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlComparison.cpp"/>
        <source>PI is %1 in the file, but the tangents of the element are parallel</source>
        <translation>PI はファイルでは %1 ですが、要素の接線は平行です</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlCurveParts.cpp"/>
        <source>the element has no geometry: a radius above zero was expected</source>
        <translation>要素の形状を求められません: 0 より大きい半径が必要です</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlCurveParts.cpp"/>
        <source>the element has no geometry: a length above zero was expected</source>
        <translation>要素の形状を求められません: 0 より大きい長さが必要です</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlCurveParts.cpp"/>
        <source>the element turns too many times</source>
        <translation>要素の周回数が多すぎます</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlCurveParts.cpp"/>
        <source>the element turns by more than 45 degrees from its tangent: its form allows less</source>
        <translation>要素が接線から 45 度を超えて離れており、この曲線形では表せません</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlCurveParts.cpp"/>
        <source>the element is curved at both ends: its form needs a straight end</source>
        <translation>要素の両端が曲がっており、この曲線形では表せません: 一方の端は直線である必要があります</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlCurveParts.cpp"/>
        <source>the element has no geometry: %1 was expected</source>
        <translation>要素の形状を求められません: %1 が必要です</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlGeometry.cpp"/>
        <source>not supported: a transition of the form "%1"</source>
        <translation>対応していません: 緩和曲線の形式「%1」</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlGeometry.cpp"/>
        <source>not supported: an element "%1" of an alignment or a border</source>
        <translation>未対応：線形または境界の要素「%1」</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlListColumns.cpp"/>
        <source>the dictionary has none of the variables of this list, which are: %1</source>
        <translation>辞書にこの一覧の変数が一つもありません。変数は次のとおりです: %1</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlListColumns.cpp"/>
        <source>the value of the variable "%1" does not fit: %2 was expected</source>
        <translation>変数「%1」の値が合いません: %2 が必要です</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlNames.cpp"/>
        <source>the file has no group of points "%1"</source>
        <translation>ファイルに点のグループ「%1」がありません</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlNames.cpp"/>
        <source>the file has no surface "%1" for this list</source>
        <translation>このリストのためのサーフェス「%1」がファイルにありません</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlNames.cpp"/>
        <source>the file has no parcel "%1"</source>
        <translation>ファイルに区画「%1」がありません</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlNames.cpp"/>
        <source>the file has no alignment "%1"</source>
        <translation>ファイルに線形「%1」がありません</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlNames.cpp"/>
        <source>the file has no grade line "%1" in the alignments that are listed</source>
        <translation>リストの線形に計画縦断線「%1」がありません</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlNames.cpp"/>
        <source>there are no names to choose from</source>
        <translation>選べる名前はありません</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlNotes.cpp"/>
        <source>and %1 more such difference</source>
        <translation>ほかに同様の相違が %1 件あります</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlNotes.cpp"/>
        <source>and %1 more such differences</source>
        <translation>ほかに同様の相違が %1 件あります</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlNotes.cpp"/>
        <source>%1: %2 in the file, which no list reads</source>
        <translation>%1: ファイルに %2 個ありますが、どの一覧も読みません</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlNotes.cpp"/>
        <source>elements of other kinds: %1 in the file, which no list reads</source>
        <translation>その他の種類の要素: ファイルに %1 個ありますが、どの一覧も読みません</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlProfile.cpp"/>
        <source>the grade line has fewer than two points</source>
        <translation>計画縦断線の点が 2 点未満です</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlProfile.cpp"/>
        <source>the grade line has no heights: a length or a radius above zero was expected</source>
        <translation>計画縦断線の高さを求められません: 0 より大きい長さか半径が必要です</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlProfile.cpp"/>
        <source>the grade line has no heights: a station ahead of that of the point before was expected</source>
        <translation>計画縦断線の高さを求められません: 測点は前の点より先である必要があります</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlProfile.cpp"/>
        <source>the first or the last point of the grade line has a curve, where only one grade meets</source>
        <translation>計画縦断線の最初か最後の点に縦断曲線がありますが、そこには勾配が一つしかありません</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlProfile.cpp"/>
        <source>the vertical curve begins before the curve of the point before has ended</source>
        <translation>縦断曲線が前の点の曲線の終わりより手前で始まっています</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlReader.cpp"/>
        <source>the element holds more than %1 bytes of text</source>
        <translation>要素のテキストが %1 バイトを超えています</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlReader.cpp"/>
        <source>the file has too many elements without content</source>
        <translation>内容のない要素が多すぎます</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlReaderAttributes.cpp"/>
        <source>not supported: coordinates of a cross section that lies at a skew to its alignment</source>
        <translation>未対応：線形に対して斜めの横断面の座標</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlReaderAttributes.cpp"/>
        <source>the attribute %1 was expected</source>
        <translation>属性 %1 が必要です</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlReaderNumbers.cpp"/>
        <source>the attribute %1="%2" does not fit: a number was expected</source>
        <translation>属性 %1="%2" が合いません: 数値が必要です</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlReaderNumbers.cpp"/>
        <source>the attribute %1="%2" does not fit: an angle in the file's unit was expected</source>
        <translation>属性 %1="%2" が合いません: ファイルの単位の角度が必要です</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlReaderText.cpp"/>
        <source>"%1" does not fit: a number was expected</source>
        <translation>「%1」が合いません: 数値が必要です</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlReaderText.cpp"/>
        <source>signs are separated from their numbers by blanks, and were taken with them</source>
        <translation>符号と数値の間に空白があります。続く数値の符号とみなしました</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlReaderText.cpp"/>
        <source>the coordinates "%1" do not fit: northing, easting and perhaps a height were expected</source>
        <translation>座標「%1」が合いません: 北距、東距、および必要なら標高が必要です</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlReaderText.cpp"/>
        <source>"%1" does not fit: two numbers were expected</source>
        <translation>「%1」が合いません: 2 つの数値が必要です</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlReaderText.cpp"/>
        <source>the list of numbers ends in the middle of a point, which was left out</source>
        <translation>数値の並びが点の途中で終わっています。この点は除きました</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlReferences.cpp"/>
        <source>the coordinates of the point "%1" cannot be read</source>
        <translation>点「%1」の座標を読み取れません</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlReferences.cpp"/>
        <source>the point "%1" is not in the file</source>
        <translation>点「%1」がファイルにありません</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlReferences.cpp"/>
        <source>several points have the name "%1" that is referred to: the first one was taken</source>
        <translation>参照先の名前「%1」の点が複数あります: 最初の点を使いました</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlRouteMaker.cpp"/>
        <source>the alignment has no staStart: its stations count from 0</source>
        <translation>線形にstaStartがありません: 測点は0から数えます</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlRouteMaker.cpp"/>
        <source>the element has no length and was left out</source>
        <translation>要素に長さがないため除きました</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlRouteMaker.cpp"/>
        <source>the elements turn too many times</source>
        <translation>要素の周回数の合計が多すぎます</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlRouteMaker.cpp"/>
        <source>the station equation is before the start or not ahead of the equation before it, or has no numbers: staInternal or staBack, and staAhead were expected</source>
        <translation>測点のブレーキが始点より手前か、前のブレーキより先にないか、数値がありません: staInternal または staBack と、staAhead が必要です</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlRouteMaker.cpp"/>
        <source>the station equation is after the end of the alignment, where no station counts by it</source>
        <translation>測点のブレーキが線形の終点より後にあり、どの測点にも使われません</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlRouteMaker.cpp"/>
        <source>the stations of the surface "%1" do not ascend: no heights are taken from it</source>
        <translation>サーフェス「%1」の測点が昇順ではありません: この高さは使いません</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlRows.cpp"/>
        <source>the file is of version %1: versions 1.0 to 2.0 are known</source>
        <translation>ファイルはバージョン %1 です: 対応しているのはバージョン 1.0 から 2.0 です</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlRows.cpp"/>
        <source>elevationUnit is "%1": heights are taken to be in the unit of lengths</source>
        <translation>elevationUnit は「%1」です：高さは長さの単位とみなします</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlRowsAlignments.cpp"/>
        <source>the alignment has %1 grade lines: the first one, "%2", was taken, as the job names none</source>
        <translation>線形に計画縦断線が %1 本あります: ジョブに指定がないため、最初の「%2」を使いました</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlRowsAlignments.cpp"/>
        <source>several grade lines of the alignment have the name "%1": the first one was taken</source>
        <translation>線形の複数の計画縦断線に「%1」という名前があります: 最初のものを使いました</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlRowsAlignments.cpp"/>
        <source>the alignment has %1 surfaces: the first one, "%2", was taken, as the job names none</source>
        <translation>線形にサーフェスが %1 個あります: ジョブに指定がないため、最初の「%2」を使いました</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlRowsAlignments.cpp"/>
        <source>several surfaces of the alignment have the name "%1": the first one was taken</source>
        <translation>線形の複数のサーフェスに「%1」という名前があります: 最初のものを使いました</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlUnits.cpp"/>
        <source>the file has no units: Metric or Imperial in Units was expected</source>
        <translation>ファイルに単位がありません: Units の中に Metric または Imperial が必要です</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlUnits.cpp"/>
        <source>the outermost element is "%1": LandXML was expected</source>
        <translation>最も外側の要素が「%1」です: LandXML が必要です</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlUnits.cpp"/>
        <source>the unit %1="%2" is not known</source>
        <translation>単位 %1="%2" は不明です</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlWidths.cpp"/>
        <source>the width is left out: staStart, a larger staEnd, startWidth and endWidth were expected</source>
        <translation>幅員は省かれます: staStart、それより大きい staEnd、startWidth、endWidth が必要です</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlWidths.cpp"/>
        <source>the widths belong to the alignment "%1", which is not in the file</source>
        <translation>幅員は線形「%1」のものですが、その線形はファイルにありません</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlWidths.cpp"/>
        <source>the alignment "%1" has %2 more grade surface, whose widths are not listed</source>
        <translation>線形「%1」にはほかに %2 個の計画面があり、その幅員は表示されません</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlWidths.cpp"/>
        <source>the alignment "%1" has %2 more grade surfaces, whose widths are not listed</source>
        <translation>線形「%1」にはほかに %2 個の計画面があり、それらの幅員は表示されません</translation>
    </message>
    <message>
        <location filename="../sources/landxml/LandXmlWidths.cpp"/>
        <source>the alignment has too many zones: the widths of the last ones are not listed</source>
        <translation>線形のゾーンが多すぎます: 最後のゾーンの幅員は表示されません</translation>
    </message>
    <message>
        <location filename="../sources/landxml/ParcelRows.cpp"/>
        <source>the border of the parcel does not close: there is a gap of %1 metres</source>
        <translation>区画の境界が閉じていません: %1 メートルの隙間があります</translation>
    </message>
    <message>
        <location filename="../sources/landxml/PointRows.cpp"/>
        <source>several points have the name "%1"</source>
        <translation>名前「%1」の点が複数あります</translation>
    </message>
    <message>
        <location filename="../sources/landxml/ProfileRows.cpp"/>
        <source>high point</source>
        <translation>最高点</translation>
    </message>
    <message>
        <location filename="../sources/landxml/ProfileRows.cpp"/>
        <source>low point</source>
        <translation>最低点</translation>
    </message>
    <message>
        <location filename="../sources/landxml/ProjectedRows.cpp"/>
        <source>the file has several alignments: the name of one was expected</source>
        <translation>ファイルに線形が複数あります: いずれかの名前が必要です</translation>
    </message>
    <message>
        <location filename="../sources/landxml/ProjectedRows.cpp"/>
        <source>several alignments have the name "%1": the first one was taken</source>
        <translation>複数の線形に名前「%1」があります: 最初のものを使いました</translation>
    </message>
    <message>
        <location filename="../sources/landxml/ProjectedRows.cpp"/>
        <source>the file has no alignment</source>
        <translation>ファイルに線形がありません</translation>
    </message>
    <message>
        <location filename="../sources/landxml/ProjectedRows.cpp"/>
        <source>the alignment has no elements</source>
        <translation>線形に要素がありません</translation>
    </message>
    <message>
        <location filename="../sources/landxml/ProjectedRows.cpp"/>
        <source>too far away</source>
        <translation>遠すぎます</translation>
    </message>
    <message>
        <location filename="../sources/landxml/ProjectedRows.cpp"/>
        <source>outside of a corner</source>
        <translation>折れ点の外側</translation>
    </message>
    <message>
        <location filename="../sources/landxml/ProjectedRows.cpp"/>
        <source>before the start</source>
        <translation>始点より手前</translation>
    </message>
    <message>
        <location filename="../sources/landxml/ProjectedRows.cpp"/>
        <source>after the end</source>
        <translation>終点より先</translation>
    </message>
    <message>
        <location filename="../sources/landxml/ProjectedRows.cpp"/>
        <source>at a centre</source>
        <translation>中心点</translation>
    </message>
    <message>
        <location filename="../sources/landxml/SectionRows.cpp"/>
        <source>the cross section is before the start or after the end of the alignment: its points have no coordinates</source>
        <translation>横断面が線形の始点より前か終点より後にあります: 点の座標はありません</translation>
    </message>
    <message>
        <location filename="../sources/landxml/StationPlaces.cpp"/>
        <source>the alignment has no station %1</source>
        <translation>線形に測点 %1 がありません</translation>
    </message>
    <message>
        <location filename="../sources/landxml/StationPlaces.cpp"/>
        <source>the alignment has the station %1 at several places</source>
        <translation>線形の複数の箇所に測点 %1 があります</translation>
    </message>
    <message>
        <location filename="../sources/landxml/StationRowsLoad.cpp"/>
        <source>the alignment has no elements, and therefore no stations</source>
        <translation>線形に要素がないため、測点がありません</translation>
    </message>
    <message>
        <location filename="../sources/landxml/StationRowsLoad.cpp"/>
        <source>the interval gives more than %1 stations</source>
        <translation>この間隔では測点が %1 を超えます</translation>
    </message>
    <message>
        <location filename="../sources/landxml/StationRowsLoad.cpp"/>
        <source>the line at the offset %1 does not run forward here: the radius of the element is %2</source>
        <translation>オフセット %1 の線はここで前方に進みません: 要素の半径は %2 です</translation>
    </message>
    <message>
        <location filename="../sources/landxml/XmlStream.cpp"/>
        <source>the tag has more than %1 bytes</source>
        <translation>タグが %1 バイトを超えています</translation>
    </message>
    <message>
        <location filename="../sources/landxml/XmlStream.cpp"/>
        <source>the file is not well-formed XML: %1</source>
        <translation>ファイルは整形式の XML ではありません: %1</translation>
    </message>
    <message>
        <location filename="../sources/landxml/XmlStream.cpp"/>
        <source>the encoding of the file is not known: UTF-8, UTF-16, ISO-8859-1, US-ASCII or windows-1252 was expected</source>
        <translation>ファイルの文字コードが不明です: UTF-8、UTF-16、ISO-8859-1、US-ASCII、windows-1252 のいずれかが必要です</translation>
    </message>
    <message>
        <location filename="../sources/landxml/XmlStream.cpp"/>
        <source>the elements are nested more than %1 deep</source>
        <translation>要素の入れ子が %1 段を超えています</translation>
    </message>
    <message>
        <location filename="../sources/landxml/XmlStreamCallbacks.h"/>
        <source>the document type is in another file, "%1", which is not read: a file without an external document type was expected</source>
        <translation>文書型が別のファイル「%1」にあり、これは読み込みません: 外部の文書型を使わないファイルが必要です</translation>
    </message>
    <message>
        <location filename="../sources/landxml/XmlStreamCallbacks.h"/>
        <source>the file declares the entity "%1": a file without entities was expected</source>
        <translation>ファイルが実体「%1」を宣言しています: 実体のないファイルが必要です</translation>
    </message>
    <message>
        <location filename="../sources/landxml/XmlStreamCallbacks.h"/>
        <source>the entity "%1" is not known</source>
        <translation>実体「%1」は不明です</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresColumns.cpp"/>
        <source>the columns "%1" and "%2" both have geometries: a query with one of them was expected</source>
        <translation>列 "%1" と "%2" の両方にジオメトリがあります: そのうち 1 つだけを含むクエリが必要です</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresColumns.cpp"/>
        <source>%1 bytes</source>
        <translation>%1 バイト</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresConnection.cpp"/>
        <source>the library libpq cannot be loaded: the package libpq5 was expected</source>
        <translation>ライブラリ libpq を読み込めません: パッケージ libpq5 が必要です</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresConnection.cpp"/>
        <source>this is not a connection: %1. Words such as service=survey, host=..., port=..., dbname=... and user=... were expected</source>
        <translation>これは接続ではありません: %1。service=survey、host=...、port=...、dbname=...、user=... のような語が必要です</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresConnection.cpp"/>
        <source>a connection cannot contain "%1": remove it, and put the password into your password file (~/.pgpass) or into PGPASSWORD</source>
        <translation>接続に "%1" を含めることはできません: 削除して、パスワードはご自分のパスワードファイル (~/.pgpass) または PGPASSWORD に設定してください</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresConnection.cpp"/>
        <source>the server does not answer</source>
        <translation>サーバーが応答しません</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresConnection.cpp"/>
        <source>the server asks for a password: it was expected in the user's own password file (~/.pgpass) or in PGPASSWORD</source>
        <translation>サーバーがパスワードを求めています: ユーザー自身のパスワードファイル (~/.pgpass) または PGPASSWORD に必要です</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresConnection.cpp"/>
        <source>the server cannot be connected to: %1</source>
        <translation>サーバーに接続できません: %1</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresConnection.cpp"/>
        <source>the connection to the server is lost: %1</source>
        <translation>サーバーとの接続が失われました: %1</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresConnection.cpp"/>
        <source>the database does not answer the query: %1</source>
        <translation>データベースがクエリに応答しません: %1</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresPreview.cpp"/>
        <source>(bytes)</source>
        <translation>(バイト列)</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresPreview.cpp"/>
        <source>there is %1: a point was expected</source>
        <translation>%1 があります: 点が必要です</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresPreview.cpp"/>
        <source>row %1: </source>
        <translation>行 %1: </translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresResult.cpp"/>
        <source>(character %1 of the query)</source>
        <translation>(クエリの %1 文字目)</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresRows.cpp"/>
        <source>a point was expected instead of %1</source>
        <translation>点が必要ですが、%1 があります</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresRowsColumns.cpp"/>
        <source>the query has %1 parameters: values of %2 are given</source>
        <translation>クエリにはパラメーターが %1 個あります: 与えられた値は %2 個です</translation>
    </message>
    <message>
        <location filename="../sources/postgresql/PostgresRowsColumns.cpp"/>
        <source>the query is not a single SELECT, which was expected</source>
        <translation>クエリは単一の SELECT ではありません。単一の SELECT が必要です</translation>
    </message>
    <message>
        <location filename="../sources/sqlite/SqliteColumns.cpp"/>
        <source>the database has no tables: the table "%1" was expected</source>
        <translation>データベースに表がありません: 表 "%1" が必要です</translation>
    </message>
    <message>
        <location filename="../sources/sqlite/SqliteColumns.cpp"/>
        <source>the database has no table "%1"</source>
        <translation>データベースに表 "%1" はありません</translation>
    </message>
    <message>
        <location filename="../sources/sqlite/SqliteFile.cpp"/>
        <source>a database file was expected, not a folder or a device</source>
        <translation>フォルダーやデバイスではなく、データベースファイルが必要です</translation>
    </message>
    <message>
        <location filename="../sources/sqlite/SqliteFile.cpp"/>
        <source>the query has parameters: values were expected in their places</source>
        <translation>クエリにパラメーターがあります: その場所には値が必要です</translation>
    </message>
    <message>
        <location filename="../sources/sqlite/SqliteFile.cpp"/>
        <source>the database is locked: another program writes to it</source>
        <translation>データベースはロックされています: 別のプログラムが書き込み中です</translation>
    </message>
    <message>
        <location filename="../sources/sqlite/SqliteFile.cpp"/>
        <source>the file is not a SQLite database, or it is encrypted</source>
        <translation>ファイルは SQLite データベースではないか、暗号化されています</translation>
    </message>
    <message>
        <location filename="../sources/sqlite/SqliteFile.cpp"/>
        <source>the database is broken: %1</source>
        <translation>データベースが壊れています: %1</translation>
    </message>
    <message>
        <location filename="../sources/sqlite/SqliteFile.cpp"/>
        <source>a program that wrote to the database did not finish its work: open the database with that program first</source>
        <translation>データベースに書き込んでいたプログラムが作業を終えていません: 先にそのプログラムでデータベースを開いてください</translation>
    </message>
    <message>
        <location filename="../sources/sqlite/SqliteFile.cpp"/>
        <source>the database cannot be opened: %1</source>
        <translation>データベースを開けません: %1</translation>
    </message>
    <message>
        <location filename="../sources/sqlite/SqliteFile.cpp"/>
        <source>the database cannot be read: %1</source>
        <translation>データベースを読み取れません: %1</translation>
    </message>
    <message>
        <location filename="../sources/sqlite/SqliteFile.cpp"/>
        <source>reading was stopped</source>
        <translation>読み取りは中止されました</translation>
    </message>
    <message>
        <location filename="../sources/sqlite/SqliteFile.cpp"/>
        <source>the database was changed while it was read, by a program that does not use SQLite</source>
        <translation>読み取り中に、SQLite を使わないプログラムによってデータベースが変更されました</translation>
    </message>
    <message>
        <location filename="../exports/CsvResult.cpp"/>
        <source>%1 texts begin with = or @: a spreadsheet program that opens the file takes them for formulas</source>
        <translation>%1 個のテキストが = または @ で始まります。ファイルを開く表計算プログラムはこれを数式とみなします</translation>
    </message>
    <message>
        <location filename="../exports/XlsxBook.cpp"/>
        <source>the workbook could not be put together: %1</source>
        <translation>ブックを組み立てられませんでした: %1</translation>
    </message>
    <message>
        <location filename="../exports/XlsxResult.cpp"/>
        <source>%1 texts are longer than a cell of a workbook holds, and are cut</source>
        <translation>%1 個のテキストはブックのセルに収まらないため、切り詰められました</translation>
    </message>
    <message>
        <location filename="../exports/XlsxResult.cpp"/>
        <source>%1 columns are more than a sheet of a workbook holds, and are left out</source>
        <translation>ブックのシートに入らない %1 列は省かれます</translation>
    </message>
    <message>
        <location filename="../exports/XlsxResult.cpp"/>
        <source>%1 totals are values: a formula would show other digits, or does not reach their rows</source>
        <translation>%1 個の合計は値です。数式では別の数字になるか、その行に届きません</translation>
    </message>
    <message>
        <location filename="../exports/XlsxResult.cpp"/>
        <source>Lengths in %1, areas in %2, angles in %3</source>
        <translation>長さ: %1、面積: %2、角度: %3</translation>
    </message>
    <message>
        <location filename="../jobs/ColumnChoices.cpp"/>
        <source>the name of a column, or its number from 1, was expected</source>
        <translation>列の名前、または 1 から始まる番号が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/ColumnChoices.cpp"/>
        <source>a text without a zero character was expected</source>
        <translation>文字 0 を含まない文字列が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/ColumnNotes.cpp"/>
        <source>the column "%1" is not a variable of the dictionary "%2"</source>
        <translation>列「%1」は辞書「%2」の変数ではありません</translation>
    </message>
    <message>
        <location filename="../jobs/ColumnNotes.cpp"/>
        <source>%1 more column is not a variable of the dictionary "%2"</source>
        <translation>さらに %1 列が辞書 "%2" の変数ではありません</translation>
    </message>
    <message>
        <location filename="../jobs/ColumnNotes.cpp"/>
        <source>%1 more columns are not variables of the dictionary "%2"</source>
        <translation>さらに %1 列が辞書 "%2" の変数ではありません</translation>
    </message>
    <message>
        <location filename="../jobs/ConditionBinding.cpp"/>
        <source>the variable "%1" does not hold numbers: a numeric variable was expected</source>
        <translation>変数「%1」の値は数値ではありません: 数値の変数が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/ConditionBinding.cpp"/>
        <source>a tolerance of 0 or more was expected</source>
        <translation>0 以上の許容差が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/ConditionBinding.cpp"/>
        <source>a number was expected: nothing is above or below NAN</source>
        <translation>数値が必要です。NAN より上や下のものはありません</translation>
    </message>
    <message>
        <location filename="../jobs/ConditionBinding.cpp"/>
        <source>"%1" and "%2" cannot be compared: they have different units</source>
        <translation>「%1」と「%2」は比較できません: 単位が異なります</translation>
    </message>
    <message>
        <location filename="../jobs/CsvData.cpp"/>
        <source>a row was expected after the header row: a block shows the first one</source>
        <translation>見出し行の後に行が必要です: ブロックは最初の行を表示します</translation>
    </message>
    <message>
        <location filename="../jobs/CsvData.cpp"/>
        <source>a row was expected: a block shows the first one</source>
        <translation>行が必要です: ブロックは最初の行を表示します</translation>
    </message>
    <message>
        <location filename="../jobs/CsvOptions.cpp"/>
        <source>the character is that of "%1": another one was expected</source>
        <translation>この文字は "%1" の文字です: 別の文字が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/CsvOptions.cpp"/>
        <source>the names of the columns in their order were expected</source>
        <translation>列の名前を順に並べたものが必要です</translation>
    </message>
    <message>
        <location filename="../jobs/CsvOptions.cpp"/>
        <source>one character was expected, other than a digit, a letter, a sign, a quote, a line end or the decimal sign</source>
        <translation>数字、英字、符号、引用符、改行、小数点以外の 1 文字が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/CsvOptions.cpp"/>
        <source>one ASCII character was expected, other than a letter, a digit, a sign, a quote or a line end, or one of the words %1</source>
        <translation>英字、数字、符号、引用符、改行以外の ASCII 文字 1 つ、または次のいずれかの語が必要です: %1</translation>
    </message>
    <message>
        <location filename="../jobs/CsvOptions.cpp"/>
        <source>an order of columns such as PNEZD was expected: each of the letters P, N, E, Z and D at most once, and - for a column that is skipped</source>
        <translation>PNEZD のような列の順序が必要です: P、N、E、Z、D はそれぞれ 1 回まで、- は読み飛ばす列</translation>
    </message>
    <message>
        <location filename="../jobs/CsvOptions.cpp"/>
        <source>the columns have names already: either an order or a list of columns was expected</source>
        <translation>列にはすでに名前があります: 順序か列のリストのどちらか一方が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/CsvOptions.cpp"/>
        <source>one ASCII character was expected, other than a letter, a digit, a sign, a quote or a line end</source>
        <translation>英字、数字、符号、引用符、改行以外の ASCII 文字 1 つが必要です</translation>
    </message>
    <message>
        <location filename="../jobs/DataFiles.cpp"/>
        <source>the data file "%1" cannot be read: %2</source>
        <translation>データファイル「%1」を読み込めません: %2</translation>
    </message>
    <message>
        <location filename="../jobs/DataKind.cpp"/>
        <source>Reading %1</source>
        <translation>読み込み中: %1</translation>
    </message>
    <message>
        <location filename="../jobs/FormulaBinding.cpp"/>
        <source>the variable "%1" does not fit the result: a variable of the same measure was expected, such as a length for lengths</source>
        <translation>変数「%1」は結果に合いません: 同じ種類の量の変数が必要です (長さには長さなど)</translation>
    </message>
    <message>
        <location filename="../jobs/FormulaBinding.cpp"/>
        <source>a variable cannot be computed from itself: another variable was expected</source>
        <translation>変数をそれ自身から計算することはできません: 別の変数が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/FormulaBinding.cpp"/>
        <source>the variables cannot be combined: variables of the same measure were expected, such as lengths, or for a product two lengths or a number and another variable</source>
        <translation>変数を組み合わせることができません: 同じ種類の量 (長さなど) の変数、積の場合は二つの長さ、または数値と別の変数が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/GroupBinding.cpp"/>
        <source>"rounding" was expected only with totals</source>
        <translation>"rounding" は集計と一緒にだけ使えます</translation>
    </message>
    <message>
        <location filename="../jobs/GroupBinding.cpp"/>
        <source>groups by %1 need rows that are sorted by them first</source>
        <translation>%1 によるグループには、まずその順に並んだ行が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/GroupBinding.cpp"/>
        <source>the key "sort" was expected in the step</source>
        <translation>ステップにキー "sort" が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/GroupBinding.cpp"/>
        <source>they are sorted by %1</source>
        <translation>行は %1 の順に並んでいます</translation>
    </message>
    <message>
        <location filename="../jobs/GroupBinding.cpp"/>
        <source>values of the variable "%1" cannot be added up: a number, a length, an area or an angle was expected, or "count"</source>
        <translation>変数「%1」の値は合計できません: 数値、長さ、面積、角度、または "count" が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/GroupBinding.cpp"/>
        <source>the table "%1" has no column "%2" for a total</source>
        <translation>表「%1」には合計を置く列「%2」がありません</translation>
    </message>
    <message>
        <location filename="../jobs/GroupBinding.cpp"/>
        <source>the column "%1" has a total already: another line was expected for a second one</source>
        <translation>列「%1」にはすでに合計があります: 二つ目には別の行が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JobData.cpp"/>
        <source>the data "%1" has no row: a block shows the first one</source>
        <translation>データ「%1」に行がありません: ブロックには最初の行が表示されます</translation>
    </message>
    <message>
        <location filename="../jobs/JobDataReader.cpp"/>
        <source>one of the keys %1 was expected</source>
        <translation>キー %1 のいずれかが必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JobDataReader.cpp"/>
        <source>only one of the keys %1 was expected</source>
        <translation>キー %1 のうち 1 つだけが必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JobDataReader.cpp"/>
        <source>standard input is the job itself: a file was expected</source>
        <translation>標準入力はジョブそのものです: ファイルが必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JobFileName.cpp"/>
        <source>a file name without a character 0 was expected</source>
        <translation>文字コード 0 を含まないファイル名が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JobFiles.cpp"/>
        <source>"%1" is the job itself: another file was expected</source>
        <translation>"%1" はジョブそのものです: 別のファイルが必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JobFiles.cpp"/>
        <source>"%1" is the template of the job: another file was expected</source>
        <translation>"%1" はジョブのテンプレートです: 別のファイルが必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JobFiles.cpp"/>
        <source>"%1" is data of the job: another file was expected</source>
        <translation>"%1" はジョブのデータです: 別のファイルが必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JobFiles.cpp"/>
        <source>"%1" is the file of the output "%2" already: another file was expected</source>
        <translation>"%1" はすでに出力 "%2" のファイルです: 別のファイルが必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JobList.cpp"/>
        <source>standard input cannot be read: %1</source>
        <translation>標準入力を読み込めません: %1</translation>
    </message>
    <message>
        <location filename="../jobs/JobList.cpp"/>
        <source>the list of jobs cannot be read: %1</source>
        <translation>ジョブの一覧を読み込めません: %1</translation>
    </message>
    <message>
        <location filename="../jobs/JobList.cpp"/>
        <source>the list of jobs contains both line breaks and NUL characters: either one name per line or a NUL character after each name was expected</source>
        <translation>ジョブの一覧に改行と NUL 文字が混在しています: 1 行に 1 つの名前、または各名前の後に NUL 文字が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JobOutputs.cpp"/>
        <source>"%1" was not written: it would have more than %2</source>
        <translation>"%1" は書き込まれませんでした: %2 を超えます</translation>
    </message>
    <message>
        <location filename="../jobs/JobOutputs.cpp"/>
        <source>"%1" could not be written: %2</source>
        <translation>「%1」に書き込めませんでした: %2</translation>
    </message>
    <message>
        <location filename="../jobs/JobOutputs.cpp"/>
        <source>the report could not be written to standard output: %1</source>
        <translation>帳票を標準出力に書き込めませんでした: %1</translation>
    </message>
    <message>
        <location filename="../jobs/JobOutputs.cpp"/>
        <source>the report begins as rich text, but %1 (line %2, column %3)</source>
        <translation>帳票はリッチテキストで始まっていますが、エラーがあります: %1 (%2 行 %3 桁)</translation>
    </message>
    <message>
        <location filename="../jobs/JobPdfReader.cpp"/>
        <source>a language such as de or en-GB was expected</source>
        <translation>de や en-GB のような言語が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JobReader.cpp"/>
        <source>a list of four margins (left, top, right, bottom) was expected</source>
        <translation>4 つの余白 (左、上、右、下) のリストが必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JobReader.cpp"/>
        <source>a character code or a text of one character was expected</source>
        <translation>文字コードまたは 1 文字のテキストが必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JobReader.cpp"/>
        <source>the key "file" was expected</source>
        <translation>キー "file" が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JobReader.cpp"/>
        <source>the ending of "%1" does not say the kind: the key "as" with one of %2 was expected</source>
        <translation>「%1」の拡張子からは種類がわかりません: キー "as" に次のいずれかを指定する必要があります: %2</translation>
    </message>
    <message>
        <location filename="../jobs/JobReader.cpp"/>
        <source>a date and time such as 2024-03-05T14:07:00 was expected</source>
        <translation>2024-03-05T14:07:00 のような日時が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JobReader.cpp"/>
        <source>the key "%1" with a text was expected</source>
        <translation>テキストを値とするキー "%1" が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JobReader.cpp"/>
        <source>a text that begins with "%1" was expected</source>
        <translation>「%1」で始まるテキストが必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JobRunner.cpp"/>
        <source>the margins leave no room on the page: smaller margins or a smaller font were expected</source>
        <translation>余白が大きく、ページに印字できる範囲がありません: 余白またはフォントを小さくする必要があります</translation>
    </message>
    <message>
        <location filename="../jobs/JobRunner.cpp"/>
        <source>there is no template file "%1"</source>
        <translation>テンプレートファイル「%1」がありません</translation>
    </message>
    <message>
        <location filename="../jobs/JobSaving.cpp"/>
        <source>the file could not be written: %1</source>
        <translation>ファイルに書き込めませんでした: %1</translation>
    </message>
    <message>
        <location filename="../jobs/JobSettings.cpp"/>
        <source>a list of three texts was expected</source>
        <translation>3 つのテキストのリストが必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JobSettings.cpp"/>
        <source>one character with a code up to 255, or an empty text, was expected</source>
        <translation>文字コード 255 以下の 1 文字または空のテキストが必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JobStepNotes.cpp"/>
        <source>the data "%1" does not say the unit of its numbers: %2 was taken</source>
        <translation>データ「%1」は数値の単位を示していません: %2 とみなしました</translation>
    </message>
    <message>
        <location filename="../jobs/JobStepNotes.cpp"/>
        <source>the field "%1" of the %2 "%3" is not a variable of the dictionary "%4"</source>
        <translation>%2「%3」の項目「%1」は辞書「%4」の変数ではありません</translation>
    </message>
    <message>
        <location filename="../jobs/JobStepNotes.cpp"/>
        <source>no column fills the field "%1" of the %2 "%3"</source>
        <translation>%2「%3」の項目「%1」に対応する列がありません</translation>
    </message>
    <message>
        <location filename="../jobs/JobStepNotes.cpp"/>
        <source>"%1" has the same ID and shows there</source>
        <translation>"%1" が同じ ID を持ち、そこに表示されます</translation>
    </message>
    <message>
        <location filename="../jobs/JobStepNotes.cpp"/>
        <source>the sort key "%1" of the table "%2" is not a variable of the dictionary "%3"</source>
        <translation>表 "%2" の並べ替えキー "%1" は辞書 "%3" の変数ではありません</translation>
    </message>
    <message>
        <location filename="../jobs/JobSteps.cpp"/>
        <source>block</source>
        <translation>ブロック</translation>
    </message>
    <message>
        <location filename="../jobs/JobSteps.cpp"/>
        <source>the template has no %1 named "%2": %3</source>
        <translation>テンプレートに "%2" という名前の%1がありません: %3</translation>
    </message>
    <message>
        <location filename="../jobs/JobSteps.cpp"/>
        <source>the %1 "%2" cannot be written: the template has no dictionary named "%3"</source>
        <translation>%1「%2」は出力できません: テンプレートに「%3」という名前の辞書がありません</translation>
    </message>
    <message>
        <location filename="../jobs/JobSteps.cpp"/>
        <source>the %1 "%2" cannot be written: the format of its field "%3" is beyond %4 characters</source>
        <translation>%1「%2」は出力できません: フィールド「%3」の書式が %4 文字を超えています</translation>
    </message>
    <message>
        <location filename="../jobs/JobStepsReader.cpp"/>
        <source>true was expected</source>
        <translation>true が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JobStepsReader.cpp"/>
        <source>a step was expected: one of heading, line, lineFeed, newPage, block, table, clear</source>
        <translation>heading, line, lineFeed, newPage, block, table, clear のいずれかのステップが必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JobStepsReader.cpp"/>
        <source>a "%1" needs a template: the key "template" was expected in the job</source>
        <translation>"%1" にはテンプレートが必要です: ジョブにキー "template" が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JobStepsReader.cpp"/>
        <source>the key "data" with the name of a data set was expected</source>
        <translation>データセット名を値とするキー "data" が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JobStepsReader.cpp"/>
        <source>there is no data set named "%1" in the job: %2</source>
        <translation>ジョブに "%1" という名前のデータセットがありません: %2</translation>
    </message>
    <message>
        <location filename="../jobs/JobStepsReader.cpp"/>
        <source>the key "report" with a list of steps was expected</source>
        <translation>ステップのリストを値とするキー "report" が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JobTableStep.cpp"/>
        <source>table</source>
        <translation>表</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 value is wider than the field "%2" of the %3 "%4", in row %5, line %6 of the report</source>
        <translation>%3 "%4" のフィールド "%2" より幅の広い値が %1 個あります。データの %5 行目、レポートの %6 行目です</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 values are wider than the field "%2" of the %3 "%4", the first one in row %5, line %6 of the report</source>
        <translation>%3 "%4" のフィールド "%2" より幅の広い値が %1 個あります。最初はデータの %5 行目、レポートの %6 行目です</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 value is wider than the field "%2" of the %3 "%4" and shows as #, in row %5, line %6 of the report</source>
        <translation>%3 "%4" のフィールド "%2" より幅の広い値が %1 個あり、# で表示されます。データの %5 行目、レポートの %6 行目です</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 values are wider than the field "%2" of the %3 "%4" and show as #, the first one in row %5, line %6 of the report</source>
        <translation>%3 "%4" のフィールド "%2" より幅の広い値が %1 個あり、# で表示されます。最初はデータの %5 行目、レポートの %6 行目です</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 total is wider than the field "%2" of the %3 "%4", under row %5, line %6 of the report</source>
        <translation>%3 "%4" のフィールド "%2" より幅の広い合計が %1 個あります。データの %5 行目の下、レポートの %6 行目です</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 totals are wider than the field "%2" of the %3 "%4", the first one under row %5, line %6 of the report</source>
        <translation>%3 "%4" のフィールド "%2" より幅の広い合計が %1 個あります。最初はデータの %5 行目の下、レポートの %6 行目です</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 total is wider than the field "%2" of the %3 "%4" and shows as #, under row %5, line %6 of the report</source>
        <translation>%3 "%4" のフィールド "%2" より幅の広い合計が %1 個あり、# で表示されます。データの %5 行目の下、レポートの %6 行目です</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 totals are wider than the field "%2" of the %3 "%4" and show as #, the first one under row %5, line %6 of the report</source>
        <translation>%3 "%4" のフィールド "%2" より幅の広い合計が %1 個あり、# で表示されます。最初はデータの %5 行目の下、レポートの %6 行目です</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 value of the field "%2" of the %3 "%4" is infinite or not a number, in row %5, line %6 of the report</source>
        <translation>%3 "%4" のフィールド "%2" の値 %1 個が無限大または非数です。データの %5 行目、レポートの %6 行目です</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 values of the field "%2" of the %3 "%4" are infinite or not a number, the first one in row %5, line %6 of the report</source>
        <translation>%3 "%4" のフィールド "%2" の値 %1 個が無限大または非数です。最初はデータの %5 行目、レポートの %6 行目です</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 value of the field "%2" of the %3 "%4" is missing and shows as 0, in row %5, line %6 of the report</source>
        <translation>%3 "%4" のフィールド "%2" の値が %1 個なく、0 と表示されます。データの %5 行目、レポートの %6 行目です</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 values of the field "%2" of the %3 "%4" are missing and show as 0, the first one in row %5, line %6 of the report</source>
        <translation>%3 "%4" のフィールド "%2" の値が %1 個なく、0 と表示されます。最初はデータの %5 行目、レポートの %6 行目です</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 value of the field "%2" of the %3 "%4" is missing and shows as blanks, in row %5, line %6 of the report</source>
        <translation>%3 "%4" のフィールド "%2" の値が %1 個なく、空白で表示されます。データの %5 行目、レポートの %6 行目です</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 values of the field "%2" of the %3 "%4" are missing and show as blanks, the first one in row %5, line %6 of the report</source>
        <translation>%3 "%4" のフィールド "%2" の値が %1 個なく、空白で表示されます。最初はデータの %5 行目、レポートの %6 行目です</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 value of the variable "%2" is missing and in no total of the table "%3", in row %4</source>
        <translation>変数「%2」の値が %1 個なく、表「%3」の合計に含まれていません (%4 行目)</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 values of the variable "%2" are missing and in no total of the table "%3", the first one in row %4</source>
        <translation>変数「%2」の値が %1 個なく、表「%3」の合計に含まれていません (最初は %4 行目)</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 value of the variable "%2" is infinite or not a number and in no total of the table "%3", in row %4</source>
        <translation>変数「%2」の値が %1 個、無限大または数値でなく、表「%3」の合計に含まれていません (%4 行目)</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 values of the variable "%2" are infinite or not a number and in no total of the table "%3", the first one in row %4</source>
        <translation>変数「%2」の値が %1 個、無限大または数値でなく、表「%3」の合計に含まれていません (最初は %4 行目)</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 value of the variable "%2" is missing and in no running sum of the table "%3", in row %4</source>
        <translation>変数「%2」の値が %1 個なく、表「%3」の累計に含まれていません (%4 行目)</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 values of the variable "%2" are missing and in no running sum of the table "%3", the first one in row %4</source>
        <translation>変数「%2」の値が %1 個なく、表「%3」の累計に含まれていません (最初は %4 行目)</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 value of the variable "%2" is infinite or not a number and in no running sum of the table "%3", in row %4</source>
        <translation>変数「%2」の値が %1 個、無限大または数値でなく、表「%3」の累計に含まれていません (%4 行目)</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>%1 values of the variable "%2" are infinite or not a number and in no running sum of the table "%3", the first one in row %4</source>
        <translation>変数「%2」の値が %1 個、無限大または数値でなく、表「%3」の累計に含まれていません (最初は %4 行目)</translation>
    </message>
    <message>
        <location filename="../jobs/JobValueNotes.cpp"/>
        <source>the field "%1" of the %2 "%3" has no value: its line is left out</source>
        <translation>%2 "%3" のフィールド "%1" に値がありません: その行は出力されません</translation>
    </message>
    <message>
        <location filename="../jobs/JsonNode.cpp"/>
        <source>a text was expected</source>
        <translation>テキストが必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JsonNode.cpp"/>
        <source>true or false was expected</source>
        <translation>true または false が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JsonNode.cpp"/>
        <source>a whole number from %1 to %2 was expected</source>
        <translation>%1 から %2 までの整数が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JsonNode.cpp"/>
        <source>a list was expected</source>
        <translation>リストが必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JsonNode.cpp"/>
        <source>unknown key "%1": %2 expected</source>
        <translation>不明なキー "%1": 使用できるキー: %2</translation>
    </message>
    <message>
        <location filename="../jobs/JsonObjectList.cpp"/>
        <source>a row has values of several variables that have one ID: that of "%1" is shown</source>
        <translation>ID が同じ複数の変数に値がある行があります: "%1" の値が表示されます</translation>
    </message>
    <message>
        <location filename="../jobs/JsonSource.cpp"/>
        <source>the key "%1" occurs twice in "%2"</source>
        <translation>キー「%1」が「%2」に 2 回あります</translation>
    </message>
    <message>
        <location filename="../jobs/JsonSource.cpp"/>
        <source>the file cannot be read: %1</source>
        <translation>ファイルを読み込めません: %1</translation>
    </message>
    <message>
        <location filename="../jobs/JsonSource.cpp"/>
        <source>the file is larger than %1 MB: a job was expected</source>
        <translation>ファイルが %1 MB を超えています: ジョブが必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JsonSource.cpp"/>
        <source>a JSON object was expected: %1</source>
        <translation>JSON オブジェクトが必要です: %1</translation>
    </message>
    <message>
        <location filename="../jobs/JsonSource.cpp"/>
        <source>a JSON object was expected</source>
        <translation>JSON オブジェクトが必要です</translation>
    </message>
    <message>
        <location filename="../jobs/JsonSource.cpp"/>
        <source>the key "%1" is in line %2 already: each key was expected once</source>
        <translation>キー「%1」はすでに %2 行目にあります: キーはそれぞれ 1 回だけ指定できます</translation>
    </message>
    <message>
        <location filename="../jobs/JsonSource.cpp"/>
        <source>the key "%1" has %2 steps: at most %3 were expected</source>
        <translation>キー「%1」は %2 段階です: %3 段階までです</translation>
    </message>
    <message>
        <location filename="../jobs/JsonSource.cpp"/>
        <source>the key "%1" cannot be set in the job: names of keys, and numbers of existing elements of a list, were expected between the dots</source>
        <translation>ジョブでキー "%1" を設定できません: ピリオドの間には、キーの名前、またはリストの既存の要素の番号が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/LandXmlData.cpp"/>
        <source>a LandXML file states its own units: only "length" was expected, the unit of lengths in the job</source>
        <translation>LandXML ファイルには単位が記載されています: ジョブ内の長さの単位である「length」だけが必要です</translation>
    </message>
    <message>
        <location filename="../jobs/LandXmlQueryReader.cpp"/>
        <source>the list "%1" does not use the key "%2": remove the key, or choose another list</source>
        <translation>リスト「%1」ではキー「%2」を使いません: キーを削除するか、別のリストを選んでください</translation>
    </message>
    <message>
        <location filename="../jobs/LandXmlQueryReader.cpp"/>
        <source>a number from %1 to %2 was expected</source>
        <translation>%1 から %2 までの数が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/LandXmlQueryReader.cpp"/>
        <source>a station such as 12345.678 or "12+345.678" was expected</source>
        <translation>12345.678 または「12+345.678」のような測点が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/LandXmlQueryReader.cpp"/>
        <source>the key "%1" was expected</source>
        <translation>キー「%1」が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/LandXmlQueryReader.cpp"/>
        <source>the key "%1" with one of %2 was expected</source>
        <translation>%2 のいずれかを値とするキー「%1」が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/PostgresData.cpp"/>
        <source>a text, a number, true, false or null was expected</source>
        <translation>文字列、数値、true、false、null のいずれかが必要です</translation>
    </message>
    <message>
        <location filename="../jobs/ResultOptionsReader.cpp"/>
        <source>a text that is not empty was expected</source>
        <translation>空でないテキストが必要です</translation>
    </message>
    <message>
        <location filename="../jobs/ResultOptionsReader.cpp"/>
        <source>the tag of a language such as de or pt-BR was expected</source>
        <translation>de や pt-BR のような言語タグが必要です</translation>
    </message>
    <message>
        <location filename="../jobs/ResultOptionsReader.cpp"/>
        <source>one ASCII character was expected, other than a letter, a digit, a sign, a point, a quote, a blank or a line end</source>
        <translation>英字、数字、符号、ピリオド、引用符、空白、改行以外の ASCII 文字 1 つが必要です</translation>
    </message>
    <message>
        <location filename="../jobs/ResultOptionsReader.cpp"/>
        <source>"table" or "block" was expected, not both</source>
        <translation>"table" と "block" の両方ではなく、どちらか一方が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/ResultOptionsReader.cpp"/>
        <source>the name of a file was expected</source>
        <translation>ファイル名が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/ResultOutputs.cpp"/>
        <source>"%1" has the rows of a table or a block, and no such step of the job writes one</source>
        <translation>"%1" には表またはブロックの行が入りますが、それを書き込む手順がジョブにありません</translation>
    </message>
    <message>
        <location filename="../jobs/ResultOutputs.cpp"/>
        <source>"%1" has the rows of one step, and %2 steps may be meant: keys "table", "block" or "data" that leave one of them were expected</source>
        <translation>"%1" には 1 つの手順の行が入りますが、%2 個の手順が該当します: 1 つに絞るキー "table"、"block"、"data" が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/SavedText.cpp"/>
        <source>a saved report was expected; this is a PDF</source>
        <translation>保存された帳票が必要です。これは PDF です</translation>
    </message>
    <message>
        <location filename="../jobs/SavedText.cpp"/>
        <source>a report file was expected; this is not UTF-8</source>
        <translation>帳票ファイルが必要です。これは UTF-8 ではありません</translation>
    </message>
    <message>
        <location filename="../jobs/ShapeBinding.cpp"/>
        <source>the template sorts the table "%1": "sort" is for tables that it does not sort</source>
        <translation>表「%1」はテンプレートが並べ替えます: "sort" はテンプレートが並べ替えない表のためのものです</translation>
    </message>
    <message>
        <location filename="../jobs/ShapeBinding.cpp"/>
        <source>rows are sorted before "%1" is computed: a variable of the data was expected</source>
        <translation>行は「%1」が計算される前に並べ替えられます: データの変数が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/ShapeBinding.cpp"/>
        <source>"per": "group" needs groups: the key "groups" was expected in the step</source>
        <translation>"per": "group" にはグループが必要です: ステップに "groups" キーが必要です</translation>
    </message>
    <message>
        <location filename="../jobs/ShapeBinding.cpp"/>
        <source>another variable with numbers, lengths, areas or angles was expected</source>
        <translation>数値、長さ、面積、角度のいずれかをもつ別の変数が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/ShapeBinding.cpp"/>
        <source>a flag needs a text, or a mark: the variable "%1" is neither</source>
        <translation>フラグにはテキストか印が必要です: 変数「%1」はどちらでもありません</translation>
    </message>
    <message>
        <location filename="../jobs/ShapeBinding.cpp"/>
        <source>the key "text" with the text of the flag was expected</source>
        <translation>フラグのテキストをもつキー "text" が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/ShapeBinding.cpp"/>
        <source>the variable "%1" has a mark and no text</source>
        <translation>変数「%1」は印であり、テキストをもちません</translation>
    </message>
    <message>
        <location filename="../jobs/SqliteData.cpp"/>
        <source>there is no database "%1"</source>
        <translation>データベース「%1」はありません</translation>
    </message>
    <message>
        <location filename="../jobs/SqliteData.cpp"/>
        <source>either "table" or "query" was expected</source>
        <translation>"table" か "query" のどちらか一方が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/StandardInput.cpp"/>
        <source>a window has no standard input: a file was expected</source>
        <translation>ウィンドウには標準入力がありません: ファイルが必要です</translation>
    </message>
    <message>
        <location filename="../jobs/TableShapeReader.cpp"/>
        <source>the name of a variable was expected</source>
        <translation>変数の名前が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/TableShapeReader.cpp"/>
        <source>one of %1 was expected, not two</source>
        <translation>%1 のいずれか一つが必要です (二つは使えません)</translation>
    </message>
    <message>
        <location filename="../jobs/TableShapeReader.cpp"/>
        <source>"beside" was expected only with above, below or outside</source>
        <translation>"beside" は above、below、outside とだけ使えます</translation>
    </message>
    <message>
        <location filename="../jobs/TableShapeReader.cpp"/>
        <source>two variables were expected</source>
        <translation>変数が二つ必要です</translation>
    </message>
    <message>
        <location filename="../jobs/TableShapeReader.cpp"/>
        <source>two variables or more were expected</source>
        <translation>変数が二つ以上必要です</translation>
    </message>
    <message>
        <location filename="../jobs/TableShapeReader.cpp"/>
        <source>the northing and easting, or the northing, easting and elevation, of two points were expected</source>
        <translation>二点の北距と東距、または北距、東距、標高が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/TableShapeReader.cpp"/>
        <source>the northing and easting of two points were expected</source>
        <translation>二点の北距と東距が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/TableShapeReader.cpp"/>
        <source>"%1" needs a heading: the key "heading" was expected</source>
        <translation>"%1" には見出しが必要です: "heading" キーが必要です</translation>
    </message>
    <message>
        <location filename="../jobs/TemplateSource.cpp"/>
        <source>the template file cannot be read: there is no such file</source>
        <translation>テンプレートファイルを読み込めません: ファイルがありません</translation>
    </message>
    <message>
        <location filename="../jobs/TemplateSource.cpp"/>
        <source>a template file was expected; this is a folder, a pipe or a device</source>
        <translation>テンプレートファイルが必要です。これはフォルダー、パイプ、またはデバイスです</translation>
    </message>
    <message>
        <location filename="../jobs/TemplateSource.cpp"/>
        <source>the template file has %1 MB: at most %2 MB were expected</source>
        <translation>テンプレートファイルが %1 MB あります: %2 MB 以下である必要があります</translation>
    </message>
    <message>
        <location filename="../jobs/TemplateSource.cpp"/>
        <source>the template file cannot be read</source>
        <translation>テンプレートファイルを読み込めません</translation>
    </message>
    <message>
        <location filename="../jobs/TemplateSource.cpp"/>
        <source>the template file is empty: a &lt;ReportTemplate&gt; element was expected</source>
        <translation>テンプレートファイルが空です: &lt;ReportTemplate&gt; 要素が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/TemplateSource.cpp"/>
        <source>the template "%1" cannot be loaded: %2</source>
        <translation>テンプレート「%1」を読み込めません: %2</translation>
    </message>
    <message>
        <location filename="../jobs/TemplateSource.cpp"/>
        <source>the file holds no template: a &lt;ReportTemplate&gt; element was expected</source>
        <translation>ファイルにテンプレートがありません: &lt;ReportTemplate&gt; 要素が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/TemplateSource.cpp"/>
        <source>there is no template named "%1": %2</source>
        <translation>"%1" という名前のテンプレートはありません: %2</translation>
    </message>
    <message>
        <location filename="../jobs/ValuesData.cpp"/>
        <source>an object or a list of objects was expected</source>
        <translation>オブジェクトまたはオブジェクトのリストが必要です</translation>
    </message>
    <message>
        <location filename="../jobs/VariableLookup.cpp"/>
        <source>the dictionary "%1" has no variable "%2": %3</source>
        <translation>辞書「%1」に変数「%2」がありません: %3</translation>
    </message>
    <message>
        <location filename="../jobs/VariableLookup.cpp"/>
        <source>the step sets "%1" only after this: a variable of the data, or one that is set before, was expected</source>
        <translation>このステップは「%1」をこの後で設定します。データの変数か、先に設定される変数が必要です</translation>
    </message>
    <message>
        <location filename="../jobs/VariableLookup.cpp"/>
        <source>%1 was expected, as the variable "%2" has it</source>
        <translation>%1が必要です (変数「%2」の値として)</translation>
    </message>
    <message>
        <location filename="../sheets/PlaceFields.cpp"/>
        <source>Previous page</source>
        <translation>前のページ</translation>
    </message>
    <message>
        <location filename="../sheets/PlaceFields.cpp"/>
        <source>Next page</source>
        <translation>次のページ</translation>
    </message>
    <message>
        <location filename="../sheets/PlaceFields.cpp"/>
        <source>Page shown</source>
        <translation>表示中のページ</translation>
    </message>
    <message>
        <location filename="../sheets/PlaceFields.cpp"/>
        <source>Smaller</source>
        <translation>縮小</translation>
    </message>
    <message>
        <location filename="../sheets/PlaceFields.cpp"/>
        <source>Larger</source>
        <translation>拡大</translation>
    </message>
    <message>
        <location filename="../sheets/PlaceFields.cpp"/>
        <source>Fit to Width</source>
        <translation>幅に合わせる</translation>
    </message>
    <message>
        <location filename="../sheets/PlaceFields.cpp"/>
        <source>Fit to Page</source>
        <translation>ページに合わせる</translation>
    </message>
    <message>
        <location filename="../sheets/ReportSheets.cpp"/>
        <source>There is no page to show.</source>
        <translation>表示できるページがありません。</translation>
    </message>
    <message>
        <location filename="../sheets/ReportSheets.cpp"/>
        <source>This report is empty.</source>
        <translation>この帳票は空です。</translation>
    </message>
    <message>
        <location filename="../sheets/ReportSheets.cpp"/>
        <source>Finding the sheets: %1 %</source>
        <translation>用紙の割り付け: %1 %</translation>
    </message>
    <message>
        <location filename="../sheets/SheetReportView.cpp"/>
        <source>Sheet</source>
        <translation>用紙</translation>
    </message>
    <message>
        <location filename="../sheets/SheetThumbnails.cpp"/>
        <source>Small pictures of the sheets</source>
        <translation>用紙の縮小画像</translation>
    </message>
    <message>
        <location filename="../sheets/SheetThumbnails.cpp"/>
        <source>Sheet %1 of %2</source>
        <translation>用紙 %1 / %2</translation>
    </message>
    <message>
        <location filename="../sheets/SheetView.cpp"/>
        <source>Sheets</source>
        <translation>用紙</translation>
    </message>
    <message>
        <location filename="../preview/TemplateEdits.cpp"/>
        <source>A field belongs to a table or a block: put the cursor into one.</source>
        <translation>フィールドは表またはブロックに属します。その中にカーソルを置いてください。</translation>
    </message>
    <message>
        <location filename="../preview/TemplateEdits.cpp"/>
        <source>The table or block needs a name first.</source>
        <translation>先に表またはブロックに名前を付けてください。</translation>
    </message>
    <message>
        <location filename="../preview/TemplateEdits.cpp"/>
        <source>The template cannot be read: correct what the list of remarks says first.</source>
        <translation>テンプレートを読み取れません。先に指摘の一覧の内容を直してください。</translation>
    </message>
    <message>
        <location filename="../preview/TemplatePreview.cpp"/>
        <source>a job with this template was expected</source>
        <translation>このテンプレートを使うジョブが必要です</translation>
    </message>
    <message>
        <location filename="../preview/TemplatePreview.cpp"/>
        <source>a job with this template was expected: it has "%1"</source>
        <translation>このテンプレートを使うジョブが必要ですが、"%1" が指定されています</translation>
    </message>
    <message>
        <location filename="../preview/TemplatePreview.cpp"/>
        <source>the template file cannot be written for its preview: %1</source>
        <translation>プレビューのためにテンプレートファイルを書き込めません: %1</translation>
    </message>
    <message>
        <location filename="../preview/TemplateVariables.cpp"/>
        <source>A name without blanks at its ends was expected.</source>
        <translation>前後に空白のない名前が必要です。</translation>
    </message>
    <message>
        <location filename="../preview/TemplateVariables.cpp"/>
        <source>A name without &lt; and &gt; was expected.</source>
        <translation>&lt; と &gt; を含まない名前が必要です。</translation>
    </message>
    <message>
        <location filename="../preview/TemplateVariables.cpp"/>
        <source>"%1" cannot be the name of a variable: it has a meaning of its own.</source>
        <translation>"%1" は変数ではありません。特別な意味を持つ名前です。</translation>
    </message>
    <message>
        <location filename="../preview/TemplateVariables.cpp"/>
        <source>There is already a variable "%1".</source>
        <translation>変数 "%1" は既にあります。</translation>
    </message>
    <message>
        <location filename="../preview/TemplateVariables.cpp"/>
        <source>Put the cursor on a variable first: in a field, a sort key or a dictionary.</source>
        <translation>先に、フィールド、並べ替えキーまたは辞書の変数にカーソルを置いてください。</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CheckCommand.cpp"/>
        <source>standard input is one job: - was expected once</source>
        <translation>標準入力は一つのジョブです: - は一度だけ指定できます</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CheckCommand.cpp"/>
        <source>kareport: stopped; nothing more was checked</source>
        <translation>kareport: 中止しました。これ以上は検査していません</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CheckOutput.cpp"/>
        <source>%1 too wide</source>
        <translation>%1 件が幅を超過</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CheckOutput.cpp"/>
        <source>label too wide</source>
        <translation>見出しが幅を超過</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CheckOutput.cpp"/>
        <source>fits</source>
        <translation>収まる</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CheckOutput.cpp"/>
        <source>%1: table "%2", %3 rows of the data "%4"</source>
        <translation>%1: 表 "%2"、データ "%4" の %3 行</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CheckOutput.cpp"/>
        <source>%1: block "%2", %3 row of the data "%4"</source>
        <translation>%1: ブロック "%2"、データ "%4" の %3 行</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CheckOutput.cpp"/>
        <source>field</source>
        <translation>フィールド</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CheckOutput.cpp"/>
        <source>label</source>
        <comment>Text over a column</comment>
        <translation>見出し</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CheckOutput.cpp"/>
        <source>width</source>
        <translation>幅</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CheckOutput.cpp"/>
        <source>widest</source>
        <translation>最大幅</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CheckOutput.cpp"/>
        <source>row</source>
        <translation>行</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CheckOutput.cpp"/>
        <source>value</source>
        <translation>値</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandLineErrors.cpp"/>
        <source>%1 has no option "%2"</source>
        <translation>%1 に "%2" というオプションはありません</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandLineErrors.cpp"/>
        <source>"%1" was expected after "%2"</source>
        <translation>"%1" は "%2" の後に必要です</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandLineErrors.cpp"/>
        <source>%1: "%2" was not expected</source>
        <translation>%1: "%2" は余分です</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandLineErrors.cpp"/>
        <source>%1: %2 was expected</source>
        <translation>%1: %2 が必要です</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandLineErrors.cpp"/>
        <source>%1 was given more than once</source>
        <translation>%1 が 2 回以上指定されています</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandLineErrors.cpp"/>
        <source>%1 "%2": a whole number was expected</source>
        <translation>%1 "%2": 整数が必要です</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandLineErrors.cpp"/>
        <source>"%1" is not a command: %2</source>
        <translation>"%1" はコマンドではありません: %2</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandLineErrors.cpp"/>
        <source>a command was expected: %1</source>
        <translation>コマンドが必要です: %1</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandLineJob.cpp"/>
        <source>kareport: stopped; nothing was written</source>
        <translation>kareport: 中断されました。何も書き込まれていません</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandLineJobChecks.cpp"/>
        <source>kareport: the report will have at least %1</source>
        <translation>kareport: レポートは少なくとも %1 になります</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandLineJobChecks.cpp"/>
        <source>kareport: nothing was written: the report has at least %1, more than the limit of %2</source>
        <translation>kareport: 何も書き込まれませんでした: レポートは少なくとも %1 で、上限の %2 を超えます</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandOutputs.cpp"/>
        <source>kareport: stopped before "%1" was written</source>
        <translation>kareport: 「%1」を書き込む前に中断されました</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandOutputs.cpp"/>
        <source>kareport: the report is empty: "%1" was not written</source>
        <translation>kareport: 帳票が空です: 「%1」は書き込まれませんでした</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandOutputs.cpp"/>
        <source>kareport: the report is empty, and a PDF has at least one page: "%1" was not written</source>
        <translation>kareport: レポートが空です。PDF には少なくとも 1 ページが必要なため、「%1」は書き込まれませんでした</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandOutputs.cpp"/>
        <source>Writing %1</source>
        <translation>書き込み中: %1</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandOutputs.cpp"/>
        <source>kareport: warning: "%1": %2</source>
        <translation>kareport: 警告: 「%1」: %2</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandSetup.cpp"/>
        <source>the ending of "%1" does not say the kind: --as with one of %2 was expected</source>
        <translation>「%1」の拡張子からは種類がわかりません: --as に次のいずれかを指定する必要があります: %2</translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandSetup.cpp"/>
        <source>--set "%1": KEY=VALUE was expected</source>
        <translation>--set "%1": KEY=VALUE の形式が必要です</translation>
    </message>
    <message>
        <location filename="../apps/kareport/ConvertCommand.cpp"/>
        <source>the output "%1" is the report being read: another file was expected</source>
        <translation>出力 "%1" は読み込むレポートそのものです: 別のファイルが必要です</translation>
    </message>
    <message>
        <location filename="../apps/kareport/ConvertCommand.cpp"/>
        <source>--set "%1": a key of the page was expected, such as page.linesPerPage=60</source>
        <translation>--set "%1": page.linesPerPage=60 のようなページのキーが必要です</translation>
    </message>
    <message>
        <location filename="../apps/kareport/ConvertCommand.cpp"/>
        <source>"%1" cannot be made from a saved report, which holds only text: use "render" with the job of the report</source>
        <translation>"%1" は、テキストだけを含む保存された報告書からは作れません: 報告書のジョブで "render" を使ってください</translation>
    </message>
    <message>
        <location filename="../apps/kareport/ConvertCommand.cpp"/>
        <source>--set: %1</source>
        <translation>--set: %1</translation>
    </message>
    <message>
        <location filename="../apps/kareport/DataOptions.cpp"/>
        <source>--units "%1": QUANTITY=UNIT was expected, as in length=usft</source>
        <translation>--units "%1": length=usft のような 量=単位 が必要です</translation>
    </message>
    <message>
        <location filename="../apps/kareport/DataOptions.cpp"/>
        <source>%1: "%2" was given twice: each was expected once</source>
        <translation>%1: "%2" が 2 回指定されています: それぞれ 1 回だけ必要です</translation>
    </message>
    <message>
        <location filename="../apps/kareport/DataOptions.cpp"/>
        <source>--columns "%1": the names of the columns in their order, or VARIABLE=COLUMN for each, were expected</source>
        <translation>--columns "%1": 列の名前を順に並べたもの、または各列の 変数=列 が必要です</translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobWatch.cpp"/>
        <source>standard output</source>
        <translation>標準出力</translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobWatch.cpp"/>
        <source>1 note</source>
        <translation>注意 1 件</translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobWatch.cpp"/>
        <source>%1 notes</source>
        <translation>注意 %1 件</translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobWatch.cpp"/>
        <source>kareport: the system has no more descriptors</source>
        <translation>kareport: システムの記述子が足りません</translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobWatch.cpp"/>
        <source>standard input can be read only once: a file was expected for each data set</source>
        <translation>標準入力は一度しか読めません: データごとにファイルが必要です</translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobWatch.cpp"/>
        <source>kareport: %1: made in %2 s: %3</source>
        <translation>kareport: %1: %2 秒で作成: %3</translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobWatch.cpp"/>
        <source>kareport: %1: not all outputs were written</source>
        <translation>kareport: %1: 一部の出力を書き込めませんでした</translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobWatch.cpp"/>
        <source>kareport: %1: failed; earlier outputs are unchanged</source>
        <translation>kareport: %1: 失敗しました。以前の出力は変わりません</translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobWatch.cpp"/>
        <source>kareport: watching %1; press Ctrl+C to stop</source>
        <translation>kareport: %1 を監視しています。Ctrl+C で終了します</translation>
    </message>
    <message>
        <location filename="../apps/kareport/NewCommand.cpp"/>
        <source>"%1" already exists; nothing was written</source>
        <translation>"%1" は既にあります。何も書き込んでいません</translation>
    </message>
    <message>
        <location filename="../apps/kareport/NewCommand.cpp"/>
        <source>"%1" could not be created: %2</source>
        <translation>"%1" を作成できませんでした: %2</translation>
    </message>
    <message>
        <location filename="../apps/kareport/NewCommand.cpp"/>
        <source>Created %1 (template), %2 (data), %3 (job)</source>
        <translation>作成しました: %1 (テンプレート)、%2 (データ)、%3 (ジョブ)</translation>
    </message>
    <message>
        <location filename="../apps/kareport/NewCommand.cpp"/>
        <source>Next: %1</source>
        <translation>次: %1</translation>
    </message>
    <message>
        <location filename="../apps/kareport/NotesFile.cpp"/>
        <source>--notes "%1": the name of a file was expected</source>
        <translation>--notes "%1": ファイル名が必要です</translation>
    </message>
    <message>
        <location filename="../apps/kareport/NotesFile.cpp"/>
        <source>--notes "%1" is one file for several jobs: a name with {} was expected, which is replaced by the name of the job file</source>
        <translation>--notes "%1" は複数のジョブに対して 1 つのファイルです: ジョブファイルの名前に置き換えられる {} を含む名前が必要です</translation>
    </message>
    <message>
        <location filename="../apps/kareport/NotesFile.cpp"/>
        <source>kareport: "%1" could not be written: %2</source>
        <translation>kareport: 「%1」を書き込めませんでした: %2</translation>
    </message>
    <message>
        <location filename="../apps/kareport/OutputFolders.cpp"/>
        <source>there is no folder "%1"; --parents creates it</source>
        <translation>フォルダー "%1" がありません。--parents で作成します</translation>
    </message>
    <message>
        <location filename="../apps/kareport/OutputFolders.cpp"/>
        <source>the folder "%1" could not be created: %2</source>
        <translation>フォルダー "%1" を作成できませんでした: %2</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderBatch.cpp"/>
        <source>"%1" is the file "%2" of this batch: another file was expected</source>
        <translation>"%1" はこの一括処理のファイル "%2" です: 別のファイルが必要です</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderBatch.cpp"/>
        <source>"%1" is written by the job "%2" already: another file was expected</source>
        <translation>"%1" はジョブ "%2" がすでに書き込んでいます: 別のファイルが必要です</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderBatch.cpp"/>
        <source>kareport: there was no job to run</source>
        <translation>kareport: 作成するジョブがありません</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderBatch.cpp"/>
        <source>%1 of %2 jobs made</source>
        <translation>%2 件中 %1 件のジョブを作成</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderBatch.cpp"/>
        <source>%1 up to date</source>
        <translation>%1 件は最新</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderBatch.cpp"/>
        <source>%1 failed</source>
        <translation>%1 件は失敗</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderBatch.cpp"/>
        <source>%1 not made when stopped</source>
        <translation>%1 件は中断時に未作成</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderCommand.cpp"/>
        <source>--limit "%1": a number of bytes was expected, such as 500000, 800K, 20M or 1G</source>
        <translation>--limit "%1": 500000、800K、20M、1G のようなバイト数が必要です</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderCommand.cpp"/>
        <source>either job files or --template, --name, --table or --block, and --data were expected</source>
        <translation>ジョブファイル、または --template、--name、--table か --block、および --data が必要です</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderCommand.cpp"/>
        <source>--template, --name, --data and one of --table and --block were expected</source>
        <translation>--template、--name、--data と、--table か --block のどちらか一方が必要です</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderCommand.cpp"/>
        <source>standard input is the list of jobs: no job is read from it</source>
        <translation>標準入力はジョブのリストです: そこからジョブは読み込みません</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderCommand.cpp"/>
        <source>--slice takes a part of several job files: job files were expected</source>
        <translation>--slice は複数のジョブファイルの一部を選びます: ジョブファイルが必要です</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderCommand.cpp"/>
        <source>--slice "%1": a number, a slash and the count of slices were expected, such as 3/8</source>
        <translation>--slice "%1": 3/8 のように、番号、スラッシュ、分割数が必要です</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderCommand.cpp"/>
        <source>-o "%1" is one file for several jobs: a name with {} was expected, which is replaced by the name of the job file</source>
        <translation>-o "%1" は複数のジョブに対して 1 つのファイルです: ジョブファイルの名前に置き換えられる {} を含む名前が必要です</translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderCommand.cpp"/>
        <source>kareport: all is up to date; nothing was written</source>
        <translation>kareport: すべて最新です。何も書き込みませんでした</translation>
    </message>
    <message>
        <location filename="../apps/kareport/ViewCommand.cpp"/>
        <source>there is no file "%1"</source>
        <translation>ファイル「%1」がありません</translation>
    </message>
    <message>
        <location filename="../apps/kareport/ViewCommand.cpp"/>
        <source>A PDF cannot be opened as a report</source>
        <translation>PDFはレポートとして開けません</translation>
    </message>
    <message>
        <location filename="../apps/kareport/ViewCommand.cpp"/>
        <source>the program kareport-desk is not installed</source>
        <translation>プログラム kareport-desk がインストールされていません</translation>
    </message>
    <message>
        <location filename="../apps/kareport/ViewCommand.cpp"/>
        <source>there is no display to show a window on: DISPLAY or WAYLAND_DISPLAY was expected</source>
        <translation>ウィンドウを表示するディスプレイがありません: DISPLAY または WAYLAND_DISPLAY が必要です</translation>
    </message>
    <message>
        <location filename="../apps/kareport/ViewCommand.cpp"/>
        <source>"%1" could not be started</source>
        <translation>「%1」を起動できませんでした</translation>
    </message>
    <message>
        <location filename="../apps/kareport/WatchCommand.cpp"/>
        <source>standard input can be read only once: a job file was expected</source>
        <translation>標準入力は一度しか読めません: ジョブファイルが必要です</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/ChangedFile.cpp"/>
        <source>"%1" was changed by another program, and it has unsaved changes here. Load it again and lose the changes made here?</source>
        <translation>「%1」は別のプログラムで変更されましたが、ここにも未保存の変更があります。再読み込みして、ここでの変更を破棄しますか?</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/ChangedFile.cpp"/>
        <source>"%1" was changed by another program. Load it again?</source>
        <translation>「%1」は別のプログラムで変更されました。再読み込みしますか?</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrame.cpp"/>
        <source>Open</source>
        <translation>開く</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrame.cpp"/>
        <source>Reports, jobs and templates (*.rep *.rtf *.json *.xml)</source>
        <translation>帳票、ジョブ、テンプレート (*.rep *.rtf *.json *.xml)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrame.cpp"/>
        <source>All files (*)</source>
        <translation>すべてのファイル (*)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameFiles.cpp"/>
        <source>"%1" could not be opened.</source>
        <translation>「%1」を開けませんでした。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameFiles.cpp"/>
        <source>"%1" could not be opened: %2</source>
        <translation>「%1」を開けませんでした: %2</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameFiles.cpp"/>
        <source>"%1" was opened, but not all of it is shown:

%2</source>
        <translation>「%1」を開きましたが、表示されない内容があります:

%2</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameFiles.cpp"/>
        <source>"%1" was saved, but it differs from the report:

%2</source>
        <translation>「%1」を保存しましたが、レポートと異なる点があります:

%2</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameFiles.cpp"/>
        <source>Exported to "%1".</source>
        <translation>「%1」に書き出しました。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Zoom &amp;In	Ctrl++</source>
        <translation>拡大(&amp;I)	Ctrl++</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Zoom &amp;Out	Ctrl+-</source>
        <translation>縮小(&amp;O)	Ctrl+-</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Usual Size	Ctrl+0</source>
        <translation>標準サイズ(&amp;U)	Ctrl+0</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>All &amp;Commands...	Ctrl+Shift+P</source>
        <translation>すべてのコマンド(&amp;C)...	Ctrl+Shift+P</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Keep Report Windows</source>
        <translation>帳票ウィンドウを残す(&amp;K)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Ne&amp;xt Report	Ctrl+Tab</source>
        <translation>次のレポート(&amp;X)	Ctrl+Tab</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Pre&amp;vious Report	Ctrl+Shift+Tab</source>
        <translation>前のレポート(&amp;V)	Ctrl+Shift+Tab</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>New from &amp;Template...	Ctrl+T</source>
        <translation>テンプレートから新規作成(&amp;T)...	Ctrl+T</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Expo&amp;rt</source>
        <translation>書き出し(&amp;R)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;PDF...</source>
        <translation>PDF(&amp;P)...</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Rich Text...</source>
        <translation>リッチテキスト(&amp;R)...</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Plain &amp;Text...</source>
        <translation>テキスト(&amp;T)...</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Values...	Ctrl+E</source>
        <translation>値(&amp;V)...	Ctrl+E</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Redo	Ctrl+Shift+Z</source>
        <translation>やり直し(&amp;R)	Ctrl+Shift+Z</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Select &amp;All	Ctrl+A</source>
        <translation>すべて選択(&amp;A)	Ctrl+A</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Find...	Ctrl+F</source>
        <translation>検索(&amp;F)...	Ctrl+F</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Find &amp;Next	F3</source>
        <translation>次を検索(&amp;N)	F3</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Find Pre&amp;vious	Shift+F3</source>
        <translation>前を検索(&amp;V)	Shift+F3</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Go to Page...	Ctrl+G</source>
        <translation>ページへ移動(&amp;G)...	Ctrl+G</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Pr&amp;eferences...	Ctrl+,</source>
        <translation>設定(&amp;E)...	Ctrl+,</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Toolbar</source>
        <translation>ツールバー</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameRecovery.cpp"/>
        <source>These reports could not be opened again:

%1</source>
        <translation>次の帳票を開き直せませんでした:

%1</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameRecovery.cpp"/>
        <source>Their unsaved changes are kept and will be offered again at the next start.</source>
        <translation>保存されていない変更は残してあり、次回の起動時に再び確認します。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameRecovery.cpp"/>
        <source>KaReport did not end properly, and what it had open cannot be read. These folders were not changed:

%1</source>
        <translation>KaReportは正常に終了しませんでした。開いていたレポートの一覧を読み取れません。次のフォルダーはそのまま残します:

%1</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameRecovery.cpp"/>
        <source> (with unsaved changes)</source>
        <translation> (未保存の変更あり)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameRecovery.cpp"/>
        <source>KaReport did not end properly the last time. These reports were open:

%1

Open them again?</source>
        <translation>KaReport は前回正常に終了しませんでした。次の帳票が開かれていました:

%1

もう一度開きますか?</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskSheets.cpp"/>
        <source>Print Se&amp;lection...</source>
        <translation>選択範囲を印刷(&amp;L)...</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskSheets.cpp"/>
        <source>S&amp;heets	F8</source>
        <translation>用紙(&amp;H)	F8</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskSheets.cpp"/>
        <source>Sheets &amp;Beside the Text	Shift+F8</source>
        <translation>テキストの横に用紙(&amp;B)	Shift+F8</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskSheets.cpp"/>
        <source>Small &amp;Pictures of the Sheets</source>
        <translation>用紙の縮小画像(&amp;P)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskSheets.cpp"/>
        <source>Page &amp;Lines in the Text</source>
        <translation>テキストにページ線(&amp;L)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskSheets.cpp"/>
        <source>Fit to &amp;Width</source>
        <translation>幅に合わせる(&amp;W)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskSheets.cpp"/>
        <source>Fit to Pa&amp;ge</source>
        <translation>ページに合わせる(&amp;G)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorHold.cpp"/>
        <source>"%1" could not be started. Choose another program under Preferences.</source>
        <translation>「%1」を起動できませんでした。設定で別のプログラムを選んでください。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>&amp;Show reports in this program:</source>
        <translation>帳票をこのプログラムで表示(&amp;S):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>Bro&amp;wse...</source>
        <translation>参照(&amp;W)...</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>&amp;Keep a report open while the program is</source>
        <translation>プログラムが開いている間は帳票を開いたままにする(&amp;K)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>Program that shows reports</source>
        <translation>帳票を表示するプログラム</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>Choose a program, or clear the box above.</source>
        <translation>プログラムを選ぶか、上のチェックを外してください。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>There is no program "%1". Choose one from the list, or with Browse.</source>
        <translation>プログラム「%1」がありません。リストまたは「参照」で選んでください。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>Choose a program</source>
        <translation>プログラムの選択</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>Reports are shown in their own window.</source>
        <translation>帳票は専用のウィンドウに表示されます。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>It gets reports as rich text.</source>
        <translation>帳票はリッチテキストで渡されます。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>It gets reports as plain text.</source>
        <translation>帳票はプレーンテキストで渡されます。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/JobExport.cpp"/>
        <source>"%1" already exists and is not a page of "%2": choose another name</source>
        <translation>「%1」はすでに存在し、「%2」のページではありません: 別の名前を選んでください</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/JobExport.cpp"/>
        <source>Workbook</source>
        <translation>ブック</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/JobExport.cpp"/>
        <source>Web Page</source>
        <translation>Web ページ</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/JobExport.cpp"/>
        <source>Rows as CSV</source>
        <translation>行 (CSV)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/JobExport.cpp"/>
        <source>Rows as JSON Lines</source>
        <translation>行 (JSON Lines)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/JobExport.cpp"/>
        <source>"%1": one of the endings .xlsx, .html, .csv and .jsonl was expected</source>
        <translation>"%1": 拡張子 .xlsx、.html、.csv、.jsonl のいずれかが必要です</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/JobLauncher.cpp"/>
        <source>the report could not be made</source>
        <translation>帳票を作成できませんでした</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/KeptReport.cpp"/>
        <source>its saved copy no longer exists</source>
        <translation>保管されていた内容が見つかりません</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Points</source>
        <translation>点</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Points of surfaces</source>
        <translation>サーフェスの点</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Parcels</source>
        <translation>区画</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Sides of parcels</source>
        <translation>区画の辺</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Alignments</source>
        <translation>線形</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Elements of alignments</source>
        <translation>線形の要素</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Stations</source>
        <translation>測点</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Profile</source>
        <translation>縦断</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Cross sections</source>
        <translation>横断</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Points beside an alignment</source>
        <translation>線形に対する点</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>&amp;List:</source>
        <translation>一覧(&amp;L):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>List</source>
        <translation>一覧</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>&amp;Group:</source>
        <translation>グループ(&amp;G):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Group</source>
        <translation>グループ</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>&amp;Parcel:</source>
        <translation>区画(&amp;P):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Parcel</source>
        <translation>区画</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>&amp;Alignment:</source>
        <translation>線形(&amp;A):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Alignment</source>
        <translation>線形</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Grade li&amp;ne:</source>
        <translation>計画縦断線(&amp;N):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Grade line</source>
        <translation>計画縦断線</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>S&amp;urface:</source>
        <translation>サーフェス(&amp;U):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Surface</source>
        <translation>サーフェス</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>&amp;Interval:</source>
        <translation>間隔(&amp;I):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>Interval</source>
        <translation>間隔</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>The distance of regular stations, in the unit of the file</source>
        <translation>等間隔の測点の間隔（ファイルの単位）</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>(the first)</source>
        <translation>(最初のもの)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/LandXmlChoice.cpp"/>
        <source>(all)</source>
        <translation>(すべて)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>Of the printer, else of the country (%1)</source>
        <translation>プリンターの用紙、なければ国の用紙 (%1)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>&amp;Keep the report window when a job is done</source>
        <translation>ジョブの終了後も帳票ウィンドウを残す(&amp;K)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>Open at the &amp;start what was open at the end</source>
        <translation>前回終了時に開いていたものを起動時に開く(&amp;S)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>Preferences</source>
        <translation>設定</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>&amp;Units and Formats</source>
        <translation>単位と書式(&amp;U)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>&amp;Page</source>
        <translation>ページ(&amp;P)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>&amp;Editor</source>
        <translation>エディター(&amp;E)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>Pro&amp;gram</source>
        <translation>プログラム(&amp;G)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source> pt</source>
        <translation> pt</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>Font size</source>
        <translation>フォントサイズ</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>Millimetres</source>
        <translation>ミリメートル</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>Inches</source>
        <translation>インチ</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>Unit of margins</source>
        <translation>余白の単位</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>&amp;Font size of new reports:</source>
        <translation>新しい帳票のフォントサイズ(&amp;F):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>Unit of &amp;margins:</source>
        <translation>余白の単位(&amp;M):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>As the system</source>
        <translation>システムの設定に従う</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>Language</source>
        <translation>言語</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>&amp;Language (from the next start):</source>
        <translation>言語 (次回の起動から)(&amp;L):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/ReportExport.cpp"/>
        <source>PDF</source>
        <translation>PDF</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/ReportExport.cpp"/>
        <source>Rich Text</source>
        <translation>リッチテキスト</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/ReportExport.cpp"/>
        <source>Plain Text</source>
        <translation>テキスト</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/ReportExport.cpp"/>
        <source>it is the report's own file, which is written by Save</source>
        <translation>この帳票自身のファイルです。「保存」で書き込みます</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/SaveAs.cpp"/>
        <source>PDF with outline and page numbers (%1)</source>
        <translation>しおりとページ番号付きの PDF (%1)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/SaveAs.cpp"/>
        <source>There is no folder "%1". Choose another one, or create it first.</source>
        <translation>フォルダー「%1」がありません。別のフォルダーを選ぶか、先に作成してください。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/SaveAs.cpp"/>
        <source>"%1" is open as another report. Close that one first, or choose another name.</source>
        <translation>「%1」は別のレポートとして開かれています。先にそれを閉じるか、別の名前を選んでください。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/SaveAs.cpp"/>
        <source>"%1" already exists. Replace it?</source>
        <translation>ファイル「%1」は既にあります。置き換えますか?</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/SaveAs.cpp"/>
        <source>Save As</source>
        <translation>名前を付けて保存</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/SavedReports.cpp"/>
        <source>it is too large</source>
        <translation>ファイルが大きすぎます</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/SavedReports.cpp"/>
        <source>There is no file "%1".</source>
        <translation>ファイル「%1」がありません。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/SavedReports.cpp"/>
        <source>"%1" is a folder, a pipe or a device. Only files can be opened here.</source>
        <translation>「%1」はフォルダー、パイプ、またはデバイスです。ここで開けるのはファイルだけです。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TableQuestion.cpp"/>
        <source>Export Values</source>
        <translation>値のエクスポート</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TableQuestion.cpp"/>
        <source>A file of this kind has the rows of &amp;one table:</source>
        <translation>この種類のファイルには 1 つの表の行が入ります(&amp;T):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Report from Template</source>
        <translation>テンプレートから帳票を作成</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Template file</source>
        <translation>テンプレートファイル</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Template</source>
        <translation>テンプレート</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Table or block</source>
        <translation>表またはブロック</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Data file</source>
        <translation>データファイル</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>&amp;Edit Template</source>
        <translation>テンプレートを編集(&amp;E)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Choose a template file</source>
        <translation>テンプレートファイルの選択</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Brow&amp;se...</source>
        <translation>参照(&amp;S)...</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Choose a data file</source>
        <translation>データファイルの選択</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Ser&amp;ver...</source>
        <translation>サーバー(&amp;V)...</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Choose a table of a database server</source>
        <translation>データベースサーバーのテーブルを選択</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Tables of a PostgreSQL server</source>
        <translation>PostgreSQL サーバーのテーブル</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>&amp;File:</source>
        <translation>ファイル(&amp;F):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>&amp;Template:</source>
        <translation>テンプレート(&amp;T):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Table or &amp;block:</source>
        <translation>表またはブロック(&amp;B):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>&amp;Data:</source>
        <translation>データ(&amp;D):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Templates (*.xml);;All files (*)</source>
        <translation>テンプレート (*.xml);;すべてのファイル (*)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Data (*.csv *.txt *.xml *.landxml *.gpkg *.sqlite *.db);;All files (*)</source>
        <translation>データ (*.csv *.txt *.xml *.landxml *.gpkg *.sqlite *.db);;すべてのファイル (*)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialogFiles.cpp"/>
        <source>Press Server to list the tables of this connection.</source>
        <translation>「サーバー」を押すと、この接続のテーブルが一覧表示されます。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialogFiles.cpp"/>
        <source>The data file was not read to its end.</source>
        <translation>データファイルは最後まで読み込まれませんでした。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialogFiles.cpp"/>
        <source>The data file holds nothing that is listed.</source>
        <translation>データファイルに一覧にできるものがありません。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialogFiles.cpp"/>
        <source>This template has neither a table nor a block.</source>
        <translation>このテンプレートには表もブロックもありません。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialogFiles.cpp"/>
        <source>There is no data file "%1".</source>
        <translation>データファイル「%1」がありません。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Metre</source>
        <translation>メートル</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Millimetre</source>
        <translation>ミリメートル</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Kilometre</source>
        <translation>キロメートル</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>International foot</source>
        <translation>国際フィート</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>US survey foot</source>
        <translation>米国測量フィート</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Square metre</source>
        <translation>平方メートル</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Hectare</source>
        <translation>ヘクタール</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Square kilometre</source>
        <translation>平方キロメートル</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Square foot</source>
        <translation>平方フィート</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Acre</source>
        <translation>エーカー</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Degree</source>
        <translation>度</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Gon</source>
        <translation>ゴン (gon)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Radian</source>
        <translation>ラジアン</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Easting, northing</source>
        <translation>東距 (E)、北距 (N)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Northing, easting</source>
        <translation>北距 (N)、東距 (E)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Degrees, minutes, seconds</source>
        <translation>度分秒</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Decimal degrees</source>
        <translation>十進度</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Whole circle</source>
        <translation>全円式</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Quadrant</source>
        <translation>象限式</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>From north</source>
        <translation>北基準</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>From south</source>
        <translation>南基準</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Leading &amp;zeros</source>
        <translation>先頭を 0 で埋める(&amp;Z)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Angle &amp;marks:</source>
        <translation>角度の記号(&amp;M):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>&amp;Lengths:</source>
        <translation>長さ(&amp;L):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Decimals:</source>
        <translation>小数桁数:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>&amp;Areas:</source>
        <translation>面積(&amp;A):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Decimals of numbers:</source>
        <translation>数値の小数桁数:</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>A&amp;ngles:</source>
        <translation>角度(&amp;N):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>&amp;Stations:</source>
        <translation>測点(&amp;S):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>&amp;Coordinates:</source>
        <translation>座標(&amp;C):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>&amp;Bearings:</source>
        <translation>方位角(&amp;B):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Degree mark</source>
        <translation>度の記号</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Minute mark</source>
        <translation>分の記号</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Second mark</source>
        <translation>秒の記号</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Looks like</source>
        <translation>表示例</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Unit of lengths</source>
        <translation>長さの単位</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Decimals of lengths</source>
        <translation>長さの小数桁数</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Unit of areas</source>
        <translation>面積の単位</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Decimals of numbers and areas</source>
        <translation>数値と面積の小数桁数</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Unit of angles</source>
        <translation>角度の単位</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Form of stations</source>
        <translation>測点の表記</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Decimals of stations</source>
        <translation>測点の小数桁数</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Order of coordinates</source>
        <translation>座標の順序</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Unit of bearings</source>
        <translation>方位角の単位</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Decimals of bearings</source>
        <translation>方位角の小数桁数</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Style of bearings</source>
        <translation>方位角の表し方</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Reference of bearings</source>
        <translation>方位角の基準方向</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Length</source>
        <translation>長さ</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Area</source>
        <translation>面積</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Angle</source>
        <translation>角度</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Bearing</source>
        <translation>方位角</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Columns</source>
        <translation>列の順序</translation>
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
        <translation>コマンド</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandList.cpp"/>
        <source>Type a part of a command or of its keys</source>
        <translation>コマンドまたはキーの一部を入力</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandList.cpp"/>
        <source>Find a command</source>
        <translation>コマンドを検索</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandList.cpp"/>
        <source>Command</source>
        <translation>コマンド</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandList.cpp"/>
        <source>Keys</source>
        <translation>キー</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandList.cpp"/>
        <source>Why the command cannot be chosen</source>
        <translation>コマンドを選べない理由</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandList.cpp"/>
        <source>No command has this name.</source>
        <translation>該当するコマンドはありません。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>No file has been opened yet.</source>
        <translation>まだファイルを開いていません。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>No report is open.</source>
        <translation>開いている帳票がありません。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>The report is still being made.</source>
        <translation>帳票を作成中です。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>No other report is open.</source>
        <translation>ほかに開いている帳票がありません。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>There is only one window.</source>
        <translation>ウィンドウは一つだけです。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>The report has no changes that are not saved.</source>
        <translation>未保存の変更はありません。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>The report is open in another program. Close it there first.</source>
        <translation>帳票は別のプログラムで開かれています。先にそちらで閉じてください。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>This report was not made by a job, so its values are not known.</source>
        <translation>この帳票はジョブで作成されていないため、値がわかりません。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>This report was not made by a job.</source>
        <translation>この帳票はジョブで作成されていません。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>The report was not made from an object of another program.</source>
        <translation>帳票は別のプログラムのオブジェクトから作成されたものではありません。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>The lines of a report window can only be read. Press View\Edit Report.</source>
        <translation>帳票ウィンドウの行は読むことしかできません。「帳票の表示/編集」を押してください。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>The report is still being loaded.</source>
        <translation>帳票を読み込み中です。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>There is nothing to undo.</source>
        <translation>元に戻す操作はありません。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>There is nothing to redo.</source>
        <translation>やり直す操作はありません。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>No text is selected.</source>
        <translation>テキストが選択されていません。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/commands/CommandReasons.cpp"/>
        <source>The sheets are not shown. Choose View &gt; Sheets.</source>
        <translation>用紙は表示されていません。「表示」&gt;「用紙」を選んでください。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/AboutDialog.cpp"/>
        <source>Built as %1 with %2 for %3, Qt %4.</source>
        <translation>%1 として %2 で %3 向けにビルド、Qt %4。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/AboutDialog.cpp"/>
        <source>About KaReport</source>
        <translation>KaReport について</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/AboutDialog.cpp"/>
        <source>The program's icon</source>
        <translation>プログラムのアイコン</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/AboutDialog.cpp"/>
        <source>Version %1</source>
        <translation>バージョン %1</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/AboutDialog.cpp"/>
        <source>Fixed-pitch reports for civil engineering and surveying.</source>
        <translation>土木・測量のための等幅帳票。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/AboutDialog.cpp"/>
        <source>Qt is used under the LGPL, version 3. All libraries and their licences are listed under Licences.</source>
        <translation>Qt は LGPL バージョン 3 に基づいて使用しています。すべてのライブラリとライセンスは「ライセンス」にあります。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/AboutDialog.cpp"/>
        <source>&amp;Licences</source>
        <translation>ライセンス(&amp;L)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/GuideBrowser.cpp"/>
        <source>Guide</source>
        <translation>手引き</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/GuidePages.cpp"/>
        <source>Working with KaReport</source>
        <translation>KaReport の使い方</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/GuidePages.cpp"/>
        <source>Templates</source>
        <translation>テンプレート</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/GuidePages.cpp"/>
        <source>Data</source>
        <translation>データ</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/GuidePages.cpp"/>
        <source>LandXML</source>
        <translation>LandXML</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/GuidePages.cpp"/>
        <source>Lists of LandXML files</source>
        <translation>LandXML ファイルの一覧表</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/GuidePages.cpp"/>
        <source>Groups and totals</source>
        <translation>グループと合計</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/GuidePages.cpp"/>
        <source>The job file</source>
        <translation>ジョブファイル</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/GuidePages.cpp"/>
        <source>The command line</source>
        <translation>コマンドライン</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/GuidePages.cpp"/>
        <source>Many jobs</source>
        <translation>多数のジョブ</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/GuidePages.cpp"/>
        <source>Examples</source>
        <translation>例</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/GuidePages.cpp"/>
        <source>Licences</source>
        <translation>ライセンス</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/HelpWindow.cpp"/>
        <source>Back</source>
        <translation>戻る</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/HelpWindow.cpp"/>
        <source>Forward</source>
        <translation>進む</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/HelpWindow.cpp"/>
        <source>Find on this page</source>
        <translation>このページを検索</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/HelpWindow.cpp"/>
        <source>Pages of the guide</source>
        <translation>手引きのページ</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/help/HelpWindow.cpp"/>
        <source>Not on this page</source>
        <translation>このページにはありません</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportDatabase.cpp"/>
        <source>the table was not read. Choose it again to read it</source>
        <translation>テーブルは読み込まれませんでした。読み込むにはもう一度選択してください</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Comma</source>
        <translation>コンマ</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Semicolon</source>
        <translation>セミコロン</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Tab</source>
        <translation>タブ</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Vertical bar</source>
        <translation>縦線</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Blanks and tabs</source>
        <translation>空白とタブ</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Point: 1.5</source>
        <translation>ピリオド: 1.5</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Comma: 1,5</source>
        <translation>コンマ: 1,5</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>First &amp;row names the columns</source>
        <translation>先頭行は列名(&amp;R)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Tabl&amp;e:</source>
        <translation>テーブル(&amp;E):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Table of the database</source>
        <translation>データベースのテーブル</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Deli&amp;miter:</source>
        <translation>区切り文字(&amp;M):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Delimiter</source>
        <translation>区切り文字</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Decimal s&amp;ign:</source>
        <translation>小数点(&amp;I):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Decimal sign</source>
        <translation>小数点</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>En&amp;coding:</source>
        <translation>文字コード(&amp;C):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Encoding</source>
        <translation>文字コード</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>&amp;Order:</source>
        <translation>順序(&amp;O):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Order of the columns</source>
        <translation>列の順序</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>&amp;Lengths are:</source>
        <translation>長さの単位(&amp;L):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Unit of lengths in the data</source>
        <translation>データの長さの単位</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>&amp;Areas are:</source>
        <translation>面積の単位(&amp;A):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Unit of areas in the data</source>
        <translation>データの面積の単位</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>A&amp;ngles are:</source>
        <translation>角度の単位(&amp;N):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>Unit of angles in the data</source>
        <translation>データの角度の単位</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>First row names the columns</source>
        <translation>先頭行は列名</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportFields.cpp"/>
        <source>P number, N northing, E easting, Z elevation, D description, - not read</source>
        <translation>P 番号、N 北座標、E 東座標、Z 標高、D 説明、- 読み込まない</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportPanel.cpp"/>
        <source>First rows of the data</source>
        <translation>データの先頭の行</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportPanel.cpp"/>
        <source>Database</source>
        <translation>データベース</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportPanel.cpp"/>
        <source>Text file</source>
        <translation>テキストファイル</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportPanel.cpp"/>
        <source>the database has no table</source>
        <translation>データベースにテーブルがありません</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportPanel.cpp"/>
        <source>Line %1, column %2: %3</source>
        <translation>%1 行 %2 列: %3</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportPanelRows.cpp"/>
        <source>(not read)</source>
        <translation>(読み込まない)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ImportPanelRows.cpp"/>
        <source>Variable of the column %1</source>
        <translation>列 %1 の変数</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>Tables of a PostgreSQL Server</source>
        <translation>PostgreSQL サーバーのテーブル</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>&amp;Service:</source>
        <translation>サービス(&amp;S):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>Service</source>
        <translation>サービス</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>an entry of ~/.pg_service.conf, or the fields below</source>
        <translation>~/.pg_service.conf の項目、または下の各欄</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>&amp;Host:</source>
        <translation>ホスト(&amp;H):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>Host</source>
        <translation>ホスト</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>&amp;Port:</source>
        <translation>ポート(&amp;P):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>Port</source>
        <translation>ポート</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>&amp;Database:</source>
        <translation>データベース(&amp;D):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>&amp;User:</source>
        <translation>ユーザー(&amp;U):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>User</source>
        <translation>ユーザー</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>&amp;More:</source>
        <translation>その他(&amp;M):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>More of the connection</source>
        <translation>接続のその他の項目</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>A password is read from your password file (~/.pgpass) or from PGPASSWORD. It is part of no job.</source>
        <translation>パスワードはパスワードファイル (~/.pgpass) または PGPASSWORD から読み込まれます。ジョブには含まれません。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>Why there are no tables</source>
        <translation>テーブルがない理由</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>&amp;List Tables</source>
        <translation>テーブルを一覧表示(&amp;L)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>Listing the tables of the server</source>
        <translation>サーバーのテーブルを一覧表示しています</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>The server was not waited for.</source>
        <translation>サーバーの応答を待たずに中止しました。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/import/ServerDialog.cpp"/>
        <source>The database has no table that this user may read.</source>
        <translation>このデータベースには、このユーザーが読み取れるテーブルがありません。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/main.cpp"/>
        <source>Runs report jobs, and shows, edits and prints reports.</source>
        <translation>帳票ジョブを実行し、帳票を表示、編集、印刷します。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/main.cpp"/>
        <source>Jobs (.json), saved reports (.rep, .rtf) and templates (.xml) to open</source>
        <translation>開くジョブ (.json)、保存した帳票 (.rep, .rtf)、テンプレート (.xml)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRuns.cpp"/>
        <source>Number of notes</source>
        <translation>注意の数</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRuns.cpp"/>
        <source>"%1" has changes that were made by hand. Make it again and lose them?</source>
        <translation>「%1」には手作業による変更があります。変更を破棄して作成し直しますか?</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRuns.cpp"/>
        <source>"%1" was not made again: %2</source>
        <translation>「%1」は作成し直されませんでした: %2</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRunsFiles.cpp"/>
        <source>Files of "%1" have changed. Press F5 to make it again.</source>
        <translation>「%1」の元のファイルが変更されました。F5 で作成し直します。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRunsFiles.cpp"/>
        <source>Jobs</source>
        <translation>ジョブ</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRunsFiles.cpp"/>
        <source>The job was saved as "%1".</source>
        <translation>ジョブを「%1」として保存しました。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRunsFront.cpp"/>
        <source>Save as &amp;Job...</source>
        <translation>ジョブとして保存(&amp;J)...</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRunsFront.cpp"/>
        <source>&amp;Run Again	F5</source>
        <translation>再実行(&amp;R)	F5</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRunsFront.cpp"/>
        <source>Run W&amp;hen Files Change</source>
        <translation>ファイルの変更時に実行(&amp;H)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRunsFront.cpp"/>
        <source>U&amp;nits Bar</source>
        <translation>単位バー(&amp;N)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRunsFront.cpp"/>
        <source>&amp;Choose Units	Ctrl+U</source>
        <translation>単位を選択(&amp;C)	Ctrl+U</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRunsFront.cpp"/>
        <source>N&amp;otes</source>
        <translation>注意(&amp;O)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRunsFront.cpp"/>
        <source>&amp;Go to Notes	F4</source>
        <translation>注意へ移動(&amp;G)	F4</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRunsFront.cpp"/>
        <source>Shows the notes on the report</source>
        <translation>レポートの作成時の注意を表示します</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/DeskRunsFront.cpp"/>
        <source>There is no file with a place for this note.</source>
        <translation>この注意に対応するファイルの位置はありません。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/FilePlace.cpp"/>
        <source>%1, line %2</source>
        <translation>%1、%2 行</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/FilePlace.cpp"/>
        <source>Lines of the file</source>
        <translation>ファイルの行</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/JobWork.cpp"/>
        <source>it is a folder, a pipe or a device</source>
        <translation>フォルダー、パイプ、またはデバイスです</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/JobWork.cpp"/>
        <source>Another job is running. Wait until it has finished, or cancel it.</source>
        <translation>別のジョブが実行中です。終了を待つか、中止してください。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/JobWork.cpp"/>
        <source>There is not enough memory for this input.</source>
        <translation>この入力を処理するメモリが足りません。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Unknown column</source>
        <translation>不明な列</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Field without data</source>
        <translation>データのないフィールド</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Value too wide</source>
        <translation>幅を超える値</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Missing value</source>
        <translation>欠けている値</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>No finite number</source>
        <translation>有限でない数値</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Unknown sort key</source>
        <translation>不明な並べ替えキー</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Not in a total</source>
        <translation>合計に含まれない値</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Character not shown</source>
        <translation>表示されない文字</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Difference in the data</source>
        <translation>データの不一致</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Not read</source>
        <translation>読み込まれないもの</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Assumed unit</source>
        <translation>仮定された単位</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Notes</source>
        <translation>注意</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Show &amp;Line</source>
        <translation>行を表示(&amp;L)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Show Pla&amp;ce in File</source>
        <translation>ファイルの位置を表示(&amp;C)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Kind</source>
        <translation>種類</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Text</source>
        <translation>内容</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Line</source>
        <comment>of a report</comment>
        <translation>行</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Place</source>
        <translation>位置</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/NotesPane.cpp"/>
        <source>Not made again</source>
        <translation>再作成に失敗</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/run/UnitsBar.cpp"/>
        <source>Units</source>
        <translation>単位</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/start/StartPage.cpp"/>
        <source>%1 — not there</source>
        <translation>%1 — 見つかりません</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/start/StartPage.cpp"/>
        <source>Start</source>
        <translation>開始</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/start/StartPage.cpp"/>
        <source>Recent files</source>
        <translation>最近使ったファイル</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/start/StartPage.cpp"/>
        <source>Files that you open are listed here.</source>
        <translation>開いたファイルがここに表示されます。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/start/StartPage.cpp"/>
        <source>Start page</source>
        <translation>スタートページ</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/start/StartPage.cpp"/>
        <source>Open a job or a saved report, or drop a file here.</source>
        <translation>ジョブまたは保存した帳票を開くか、ここにファイルをドロップしてください。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/start/StartPage.cpp"/>
        <source>Recent Files</source>
        <translation>最近使ったファイル</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateFindBar.cpp"/>
        <source>Find and replace</source>
        <translation>検索と置換</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateFindBar.cpp"/>
        <source>Replacement text</source>
        <translation>置き換える文字列</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateFindBar.cpp"/>
        <source>Replace with</source>
        <translation>置換後の文字列</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateFindBar.cpp"/>
        <source>&amp;Next</source>
        <translation>次へ(&amp;N)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateFindBar.cpp"/>
        <source>&amp;Previous</source>
        <translation>前へ(&amp;P)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateFindBar.cpp"/>
        <source>&amp;Replace</source>
        <translation>置換(&amp;R)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateFindBar.cpp"/>
        <source>Replace &amp;All</source>
        <translation>すべて置換(&amp;A)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateFindBar.cpp"/>
        <source>Matches: %1</source>
        <translation>一致: %1</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplatePage.cpp"/>
        <source>First pages of the report</source>
        <translation>レポートの先頭ページ</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplatePage.cpp"/>
        <source>Enter on a value or a label goes to its field in the template.</source>
        <translation>値または見出しの上で Enter を押すと、テンプレートのフィールドに移動します。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateTextEdit.cpp"/>
        <source>Text of the template</source>
        <translation>テンプレートのテキスト</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateTextEdit.cpp"/>
        <source>What can be written here</source>
        <translation>ここに書けるもの</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindow.cpp"/>
        <source>Working…</source>
        <translation>処理中…</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindow.cpp"/>
        <source>Sample rows are shown: %1</source>
        <translation>仮の行を表示しています: %1</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindow.cpp"/>
        <source>The last pages that could be made are shown: %1</source>
        <translation>最後に作成できたページを表示しています: %1</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindow.cpp"/>
        <source>error</source>
        <translation>エラー</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindow.cpp"/>
        <source>warning</source>
        <translation>警告</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindow.cpp"/>
        <source>Line %1, column %2</source>
        <translation>%1 行 %2 列</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowFile.cpp"/>
        <source>"%1" has characters that cannot be shown here. It can be read, but not edited.</source>
        <translation>"%1" にはここに表示できない文字があります。読むことはできますが、編集はできません。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowFile.cpp"/>
        <source>"%1" could not be saved: %2</source>
        <translation>"%1" を保存できませんでした: %2</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowFile.cpp"/>
        <source>"%1" has characters that are not in Latin-1. It was saved as UTF-8.</source>
        <translation>"%1" には Latin-1 にない文字があります。UTF-8 で保存しました。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowFile.cpp"/>
        <source>Sample rows</source>
        <translation>仮の行</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowFile.cpp"/>
        <source>Choose a job or a data file...</source>
        <translation>ジョブまたはデータファイルを選択...</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowLayout.cpp"/>
        <source>Rename Variable</source>
        <translation>変数名の変更</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowLayout.cpp"/>
        <source>New name</source>
        <translation>新しい名前</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowLayout.cpp"/>
        <source>&amp;New name of "%1":</source>
        <translation>"%1" の新しい名前(&amp;N):</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowLayout.cpp"/>
        <source>Choose a job or a data file</source>
        <translation>ジョブまたはデータファイルの選択</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowLayout.cpp"/>
        <source>Jobs and data (*.json *.csv *.txt)</source>
        <translation>ジョブとデータ (*.json *.csv *.txt)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowLayout.cpp"/>
        <source>Remarks on the template</source>
        <translation>テンプレートへの指摘</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowLayout.cpp"/>
        <source>Remark</source>
        <translation>指摘</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowLayout.cpp"/>
        <source>Data of the pages</source>
        <translation>ページのデータ</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowLayout.cpp"/>
        <source>State of the pages</source>
        <translation>ページの状態</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>The template can only be read: it has characters that cannot be shown here.</source>
        <translation>テンプレートは読み取り専用です: ここでは表示できない文字が含まれています。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>The template has no changes that are not saved.</source>
        <translation>テンプレートに未保存の変更はありません。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>Save &amp;As...	Ctrl+Shift+S</source>
        <translation>名前を付けて保存(&amp;A)...	Ctrl+Shift+S</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>Choose &amp;Data...	Ctrl+D</source>
        <translation>データを選択(&amp;D)...	Ctrl+D</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>&amp;Close	Ctrl+W</source>
        <translation>閉じる(&amp;C)	Ctrl+W</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>C&amp;omplete	Ctrl+Space</source>
        <translation>補完(&amp;O)	Ctrl+Space</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>Rena&amp;me Variable...	F2</source>
        <translation>変数名の変更(&amp;M)...	F2</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>No text has been looked for yet.</source>
        <translation>まだテキストを検索していません。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>&amp;Find and Replace...	Ctrl+F</source>
        <translation>検索と置換(&amp;F)...	Ctrl+F</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>&amp;Insert</source>
        <translation>挿入(&amp;I)</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>&amp;Field	Ctrl+Shift+F</source>
        <translation>フィールド(&amp;F)	Ctrl+Shift+F</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>&amp;Table	Ctrl+Shift+T</source>
        <translation>表(&amp;T)	Ctrl+Shift+T</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>&amp;Block	Ctrl+Shift+B</source>
        <translation>ブロック(&amp;B)	Ctrl+Shift+B</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>&amp;Dictionary	Ctrl+Shift+D</source>
        <translation>辞書(&amp;D)	Ctrl+Shift+D</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>There are no remarks on the template.</source>
        <translation>テンプレートへの指摘はありません。</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>&amp;Next Remark	F8</source>
        <translation>次の指摘(&amp;N)	F8</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>&amp;Previous Remark	Shift+F8</source>
        <translation>前の指摘(&amp;P)	Shift+F8</translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/templates/TemplateWindowMenus.cpp"/>
        <source>Text, &amp;Pages, Remarks	F6</source>
        <translation>テキスト、ページ、指摘(&amp;P)	F6</translation>
    </message>
</context>
</TS>
