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
    <name>ClashLine</name>
    <message>
        <source>Go to</source>
        <translation>移動</translation>
    </message>
    <message>
        <source>Go to action &apos;%1&apos;</source>
        <translation>アクション「%1」に移動</translation>
    </message>
    <message>
        <source>Take over</source>
        <translation>引き継ぐ</translation>
    </message>
    <message>
        <source>Take over &apos;%1&apos; from action &apos;%2&apos;</source>
        <translation>「%1」をアクション「%2」から引き継ぐ</translation>
    </message>
    <message>
        <source>Further clashes: %1</source>
        <translation>その他の衝突: %1</translation>
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
    <name>EditShortcutsAssistance</name>
    <message>
        <source>Schemes</source>
        <translation>スキーム</translation>
    </message>
    <message>
        <source>No action matches the filter.</source>
        <translation>フィルタに一致するアクションはありません。</translation>
    </message>
    <message>
        <source>No action has the shortcut %1.</source>
        <translation>ショートカット %1 を持つアクションはありません。</translation>
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
    <name>EntryCheck</name>
    <message>
        <source>The condition &apos;%1&apos; needs a file.</source>
        <translation>条件「%1」にはファイルが必要です。</translation>
    </message>
    <message>
        <source>The file of the condition &apos;%1&apos; is one in the folder of settings, without &apos;/&apos; before it.</source>
        <translation>条件「%1」のファイルは設定フォルダ内のもので、前に「/」を付けません。</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs a key.</source>
        <translation>条件「%1」にはキーが必要です。</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs &apos;if-session&apos; or &apos;unless-session&apos; and a session.</source>
        <translation>条件「%1」には「if-session」または「unless-session」とセッションが必要です。</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs a schema and a key.</source>
        <translation>条件「%1」にはスキーマとキーが必要です。</translation>
    </message>
    <message>
        <source>There is no condition &apos;%1&apos;.</source>
        <translation>条件「%1」はありません。</translation>
    </message>
    <message>
        <source>A category is empty.</source>
        <translation>空のカテゴリがあります。</translation>
    </message>
    <message>
        <source>There is no registered category &apos;%1&apos;; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>登録済みのカテゴリに「%1」はありません。独自のカテゴリは「X-」で始める必要があります。</translation>
    </message>
    <message>
        <source>Change it to &apos;%1&apos;</source>
        <translation>「%1」に変更</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; also needs: %2.</source>
        <translation>カテゴリ「%1」には次も必要です: %2。</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; goes with one of these: %2.</source>
        <translation>カテゴリ「%1」は次のいずれかと組み合わせます: %2。</translation>
    </message>
    <message>
        <source>Add &apos;%1&apos;</source>
        <translation>「%1」を追加</translation>
    </message>
    <message>
        <source>Remove it</source>
        <translation>取り除く</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; is out of use.</source>
        <translation>カテゴリ「%1」は使われなくなりました。</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; is only for entries that list desktops in &apos;Only show in&apos;.</source>
        <translation>カテゴリ「%1」は、「次でのみ表示」にデスクトップを挙げたエントリ専用です。</translation>
    </message>
    <message>
        <source>No main category is among them, so menus may not know where to show the entry.</source>
        <translation>メインカテゴリが含まれていないため、メニューはエントリの表示場所を判断できないことがあります。</translation>
    </message>
    <message>
        <source>Several main categories are among them, so the entry may be shown more than once.</source>
        <translation>メインカテゴリが複数含まれているため、エントリが重複して表示されることがあります。</translation>
    </message>
    <message>
        <source>&apos;%1&apos; stands more than once.</source>
        <translation>「%1」が 2 回以上あります。</translation>
    </message>
    <message>
        <source>Keep the first</source>
        <translation>最初のものを残す</translation>
    </message>
    <message>
        <source>The application has no command.</source>
        <translation>アプリケーションにコマンドがありません。</translation>
    </message>
    <message>
        <source>The link leads nowhere.</source>
        <translation>リンクの行き先がありません。</translation>
    </message>
    <message>
        <source>A quote is not closed.</source>
        <translation>引用符が閉じられていません。</translation>
    </message>
    <message>
        <source>In quotes, a backslash has to stand before &apos;%1&apos;.</source>
        <translation>引用符の中では「%1」の前にバックスラッシュが必要です。</translation>
    </message>
    <message>
        <source>The command ends in a single backslash, which stands for nothing.</source>
        <translation>コマンドの末尾に、何も表さないバックスラッシュが 1 つあります。</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has to stand in double quotes.</source>
        <translation>「%1」は二重引用符で囲む必要があります。</translation>
    </message>
    <message>
        <source>Close the quote</source>
        <translation>引用符を閉じる</translation>
    </message>
    <message>
        <source>Put it in quotes</source>
        <translation>引用符で囲む</translation>
    </message>
    <message>
        <source>Have a shell run it</source>
        <translation>シェルに実行させる</translation>
    </message>
    <message>
        <source>Write &apos;%&apos; as &apos;%%&apos;</source>
        <translation>「%」を「%%」と書く</translation>
    </message>
    <message>
        <source>A field code is not complete: &apos;%&apos; ends the command.</source>
        <translation>フィールドコードが不完全です: コマンドが「%」で終わっています。</translation>
    </message>
    <message>
        <source>There is no field code &apos;%%1&apos;.</source>
        <translation>フィールドコード「%%1」はありません。</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; is out of use; nothing is put in its place.</source>
        <translation>フィールドコード「%%1」は使われなくなりました。何にも置き換えられません。</translation>
    </message>
    <message>
        <source>Only one of &apos;%f&apos;, &apos;%F&apos;, &apos;%u&apos; and &apos;%U&apos; may stand in a command, and once.</source>
        <translation>「%f」、「%F」、「%u」、「%U」のうち、コマンドに書けるのは 1 つを 1 回だけです。</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; stands more than once.</source>
        <translation>フィールドコード「%%1」が 2 回以上あります。</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; has to be an argument of its own, not in quotes.</source>
        <translation>フィールドコード「%%1」は、引用符なしの独立した引数にする必要があります。</translation>
    </message>
    <message>
        <source>The path of the program has a blank: it has to stand in quotes.</source>
        <translation>プログラムのパスに空白があります: 引用符で囲む必要があります。</translation>
    </message>
    <message>
        <source>There is no program &apos;%1&apos;.</source>
        <translation>プログラム「%1」はありません。</translation>
    </message>
    <message>
        <source>The command has to begin with a program.</source>
        <translation>コマンドはプログラムで始める必要があります。</translation>
    </message>
    <message>
        <source>&apos;Try exec&apos; takes the program alone, without quotes and arguments.</source>
        <translation>「確認用コマンド」に書けるのはプログラムだけで、引用符や引数は付けられません。</translation>
    </message>
    <message>
        <source>Keep the program</source>
        <translation>プログラムだけを残す</translation>
    </message>
    <message>
        <source>There is no program &apos;%1&apos;, so the entry is not shown.</source>
        <translation>プログラム「%1」がないため、エントリは表示されません。</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is missing.</source>
        <translation>「%1」がありません。</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has translations only, and nothing for all other languages.</source>
        <translation>「%1」には翻訳だけがあり、その他の言語のための値がありません。</translation>
    </message>
    <message>
        <source>Take &apos;%1&apos;</source>
        <translation>「%1」を使う</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is only for entries of the type &apos;%2&apos;.</source>
        <translation>「%1」は、タイプ「%2」のエントリ専用です。</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is out of use here.</source>
        <translation>「%1」はここでは使われなくなりました。</translation>
    </message>
    <message>
        <source>No key can be called &apos;%1&apos;.</source>
        <translation>「%1」という名前のキーは使えません。</translation>
    </message>
    <message>
        <source>There is no key &apos;%1&apos; here; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>ここではキー「%1」はありません。独自のキーは「X-」で始める必要があります。</translation>
    </message>
    <message>
        <source>&apos;%1&apos; cannot be translated.</source>
        <translation>「%1」は翻訳できません。</translation>
    </message>
    <message>
        <source>&apos;Only show in&apos; and &apos;Not show in&apos; exclude each other.</source>
        <translation>「次でのみ表示」と「次では非表示」は同時に使えません。</translation>
    </message>
    <message>
        <source>The file is empty.</source>
        <translation>ファイルが空です。</translation>
    </message>
    <message>
        <source>The first group of the file is not &apos;[Desktop Entry]&apos;.</source>
        <translation>ファイルの最初のグループが「[Desktop Entry]」ではありません。</translation>
    </message>
    <message>
        <source>The name of the file has to end in &apos;.%1&apos;.</source>
        <translation>ファイル名は「.%1」で終わる必要があります。</translation>
    </message>
    <message>
        <source>Lines of the file end in a carriage return.</source>
        <translation>ファイルの行末に復帰文字 (CR) があります。</translation>
    </message>
    <message>
        <source>A line of the file says nothing: %1</source>
        <translation>ファイルに意味のない行があります: %1</translation>
    </message>
    <message>
        <source>A line of the file stands before all groups: %1</source>
        <translation>どのグループよりも前に行があります: %1</translation>
    </message>
    <message>
        <source>A line of the file begins with a blank: %1</source>
        <translation>ファイルに空白で始まる行があります: %1</translation>
    </message>
    <message>
        <source>A blank stands behind a group: %1</source>
        <translation>グループの後ろに空白があります: %1</translation>
    </message>
    <message>
        <source>The group &apos;%1&apos; stands more than once.</source>
        <translation>グループ「%1」が 2 回以上あります。</translation>
    </message>
    <message>
        <source>No group can be called &apos;%1&apos;.</source>
        <translation>「%1」という名前のグループは使えません。</translation>
    </message>
    <message>
        <source>The group &apos;%1&apos; is out of use.</source>
        <translation>グループ「%1」は使われなくなりました。</translation>
    </message>
    <message>
        <source>There is no group &apos;%1&apos;; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>グループ「%1」はありません。独自のグループは「X-」で始める必要があります。</translation>
    </message>
    <message>
        <source>The id &apos;%1&apos; of an action may only have letters A to Z, digits and &apos;-&apos;.</source>
        <translation>アクションの ID「%1」に使えるのは、英字 A から Z、数字、「-」だけです。</translation>
    </message>
    <message>
        <source>The action &apos;%1&apos; is described, but &apos;Actions&apos; does not name it.</source>
        <translation>アクション「%1」の記述がありますが、「Actions」に挙げられていません。</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: it has no &apos;/&apos;.</source>
        <translation>「%1」は MIME タイプではありません: 「/」がありません。</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: nothing stands behind the &apos;/&apos;.</source>
        <translation>「%1」は MIME タイプではありません: 「/」の後ろに何もありません。</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: there is no kind &apos;%2&apos;.</source>
        <translation>「%1」は MIME タイプではありません: 「%2」という種類はありません。</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: it has a character that none has.</source>
        <translation>「%1」は MIME タイプではありません: 使えない文字があります。</translation>
    </message>
    <message>
        <source>MIME types like &apos;%1&apos; are not used for files.</source>
        <translation>「%1」のような MIME タイプはファイルには使われません。</translation>
    </message>
    <message>
        <source>This computer does not know the MIME type &apos;%1&apos;.</source>
        <translation>このコンピュータには MIME タイプ「%1」がありません。</translation>
    </message>
    <message>
        <source>An action has no id.</source>
        <translation>ID のないアクションがあります。</translation>
    </message>
    <message>
        <source>Nothing says what the action &apos;%1&apos; is.</source>
        <translation>アクション「%1」の内容がどこにも書かれていません。</translation>
    </message>
    <message>
        <source>There is no registered desktop &apos;%1&apos;; others have to begin with &apos;X-&apos;.</source>
        <translation>登録済みのデスクトップに「%1」はありません。それ以外は「X-」で始める必要があります。</translation>
    </message>
    <message>
        <source>In your language the entry is shown as &apos;%1&apos;.</source>
        <translation>お使いの言語では、エントリは「%1」と表示されます。</translation>
    </message>
    <message>
        <source>The comment says no more than the name.</source>
        <translation>コメントが名前と同じことしか述べていません。</translation>
    </message>
    <message>
        <source>The comment says no more than the generic name.</source>
        <translation>コメントが一般名と同じことしか述べていません。</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is out of use here; it has to be &apos;true&apos; or &apos;false&apos;.</source>
        <translation>「%1」はここでは使われなくなりました。「true」または「false」にする必要があります。</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has to be &apos;true&apos; or &apos;false&apos;.</source>
        <translation>「%1」は「true」または「false」にする必要があります。</translation>
    </message>
    <message>
        <source>Change it to &apos;true&apos;</source>
        <translation>「true」に変更</translation>
    </message>
    <message>
        <source>The name of an icon has no suffix like &apos;%1&apos;.</source>
        <translation>アイコンの名前に「%1」のような拡張子は付けません。</translation>
    </message>
    <message>
        <source>Remove the suffix</source>
        <translation>拡張子を取り除く</translation>
    </message>
    <message>
        <source>No icon theme has an icon &apos;%1&apos;.</source>
        <translation>どのアイコンテーマにもアイコン「%1」はありません。</translation>
    </message>
    <message>
        <source>Write the folder in full</source>
        <translation>フォルダを省略せずに書く</translation>
    </message>
    <message>
        <source>The address does not say how to reach it, as &apos;https:&apos; and &apos;file:&apos; do.</source>
        <translation>アドレスに、「https:」や「file:」のような接続方法の指定がありません。</translation>
    </message>
    <message>
        <source>The text is not encoded in UTF-8.</source>
        <translation>テキストが UTF-8 でエンコードされていません。</translation>
    </message>
    <message>
        <source>A control character or tab may not stand here.</source>
        <translation>ここには制御文字やタブを使えません。</translation>
    </message>
    <message>
        <source>The type has to be &apos;Application&apos;, &apos;Link&apos; or &apos;Directory&apos;, not &apos;%1&apos;.</source>
        <translation>タイプは「%1」ではなく、「Application」、「Link」、「Directory」のいずれかにする必要があります。</translation>
    </message>
    <message>
        <source>There is no version &apos;%1&apos; of the standard.</source>
        <translation>規格にバージョン「%1」はありません。</translation>
    </message>
    <message>
        <source>There is no encoding &apos;%1&apos;.</source>
        <translation>エンコーディング「%1」はありません。</translation>
    </message>
    <message>
        <source>There is no picture &apos;%1&apos;.</source>
        <translation>画像「%1」はありません。</translation>
    </message>
    <message>
        <source>An icon has a name or a path that begins with &apos;/&apos;.</source>
        <translation>アイコンには、名前または「/」で始まるパスを指定します。</translation>
    </message>
    <message>
        <source>The path of a folder begins with &apos;/&apos;.</source>
        <translation>フォルダのパスは「/」で始まります。</translation>
    </message>
    <message>
        <source>There is no folder &apos;%1&apos;.</source>
        <translation>フォルダ「%1」はありません。</translation>
    </message>
    <message>
        <source>There is no file &apos;%1&apos;.</source>
        <translation>ファイル「%1」はありません。</translation>
    </message>
    <message>
        <source>D-Bus cannot start &apos;%1&apos;: a file of a name like &apos;org.example.Program.desktop&apos; is needed.</source>
        <translation>D-Bus は「%1」を起動できません: 「org.example.Program.desktop」のような名前のファイルが必要です。</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no name of an interface; such names are like &apos;org.example.Viewer&apos;.</source>
        <translation>「%1」はインターフェースの名前ではありません。「org.example.Viewer」のような名前にしてください。</translation>
    </message>
