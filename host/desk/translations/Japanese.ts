<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ja_JP" sourcelanguage="en_US">
<context>
    <name>KvDeskActions</name>
    <message>
        <source>&amp;New session</source>
        <translation>新規セッション(&amp;N)</translation>
    </message>
    <message>
        <source>Start an empty session</source>
        <translation>空のセッションを開始</translation>
    </message>
    <message>
        <source>Open &amp;image...</source>
        <translation>画像を開く(&amp;I)...</translation>
    </message>
    <message>
        <source>Open image</source>
        <translation>画像を開く</translation>
    </message>
    <message>
        <source>&amp;Open session...</source>
        <translation>セッションを開く(&amp;O)...</translation>
    </message>
    <message>
        <source>Open session</source>
        <translation>セッションを開く</translation>
    </message>
    <message>
        <source>Import &amp;table...</source>
        <translation>表をインポート(&amp;T)...</translation>
    </message>
    <message>
        <source>Import table of measured values</source>
        <translation>測定値の表をインポート</translation>
    </message>
    <message>
        <source>&amp;Save session</source>
        <translation>セッションを保存(&amp;S)</translation>
    </message>
    <message>
        <source>Save session</source>
        <translation>セッションを保存</translation>
    </message>
    <message>
        <source>Save session &amp;as...</source>
        <translation>名前を付けてセッションを保存(&amp;A)...</translation>
    </message>
    <message>
        <source>Save session to another file</source>
        <translation>セッションを別のファイルに保存</translation>
    </message>
    <message>
        <source>&amp;Quit</source>
        <translation>終了(&amp;Q)</translation>
    </message>
    <message>
        <source>Quit the program</source>
        <translation>プログラムを終了</translation>
    </message>
    <message>
        <source>Zoom &amp;in</source>
        <translation>拡大(&amp;I)</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>拡大</translation>
    </message>
    <message>
        <source>Zoom &amp;out</source>
        <translation>縮小(&amp;O)</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>縮小</translation>
    </message>
    <message>
        <source>&amp;Fit to window</source>
        <translation>ウィンドウに合わせる(&amp;F)</translation>
    </message>
    <message>
        <source>Show the whole image</source>
        <translation>画像全体を表示</translation>
    </message>
    <message>
        <source>&amp;Actual size</source>
        <translation>実際のサイズ(&amp;A)</translation>
    </message>
    <message>
        <source>Show the image at 100 %</source>
        <translation>画像を 100% で表示</translation>
    </message>
    <message>
        <source>&amp;Measured values</source>
        <translation>測定値(&amp;M)</translation>
    </message>
    <message>
        <source>Show or hide the measured values</source>
        <translation>測定値の表示/非表示</translation>
    </message>
    <message>
        <source>Stat&amp;us log</source>
        <translation>ステータスログ(&amp;U)</translation>
    </message>
    <message>
        <source>Show or hide the status log</source>
        <translation>ステータスログの表示/非表示</translation>
    </message>
    <message>
        <source>&amp;Dark or light theme</source>
        <translation>ダーク/ライトテーマ(&amp;D)</translation>
    </message>
    <message>
        <source>Change between the dark and the light theme</source>
        <translation>ダークテーマとライトテーマを切り替え</translation>
    </message>
    <message>
        <source>Settin&amp;gs...</source>
        <translation>設定(&amp;G)...</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>設定</translation>
    </message>
    <message>
        <source>&amp;About Measuring Desk</source>
        <translation>Measuring Desk について(&amp;A)</translation>
    </message>
    <message>
        <source>About Measuring Desk</source>
        <translation>Measuring Desk について</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>command (shortcut)</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>&amp;Export measured values...</source>
        <translation>測定値をエクスポート(&amp;E)...</translation>
    </message>
    <message>
        <source>Export measured values as a table</source>
        <translation>測定値を表としてエクスポート</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>元に戻す(&amp;U)</translation>
    </message>
    <message>
        <source>Undo the last step</source>
        <translation>直前の操作を元に戻す</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>やり直し(&amp;R)</translation>
    </message>
    <message>
        <source>Redo what was undone</source>
        <translation>元に戻した操作をやり直す</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>切り取り(&amp;T)</translation>
    </message>
    <message>
        <source>Cut the selected objects</source>
        <translation>選択したオブジェクトを切り取り</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>コピー(&amp;C)</translation>
    </message>
    <message>
        <source>Copy the selected objects</source>
        <translation>選択したオブジェクトをコピー</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>貼り付け(&amp;P)</translation>
    </message>
    <message>
        <source>Paste copied objects</source>
        <translation>コピーしたオブジェクトを貼り付け</translation>
    </message>
    <message>
        <source>&amp;Delete</source>
        <translation>削除(&amp;D)</translation>
    </message>
    <message>
        <source>Delete the selected objects</source>
        <translation>選択したオブジェクトを削除</translation>
    </message>
    <message>
        <source>Select &amp;all</source>
        <translation>すべて選択(&amp;A)</translation>
    </message>
    <message>
        <source>Select all objects on the image</source>
        <translation>画像上のすべてのオブジェクトを選択</translation>
    </message>
    <message>
        <source>Re&amp;name</source>
        <translation>名前の変更(&amp;N)</translation>
    </message>
    <message>
        <source>Give the selected object a name</source>
        <translation>選択したオブジェクトに名前を付ける</translation>
    </message>
    <message>
        <source>&amp;Find measured values</source>
        <translation>測定値を検索(&amp;F)</translation>
    </message>
    <message>
        <source>Filter the measured values</source>
        <translation>測定値をフィルターで絞り込む</translation>
    </message>
    <message>
        <source>&amp;Select</source>
        <translation>選択(&amp;S)</translation>
    </message>
    <message>
        <source>Select and change objects</source>
        <translation>オブジェクトを選択・変更</translation>
    </message>
    <message>
        <source>&amp;Line</source>
        <translation>直線(&amp;L)</translation>
    </message>
    <message>
        <source>Measure a length</source>
        <translation>長さを測定</translation>
    </message>
    <message>
        <source>&amp;Polyline</source>
        <translation>折れ線(&amp;P)</translation>
    </message>
    <message>
        <source>Measure the length of a way</source>
        <translation>経路の長さを測定</translation>
    </message>
    <message>
        <source>Parallel &amp;distance</source>
        <translation>平行距離(&amp;D)</translation>
    </message>
    <message>
        <source>Measure the distance of a point from a line</source>
        <translation>点と直線の距離を測定</translation>
    </message>
    <message>
        <source>&amp;Arc</source>
        <translation>円弧(&amp;A)</translation>
    </message>
    <message>
        <source>Measure an arc through three points</source>
        <translation>3 点を通る円弧を測定</translation>
    </message>
    <message>
        <source>&amp;Circle</source>
        <translation>円(&amp;C)</translation>
    </message>
    <message>
        <source>Measure a circle</source>
        <translation>円を測定</translation>
    </message>
    <message>
        <source>&amp;Rectangle</source>
        <translation>長方形(&amp;R)</translation>
    </message>
    <message>
        <source>Measure a rectangle</source>
        <translation>長方形を測定</translation>
    </message>
    <message>
        <source>Poly&amp;gon</source>
        <translation>多角形(&amp;G)</translation>
    </message>
    <message>
        <source>Measure the area of a polygon</source>
        <translation>多角形の面積を測定</translation>
    </message>
    <message>
        <source>Cou&amp;nter</source>
        <translation>カウンター(&amp;N)</translation>
    </message>
    <message>
        <source>Count by clicks</source>
        <translation>クリックで数える</translation>
    </message>
    <message>
        <source>&amp;Text note</source>
        <translation>テキスト注釈(&amp;T)</translation>
    </message>
    <message>
        <source>Write on the image</source>
        <translation>画像に文字を書き込む</translation>
    </message>
    <message>
        <source>Scale &amp;bar</source>
        <translation>スケールバー(&amp;B)</translation>
    </message>
    <message>
        <source>Draw a scale bar</source>
        <translation>スケールバーを描く</translation>
    </message>
    <message>
        <source>Cal&amp;ibration...</source>
        <translation>校正(&amp;I)...</translation>
    </message>
    <message>
        <source>Say how large a pixel of the image is</source>
        <translation>画像の 1 ピクセルの大きさを指定</translation>
    </message>
    <message>
        <source>Use the file&apos;s pixel size</source>
        <translation>ファイルのピクセルサイズを使用</translation>
    </message>
    <message>
        <source>Measure with the pixel size that the image&apos;s file states</source>
        <translation>画像ファイルに記録されたピクセルサイズで測定</translation>
    </message>
    <message>
        <source>&amp;Take snapshot</source>
        <translation>スナップショットを撮影(&amp;T)</translation>
    </message>
    <message>
        <source>Save the image to the gallery</source>
        <translation>画像をギャラリーに保存</translation>
    </message>
    <message>
        <source>Snapshots &amp;with measurements</source>
        <translation>測定結果付きスナップショット(&amp;W)</translation>
    </message>
    <message>
        <source>Draw the measured objects on snapshots</source>
        <translation>測定オブジェクトをスナップショットに描画</translation>
    </message>
    <message>
        <source>&amp;Freeze</source>
        <translation>静止(&amp;F)</translation>
    </message>
    <message>
        <source>Freeze the live image</source>
        <translation>ライブ画像を静止</translation>
    </message>
    <message>
        <source>&amp;Labels on the image</source>
        <translation>画像上のラベル(&amp;L)</translation>
    </message>
    <message>
        <source>Show or hide the labels of objects</source>
        <translation>オブジェクトのラベルの表示/非表示</translation>
    </message>
    <message>
        <source>&amp;Rulers</source>
        <translation>ルーラー(&amp;R)</translation>
    </message>
    <message>
        <source>Show or hide the rulers</source>
        <translation>ルーラーの表示/非表示</translation>
    </message>
    <message>
        <source>&amp;Scale bar on the image</source>
        <translation>画像上のスケールバー(&amp;S)</translation>
    </message>
    <message>
        <source>Show or hide the scale bar, on reports, too</source>
        <translation>スケールバーの表示/非表示 (レポートにも反映)</translation>
    </message>
    <message>
        <source>&amp;Gallery</source>
        <translation>ギャラリー(&amp;G)</translation>
    </message>
    <message>
        <source>Show or hide the gallery</source>
        <translation>ギャラリーの表示/非表示</translation>
    </message>
    <message>
        <source>&amp;Start page</source>
        <translation>スタートページ(&amp;S)</translation>
    </message>
    <message>
        <source>Show the first steps, the examples and the recent sessions</source>
        <translation>最初の手順、サンプル、最近使用したセッションを表示</translation>
    </message>
    <message>
        <source>&amp;User guide</source>
        <translation>ユーザーガイド(&amp;U)</translation>
    </message>
    <message>
        <source>Read the user guide</source>
        <translation>ユーザーガイドを表示</translation>
    </message>
