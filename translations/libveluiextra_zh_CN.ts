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
