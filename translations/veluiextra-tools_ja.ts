<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ja" sourcelanguage="en">
<context>
    <name>DesktopEntryPages</name>
    <message>
        <source>&amp;Read-only</source>
        <translation>読み取り専用(&amp;R)</translation>
    </message>
    <message>
        <source>&amp;Button beside the address</source>
        <translation>アドレスの横のボタン(&amp;B)</translation>
    </message>
    <message>
        <source>Information requested for %1</source>
        <translation>%1 の情報が要求されました</translation>
    </message>
    <message>
        <source>Use the buttons beside the fields to edit commands, files, icons, lists and actions.</source>
        <translation>コマンドとファイル、アイコン、リスト、アクションは、それぞれのフィールドのボタンから編集します。</translation>
    </message>
    <message>
        <source>Properties form</source>
        <translation>プロパティのフォーム</translation>
    </message>
    <message>
        <source>Desktop entries</source>
        <translation>デスクトップエントリ</translation>
    </message>
    <message>
        <source>Paths, icons, lists and actions</source>
        <translation>パス、アイコン、リスト、アクション</translation>
    </message>
    <message>
        <source>&amp;Assistance</source>
        <translation>アシスタンス(&amp;A)</translation>
    </message>
</context>
<context>
    <name>EditorCommands</name>
    <message>
        <source>Open</source>
        <translation>開く</translation>
    </message>
    <message>
        <source>Cannot read %1.</source>
        <translation>%1 を読み取れません。</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>保存</translation>
    </message>
    <message>
        <source>Cannot write %1.</source>
        <translation>%1 に書き込めません。</translation>
    </message>
    <message>
        <source>Go to line</source>
        <translation>指定行に移動</translation>
    </message>
    <message>
        <source>Line:</source>
        <translation>行:</translation>
    </message>
    <message>
        <source>File</source>
        <translation>ファイル</translation>
    </message>
    <message>
        <source>&amp;New</source>
        <translation>新規(&amp;N)</translation>
    </message>
    <message>
        <source>&amp;Open...</source>
        <translation>開く(&amp;O)...</translation>
    </message>
    <message>
        <source>&amp;Save...</source>
        <translation>保存(&amp;S)...</translation>
    </message>
    <message>
        <source>Insert &amp;date</source>
        <translation>日付を挿入(&amp;D)</translation>
    </message>
    <message>
        <source>Insert &amp;time</source>
        <translation>時刻を挿入(&amp;T)</translation>
    </message>
    <message>
        <source>Insert &amp;rule</source>
        <translation>区切り線を挿入(&amp;R)</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>編集</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>元に戻す(&amp;U)</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>やり直し(&amp;R)</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>切り取り(&amp;T)</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>コピー(&amp;C)</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>貼り付け(&amp;P)</translation>
    </message>
    <message>
        <source>Select &amp;all</source>
        <translation>すべて選択(&amp;A)</translation>
    </message>
    <message>
        <source>Select word</source>
        <translation>単語を選択</translation>
    </message>
    <message>
        <source>Select line</source>
        <translation>行を選択</translation>
    </message>
    <message>
        <source>Select paragraph</source>
        <translation>段落を選択</translation>
    </message>
    <message>
        <source>Find selected a&amp;gain</source>
        <translation>選択した文字列の次を検索(&amp;G)</translation>
    </message>
    <message>
        <source>Find selected backward</source>
        <translation>選択した文字列の前を検索</translation>
    </message>
    <message>
        <source>Find selected word</source>
        <translation>選択した単語を検索</translation>
    </message>
    <message>
        <source>Find selected, matching case</source>
        <translation>大文字と小文字を区別して検索</translation>
    </message>
    <message>
        <source>Go to &amp;line...</source>
        <translation>指定行に移動(&amp;L)...</translation>
    </message>
    <message>
        <source>Go to start</source>
        <translation>先頭に移動</translation>
    </message>
    <message>
        <source>Go to end</source>
        <translation>末尾に移動</translation>
    </message>
    <message>
        <source>Go to next paragraph</source>
        <translation>次の段落に移動</translation>
    </message>
    <message>
        <source>Go to previous paragraph</source>
        <translation>前の段落に移動</translation>
    </message>
    <message>
        <source>Delete word to the left</source>
        <translation>左の単語を削除</translation>
    </message>
    <message>
        <source>Delete word to the right</source>
        <translation>右の単語を削除</translation>
    </message>
    <message>
        <source>Delete to start of line</source>
        <translation>行頭まで削除</translation>
    </message>
    <message>
        <source>Delete to end of line</source>
        <translation>行末まで削除</translation>
    </message>
    <message>
        <source>To upper case</source>
        <translation>大文字にする</translation>
    </message>
    <message>
        <source>To lower case</source>
        <translation>小文字にする</translation>
    </message>
    <message>
        <source>Swap case</source>
        <translation>大文字と小文字を入れ替える</translation>
    </message>
    <message>
        <source>Capitalize</source>
        <translation>先頭の文字を大文字にする</translation>
    </message>
    <message>
        <source>Move line up</source>
        <translation>行を上に移動</translation>
    </message>
    <message>
        <source>Move line down</source>
        <translation>行を下に移動</translation>
    </message>
    <message>
        <source>New line above</source>
        <translation>上に新しい行</translation>
    </message>
    <message>
        <source>New line below</source>
        <translation>下に新しい行</translation>
    </message>
    <message>
        <source>Duplicate lines</source>
        <translation>行を複製</translation>
    </message>
    <message>
        <source>Join lines</source>
        <translation>行を連結</translation>
    </message>
    <message>
        <source>Sort lines</source>
        <translation>行を並べ替え</translation>
    </message>
    <message>
        <source>Reverse lines</source>
        <translation>行を逆順にする</translation>
    </message>
    <message>
        <source>Remove duplicate lines</source>
        <translation>重複する行を削除</translation>
    </message>
    <message>
        <source>Remove empty lines</source>
        <translation>空行を削除</translation>
    </message>
    <message>
        <source>Trim lines</source>
        <translation>行の前後の空白を削除</translation>
    </message>
    <message>
        <source>Indent lines</source>
        <translation>行をインデント</translation>
    </message>
    <message>
        <source>Unindent lines</source>
        <translation>行のインデントを解除</translation>
    </message>
    <message>
        <source>Comment lines</source>
        <translation>行をコメントにする</translation>
    </message>
    <message>
        <source>Uncomment lines</source>
        <translation>行のコメントを解除</translation>
    </message>
    <message>
        <source>Tabs to spaces</source>
        <translation>タブを空白に変換</translation>
    </message>
    <message>
        <source>View</source>
        <translation>表示</translation>
    </message>
    <message>
        <source>Zoom &amp;in</source>
        <translation>拡大(&amp;I)</translation>
    </message>
    <message>
        <source>Zoom &amp;out</source>
        <translation>縮小(&amp;O)</translation>
    </message>
    <message>
        <source>&amp;Wrap lines</source>
        <translation>行を折り返す(&amp;W)</translation>
    </message>
    <message>
        <source>&amp;Fixed-width font</source>
        <translation>等幅フォント(&amp;F)</translation>
    </message>
    <message>
        <source>&amp;Proportional font</source>
        <translation>プロポーショナルフォント(&amp;P)</translation>
    </message>
    <message>
        <source>O&amp;verwrite</source>
        <translation>上書き(&amp;V)</translation>
    </message>
    <message>
        <source>&amp;Read only</source>
        <translation>読み取り専用(&amp;R)</translation>
    </message>
    <message>
        <source>Wide cur&amp;sor</source>
        <translation>太いカーソル(&amp;S)</translation>
    </message>
    <message>
        <source>&amp;Center on cursor</source>
        <translation>カーソルを中央に表示(&amp;C)</translation>
    </message>
    <message>
        <source>Scroll &amp;up</source>
        <translation>上にスクロール(&amp;U)</translation>
    </message>
    <message>
        <source>Scroll &amp;down</source>
        <translation>下にスクロール(&amp;D)</translation>
    </message>
    <message>
        <source>Scroll to &amp;top</source>
        <translation>先頭までスクロール(&amp;T)</translation>
    </message>
    <message>
        <source>Scroll to botto&amp;m</source>
        <translation>末尾までスクロール(&amp;M)</translation>
    </message>
    <message>
        <source>Text</source>
        <translation>テキスト</translation>
    </message>
    <message>
        <source>Keys</source>
        <translation>キー</translation>
    </message>
    <message>
        <source>The file has %1 for %2, but %3 has it, too.</source>
        <translation>ファイルでは %1 が %2 に割り当てられていますが、%3 も使用しています。</translation>
    </message>
    <message>
        <source>&amp;Replace</source>
        <translation>置き換える(&amp;R)</translation>
    </message>
    <message>
        <source>&amp;Skip</source>
        <translation>スキップ(&amp;S)</translation>
    </message>
    <message>
        <source>&amp;Export keys...</source>
        <translation>キーをエクスポート(&amp;E)...</translation>
    </message>
    <message>
        <source>&amp;Import keys...</source>
        <translation>キーをインポート(&amp;I)...</translation>
    </message>
    <message>
        <source>Save cheat sheet as &amp;HTML...</source>
        <translation>一覧表を HTML として保存(&amp;H)...</translation>
    </message>
    <message>
        <source>Save cheat sheet as te&amp;xt...</source>
        <translation>一覧表をテキストとして保存(&amp;X)...</translation>
    </message>
    <message>
        <source>&amp;Copy cheat sheet</source>
        <translation>一覧表をコピー(&amp;C)</translation>
    </message>