</context>
<context>
    <name>EntryTrial</name>
    <message>
        <source>The entry could not be written to a temporary file.</source>
        <translation>エントリを一時ファイルに書き込めませんでした。</translation>
    </message>
</context>
<context>
    <name>KeyAssistance</name>
    <message>
        <source>Press the keys of the shortcut. Tab leaves the field.</source>
        <translation>ショートカットのキーを押してください。Tab でフィールドを離れます。</translation>
    </message>
    <message>
        <source>Key for action &apos;%1&apos;</source>
        <translation>アクション「%1」のキー</translation>
    </message>
    <message>
        <source>None: no key for action &apos;%1&apos;</source>
        <translation>なし: アクション「%1」にキーを割り当てない</translation>
    </message>
    <message>
        <source>What speaks against the key for action &apos;%1&apos;</source>
        <translation>アクション「%1」のキーの問題点</translation>
    </message>
</context>
<context>
    <name>KeyDescription</name>
    <message>
        <source>Whether the entry starts a program, opens an address or describes a folder of the menu.</source>
        <translation>エントリが、プログラムを起動するのか、アドレスを開くのか、メニューのフォルダを表すのかを示します。</translation>
    </message>
    <message>
        <source>The name that menus show.</source>
        <translation>メニューに表示される名前です。</translation>
    </message>
    <message>
        <source>The icon that menus show: a name from the icon theme, or the full path of a picture.</source>
        <translation>メニューに表示されるアイコンです。アイコンテーマにある名前か、画像の完全なパスを指定します。</translation>
    </message>
    <message>
        <source>The command that starts the program, with codes such as %f for the files that it opens.</source>
        <translation>プログラムを起動するコマンドです。開くファイルを表す %f などのコードを使えます。</translation>
    </message>
    <message>
        <source>Whether the program needs a terminal window.</source>
        <translation>プログラムにターミナルウィンドウが必要かどうかを示します。</translation>
    </message>
    <message>
        <source>The folder in which the program starts.</source>
        <translation>プログラムを起動するときの作業フォルダです。</translation>
    </message>
    <message>
        <source>A program that has to be installed; without it menus leave the entry out.</source>
        <translation>インストールされている必要があるプログラムです。ない場合、エントリはメニューに出ません。</translation>
    </message>
    <message>
        <source>The address that the entry opens.</source>
        <translation>エントリが開くアドレスです。</translation>
    </message>
    <message>
        <source>What kind of program it is, such as: Web browser.</source>
        <translation>プログラムの種類です。例: ウェブブラウザ。</translation>
    </message>
    <message>
        <source>A sentence about the program, which menus show as a tip.</source>
        <translation>メニューでヒントとして表示される、プログラムの説明文です。</translation>
    </message>
    <message>
        <source>Whether menus leave the entry out although the program can be used.</source>
        <translation>プログラムが使える場合でもエントリをメニューに出さないかどうかを示します。</translation>
    </message>
    <message>
        <source>Whether the entry counts as deleted.</source>
        <translation>エントリを削除済みとして扱うかどうかを示します。</translation>
    </message>
    <message>
        <source>The desktop environments that alone show the entry; none means all.</source>
        <translation>エントリを表示するデスクトップ環境を限定します。指定がなければすべてで表示します。</translation>
    </message>
    <message>
        <source>The desktop environments that do not show the entry.</source>
        <translation>エントリを表示しないデスクトップ環境です。</translation>
    </message>
    <message>
        <source>The types of files that the program opens.</source>
        <translation>プログラムが開けるファイルのタイプです。</translation>
    </message>
    <message>
        <source>The groups of the menu that the program belongs to.</source>
        <translation>プログラムが属するメニューのグループです。</translation>
    </message>
    <message>
        <source>Words by which a search finds the program beside its name.</source>
        <translation>名前のほかに、検索でプログラムを見つけるための語です。</translation>
    </message>
    <message>
        <source>Whether the program tells when it has started, so that the pointer shows it until then.</source>
        <translation>プログラムが起動の完了を知らせるかどうかを示します。知らせる場合、それまでポインタが起動中であることを表します。</translation>
    </message>
    <message>
        <source>The class of the window by which the desktop knows that the program has started.</source>
        <translation>デスクトップがプログラムの起動完了を知るためのウィンドウのクラスです。</translation>
    </message>
    <message>
        <source>Further things that the program can be started for, such as: New window.</source>
        <translation>プログラムを起動して行えるその他の操作です。例: 新しいウィンドウ。</translation>
    </message>
    <message>
        <source>The version of the standard for entries that this one follows.</source>
        <translation>このエントリが従う、エントリの規格のバージョンです。</translation>
    </message>
    <message>
        <source>%1 Only for users of one language.</source>
        <comment>%1 is a sentence about a key</comment>
        <translation>%1 特定の言語の利用者だけが対象です。</translation>
    </message>
