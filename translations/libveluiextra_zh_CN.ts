<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="zh_CN" sourcelanguage="en">
<context>
    <name>ActionListEdit</name>
    <message>
        <source>Form</source>
        <translation>表单</translation>
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
        <translation>转到</translation>
    </message>
    <message>
        <source>Go to action &apos;%1&apos;</source>
        <translation>转到操作“%1”</translation>
    </message>
    <message>
        <source>Take over</source>
        <translation>接管</translation>
    </message>
    <message>
        <source>Take over &apos;%1&apos; from action &apos;%2&apos;</source>
        <translation>从操作“%2”接管“%1”</translation>
    </message>
    <message>
        <source>Further clashes: %1</source>
        <translation>其他冲突：%1</translation>
    </message>
</context>
<context>
    <name>EditActionsDialog</name>
    <message>
        <source>Actions</source>
        <translation>操作</translation>
    </message>
</context>
<context>
    <name>EditActionsWidget</name>
    <message>
        <source>Form</source>
        <translation>表单</translation>
    </message>
    <message>
        <source>Add...</source>
        <translation>添加...</translation>
    </message>
    <message>
        <source>Edit...</source>
        <translation>编辑...</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>删除</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>上移</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>下移</translation>
    </message>
</context>
<context>
    <name>EditShortcutsAssistance</name>
    <message>
        <source>Schemes</source>
        <translation>方案</translation>
    </message>
    <message>
        <source>No action matches the filter.</source>
        <translation>没有操作符合筛选条件。</translation>
    </message>
    <message>
        <source>No action has the shortcut %1.</source>
        <translation>没有操作使用快捷键 %1。</translation>
    </message>
</context>
<context>
    <name>EditShortcutsDialog</name>
    <message>
        <source>None</source>
        <translation>无</translation>
    </message>
    <message>
        <source>Configure shortcuts</source>
        <translation>配置快捷键</translation>
    </message>
    <message>
        <source>Choose a key for selected action</source>
        <translation>为选中的操作选择按键</translation>
    </message>
    <message>
        <source>Default key:</source>
        <translation>默认按键：</translation>
    </message>
    <message>
        <source>Assign key:</source>
        <translation>指定按键：</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for global action &apos;%2&apos;.</source>
        <translation>快捷键“%1”已用于全局操作“%2”。</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for action &apos;%2&apos;. Please try another.</source>
        <translation>快捷键“%1”已用于操作“%2”。请尝试其他快捷键。</translation>
    </message>
    <message>
        <source>Shortcuts conflict</source>
        <translation>快捷键冲突</translation>
    </message>
    <message>
        <source>Apply changes</source>
        <translation>应用更改</translation>
    </message>
    <message>
        <source>Some shortcuts have been changed. Do you want to apply changes?</source>
        <translation>一些快捷键已更改。您想要应用更改吗？</translation>
    </message>
</context>
<context>
    <name>EditStringsDialog</name>
    <message>
        <source>Strings</source>
        <translation>字符串</translation>
    </message>
</context>
<context>
    <name>EditableListWidget</name>
    <message>
        <source>Form</source>
        <translation>表单</translation>
    </message>
    <message>
        <source>Add...</source>
        <translation>添加...</translation>
    </message>
    <message>
        <source>Edit...</source>
        <translation>编辑...</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>删除</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>上移</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>下移</translation>
    </message>
</context>
<context>
    <name>KeyAssistance</name>
    <message>
        <source>Press the keys of the shortcut. Tab leaves the field.</source>
        <translation>请按下快捷键的各个键。按 Tab 离开输入框。</translation>
    </message>
    <message>
        <source>Key for action &apos;%1&apos;</source>
        <translation>操作“%1”的按键</translation>
    </message>
    <message>
        <source>None: no key for action &apos;%1&apos;</source>
        <translation>无：操作“%1”不使用按键</translation>
    </message>
    <message>
        <source>What speaks against the key for action &apos;%1&apos;</source>
        <translation>操作“%1”的按键存在的问题</translation>
    </message>
</context>
<context>
    <name>MenuDeletion</name>
    <message>
        <source>There is no trash for %1. It would be deleted for good: this cannot be undone. Delete it?</source>
        <translation>%1 没有回收站可用。它将被永久删除，无法撤销。要删除吗？</translation>
    </message>
    <message numerus="yes">
        <source>There is no trash for %n of these items. They would be deleted for good: this cannot be undone. Delete them?</source>
        <translation>
            <numerusform>其中 %n 个项目没有回收站可用。它们将被永久删除，无法撤销。要删除吗？</numerusform>
        </translation>
    </message>
    <message>
        <source>%1 cannot be deleted: %2</source>
        <translation>无法删除 %1：%2</translation>
    </message>