</context>
<context>
    <name>KvDeskAutosave</name>
    <message>
        <source>the folder &quot;%1&quot; cannot be written</source>
        <translation>フォルダー「%1」に書き込めません</translation>
    </message>
    <message>
        <source>Unsaved changes are not being copied: %1</source>
        <translation>未保存の変更をバックアップできません: %1</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationCommands</name>
    <message>
        <source>The session measures with it already</source>
        <translation>セッションはすでにこのピクセルサイズで測定しています</translation>
    </message>
    <message>
        <source>The image&apos;s file does not state one</source>
        <translation>画像ファイルにピクセルサイズが記録されていません</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationDialog</name>
    <message>
        <source>Calibration</source>
        <translation>校正</translation>
    </message>
    <message>
        <source>Objective</source>
        <translation>対物レンズ</translation>
    </message>
    <message>
        <source>Choose an objective, or type the name of a new one</source>
        <translation>対物レンズを選択するか、新しい対物レンズの名前を入力します</translation>
    </message>
    <message>
        <source>Such as 10x</source>
        <translation>例: 10x</translation>
    </message>
    <message>
        <source>In use</source>
        <translation>使用中</translation>
    </message>
    <message>
        <source>New calibration</source>
        <translation>新しい校正</translation>
    </message>
    <message>
        <source>Known distance</source>
        <translation>既知の距離</translation>
    </message>
    <message>
        <source>Image file</source>
        <translation>画像ファイル</translation>
    </message>
    <message>
        <source>Typed</source>
        <translation>手入力</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>名前</translation>
    </message>
    <message>
        <source>Who</source>
        <translation>実施者</translation>
    </message>
    <message>
        <source>Note</source>
        <translation>備考</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>校正</translation>
    </message>
    <message>
        <source>History of the objective</source>
        <translation>対物レンズの履歴</translation>
    </message>
    <message>
        <source>Calibrations of this objective appear here</source>
        <translation>この対物レンズの校正がここに表示されます</translation>
    </message>
    <message>
        <source>Use again</source>
        <translation>再使用</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>閉じる</translation>
    </message>
    <message>
        <source>New pixel size: %1</source>
        <translation>新しいピクセルサイズ: %1</translation>
    </message>
    <message>
        <source>No pixel size yet</source>
        <translation>ピクセルサイズ未設定</translation>
    </message>
    <message>
        <source>Measure with this pixel size and remember it</source>
        <translation>このピクセルサイズで測定し、履歴に保存します</translation>
    </message>
    <message>
        <source>Complete the fields above first</source>
        <translation>先に上の項目をすべて入力してください</translation>
    </message>
    <message>
        <source>Measure with the selected calibration</source>
        <translation>選択した校正で測定します</translation>
    </message>
    <message>
        <source>Select a calibration in the table first</source>
        <translation>先に表で校正を選択してください</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationHistory</name>
    <message>
        <source>Date</source>
        <translation>日付</translation>
    </message>
    <message>
        <source>Who</source>
        <translation>実施者</translation>
    </message>
    <message>
        <source>Pixel size</source>
        <translation>ピクセルサイズ</translation>
    </message>
    <message>
        <source>Origin</source>
        <translation>取得元</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>名前</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationText</name>
    <message>
        <source>%1 μm</source>
        <comment>size of a pixel</comment>
        <translation>%1 μm</translation>
    </message>
    <message>
        <source>%1 × %2 μm</source>
        <comment>width and height of a pixel</comment>
        <translation>%1 × %2 μm</translation>
    </message>
    <message>
        <source>Known distance</source>
        <translation>既知の距離</translation>
    </message>
    <message>
        <source>Image file</source>
        <translation>画像ファイル</translation>
    </message>
    <message>
        <source>Typed</source>
        <translation>手入力</translation>
    </message>
    <message>
        <source>Not calibrated</source>
        <translation>未校正</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationWay</name>
    <message>
        <source>Type a number such as 5.3 or 5,3</source>
        <translation>5.3 や 5,3 のような数値を入力してください</translation>
    </message>
    <message>
        <source>A pixel measures between %1 and %2</source>
        <translation>ピクセルの大きさは %1 から %2 までです</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrator</name>
    <message>
        <source>%1 states pixels of %2; the session measures with %3</source>
        <translation>%1 に記録されたピクセルサイズは %2 ですが、セッションは %3 で測定しています</translation>
    </message>
    <message>
        <source>%1 states pixels of %2; the session measures in pixels</source>
        <translation>%1 に記録されたピクセルサイズは %2 ですが、セッションはピクセル単位で測定しています</translation>
    </message>
    <message>
        <source>Calibrated: %1, %2 per pixel</source>
        <extracomment>%1 is an objective or a file, %2 the size of a pixel with its unit</extracomment>
        <translation>校正しました: %1、1 ピクセルあたり %2</translation>
    </message>
</context>
<context>
    <name>KvDeskCommandLine</name>
    <message>
        <source>There is no theme &quot;%1&quot;: use %2</source>
        <translation>テーマ「%1」はありません。%2 を使用してください</translation>
    </message>
    <message>
        <source> or </source>
        <translation> または </translation>
    </message>
    <message>
        <source>Usage: measuringdesk [OPTION...] [SESSION|IMAGE|TABLE|FOLDER|VIDEO...]
Measures objects on images and shows their values.

  --session FILE      open a session
  --image FILE        open an image
  --table FILE        import a table of measured values
  --theme Dark|Light  theme of this run
  --plugins DIR       look for plug-ins here, too; can be given several times
  --help              show this text
  --version           show the version

The environment variable STATREPORT_PLUGINS names more folders with plug-ins.
</source>
        <translation>使用法: measuringdesk [OPTION...] [SESSION|IMAGE|TABLE|FOLDER|VIDEO...]
画像上のオブジェクトを測定し、その値を表示します。

  --session FILE      セッションを開く
  --image FILE        画像を開く
  --table FILE        測定値の表をインポートする
  --theme Dark|Light  今回の起動で使うテーマ
  --plugins DIR       このフォルダーでもプラグインを探す (複数回指定可)
  --help              このテキストを表示する
  --version           バージョンを表示する

環境変数 STATREPORT_PLUGINS で、プラグインのフォルダーをさらに指定できます。
</translation>
    </message>
    <message>
        <source>%1 (measuringdesk --help tells more)</source>
        <translation>%1 (詳細: measuringdesk --help)</translation>
    </message>
</context>
<context>
    <name>KvDeskCounterBar</name>
    <message>
        <source>Clicks count for</source>
        <translation>クリックの計数先</translation>
    </message>
    <message>
        <source>The counter that gets the clicks (1 to 9)</source>
        <translation>クリックを計数するカウンター (キー 1 ～ 9)</translation>
    </message>
    <message>
        <source>Count another class</source>
        <translation>別のクラスを数える</translation>
    </message>
    <message>
        <source>A right click takes a place away</source>
        <translation>右クリックで計数点を削除</translation>
    </message>
    <message>
        <source>A new counter</source>
        <translation>新しいカウンター</translation>
    </message>
</context>
<context>
    <name>KvDeskEditCommands</name>
    <message>
        <source>&amp;Undo %1</source>
        <extracomment>%1 is what is undone or redone, such as &quot;move of Line 3&quot;</extracomment>
        <translation>元に戻す(&amp;U): %1</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>元に戻す(&amp;U)</translation>
    </message>
    <message>
        <source>&amp;Redo %1</source>
        <translation>やり直し(&amp;R): %1</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>やり直し(&amp;R)</translation>
    </message>
    <message>
        <source>Nothing was done yet</source>
        <translation>元に戻す操作がありません</translation>
    </message>
    <message>
        <source>Nothing was undone</source>
        <translation>やり直す操作がありません</translation>
    </message>
    <message>
        <source>Select an object first</source>
        <translation>先にオブジェクトを選択してください</translation>
    </message>
    <message>
        <source>Select one object first</source>
        <translation>先にオブジェクトを 1 つ選択してください</translation>
    </message>
    <message>
        <source>No measured objects were copied</source>
        <translation>測定オブジェクトがコピーされていません</translation>
    </message>
    <message>
        <source>Finish or cancel what you have begun first</source>
        <translation>先に、始めた操作を完了するか取り消してください</translation>
    </message>