</context>
<context>
    <name>LanguageNote</name>
    <message>
        <source>Users of %1 see these texts.</source>
        <translation>%1 の利用者には、これらのテキストが表示されます。</translation>
    </message>
    <message>
        <source>Users of %1 see these texts, and those of %2 where one is missing.</source>
        <translation>%1 の利用者には、これらのテキストが表示され、欠けているものは %2 のテキストで補われます。</translation>
    </message>
    <message>
        <source>Users of %1 see these texts, and those without a language where one is missing.</source>
        <translation>%1 の利用者には、これらのテキストが表示され、欠けているものは言語指定なしのテキストで補われます。</translation>
    </message>
    <message>
        <source>Users of %1 see the texts of %2.</source>
        <translation>%1 の利用者には、%2 のテキストが表示されます。</translation>
    </message>
    <message>
        <source>Users of %1 see the texts without a language.</source>
        <translation>%1 の利用者には、言語指定なしのテキストが表示されます。</translation>
    </message>
    <message>
        <source>%1 Texts of their own have: %2.</source>
        <comment>%1 is a sentence, %2 a list of languages</comment>
        <translation>%1 独自のテキストがある言語: %2。</translation>
    </message>
</context>
<context>
    <name>MenuDeletion</name>
    <message>
        <source>There is no trash for %1. It would be deleted for good: this cannot be undone. Delete it?</source>
        <translation>%1 にはゴミ箱がありません。完全に削除され、元に戻すことはできません。削除しますか?</translation>
    </message>
    <message numerus="yes">
        <source>There is no trash for %n of these items. They would be deleted for good: this cannot be undone. Delete them?</source>
        <translation>
            <numerusform>これらの項目のうち %n 個にはゴミ箱がありません。完全に削除され、元に戻すことはできません。削除しますか?</numerusform>
        </translation>
    </message>
    <message>
        <source>%1 cannot be deleted: %2</source>
        <translation>%1 を削除できません: %2</translation>
    </message>
    <message numerus="yes">
        <source>The deletion was canceled. %n items are still there, in whole or in part.</source>
        <translation>
            <numerusform>削除はキャンセルされました。%n 個の項目が、全部または一部残っています。</numerusform>
        </translation>
    </message>
    <message>
        <source>The deletion was canceled. Still there, in whole or in part: %1.</source>
        <translation>削除はキャンセルされました。全部または一部残っているもの: %1。</translation>
    </message>
</context>
<context>
    <name>MenuDrop</name>
    <message>
        <source>The folder &apos;%1&apos; already has &apos;%2&apos;. Keep both gives the new one another file name, Replace puts the old one into the trash, Skip leaves the new one where it is; Cancel leaves everything as it is.</source>
        <translation>フォルダ「%1」には既に「%2」があります。「両方を残す」は新しい方に別のファイル名を付け、「置き換える」は古い方をゴミ箱に入れ、「スキップ」は新しい方を今の場所に残します。「キャンセル」はすべてをそのままにします。</translation>
    </message>
    <message>
        <source>The folder &apos;%1&apos; already has &apos;%2&apos;, which the new one comes from. Keep both gives the new one another file name, Skip leaves it where it is; Cancel leaves everything as it is.</source>
        <translation>フォルダ「%1」には既に「%2」があり、新しい方はそれに由来します。「両方を残す」は新しい方に別のファイル名を付け、「スキップ」は今の場所に残します。「キャンセル」はすべてをそのままにします。</translation>
    </message>
    <message>
        <source>Another one that comes to the folder &apos;%1&apos; has the same file name as &apos;%2&apos;. Keep both gives this one another file name, Skip leaves it where it is; Cancel leaves everything as it is.</source>
        <translation>フォルダ「%1」に入る別のものが、「%2」と同じファイル名です。「両方を残す」はこちらに別のファイル名を付け、「スキップ」は今の場所に残します。「キャンセル」はすべてをそのままにします。</translation>
    </message>
    <message>
        <source>Name already taken</source>
        <translation>名前が既に使われています</translation>
    </message>
    <message>
        <source>&amp;Keep both</source>
        <translation>両方を残す(&amp;K)</translation>
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
        <source>&amp;Do the same with all further ones</source>
        <translation>以降もすべて同じようにする(&amp;D)</translation>
    </message>
