<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ja" sourcelanguage="en">
<context>
    <name>ActionListEdit</name>
    <message>
        <source>Form</source>
        <translation>フォーム</translation>
    </message>
    <message>
        <source>...</source>
        <translation>...</translation>
    </message>
</context>
<context>
    <name>EditActionsDialog</name>
    <message>
        <source>Actions</source>
        <translation>アクション</translation>
    </message>
</context>
<context>
    <name>EditActionsWidget</name>
    <message>
        <source>Form</source>
        <translation>フォーム</translation>
    </message>
    <message>
        <source>Add...</source>
        <translation>追加...</translation>
    </message>
    <message>
        <source>Edit...</source>
        <translation>編集...</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>削除</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>上へ</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>下へ</translation>
    </message>
</context>
<context>
    <name>EditShortcutsDialog</name>
    <message>
        <source>None</source>
        <translation>なし</translation>
    </message>
    <message>
        <source>Configure shortcuts</source>
        <translation>ショートカットを設定</translation>
    </message>
    <message>
        <source>Choose a key for selected action</source>
        <translation>選択したアクションのキーを選択</translation>
    </message>
    <message>
        <source>Default key:</source>
        <translation>標準のキー:</translation>
    </message>
    <message>
        <source>Assign key:</source>
        <translation>割り当てるキー:</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for global action &apos;%2&apos;.</source>
        <translation>ショートカット「%1」は既にグローバルアクション「%2」に使用されています。</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for action &apos;%2&apos;. Please try another.</source>
        <translation>ショートカット「%1」は既にアクション「%2」に使用されています。別のものを試してください。</translation>
    </message>
    <message>
        <source>Shortcuts conflict</source>
        <translation>ショートカットの競合</translation>
    </message>
    <message>
        <source>Apply changes</source>
        <translation>変更を適用</translation>
    </message>
    <message>
        <source>Some shortcuts have been changed. Do you want to apply changes?</source>
        <translation>いくつかのショートカットが変更されました。変更を適用しますか?</translation>
    </message>
</context>
<context>
    <name>EditStringsDialog</name>
    <message>
        <source>Strings</source>
        <translation>文字列</translation>
    </message>
</context>
<context>
    <name>EditableListWidget</name>
    <message>
        <source>Form</source>
        <translation>フォーム</translation>
    </message>
    <message>
        <source>Add...</source>
        <translation>追加...</translation>
    </message>
    <message>
        <source>Edit...</source>
        <translation>編集...</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>削除</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>上へ</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>下へ</translation>
    </message>
</context>
<context>
    <name>QFileSystemModel</name>
    <message>
        <source>%1 does not exist.</source>
        <translation>%1 は存在しません。</translation>
    </message>
    <message>
        <source>%1 exists and was left as it is.</source>
        <translation>%1 は存在するため、そのまま残しました。</translation>
    </message>
    <message>
        <source>%1 cannot be put into itself.</source>
        <translation>%1 をそれ自身の中に置くことはできません。</translation>
    </message>
    <message>
        <source>%1 cannot be written.</source>
        <translation>%1 に書き込めません。</translation>
    </message>
    <message>
        <source>Can&apos;t move %1: %2</source>
        <translation>%1 を移動できません: %2</translation>
    </message>
    <message>
        <source>Can&apos;t copy %1: %2</source>
        <translation>%1 をコピーできません: %2</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>注意</translation>
    </message>
    <message>
        <source>%1 already exists. Overwrite?</source>
        <translation>%1 は既に存在します。上書きしますか?</translation>
    </message>
