<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ja_JP" sourcelanguage="en_US">
<context>
    <name>GuiStatReportingPluginUi</name>
    <message>
        <source>Form</source>
        <translation>フォーム</translation>
    </message>
    <message>
        <source>Open Templates Editor</source>
        <translation>テンプレートエディターを開く</translation>
    </message>
    <message>
        <source>Opens Report Template Editor</source>
        <translation>レポートテンプレートエディターを開きます</translation>
    </message>
    <message>
        <source>Generate Report File</source>
        <translation>レポートファイルを作成</translation>
    </message>
    <message>
        <source>Exports current measurments to pdf file.</source>
        <translation>現在の測定値を PDF ファイルにエクスポートします。</translation>
    </message>
    <message>
        <source>Open Statistics Window</source>
        <translation>統計ウィンドウを開く</translation>
    </message>
    <message>
        <source>Template:</source>
        <translation>テンプレート:</translation>
    </message>
    <message>
        <source>Browse Templates</source>
        <translation>テンプレートを参照</translation>
    </message>
    <message>
        <source>Opens default template for report generation</source>
        <translation>レポート作成に使う既定のテンプレートを開きます</translation>
    </message>
</context>
<context>
    <name>KvAddImageDialog</name>
    <message>
        <source>Choose image file</source>
        <translation>画像ファイルの選択</translation>
    </message>
    <message>
        <source>Image file(*.png *.jpg *.gif *.tif *.bmp)</source>
        <translation>画像ファイル (*.png *.jpg *.gif *.tif *.bmp)</translation>
    </message>
</context>
<context>
    <name>KvAddLinkDialogUi</name>
    <message>
        <source>Insert Link</source>
        <translation>リンクの挿入</translation>
    </message>
    <message>
        <source>Title:</source>
        <translation>タイトル:</translation>
    </message>
    <message>
        <source>URL:</source>
        <translation>URL:</translation>
    </message>
</context>
<context>
    <name>KvAlignmentOptionsRow</name>
    <message>
        <source>Align left</source>
        <translation>左揃え</translation>
    </message>
    <message>
        <source>Align center</source>
        <translation>中央揃え</translation>
    </message>
    <message>
        <source>Align right</source>
        <translation>右揃え</translation>
    </message>
</context>
<context>
    <name>KvBaseEditorNodeFactory</name>
    <message>
        <source>Measurements Table</source>
        <translation>測定値表</translation>
    </message>
    <message>
        <source>Text Document</source>
        <translation>テキスト文書</translation>
    </message>
    <message>
        <source>Camera Image View</source>
        <translation>カメラ画像ビュー</translation>
    </message>
    <message>
        <source>Image View</source>
        <translation>画像ビュー</translation>
    </message>
    <message>
        <source>Statistics</source>
        <translation>統計</translation>
    </message>
    <message>
        <source>Statistics Table</source>
        <translation>統計表</translation>
    </message>
    <message>
        <source>Counters</source>
        <translation>カウンター</translation>
    </message>
    <message>
        <source>Min / Median / Max Box</source>
        <translation>箱ひげ図 (最小/中央値/最大)</translation>
    </message>
    <message>
        <source>Trend</source>
        <translation>トレンド</translation>
    </message>
</context>
<context>
    <name>KvCameraImageNodeOptionsWidget</name>
    <message>
        <source>Camera image view</source>
        <translation>カメラ画像ビュー</translation>
    </message>
    <message>
        <source>Render measurements</source>
        <translation>測定結果を描画</translation>
    </message>
    <message>
        <source>Draw the measurement objects on the picture</source>
        <translation>測定オブジェクトを画像に重ねて描画します</translation>
    </message>
</context>
<context>
    <name>KvCameraImageWidget</name>
    <message>
        <source>Camera Image View</source>
        <translation>カメラ画像ビュー</translation>
    </message>
</context>
<context>
    <name>KvColumnsOptionsRow</name>
    <message>
        <source>Select columns:</source>
        <translation>列の選択:</translation>
    </message>