</context>
<context>
    <name>MenuHistory</name>
    <message>
        <source>Undo</source>
        <translation>撤销</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>重做</translation>
    </message>
    <message>
        <source>Done: %1</source>
        <translation>完成：%1</translation>
    </message>
    <message>
        <source>Moving files...</source>
        <translation>正在移动文件...</translation>
    </message>
    <message>
        <source>Nothing was undone: %1</source>
        <translation>没有撤销任何操作：%1</translation>
    </message>
    <message>
        <source>Nothing was done again: %1</source>
        <translation>没有重做任何操作：%1</translation>
    </message>
    <message>
        <source>%1 is not there any more.</source>
        <translation>%1 已不存在。</translation>
    </message>
    <message>
        <source>There is another %1 by now.</source>
        <translation>现在有另一个 %1。</translation>
    </message>
    <message>
        <source>%1 was changed by another program.</source>
        <translation>%1 已被其他程序更改。</translation>
    </message>
    <message>
        <source>%1 is not in the trash any more.</source>
        <translation>%1 已不在回收站中。</translation>
    </message>
    <message>
        <source>%1 cannot be put into the trash.</source>
        <translation>无法将 %1 移到回收站。</translation>
    </message>
    <message>
        <source>It was canceled.</source>
        <translation>操作已取消。</translation>
    </message>
    <message>
        <source>%1 cannot be changed: %2</source>
        <translation>无法更改 %1：%2</translation>
    </message>
    <message>
        <source>Undo creation of %1</source>
        <translation>撤销创建 %1</translation>
    </message>
    <message>
        <source>Redo creation of %1</source>
        <translation>重做创建 %1</translation>
    </message>
    <message>
        <source>%1 was created.</source>
        <translation>已创建 %1。</translation>
    </message>
    <message>
        <source>Undo change of %1</source>
        <translation>撤销更改 %1</translation>
    </message>
    <message>
        <source>Redo change of %1</source>
        <translation>重做更改 %1</translation>
    </message>
    <message>
        <source>%1 was changed.</source>
        <translation>已更改 %1。</translation>
    </message>
    <message>
        <source>Undo deletion of %1</source>
        <translation>撤销删除 %1</translation>
    </message>
    <message>
        <source>Redo deletion of %1</source>
        <translation>重做删除 %1</translation>
    </message>
    <message>
        <source>%1 was deleted.</source>
        <translation>已删除 %1。</translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of folder %1 (%n entries)</source>
        <translation>
            <numerusform>撤销删除文件夹 %1（%n 个条目）</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of folder %1 (%n entries)</source>
        <translation>
            <numerusform>重做删除文件夹 %1（%n 个条目）</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The folder %1 was deleted (%n entries).</source>
        <translation>
            <numerusform>已删除文件夹 %1（%n 个条目）。</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of %n items</source>
        <translation>
            <numerusform>撤销删除 %n 个项目</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of %n items</source>
        <translation>
            <numerusform>重做删除 %n 个项目</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were deleted.</source>
        <translation>
            <numerusform>已删除 %n 个项目。</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo moving of %1 to %2</source>
        <translation>撤销将 %1 移动到 %2</translation>
    </message>
    <message>
        <source>Redo moving of %1 to %2</source>
        <translation>重做将 %1 移动到 %2</translation>
    </message>
    <message>
        <source>%1 was moved to %2.</source>
        <translation>已将 %1 移动到 %2。</translation>
    </message>
    <message numerus="yes">
        <source>Undo moving of %n items to %2</source>
        <translation>
            <numerusform>撤销将 %n 个项目移动到 %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo moving of %n items to %2</source>
        <translation>
            <numerusform>重做将 %n 个项目移动到 %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were moved to %2.</source>
        <translation>
            <numerusform>已将 %n 个项目移动到 %2。</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo copying of %1 to %2</source>
        <translation>撤销将 %1 复制到 %2</translation>
    </message>
    <message>
        <source>Redo copying of %1 to %2</source>
        <translation>重做将 %1 复制到 %2</translation>
    </message>
    <message>
        <source>%1 was copied to %2.</source>
        <translation>已将 %1 复制到 %2。</translation>
    </message>
    <message numerus="yes">
        <source>Undo copying of %n items to %2</source>
        <translation>
            <numerusform>撤销将 %n 个项目复制到 %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo copying of %n items to %2</source>
        <translation>
            <numerusform>重做将 %n 个项目复制到 %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were copied to %2.</source>
        <translation>
            <numerusform>已将 %n 个项目复制到 %2。</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo reordering of %1</source>
        <translation>撤销重新排列 %1</translation>
    </message>
    <message>
        <source>Redo reordering of %1</source>
        <translation>重做重新排列 %1</translation>
    </message>
    <message>
        <source>%1 has another place.</source>
        <translation>%1 的位置已改变。</translation>
    </message>
    <message>
        <source>Undo default menu</source>
        <translation>撤销默认菜单</translation>
    </message>
    <message>
        <source>Redo default menu</source>
        <translation>重做默认菜单</translation>
    </message>
    <message>
        <source>The default menu was built.</source>
        <translation>已生成默认菜单。</translation>
    </message>
    <message>
        <source>Undo hiding of %1</source>
        <translation>撤销隐藏 %1</translation>
    </message>
    <message>
        <source>Redo hiding of %1</source>
        <translation>重做隐藏 %1</translation>
    </message>
    <message>
        <source>%1 is hidden: the menu no longer shows it.</source>
        <translation>%1 已隐藏：菜单不再显示它。</translation>
    </message>
    <message>
        <source>Undo showing %1 again</source>
        <translation>撤销重新显示 %1</translation>
    </message>
    <message>
        <source>Redo showing %1 again</source>
        <translation>重做重新显示 %1</translation>
    </message>
    <message>
        <source>The menu shows %1 again.</source>
        <translation>菜单重新显示 %1。</translation>
    </message>
    <message>
        <source>Undo deletion of folder %1 (1 entry)</source>
        <translation>撤销删除文件夹 %1（1 个条目）</translation>
    </message>
    <message>
        <source>Redo deletion of folder %1 (1 entry)</source>
        <translation>重做删除文件夹 %1（1 个条目）</translation>
    </message>
    <message>
        <source>The folder %1 was deleted (1 entry).</source>
        <translation>已删除文件夹 %1（1 个条目）。</translation>
    </message>