</context>
<context>
    <name>EntryWindow</name>
    <message>
        <source>Unsaved changes</source>
        <translation>保存されていない変更</translation>
    </message>
    <message>
        <source>The entry %1 was changed.
Save the changes?</source>
        <translation>エントリ %1 は変更されています。
変更を保存しますか?</translation>
    </message>
</context>
<context>
    <name>FileIconsPage</name>
    <message>
        <source>File icons</source>
        <translation>ファイルのアイコン</translation>
    </message>
    <message>
        <source>Models</source>
        <translation>モデル</translation>
    </message>
</context>
<context>
    <name>GalleryWindow</name>
    <message>
        <source>Widget gallery</source>
        <translation>ウィジェットギャラリー</translation>
    </message>
    <message>
        <source>Pages</source>
        <translation>ページ</translation>
    </message>
    <message>
        <source>Code of this page</source>
        <translation>このページのコード</translation>
    </message>
</context>
<context>
    <name>KeyNamesPage</name>
    <message>
        <source>&amp;Press keys:</source>
        <translation>キーを押してください(&amp;P):</translation>
    </message>
    <message>
        <source>In the window manager&apos;s notation:</source>
        <translation>ウィンドウマネージャでの表記:</translation>
    </message>
    <message>
        <source>Read back:</source>
        <translation>読み戻した結果:</translation>
    </message>
    <message>
        <source>Global action with these keys:</source>
        <translation>このキーのグローバルアクション:</translation>
    </message>
    <message>
        <source>Key names</source>
        <translation>キーの名前</translation>
    </message>
    <message>
        <source>Shortcuts</source>
        <translation>ショートカット</translation>
    </message>
