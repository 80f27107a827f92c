<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="zh_CN" sourcelanguage="en">
<context>
    <name>DesktopEntryPages</name>
    <message>
        <source>&amp;Read-only</source>
        <translation>只读(&amp;R)</translation>
    </message>
    <message>
        <source>&amp;Button beside the address</source>
        <translation>地址旁的按钮(&amp;B)</translation>
    </message>
    <message>
        <source>Information requested for %1</source>
        <translation>已请求 %1 的信息</translation>
    </message>
    <message>
        <source>Use the buttons beside the fields to edit commands, files, icons, lists and actions.</source>
        <translation>命令和文件、图标、列表和操作通过其字段的按钮进行编辑。</translation>
    </message>
    <message>
        <source>Properties form</source>
        <translation>属性表单</translation>
    </message>
    <message>
        <source>Desktop entries</source>
        <translation>桌面条目</translation>
    </message>
    <message>
        <source>Paths, icons, lists and actions</source>
        <translation>路径、图标、列表和操作</translation>
    </message>
    <message>
        <source>&amp;Assistance</source>
        <translation>辅助(&amp;A)</translation>
    </message>
</context>
<context>
    <name>EditorCommands</name>
    <message>
        <source>Open</source>
        <translation>打开</translation>
    </message>
    <message>
        <source>Cannot read %1.</source>
        <translation>无法读取 %1。</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>保存</translation>
    </message>
    <message>
        <source>Cannot write %1.</source>
        <translation>无法写入 %1。</translation>
    </message>
    <message>
        <source>Go to line</source>
        <translation>转到行</translation>
    </message>
    <message>
        <source>Line:</source>
        <translation>行：</translation>
    </message>
    <message>
        <source>File</source>
        <translation>文件</translation>
    </message>
    <message>
        <source>&amp;New</source>
        <translation>新建(&amp;N)</translation>
    </message>
    <message>
        <source>&amp;Open...</source>
        <translation>打开(&amp;O)...</translation>
    </message>
    <message>
        <source>&amp;Save...</source>
        <translation>保存(&amp;S)...</translation>
    </message>
    <message>
        <source>Insert &amp;date</source>
        <translation>插入日期(&amp;D)</translation>
    </message>
    <message>
        <source>Insert &amp;time</source>
        <translation>插入时间(&amp;T)</translation>
    </message>
    <message>
        <source>Insert &amp;rule</source>
        <translation>插入分隔线(&amp;R)</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>编辑</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>撤销(&amp;U)</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>重做(&amp;R)</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>剪切(&amp;T)</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>复制(&amp;C)</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>粘贴(&amp;P)</translation>
    </message>
    <message>
        <source>Select &amp;all</source>
        <translation>全选(&amp;A)</translation>
    </message>
    <message>
        <source>Select word</source>
        <translation>选中单词</translation>
    </message>
    <message>
        <source>Select line</source>
        <translation>选中行</translation>
    </message>
    <message>
        <source>Select paragraph</source>
        <translation>选中段落</translation>
    </message>
    <message>
        <source>Find selected a&amp;gain</source>
        <translation>查找下一个选中内容(&amp;G)</translation>
    </message>
    <message>
        <source>Find selected backward</source>
        <translation>查找上一个选中内容</translation>
    </message>
    <message>
        <source>Find selected word</source>
        <translation>查找选中的单词</translation>
    </message>
    <message>
        <source>Find selected, matching case</source>
        <translation>区分大小写查找选中内容</translation>
    </message>
    <message>
        <source>Go to &amp;line...</source>
        <translation>转到行(&amp;L)...</translation>
    </message>
    <message>
        <source>Go to start</source>
        <translation>转到开头</translation>
    </message>
    <message>
        <source>Go to end</source>
        <translation>转到结尾</translation>
    </message>
    <message>
        <source>Go to next paragraph</source>
        <translation>转到下一段</translation>
    </message>
    <message>
        <source>Go to previous paragraph</source>
        <translation>转到上一段</translation>
    </message>
    <message>
        <source>Delete word to the left</source>
        <translation>删除左侧单词</translation>
    </message>
    <message>
        <source>Delete word to the right</source>
        <translation>删除右侧单词</translation>
    </message>
    <message>
        <source>Delete to start of line</source>
        <translation>删除至行首</translation>
    </message>
    <message>
        <source>Delete to end of line</source>
        <translation>删除至行尾</translation>
    </message>
    <message>
        <source>To upper case</source>
        <translation>转为大写</translation>
    </message>
    <message>
        <source>To lower case</source>
        <translation>转为小写</translation>
    </message>
    <message>
        <source>Swap case</source>
        <translation>互换大小写</translation>
    </message>
    <message>
        <source>Capitalize</source>
        <translation>首字母大写</translation>
    </message>
    <message>
        <source>Move line up</source>
        <translation>上移一行</translation>
    </message>
    <message>
        <source>Move line down</source>
        <translation>下移一行</translation>
    </message>
    <message>
        <source>New line above</source>
        <translation>在上方新建行</translation>
    </message>
    <message>
        <source>New line below</source>
        <translation>在下方新建行</translation>
    </message>
    <message>
        <source>Duplicate lines</source>
        <translation>重复行</translation>
    </message>
    <message>
        <source>Join lines</source>
        <translation>合并行</translation>
    </message>
    <message>
        <source>Sort lines</source>
        <translation>排序行</translation>
    </message>
    <message>
        <source>Reverse lines</source>
        <translation>反转行序</translation>
    </message>
    <message>
        <source>Remove duplicate lines</source>
        <translation>删除重复行</translation>
    </message>
    <message>
        <source>Remove empty lines</source>
        <translation>删除空行</translation>
    </message>
    <message>
        <source>Trim lines</source>
        <translation>去除行首尾空格</translation>
    </message>
    <message>
        <source>Indent lines</source>
        <translation>缩进行</translation>
    </message>
    <message>
        <source>Unindent lines</source>
        <translation>取消缩进行</translation>
    </message>
    <message>
        <source>Comment lines</source>
        <translation>注释行</translation>
    </message>
    <message>
        <source>Uncomment lines</source>
        <translation>取消注释行</translation>
    </message>
    <message>
        <source>Tabs to spaces</source>
        <translation>制表符转为空格</translation>
    </message>
    <message>
        <source>View</source>
        <translation>视图</translation>
    </message>
    <message>
        <source>Zoom &amp;in</source>
        <translation>放大(&amp;I)</translation>
    </message>
    <message>
        <source>Zoom &amp;out</source>
        <translation>缩小(&amp;O)</translation>
    </message>
    <message>
        <source>&amp;Wrap lines</source>
        <translation>自动换行(&amp;W)</translation>
    </message>
    <message>
        <source>&amp;Fixed-width font</source>
        <translation>等宽字体(&amp;F)</translation>
    </message>
    <message>
        <source>&amp;Proportional font</source>
        <translation>比例字体(&amp;P)</translation>
    </message>
    <message>
        <source>O&amp;verwrite</source>
        <translation>覆盖(&amp;V)</translation>
    </message>
    <message>
        <source>&amp;Read only</source>
        <translation>只读(&amp;R)</translation>
    </message>
    <message>
        <source>Wide cur&amp;sor</source>
        <translation>粗光标(&amp;S)</translation>
    </message>
    <message>
        <source>&amp;Center on cursor</source>
        <translation>光标居中(&amp;C)</translation>
    </message>
    <message>
        <source>Scroll &amp;up</source>
        <translation>向上滚动(&amp;U)</translation>
    </message>
    <message>
        <source>Scroll &amp;down</source>
        <translation>向下滚动(&amp;D)</translation>
    </message>
    <message>
        <source>Scroll to &amp;top</source>
        <translation>滚动到顶部(&amp;T)</translation>
    </message>
    <message>
        <source>Scroll to botto&amp;m</source>
        <translation>滚动到底部(&amp;M)</translation>
    </message>
    <message>
        <source>Text</source>
        <translation>文本</translation>
    </message>
    <message>
        <source>Keys</source>
        <translation>按键</translation>
    </message>
    <message>
        <source>The file has %1 for %2, but %3 has it, too.</source>
        <translation>文件中 %1 用于 %2，但 %3 也使用它。</translation>
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
        <source>Save cheat sheet as te&amp;xt...</source>
        <translation>将速查表保存为文本(&amp;X)...</translation>
    </message>
    <message>
        <source>&amp;Copy cheat sheet</source>
        <translation>复制速查表(&amp;C)</translation>
    </message>