</context>
<context>
    <name>ShortcutClash</name>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for action &apos;%2&apos;.</source>
        <translation>ショートカット「%1」は既にアクション「%2」に使用されています。</translation>
    </message>
    <message>
        <source>Shortcut &apos;%2&apos; of action &apos;%3&apos; begins with &apos;%1&apos;.</source>
        <translation>アクション「%3」のショートカット「%2」は「%1」で始まります。</translation>
    </message>
    <message>
        <source>Shortcut &apos;%2&apos; begins with &apos;%1&apos;, the shortcut of action &apos;%3&apos;.</source>
        <translation>ショートカット「%2」は、アクション「%3」のショートカット「%1」で始まります。</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; opens the menu &apos;%2&apos;.</source>
        <translation>ショートカット「%1」はメニュー「%2」を開きます。</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; leads to &apos;%2&apos; in the window.</source>
        <translation>ショートカット「%1」はウィンドウの「%2」に移動します。</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is the standard shortcut for &apos;%2&apos;.</source>
        <translation>ショートカット「%1」は「%2」の標準ショートカットです。</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for global action &apos;%2&apos;.</source>
        <translation>ショートカット「%1」は既にグローバルアクション「%2」に使用されています。</translation>
    </message>
    <message>
        <source>With &apos;%1&apos; as a shortcut this key cannot be typed into texts.</source>
        <translation>「%1」をショートカットにすると、このキーを文章に入力できなくなります。</translation>
    </message>
    <message>
        <source>The current keyboard layout cannot produce &apos;%1&apos;.</source>
        <translation>現在のキーボード配列では「%1」を入力できません。</translation>
    </message>
</context>
<context>
    <name>ShortcutScheme</name>
    <message>
        <source>The shortcuts could not be saved to %1: %2</source>
        <comment>%2: what the system says</comment>
        <translation>ショートカットを %1 に保存できませんでした: %2</translation>
    </message>
    <message>
        <source>The shortcuts could not be read from %1: %2</source>
        <comment>%2: what the system says</comment>
        <translation>ショートカットを %1 から読み込めませんでした: %2</translation>
    </message>
    <message>
        <source>%1 is not a regular file.</source>
        <translation>%1 は通常のファイルではありません。</translation>
    </message>
    <message>
        <source>%1 is too large for a file of shortcuts.</source>
        <translation>%1 はショートカットのファイルとしては大きすぎます。</translation>
    </message>
    <message>
        <source>%1 holds no shortcuts.</source>
        <translation>%1 にはショートカットがありません。</translation>
    </message>
    <message>
        <source>Unreadable shortcuts in %1 were skipped: %2</source>
        <comment>%2: their number</comment>
        <translation>%1 の読み取れないショートカットを飛ばしました: %2</translation>
    </message>
</context>
<context>
    <name>ShortcutSheet</name>
    <message>
        <source>Keyboard shortcuts</source>
        <comment>title of a printed sheet</comment>
        <translation>キーボードショートカット</translation>
    </message>
</context>
<context>
    <name>ShortcutsModel</name>
    <message>
        <source>Action</source>
        <translation>アクション</translation>
    </message>
    <message>
        <source>Shortcut</source>
        <translation>ショートカット</translation>
    </message>
</context>
<context>
    <name>StandardKeyNames</name>
    <message>
        <source>Help</source>
        <translation>ヘルプ</translation>
    </message>
    <message>
        <source>What&apos;s this?</source>
        <translation>これは何?</translation>
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
        <source>Save</source>
        <translation>保存</translation>
    </message>
    <message>
        <source>Save as</source>
        <translation>名前を付けて保存</translation>
    </message>
    <message>
        <source>New</source>
        <translation>新規</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>削除</translation>
    </message>
    <message>
        <source>Cut</source>
        <translation>切り取り</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>コピー</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation>貼り付け</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>元に戻す</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>やり直し</translation>
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
        <source>Refresh</source>
        <translation>再読み込み</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>拡大</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>縮小</translation>
    </message>
    <message>
        <source>Print</source>
        <translation>印刷</translation>
    </message>
    <message>
        <source>New tab</source>
        <translation>新しいタブ</translation>
    </message>
    <message>
        <source>Next tab</source>
        <translation>次のタブ</translation>
    </message>
    <message>
        <source>Previous tab</source>
        <translation>前のタブ</translation>
    </message>
    <message>
        <source>Find</source>
        <translation>検索</translation>
    </message>
    <message>
        <source>Find next</source>
        <translation>次を検索</translation>
    </message>
    <message>
        <source>Find previous</source>
        <translation>前を検索</translation>
    </message>
    <message>
        <source>Replace</source>
        <translation>置換</translation>
    </message>
    <message>
        <source>Select all</source>
        <translation>すべて選択</translation>
    </message>
    <message>
        <source>Deselect</source>
        <translation>選択を解除</translation>
    </message>
    <message>
        <source>Full screen</source>
        <translation>全画面表示</translation>
    </message>
    <message>
        <source>Preferences</source>
        <translation>設定</translation>
    </message>
    <message>
        <source>Quit</source>
        <translation>終了</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>キャンセル</translation>
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
        <source>Move the cursor</source>
        <translation>カーソルを移動</translation>
    </message>
    <message>
        <source>Select text</source>
        <translation>文字列を選択</translation>
    </message>
    <message>
        <source>Edit text</source>
        <translation>文字列を編集</translation>
    </message>