</context>
<context>
    <name>KvDeskExamples</name>
    <message>
        <source>Coin: first length</source>
        <translation>コイン: はじめての測定</translation>
    </message>
    <message>
        <source>Plate: dimensions</source>
        <translation>プレート: 寸法</translation>
    </message>
    <message>
        <source>Cells: counting</source>
        <translation>細胞: 計数</translation>
    </message>
    <message>
        <source>Fibres: statistics</source>
        <translation>繊維: 統計</translation>
    </message>
</context>
<context>
    <name>KvDeskExportCommand</name>
    <message>
        <source>Nothing was measured yet</source>
        <translation>まだ何も測定されていません</translation>
    </message>
    <message>
        <source>Measured values</source>
        <comment>file name</comment>
        <translation>測定値</translation>
    </message>
    <message>
        <source>JSON files</source>
        <translation>JSON ファイル</translation>
    </message>
    <message>
        <source>CSV tables</source>
        <translation>CSV 表</translation>
    </message>
    <message>
        <source>Export measured values</source>
        <translation>測定値のエクスポート</translation>
    </message>
    <message>
        <source>Export cancelled: %1</source>
        <translation>エクスポートをキャンセルしました: %1</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; was not written.</source>
        <translation>表「%1」を書き込めませんでした。</translation>
    </message>
    <message>
        <source>Measured values exported: %1</source>
        <translation>測定値をエクスポートしました: %1</translation>
    </message>
    <message>
        <source>Exporting measured values</source>
        <translation>測定値をエクスポート中</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>キャンセル</translation>
    </message>
</context>
<context>
    <name>KvDeskExportDialog</name>
    <message>
        <source>Export measured values</source>
        <translation>測定値のエクスポート</translation>
    </message>
    <message>
        <source>Table</source>
        <translation>表</translation>
    </message>
    <message>
        <source>Numbers</source>
        <translation>数値</translation>
    </message>
    <message>
        <source>Byte order mark, for spreadsheets that do not expect UTF-8</source>
        <translation>BOM を付ける (UTF-8 を前提としない表計算ソフト用)</translation>
    </message>
    <message>
        <source>Apostrophe before names that spreadsheets take for formulas</source>
        <translation>数式と見なされる名前の前にアポストロフィを付ける</translation>
    </message>
    <message>
        <source>Changes names that begin with =, +, - or @: they are others when the table is imported again</source>
        <translation>=、+、-、@ で始まる名前を変更します。表を再度インポートすると別の名前になります</translation>
    </message>
    <message>
        <source>Export...</source>
        <translation>エクスポート...</translation>
    </message>
    <message>
        <source>CSV, one row per value</source>
        <translation>CSV、値ごとに 1 行</translation>
    </message>
    <message>
        <source>CSV, one row per object</source>
        <translation>CSV、オブジェクトごとに 1 行</translation>
    </message>
    <message>
        <source>JSON</source>
        <translation>JSON</translation>
    </message>
    <message>
        <source>1.5, commas between the fields</source>
        <translation>1.5、区切りはカンマ</translation>
    </message>
    <message>
        <source>1,5, semicolons between the fields (spreadsheets, %1)</source>
        <extracomment>%1 is the name of a language</extracomment>
        <translation>1,5、区切りはセミコロン (表計算ソフト、%1)</translation>
    </message>
    <message>
        <source>1.5, commas between the fields (spreadsheets, %1)</source>
        <translation>1.5、区切りはカンマ (表計算ソフト、%1)</translation>
    </message>
    <message>
        <source>For statistics programs. Can be imported here again.</source>
        <translation>統計ソフト用です。ここに再度インポートできます。</translation>
    </message>
    <message>
        <source>For spreadsheets. Headings name the units.</source>
        <translation>表計算ソフト用です。見出しに単位が入ります。</translation>
    </message>
    <message>
        <source>For programs. Numbers always have a decimal point.</source>
        <translation>プログラム用です。数値の小数点は常にピリオドです。</translation>
    </message>
    <message>
        <source>No measured object is selected</source>
        <translation>測定オブジェクトが選択されていません</translation>
    </message>
    <message>
        <source>Concerns CSV tables only</source>
        <translation>CSV 表にのみ適用されます</translation>
    </message>
    <message numerus="yes">
        <source>Only the selected object(s) (%n)</source>
        <translation>
            <numerusform>選択したオブジェクトのみ (%n 個)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskExposureControl</name>
    <message>
        <source>E&amp;xposure</source>
        <translation>露光(&amp;X)</translation>
    </message>
    <message>
        <source>Exposure time of the camera</source>
        <translation>カメラの露光時間</translation>
    </message>
    <message>
        <source> ms</source>
        <comment>milliseconds</comment>
        <translation> ms</translation>
    </message>
</context>
<context>
    <name>KvDeskFileCommands</name>
    <message>
        <source>Sessions</source>
        <translation>セッション</translation>
    </message>
    <message>
        <source>All files</source>
        <translation>すべてのファイル</translation>
    </message>
    <message>
        <source>Unsaved changes</source>
        <translation>未保存の変更</translation>
    </message>
    <message>
        <source>Save the changes to &quot;%1&quot;?</source>
        <translation>「%1」への変更を保存しますか?</translation>
    </message>
    <message>
        <source>The session &quot;%1&quot; was not opened.</source>
        <translation>セッション「%1」を開けませんでした。</translation>
    </message>
    <message>
        <source>Image missing</source>
        <translation>画像が見つかりません</translation>
    </message>
    <message>
        <source>Open the session without its image?</source>
        <translation>画像なしでセッションを開きますか?</translation>
    </message>
    <message>
        <source>The image &quot;%1&quot; was not opened.</source>
        <translation>画像「%1」を開けませんでした。</translation>
    </message>
    <message>
        <source>Image opened: %1</source>
        <translation>画像を開きました: %1</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; was not imported.</source>
        <translation>表「%1」をインポートできませんでした。</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>file, remark</comment>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>The session &quot;%1&quot; was not saved.</source>
        <translation>セッション「%1」を保存できませんでした。</translation>
    </message>
    <message>
        <source>Session saved: %1</source>
        <translation>セッションを保存しました: %1</translation>
    </message>
    <message>
        <source>Open session</source>
        <translation>セッションを開く</translation>
    </message>
    <message>
        <source>Open image</source>
        <translation>画像を開く</translation>
    </message>
    <message>
        <source>Images</source>
        <translation>画像</translation>
    </message>
    <message>
        <source>Import table</source>
        <translation>表のインポート</translation>
    </message>
    <message>
        <source>Tables</source>
        <translation>表</translation>
    </message>
    <message>
        <source>Save session</source>
        <translation>セッションの保存</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>Only one session can be open; not opened: %1</source>
        <translation>開けるセッションは 1 つだけです。開いていないファイル: %1</translation>
    </message>
    <message>
        <source>Neither a session, an image nor a table: %1</source>
        <translation>セッション、画像、表のいずれでもありません: %1</translation>
    </message>
    <message>
        <source>There is not enough memory</source>
        <translation>メモリが不足しています</translation>
    </message>
    <message>
        <source>Opening &quot;%1&quot;</source>
        <translation>「%1」を開いています</translation>
    </message>
    <message>
        <source>The measurements were not restored.</source>
        <translation>測定データを復元できませんでした。</translation>
    </message>
    <message>
        <source>Restoring measurements</source>
        <translation>測定データを復元しています</translation>
    </message>
    <message>
        <source>Importing &quot;%1&quot;</source>
        <translation>「%1」をインポートしています</translation>
    </message>
    <message>
        <source>Saving &quot;%1&quot;</source>
        <translation>「%1」を保存しています</translation>
    </message>
    <message>
        <source>Session changed by another program</source>
        <translation>別のプログラムによるセッションの変更</translation>
    </message>
    <message>
        <source>&quot;%1&quot; was changed by another program. Overwrite its changes?</source>
        <translation>「%1」は別のプログラムで変更されました。その変更を上書きしますか?</translation>
    </message>
    <message>
        <source>Overwrite</source>
        <translation>上書き</translation>
    </message>
    <message>
        <source>Save as...</source>
        <translation>名前を付けて保存...</translation>
    </message>
    <message numerus="yes">
        <source>%n files were not opened.</source>
        <extracomment>%n is 2 at least</extracomment>
        <translation>
            <numerusform>%n 個のファイルを開けませんでした。</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Session opened: %1 (%n object(s))</source>
        <translation>
            <numerusform>セッションを開きました: %1 (オブジェクト %n 個)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Measurements restored: %1 (%n object(s))</source>
        <translation>
            <numerusform>測定データを復元しました: %1 (オブジェクト %n 個)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Table imported: %1 (%n object(s))</source>
        <translation>
            <numerusform>表をインポートしました: %1 (オブジェクト %n 個)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskFilePixelSize</name>
    <message>
        <source>%1 states pixels of %2.</source>
        <comment>file, size</comment>
        <translation>%1 に記録されたピクセルサイズは %2 です。</translation>
    </message>
    <message>
        <source>The image&apos;s file does not state how large its pixels are.</source>
        <translation>画像ファイルにピクセルの大きさが記録されていません。</translation>
    </message>