</context>
<context>
    <name>EntryWindow</name>
    <message>
        <source>Unsaved changes</source>
        <translation>未保存的更改</translation>
    </message>
    <message>
        <source>The entry %1 was changed.
Save the changes?</source>
        <translation>条目 %1 已更改。
要保存更改吗？</translation>
    </message>
</context>
<context>
    <name>FileIconsPage</name>
    <message>
        <source>File icons</source>
        <translation>文件图标</translation>
    </message>
    <message>
        <source>Models</source>
        <translation>模型</translation>
    </message>
</context>
<context>
    <name>GalleryWindow</name>
    <message>
        <source>Widget gallery</source>
        <translation>部件展示</translation>
    </message>
    <message>
        <source>Pages</source>
        <translation>页面</translation>
    </message>
    <message>
        <source>Code of this page</source>
        <translation>此页面的代码</translation>
    </message>
</context>
<context>
    <name>KeyNamesPage</name>
    <message>
        <source>&amp;Press keys:</source>
        <translation>按下按键(&amp;P)：</translation>
    </message>
    <message>
        <source>In the window manager&apos;s notation:</source>
        <translation>窗口管理器的写法：</translation>
    </message>
    <message>
        <source>Read back:</source>
        <translation>读回结果：</translation>
    </message>
    <message>
        <source>Global action with these keys:</source>
        <translation>使用这些按键的全局操作：</translation>
    </message>
    <message>
        <source>Key names</source>
        <translation>按键名称</translation>
    </message>
    <message>
        <source>Shortcuts</source>
        <translation>快捷键</translation>
    </message>