</context>
<context>
    <name>MenuHistory</name>
    <message>
        <source>Undo</source>
        <translation>元に戻す</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>やり直す</translation>
    </message>
    <message>
        <source>Done: %1</source>
        <translation>完了: %1</translation>
    </message>
    <message>
        <source>Moving files...</source>
        <translation>ファイルを移動しています...</translation>
    </message>
    <message>
        <source>Nothing was undone: %1</source>
        <translation>何も元に戻されませんでした: %1</translation>
    </message>
    <message>
        <source>Nothing was done again: %1</source>
        <translation>何もやり直されませんでした: %1</translation>
    </message>
    <message>
        <source>%1 is not there any more.</source>
        <translation>%1 はもうありません。</translation>
    </message>
    <message>
        <source>There is another %1 by now.</source>
        <translation>別の %1 があります。</translation>
    </message>
    <message>
        <source>%1 was changed by another program.</source>
        <translation>%1 は他のプログラムによって変更されました。</translation>
    </message>
    <message>
        <source>%1 is not in the trash any more.</source>
        <translation>%1 はもうゴミ箱にありません。</translation>
    </message>
    <message>
        <source>%1 cannot be put into the trash.</source>
        <translation>%1 をゴミ箱に入れられません。</translation>
    </message>
    <message>
        <source>It was canceled.</source>
        <translation>キャンセルされました。</translation>
    </message>
    <message>
        <source>%1 cannot be changed: %2</source>
        <translation>%1 を変更できません: %2</translation>
    </message>
    <message>
        <source>Undo creation of %1</source>
        <translation>%1 の作成を元に戻す</translation>
    </message>
    <message>
        <source>Redo creation of %1</source>
        <translation>%1 の作成をやり直す</translation>
    </message>
    <message>
        <source>%1 was created.</source>
        <translation>%1 を作成しました。</translation>
    </message>
    <message>
        <source>Undo change of %1</source>
        <translation>%1 の変更を元に戻す</translation>
    </message>
    <message>
        <source>Redo change of %1</source>
        <translation>%1 の変更をやり直す</translation>
    </message>
    <message>
        <source>%1 was changed.</source>
        <translation>%1 を変更しました。</translation>
    </message>
    <message>
        <source>Undo deletion of %1</source>
        <translation>%1 の削除を元に戻す</translation>
    </message>
    <message>
        <source>Redo deletion of %1</source>
        <translation>%1 の削除をやり直す</translation>
    </message>
    <message>
        <source>%1 was deleted.</source>
        <translation>%1 を削除しました。</translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of folder %1 (%n entries)</source>
        <translation>
            <numerusform>フォルダ %1 (%n 個のエントリ) の削除を元に戻す</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of folder %1 (%n entries)</source>
        <translation>
            <numerusform>フォルダ %1 (%n 個のエントリ) の削除をやり直す</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The folder %1 was deleted (%n entries).</source>
        <translation>
            <numerusform>フォルダ %1 (%n 個のエントリ) を削除しました。</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of %n items</source>
        <translation>
            <numerusform>%n 個の項目の削除を元に戻す</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of %n items</source>
        <translation>
            <numerusform>%n 個の項目の削除をやり直す</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were deleted.</source>
        <translation>
            <numerusform>%n 個の項目を削除しました。</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo moving of %1 to %2</source>
        <translation>%1 の %2 への移動を元に戻す</translation>
    </message>
    <message>
        <source>Redo moving of %1 to %2</source>
        <translation>%1 の %2 への移動をやり直す</translation>
    </message>
    <message>
        <source>%1 was moved to %2.</source>
        <translation>%1 を %2 に移動しました。</translation>
    </message>
    <message numerus="yes">
        <source>Undo moving of %n items to %2</source>
        <translation>
            <numerusform>%n 個の項目の %2 への移動を元に戻す</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo moving of %n items to %2</source>
        <translation>
            <numerusform>%n 個の項目の %2 への移動をやり直す</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were moved to %2.</source>
        <translation>
            <numerusform>%n 個の項目を %2 に移動しました。</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo copying of %1 to %2</source>
        <translation>%1 の %2 へのコピーを元に戻す</translation>
    </message>
    <message>
        <source>Redo copying of %1 to %2</source>
        <translation>%1 の %2 へのコピーをやり直す</translation>
    </message>
    <message>
        <source>%1 was copied to %2.</source>
        <translation>%1 を %2 にコピーしました。</translation>
    </message>
    <message numerus="yes">
        <source>Undo copying of %n items to %2</source>
        <translation>
            <numerusform>%n 個の項目の %2 へのコピーを元に戻す</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo copying of %n items to %2</source>
        <translation>
            <numerusform>%n 個の項目の %2 へのコピーをやり直す</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were copied to %2.</source>
        <translation>
            <numerusform>%n 個の項目を %2 にコピーしました。</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo reordering of %1</source>
        <translation>%1 の並べ替えを元に戻す</translation>
    </message>
    <message>
        <source>Redo reordering of %1</source>
        <translation>%1 の並べ替えをやり直す</translation>
    </message>
    <message>
        <source>%1 has another place.</source>
        <translation>%1 の位置を変えました。</translation>
    </message>
    <message>
        <source>Undo default menu</source>
        <translation>標準メニューを元に戻す</translation>
    </message>
    <message>
        <source>Redo default menu</source>
        <translation>標準メニューをやり直す</translation>
    </message>
    <message>
        <source>The default menu was built.</source>
        <translation>標準メニューを作成しました。</translation>
    </message>
    <message>
        <source>Undo hiding of %1</source>
        <translation>%1 を隠す操作を元に戻す</translation>
    </message>
    <message>
        <source>Redo hiding of %1</source>
        <translation>%1 を隠す操作をやり直す</translation>
    </message>
    <message>
        <source>%1 is hidden: the menu no longer shows it.</source>
        <translation>%1 は隠されています: メニューには表示されません。</translation>
    </message>
    <message>
        <source>Undo showing %1 again</source>
        <translation>%1 の再表示を元に戻す</translation>
    </message>
    <message>
        <source>Redo showing %1 again</source>
        <translation>%1 の再表示をやり直す</translation>
    </message>
    <message>
        <source>The menu shows %1 again.</source>
        <translation>%1 は再びメニューに表示されます。</translation>
    </message>
    <message>
        <source>Undo deletion of folder %1 (1 entry)</source>
        <translation>フォルダ %1 (1 個のエントリ) の削除を元に戻す</translation>
    </message>
    <message>
        <source>Redo deletion of folder %1 (1 entry)</source>
        <translation>フォルダ %1 (1 個のエントリ) の削除をやり直す</translation>
    </message>
    <message>
        <source>The folder %1 was deleted (1 entry).</source>
        <translation>フォルダ %1 (1 個のエントリ) を削除しました。</translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of %1 items (%n entries)</source>
        <translation>
            <numerusform>%1 個の項目 (%n 個のエントリ) の削除を元に戻す</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of %1 items (%n entries)</source>
        <translation>
            <numerusform>%1 個の項目 (%n 個のエントリ) の削除をやり直す</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%1 items were deleted (%n entries).</source>
        <translation>
            <numerusform>%1 個の項目 (%n 個のエントリ) を削除しました。</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo reordering of %n items</source>
        <translation>
            <numerusform>%n 個の項目の並べ替えを元に戻す</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo reordering of %n items</source>
        <translation>
            <numerusform>%n 個の項目の並べ替えをやり直す</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items have other places.</source>
        <translation>
            <numerusform>%n 個の項目の位置を変えました。</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo hiding of %n items</source>
        <translation>
            <numerusform>%n 個の項目を隠す操作を元に戻す</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo hiding of %n items</source>
        <translation>
            <numerusform>%n 個の項目を隠す操作をやり直す</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items are hidden: the menu no longer shows them.</source>
        <translation>
            <numerusform>%n 個の項目は隠されています: メニューには表示されません。</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo showing %n items again</source>
        <translation>
            <numerusform>%n 個の項目の再表示を元に戻す</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo showing %n items again</source>
        <translation>
            <numerusform>%n 個の項目の再表示をやり直す</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The menu shows %n items again.</source>
        <translation>
            <numerusform>%n 個の項目は再びメニューに表示されます。</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo sorting of folder %1</source>
        <translation>フォルダ %1 の整列を元に戻す</translation>
    </message>
    <message>
        <source>Redo sorting of folder %1</source>
        <translation>フォルダ %1 の整列をやり直す</translation>
    </message>
    <message>
        <source>The folder %1 was sorted by name.</source>
        <translation>フォルダ %1 を名前順に並べました。</translation>
    </message>
    <message>
        <source>Undo duplication of %1</source>
        <translation>%1 の複製を元に戻す</translation>
    </message>
    <message>
        <source>Redo duplication of %1</source>
        <translation>%1 の複製をやり直す</translation>
    </message>
    <message>
        <source>%1 was duplicated. The copy is selected.</source>
        <translation>%1 を複製しました。複製したものが選択されています。</translation>
    </message>
    <message numerus="yes">
        <source>Undo duplication of %n items</source>
        <translation>
            <numerusform>%n 個の項目の複製を元に戻す</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo duplication of %n items</source>
        <translation>
            <numerusform>%n 個の項目の複製をやり直す</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were duplicated. The copies are selected.</source>
        <translation>
            <numerusform>%n 個の項目を複製しました。複製したものが選択されています。</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo deletion of %1 items (1 entry)</source>
        <translation>%1 個の項目 (1 個のエントリ) の削除を元に戻す</translation>
    </message>
    <message>
        <source>Redo deletion of %1 items (1 entry)</source>
        <translation>%1 個の項目 (1 個のエントリ) の削除をやり直す</translation>
    </message>
    <message>
        <source>%1 items were deleted (1 entry).</source>
        <translation>%1 個の項目 (1 個のエントリ) を削除しました。</translation>
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
    <message>
        <source>Can&apos;t link %1: %2</source>
        <translation>%1 へのリンクを作成できません: %2</translation>
    </message>
</context>
<context>
    <name>SchemeMenu</name>
    <message>
        <source>This is not a regular file.</source>
        <translation>これは通常のファイルではありません。</translation>
    </message>
    <message>
        <source>Shortcuts taken over: %1, left out: %2. Ok puts them into force, Reset takes them back.</source>
        <translation>引き継いだショートカット: %1、除外: %2。OK で有効になり、リセットで取り消されます。</translation>
    </message>
    <message>
        <source>%3
Shortcuts taken over: %1, left out: %2. Ok puts them into force, Reset takes them back.</source>
        <comment>%3: a sentence about lines that were skipped</comment>
        <translation>%3
引き継いだショートカット: %1、除外: %2。OK で有効になり、リセットで取り消されます。</translation>
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
        <source>Save cheat sheet as &amp;text...</source>
        <translation>一覧表をテキストとして保存(&amp;T)...</translation>
    </message>
    <message>
        <source>&amp;Copy cheat sheet</source>
        <translation>一覧表をコピー(&amp;C)</translation>
    </message>
    <message>
        <source>Export keys</source>
        <translation>キーをエクスポート</translation>
    </message>
    <message>
        <source>Keys (*.ini);;All files (*)</source>
        <translation>キー (*.ini);;すべてのファイル (*)</translation>
    </message>
    <message>
        <source>%1
Choose another folder or another name, and try again.</source>
        <translation>%1
別のフォルダまたは別の名前を選んで、もう一度試してください。</translation>
    </message>
    <message>
        <source>Import keys</source>
        <translation>キーをインポート</translation>
    </message>
    <message>
        <source>%1
Choose a file that was written with &apos;Export keys...&apos;.</source>
        <translation>%1
「キーをエクスポート...」で書き出したファイルを選んでください。</translation>
    </message>
    <message>
        <source>HTML documents (*.html);;All files (*)</source>
        <translation>HTML 文書 (*.html);;すべてのファイル (*)</translation>
    </message>
    <message>
        <source>Plain text (*.txt);;All files (*)</source>
        <translation>プレーンテキスト (*.txt);;すべてのファイル (*)</translation>
    </message>
    <message>
        <source>Save cheat sheet</source>
        <translation>一覧表を保存</translation>
    </message>
    <message>
        <source>The cheat sheet could not be saved to %1: %2
Choose another folder or another name, and try again.</source>
        <comment>%2: what the system says</comment>
        <translation>一覧表を %1 に保存できませんでした: %2
別のフォルダまたは別の名前を選んで、もう一度試してください。</translation>
    </message>
</context>
<context>
    <name>SchemeQuestion</name>
    <message>
        <source>Import keys</source>
        <translation>キーをインポート</translation>
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
        <source>&amp;Do the same with all further ones</source>
        <translation>以降もすべて同じようにする(&amp;D)</translation>
    </message>
    <message>
        <source>The file has shortcut &apos;%1&apos; for action &apos;%2&apos;, but the global action &apos;%3&apos; has it. Skip leaves action &apos;%2&apos; as it is; Cancel takes nothing over.</source>
        <translation>ファイルではショートカット「%1」がアクション「%2」に割り当てられていますが、グローバルアクション「%3」が使用しています。スキップするとアクション「%2」はそのまま、キャンセルすると何も引き継がれません。</translation>
    </message>
    <message>
        <source>The file has shortcut &apos;%1&apos; for action &apos;%2&apos;, but action &apos;%3&apos; has it, too. Replace takes it away from action &apos;%3&apos;, Skip leaves action &apos;%2&apos; as it is; Cancel takes nothing over.</source>
        <translation>ファイルではショートカット「%1」がアクション「%2」に割り当てられていますが、アクション「%3」も使用しています。置き換えるとアクション「%3」から外され、スキップするとアクション「%2」はそのまま、キャンセルすると何も引き継がれません。</translation>
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
    <message>
        <source>Shortcut &apos;%1&apos; is a further shortcut of action &apos;%2&apos;.</source>
        <translation>ショートカット「%1」はアクション「%2」の追加のショートカットです。</translation>
    </message>