</context>
<context>
    <name>KvDeskGallery</name>
    <message>
        <source>Gallery</source>
        <translation>ギャラリー</translation>
    </message>
    <message>
        <source>Hide the gallery</source>
        <translation>ギャラリーを非表示</translation>
    </message>
    <message>
        <source>&amp;Open image</source>
        <translation>画像を開く(&amp;O)</translation>
    </message>
    <message>
        <source>&amp;Show in folder</source>
        <translation>フォルダーで表示(&amp;S)</translation>
    </message>
    <message>
        <source>&amp;Copy path</source>
        <translation>パスをコピー(&amp;C)</translation>
    </message>
    <message>
        <source>&amp;Move to trash...</source>
        <translation>ごみ箱に移動(&amp;M)...</translation>
    </message>
    <message>
        <source>Choose &amp;folder...</source>
        <translation>フォルダーを選択(&amp;F)...</translation>
    </message>
    <message>
        <source>Show the images of a folder</source>
        <translation>フォルダー内の画像を表示します</translation>
    </message>
    <message>
        <source>Save s&amp;napshots in this folder</source>
        <translation>スナップショットをこのフォルダーに保存(&amp;N)</translation>
    </message>
    <message>
        <source>Folder of the gallery</source>
        <translation>ギャラリーのフォルダー</translation>
    </message>
    <message>
        <source>More commands of the gallery</source>
        <translation>ギャラリーのその他のコマンド</translation>
    </message>
    <message>
        <source>Snapshots</source>
        <translation>スナップショット</translation>
    </message>
    <message>
        <source>Choose folder</source>
        <translation>フォルダーの選択</translation>
    </message>
    <message>
        <source>Snapshots are saved in %1</source>
        <translation>スナップショットの保存先: %1</translation>
    </message>
    <message>
        <source>Snapshots (%1) and the images of a folder appear here; drag them onto report pages</source>
        <translation>スナップショット (%1) とフォルダー内の画像がここに表示されます。レポートのページへドラッグできます</translation>
    </message>
    <message>
        <source>There are no images in %1</source>
        <translation>%1 に画像がありません</translation>
    </message>
    <message>
        <source>The folder %1 does not exist</source>
        <translation>フォルダー %1 は存在しません</translation>
    </message>
    <message>
        <source>Select an image first</source>
        <translation>先に画像を選択してください</translation>
    </message>
    <message>
        <source>Snapshots are saved in this folder already</source>
        <translation>スナップショットはすでにこのフォルダーに保存されます</translation>
    </message>
    <message>
        <source>Move &quot;%1&quot; to the trash?</source>
        <translation>「%1」をごみ箱に移動しますか?</translation>
    </message>
    <message>
        <source>Move to trash</source>
        <translation>ごみ箱に移動</translation>
    </message>
    <message>
        <source>Moved to the trash: %1</source>
        <translation>ごみ箱に移動しました: %1</translation>
    </message>
    <message>
        <source>Not moved to the trash: %1</source>
        <translation>ごみ箱に移動できませんでした: %1</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>The files are still there. They are write-protected, or there is no trash for them.</source>
        <translation>ファイルは元の場所に残っています。書き込み禁止になっているか、使用できるごみ箱がありません。</translation>
    </message>
    <message numerus="yes">
        <source>Move %n selected image(s) to the trash?</source>
        <translation>
            <numerusform>選択した %n 個の画像をごみ箱に移動しますか?</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskGalleryModel</name>
    <message>
        <source>%1 × %2 px</source>
        <comment>width, height</comment>
        <translation>%1 × %2 px</translation>
    </message>
</context>
<context>
    <name>KvDeskGalleryView</name>
    <message>
        <source>Gallery</source>
        <translation>ギャラリー</translation>
    </message>
</context>
<context>
    <name>KvDeskGuideCommand</name>
    <message>
        <source>The user guide is not installed</source>
        <translation>ユーザーガイドがインストールされていません</translation>
    </message>
</context>
<context>
    <name>KvDeskGuideWindow</name>
    <message>
        <source>User guide</source>
        <translation>ユーザーガイド</translation>
    </message>
    <message>
        <source>Contents</source>
        <translation>目次</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>戻る</translation>
    </message>
    <message>
        <source>Forward</source>
        <translation>進む</translation>
    </message>
    <message>
        <source>Find in the guide</source>
        <translation>ガイド内を検索</translation>
    </message>
    <message>
        <source>Find previous</source>
        <translation>前を検索</translation>
    </message>
    <message>
        <source>Find next</source>
        <translation>次を検索</translation>
    </message>
    <message>
        <source>This is the first place</source>
        <translation>最初の位置です</translation>
    </message>
    <message>
        <source>This is the last place</source>
        <translation>最後の位置です</translation>
    </message>
    <message>
        <source>Not found</source>
        <translation>見つかりません</translation>
    </message>
    <message>
        <source>Type what to find first</source>
        <translation>先に検索する語を入力してください</translation>
    </message>
</context>
<context>
    <name>KvDeskImageView</name>
    <message>
        <source>Image</source>
        <translation>画像</translation>
    </message>
    <message>
        <source>Open an image or a session to start</source>
        <translation>画像またはセッションを開いてください</translation>
    </message>
</context>
<context>
    <name>KvDeskInlineEditor</name>
    <message>
        <source>Text</source>
        <translation>テキスト</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>名前</translation>
    </message>
</context>
<context>
    <name>KvDeskKnownDistance</name>
    <message>
        <source>inch</source>
        <translation>インチ</translation>
    </message>
    <message>
        <source>Use selected line</source>
        <translation>選択した直線を使用</translation>
    </message>
    <message>
        <source>Length of the line</source>
        <translation>直線の長さ</translation>
    </message>
    <message>
        <source>Unit of the length</source>
        <translation>長さの単位</translation>
    </message>
    <message>
        <source>Its length</source>
        <translation>実際の長さ</translation>
    </message>
    <message>
        <source>Draw a line over a distance that you know, such as on a stage micrometer, and select it.</source>
        <translation>対物ミクロメーターなど、距離がわかっている箇所に直線を引き、その直線を選択してください。</translation>
    </message>
    <message>
        <source>No line yet</source>
        <translation>直線なし</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>name and length of a line</comment>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>Take the selected line as the known distance</source>
        <translation>選択した直線を既知の距離とします</translation>
    </message>
    <message>
        <source>Select one line on the image first</source>
        <translation>先に画像上の直線を 1 本選択してください</translation>
    </message>
</context>
<context>
    <name>KvDeskLiveBar</name>
    <message>
        <source>Live image</source>
        <translation>ライブ画像</translation>
    </message>
    <message>
        <source>Freeze</source>
        <translation>静止</translation>
    </message>
    <message>
        <source>%1 fps</source>
        <extracomment>frames per second</extracomment>
        <translation>%1 fps</translation>
    </message>
    <message>
        <source>%1 delivers no pictures any more; this is the last one</source>
        <translation>%1 から画像が届かなくなりました。最後の画像を表示しています</translation>
    </message>
    <message>
        <source>%1 delivers no pictures</source>
        <translation>%1 から画像が届きません</translation>
    </message>
    <message>
        <source>%1 is stopped</source>
        <translation>%1 は停止しています</translation>
    </message>
    <message>
        <source>Waiting for the first picture of %1</source>
        <translation>%1 の最初の画像を待っています</translation>
    </message>
    <message>
        <source>Frozen: %1</source>
        <translation>静止中: %1</translation>
    </message>
    <message>
        <source>Live: %1</source>
        <translation>ライブ: %1</translation>
    </message>
    <message>
        <source>This image is not live</source>
        <translation>この画像はライブではありません</translation>
    </message>
    <message>
        <source>&amp;Reconnect</source>
        <translation>再接続(&amp;R)</translation>
    </message>
    <message>
        <source>&amp;Start</source>
        <translation>開始(&amp;S)</translation>
    </message>
    <message>
        <source>Frames per second
Dropped, because newer ones came first: %1</source>
        <translation>1 秒あたりのフレーム数
より新しいフレームが先に届いたため破棄: %1</translation>
    </message>
    <message>
        <source>Stop the live image; other programs can use the camera then</source>
        <translation>ライブ画像を停止します。停止後は他のプログラムがカメラを使用できます</translation>
    </message>
</context>
<context>
    <name>KvDeskMainWindow</name>
    <message>
        <source>&amp;File</source>
        <translation>ファイル(&amp;F)</translation>
    </message>
    <message>
        <source>&amp;Recent sessions</source>
        <translation>最近使用したセッション(&amp;R)</translation>
    </message>
    <message>
        <source>&amp;View</source>
        <translation>表示(&amp;V)</translation>
    </message>
    <message>
        <source>&amp;Help</source>
        <translation>ヘルプ(&amp;H)</translation>
    </message>
    <message>
        <source>Main tool bar</source>
        <translation>メインツールバー</translation>
    </message>
    <message>
        <source>%1[*] - Measuring Desk</source>
        <extracomment>%1 is the name of a session; [*] is replaced by a star when it has unsaved changes</extracomment>
        <translation>%1[*] - Measuring Desk</translation>
    </message>
    <message>
        <source>None yet</source>
        <translation>まだありません</translation>
    </message>
    <message>
        <source>About Measuring Desk</source>
        <translation>Measuring Desk について</translation>
    </message>
    <message>
        <source>&lt;b&gt;Measuring Desk %1&lt;/b&gt;&lt;p&gt;Measures objects on images, and hosts plug-ins such as the statistics reports.&lt;/p&gt;&lt;p&gt;%2, MIT licence&lt;/p&gt;</source>
        <translation>&lt;b&gt;Measuring Desk %1&lt;/b&gt;&lt;p&gt;画像上のオブジェクトを測定し、統計レポートなどのプラグインを組み込めるソフトウェアです。&lt;/p&gt;&lt;p&gt;%2、MIT ライセンス&lt;/p&gt;</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>編集(&amp;E)</translation>
    </message>
    <message>
        <source>&amp;Image</source>
        <translation>画像(&amp;I)</translation>
    </message>
    <message>
        <source>&amp;Measure</source>
        <translation>測定(&amp;M)</translation>
    </message>
    <message>
        <source>Choose the image source</source>
        <translation>画像ソースを選択</translation>
    </message>