</context>
<context>
    <name>QFileSystemModel</name>
    <message>
        <source>%1 does not exist.</source>
        <translation>%1 不存在。</translation>
    </message>
    <message>
        <source>%1 exists and was left as it is.</source>
        <translation>%1 已存在，保持不变。</translation>
    </message>
    <message>
        <source>%1 cannot be put into itself.</source>
        <translation>无法将 %1 放入其自身。</translation>
    </message>
    <message>
        <source>%1 cannot be written.</source>
        <translation>无法写入 %1。</translation>
    </message>
    <message>
        <source>Can&apos;t move %1: %2</source>
        <translation>无法移动 %1：%2</translation>
    </message>
    <message>
        <source>Can&apos;t copy %1: %2</source>
        <translation>无法复制 %1：%2</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>注意</translation>
    </message>
    <message>
        <source>%1 already exists. Overwrite?</source>
        <translation>%1 已存在。要覆盖吗？</translation>
    </message>
</context>
<context>
    <name>SchemeMenu</name>
    <message>
        <source>This is not a regular file.</source>
        <translation>这不是普通文件。</translation>
    </message>
    <message>
        <source>Shortcuts taken over: %1, left out: %2. Ok puts them into force, Reset takes them back.</source>
        <translation>已接管的快捷键：%1，未接管：%2。“确定”使其生效，“重置”将其撤回。</translation>
    </message>
    <message>
        <source>%3
Shortcuts taken over: %1, left out: %2. Ok puts them into force, Reset takes them back.</source>
        <comment>%3: a sentence about lines that were skipped</comment>
        <translation>%3
已接管的快捷键：%1，未接管：%2。“确定”使其生效，“重置”将其撤回。</translation>
    </message>
    <message>
        <source>&amp;Export keys...</source>
        <translation>导出按键(&amp;E)...</translation>
    </message>
    <message>
        <source>&amp;Import keys...</source>
        <translation>导入按键(&amp;I)...</translation>
    </message>
    <message>
        <source>Save cheat sheet as &amp;HTML...</source>
        <translation>将速查表保存为 HTML(&amp;H)...</translation>
    </message>
    <message>
        <source>Save cheat sheet as &amp;text...</source>
        <translation>将速查表保存为文本(&amp;T)...</translation>
    </message>
    <message>
        <source>&amp;Copy cheat sheet</source>
        <translation>复制速查表(&amp;C)</translation>
    </message>
    <message>
        <source>Export keys</source>
        <translation>导出按键</translation>
    </message>
    <message>
        <source>Keys (*.ini);;All files (*)</source>
        <translation>按键 (*.ini);;所有文件 (*)</translation>
    </message>
    <message>
        <source>%1
Choose another folder or another name, and try again.</source>
        <translation>%1
请选择其他文件夹或其他名称，然后重试。</translation>
    </message>
    <message>
        <source>Import keys</source>
        <translation>导入按键</translation>
    </message>
    <message>
        <source>%1
Choose a file that was written with &apos;Export keys...&apos;.</source>
        <translation>%1
请选择用“导出按键...”写入的文件。</translation>
    </message>
    <message>
        <source>HTML documents (*.html);;All files (*)</source>
        <translation>HTML 文档 (*.html);;所有文件 (*)</translation>
    </message>
    <message>
        <source>Plain text (*.txt);;All files (*)</source>
        <translation>纯文本 (*.txt);;所有文件 (*)</translation>
    </message>
    <message>
        <source>Save cheat sheet</source>
        <translation>保存速查表</translation>
    </message>
    <message>
        <source>The cheat sheet could not be saved to %1: %2
Choose another folder or another name, and try again.</source>
        <comment>%2: what the system says</comment>
        <translation>无法将速查表保存到 %1：%2
请选择其他文件夹或其他名称，然后重试。</translation>
    </message>