</context>
<context>
    <name>MenuPages</name>
    <message>
        <source>&amp;Pick an entry...</source>
        <translation>选取条目(&amp;P)...</translation>
    </message>
    <message>
        <source>Edit the &amp;menu...</source>
        <translation>编辑菜单(&amp;M)...</translation>
    </message>
    <message>
        <source>Edit an e&amp;ntry...</source>
        <translation>编辑条目(&amp;N)...</translation>
    </message>
    <message>
        <source>Menu tree</source>
        <translation>菜单树</translation>
    </message>
    <message>
        <source>Menus</source>
        <translation>菜单</translation>
    </message>
    <message>
        <source>Menu and entry dialogs</source>
        <translation>菜单和条目对话框</translation>
    </message>
    <message>
        <source>&amp;Assistance</source>
        <translation>辅助(&amp;A)</translation>
    </message>
</context>
<context>
    <name>RadioGroupBoxPage</name>
    <message>
        <source>&amp;Automatic configuration</source>
        <translation>自动配置(&amp;A)</translation>
    </message>
    <message>
        <source>Script address:</source>
        <translation>脚本地址：</translation>
    </message>
    <message>
        <source>Ask again at every start</source>
        <translation>每次启动时再次询问</translation>
    </message>
    <message>
        <source>&amp;Manual configuration</source>
        <translation>手动配置(&amp;M)</translation>
    </message>
    <message>
        <source>Host:</source>
        <translation>主机：</translation>
    </message>
    <message>
        <source>Port:</source>
        <translation>端口：</translation>
    </message>
    <message>
        <source>Protocol:</source>
        <translation>协议：</translation>
    </message>
    <message>
        <source>&amp;Direct connection</source>
        <translation>直接连接(&amp;D)</translation>
    </message>
    <message>
        <source>There is nothing to set.</source>
        <translation>无需任何设置。</translation>
    </message>
    <message>
        <source>Radio group boxes</source>
        <translation>单选分组框</translation>
    </message>
    <message>
        <source>Widgets</source>
        <translation>部件</translation>
    </message>