</context>
<context>
    <name>KvDeskNotice</name>
    <message>
        <source>Close this message</source>
        <translation>このメッセージを閉じる</translation>
    </message>
</context>
<context>
    <name>KvDeskObjectClipboard</name>
    <message>
        <source>Type</source>
        <translation>種類</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>オブジェクト</translation>
    </message>
    <message>
        <source>Value name</source>
        <translation>値の名前</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>値</translation>
    </message>
</context>
<context>
    <name>KvDeskObjectEditor</name>
    <message numerus="yes">
        <source>%n objects</source>
        <comment>several measured objects</comment>
        <extracomment>%n is 2 at least</extracomment>
        <translation>
            <numerusform>%n 個のオブジェクト</numerusform>
        </translation>
    </message>
    <message>
        <source>drawing of %1</source>
        <translation>%1の描画</translation>
    </message>
    <message>
        <source>change of %1</source>
        <translation>%1の変更</translation>
    </message>
    <message>
        <source>move of %1</source>
        <translation>%1の移動</translation>
    </message>
    <message>
        <source>renaming of %1</source>
        <translation>%1の名前の変更</translation>
    </message>
    <message>
        <source>text of %1</source>
        <translation>%1のテキストの変更</translation>
    </message>
    <message>
        <source>showing of %1 of %2</source>
        <extracomment>%1 is a value, %2 an object</extracomment>
        <translation>%2の%1の表示</translation>
    </message>
    <message>
        <source>hiding of %1 of %2</source>
        <translation>%2の%1の非表示</translation>
    </message>
    <message>
        <source>deletion of %1</source>
        <translation>%1の削除</translation>
    </message>
    <message>
        <source>change of the calibration</source>
        <translation>校正の変更</translation>
    </message>
    <message>
        <source>place of %1</source>
        <translation>%1への計数点の追加</translation>
    </message>
    <message>
        <source>deletion of a place of %1</source>
        <translation>%1の計数点の削除</translation>
    </message>
    <message>
        <source>pasting of %1</source>
        <translation>%1の貼り付け</translation>
    </message>
    <message>
        <source>import of %1</source>
        <translation>%1のインポート</translation>
    </message>
</context>
<context>
    <name>KvDeskPlugins</name>
    <message>
        <source>No plug-ins were found</source>
        <translation>プラグインが見つかりませんでした</translation>
    </message>
    <message>
        <source>It is no plug-in for this program</source>
        <translation>このプログラム用のプラグインではありません</translation>
    </message>
    <message>
        <source>Its tools &quot;%1&quot; could not be started</source>
        <translation>ツール「%1」を開始できませんでした</translation>
    </message>
    <message>
        <source>Plug-in loaded: %1</source>
        <translation>プラグインを読み込みました: %1</translation>
    </message>
    <message>
        <source>Plug-in not loaded: %1: %2</source>
        <translation>プラグインを読み込めませんでした: %1: %2</translation>
    </message>
    <message>
        <source>It failed: %1</source>
        <translation>失敗しました: %1</translation>
    </message>
    <message>
        <source>It failed for a reason of its own</source>
        <translation>プラグイン固有の原因で失敗しました</translation>
    </message>
</context>
<context>
    <name>KvDeskProgress</name>
    <message>
        <source>Cancel</source>
        <translation>キャンセル</translation>
    </message>
    <message>
        <source>Leave everything as it was (Esc)</source>
        <translation>何も変更せずに中止します (Esc)</translation>
    </message>
    <message>
        <source>This can no longer be cancelled</source>
        <translation>もうキャンセルできません</translation>
    </message>
</context>
<context>
    <name>KvDeskRecovery</name>
    <message>
        <source>Untitled session</source>
        <translation>無題のセッション</translation>
    </message>
    <message numerus="yes">
        <source>%1 (%n object(s))</source>
        <extracomment>%1 is the name of a session</extracomment>
        <translation>
            <numerusform>%1 (オブジェクト %n 個)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskRecoveryBar</name>
    <message>
        <source>Show other measurements that were not saved</source>
        <translation>保存されていないほかの測定データを表示します</translation>
    </message>
    <message>
        <source>Restore</source>
        <translation>復元</translation>
    </message>
    <message>
        <source>Open these measurements as a session with unsaved changes</source>
        <translation>この測定データを、未保存の変更があるセッションとして開きます</translation>
    </message>
    <message>
        <source>Discard</source>
        <translation>破棄</translation>
    </message>
    <message>
        <source>Delete these measurements for good</source>
        <translation>この測定データを完全に削除します</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <extracomment>%1 is a time, %2 a session</extracomment>
        <translation>%1: %2</translation>
    </message>
    <message numerus="yes">
        <source>%n more</source>
        <comment>measurements that were not saved</comment>
        <translation>
            <numerusform>ほか %n 件</numerusform>
        </translation>
    </message>
    <message>
        <source>Measurements from %1 were not saved.</source>
        <translation>%1 の測定データが保存されていません。</translation>
    </message>
</context>
<context>
    <name>KvDeskRuler</name>
    <message>
        <source>Horizontal ruler</source>
        <translation>水平ルーラー</translation>
    </message>
    <message>
        <source>Vertical ruler</source>
        <translation>垂直ルーラー</translation>
    </message>
    <message>
        <source>Ruler in %1</source>
        <translation>ルーラー (%1)</translation>
    </message>
</context>
<context>
    <name>KvDeskSelectionStatistics</name>
    <message>
        <source>n = %1, mean %2, SD %3, min %4, max %5</source>
        <extracomment>number of values, their mean, standard deviation, smallest and largest one</extracomment>
        <translation>n = %1、平均 %2、SD %3、最小 %4、最大 %5</translation>
    </message>
    <message>
        <source>Selected values: %1</source>
        <translation>選択した値: %1</translation>
    </message>
    <message>
        <source>Mean: %1</source>
        <translation>平均: %1</translation>
    </message>
    <message>
        <source>Standard deviation: %1</source>
        <translation>標準偏差: %1</translation>
    </message>
    <message>
        <source>Smallest: %1</source>
        <translation>最小: %1</translation>
    </message>
    <message>
        <source>Largest: %1</source>
        <translation>最大: %1</translation>
    </message>
</context>
<context>
    <name>KvDeskSession</name>
    <message>
        <source>Untitled session</source>
        <translation>無題のセッション</translation>
    </message>
</context>
<context>
    <name>KvDeskSettingsDialog</name>
    <message>
        <source>Settings</source>
        <translation>設定</translation>
    </message>
    <message>
        <source>Appearance</source>
        <translation>外観</translation>
    </message>
    <message>
        <source>Theme</source>
        <translation>テーマ</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>ダーク</translation>
    </message>
    <message>
        <source>Light</source>
        <translation>ライト</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>言語</translation>
    </message>
    <message>
        <source>Another language takes effect when the program is started again.</source>
        <translation>言語の変更は、プログラムの再起動後に有効になります。</translation>
    </message>
    <message>
        <source>Measured values</source>
        <translation>測定値</translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation>自動</translation>
    </message>
    <message>
        <source>Significant digits</source>
        <translation>有効桁数</translation>
    </message>
    <message>
        <source>Length unit</source>
        <translation>長さの単位</translation>
    </message>
    <message>
        <source>Angle unit</source>
        <translation>角度の単位</translation>
    </message>
    <message>
        <source>Degrees (°)</source>
        <translation>度 (°)</translation>
    </message>
    <message>
        <source>Radians (rad)</source>
        <translation>ラジアン (rad)</translation>
    </message>
    <message>
        <source>System default</source>
        <translation>システムの既定</translation>
    </message>
    <message>
        <source>Nothing was changed yet</source>
        <translation>まだ何も変更されていません</translation>
    </message>
</context>
<context>
    <name>KvDeskSnapshotFile</name>
    <message>
        <source>The folder cannot be created</source>
        <translation>フォルダーを作成できません</translation>
    </message>
    <message>
        <source>The picture cannot be encoded</source>
        <translation>画像をエンコードできません</translation>
    </message>
</context>
<context>
    <name>KvDeskSnapshots</name>
    <message>
        <source>Open an image first</source>
        <translation>先に画像を開いてください</translation>
    </message>
    <message>
        <source>No snapshot was taken: earlier ones are still being saved</source>
        <translation>前のスナップショットを保存中のため、撮影できませんでした</translation>
    </message>
    <message>
        <source>Snapshot saved: %1</source>
        <translation>スナップショットを保存しました: %1</translation>
    </message>
    <message>
        <source>The snapshot was not saved. %1</source>
        <translation>スナップショットを保存できませんでした。%1</translation>
    </message>
</context>
<context>
    <name>KvDeskSourceCommands</name>
    <message>
        <source>The image source &quot;%1&quot; was not opened.</source>
        <translation>画像ソース「%1」を開けませんでした。</translation>
    </message>
    <message>
        <source>Image source: %1</source>
        <translation>画像ソース: %1</translation>
    </message>
    <message>
        <source>Open image folder</source>
        <translation>画像フォルダーを開く</translation>
    </message>
    <message>
        <source>Open video</source>
        <translation>動画を開く</translation>
    </message>
    <message>
        <source>Videos</source>
        <translation>動画</translation>
    </message>