</context>
<context>
    <name>KvEditorAddImageExtWidgetUi</name>
    <message>
        <source>Width:</source>
        <translation>幅:</translation>
    </message>
    <message>
        <source>Width in percent of the text&apos;s width</source>
        <translation>テキスト幅に対する幅 (%)</translation>
    </message>
    <message>
        <source>Float:</source>
        <translation>配置:</translation>
    </message>
    <message>
        <source>Side of the text at which the picture stands</source>
        <translation>テキストに対して画像を置く側</translation>
    </message>
    <message>
        <source>none</source>
        <translation>なし</translation>
    </message>
    <message>
        <source>left</source>
        <translation>左</translation>
    </message>
    <message>
        <source>right</source>
        <translation>右</translation>
    </message>
</context>
<context>
    <name>KvEditorToolCombo</name>
    <message>
        <source>Group of blocks, open</source>
        <translation>ブロックのグループ、開いています</translation>
    </message>
    <message>
        <source>Group of blocks, closed</source>
        <translation>ブロックのグループ、閉じています</translation>
    </message>
    <message>
        <source>Close the group (Enter)</source>
        <translation>グループを閉じる (Enter)</translation>
    </message>
    <message>
        <source>Open the group (Enter)</source>
        <translation>グループを開く (Enter)</translation>
    </message>
</context>
<context>
    <name>KvEditorToolWidget</name>
    <message>
        <source>Drag onto the page, or press Enter to append</source>
        <translation>ページへドラッグします。Enter キーを押すと末尾に追加されます</translation>
    </message>
</context>
<context>
    <name>KvFileDialogs</name>
    <message>
        <source>%1 already exists.
Do you want to replace it?</source>
        <translation>%1 はすでに存在します。
置き換えますか?</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>保存</translation>
    </message>
</context>
<context>
    <name>KvFooterWidget</name>
    <message>
        <source>Footer</source>
        <translation>フッター</translation>
    </message>
</context>
<context>
    <name>KvGroupByOptionsRow</name>
    <message>
        <source>Group by:</source>
        <translation>グループ化:</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>オブジェクト</translation>
    </message>
    <message>
        <source>Measurement</source>
        <translation>測定項目</translation>
    </message>
</context>
<context>
    <name>KvHeaderWidget</name>
    <message>
        <source>Header</source>
        <translation>ヘッダー</translation>
    </message>
</context>
<context>
    <name>KvImageFile</name>
    <message>
        <source>Cannot read the image file %1</source>
        <translation>画像ファイル %1 を読み取れません</translation>
    </message>
    <message>
        <source>The image that the template holds of %1 is damaged</source>
        <translation>テンプレートに保存されている %1 の画像が壊れています</translation>
    </message>
</context>
<context>
    <name>KvImageNodeOptionsWidget</name>
    <message>
        <source>Image view</source>
        <translation>画像ビュー</translation>
    </message>
    <message>
        <source>Browse</source>
        <translation>参照</translation>
    </message>
    <message>
        <source>Choose an image file</source>
        <translation>画像ファイルを選択します</translation>
    </message>
    <message>
        <source>Choose image file</source>
        <translation>画像ファイルの選択</translation>
    </message>
    <message>
        <source>Image file(*.png *.jpg *.gif *.tif *.bmp)</source>
        <translation>画像ファイル (*.png *.jpg *.gif *.tif *.bmp)</translation>
    </message>
</context>
<context>
    <name>KvImageWidget</name>
    <message>
        <source>Image View</source>
        <translation>画像ビュー</translation>
    </message>
</context>
<context>
    <name>KvPageCountWidget</name>
    <message>
        <source>Page count</source>
        <translation>ページ数</translation>
    </message>