</context>
<context>
    <name>SchemeQuestion</name>
    <message>
        <source>Import keys</source>
        <translation>导入按键</translation>
    </message>
    <message>
        <source>&amp;Replace</source>
        <translation>替换(&amp;R)</translation>
    </message>
    <message>
        <source>&amp;Skip</source>
        <translation>跳过(&amp;S)</translation>
    </message>
    <message>
        <source>&amp;Do the same with all further ones</source>
        <translation>对其余各项执行相同操作(&amp;D)</translation>
    </message>
    <message>
        <source>The file has shortcut &apos;%1&apos; for action &apos;%2&apos;, but the global action &apos;%3&apos; has it. Skip leaves action &apos;%2&apos; as it is; Cancel takes nothing over.</source>
        <translation>文件中快捷键“%1”用于操作“%2”，但全局操作“%3”已使用它。“跳过”使操作“%2”保持不变；“取消”则不接管任何按键。</translation>
    </message>
    <message>
        <source>The file has shortcut &apos;%1&apos; for action &apos;%2&apos;, but action &apos;%3&apos; has it, too. Replace takes it away from action &apos;%3&apos;, Skip leaves action &apos;%2&apos; as it is; Cancel takes nothing over.</source>
        <translation>文件中快捷键“%1”用于操作“%2”，但操作“%3”也使用它。“替换”将其从操作“%3”移除，“跳过”使操作“%2”保持不变；“取消”则不接管任何按键。</translation>
    </message>
</context>
<context>
    <name>ShortcutClash</name>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for action &apos;%2&apos;.</source>
        <translation>快捷键“%1”已用于操作“%2”。</translation>
    </message>
    <message>
        <source>Shortcut &apos;%2&apos; of action &apos;%3&apos; begins with &apos;%1&apos;.</source>
        <translation>操作“%3”的快捷键“%2”以“%1”开头。</translation>
    </message>
    <message>
        <source>Shortcut &apos;%2&apos; begins with &apos;%1&apos;, the shortcut of action &apos;%3&apos;.</source>
        <translation>快捷键“%2”以操作“%3”的快捷键“%1”开头。</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; opens the menu &apos;%2&apos;.</source>
        <translation>快捷键“%1”用于打开菜单“%2”。</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; leads to &apos;%2&apos; in the window.</source>
        <translation>快捷键“%1”会转到窗口中的“%2”。</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is the standard shortcut for &apos;%2&apos;.</source>
        <translation>快捷键“%1”是“%2”的标准快捷键。</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for global action &apos;%2&apos;.</source>
        <translation>快捷键“%1”已用于全局操作“%2”。</translation>
    </message>
    <message>
        <source>With &apos;%1&apos; as a shortcut this key cannot be typed into texts.</source>
        <translation>若将“%1”用作快捷键，则无法在文本中输入此键。</translation>
    </message>
    <message>
        <source>The current keyboard layout cannot produce &apos;%1&apos;.</source>
        <translation>当前键盘布局无法输入“%1”。</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is a further shortcut of action &apos;%2&apos;.</source>
        <translation>快捷键“%1”是操作“%2”的另一个快捷键。</translation>
    </message>
</context>
<context>
    <name>ShortcutDelegate</name>
    <message>
        <source>Back to no shortcut</source>
        <translation>恢复为无快捷键</translation>
    </message>
    <message>
        <source>Back to %1</source>
        <translation>恢复为 %1</translation>
    </message>
</context>
<context>
    <name>ShortcutFilterBar</name>
    <message>
        <source>Press keys</source>
        <translation>按下按键</translation>
    </message>
    <message>
        <source>Changed only</source>
        <translation>仅已更改</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>筛选</translation>
    </message>
    <message>
        <source>Shows who has the keys that you press; Escape ends it.</source>
        <translation>显示谁使用您按下的键；按 Escape 结束。</translation>
    </message>
    <message>
        <source>Shows the actions alone whose shortcut is not the default one, or was edited.</source>
        <translation>仅显示快捷键不是默认值或已被编辑的操作。</translation>
    </message>
    <message>
        <source>Press the keys to look for</source>
        <translation>请按下要查找的键</translation>
    </message>
    <message>
        <source>Filter by name, group or shortcut</source>
        <translation>按名称、分组或快捷键筛选</translation>
    </message>
</context>
<context>
    <name>ShortcutScheme</name>
    <message>
        <source>The shortcuts could not be saved to %1: %2</source>
        <comment>%2: what the system says</comment>
        <translation>无法将快捷键保存到 %1：%2</translation>
    </message>
    <message>
        <source>The shortcuts could not be read from %1: %2</source>
        <comment>%2: what the system says</comment>
        <translation>无法从 %1 读取快捷键：%2</translation>
    </message>
    <message>
        <source>%1 is not a regular file.</source>
        <translation>%1 不是普通文件。</translation>
    </message>
    <message>
        <source>%1 is too large for a file of shortcuts.</source>
        <translation>%1 太大，不像是快捷键文件。</translation>
    </message>
    <message>
        <source>%1 holds no shortcuts.</source>
        <translation>%1 中没有快捷键。</translation>
    </message>
    <message>
        <source>Unreadable shortcuts in %1 were skipped: %2</source>
        <comment>%2: their number</comment>
        <translation>已跳过 %1 中无法读取的快捷键：%2</translation>
    </message>