</context>
<context>
    <name>MenuPages</name>
    <message>
        <source>&amp;Pick an entry...</source>
        <translation>エントリを選択(&amp;P)...</translation>
    </message>
    <message>
        <source>Edit the &amp;menu...</source>
        <translation>メニューを編集(&amp;M)...</translation>
    </message>
    <message>
        <source>Edit an e&amp;ntry...</source>
        <translation>エントリを編集(&amp;N)...</translation>
    </message>
    <message>
        <source>Menu tree</source>
        <translation>メニューのツリー</translation>
    </message>
    <message>
        <source>Menus</source>
        <translation>メニュー</translation>
    </message>
    <message>
        <source>Menu and entry dialogs</source>
        <translation>メニューとエントリのダイアログ</translation>
    </message>
    <message>
        <source>&amp;Assistance</source>
        <translation>アシスタンス(&amp;A)</translation>
    </message>
</context>
<context>
    <name>RadioGroupBoxPage</name>
    <message>
        <source>&amp;Automatic configuration</source>
        <translation>自動設定(&amp;A)</translation>
    </message>
    <message>
        <source>Script address:</source>
        <translation>スクリプトのアドレス:</translation>
    </message>
    <message>
        <source>Ask again at every start</source>
        <translation>起動のたびに確認する</translation>
    </message>
    <message>
        <source>&amp;Manual configuration</source>
        <translation>手動設定(&amp;M)</translation>
    </message>
    <message>
        <source>Host:</source>
        <translation>ホスト:</translation>
    </message>
    <message>
        <source>Port:</source>
        <translation>ポート:</translation>
    </message>
    <message>
        <source>Protocol:</source>
        <translation>プロトコル:</translation>
    </message>
    <message>
        <source>&amp;Direct connection</source>
        <translation>直接接続(&amp;D)</translation>
    </message>
    <message>
        <source>There is nothing to set.</source>
        <translation>設定の必要はありません。</translation>
    </message>
    <message>
        <source>Radio group boxes</source>
        <translation>ラジオボタン付きグループボックス</translation>
    </message>
    <message>
        <source>Widgets</source>
        <translation>ウィジェット</translation>
    </message>