</context>
<context>
    <name>StringListEdit</name>
    <message>
        <source>Form</source>
        <translation>フォーム</translation>
    </message>
    <message>
        <source>...</source>
        <translation>...</translation>
    </message>
</context>
<context>
    <name>VelDesktopEntryEditDialog</name>
    <message>
        <source>Warning</source>
        <translation>警告</translation>
    </message>
    <message>
        <source>no executable</source>
        <translation>実行ファイルが指定されていません</translation>
    </message>
    <message>
        <source>can&apos;t find executable</source>
        <translation>実行ファイルが見つかりません</translation>
    </message>
    <message>
        <source>can&apos;t find try executable</source>
        <translation>確認用の実行ファイルが見つかりません</translation>
    </message>
    <message>
        <source>can&apos;t find URL</source>
        <translation>URL が見つかりません</translation>
    </message>
    <message>
        <source>wrong/incomplete desktop entry</source>
        <translation>デスクトップエントリが不正または不完全です</translation>
    </message>
    <message>
        <source>Can&apos;t save position on desktop for %1</source>
        <translation>%1 のデスクトップ上の位置を保存できません</translation>
    </message>
    <message>
        <source>Copy from...</source>
        <translation>コピー元...</translation>
    </message>
    <message>
        <source>Can&apos;t load file %1</source>
        <translation>ファイル %1 を読み込めません</translation>
    </message>
    <message>
        <source>Desktop Entry Editor</source>
        <translation>デスクトップエントリエディタ</translation>
    </message>
    <message>
        <source>You create hidden desktop entry</source>
        <translation>非表示のデスクトップエントリを作成しています</translation>
    </message>
    <message>
        <source>Can&apos;t save file %1</source>
        <translation>ファイル %1 を保存できません</translation>
    </message>
    <message>
        <source>Help</source>
        <translation>ヘルプ</translation>
    </message>
    <message>
        <source>&lt;b&gt;Desktop entry&lt;/b&gt; is a multipurpose info file for installed apps, devices, etc. It can be used to build menu entries, shortcuts, etc. This dialog implements the &apos;Desktop Entry Standard&apos; of &lt;a href=&quot;https://www.freedesktop.org&quot;&gt;https://www.freedesktop.org&lt;/a&gt;.&lt;br&gt;&lt;br&gt;Desktop entry file is a text ini-like file with one main section [Desktop Entry] and possible additional sections for each action defined in the main section field &apos;Actions&apos;. All fields are text string pairs: key=value. Value can also be a semicolon separated string list.</source>
        <translation>&lt;b&gt;デスクトップエントリ&lt;/b&gt;は、インストールされたアプリケーションやデバイスなどのための多目的な情報ファイルです。メニュー項目やショートカットなどを作るために使用できます。このダイアログは、&lt;a href=&quot;https://www.freedesktop.org&quot;&gt;https://www.freedesktop.org&lt;/a&gt; の「Desktop Entry Standard」を実装しています。&lt;br&gt;&lt;br&gt;デスクトップエントリのファイルは INI 形式に似たテキストファイルで、1 つのメインセクション [Desktop Entry] と、メインセクションの「Actions」フィールドで定義された各アクションのための追加のセクションからなります。すべてのフィールドは「キー=値」という文字列の組です。値はセミコロンで区切られた文字列のリストにすることもできます。</translation>
    </message>