</context>
<context>
    <name>KvPrintProgressDialog</name>
    <message>
        <source>Cancel</source>
        <translation>キャンセル</translation>
    </message>
    <message>
        <source>Printing the report</source>
        <translation>レポートの印刷中</translation>
    </message>
    <message>
        <source>Progress</source>
        <translation>進行状況</translation>
    </message>
    <message>
        <source>Cancel (Esc)</source>
        <translation>キャンセル (Esc)</translation>
    </message>
    <message>
        <source>Page %1 of %2</source>
        <translation>%1 / %2 ページ</translation>
    </message>
</context>
<context>
    <name>KvReportGlyphs</name>
    <message>
        <source>No installed font has these characters, the report leaves them out: %1</source>
        <translation>インストールされているフォントにない文字のため、レポートでは省かれます: %1</translation>
    </message>
    <message>
        <source>No installed font has these characters, the report leaves them out: %1 (fonts to install: %2)</source>
        <translation>インストールされているフォントにない文字のため、レポートでは省かれます: %1 (必要なフォント: %2)</translation>
    </message>
</context>
<context>
    <name>KvReportKeywords</name>
    <message>
        <source>Creation date (ISO)</source>
        <translation>作成日 (ISO)</translation>
    </message>
    <message>
        <source>Creation date (Text)</source>
        <translation>作成日 (テキスト)</translation>
    </message>
    <message>
        <source>Creation time</source>
        <translation>作成時刻</translation>
    </message>
    <message>
        <source>Program name</source>
        <translation>プログラム名</translation>
    </message>
    <message>
        <source>Program version</source>
        <translation>プログラムのバージョン</translation>
    </message>
    <message>
        <source>Program vendor</source>
        <translation>プログラムの提供元</translation>
    </message>
</context>
<context>
    <name>KvReportTemplatesEditor</name>
    <message>
        <source>Report template editor</source>
        <translation>レポートテンプレートエディター</translation>
    </message>
    <message>
        <source>Report template file (*.rtp)</source>
        <translation>レポートテンプレートファイル (*.rtp)</translation>
    </message>
</context>
<context>
    <name>KvRotationOptionsRow</name>
    <message>
        <source>Rotation</source>
        <translation>回転</translation>
    </message>
    <message>
        <source>Rotation of the picture, clockwise</source>
        <translation>画像の回転角度 (時計回り)</translation>
    </message>
</context>
<context>
    <name>KvSelectionOverlay</name>
    <message>
        <source>Delete block</source>
        <translation>ブロックを削除</translation>
    </message>
    <message>
        <source>Delete block (Del)</source>
        <translation>ブロックを削除 (Del)</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableNodeCfg</name>
    <message>
        <source>Object Name</source>
        <translation>オブジェクト名</translation>
    </message>
    <message>
        <source>Object Type</source>
        <translation>オブジェクトの種類</translation>
    </message>
    <message>
        <source>Value Name</source>
        <translation>値の名前</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>値</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableOptionsWidget</name>
    <message>
        <source>Measurements table</source>
        <translation>測定値表</translation>
    </message>
    <message>
        <source>Order by:</source>
        <translation>並べ替え:</translation>
    </message>
    <message>
        <source>default</source>
        <translation>既定</translation>
    </message>
    <message>
        <source>%1, ascending</source>
        <translation>%1 (昇順)</translation>
    </message>
    <message>
        <source>%1, descending</source>
        <translation>%1 (降順)</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableWidget</name>
    <message>
        <source>Measurements Table</source>
        <translation>測定値表</translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableNodeCfg</name>
    <message>
        <source>Min</source>
        <translation>最小</translation>
    </message>
    <message>
        <source>Max</source>
        <translation>最大</translation>
    </message>
    <message>
        <source>Average</source>
        <translation>平均</translation>
    </message>
    <message>
        <source>Sigma</source>
        <translation>σ</translation>
    </message>
    <message>
        <source>3 Sigma</source>
        <translation>3σ</translation>
    </message>
    <message>
        <source>6 Sigma</source>
        <translation>6σ</translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableOptionsWidget</name>
    <message>
        <source>Statistics table</source>
        <translation>統計表</translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableWidget</name>
    <message>
        <source>Statistics Table</source>
        <translation>統計表</translation>
    </message>
    <message>
        <source>Object Type</source>
        <translation>オブジェクトの種類</translation>
    </message>
    <message>
        <source>Measurement Type</source>
        <translation>測定項目</translation>
    </message>