</context>
<context>
    <name>ShortcutSheet</name>
    <message>
        <source>Keyboard shortcuts</source>
        <comment>title of a printed sheet</comment>
        <translation>键盘快捷键</translation>
    </message>
</context>
<context>
    <name>ShortcutsModel</name>
    <message>
        <source>Action</source>
        <translation>操作</translation>
    </message>
    <message>
        <source>Shortcut</source>
        <translation>快捷键</translation>
    </message>
    <message>
        <source>%1, changed</source>
        <comment>%1: an action or a key</comment>
        <translation>%1，已更改</translation>
    </message>
    <message>
        <source>No shortcut</source>
        <translation>无快捷键</translation>
    </message>
    <message>
        <source>There is no default shortcut.</source>
        <translation>没有默认快捷键。</translation>
    </message>
    <message>
        <source>The default shortcut is %1.</source>
        <translation>默认快捷键是 %1。</translation>
    </message>
</context>
<context>
    <name>StandardKeyNames</name>
    <message>
        <source>Help</source>
        <translation>帮助</translation>
    </message>
    <message>
        <source>What&apos;s this?</source>
        <translation>这是什么？</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>打开</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>关闭</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>保存</translation>
    </message>
    <message>
        <source>Save as</source>
        <translation>另存为</translation>
    </message>
    <message>
        <source>New</source>
        <translation>新建</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>删除</translation>
    </message>
    <message>
        <source>Cut</source>
        <translation>剪切</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>复制</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation>粘贴</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>撤销</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>重做</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>后退</translation>
    </message>
    <message>
        <source>Forward</source>
        <translation>前进</translation>
    </message>
    <message>
        <source>Refresh</source>
        <translation>刷新</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>放大</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>缩小</translation>
    </message>
    <message>
        <source>Print</source>
        <translation>打印</translation>
    </message>
    <message>
        <source>New tab</source>
        <translation>新建标签页</translation>
    </message>
    <message>
        <source>Next tab</source>
        <translation>下一个标签页</translation>
    </message>
    <message>
        <source>Previous tab</source>
        <translation>上一个标签页</translation>
    </message>
    <message>
        <source>Find</source>
        <translation>查找</translation>
    </message>
    <message>
        <source>Find next</source>
        <translation>查找下一个</translation>
    </message>
    <message>
        <source>Find previous</source>
        <translation>查找上一个</translation>
    </message>
    <message>
        <source>Replace</source>
        <translation>替换</translation>
    </message>
    <message>
        <source>Select all</source>
        <translation>全选</translation>
    </message>
    <message>
        <source>Deselect</source>
        <translation>取消选择</translation>
    </message>
    <message>
        <source>Full screen</source>
        <translation>全屏</translation>
    </message>
    <message>
        <source>Preferences</source>
        <translation>首选项</translation>
    </message>
    <message>
        <source>Quit</source>
        <translation>退出</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>取消</translation>
    </message>
    <message>
        <source>Bold</source>
        <translation>粗体</translation>
    </message>
    <message>
        <source>Italic</source>
        <translation>斜体</translation>
    </message>
    <message>
        <source>Underline</source>
        <translation>下划线</translation>
    </message>
    <message>
        <source>Move the cursor</source>
        <translation>移动光标</translation>
    </message>
    <message>
        <source>Select text</source>
        <translation>选择文本</translation>
    </message>
    <message>
        <source>Edit text</source>
        <translation>编辑文本</translation>
    </message>