</context>
<context>
    <name>VelDesktopEntryPropsWidgetPrivate</name>
    <message>
        <source>Information about the URL</source>
        <translation>URL の情報</translation>
    </message>
    <message>
        <source>Only show in</source>
        <translation>次でのみ表示</translation>
    </message>
    <message>
        <source>Not show in</source>
        <translation>次では非表示</translation>
    </message>
    <message>
        <source>Add desktop environment:</source>
        <translation>デスクトップ環境を追加:</translation>
    </message>
    <message>
        <source>Edit desktop environment:</source>
        <translation>デスクトップ環境を編集:</translation>
    </message>
    <message>
        <source>MIME type or file name extension:</source>
        <translation>MIME タイプまたはファイル名の拡張子:</translation>
    </message>
    <message>
        <source>MIME type</source>
        <translation>MIME タイプ</translation>
    </message>
    <message>
        <source>Add MIME type</source>
        <translation>MIME タイプを追加</translation>
    </message>
    <message>
        <source>Edit MIME type</source>
        <translation>MIME タイプを編集</translation>
    </message>
    <message>
        <source>Categories</source>
        <translation>カテゴリ</translation>
    </message>
    <message>
        <source>Add category</source>
        <translation>カテゴリを追加</translation>
    </message>
    <message>
        <source>Category:</source>
        <translation>カテゴリ:</translation>
    </message>
    <message>
        <source>Edit category</source>
        <translation>カテゴリを編集</translation>
    </message>
    <message>
        <source>Keywords</source>
        <translation>キーワード</translation>
    </message>
    <message>
        <source>Add keyword</source>
        <translation>キーワードを追加</translation>
    </message>
    <message>
        <source>Keyword:</source>
        <translation>キーワード:</translation>
    </message>
    <message>
        <source>Edit keyword</source>
        <translation>キーワードを編集</translation>
    </message>
    <message>
        <source>Actions</source>
        <translation>アクション</translation>
    </message>
    <message>
        <source>Add action</source>
        <translation>アクションを追加</translation>
    </message>
    <message>
        <source>Edit action</source>
        <translation>アクションを編集</translation>
    </message>
    <message>
        <source>Application</source>
        <translation>アプリケーション</translation>
    </message>
    <message>
        <source>Link</source>
        <translation>リンク</translation>
    </message>
    <message>
        <source>Directory</source>
        <translation>フォルダ</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>注意</translation>
    </message>
    <message>
        <source>Desktop entry type was changed.
Some field values may be lost...
Continue?</source>
        <translation>デスクトップエントリのタイプが変更されました。
一部のフィールドの値が失われるかもしれません...
続けますか?</translation>
    </message>
    <message>
        <source>Type</source>
        <translation>タイプ</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>名前</translation>
    </message>
    <message>
        <source>Icon</source>
        <translation>アイコン</translation>
    </message>
    <message>
        <source>Exec</source>
        <translation>コマンド</translation>
    </message>
    <message>
        <source>Terminal</source>
        <translation>ターミナル</translation>
    </message>
    <message>
        <source>Path</source>
        <translation>作業パス</translation>
    </message>
    <message>
        <source>Try exec</source>
        <translation>確認用コマンド</translation>
    </message>
    <message>
        <source>Url</source>
        <translation>URL</translation>
    </message>
    <message>
        <source>Generic name</source>
        <translation>一般名</translation>
    </message>
    <message>
        <source>Comment</source>
        <translation>コメント</translation>
    </message>
    <message>
        <source>No display</source>
        <translation>表示しない</translation>
    </message>
    <message>
        <source>Hidden</source>
        <translation>非表示</translation>
    </message>
    <message>
        <source>Startup notify</source>
        <translation>起動通知</translation>
    </message>
    <message>
        <source>Startup WM class</source>
        <translation>起動時のウィンドウクラス</translation>
    </message>
    <message>
        <source>Version</source>
        <translation>バージョン</translation>
    </message>
</context>
<context>
    <name>VelMenuDialog</name>
    <message>
        <source>Edit</source>
        <translation>編集</translation>
    </message>
    <message>
        <source>Send command to vel-wm to update
 edited menu, toolbar, etc.</source>
        <translation>編集したメニューやツールバーなどを更新する
 コマンドを vel-wm に送る</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>警告</translation>
    </message>
    <message>
        <source>Can&apos;t send command to vel-wm</source>
        <translation>vel-wm にコマンドを送れません</translation>
    </message>