</context>
<context>
    <name>ShortcutDelegate</name>
    <message>
        <source>Back to no shortcut</source>
        <translation>ショートカットなしに戻す</translation>
    </message>
    <message>
        <source>Back to %1</source>
        <translation>%1 に戻す</translation>
    </message>
</context>
<context>
    <name>ShortcutFilterBar</name>
    <message>
        <source>Press keys</source>
        <translation>キーを押す</translation>
    </message>
    <message>
        <source>Changed only</source>
        <translation>変更のみ</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>フィルタ</translation>
    </message>
    <message>
        <source>Shows who has the keys that you press; Escape ends it.</source>
        <translation>押したキーを持つアクションを表示します。Escape で終了します。</translation>
    </message>
    <message>
        <source>Shows the actions alone whose shortcut is not the default one, or was edited.</source>
        <translation>ショートカットが標準と異なるか編集されたアクションだけを表示します。</translation>
    </message>
    <message>
        <source>Press the keys to look for</source>
        <translation>探すキーを押してください</translation>
    </message>
    <message>
        <source>Filter by name, group or shortcut</source>
        <translation>名前、グループ、ショートカットで絞り込む</translation>
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
    <message>
        <source>%1, changed</source>
        <comment>%1: an action or a key</comment>
        <translation>%1、変更あり</translation>
    </message>
    <message>
        <source>No shortcut</source>
        <translation>ショートカットなし</translation>
    </message>
    <message>
        <source>There is no default shortcut.</source>
        <translation>標準のショートカットはありません。</translation>
    </message>
    <message>
        <source>The default shortcut is %1.</source>
        <translation>標準のショートカットは %1 です。</translation>
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
    <name>TreeAssistance</name>
    <message>
        <source>&amp;Reset this shortcut</source>
        <translation>このショートカットをリセット(&amp;R)</translation>
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
    <message>
        <source>The file %1 is not a desktop entry: it has no group [Desktop Entry].</source>
        <translation>ファイル %1 はデスクトップエントリではありません: グループ [Desktop Entry] がありません。</translation>
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
    <message>
        <source>This menu cannot be changed: the folder %1 does not exist.</source>
        <translation>このメニューは変更できません: フォルダ %1 がありません。</translation>
    </message>
    <message>
        <source>This menu cannot be changed: you may not write to the folder %1.</source>
        <translation>このメニューは変更できません: フォルダ %1 に書き込めません。</translation>
    </message>
    <message>
        <source>Show hidden</source>
        <translation>隠れた項目を表示</translation>
    </message>
    <message>
        <source>Filter by name, command or keyword</source>
        <translation>名前、コマンド、キーワードで絞り込む</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>フィルタ</translation>
    </message>
    <message>
        <source>Also show the entries that the menu leaves out</source>
        <translation>メニューに出ないエントリも表示する</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>元に戻す</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>エラー</translation>
    </message>
    <message>
        <source>Start menu</source>
        <translation>スタートメニュー</translation>
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
    <message>
        <source>Not in the menu: it is not meant for this desktop.</source>
        <translation>メニューに出ません: このデスクトップ用ではありません。</translation>
    </message>
    <message>
        <source>Not in the menu: it is meant for other desktops only (%1).</source>
        <translation>メニューに出ません: 他のデスクトップ専用です (%1)。</translation>
    </message>
    <message>
        <source>Not in the menu: it is marked as deleted (Hidden).</source>
        <translation>メニューに出ません: 削除済みと記されています (Hidden)。</translation>
    </message>
    <message>
        <source>Not in the menu: it is marked not to be displayed (NoDisplay).</source>
        <translation>メニューに出ません: 表示しないと記されています (NoDisplay)。</translation>
    </message>
    <message>
        <source>Not in the menu: the program %1 is not installed (TryExec).</source>
        <translation>メニューに出ません: プログラム %1 がインストールされていません (TryExec)。</translation>
    </message>
    <message>
        <source>This file is not a desktop entry, whatever its name says.</source>
        <translation>このファイルは名前に反してデスクトップエントリではありません。</translation>
    </message>
    <message>
        <source>This file cannot be read.</source>
        <translation>このファイルは読み込めません。</translation>
    </message>
    <message>
        <source>This entry has no name. The name of its file is shown.</source>
        <translation>このエントリには名前がありません。ファイル名を表示しています。</translation>
    </message>
    <message>
        <source>Taking back what was done...</source>
        <translation>操作を元に戻しています...</translation>
    </message>
    <message>
        <source>The program that holds the clipboard does not answer. Nothing was pasted.</source>
        <translation>クリップボードを所有するプログラムが応答しません。何も貼り付けられませんでした。</translation>
    </message>
    <message>
        <source>Nothing can be created in %1, because there is no such folder.</source>
        <translation>%1 には何も作成できません。そのフォルダがありません。</translation>
    </message>
    <message>
        <source>%1 could not be saved. Make sure that the folder %2 may be written and that the disk is not full, then try again.</source>
        <translation>%1 を保存できませんでした。フォルダ %2 に書き込めること、ディスクに空きがあることを確かめて、もう一度試してください。</translation>
    </message>
    <message>
        <source>%1 could not be deleted: %2. Make sure that the folder that holds it may be written, then try again.</source>
        <translation>%1 を削除できませんでした: %2。それを含むフォルダに書き込めることを確かめて、もう一度試してください。</translation>
    </message>
    <message>
        <source>%1 was deleted in part only, because %2 could not be deleted: %3. Make sure that its folder may be written, then delete the rest.</source>
        <translation>%1 は一部しか削除されていません。%2 を削除できませんでした: %3。そのフォルダに書き込めることを確かめて、残りを削除してください。</translation>
    </message>
    <message>
        <source>Nothing in this menu matches &apos;%1&apos;.</source>
        <translation>このメニューに「%1」に一致するものはありません。</translation>
    </message>
    <message>
        <source>Searching the menu for &apos;%1&apos;...</source>
        <translation>メニューで「%1」を検索しています...</translation>
    </message>
    <message>
        <source>The menu is too large to be searched as a whole. Only a part of it was searched.</source>
        <translation>メニューが大きすぎて全体を検索できません。一部だけを検索しました。</translation>
    </message>
    <message>
        <source>&apos;%1&apos; was not changed: the file %2 cannot be written.</source>
        <translation>「%1」は変更されませんでした: ファイル %2 に書き込めません。</translation>
    </message>
    <message>
        <source>The order of the folder %1 could not be saved. Make sure that the folder may be written and that the disk is not full, then try again.</source>
        <translation>フォルダ %1 の並び順を保存できませんでした。フォルダに書き込めること、ディスクに空きがあることを確かめて、もう一度試してください。</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1. The menu was left as it is.</source>
        <translation>標準メニューを %1 に作成できませんでした。メニューは元のままです。</translation>
    </message>
    <message>
        <source>Menu</source>
        <comment>the tree</comment>
        <translation>メニュー</translation>
    </message>
    <message>
        <source>%1 cannot be edited, because the folder %2 may not be written.</source>
        <translation>%1 は編集できません。フォルダ %2 に書き込めません。</translation>
    </message>
    <message>
        <source>Moving files...</source>
        <translation>ファイルを移動しています...</translation>
    </message>
    <message>
        <source>Copying files...</source>
        <translation>ファイルをコピーしています...</translation>
    </message>
    <message>
        <source>Deleting files...</source>
        <translation>ファイルを削除しています...</translation>
    </message>
    <message>
        <source>The deletion of %1 was canceled. What was not yet deleted is still there.</source>
        <translation>%1 の削除はキャンセルされました。まだ削除されていないものは残っています。</translation>
    </message>
    <message>
        <source>This menu is empty. Press %1 for a new entry, or right-click here for what else can be added.</source>
        <translation>このメニューは空です。%1 を押すと新しいエントリを作成できます。ここを右クリックすると、ほかに追加できるものが表示されます。</translation>
    </message>
    <message>
        <source>the program %1 ended with an error</source>
        <translation>プログラム %1 はエラーで終了しました</translation>
    </message>
    <message>
        <source>the program %1 cannot be run</source>
        <translation>プログラム %1 を実行できません</translation>
    </message>
    <message numerus="yes">
        <source>And %n more.</source>
        <translation>
            <numerusform>ほか %n 個。</numerusform>
        </translation>
    </message>
    <message>
        <source>Open containin&amp;g folder</source>
        <translation>項目のあるフォルダを開く(&amp;G)</translation>
    </message>
    <message>
        <source>The folder %1 was not opened: %2.</source>
        <translation>フォルダ %1 を開けませんでした: %2。</translation>
    </message>
    <message>
        <source>New &amp;folder</source>
        <translation>新しいフォルダ(&amp;F)</translation>
    </message>
    <message>
        <source>New entr&amp;y</source>
        <translation>新しいエントリ(&amp;Y)</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>編集(&amp;E)</translation>
    </message>
    <message>
        <source>&amp;Delete</source>
        <translation>削除(&amp;D)</translation>
    </message>
    <message>
        <source>E&amp;xecute</source>
        <translation>実行(&amp;X)</translation>
    </message>
    <message>
        <source>F&amp;ind</source>
        <translation>検索(&amp;I)</translation>
    </message>
    <message>
        <source>Find &amp;Next</source>
        <translation>次を検索(&amp;N)</translation>
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
        <source>Default &amp;menu...</source>
        <translation>標準のメニュー(&amp;M)...</translation>
    </message>
    <message>
        <source>&amp;Up</source>
        <translation>上へ(&amp;U)</translation>
    </message>
    <message>
        <source>D&amp;own</source>
        <translation>下へ(&amp;O)</translation>
    </message>
    <message>
        <source>Dup&amp;licate</source>
        <translation>複製(&amp;L)</translation>
    </message>
    <message>
        <source>&amp;Hide</source>
        <translation>隠す(&amp;H)</translation>
    </message>
    <message>
        <source>Sho&amp;w again</source>
        <translation>再び表示(&amp;W)</translation>
    </message>
    <message>
        <source>&amp;Reload</source>
        <translation>再読み込み(&amp;R)</translation>
    </message>
    <message>
        <source>&amp;Sort by name</source>
        <translation>名前順に並べる(&amp;S)</translation>
    </message>
    <message>
        <source>The folder %1 is sorted by name already.</source>
        <translation>フォルダ %1 は既に名前順に並んでいます。</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1, because no application is installed. The menu was left as it is.</source>
        <translation>アプリケーションがインストールされていないため、標準メニューを %1 に作成できませんでした。メニューは元のままです。</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1: %2. The menu was left as it is.</source>
        <translation>標準メニューを %1 に作成できませんでした: %2。メニューは元のままです。</translation>
    </message>
    <message>
        <source>%1 is no file on this computer. Nothing was moved or copied.</source>
        <translation>%1 はこのコンピュータのファイルではありません。何も移動またはコピーされませんでした。</translation>
    </message>
    <message>
        <source>%1 was not started: %2.</source>
        <translation>%1 を起動できませんでした: %2。</translation>
    </message>
    <message>
        <source>This menu is empty. Right-click here and choose &apos;%2&apos; to fill it with the applications that are installed, or press %1 for a new entry.</source>
        <translation>このメニューは空です。ここを右クリックして「%2」を選ぶと、インストールされているアプリケーションが追加されます。%1 を押すと新しいエントリを作成できます。</translation>
    </message>
    <message>
        <source>This menu is empty, because no application was found that is installed. Once there is one, right-click here and choose &apos;%2&apos;. Until then, press %1 for an entry of your own.</source>
        <translation>インストールされているアプリケーションが見つからなかったため、このメニューは空です。インストールしたら、ここを右クリックして「%2」を選んでください。それまでは、%1 を押すと独自のエントリを作成できます。</translation>
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
    <name>VelUI::CategoryChooser</name>
    <message>
        <source>Main category</source>
        <translation>メインカテゴリ</translation>
    </message>
    <message>
        <source>Goes with %1</source>
        <translation>%1 と組み合わせて使用</translation>
    </message>
    <message>
        <source>Only beside &quot;Only show in&quot;</source>
        <translation>「次でのみ表示」と併用時のみ</translation>
    </message>
    <message>
        <source>Deprecated</source>
        <translation>非推奨</translation>
    </message>
    <message>
        <source>Extension</source>
        <comment>a category of somebody&apos;s own, X-...</comment>
        <translation>拡張</translation>
    </message>
    <message>
        <source>Not registered</source>
        <translation>未登録</translation>
    </message>
    <message>
        <source>Choose categories</source>
        <translation>カテゴリの選択</translation>
    </message>
    <message>
        <source>Name</source>
        <comment>title of a column</comment>
        <translation>名前</translation>
    </message>
    <message>
        <source>Category</source>
        <comment>title of a column</comment>
        <translation>カテゴリ</translation>
    </message>
    <message>
        <source>Remark</source>
        <comment>title of a column</comment>
        <translation>備考</translation>
    </message>