</context>
<context>
    <name>StringListEdit</name>
    <message>
        <source>Form</source>
        <translation>表单</translation>
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
        <translation>重置此快捷键(&amp;R)</translation>
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
        <translation>没有可执行文件</translation>
    </message>
    <message>
        <source>can&apos;t find executable</source>
        <translation>找不到可执行文件</translation>
    </message>
    <message>
        <source>can&apos;t find try executable</source>
        <translation>找不到用于检测的可执行文件</translation>
    </message>
    <message>
        <source>can&apos;t find URL</source>
        <translation>找不到 URL</translation>
    </message>
    <message>
        <source>wrong/incomplete desktop entry</source>
        <translation>桌面条目错误或不完整</translation>
    </message>
    <message>
        <source>Can&apos;t save position on desktop for %1</source>
        <translation>无法保存 %1 在桌面上的位置</translation>
    </message>
    <message>
        <source>Copy from...</source>
        <translation>复制自...</translation>
    </message>
    <message>
        <source>Can&apos;t load file %1</source>
        <translation>无法加载文件 %1</translation>
    </message>
    <message>
        <source>Desktop Entry Editor</source>
        <translation>桌面条目编辑器</translation>
    </message>
    <message>
        <source>You create hidden desktop entry</source>
        <translation>您正在创建隐藏的桌面条目</translation>
    </message>
    <message>
        <source>Can&apos;t save file %1</source>
        <translation>无法保存文件 %1</translation>
    </message>
    <message>
        <source>Help</source>
        <translation>帮助</translation>
    </message>
    <message>
        <source>&lt;b&gt;Desktop entry&lt;/b&gt; is a multipurpose info file for installed apps, devices, etc. It can be used to build menu entries, shortcuts, etc. This dialog implements the &apos;Desktop Entry Standard&apos; of &lt;a href=&quot;https://www.freedesktop.org&quot;&gt;https://www.freedesktop.org&lt;/a&gt;.&lt;br&gt;&lt;br&gt;Desktop entry file is a text ini-like file with one main section [Desktop Entry] and possible additional sections for each action defined in the main section field &apos;Actions&apos;. All fields are text string pairs: key=value. Value can also be a semicolon separated string list.</source>
        <translation>&lt;b&gt;桌面条目&lt;/b&gt;是一种用途广泛的信息文件，用于已安装的应用程序、设备等。它可以用来构建菜单项、快捷方式等。此对话框实现了 &lt;a href=&quot;https://www.freedesktop.org&quot;&gt;https://www.freedesktop.org&lt;/a&gt; 的“Desktop Entry Standard”标准。&lt;br&gt;&lt;br&gt;桌面条目文件是类似 INI 的文本文件，包含一个主要小节 [Desktop Entry]，还可以为主要小节的“Actions”字段中定义的每个操作包含附加的小节。所有字段都是成对的文本字符串：键=值。值也可以是以分号分隔的字符串列表。</translation>
    </message>
</context>
<context>
    <name>VelDesktopEntryPropsWidgetPrivate</name>
    <message>
        <source>Information about the URL</source>
        <translation>关于 URL 的信息</translation>
    </message>
    <message>
        <source>Only show in</source>
        <translation>仅显示于</translation>
    </message>
    <message>
        <source>Not show in</source>
        <translation>不显示于</translation>
    </message>
    <message>
        <source>Add desktop environment:</source>
        <translation>添加桌面环境：</translation>
    </message>
    <message>
        <source>Edit desktop environment:</source>
        <translation>编辑桌面环境：</translation>
    </message>
    <message>
        <source>MIME type or file name extension:</source>
        <translation>MIME 类型或文件扩展名：</translation>
    </message>
    <message>
        <source>MIME type</source>
        <translation>MIME 类型</translation>
    </message>
    <message>
        <source>Add MIME type</source>
        <translation>添加 MIME 类型</translation>
    </message>
    <message>
        <source>Edit MIME type</source>
        <translation>编辑 MIME 类型</translation>
    </message>
    <message>
        <source>Categories</source>
        <translation>类别</translation>
    </message>
    <message>
        <source>Add category</source>
        <translation>添加类别</translation>
    </message>
    <message>
        <source>Category:</source>
        <translation>类别：</translation>
    </message>
    <message>
        <source>Edit category</source>
        <translation>编辑类别</translation>
    </message>
    <message>
        <source>Keywords</source>
        <translation>关键词</translation>
    </message>
    <message>
        <source>Add keyword</source>
        <translation>添加关键词</translation>
    </message>
    <message>
        <source>Keyword:</source>
        <translation>关键词：</translation>
    </message>
    <message>
        <source>Edit keyword</source>
        <translation>编辑关键词</translation>
    </message>
    <message>
        <source>Actions</source>
        <translation>操作</translation>
    </message>
    <message>
        <source>Add action</source>
        <translation>添加操作</translation>
    </message>
    <message>
        <source>Edit action</source>
        <translation>编辑操作</translation>
    </message>
    <message>
        <source>Application</source>
        <translation>应用程序</translation>
    </message>
    <message>
        <source>Link</source>
        <translation>链接</translation>
    </message>
    <message>
        <source>Directory</source>
        <translation>文件夹</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>注意</translation>
    </message>
    <message>
        <source>Desktop entry type was changed.
Some field values may be lost...
Continue?</source>
        <translation>桌面条目的类型已更改。
某些字段的值可能会丢失...
要继续吗？</translation>
    </message>
    <message>
        <source>Type</source>
        <translation>类型</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>名称</translation>
    </message>
    <message>
        <source>Icon</source>
        <translation>图标</translation>
    </message>
    <message>
        <source>Exec</source>
        <translation>命令</translation>
    </message>
    <message>
        <source>Terminal</source>
        <translation>终端</translation>
    </message>
    <message>
        <source>Path</source>
        <translation>工作路径</translation>
    </message>
    <message>
        <source>Try exec</source>
        <translation>检测命令</translation>
    </message>
    <message>
        <source>Url</source>
        <translation>URL</translation>
    </message>
    <message>
        <source>Generic name</source>
        <translation>通用名称</translation>
    </message>
    <message>
        <source>Comment</source>
        <translation>注释</translation>
    </message>
    <message>
        <source>No display</source>
        <translation>不显示</translation>
    </message>
    <message>
        <source>Hidden</source>
        <translation>隐藏</translation>
    </message>
    <message>
        <source>Startup notify</source>
        <translation>启动通知</translation>
    </message>
    <message>
        <source>Startup WM class</source>
        <translation>启动窗口类</translation>
    </message>
    <message>
        <source>Version</source>
        <translation>版本</translation>
    </message>