</context>
<context>
    <name>SettingsPage</name>
    <message>
        <source>Settings file</source>
        <translation>设置文件</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>设置</translation>
    </message>
    <message>
        <source>F&amp;lat buttons</source>
        <translation>扁平按钮(&amp;L)</translation>
    </message>
    <message>
        <source>S&amp;ection:</source>
        <translation>小节(&amp;E)：</translation>
    </message>
    <message>
        <source>&amp;Font:</source>
        <translation>字体(&amp;F)：</translation>
    </message>
    <message>
        <source>&amp;Size:</source>
        <translation>大小(&amp;S)：</translation>
    </message>
    <message>
        <source>Contents of the file on disk</source>
        <translation>磁盘上的文件内容</translation>
    </message>
    <message>
        <source>Name a settings file on the command line to edit it here.</source>
        <translation>在命令行上指定设置文件，即可在此处编辑。</translation>
    </message>
    <message>
        <source>%1 cannot be opened.</source>
        <translation>无法打开 %1。</translation>
    </message>
</context>
<context>
    <name>ShortcutsPage</name>
    <message>
        <source>Delete the whole line</source>
        <translation>删除整行</translation>
    </message>
    <message>
        <source>Last command: %1</source>
        <translation>上一个命令：%1</translation>
    </message>
    <message>
        <source>one line
another line
and a third one
</source>
        <translation>一行
另一行
还有第三行
</translation>
    </message>
    <message>
        <source>Go to the editor</source>
        <translation>转到编辑器</translation>
    </message>
    <message>
        <source>View</source>
        <translation>视图</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>设置</translation>
    </message>
    <message>
        <source>Configure shortcuts...</source>
        <translation>配置快捷键...</translation>
    </message>
    <message>
        <source>Shortcuts</source>
        <translation>快捷键</translation>
    </message>
    <message>
        <source>Configure shortcuts in the plain dialog...</source>
        <translation>在简单对话框中配置快捷键...</translation>
    </message>
</context>
<context>
    <name>vel-entryedit</name>
    <message>
        <source>Edits a desktop entry.</source>
        <translation>编辑桌面条目。</translation>
    </message>
    <message>
        <source>Make a new entry when there is no such file.</source>
        <translation>如果没有此文件，则新建条目。</translation>
    </message>
    <message>
        <source>Begin with the values of the entry &lt;file&gt;.</source>
        <translation>以条目 &lt;file&gt; 的值开始。</translation>
    </message>
    <message>
        <source>Show the entry only.</source>
        <translation>仅显示条目。</translation>
    </message>
    <message>
        <source>The entry to edit.</source>
        <translation>要编辑的条目。</translation>
    </message>
    <message>
        <source>one file has to be named</source>
        <translation>必须指定一个文件</translation>
    </message>
    <message>
        <source>cannot open %1</source>
        <translation>无法打开 %1</translation>
    </message>
    <message>
        <source>cannot open %1: there is no such file, --create makes a new entry</source>
        <translation>无法打开 %1：没有此文件，--create 可新建条目</translation>
    </message>
    <message>
        <source>cannot open %1: it is no regular file</source>
        <translation>无法打开 %1：它不是常规文件</translation>
    </message>
    <message>
        <source>cannot open %1: %2</source>
        <translation>无法打开 %1：%2</translation>
    </message>