</context>
<context>
    <name>SettingsPage</name>
    <message>
        <source>Settings file</source>
        <translation>設定ファイル</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>設定</translation>
    </message>
    <message>
        <source>F&amp;lat buttons</source>
        <translation>フラットなボタン(&amp;L)</translation>
    </message>
    <message>
        <source>S&amp;ection:</source>
        <translation>セクション(&amp;E):</translation>
    </message>
    <message>
        <source>&amp;Font:</source>
        <translation>フォント(&amp;F):</translation>
    </message>
    <message>
        <source>&amp;Size:</source>
        <translation>サイズ(&amp;S):</translation>
    </message>
    <message>
        <source>Contents of the file on disk</source>
        <translation>ディスク上のファイルの内容</translation>
    </message>
    <message>
        <source>Name a settings file on the command line to edit it here.</source>
        <translation>コマンドラインで設定ファイルを指定すると、ここで編集できます。</translation>
    </message>
    <message>
        <source>%1 cannot be opened.</source>
        <translation>%1 を開けません。</translation>
    </message>
</context>
<context>
    <name>ShortcutsPage</name>
    <message>
        <source>Delete the whole line</source>
        <translation>行全体を削除</translation>
    </message>
    <message>
        <source>Last command: %1</source>
        <translation>最後のコマンド: %1</translation>
    </message>
    <message>
        <source>one line
another line
and a third one
</source>
        <translation>1 行目
2 行目
そして 3 行目
</translation>
    </message>
    <message>
        <source>Go to the editor</source>
        <translation>エディタに移動</translation>
    </message>
    <message>
        <source>View</source>
        <translation>表示</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>設定</translation>
    </message>
    <message>
        <source>Configure shortcuts...</source>
        <translation>ショートカットを設定...</translation>
    </message>
    <message>
        <source>Shortcuts</source>
        <translation>ショートカット</translation>
    </message>
    <message>
        <source>Configure shortcuts in the plain dialog...</source>
        <translation>簡易ダイアログでショートカットを設定...</translation>
    </message>
</context>
<context>
    <name>vel-entryedit</name>
    <message>
        <source>Edits a desktop entry.</source>
        <translation>デスクトップエントリを編集します。</translation>
    </message>
    <message>
        <source>Make a new entry when there is no such file.</source>
        <translation>ファイルがない場合は新しいエントリを作ります。</translation>
    </message>
    <message>
        <source>Begin with the values of the entry &lt;file&gt;.</source>
        <translation>エントリ &lt;file&gt; の値から始めます。</translation>
    </message>
    <message>
        <source>Show the entry only.</source>
        <translation>エントリを表示するだけです。</translation>
    </message>
    <message>
        <source>The entry to edit.</source>
        <translation>編集するエントリです。</translation>
    </message>
    <message>
        <source>one file has to be named</source>
        <translation>ファイルを 1 つ指定してください</translation>
    </message>
    <message>
        <source>cannot open %1</source>
        <translation>%1 を開けません</translation>
    </message>
    <message>
        <source>cannot open %1: there is no such file, --create makes a new entry</source>
        <translation>%1 を開けません: そのようなファイルはありません。--create を付けると新しいエントリを作成します</translation>
    </message>
    <message>
        <source>cannot open %1: it is no regular file</source>
        <translation>%1 を開けません: 通常のファイルではありません</translation>
    </message>
    <message>
        <source>cannot open %1: %2</source>
        <translation>%1 を開けません: %2</translation>
    </message>