</context>
<context>
    <name>VelMenuDialog</name>
    <message>
        <source>Edit</source>
        <translation>编辑</translation>
    </message>
    <message>
        <source>Send command to vel-wm to update
 edited menu, toolbar, etc.</source>
        <translation>向 vel-wm 发送命令，以更新
 编辑过的菜单、工具栏等</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>警告</translation>
    </message>
    <message>
        <source>Can&apos;t send command to vel-wm</source>
        <translation>无法向 vel-wm 发送命令</translation>
    </message>
    <message>
        <source>This menu cannot be changed: the folder %1 does not exist.</source>
        <translation>此菜单无法更改：文件夹 %1 不存在。</translation>
    </message>
    <message>
        <source>This menu cannot be changed: you may not write to the folder %1.</source>
        <translation>此菜单无法更改：您不能写入文件夹 %1。</translation>
    </message>
    <message>
        <source>Show hidden</source>
        <translation>显示隐藏项</translation>
    </message>
    <message>
        <source>Filter by name, command or keyword</source>
        <translation>按名称、命令或关键词筛选</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>筛选</translation>
    </message>
    <message>
        <source>Also show the entries that the menu leaves out</source>
        <translation>同时显示菜单中省略的条目</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>撤销</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>错误</translation>
    </message>
    <message>
        <source>Start menu</source>
        <translation>开始菜单</translation>
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
        <translation>无法启动：
%1 %2</translation>
    </message>
    <message>
        <source>All previous shortcuts
will be lost. Are you sure?</source>
        <translation>以前的所有快捷方式