</context>
<context>
    <name>VelUI::CategoryNames</name>
    <message>
        <source>Audio and video</source>
        <translation>オーディオとビデオ</translation>
    </message>
    <message>
        <source>Audio</source>
        <translation>オーディオ</translation>
    </message>
    <message>
        <source>Video</source>
        <translation>ビデオ</translation>
    </message>
    <message>
        <source>Software development</source>
        <translation>ソフトウェア開発</translation>
    </message>
    <message>
        <source>Education</source>
        <translation>教育</translation>
    </message>
    <message>
        <source>Games</source>
        <translation>ゲーム</translation>
    </message>
    <message>
        <source>Graphics</source>
        <translation>グラフィックス</translation>
    </message>
    <message>
        <source>Internet and network</source>
        <translation>インターネットとネットワーク</translation>
    </message>
    <message>
        <source>Office</source>
        <translation>オフィス</translation>
    </message>
    <message>
        <source>Science</source>
        <translation>科学</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>設定</translation>
    </message>
    <message>
        <source>System tools</source>
        <translation>システムツール</translation>
    </message>
    <message>
        <source>Accessories</source>
        <translation>アクセサリ</translation>
    </message>
    <message>
        <source>Build tools</source>
        <translation>ビルドツール</translation>
    </message>
    <message>
        <source>Debuggers</source>
        <translation>デバッガ</translation>
    </message>
    <message>
        <source>Development environments</source>
        <translation>開発環境</translation>
    </message>
    <message>
        <source>Designers of user interfaces</source>
        <translation>ユーザインターフェース設計</translation>
    </message>
    <message>
        <source>Profilers</source>
        <translation>プロファイラ</translation>
    </message>
    <message>
        <source>Revision control</source>
        <translation>バージョン管理</translation>
    </message>
    <message>
        <source>Translation tools</source>
        <translation>翻訳ツール</translation>
    </message>
    <message>
        <source>Calendars</source>
        <translation>カレンダー</translation>
    </message>
    <message>
        <source>Address books</source>
        <translation>アドレス帳</translation>
    </message>
    <message>
        <source>Databases</source>
        <translation>データベース</translation>
    </message>
    <message>
        <source>Dictionaries</source>
        <translation>辞書</translation>
    </message>
    <message>
        <source>Charts</source>
        <translation>グラフ</translation>
    </message>
    <message>
        <source>Email</source>
        <translation>電子メール</translation>
    </message>
    <message>
        <source>Finances</source>
        <translation>財務</translation>
    </message>
    <message>
        <source>Flow charts</source>
        <translation>フローチャート</translation>
    </message>
    <message>
        <source>Handheld devices</source>
        <translation>携帯端末</translation>
    </message>
    <message>
        <source>Project management</source>
        <translation>プロジェクト管理</translation>
    </message>
    <message>
        <source>Presentations</source>
        <translation>プレゼンテーション</translation>
    </message>
    <message>
        <source>Spreadsheets</source>
        <translation>表計算</translation>
    </message>
    <message>
        <source>Word processors</source>
        <translation>ワープロ</translation>
    </message>
    <message>
        <source>Two-dimensional graphics</source>
        <translation>2D グラフィックス</translation>
    </message>
    <message>
        <source>Vector graphics</source>
        <translation>ベクターグラフィックス</translation>
    </message>
    <message>
        <source>Raster graphics</source>
        <translation>ラスターグラフィックス</translation>
    </message>
    <message>
        <source>Three-dimensional graphics</source>
        <translation>3D グラフィックス</translation>
    </message>
    <message>
        <source>Scanning</source>
        <translation>スキャン</translation>
    </message>
    <message>
        <source>Text recognition</source>
        <translation>文字認識</translation>
    </message>
    <message>
        <source>Photography</source>
        <translation>写真</translation>
    </message>
    <message>
        <source>Desktop publishing</source>
        <translation>デスクトップパブリッシング</translation>
    </message>
    <message>
        <source>Viewers</source>
        <translation>ビューア</translation>
    </message>
    <message>
        <source>Text tools</source>
        <translation>テキストツール</translation>
    </message>
    <message>
        <source>Desktop settings</source>
        <translation>デスクトップの設定</translation>
    </message>
    <message>
        <source>Hardware settings</source>
        <translation>ハードウェアの設定</translation>
    </message>
    <message>
        <source>Printing</source>
        <translation>印刷</translation>
    </message>
    <message>
        <source>Package managers</source>
        <translation>パッケージ管理</translation>
    </message>
    <message>
        <source>Dial-up connections</source>
        <translation>ダイヤルアップ接続</translation>
    </message>
    <message>
        <source>Instant messaging</source>
        <translation>インスタントメッセージ</translation>
    </message>
    <message>
        <source>Chat</source>
        <translation>チャット</translation>
    </message>
    <message>
        <source>IRC</source>
        <translation>IRC</translation>
    </message>
    <message>
        <source>News feeds</source>
        <translation>ニュースフィード</translation>
    </message>
    <message>
        <source>File transfer</source>
        <translation>ファイル転送</translation>
    </message>
    <message>
        <source>Amateur radio</source>
        <translation>アマチュア無線</translation>
    </message>
    <message>
        <source>Newsgroups</source>
        <translation>ニュースグループ</translation>
    </message>
    <message>
        <source>File sharing</source>
        <translation>ファイル共有</translation>
    </message>
    <message>
        <source>Remote access</source>
        <translation>リモートアクセス</translation>
    </message>
    <message>
        <source>Telephony</source>
        <translation>電話</translation>
    </message>
    <message>
        <source>Telephony tools</source>
        <translation>電話ツール</translation>
    </message>
    <message>
        <source>Video conferences</source>
        <translation>ビデオ会議</translation>
    </message>
    <message>
        <source>Web browsers</source>
        <translation>ウェブブラウザ</translation>
    </message>
    <message>
        <source>Web development</source>
        <translation>ウェブ開発</translation>
    </message>
    <message>
        <source>MIDI</source>
        <translation>MIDI</translation>
    </message>
    <message>
        <source>Mixers</source>
        <translation>ミキサー</translation>
    </message>
    <message>
        <source>Sequencers</source>
        <translation>シーケンサ</translation>
    </message>
    <message>
        <source>Tuners</source>
        <translation>チューナー</translation>
    </message>
    <message>
        <source>Television</source>
        <translation>テレビ</translation>
    </message>
    <message>
        <source>Audio and video editing</source>
        <translation>オーディオとビデオの編集</translation>
    </message>
    <message>
        <source>Players</source>
        <translation>プレーヤー</translation>
    </message>
    <message>
        <source>Recorders</source>
        <translation>レコーダー</translation>
    </message>
    <message>
        <source>Disc burning</source>
        <translation>ディスク書き込み</translation>
    </message>
    <message>
        <source>Action games</source>
        <translation>アクションゲーム</translation>
    </message>
    <message>
        <source>Adventure games</source>
        <translation>アドベンチャーゲーム</translation>
    </message>
    <message>
        <source>Arcade games</source>
        <translation>アーケードゲーム</translation>
    </message>
    <message>
        <source>Board games</source>
        <translation>ボードゲーム</translation>
    </message>
    <message>
        <source>Falling blocks games</source>
        <translation>落ち物ゲーム</translation>
    </message>
    <message>
        <source>Card games</source>
        <translation>カードゲーム</translation>
    </message>
    <message>
        <source>Games for children</source>
        <translation>子供向けゲーム</translation>
    </message>
    <message>
        <source>Logic games</source>
        <translation>論理ゲーム</translation>
    </message>
    <message>
        <source>Role-playing games</source>
        <translation>ロールプレイングゲーム</translation>
    </message>
    <message>
        <source>Shooters</source>
        <translation>シューティングゲーム</translation>
    </message>
    <message>
        <source>Simulations</source>
        <translation>シミュレーション</translation>
    </message>
    <message>
        <source>Sports games</source>
        <translation>スポーツゲーム</translation>
    </message>
    <message>
        <source>Strategy games</source>
        <translation>戦略ゲーム</translation>
    </message>
    <message>
        <source>Art</source>
        <translation>芸術</translation>
    </message>
    <message>
        <source>Construction</source>
        <translation>建築</translation>
    </message>
    <message>
        <source>Music</source>
        <translation>音楽</translation>
    </message>
    <message>
        <source>Languages</source>
        <translation>言語</translation>
    </message>
    <message>
        <source>Artificial intelligence</source>
        <translation>人工知能</translation>
    </message>
    <message>
        <source>Astronomy</source>
        <translation>天文学</translation>
    </message>
    <message>
        <source>Biology</source>
        <translation>生物学</translation>
    </message>
    <message>
        <source>Chemistry</source>
        <translation>化学</translation>
    </message>
    <message>
        <source>Computer science</source>
        <translation>計算機科学</translation>
    </message>
    <message>
        <source>Data visualization</source>
        <translation>データの可視化</translation>
    </message>
    <message>
        <source>Economics</source>
        <translation>経済</translation>
    </message>
    <message>
        <source>Electricity</source>
        <translation>電気</translation>
    </message>
    <message>
        <source>Geography</source>
        <translation>地理</translation>
    </message>
    <message>
        <source>Geology</source>
        <translation>地質学</translation>
    </message>
    <message>
        <source>Earth sciences</source>
        <translation>地球科学</translation>
    </message>
    <message>
        <source>History</source>
        <translation>歴史</translation>
    </message>
    <message>
        <source>Humanities</source>
        <translation>人文科学</translation>
    </message>
    <message>
        <source>Image processing</source>
        <translation>画像処理</translation>
    </message>
    <message>
        <source>Literature</source>
        <translation>文学</translation>
    </message>
    <message>
        <source>Maps</source>
        <translation>地図</translation>
    </message>
    <message>
        <source>Mathematics</source>
        <translation>数学</translation>
    </message>
    <message>
        <source>Numerical analysis</source>
        <translation>数値解析</translation>
    </message>
    <message>
        <source>Medicine</source>
        <translation>医学</translation>
    </message>
    <message>
        <source>Physics</source>
        <translation>物理学</translation>
    </message>
    <message>
        <source>Robotics</source>
        <translation>ロボット工学</translation>
    </message>
    <message>
        <source>Spirituality</source>
        <translation>スピリチュアル</translation>
    </message>
    <message>
        <source>Sports</source>
        <translation>スポーツ</translation>
    </message>
    <message>
        <source>Parallel computing</source>
        <translation>並列計算</translation>
    </message>
    <message>
        <source>Amusement</source>
        <translation>娯楽</translation>
    </message>
    <message>
        <source>Archiving</source>
        <translation>アーカイブ</translation>
    </message>
    <message>
        <source>Compression</source>
        <translation>圧縮</translation>
    </message>
    <message>
        <source>Electronics</source>
        <translation>電子工学</translation>
    </message>
    <message>
        <source>Emulators</source>
        <translation>エミュレータ</translation>
    </message>
    <message>
        <source>Engineering</source>
        <translation>工学</translation>
    </message>
    <message>
        <source>File tools</source>
        <translation>ファイルツール</translation>
    </message>
    <message>
        <source>File managers</source>
        <translation>ファイルマネージャ</translation>
    </message>
    <message>
        <source>Terminals</source>
        <translation>ターミナル</translation>
    </message>
    <message>
        <source>File systems</source>
        <translation>ファイルシステム</translation>
    </message>
    <message>
        <source>Monitors</source>
        <translation>システムモニタ</translation>
    </message>
    <message>
        <source>Security</source>
        <translation>セキュリティ</translation>
    </message>
    <message>
        <source>Accessibility</source>
        <translation>アクセシビリティ</translation>
    </message>
    <message>
        <source>Calculators</source>
        <translation>電卓</translation>
    </message>
    <message>
        <source>Clocks</source>
        <translation>時計</translation>
    </message>
    <message>
        <source>Text editors</source>
        <translation>テキストエディタ</translation>
    </message>
    <message>
        <source>Documentation</source>
        <translation>文書</translation>
    </message>
    <message>
        <source>For adults</source>
        <translation>成人向け</translation>
    </message>
    <message>
        <source>Core of the desktop</source>
        <translation>デスクトップの中核</translation>
    </message>
    <message>
        <source>Made with KDE</source>
        <translation>KDE で作成</translation>
    </message>
    <message>
        <source>Made with GNOME</source>
        <translation>GNOME で作成</translation>
    </message>
    <message>
        <source>Made with Xfce</source>
        <translation>Xfce で作成</translation>
    </message>
    <message>
        <source>Made with GTK</source>
        <translation>GTK で作成</translation>
    </message>
    <message>
        <source>Made with Qt</source>
        <translation>Qt で作成</translation>
    </message>
    <message>
        <source>Made with Motif</source>
        <translation>Motif で作成</translation>
    </message>
    <message>
        <source>Made with Java</source>
        <translation>Java で作成</translation>
    </message>
    <message>
        <source>For the console</source>
        <translation>コンソール用</translation>
    </message>
    <message>
        <source>Screen savers</source>
        <translation>スクリーンセーバー</translation>
    </message>
    <message>
        <source>Icons of the system tray</source>
        <translation>システムトレイのアイコン</translation>
    </message>
    <message>
        <source>Applets of a panel</source>
        <translation>パネルのアプレット</translation>
    </message>
    <message>
        <source>Desktop shells</source>
        <translation>デスクトップシェル</translation>
    </message>
    <message>
        <source>Applications</source>
        <translation>アプリケーション</translation>
    </message>