</context>
<context>
    <name>VelMenuView</name>
    <message>
        <source>Warning</source>
        <translation>警告</translation>
    </message>
    <message>
        <source>Can&apos;t start:
%1 %2</source>
        <translation>起動できません:
%1 %2</translation>
    </message>
    <message>
        <source>All previous shortcuts
will be lost. Are you sure?</source>
        <translation>以前のショートカットは
すべて失われます。よろしいですか?</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>編集</translation>
    </message>
    <message>
        <source>New folder</source>
        <translation>新しいフォルダ</translation>
    </message>
    <message>
        <source>New entry</source>
        <translation>新しいエントリ</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>削除</translation>
    </message>
    <message>
        <source>Execute</source>
        <translation>実行</translation>
    </message>
    <message>
        <source>Find</source>
        <translation>検索</translation>
    </message>
    <message>
        <source>Find Next</source>
        <translation>次を検索</translation>
    </message>
    <message>
        <source>Cut</source>
        <translation>切り取り</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>コピー</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation>貼り付け</translation>
    </message>
    <message>
        <source>Default menu...</source>
        <translation>標準のメニュー...</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>上へ</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>下へ</translation>
    </message>
    <message>
        <source>Move</source>
        <translation>移動</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>キャンセル</translation>
    </message>
    <message>
        <source>Group</source>
        <translation>グループ</translation>
    </message>
    <message>
        <source>Shortcut</source>
        <translation>ショートカット</translation>
    </message>
    <message>
        <source>Can&apos;t edit non desktop file</source>
        <translation>desktop ファイル以外は編集できません</translation>
    </message>
    <message>
        <source>Desktop Entry %1</source>
        <translation>デスクトップエントリ %1</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>注意</translation>
    </message>
    <message>
        <source>Are you sure to delete it?</source>
        <translation>本当に削除しますか?</translation>
    </message>
    <message>
        <source>Find string:</source>
        <translation>検索する文字列:</translation>
    </message>
    <message>
        <source>&apos;%1&apos; not found .</source>
        <translation>「%1」は見つかりませんでした。</translation>
    </message>
</context>
<context>
    <name>VelUI::ActionPropsDialog</name>
    <message>
        <source>Id</source>
        <translation>ID</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>名前</translation>
    </message>
    <message>
        <source>Icon</source>
        <translation>アイコン</translation>
    </message>
    <message>
        <source>Exec</source>
        <translation>コマンド</translation>
    </message>
    <message>
        <source>Only show in</source>
        <translation>次でのみ表示</translation>
    </message>
    <message>
        <source>Add desktop environment:</source>
        <translation>デスクトップ環境を追加:</translation>
    </message>
    <message>
        <source>Edit desktop environment:</source>
        <translation>デスクトップ環境を編集:</translation>
    </message>
    <message>
        <source>Not show in</source>
        <translation>次では非表示</translation>
    </message>
</context>
<context>
    <name>VelUI::EditActionsWidget</name>
    <message>
        <source>Add action</source>
        <translation>アクションを追加</translation>
    </message>
    <message>
        <source>Edit action</source>
        <translation>アクションを編集</translation>
    </message>
    <message>
        <source>newAction</source>
        <comment>id of a new action</comment>
        <translation>newAction</translation>
    </message>
</context>
<context>
    <name>VelUI::EditableListWidget</name>
    <message>
        <source>Add string</source>
        <translation>文字列を追加</translation>
    </message>
    <message>
        <source>String:</source>
        <translation>文字列:</translation>
    </message>
    <message>
        <source>Edit string</source>
        <translation>文字列を編集</translation>
    </message>
</context>
<context>
    <name>VelUI::FormLayout</name>
    <message>
        <source>Edit %1</source>
        <comment>name of a &quot;...&quot; button</comment>
        <translation>%1 を編集</translation>
    </message>
</context>
<context>
    <name>VelUI::PathEdit</name>
    <message>
        <source>...</source>
        <translation>...</translation>
    </message>
    <message>
        <source>Choose application exec path</source>
        <translation>アプリケーションの実行パスを選択</translation>
    </message>
</context>
</TS>