都将丢失。您确定吗？</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>编辑</translation>
    </message>
    <message>
        <source>New folder</source>
        <translation>新建文件夹</translation>
    </message>
    <message>
        <source>New entry</source>
        <translation>新建条目</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>删除</translation>
    </message>
    <message>
        <source>Execute</source>
        <translation>执行</translation>
    </message>
    <message>
        <source>Find</source>
        <translation>查找</translation>
    </message>
    <message>
        <source>Find Next</source>
        <translation>查找下一个</translation>
    </message>
    <message>
        <source>Cut</source>
        <translation>剪切</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>复制</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation>粘贴</translation>
    </message>
    <message>
        <source>Default menu...</source>
        <translation>默认菜单...</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>上移</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>下移</translation>
    </message>
    <message>
        <source>Move</source>
        <translation>移动</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>取消</translation>
    </message>
    <message>
        <source>Group</source>
        <translation>组</translation>
    </message>
    <message>
        <source>Shortcut</source>
        <translation>快捷方式</translation>
    </message>
    <message>
        <source>Can&apos;t edit non desktop file</source>
        <translation>无法编辑非 desktop 文件</translation>
    </message>
    <message>
        <source>Desktop Entry %1</source>
        <translation>桌面条目 %1</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>注意</translation>
    </message>
    <message>
        <source>Are you sure to delete it?</source>
        <translation>您确定要删除它吗？</translation>
    </message>
    <message>
        <source>Find string:</source>
        <translation>查找字符串：</translation>
    </message>
    <message>
        <source>&apos;%1&apos; not found .</source>
        <translation>找不到“%1”。</translation>
    </message>
    <message>
        <source>Not in the menu: it is not meant for this desktop.</source>
        <translation>不在菜单中：它不适用于此桌面。</translation>
    </message>
    <message>
        <source>Not in the menu: it is meant for other desktops only (%1).</source>
        <translation>不在菜单中：它仅适用于其他桌面（%1）。</translation>
    </message>
    <message>
        <source>Not in the menu: it is marked as deleted (Hidden).</source>
        <translation>不在菜单中：它被标记为已删除 (Hidden)。</translation>
    </message>
    <message>
        <source>Not in the menu: it is marked not to be displayed (NoDisplay).</source>
        <translation>不在菜单中：它被标记为不显示 (NoDisplay)。</translation>
    </message>
    <message>
        <source>Not in the menu: the program %1 is not installed (TryExec).</source>
        <translation>不在菜单中：程序 %1 未安装 (TryExec)。</translation>
    </message>
    <message>
        <source>This file is not a desktop entry, whatever its name says.</source>
        <translation>无论名称如何，此文件都不是桌面条目。</translation>
    </message>
    <message>
        <source>This file cannot be read.</source>
        <translation>无法读取此文件。</translation>
    </message>
    <message>
        <source>This entry has no name. The name of its file is shown.</source>
        <translation>此条目没有名称，显示的是其文件名。</translation>
    </message>
    <message>
        <source>Taking back what was done...</source>
        <translation>正在撤销所做的操作...</translation>
    </message>
    <message>
        <source>The program that holds the clipboard does not answer. Nothing was pasted.</source>
        <translation>拥有剪贴板的程序没有响应。未粘贴任何内容。</translation>
    </message>
    <message>
        <source>Nothing can be created in %1, because there is no such folder.</source>
        <translation>无法在 %1 中创建任何内容，因为没有这个文件夹。</translation>
    </message>
    <message>
        <source>%1 could not be saved. Make sure that the folder %2 may be written and that the disk is not full, then try again.</source>
        <translation>无法保存 %1。请确保文件夹 %2 可以写入且磁盘未满，然后重试。</translation>
    </message>
    <message>
        <source>%1 could not be deleted: %2. Make sure that the folder that holds it may be written, then try again.</source>
        <translation>无法删除 %1：%2。请确保包含它的文件夹可以写入，然后重试。</translation>
    </message>
    <message>
        <source>%1 was deleted in part only, because %2 could not be deleted: %3. Make sure that its folder may be written, then delete the rest.</source>
        <translation>%1 只删除了一部分，因为无法删除 %2：%3。请确保其所在文件夹可以写入，然后删除其余部分。</translation>
    </message>
    <message>
        <source>Nothing in this menu matches &apos;%1&apos;.</source>
        <translation>此菜单中没有与“%1”相符的内容。</translation>
    </message>
    <message>
        <source>Searching the menu for &apos;%1&apos;...</source>
        <translation>正在菜单中搜索“%1”...</translation>
    </message>
    <message>
        <source>The menu is too large to be searched as a whole. Only a part of it was searched.</source>
        <translation>菜单过大，无法全部搜索，只搜索了其中一部分。</translation>
    </message>
    <message>
        <source>Hide</source>
        <translation>隐藏</translation>
    </message>
    <message>
        <source>Show again</source>
        <translation>重新显示</translation>
    </message>
    <message>
        <source>&apos;%1&apos; was not changed: the file %2 cannot be written.</source>
        <translation>“%1”未更改：无法写入文件 %2。</translation>
    </message>
    <message>
        <source>The order of the folder %1 could not be saved. Make sure that the folder may be written and that the disk is not full, then try again.</source>
        <translation>无法保存文件夹 %1 的顺序。请确保该文件夹可以写入且磁盘未满，然后重试。</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1. The menu was left as it is.</source>
        <translation>无法在 %1 中生成默认菜单。菜单保持原样。</translation>
    </message>
    <message>
        <source>Menu</source>
        <comment>the tree</comment>
        <translation>菜单</translation>
    </message>
    <message>
        <source>%1 cannot be edited, because the folder %2 may not be written.</source>
        <translation>无法编辑 %1，因为不能写入文件夹 %2。</translation>
    </message>
    <message>
        <source>Moving files...</source>
        <translation>正在移动文件...</translation>
    </message>
    <message>
        <source>Copying files...</source>
        <translation>正在复制文件...</translation>
    </message>
    <message>
        <source>Deleting files...</source>
        <translation>正在删除文件...</translation>
    </message>
    <message>
        <source>The deletion of %1 was canceled. What was not yet deleted is still there.</source>
        <translation>已取消删除 %1。尚未删除的内容仍然存在。</translation>
    </message>
    <message>
        <source>Reload</source>
        <translation>重新载入</translation>
    </message>
    <message>
        <source>This menu is empty. Press %1 for a new entry, or right-click here for what else can be added.</source>
        <translation>此菜单为空。按 %1 新建条目，或在此处单击右键查看还可以添加什么。</translation>
    </message>
</context>
<context>
    <name>VelUI::ActionPropsDialog</name>
    <message>
        <source>Id</source>
        <translation>标识</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>名称</translation>
    </message>
    <message>
        <source>Icon</source>
        <translation>图标</translation>
    </message>
    <message>
        <source>Exec</source>
        <translation>命令</translation>
    </message>
    <message>
        <source>Only show in</source>
        <translation>仅显示于</translation>
    </message>
    <message>
        <source>Add desktop environment:</source>
        <translation>添加桌面环境：</translation>
    </message>
    <message>
        <source>Edit desktop environment:</source>
        <translation>编辑桌面环境：</translation>
    </message>
    <message>
        <source>Not show in</source>
        <translation>不显示于</translation>
    </message>
</context>
<context>
    <name>VelUI::EditActionsWidget</name>
    <message>
        <source>Add action</source>
        <translation>添加操作</translation>
    </message>
    <message>
        <source>Edit action</source>
        <translation>编辑操作</translation>
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
        <translation>添加字符串</translation>
    </message>
    <message>
        <source>String:</source>
        <translation>字符串：</translation>
    </message>
    <message>
        <source>Edit string</source>
        <translation>编辑字符串</translation>
    </message>
</context>
<context>
    <name>VelUI::FormLayout</name>
    <message>
        <source>Edit %1</source>
        <comment>name of a &quot;...&quot; button</comment>
        <translation>编辑 %1</translation>
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
        <translation>选择应用程序的可执行路径</translation>
    </message>
</context>
</TS>