</context>
<context>
    <name>vel-gallery</name>
    <message>
        <source>the page %1 did not finish loading</source>
        <translation>ページ %1 の準備ができませんでした</translation>
    </message>
    <message>
        <source>cannot write %1</source>
        <translation>%1 に書き込めません</translation>
    </message>
    <message>
        <source>cannot make the folder %1</source>
        <translation>フォルダ %1 を作成できません</translation>
    </message>
    <message>
        <source>Shows the library&apos;s widgets, dialogs and models in action.</source>
        <translation>ライブラリのウィジェット、ダイアログ、モデルが動く様子を表示します。</translation>
    </message>
    <message>
        <source>Start with the page &lt;name&gt;.</source>
        <translation>ページ &lt;name&gt; から始めます。</translation>
    </message>
    <message>
        <source>Write screenshots of every page, or of the page given with --page, to &lt;dir&gt; and exit.</source>
        <translation>すべてのページ、または --page で指定したページの画像を &lt;dir&gt; に書き込んで終了します。</translation>
    </message>
    <message>
        <source>The settings file that the settings page edits.</source>
        <translation>設定のページで編集する設定ファイルです。</translation>
    </message>
    <message>
        <source>Widget gallery</source>
        <translation>ウィジェットギャラリー</translation>
    </message>
    <message>
        <source>there is no page %1</source>
        <translation>ページ %1 はありません</translation>
    </message>
</context>
<context>
    <name>vel-menuedit</name>
    <message>
        <source>cannot create the start menu %1</source>
        <translation>スタートメニュー %1 を作成できません</translation>
    </message>
    <message>
        <source>no such directory: %1</source>
        <translation>そのようなフォルダはありません: %1</translation>
    </message>
    <message>
        <source>not a directory: %1</source>
        <translation>フォルダではありません: %1</translation>
    </message>
    <message>
        <source>cannot read the directory %1</source>
        <translation>フォルダ %1 を読み取れません</translation>
    </message>
    <message>
        <source>Edits the start menu, or picks an entry of it.</source>
        <translation>スタートメニューを編集するか、そのエントリを選択します。</translation>
    </message>
    <message>
        <source>Show the menu directory &lt;dir&gt; instead of the start menu.</source>
        <translation>スタートメニューの代わりにメニューフォルダ &lt;dir&gt; を表示します。</translation>
    </message>
    <message>
        <source>Show the desktop folder.</source>
        <translation>デスクトップフォルダを表示します。</translation>
    </message>
    <message>
        <source>Show the tool bar.</source>
        <translation>ツールバーを表示します。</translation>
    </message>
    <message>
        <source>Look only, change nothing.</source>
        <translation>表示するだけで、何も変更しません。</translation>
    </message>
    <message>
        <source>Show icons of &lt;pixels&gt; pixels.</source>
        <translation>&lt;pixels&gt; ピクセルのアイコンを表示します。</translation>
    </message>
    <message>
        <source>Pick an entry and print its path and its command line.</source>
        <translation>エントリを選択し、そのパスとコマンドラインを出力します。</translation>
    </message>
    <message>
        <source>unexpected argument: %1</source>
        <translation>予期しない引数: %1</translation>
    </message>
    <message>
        <source>only one of --dir, --desktop and --toolbar can be given</source>
        <translation>--dir、--desktop、--toolbar のうち指定できるのは 1 つだけです</translation>
    </message>
    <message>
        <source>--icon-size needs a number of pixels from 1 to 512, not &quot;%1&quot;</source>
        <translation>--icon-size には 1 から 512 までのピクセル数を指定してください。「%1」は使えません</translation>
    </message>