</context>
<context>
    <name>VelUI::ChoiceDialog</name>
    <message>
        <source>Filter</source>
        <translation>フィルタ</translation>
    </message>
    <message>
        <source>Type to filter</source>
        <translation>入力して絞り込む</translation>
    </message>
    <message>
        <source>Reading...</source>
        <translation>読み込んでいます...</translation>
    </message>
    <message>
        <source>No match</source>
        <translation>一致するものはありません</translation>
    </message>
    <message numerus="yes">
        <source>%n chosen</source>
        <translation>
            <numerusform>%n 個選択中</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>VelUI::DesktopChooser</name>
    <message>
        <source>Desktop environment</source>
        <translation>デスクトップ環境</translation>
    </message>
    <message>
        <source>Remark</source>
        <comment>title of a column</comment>
        <translation>備考</translation>
    </message>
    <message>
        <source>This session</source>
        <translation>このセッション</translation>
    </message>
    <message>
        <source>Not registered</source>
        <translation>未登録</translation>
    </message>
</context>
<context>
    <name>VelUI::EditActionsDialog</name>
    <message>
        <source>An action has no id. It can have &quot;%1&quot;.</source>
        <translation>ID のないアクションがあります。「%1」にできます。</translation>
    </message>
    <message>
        <source>Two actions have the id &quot;%1&quot;. The second one can have &quot;%2&quot;.</source>
        <translation>2 つのアクションの ID が「%1」です。2 つ目は「%2」にできます。</translation>
    </message>
    <message>
        <source>No entry can hold the id &quot;%1&quot;. It can be &quot;%2&quot;.</source>
        <translation>エントリの中で ID「%1」は使えません。「%2」にできます。</translation>
    </message>
    <message>
        <source>The id &quot;%1&quot; should have only A to Z, a to z, 0 to 9 and &quot;-&quot; in it, as &quot;%2&quot; has.</source>
        <translation>ID「%1」に使えるのは A から Z、a から z、0 から 9、「-」だけです。例えば「%2」にします。</translation>
    </message>
    <message numerus="yes">
        <source>%n more id(s) should be changed.</source>
        <translation>
            <numerusform>ほかに %n 個の ID を変更する必要があります。</numerusform>
        </translation>
    </message>
    <message>
        <source>Use &quot;%1&quot;</source>
        <translation>「%1」を使う</translation>
    </message>
    <message>
        <source>Use the proposed ids</source>
        <translation>提案された ID を使う</translation>
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
    <name>VelUI::EditStringsDialog</name>
    <message>
        <source>The &quot;;&quot; in &quot;%1&quot; does not separate items, it becomes part of one item.</source>
        <translation>「%1」の「;」は項目を区切らず、1 つの項目の一部になります。</translation>
    </message>
    <message numerus="yes">
        <source>Make %n item(s) of it</source>
        <translation>
            <numerusform>%n 個の項目に分ける</numerusform>
        </translation>
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
    <name>VelUI::EntryFormAssistance</name>
    <message>
        <source>Te&amp;xt</source>
        <comment>button: shows the file of the entry</comment>
        <translation>テキスト(&amp;X)</translation>
    </message>
    <message>
        <source>Shows the file as it would be saved</source>
        <translation>保存される内容でファイルを表示します</translation>
    </message>