</context>
<context>
    <name>KvDeskSourceMenu</name>
    <message>
        <source>Image &amp;source</source>
        <translation>画像ソース(&amp;S)</translation>
    </message>
    <message>
        <source>Still &amp;image...</source>
        <translation>静止画(&amp;I)...</translation>
    </message>
    <message>
        <source>Image &amp;folder...</source>
        <translation>画像フォルダー(&amp;F)...</translation>
    </message>
    <message>
        <source>Play the images of a folder like a camera</source>
        <translation>フォルダー内の画像をカメラのように再生します</translation>
    </message>
    <message>
        <source>&amp;Video...</source>
        <translation>動画(&amp;V)...</translation>
    </message>
    <message>
        <source>Play a video like a camera</source>
        <translation>動画をカメラのように再生します</translation>
    </message>
    <message>
        <source>Looking for cameras...</source>
        <translation>カメラを検索中...</translation>
    </message>
    <message>
        <source>No camera is connected</source>
        <translation>カメラが接続されていません</translation>
    </message>
</context>
<context>
    <name>KvDeskStartPage</name>
    <message>
        <source>From an image to a report</source>
        <translation>画像からレポートまで</translation>
    </message>
    <message>
        <source>Back to the image</source>
        <translation>画像に戻る</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>command (shortcut)</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>Open an image</source>
        <translation>画像を開く</translation>
    </message>
    <message>
        <source>A picture file, or the live image of a camera.</source>
        <translation>画像ファイル、またはカメラのライブ画像。</translation>
    </message>
    <message>
        <source>Choose a camera or another source</source>
        <translation>カメラまたは別のソースを選択</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>校正</translation>
    </message>
    <message>
        <source>Say how large a pixel is. The examples are calibrated already.</source>
        <translation>1 ピクセルの大きさを指定します。サンプルは校正済みです。</translation>
    </message>
    <message>
        <source>Measure and report</source>
        <translation>測定とレポート作成</translation>
    </message>
    <message>
        <source>Drag a line over the image: its length is listed at once. The report panel makes a PDF of all values.</source>
        <translation>画像上でドラッグして直線を引くと、その長さがすぐに一覧に表示されます。レポートパネルで、すべての値を PDF にまとめられます。</translation>
    </message>
    <message>
        <source>Examples to try</source>
        <translation>サンプルで試す</translation>
    </message>
    <message>
        <source>Recent sessions</source>
        <translation>最近使用したセッション</translation>
    </message>
    <message>
        <source>Open an image first</source>
        <translation>先に画像を開いてください</translation>
    </message>
    <message>
        <source>Open a copy of this example</source>
        <translation>このサンプルのコピーを開く</translation>
    </message>
</context>
<context>
    <name>KvDeskStatus</name>
    <message>
        <source>Warning</source>
        <translation>警告</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>エラー</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>情報</translation>
    </message>
</context>
<context>
    <name>KvDeskStatusBar</name>
    <message>
        <source>%1 × %2 px</source>
        <translation>%1 × %2 px</translation>
    </message>
    <message>
        <source>%1 %</source>
        <comment>zoom</comment>
        <translation>%1%</translation>
    </message>
    <message>
        <source>x %1, y %2</source>
        <comment>pixel below the pointer</comment>
        <translation>x %1, y %2</translation>
    </message>
    <message>
        <source>Statistics of the selected values</source>
        <translation>選択した値の統計</translation>
    </message>
    <message>
        <source>, %1</source>
        <comment>objective</comment>
        <translation>, %1</translation>
    </message>
    <message>
        <source>, %1/px</source>
        <comment>size of a pixel</comment>
        <translation>, %1/px</translation>
    </message>
</context>
<context>
    <name>KvDeskStatusLog</name>
    <message>
        <source>Status log</source>
        <translation>ステータスログ</translation>
    </message>
    <message>
        <source>Hide the status log</source>
        <translation>ステータスログを非表示</translation>
    </message>
    <message>
        <source>Clear the status log</source>
        <translation>ステータスログを消去</translation>
    </message>
    <message>
        <source>Messages of the program and its plug-ins appear here</source>
        <translation>プログラムとプラグインのメッセージがここに表示されます</translation>
    </message>
    <message>
        <source>There are no messages</source>
        <translation>メッセージはありません</translation>
    </message>
</context>
<context>
    <name>KvDeskStatusLogModel</name>
    <message>
        <source>%1
Reported by %2</source>
        <comment>message, source</comment>
        <translation>%1
報告元: %2</translation>
    </message>
    <message>
        <source>Category</source>
        <translation>種別</translation>
    </message>
    <message>
        <source>Time</source>
        <translation>時刻</translation>
    </message>
    <message>
        <source>Message</source>
        <translation>メッセージ</translation>
    </message>
</context>
<context>
    <name>KvDeskTableView</name>
    <message>
        <source>Copy</source>
        <translation>コピー</translation>
    </message>
</context>
<context>
    <name>KvDeskToolStrip</name>
    <message>
        <source>Measuring tools</source>
        <translation>測定ツール</translation>
    </message>
</context>
<context>
    <name>KvDeskTypedPixelSize</name>
    <message>
        <source>Width of a pixel in micrometres</source>
        <translation>ピクセルの幅 (マイクロメートル)</translation>
    </message>
    <message>
        <source>Height of a pixel in micrometres</source>
        <translation>ピクセルの高さ (マイクロメートル)</translation>
    </message>
    <message>
        <source>Same size in both directions</source>
        <translation>縦横同じサイズ</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>幅</translation>
    </message>
    <message>
        <source>Height</source>
        <translation>高さ</translation>
    </message>
    <message>
        <source>Type how large a pixel of the image is in reality.</source>
        <translation>画像の 1 ピクセルの実際の大きさを入力してください。</translation>
    </message>
</context>
<context>
    <name>KvDeskValueCommands</name>
    <message>
        <source>Rename</source>
        <translation>名前の変更</translation>
    </message>
    <message>
        <source>Delete object</source>
        <translation>オブジェクトを削除</translation>
    </message>
    <message>
        <source>Hide value</source>
        <translation>値を非表示</translation>
    </message>
    <message>
        <source>Show all values of the object</source>
        <translation>オブジェクトのすべての値を表示</translation>
    </message>
    <message>
        <source>Select one object first</source>
        <translation>先にオブジェクトを 1 つ選択してください</translation>
    </message>
    <message>
        <source>Select an object first</source>
        <translation>先にオブジェクトを選択してください</translation>
    </message>
    <message>
        <source>Select a value first</source>
        <translation>先に値を選択してください</translation>
    </message>
    <message>
        <source>No value of the selected object is hidden</source>
        <translation>選択したオブジェクトに非表示の値はありません</translation>
    </message>
    <message>
        <source>showing of values</source>
        <translation>値の表示</translation>
    </message>
    <message>
        <source>hiding of values</source>
        <translation>値の非表示</translation>
    </message>
</context>
<context>
    <name>KvDeskValueTable</name>
    <message>
        <source>Measured values</source>
        <translation>測定値</translation>
    </message>
    <message>
        <source>Hide the measured values</source>
        <translation>測定値を非表示</translation>
    </message>
    <message>
        <source>Filter by type, object or value name</source>
        <translation>種類、オブジェクト、値の名前で絞り込み</translation>
    </message>
    <message>
        <source>Filter of the measured values</source>
        <translation>測定値のフィルター</translation>
    </message>
    <message>
        <source>Shows only rows that have all of these words</source>
        <translation>入力した語をすべて含む行のみを表示します</translation>
    </message>
    <message>
        <source>No measured value matches the filter</source>
        <translation>フィルターに一致する測定値がありません</translation>
    </message>
    <message>
        <source>Clear the filter</source>
        <translation>フィルターを解除</translation>
    </message>
    <message>
        <source>%1 of %2</source>
        <extracomment>rows that match the filter, all rows</extracomment>
        <translation>%1 / %2</translation>
    </message>
    <message>
        <source>Measured values appear here once something is measured or imported</source>
        <translation>測定またはインポートを行うと、測定値がここに表示されます</translation>
    </message>
    <message>
        <source>There are no measured values yet</source>
        <translation>測定値はまだありません</translation>
    </message>
</context>
<context>
    <name>KvDeskValueTableModel</name>
    <message>
        <source>Type</source>
        <translation>種類</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>オブジェクト</translation>
    </message>
    <message>
        <source>Value name</source>
        <translation>値の名前</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>値</translation>
    </message>
</context>
<context>
    <name>KvToolBase</name>
    <message>
        <source>Reset</source>
        <translation>リセット</translation>
    </message>
    <message>
        <source>Reset to the default values</source>
        <translation>既定値に戻す</translation>
    </message>
</context>
<context>
    <name>QPlatformTheme</name>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>キャンセル</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>適用</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>保存</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>開く</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>閉じる</translation>
    </message>
    <message>
        <source>Discard</source>
        <translation>破棄</translation>
    </message>
    <message>
        <source>&amp;Yes</source>
        <translation>はい(&amp;Y)</translation>
    </message>
    <message>
        <source>&amp;No</source>
        <translation>いいえ(&amp;N)</translation>
    </message>
</context>
<context>
    <name>ZtAppSettings</name>
    <message>
        <source>The settings could not be saved to %1. Check that the folder is writable.</source>
        <translation>設定を %1 に保存できませんでした。フォルダーに書き込めるか確認してください。</translation>
    </message>
    <message>
        <source>The settings file %1 cannot be read. Changes to the settings will not be kept.</source>
        <translation>設定ファイル %1 を読み取れません。設定の変更は保存されません。</translation>
    </message>
    <message>
        <source>The settings file %1 is damaged. It was renamed to %2; all settings are back at their defaults.</source>
        <translation>設定ファイル %1 が壊れています。ファイル名を %2 に変更し、すべての設定を既定値に戻しました。</translation>
    </message>
    <message>
        <source>The settings file %1 is damaged and could not be renamed to %2. Changes to the settings will not be kept.</source>
        <translation>設定ファイル %1 が壊れており、ファイル名を %2 に変更できませんでした。設定の変更は保存されません。</translation>
    </message>
