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
        <source>Hide</source>
        <translation>隠す</translation>
    </message>
    <message>
        <source>Show again</source>
        <translation>再び表示</translation>
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
        <source>Reload</source>
        <translation>再読み込み</translation>
    </message>
    <message>
        <source>This menu is empty. Press %1 for a new entry, or right-click here for what else can be added.</source>
        <translation>このメニューは空です。%1 を押すと新しいエントリを作成できます。ここを右クリックすると、ほかに追加できるものが表示されます。</translation>
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