</context>
<context>
    <name>VelUI::EntryTextDialog</name>
    <message>
        <source>Text of the entry</source>
        <translation>エントリのテキスト</translation>
    </message>
    <message>
        <source>The file as it would be saved</source>
        <translation>保存される内容のファイル</translation>
    </message>
    <message>
        <source>Nothing is changed.</source>
        <translation>変更はありません。</translation>
    </message>
    <message>
        <source>≠ changed lines: %1, + new lines: %2, removed lines: %3</source>
        <translation>≠ 変更された行: %1、+ 新しい行: %2、削除された行: %3</translation>
    </message>
</context>
<context>
    <name>VelUI::FieldChoosers</name>
    <message>
        <source>Choose %1</source>
        <comment>name of a &quot;Choose...&quot; button</comment>
        <translation>%1 を選択</translation>
    </message>
    <message>
        <source>Choose...</source>
        <translation>選択...</translation>
    </message>
    <message>
        <source>Chooses from all that are known (Alt+Down)</source>
        <translation>既知のものすべてから選択します (Alt+Down)</translation>
    </message>
    <message>
        <source>Chooses an installed program (Alt+Down)</source>
        <translation>インストールされているプログラムを選択します (Alt+Down)</translation>
    </message>
    <message>
        <source>Insert</source>
        <comment>button: a field code</comment>
        <translation>挿入</translation>
    </message>
    <message>
        <source>Insert a field code</source>
        <translation>フィールドコードを挿入</translation>
    </message>
    <message>
        <source>Inserts a code that stands for the files to open, or for a part of this entry</source>
        <translation>開くファイルや、このエントリの一部を表すコードを挿入します</translation>
    </message>
</context>
<context>
    <name>VelUI::FieldCodes</name>
    <message>
        <source>%f: one file; for several files the program is started several times</source>
        <translation>%f: 1 つのファイル。複数の場合はプログラムを複数回起動します</translation>
    </message>
    <message>
        <source>%F: all files, each as a word of its own</source>
        <translation>%F: すべてのファイル。それぞれ独立した語になります</translation>
    </message>
    <message>
        <source>%u: one address (URL) or file; for several the program is started several times</source>
        <translation>%u: 1 つのアドレス (URL) またはファイル。複数の場合はプログラムを複数回起動します</translation>
    </message>
    <message>
        <source>%U: all addresses (URLs) or files, each as a word of its own</source>
        <translation>%U: すべてのアドレス (URL) またはファイル。それぞれ独立した語になります</translation>
    </message>
    <message>
        <source>%i: --icon and the icon of this entry, if it has one</source>
        <translation>%i: このエントリにアイコンがあれば、--icon とそのアイコン</translation>
    </message>
    <message>
        <source>%c: the name of this entry, translated</source>
        <translation>%c: このエントリの名前 (翻訳されたもの)</translation>
    </message>
    <message>
        <source>%k: where the file of this entry lies</source>
        <translation>%k: このエントリのファイルの場所</translation>
    </message>
    <message>
        <source>%%: a percent sign</source>
        <translation>%%: パーセント記号</translation>
    </message>
</context>
<context>
    <name>VelUI::FindingLine</name>
    <message>
        <source>Fix</source>
        <translation>修正</translation>
    </message>
    <message>
        <source>Fix: %1</source>
        <comment>on a button; %1 is what it does</comment>
        <translation>修正: %1</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>how bad something is, and what it is</comment>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>エラー</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>警告</translation>
    </message>
    <message>
        <source>Hint</source>
        <translation>ヒント</translation>
    </message>
</context>
<context>
    <name>VelUI::FormFindings</name>
    <message>
        <source>%1: %2</source>
        <comment>a key or an action of an entry, and what is wrong with it</comment>
        <translation>%1: %2</translation>
    </message>
</context>
<context>
    <name>VelUI::FormHistory</name>
    <message>
        <source>Undo change of %1</source>
        <translation>%1 の変更を元に戻す</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>元に戻す</translation>
    </message>
    <message>
        <source>Redo change of %1</source>
        <translation>%1 の変更をやり直す</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>やり直す</translation>
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
    <name>VelUI::LanguageBar</name>
    <message>
        <source>&amp;Language:</source>
        <translation>言語(&amp;L):</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>言語</translation>
    </message>
    <message>
        <source>Another language...</source>
        <translation>その他の言語...</translation>
    </message>
    <message>
        <source>Another language</source>
        <translation>その他の言語</translation>
    </message>
    <message>
        <source>Unknown language</source>
        <translation>不明な言語</translation>
    </message>
    <message>
        <source>%1 (%2), yours: %3 of %4 texts</source>
        <translation>%1 (%2)、あなたの言語: %4 個中 %3 個のテキスト</translation>
    </message>
    <message>
        <source>%1 (%2), yours: no text yet</source>
        <translation>%1 (%2)、あなたの言語: テキストはまだありません</translation>
    </message>
    <message>
        <source>%1 (%2): %3 of %4 texts</source>
        <translation>%1 (%2): %4 個中 %3 個のテキスト</translation>
    </message>
    <message>
        <source>%1 (%2): no text yet</source>
        <translation>%1 (%2): テキストはまだありません</translation>
    </message>
</context>
<context>
    <name>VelUI::LanguageDialog</name>
    <message>
        <source>Another language</source>
        <translation>その他の言語</translation>
    </message>
    <message>
        <source>&amp;Language or its code, such as pt_BR:</source>
        <translation>言語またはそのコード (例: pt_BR)(&amp;L):</translation>
    </message>
    <message>
        <source>Language or its code</source>
        <translation>言語またはそのコード</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>a language and its code</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>No language has such a code: it is like de, pt_BR or sr@latin.</source>
        <translation>そのような言語コードはありません: コードは de、pt_BR、sr@latin のような形です。</translation>
    </message>
    <message>
        <source>The code %1 is well-formed, but no language of this name is known.</source>
        <translation>コード %1 の形は正しいのですが、この名前の言語は知られていません。</translation>
    </message>
</context>
<context>
    <name>VelUI::MimeTypeChooser</name>
    <message>
        <source>Choose MIME types</source>
        <translation>MIME タイプの選択</translation>
    </message>
</context>
<context>
    <name>VelUI::MimeTypeSource</name>
    <message>
        <source>MIME type</source>
        <translation>MIME タイプ</translation>
    </message>
    <message>
        <source>Description</source>
        <translation>説明</translation>
    </message>
    <message>
        <source>File names</source>
        <translation>ファイル名</translation>
    </message>
    <message>
        <source>Not in the database</source>
        <translation>データベースにありません</translation>
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
<context>
    <name>VelUI::ProgramChooser</name>
    <message>
        <source>Choose a program</source>
        <translation>プログラムの選択</translation>
    </message>
</context>
<context>
    <name>VelUI::ProgramSource</name>
    <message>
        <source>Program</source>
        <comment>title of a column</comment>
        <translation>プログラム</translation>
    </message>
    <message>
        <source>Folder</source>
        <comment>title of a column</comment>
        <translation>フォルダ</translation>
    </message>
</context>
<context>
    <name>VelUI::RowFindings</name>
    <message numerus="yes">
        <source>And %n more.</source>
        <translation>
            <numerusform>ほか %n 個。</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>VelUI::TrialLine</name>
    <message>
        <source>Stop</source>
        <comment>button: ends the trial of an entry</comment>
        <translation>停止</translation>
    </message>
    <message>
        <source>T&amp;ry</source>
        <comment>button: runs the entry</comment>
        <translation>試す(&amp;R)</translation>
    </message>
    <message>
        <source>Stops the trial</source>
        <translation>試行を停止します</translation>
    </message>
    <message>
        <source>Runs the entry as it is now, without saving it</source>
        <translation>エントリを保存せずに、今の状態で実行します</translation>
    </message>
    <message>
        <source>The program vel-open, which runs entries, could not be started: %1</source>
        <translation>エントリを実行するプログラム vel-open を起動できませんでした: %1</translation>
    </message>
    <message>
        <source>The trial was stopped.</source>
        <translation>試行を停止しました。</translation>
    </message>
    <message>
        <source>The entry was started (exit status 0).</source>
        <translation>エントリを起動しました (終了ステータス 0)。</translation>
    </message>
    <message>
        <source>The entry was started (exit status 0): %1</source>
        <translation>エントリを起動しました (終了ステータス 0): %1</translation>
    </message>
    <message>
        <source>The entry could not be started (exit status %1).</source>
        <translation>エントリを起動できませんでした (終了ステータス %1)。</translation>
    </message>
    <message>
        <source>The entry could not be started (exit status %1): %2</source>
        <translation>エントリを起動できませんでした (終了ステータス %1): %2</translation>
    </message>
</context>
</TS>