</context>
<context>
    <name>vel-gallery</name>
    <message>
        <source>the page %1 did not finish loading</source>
        <translation>页面 %1 未能就绪</translation>
    </message>
    <message>
        <source>cannot write %1</source>
        <translation>无法写入 %1</translation>
    </message>
    <message>
        <source>cannot make the folder %1</source>
        <translation>无法创建文件夹 %1</translation>
    </message>
    <message>
        <source>Shows the library&apos;s widgets, dialogs and models in action.</source>
        <translation>展示库中部件、对话框和模型的实际效果。</translation>
    </message>
    <message>
        <source>Start with the page &lt;name&gt;.</source>
        <translation>从页面 &lt;name&gt; 开始。</translation>
    </message>
    <message>
        <source>Write screenshots of every page, or of the page given with --page, to &lt;dir&gt; and exit.</source>
        <translation>将所有页面或 --page 指定的页面的图片写入 &lt;dir&gt; 后退出。</translation>
    </message>
    <message>
        <source>The settings file that the settings page edits.</source>
        <translation>设置页面所编辑的设置文件。</translation>
    </message>
    <message>
        <source>Widget gallery</source>
        <translation>部件展示</translation>
    </message>
    <message>
        <source>there is no page %1</source>
        <translation>没有页面 %1</translation>
    </message>
</context>
<context>
    <name>vel-menuedit</name>
    <message>
        <source>cannot create the start menu %1</source>
        <translation>无法创建开始菜单 %1</translation>
    </message>
    <message>
        <source>no such directory: %1</source>
        <translation>没有此文件夹：%1</translation>
    </message>
    <message>
        <source>not a directory: %1</source>
        <translation>不是文件夹：%1</translation>
    </message>
    <message>
        <source>cannot read the directory %1</source>
        <translation>无法读取文件夹 %1</translation>
    </message>
    <message>
        <source>Edits the start menu, or picks an entry of it.</source>
        <translation>编辑开始菜单，或从中选取条目。</translation>
    </message>
    <message>
        <source>Show the menu directory &lt;dir&gt; instead of the start menu.</source>
        <translation>显示菜单文件夹 &lt;dir&gt;，而不是开始菜单。</translation>
    </message>
    <message>
        <source>Show the desktop folder.</source>
        <translation>显示桌面文件夹。</translation>
    </message>
    <message>
        <source>Show the tool bar.</source>
        <translation>显示工具栏。</translation>
    </message>
    <message>
        <source>Look only, change nothing.</source>
        <translation>仅查看，不做任何更改。</translation>
    </message>
    <message>
        <source>Show icons of &lt;pixels&gt; pixels.</source>
        <translation>显示 &lt;pixels&gt; 像素的图标。</translation>
    </message>
    <message>
        <source>Pick an entry and print its path and its command line.</source>
        <translation>选取条目并输出其路径和命令行。</translation>
    </message>
    <message>
        <source>unexpected argument: %1</source>
        <translation>意外的参数：%1</translation>
    </message>
    <message>
        <source>only one of --dir, --desktop and --toolbar can be given</source>
        <translation>--dir、--desktop 和 --toolbar 只能指定其中之一</translation>
    </message>
    <message>
        <source>--icon-size needs a number of pixels from 1 to 512, not &quot;%1&quot;</source>
        <translation>--icon-size 需要 1 到 512 之间的像素数，而不是“%1”</translation>
    </message>