</context>
<context>
    <name>vel-menuprint</name>
    <message>
        <source>Prints a menu directory in its order.</source>
        <translation>メニューフォルダをその順序で出力します。</translation>
    </message>
    <message>
        <source>The menu directory; the start menu when none is given.</source>
        <translation>メニューフォルダです。省略した場合はスタートメニューです。</translation>
    </message>
    <message>
        <source>unknown format: %1</source>
        <translation>不明な形式: %1</translation>
    </message>
    <message>
        <source>more than one directory</source>
        <translation>フォルダが 2 つ以上指定されています</translation>
    </message>
    <message>
        <source>no such directory: %1</source>
        <translation>そのようなフォルダはありません: %1</translation>
    </message>
    <message>
        <source>cannot read the directory %1</source>
        <translation>フォルダ %1 を読み取れません</translation>
    </message>
    <message>
        <source>The menu has more than %1 items or %2 levels, and the rest of it is left out. Look for links that lead into the same folders again.</source>
        <translation>メニューの項目が %1 個、または階層が %2 段を超えているため、残りは省略されました。同じフォルダに何度もつながるリンクがないか確認してください。</translation>
    </message>
    <message>
        <source>What to print: %1. The default is text.</source>
        <translation>出力する内容です: %1。標準は text です。</translation>
    </message>
    <message>
        <source>The icon theme to take the files of icons from; the user&apos;s own when none is given.</source>
        <translation>アイコンのファイルを取り出すアイコンテーマです。省略した場合は利用者のテーマです。</translation>
    </message>
    <message>
        <source>The edge of the icons in pixels, 24 by default.</source>
        <translation>アイコンの一辺のピクセル数です。標準は 24 です。</translation>
    </message>
    <message>
        <source>Reads one of the lines that rofi or dmenu was given from standard input and starts its entry.</source>
        <translation>rofi または dmenu に渡された行の 1 つを標準入力から読み取り、そのエントリを起動します。</translation>
    </message>
    <message>
        <source>the size of icons is not between 1 and %1</source>
        <translation>アイコンのサイズが 1 から %1 の範囲にありません</translation>
    </message>
    <message>
        <source>The start menu is empty: no application is installed.</source>
        <translation>スタートメニューは空です: アプリケーションがインストールされていません。</translation>
    </message>
    <message>
        <source>The start menu %1 cannot be made: %2</source>
        <translation>スタートメニュー %1 を作成できません: %2</translation>
    </message>
    <message>
        <source>%1 is left out, as the line end in its name cannot be written in this format. Rename it.</source>
        <translation>%1 は省略されました。名前に含まれる改行をこの形式では書けません。名前を変更してください。</translation>
    </message>
    <message>
        <source>The start menu is empty: nothing in %1 is shown.</source>
        <translation>スタートメニューは空です: %1 には表示されるものがありません。</translation>
    </message>
    <message>
        <source>cannot run vel-open: %1</source>
        <translation>vel-open を実行できません: %1</translation>
    </message>
    <message>
        <source>There is no &quot;%1&quot; in the menu.</source>
        <translation>メニューに「%1」はありません。</translation>
    </message>
</context>
<context>
    <name>vel-wmbridge</name>
    <message>
        <source>Owns the window manager&apos;s command channel on a desktop that has none, and runs a command of the shell for each kind of update. The variable VEL_COMMAND holds the line that came.</source>
        <translation>ウィンドウマネージャのコマンドチャンネルがないデスクトップでそれを受け持ち、更新の種類ごとにシェルのコマンドを実行します。変数 VEL_COMMAND に受信した行が入ります。</translation>
    </message>
    <message>
        <source>Run when the start menu has changed.</source>
        <translation>スタートメニューが変更されたときに実行します。</translation>
    </message>
    <message>
        <source>Run when the tool bar has changed.</source>
        <translation>ツールバーが変更されたときに実行します。</translation>
    </message>
    <message>
        <source>Run when the desktop&apos;s entries have changed.</source>
        <translation>デスクトップのエントリが変更されたときに実行します。</translation>
    </message>
    <message>
        <source>Run for every other line.</source>
        <translation>その他の行で実行します。</translation>
    </message>
    <message>
        <source>Take the channel from the program that has it.</source>
        <translation>チャンネルを使用中のプログラムから引き継ぎます。</translation>
    </message>
    <message>
        <source>unexpected argument: %1</source>
        <translation>予期しない引数: %1</translation>
    </message>
    <message>
        <source>cannot run the command for %1</source>
        <translation>%1 のコマンドを実行できません</translation>
    </message>
    <message>
        <source>another program has taken the channel</source>
        <translation>別のプログラムがチャンネルを引き継ぎました</translation>
    </message>
    <message>
        <source>cannot take the channel: there is no display, or another program has it</source>
        <translation>チャンネルを引き継げません: ディスプレイがないか、別のプログラムが使用中です</translation>
    </message>
    <message>
        <source>unknown window manager: %1 (known are %2)</source>
        <translation>不明なウィンドウマネージャ: %1 (対応しているもの: %2)</translation>
    </message>
    <message>
        <source>Do what this window manager needs to show the start menu as it is: %1.</source>
        <translation>このウィンドウマネージャがスタートメニューを現在の内容で表示するために必要なことを行います: %1。</translation>
    </message>
</context>
</TS>