</context>
<context>
    <name>KvStatisticsUnitConverter</name>
    <message>
        <source>deg</source>
        <translation>度</translation>
    </message>
    <message>
        <source>pcs</source>
        <translation>個</translation>
    </message>
    <message>
        <source>%</source>
        <translation>%</translation>
    </message>
</context>
<context>
    <name>KvStatisticsWindow</name>
    <message>
        <source>Measurement statistics</source>
        <translation>測定値の統計</translation>
    </message>
    <message>
        <source>Choose a statistics view on the right.</source>
        <translation>右側で統計ビューを選択してください。</translation>
    </message>
    <message>
        <source>No statistics blocks are installed.</source>
        <translation>統計ブロックがインストールされていません。</translation>
    </message>
</context>
<context>
    <name>KvTemplateModel</name>
    <message>
        <source>Cannot read</source>
        <translation>読み取りエラー</translation>
    </message>
    <message>
        <source>Cannot open file %1</source>
        <translation>ファイル %1 を開けません</translation>
    </message>
    <message>
        <source>Error reading file</source>
        <translation>ファイルの読み取りエラー</translation>
    </message>
    <message>
        <source>Cannot read file %1</source>
        <translation>ファイル %1 を読み取れません</translation>
    </message>
    <message>
        <source>Cannot save</source>
        <translation>保存エラー</translation>
    </message>
    <message>
        <source>Cannot create file %1</source>
        <translation>ファイル %1 を作成できません</translation>
    </message>
</context>
<context>
    <name>KvTemplatesEditorWindow</name>
    <message>
        <source>Open a template file</source>
        <translation>テンプレートファイルを開きます</translation>
    </message>
    <message>
        <source>Start a new, empty template</source>
        <translation>新しい空のテンプレートを作成します</translation>
    </message>
    <message>
        <source>Save the template to another file</source>
        <translation>テンプレートを別のファイルに保存します</translation>
    </message>
    <message>
        <source>Save the template</source>
        <translation>テンプレートを保存します</translation>
    </message>
    <message>
        <source>Print the report to a PDF file</source>
        <translation>レポートを PDF ファイルに印刷します</translation>
    </message>
    <message>
        <source>Header on every page</source>
        <translation>各ページにヘッダーを付ける</translation>
    </message>
    <message>
        <source>Footer on every page</source>
        <translation>各ページにフッターを付ける</translation>
    </message>
    <message>
        <source>Page numbers</source>
        <translation>ページ番号</translation>
    </message>
    <message>
        <source>Report pages</source>
        <translation>レポートのページ</translation>
    </message>
    <message>
        <source>Blocks to add</source>
        <translation>追加できるブロック</translation>
    </message>
    <message>
        <source>Are you sure?</source>
        <translation>確認</translation>
    </message>
    <message>
        <source>The template is modified, do you want to save it first?</source>
        <translation>テンプレートが変更されています。先に保存しますか?</translation>
    </message>
    <message>
        <source>Choose file to open</source>
        <translation>開くファイルの選択</translation>
    </message>
    <message>
        <source>Choose file to save</source>
        <translation>保存先ファイルの選択</translation>
    </message>
    <message>
        <source>Choose file to print to</source>
        <translation>印刷先ファイルの選択</translation>
    </message>
    <message>
        <source>Pdf file (*.pdf)</source>
        <translation>PDF ファイル (*.pdf)</translation>
    </message>
    <message>
        <source>Save failed</source>
        <translation>保存に失敗しました</translation>
    </message>
    <message>
        <source>Cannot write to file %1</source>
        <translation>ファイル %1 に書き込めません</translation>
    </message>
    <message>
        <source>[new]</source>
        <translation>[新規]</translation>
    </message>