</context>
<context>
    <name>vel-menuprint</name>
    <message>
        <source>Prints a menu directory in its order.</source>
        <translation>按顺序输出菜单文件夹。</translation>
    </message>
    <message>
        <source>The menu directory; the start menu when none is given.</source>
        <translation>菜单文件夹；未指定时为开始菜单。</translation>
    </message>
    <message>
        <source>unknown format: %1</source>
        <translation>未知格式：%1</translation>
    </message>
    <message>
        <source>more than one directory</source>
        <translation>指定了多个文件夹</translation>
    </message>
    <message>
        <source>no such directory: %1</source>
        <translation>没有此文件夹：%1</translation>
    </message>
    <message>
        <source>cannot read the directory %1</source>
        <translation>无法读取文件夹 %1</translation>
    </message>
    <message>
        <source>The menu has more than %1 items or %2 levels, and the rest of it is left out. Look for links that lead into the same folders again.</source>
        <translation>该菜单超过 %1 个项目或 %2 层，其余部分已省略。请检查是否有反复指向相同文件夹的链接。</translation>
    </message>
    <message>
        <source>What to print: %1. The default is text.</source>
        <translation>要输出的内容：%1。默认为 text。</translation>
    </message>
    <message>
        <source>The icon theme to take the files of icons from; the user&apos;s own when none is given.</source>
        <translation>从中取用图标文件的图标主题；未指定时为用户自己的主题。</translation>
    </message>
    <message>
        <source>The edge of the icons in pixels, 24 by default.</source>
        <translation>图标的边长（像素），默认为 24。</translation>
    </message>
    <message>
        <source>Reads one of the lines that rofi or dmenu was given from standard input and starts its entry.</source>
        <translation>从标准输入读取曾提供给 rofi 或 dmenu 的其中一行，并启动其条目。</translation>
    </message>
    <message>
        <source>the size of icons is not between 1 and %1</source>
        <translation>图标大小不在 1 到 %1 之间</translation>
    </message>
    <message>
        <source>The start menu is empty: no application is installed.</source>
        <translation>开始菜单为空：没有安装任何应用程序。</translation>
    </message>
    <message>
        <source>The start menu %1 cannot be made: %2</source>
        <translation>无法创建开始菜单 %1：%2</translation>
    </message>
    <message>
        <source>%1 is left out, as the line end in its name cannot be written in this format. Rename it.</source>
        <translation>已省略 %1，因为其名称中的换行符无法以此格式写入。请将其重命名。</translation>
    </message>
    <message>
        <source>The start menu is empty: nothing in %1 is shown.</source>
        <translation>开始菜单为空：%1 中没有可显示的内容。</translation>
    </message>
    <message>
        <source>cannot run vel-open: %1</source>
        <translation>无法运行 vel-open：%1</translation>
    </message>
    <message>
        <source>There is no &quot;%1&quot; in the menu.</source>
        <translation>菜单中没有“%1”。</translation>
    </message>
</context>
<context>
    <name>vel-wmbridge</name>
    <message>
        <source>Owns the window manager&apos;s command channel on a desktop that has none, and runs a command of the shell for each kind of update. The variable VEL_COMMAND holds the line that came.</source>
        <translation>在没有窗口管理器命令通道的桌面上拥有该通道，并为每种更新运行一条 shell 命令。变量 VEL_COMMAND 保存收到的行。</translation>
    </message>
    <message>
        <source>Run when the start menu has changed.</source>
        <translation>开始菜单更改时运行。</translation>
    </message>
    <message>
        <source>Run when the tool bar has changed.</source>
        <translation>工具栏更改时运行。</translation>
    </message>
    <message>
        <source>Run when the desktop&apos;s entries have changed.</source>
        <translation>桌面的条目更改时运行。</translation>
    </message>
    <message>
        <source>Run for every other line.</source>
        <translation>对其他任何行运行。</translation>
    </message>
    <message>
        <source>Take the channel from the program that has it.</source>
        <translation>从占用通道的程序处接管通道。</translation>
    </message>
    <message>
        <source>unexpected argument: %1</source>
        <translation>意外的参数：%1</translation>
    </message>
    <message>
        <source>cannot run the command for %1</source>
        <translation>无法运行 %1 的命令</translation>
    </message>
    <message>
        <source>another program has taken the channel</source>
        <translation>另一个程序已接管通道</translation>
    </message>
    <message>
        <source>cannot take the channel: there is no display, or another program has it</source>
        <translation>无法接管通道：没有显示器，或另一个程序正占用它</translation>
    </message>
    <message>
        <source>unknown window manager: %1 (known are %2)</source>
        <translation>未知的窗口管理器：%1（已知的有 %2）</translation>
    </message>
    <message>
        <source>Do what this window manager needs to show the start menu as it is: %1.</source>
        <translation>执行此窗口管理器所需的操作，使其按现状显示开始菜单：%1。</translation>
    </message>
</context>
</TS>