</context>
<context>
    <name>ZtAravisSource</name>
    <message>
        <source>%1 is disconnected; its last picture stays</source>
        <translation>%1 の接続が切れました。最後の画像を表示し続けます</translation>
    </message>
    <message>
        <source>%1 delivers pictures of a kind that cannot be shown</source>
        <translation>%1 からの画像は表示できない形式です</translation>
    </message>
    <message>
        <source>The camera does not take the setting (%1)</source>
        <translation>カメラが設定を受け付けません (%1)</translation>
    </message>
    <message>
        <source>%1 cannot be opened (%2)</source>
        <translation>%1 を開けません (%2)</translation>
    </message>
</context>
<context>
    <name>ZtCalibrationStore</name>
    <message>
        <source>This is not a calibration</source>
        <translation>校正データではありません</translation>
    </message>
    <message>
        <source>A calibration in the settings is damaged and was left out (%1: %2)</source>
        <translation>設定内の校正データが壊れているため、除外しました (%1: %2)</translation>
    </message>
</context>
<context>
    <name>ZtCsvReader</name>
    <message>
        <source>A quoted text does not end</source>
        <translation>引用符で囲まれたテキストが閉じられていません</translation>
    </message>
    <message>
        <source>There is text after a closing quote</source>
        <translation>閉じ引用符の後にテキストがあります</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>読み取りがキャンセルされました</translation>
    </message>
</context>
<context>
    <name>ZtDrawnType</name>
    <message>
        <source>Rectangle</source>
        <translation>長方形</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>幅</translation>
    </message>
    <message>
        <source>Height</source>
        <translation>高さ</translation>
    </message>
    <message>
        <source>Area</source>
        <translation>面積</translation>
    </message>
    <message>
        <source>Line</source>
        <translation>直線</translation>
    </message>
    <message>
        <source>Length</source>
        <translation>長さ</translation>
    </message>
    <message>
        <source>Arc</source>
        <translation>円弧</translation>
    </message>
    <message>
        <source>Angle</source>
        <translation>角度</translation>
    </message>
    <message>
        <source>Arc length</source>
        <translation>円弧の長さ</translation>
    </message>
    <message>
        <source>Polygon</source>
        <translation>多角形</translation>
    </message>
    <message>
        <source>Perimeter</source>
        <translation>周囲長</translation>
    </message>
    <message>
        <source>Polyline</source>
        <translation>折れ線</translation>
    </message>
    <message>
        <source>Parallel distance</source>
        <translation>平行距離</translation>
    </message>
    <message>
        <source>Distance</source>
        <translation>距離</translation>
    </message>
    <message>
        <source>Text note</source>
        <translation>テキスト注釈</translation>
    </message>
    <message>
        <source>Scale bar</source>
        <translation>スケールバー</translation>
    </message>
    <message>
        <source>Counter</source>
        <translation>カウンター</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>個数</translation>
    </message>
    <message>
        <source>Share</source>
        <translation>割合</translation>
    </message>
    <message>
        <source>Circle</source>
        <translation>円</translation>
    </message>
    <message>
        <source>Diameter</source>
        <translation>直径</translation>
    </message>
</context>
<context>
    <name>ZtFileFault</name>
    <message>
        <source>No such file or directory</source>
        <translation>そのようなファイルやディレクトリはありません</translation>
    </message>
    <message>
        <source>Permission denied</source>
        <translation>許可がありません</translation>
    </message>
    <message>
        <source>Is a directory</source>
        <translation>ディレクトリです</translation>
    </message>
    <message>
        <source>Not a directory</source>
        <translation>ディレクトリではありません</translation>
    </message>
    <message>
        <source>File name too long</source>
        <translation>ファイル名が長すぎます</translation>
    </message>
    <message>
        <source>No space left on device</source>
        <translation>デバイスに空き領域がありません</translation>
    </message>
    <message>
        <source>Read-only file system</source>
        <translation>読み込み専用ファイルシステムです</translation>
    </message>
    <message>
        <source>Input/output error</source>
        <translation>入力/出力エラーです</translation>
    </message>
</context>
<context>
    <name>ZtFrameSourceCatalogue</name>
    <message>
        <source>This program cannot play videos</source>
        <translation>このプログラムでは動画を再生できません</translation>
    </message>
    <message>
        <source>This program knows no cameras of this kind</source>
        <translation>この種類のカメラには対応していません</translation>
    </message>
</context>
<context>
    <name>ZtImageFolderSource</name>
    <message>
        <source>%1: no picture of the folder can be shown</source>
        <translation>%1: フォルダー内に表示できる画像がありません</translation>
    </message>
    <message>
        <source>The folder does not exist</source>
        <translation>フォルダーが存在しません</translation>
    </message>
    <message>
        <source>The folder cannot be read</source>
        <translation>フォルダーを読み取れません</translation>
    </message>
    <message>
        <source>The folder holds no pictures</source>
        <translation>フォルダーに画像がありません</translation>
    </message>
</context>
<context>
    <name>ZtKernelImage</name>
    <message>
        <source>%1 delivers pictures again</source>
        <translation>%1 から再び画像が届いています</translation>
    </message>
</context>
<context>
    <name>ZtLiveFrameSource</name>
    <message>
        <source>%1 has stopped delivering pictures; the last one stays</source>
        <translation>%1 から画像が届かなくなりました。最後の画像を表示し続けます</translation>
    </message>
</context>
<context>
    <name>ZtMeasureFormat</name>
    <message>
        <source>pcs</source>
        <translation>個</translation>
    </message>
</context>
<context>
    <name>ZtSession</name>
    <message>
        <source>The file is empty</source>
        <translation>ファイルが空です</translation>
    </message>
    <message>
        <source>The file is not a session</source>
        <translation>セッションファイルではありません</translation>
    </message>
    <message>
        <source>The file cannot be written (%1)</source>
        <translation>ファイルに書き込めません (%1)</translation>
    </message>
    <message>
        <source>This must be a list</source>
        <translation>リストでなければなりません</translation>
    </message>
    <message>
        <source>This must be a text</source>
        <translation>テキストでなければなりません</translation>
    </message>
    <message>
        <source>This must be a whole number from 1</source>
        <translation>1 以上の整数でなければなりません</translation>
    </message>
    <message>
        <source>This must be a number</source>
        <translation>数値でなければなりません</translation>
    </message>
    <message>
        <source>This must be a number greater than 0</source>
        <translation>0 より大きい数値でなければなりません</translation>
    </message>
    <message>
        <source>Another object of this type has the same number</source>
        <translation>同じ種類の別のオブジェクトがこの番号を使っています</translation>
    </message>
    <message>
        <source>This must be an object</source>
        <translation>JSON オブジェクトでなければなりません</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is not a type of objects</source>
        <translation>「%1」はオブジェクトの種類ではありません</translation>
    </message>
    <message>
        <source>An object of type &quot;%1&quot; cannot have this number of points (%2)</source>
        <translation>種類「%1」のオブジェクトは、この数の点を持てません (%2)</translation>
    </message>
    <message>
        <source>A point must be a list of two numbers between -1e9 and 1e9</source>
        <translation>点は -1e9 から 1e9 までの 2 つの数値のリストでなければなりません</translation>
    </message>
    <message>
        <source>This must be the name of a value</source>
        <translation>値の名前でなければなりません</translation>
    </message>
    <message>
        <source>The type has no name</source>
        <translation>種類に名前がありません</translation>
    </message>
    <message>
        <source>A value must have a name of its own</source>
        <translation>値には固有の名前が必要です</translation>
    </message>
    <message>
        <source>The numbers of the rows must rise</source>
        <translation>行の番号は昇順でなければなりません</translation>
    </message>
    <message>
        <source>A row must be a list of number, name and values</source>
        <translation>行は番号、名前、値のリストでなければなりません</translation>
    </message>
    <message>
        <source>This must be a text or null</source>
        <translation>テキストまたは null でなければなりません</translation>
    </message>
    <message>
        <source>This must be a list or an object</source>
        <translation>リストまたは JSON オブジェクトでなければなりません</translation>
    </message>
    <message>
        <source>The table has no such value</source>
        <translation>表にこの値はありません</translation>
    </message>
    <message>
        <source>This must be the text of a number</source>
        <translation>数値を表すテキストでなければなりません</translation>
    </message>
    <message>
        <source>The unit does not fit that of the value</source>
        <translation>単位が値の単位と合いません</translation>
    </message>
    <message>
        <source>The file is nested too deeply</source>
        <translation>ファイルの入れ子が深すぎます</translation>
    </message>
    <message>
        <source>The file is not valid JSON (%1)</source>
        <translation>ファイルは有効な JSON ではありません (%1)</translation>
    </message>
    <message>
        <source>The file does not exist</source>
        <translation>ファイルが存在しません</translation>
    </message>
    <message>
        <source>This is a folder, not a file</source>
        <translation>これはファイルではなくフォルダーです</translation>
    </message>
    <message>
        <source>The file cannot be read (%1)</source>
        <translation>ファイルを読み取れません (%1)</translation>
    </message>
    <message>
        <source>The file is too large for a session</source>
        <translation>ファイルがセッションとしては大きすぎます</translation>
    </message>
    <message>
        <source>This must be a date such as 2026-01-31T12:00:00Z</source>
        <translation>2026-01-31T12:00:00Z のような日時でなければなりません</translation>
    </message>
    <message>
        <source>This must be &quot;knownDistance&quot;, &quot;metadata&quot; or &quot;typed&quot;</source>
        <translation>&quot;knownDistance&quot;、&quot;metadata&quot;、&quot;typed&quot; のいずれかでなければなりません</translation>
    </message>
    <message>
        <source>The file is write-protected</source>
        <translation>ファイルは書き込み禁止です</translation>
    </message>
    <message>
        <source>Writing was cancelled</source>
        <translation>書き込みがキャンセルされました</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>読み取りがキャンセルされました</translation>
    </message>
    <message>
        <source>The session is of the newer version %1; this program reads versions up to %2</source>
        <translation>セッションは新しいバージョン %1 です。このプログラムが読み取れるのはバージョン %2 までです</translation>
    </message>
    <message>
        <source>Sessions of version %1 are not known; this program reads versions %2 to %3</source>
        <translation>バージョン %1 のセッションには対応していません。このプログラムが読み取れるのはバージョン %2 ～ %3 です</translation>
    </message>
    <message>
        <source>This file is a table of values; import it</source>
        <translation>このファイルは測定値の表です。インポートしてください</translation>
    </message>