</context>
<context>
    <name>KvTemplatesEditorWindowUi</name>
    <message>
        <source>Open File</source>
        <translation>ファイルを開く</translation>
    </message>
    <message>
        <source>Clear</source>
        <translation>クリア</translation>
    </message>
    <message>
        <source>Save as ...</source>
        <translation>名前を付けて保存...</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>保存</translation>
    </message>
    <message>
        <source>Print</source>
        <translation>印刷</translation>
    </message>
    <message>
        <source>Add block</source>
        <translation>ブロックの追加</translation>
    </message>
    <message>
        <source>The template is empty. Drag a block from here onto the page.</source>
        <translation>テンプレートは空です。ここからページへブロックをドラッグしてください。</translation>
    </message>
</context>
<context>
    <name>KvTextDocumentNodeOptionsWidget</name>
    <message>
        <source>Text</source>
        <translation>テキスト</translation>
    </message>
    <message>
        <source>Font size in points</source>
        <translation>フォントサイズ (ポイント)</translation>
    </message>
    <message>
        <source>Font size</source>
        <translation>フォントサイズ</translation>
    </message>
    <message>
        <source>Text color</source>
        <translation>文字色</translation>
    </message>
    <message>
        <source>Bold</source>
        <translation>太字</translation>
    </message>
    <message>
        <source>Italic</source>
        <translation>斜体</translation>
    </message>
    <message>
        <source>Underline</source>
        <translation>下線</translation>
    </message>
    <message>
        <source>Align left</source>
        <translation>左揃え</translation>
    </message>
    <message>
        <source>Align center</source>
        <translation>中央揃え</translation>
    </message>
    <message>
        <source>Align right</source>
        <translation>右揃え</translation>
    </message>
    <message>
        <source>Justify</source>
        <translation>両端揃え</translation>
    </message>
    <message>
        <source>Superscript</source>
        <translation>上付き</translation>
    </message>
    <message>
        <source>Subscript</source>
        <translation>下付き</translation>
    </message>
    <message>
        <source>Insert link</source>
        <translation>リンクを挿入</translation>
    </message>
    <message>
        <source>Insert picture</source>
        <translation>画像を挿入</translation>
    </message>
    <message>
        <source>Insert tag</source>
        <translation>タグを挿入</translation>
    </message>
    <message>
        <source>Insert a tag that the report replaces by its value</source>
        <translation>レポートで実際の値に置き換えられるタグを挿入します</translation>
    </message>
</context>
<context>
    <name>KvTextDocumentNodeWidget</name>
    <message>
        <source>Text</source>
        <translation>テキスト</translation>
    </message>
</context>
<context>
    <name>KvThemeOptionsRow</name>
    <message>
        <source>Color theme:</source>
        <translation>カラーテーマ:</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>ダーク</translation>
    </message>
    <message>
        <source>Light</source>
        <translation>ライト</translation>
    </message>
</context>
<context>
    <name>KvWidthOptionsRow</name>
    <message>
        <source>W</source>
        <comment>short for width</comment>
        <translation>幅</translation>
    </message>
    <message>
        <source>Width in percent</source>
        <translation>幅 (%)</translation>
    </message>
    <message>
        <source>Width in percent of the page&apos;s content</source>
        <translation>ページの本文領域に対する幅 (%)</translation>
    </message>
</context>
<context>
    <name>KvWindowTitleBar</name>
    <message>
        <source>Close</source>
        <translation>閉じる</translation>
    </message>
</context>
<context>
    <name>StatReportingPlugin</name>
    <message>
        <source>Statistics tools</source>
        <translation>レポートと統計</translation>
    </message>
    <message>
        <source>Select Template File</source>
        <translation>レポートテンプレートファイルの選択</translation>
    </message>
    <message>
        <source>Report Template File (*.rtp)</source>
        <translation>レポートテンプレートファイル (*.rtp)</translation>
    </message>
    <message>
        <source>No report template selected.</source>
        <translation>レポートテンプレートが選択されていません。</translation>
    </message>
</context>
</TS>