</context>
<context>
    <name>ZtStillImageSource</name>
    <message>
        <source>The picture does not exist</source>
        <translation>画像が存在しません</translation>
    </message>
    <message>
        <source>This is a folder, not a picture</source>
        <translation>これは画像ではなくフォルダーです</translation>
    </message>
    <message>
        <source>The picture cannot be read</source>
        <translation>画像を読み取れません</translation>
    </message>
    <message>
        <source>The picture has %1 x %2 pixels, which is too many</source>
        <translation>画像が大きすぎます (%1 x %2 ピクセル)</translation>
    </message>
    <message>
        <source>The picture cannot be decoded (%1)</source>
        <translation>画像をデコードできません (%1)</translation>
    </message>
    <message>
        <source>the file is empty</source>
        <translation>ファイルが空です</translation>
    </message>
    <message>
        <source>it has no size</source>
        <translation>サイズがありません</translation>
    </message>
    <message>
        <source>the file is damaged</source>
        <translation>ファイルが壊れています</translation>
    </message>
    <message>
        <source>the file is too short for its picture</source>
        <translation>ファイルが画像に対して短すぎます</translation>
    </message>
    <message>
        <source>there is not enough memory</source>
        <translation>メモリが不足しています</translation>
    </message>
</context>
<context>
    <name>ZtTableImport</name>
    <message>
        <source>&quot;%1&quot; already has a value &quot;%2&quot; in line %3</source>
        <translation>「%1」には %3 行目にすでに値「%2」があります</translation>
    </message>
    <message>
        <source>The file does not exist</source>
        <translation>ファイルが存在しません</translation>
    </message>
    <message>
        <source>This is a folder, not a file</source>
        <translation>これはファイルではなくフォルダーです</translation>
    </message>
    <message>
        <source>The file cannot be read (%1)</source>
        <translation>ファイルを読み取れません (%1)</translation>
    </message>
    <message>
        <source>The table is not open for reading</source>
        <translation>表が読み取り用に開かれていません</translation>
    </message>
    <message>
        <source>The table has no rows</source>
        <translation>表に行がありません</translation>
    </message>
    <message>
        <source>The row and the header differ in their number of fields (%1 and %2)</source>
        <translation>行とヘッダー行のフィールド数が異なります (%1 と %2)</translation>
    </message>
    <message>
        <source>%1 is not a finite number</source>
        <translation>%1 は有限の数値ではありません</translation>
    </message>
    <message>
        <source>%1 is not a number</source>
        <translation>%1 は数値ではありません</translation>
    </message>
    <message>
        <source>&quot;%1&quot; of &quot;%2&quot; is given in &quot;%3&quot; here, but in &quot;%4&quot; before</source>
        <translation>「%2」の「%1」の単位がここでは「%3」ですが、前の箇所では「%4」です</translation>
    </message>
    <message>
        <source>There is no column %1; the columns are %2</source>
        <translation>列 %1 がありません。存在する列: %2</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>オブジェクト</translation>
    </message>
    <message>
        <source>There is no value %1 to give a unit; the values are %2</source>
        <translation>単位を指定する値 %1 がありません。存在する値: %2</translation>
    </message>
    <message>
        <source>The first line announces rows without values</source>
        <translation>1 行目で、値のない行が宣言されています</translation>
    </message>
    <message>
        <source>There is no column %1; the columns of this table have no names</source>
        <translation>列 %1 がありません。この表の列には名前がありません</translation>
    </message>
    <message>
        <source>%1 is not the index of a class; they go from 0 to %2</source>
        <translation>%1 はクラスのインデックスではありません。有効な範囲は 0 ～ %2 です</translation>
    </message>
    <message>
        <source>Value %1</source>
        <translation>値 %1</translation>
    </message>
    <message>
        <source>The file is larger than %1 MB</source>
        <translation>ファイルが %1 MB を超えています</translation>
    </message>
    <message>
        <source>The file is empty</source>
        <translation>ファイルが空です</translation>
    </message>
    <message>
        <source>The first line does not name the columns</source>
        <translation>1 行目に列の名前がありません</translation>
    </message>
    <message>
        <source>Column %1 is not part of a list of values and was left out</source>
        <translation>列 %1 は値の一覧の列ではないため、読み込まれませんでした</translation>
    </message>
    <message>
        <source>Columns %1 are not part of a list of values and were left out</source>
        <translation>列 %1 は値の一覧の列ではないため、読み込まれませんでした</translation>
    </message>
    <message>
        <source>The value has no name</source>
        <translation>値に名前がありません</translation>
    </message>
    <message>
        <source>The row does not say which object it belongs to</source>
        <translation>行がどのオブジェクトに属するのか示されていません</translation>
    </message>
    <message>
        <source>%1 is not a unit</source>
        <translation>%1 は単位ではありません</translation>
    </message>
    <message>
        <source>There is no column of numbers</source>
        <translation>数値の列がありません</translation>
    </message>
    <message>
        <source>Column %1</source>
        <translation>列 %1</translation>
    </message>
    <message>
        <source>Column %1 holds text and was left out</source>
        <translation>列 %1 はテキストを含むため、読み込まれませんでした</translation>
    </message>
    <message>
        <source>Columns %1 hold text and were left out</source>
        <translation>列 %1 はテキストを含むため、読み込まれませんでした</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>読み取りがキャンセルされました</translation>
    </message>
    <message numerus="yes">
        <source>The table has %n row(s), its first line announces %1</source>
        <translation>
            <numerusform>表の行数は %n ですが、1 行目では %1 と宣言されています</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The row has %n field(s) instead of %1</source>
        <translation>
            <numerusform>行のフィールド数が %1 ではなく %n です</numerusform>
        </translation>
    </message>
    <message>
        <source>The records have too many different names</source>
        <translation>レコードに異なる名前が多すぎます</translation>
    </message>
    <message>
        <source>This file is a session, not a table; open it</source>
        <translation>このファイルは表ではなくセッションです。開いてください</translation>
    </message>
    <message>
        <source>The file is neither a list of records nor an export of values</source>
        <translation>このファイルはレコードのリストでも、エクスポートした測定値でもありません</translation>
    </message>
    <message>
        <source>This name comes twice</source>
        <translation>この名前は 2 回出てきます</translation>
    </message>
    <message>
        <source>This must be a text, a number or null</source>
        <translation>ここには文字列、数値、または null が必要です</translation>
    </message>
    <message>
        <source>The table is of version %1; this program reads version %2</source>
        <translation>表のバージョンは %1 ですが、このプログラムはバージョン %2 を読み取ります</translation>
    </message>
</context>
<context>
    <name>ZtTextDecoder</name>
    <message>
        <source>The file is not a text file: it holds a NUL character</source>
        <translation>テキストファイルではありません。NUL 文字が含まれています</translation>
    </message>
    <message>
        <source>The file is not valid UTF-16 text</source>
        <translation>有効な UTF-16 テキストファイルではありません</translation>
    </message>
    <message>
        <source>The text is not valid UTF-8</source>
        <translation>テキストは有効な UTF-8 ではありません</translation>
    </message>
</context>
<context>
    <name>ZtUvcCameraSource</name>
    <message>
        <source>%1 is not connected</source>
        <translation>%1 は接続されていません</translation>
    </message>
    <message>
        <source>%1 is disconnected or in use (%2)</source>
        <translation>%1 は接続が切れたか、使用中です (%2)</translation>
    </message>
</context>
<context>
    <name>ZtVideoFileSource</name>
    <message>
        <source>The video does not exist</source>
        <translation>動画が存在しません</translation>
    </message>
    <message>
        <source>The video cannot be read</source>
        <translation>動画を読み取れません</translation>
    </message>
    <message>
        <source>The video is empty</source>
        <translation>動画が空です</translation>
    </message>
    <message>
        <source>there is only sound in it</source>
        <translation>音声しか含まれていません</translation>
    </message>
    <message>
        <source>The video %1 cannot be played (%2)</source>
        <translation>動画 %1 を再生できません (%2)</translation>
    </message>
    <message>
        <source>the file is damaged</source>
        <translation>ファイルが壊れています</translation>
    </message>
</context>
<context>
    <name>acss</name>
    <message>
        <source>The icon %1 is missing.</source>
        <translation>アイコン %1 がありません。</translation>
    </message>
</context>
</TS>
