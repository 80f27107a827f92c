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
    <name>EntryCheck</name>
    <message>
        <source>The condition &apos;%1&apos; needs a file.</source>
        <translation>条件“%1”需要一个文件。</translation>
    </message>
    <message>
        <source>The file of the condition &apos;%1&apos; is one in the folder of settings, without &apos;/&apos; before it.</source>
        <translation>条件“%1”的文件位于设置文件夹中，前面不带“/”。</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs a key.</source>
        <translation>条件“%1”需要一个键。</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs &apos;if-session&apos; or &apos;unless-session&apos; and a session.</source>
        <translation>条件“%1”需要“if-session”或“unless-session”以及一个会话。</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs a schema and a key.</source>
        <translation>条件“%1”需要一个架构和一个键。</translation>
    </message>
    <message>
        <source>There is no condition &apos;%1&apos;.</source>
        <translation>没有条件“%1”。</translation>
    </message>
    <message>
        <source>A category is empty.</source>
        <translation>有一个类别为空。</translation>
    </message>
    <message>
        <source>There is no registered category &apos;%1&apos;; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>没有已注册的类别“%1”；自定义类别必须以“X-”开头。</translation>
    </message>
    <message>
        <source>Change it to &apos;%1&apos;</source>
        <translation>更改为“%1”</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; also needs: %2.</source>
        <translation>类别“%1”还需要：%2。</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; goes with one of these: %2.</source>
        <translation>类别“%1”须与以下之一搭配：%2。</translation>
    </message>
    <message>
        <source>Add &apos;%1&apos;</source>
        <translation>添加“%1”</translation>
    </message>
    <message>
        <source>Remove it</source>
        <translation>移除</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; is out of use.</source>
        <translation>类别“%1”已不再使用。</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; is only for entries that list desktops in &apos;Only show in&apos;.</source>
        <translation>类别“%1”只用于在“仅显示于”中列出了桌面的条目。</translation>
    </message>
    <message>
        <source>No main category is among them, so menus may not know where to show the entry.</source>
        <translation>其中没有主类别，菜单可能不知道在何处显示该条目。</translation>
    </message>
    <message>
        <source>Several main categories are among them, so the entry may be shown more than once.</source>
        <translation>其中有多个主类别，该条目可能会显示多次。</translation>
    </message>
    <message>
        <source>&apos;%1&apos; stands more than once.</source>
        <translation>“%1”出现了不止一次。</translation>
    </message>
    <message>
        <source>Keep the first</source>
        <translation>保留第一个</translation>
    </message>
    <message>
        <source>The application has no command.</source>
        <translation>该应用程序没有命令。</translation>
    </message>
    <message>
        <source>The link leads nowhere.</source>
        <translation>该链接没有指向任何位置。</translation>
    </message>
    <message>
        <source>A quote is not closed.</source>
        <translation>有引号未闭合。</translation>
    </message>
    <message>
        <source>In quotes, a backslash has to stand before &apos;%1&apos;.</source>
        <translation>在引号内，“%1”前面必须有反斜杠。</translation>
    </message>
    <message>
        <source>The command ends in a single backslash, which stands for nothing.</source>
        <translation>命令以单个反斜杠结尾，它不表示任何内容。</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has to stand in double quotes.</source>
        <translation>“%1”必须放在双引号中。</translation>
    </message>
    <message>
        <source>Close the quote</source>
        <translation>闭合引号</translation>
    </message>
    <message>
        <source>Put it in quotes</source>
        <translation>加上引号</translation>
    </message>
    <message>
        <source>Have a shell run it</source>
        <translation>交给 shell 运行</translation>
    </message>
    <message>
        <source>Write &apos;%&apos; as &apos;%%&apos;</source>
        <translation>将“%”写成“%%”</translation>
    </message>
    <message>
        <source>A field code is not complete: &apos;%&apos; ends the command.</source>
        <translation>字段代码不完整：命令以“%”结尾。</translation>
    </message>
    <message>
        <source>There is no field code &apos;%%1&apos;.</source>
        <translation>没有字段代码“%%1”。</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; is out of use; nothing is put in its place.</source>
        <translation>字段代码“%%1”已不再使用；它不会被替换为任何内容。</translation>
    </message>
    <message>
        <source>Only one of &apos;%f&apos;, &apos;%F&apos;, &apos;%u&apos; and &apos;%U&apos; may stand in a command, and once.</source>
        <translation>命令中只能有“%f”、“%F”、“%u”和“%U”之一，且只能出现一次。</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; stands more than once.</source>
        <translation>字段代码“%%1”出现了不止一次。</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; has to be an argument of its own, not in quotes.</source>
        <translation>字段代码“%%1”必须是单独的参数，且不能放在引号中。</translation>
    </message>
    <message>
        <source>The path of the program has a blank: it has to stand in quotes.</source>
        <translation>程序路径中有空格：必须加上引号。</translation>
    </message>
    <message>
        <source>There is no program &apos;%1&apos;.</source>
        <translation>没有程序“%1”。</translation>
    </message>
    <message>
        <source>The command has to begin with a program.</source>
        <translation>命令必须以程序开头。</translation>
    </message>
    <message>
        <source>&apos;Try exec&apos; takes the program alone, without quotes and arguments.</source>
        <translation>“检测命令”只能填写程序本身，不带引号和参数。</translation>
    </message>
    <message>
        <source>Keep the program</source>
        <translation>只保留程序</translation>
    </message>
    <message>
        <source>There is no program &apos;%1&apos;, so the entry is not shown.</source>
        <translation>没有程序“%1”，因此不显示该条目。</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is missing.</source>
        <translation>缺少“%1”。</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has translations only, and nothing for all other languages.</source>
        <translation>“%1”只有译文，没有供所有其他语言使用的内容。</translation>
    </message>
    <message>
        <source>Take &apos;%1&apos;</source>
        <translation>使用“%1”</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is only for entries of the type &apos;%2&apos;.</source>
        <translation>“%1”只用于类型为“%2”的条目。</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is out of use here.</source>
        <translation>“%1”在此处已不再使用。</translation>
    </message>
    <message>
        <source>No key can be called &apos;%1&apos;.</source>
        <translation>键不能命名为“%1”。</translation>
    </message>
    <message>
        <source>There is no key &apos;%1&apos; here; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>此处没有键“%1”；自定义键必须以“X-”开头。</translation>
    </message>
    <message>
        <source>&apos;%1&apos; cannot be translated.</source>
        <translation>“%1”不能翻译。</translation>
    </message>
    <message>
        <source>&apos;Only show in&apos; and &apos;Not show in&apos; exclude each other.</source>
        <translation>“仅显示于”和“不显示于”不能同时使用。</translation>
    </message>
    <message>
        <source>The file is empty.</source>
        <translation>文件为空。</translation>
    </message>
    <message>
        <source>The first group of the file is not &apos;[Desktop Entry]&apos;.</source>
        <translation>文件的第一个组不是“[Desktop Entry]”。</translation>
    </message>
    <message>
        <source>The name of the file has to end in &apos;.%1&apos;.</source>
        <translation>文件名必须以“.%1”结尾。</translation>
    </message>
    <message>
        <source>Lines of the file end in a carriage return.</source>
        <translation>文件中的行以回车符结尾。</translation>
    </message>
    <message>
        <source>A line of the file says nothing: %1</source>
        <translation>文件中有一行没有意义：%1</translation>
    </message>
    <message>
        <source>A line of the file stands before all groups: %1</source>
        <translation>文件中有一行位于所有组之前：%1</translation>
    </message>
    <message>
        <source>A line of the file begins with a blank: %1</source>
        <translation>文件中有一行以空格开头：%1</translation>
    </message>
    <message>
        <source>A blank stands behind a group: %1</source>
        <translation>组后面有一个空格：%1</translation>
    </message>
    <message>
        <source>The group &apos;%1&apos; stands more than once.</source>
        <translation>组“%1”出现了不止一次。</translation>
    </message>
    <message>
        <source>No group can be called &apos;%1&apos;.</source>
        <translation>组不能命名为“%1”。</translation>
    </message>
    <message>
        <source>The group &apos;%1&apos; is out of use.</source>
        <translation>组“%1”已不再使用。</translation>
    </message>
    <message>
        <source>There is no group &apos;%1&apos;; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>没有组“%1”；自定义组必须以“X-”开头。</translation>
    </message>
    <message>
        <source>The id &apos;%1&apos; of an action may only have letters A to Z, digits and &apos;-&apos;.</source>
        <translation>操作的标识“%1”只能包含字母 A 到 Z、数字和“-”。</translation>
    </message>
    <message>
        <source>The action &apos;%1&apos; is described, but &apos;Actions&apos; does not name it.</source>
        <translation>操作“%1”有说明，但“Actions”中没有列出它。</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: it has no &apos;/&apos;.</source>
        <translation>“%1”不是 MIME 类型：其中没有“/”。</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: nothing stands behind the &apos;/&apos;.</source>
        <translation>“%1”不是 MIME 类型：“/”后面没有内容。</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: there is no kind &apos;%2&apos;.</source>
        <translation>“%1”不是 MIME 类型：没有“%2”这一种类。</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: it has a character that none has.</source>
        <translation>“%1”不是 MIME 类型：其中有不允许使用的字符。</translation>
    </message>
    <message>
        <source>MIME types like &apos;%1&apos; are not used for files.</source>
        <translation>“%1”这样的 MIME 类型不用于文件。</translation>
    </message>
    <message>
        <source>This computer does not know the MIME type &apos;%1&apos;.</source>
        <translation>这台计算机上没有 MIME 类型“%1”。</translation>
    </message>
    <message>
        <source>An action has no id.</source>
        <translation>有一个操作没有标识。</translation>
    </message>
    <message>
        <source>Nothing says what the action &apos;%1&apos; is.</source>
        <translation>没有任何内容说明操作“%1”是什么。</translation>
    </message>
    <message>
        <source>There is no registered desktop &apos;%1&apos;; others have to begin with &apos;X-&apos;.</source>
        <translation>没有已注册的桌面“%1”；其他桌面必须以“X-”开头。</translation>
    </message>
    <message>
        <source>In your language the entry is shown as &apos;%1&apos;.</source>
        <translation>在您的语言中，该条目显示为“%1”。</translation>
    </message>
    <message>
        <source>The comment says no more than the name.</source>
        <translation>注释没有提供名称以外的信息。</translation>
    </message>
    <message>
        <source>The comment says no more than the generic name.</source>
        <translation>注释没有提供通用名称以外的信息。</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is out of use here; it has to be &apos;true&apos; or &apos;false&apos;.</source>
        <translation>“%1”在此处已不再使用；必须是“true”或“false”。</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has to be &apos;true&apos; or &apos;false&apos;.</source>
        <translation>“%1”必须是“true”或“false”。</translation>
    </message>
    <message>
        <source>Change it to &apos;true&apos;</source>
        <translation>更改为“true”</translation>
    </message>
    <message>
        <source>The name of an icon has no suffix like &apos;%1&apos;.</source>
        <translation>图标名称不带“%1”这样的后缀。</translation>
    </message>
    <message>
        <source>Remove the suffix</source>
        <translation>移除后缀</translation>
    </message>
    <message>
        <source>No icon theme has an icon &apos;%1&apos;.</source>
        <translation>没有任何图标主题包含图标“%1”。</translation>
    </message>
    <message>
        <source>Write the folder in full</source>
        <translation>写出完整的文件夹路径</translation>
    </message>
    <message>
        <source>The address does not say how to reach it, as &apos;https:&apos; and &apos;file:&apos; do.</source>
        <translation>该地址没有像“https:”和“file:”那样说明如何访问它。</translation>
    </message>
    <message>
        <source>The text is not encoded in UTF-8.</source>
        <translation>文本未以 UTF-8 编码。</translation>
    </message>
    <message>
        <source>A control character or tab may not stand here.</source>
        <translation>此处不能有控制字符或制表符。</translation>
    </message>
    <message>
        <source>The type has to be &apos;Application&apos;, &apos;Link&apos; or &apos;Directory&apos;, not &apos;%1&apos;.</source>
        <translation>类型必须是“Application”、“Link”或“Directory”，而不是“%1”。</translation>
    </message>
    <message>
        <source>There is no version &apos;%1&apos; of the standard.</source>
        <translation>该标准没有“%1”版。</translation>
    </message>
    <message>
        <source>There is no encoding &apos;%1&apos;.</source>
        <translation>没有编码“%1”。</translation>
    </message>
    <message>
        <source>There is no picture &apos;%1&apos;.</source>
        <translation>没有图片“%1”。</translation>
    </message>
    <message>
        <source>An icon has a name or a path that begins with &apos;/&apos;.</source>
        <translation>图标应为名称，或以“/”开头的路径。</translation>
    </message>
    <message>
        <source>The path of a folder begins with &apos;/&apos;.</source>
        <translation>文件夹的路径应以“/”开头。</translation>
    </message>
    <message>
        <source>There is no folder &apos;%1&apos;.</source>
        <translation>没有文件夹“%1”。</translation>
    </message>
    <message>
        <source>There is no file &apos;%1&apos;.</source>
        <translation>没有文件“%1”。</translation>
    </message>
    <message>
        <source>D-Bus cannot start &apos;%1&apos;: a file of a name like &apos;org.example.Program.desktop&apos; is needed.</source>
        <translation>D-Bus 无法启动“%1”：需要名称类似“org.example.Program.desktop”的文件。</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no name of an interface; such names are like &apos;org.example.Viewer&apos;.</source>
        <translation>“%1”不是接口名称；接口名称形如“org.example.Viewer”。</translation>
    </message>
</context>
<context>
    <name>EntryTrial</name>
    <message>
        <source>The entry could not be written to a temporary file.</source>
        <translation>无法将条目写入临时文件。</translation>
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
    <name>KeyDescription</name>
    <message>
        <source>Whether the entry starts a program, opens an address or describes a folder of the menu.</source>
        <translation>条目是启动程序、打开地址，还是描述菜单中的文件夹。</translation>
    </message>
    <message>
        <source>The name that menus show.</source>
        <translation>菜单中显示的名称。</translation>
    </message>
    <message>
        <source>The icon that menus show: a name from the icon theme, or the full path of a picture.</source>
        <translation>菜单中显示的图标：图标主题中的名称，或图片的完整路径。</translation>
    </message>
    <message>
        <source>The command that starts the program, with codes such as %f for the files that it opens.</source>
        <translation>启动程序的命令，可包含代码，例如用 %f 表示要打开的文件。</translation>
    </message>
    <message>
        <source>Whether the program needs a terminal window.</source>
        <translation>程序是否需要终端窗口。</translation>
    </message>
    <message>
        <source>The folder in which the program starts.</source>
        <translation>启动程序时所在的文件夹。</translation>
    </message>
    <message>
        <source>A program that has to be installed; without it menus leave the entry out.</source>
        <translation>必须已安装的程序；如果没有安装，菜单会省略该条目。</translation>
    </message>
    <message>
        <source>The address that the entry opens.</source>
        <translation>条目所打开的地址。</translation>
    </message>
    <message>
        <source>What kind of program it is, such as: Web browser.</source>
        <translation>程序的种类，例如：网页浏览器。</translation>
    </message>
    <message>
        <source>A sentence about the program, which menus show as a tip.</source>
        <translation>关于程序的一句话，菜单将其显示为提示。</translation>
    </message>
    <message>
        <source>Whether menus leave the entry out although the program can be used.</source>
        <translation>即使程序可以使用，菜单是否仍省略该条目。</translation>
    </message>
    <message>
        <source>Whether the entry counts as deleted.</source>
        <translation>是否将条目视为已删除。</translation>
    </message>
    <message>
        <source>The desktop environments that alone show the entry; none means all.</source>
        <translation>只在这些桌面环境中显示该条目；留空表示全部。</translation>
    </message>
    <message>
        <source>The desktop environments that do not show the entry.</source>
        <translation>不显示该条目的桌面环境。</translation>
    </message>
    <message>
        <source>The types of files that the program opens.</source>
        <translation>程序可以打开的文件类型。</translation>
    </message>
    <message>
        <source>The groups of the menu that the program belongs to.</source>
        <translation>程序在菜单中所属的组。</translation>
    </message>
    <message>
        <source>Words by which a search finds the program beside its name.</source>
        <translation>除名称以外，可用来搜索到该程序的词语。</translation>
    </message>
    <message>
        <source>Whether the program tells when it has started, so that the pointer shows it until then.</source>
        <translation>程序是否会通知启动完成，以便在此之前由指针显示启动状态。</translation>
    </message>
    <message>
        <source>The class of the window by which the desktop knows that the program has started.</source>
        <translation>窗口的类，桌面据此得知程序已经启动。</translation>
    </message>
    <message>
        <source>Further things that the program can be started for, such as: New window.</source>
        <translation>程序启动后可做的其他事情，例如：新建窗口。</translation>
    </message>
    <message>
        <source>The version of the standard for entries that this one follows.</source>
        <translation>此条目遵循的条目标准的版本。</translation>
    </message>
    <message>
        <source>%1 Only for users of one language.</source>
        <comment>%1 is a sentence about a key</comment>
        <translation>%1 仅适用于使用某一种语言的用户。</translation>
    </message>
</context>
<context>
    <name>LanguageNote</name>
    <message>
        <source>Users of %1 see these texts.</source>
        <translation>使用 %1 的用户会看到这些文本。</translation>
    </message>
    <message>
        <source>Users of %1 see these texts, and those of %2 where one is missing.</source>
        <translation>使用 %1 的用户会看到这些文本，缺少的则显示 %2 的文本。</translation>
    </message>
    <message>
        <source>Users of %1 see these texts, and those without a language where one is missing.</source>
        <translation>使用 %1 的用户会看到这些文本，缺少的则显示未指定语言的文本。</translation>
    </message>
    <message>
        <source>Users of %1 see the texts of %2.</source>
        <translation>使用 %1 的用户会看到 %2 的文本。</translation>
    </message>
    <message>
        <source>Users of %1 see the texts without a language.</source>
        <translation>使用 %1 的用户会看到未指定语言的文本。</translation>
    </message>
    <message>
        <source>%1 Texts of their own have: %2.</source>
        <comment>%1 is a sentence, %2 a list of languages</comment>
        <translation>%1 有自己文本的语言：%2。</translation>
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
    <message numerus="yes">
        <source>The deletion was canceled. %n items are still there, in whole or in part.</source>
        <translation>
            <numerusform>已取消删除。%n 个项目全部或部分仍然存在。</numerusform>
        </translation>
    </message>
    <message>
        <source>The deletion was canceled. Still there, in whole or in part: %1.</source>
        <translation>已取消删除。全部或部分仍然存在：%1。</translation>
    </message>
</context>
<context>
    <name>MenuDrop</name>
    <message>
        <source>The folder &apos;%1&apos; already has &apos;%2&apos;. Keep both gives the new one another file name, Replace puts the old one into the trash, Skip leaves the new one where it is; Cancel leaves everything as it is.</source>
        <translation>文件夹“%1”中已有“%2”。“两者都保留”会给新的项目另取一个文件名，“替换”会将旧的项目移到回收站，“跳过”会将新的项目留在原处；“取消”则使一切保持不变。</translation>
    </message>
    <message>
        <source>The folder &apos;%1&apos; already has &apos;%2&apos;, which the new one comes from. Keep both gives the new one another file name, Skip leaves it where it is; Cancel leaves everything as it is.</source>
        <translation>文件夹“%1”中已有“%2”，而新的项目正是源自它。“两者都保留”会给新的项目另取一个文件名，“跳过”会将它留在原处；“取消”则使一切保持不变。</translation>
    </message>
    <message>
        <source>Another one that comes to the folder &apos;%1&apos; has the same file name as &apos;%2&apos;. Keep both gives this one another file name, Skip leaves it where it is; Cancel leaves everything as it is.</source>
        <translation>要放入文件夹“%1”的另一个项目与“%2”文件名相同。“两者都保留”会给此项目另取一个文件名，“跳过”会将它留在原处；“取消”则使一切保持不变。</translation>
    </message>
    <message>
        <source>Name already taken</source>
        <translation>名称已被占用</translation>
    </message>
    <message>
        <source>&amp;Keep both</source>
        <translation>两者都保留(&amp;K)</translation>
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
    <message numerus="yes">
        <source>Undo deletion of %1 items (%n entries)</source>
        <translation>
            <numerusform>撤销删除 %1 个项目（%n 个条目）</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of %1 items (%n entries)</source>
        <translation>
            <numerusform>重做删除 %1 个项目（%n 个条目）</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%1 items were deleted (%n entries).</source>
        <translation>
            <numerusform>已删除 %1 个项目（%n 个条目）。</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo reordering of %n items</source>
        <translation>
            <numerusform>撤销重新排列 %n 个项目</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo reordering of %n items</source>
        <translation>
            <numerusform>重做重新排列 %n 个项目</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items have other places.</source>
        <translation>
            <numerusform>%n 个项目的位置已改变。</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo hiding of %n items</source>
        <translation>
            <numerusform>撤销隐藏 %n 个项目</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo hiding of %n items</source>
        <translation>
            <numerusform>重做隐藏 %n 个项目</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items are hidden: the menu no longer shows them.</source>
        <translation>
            <numerusform>%n 个项目已隐藏：菜单不再显示它们。</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo showing %n items again</source>
        <translation>
            <numerusform>撤销重新显示 %n 个项目</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo showing %n items again</source>
        <translation>
            <numerusform>重做重新显示 %n 个项目</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The menu shows %n items again.</source>
        <translation>
            <numerusform>菜单重新显示 %n 个项目。</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo sorting of folder %1</source>
        <translation>撤销排序文件夹 %1</translation>
    </message>
    <message>
        <source>Redo sorting of folder %1</source>
        <translation>重做排序文件夹 %1</translation>
    </message>
    <message>
        <source>The folder %1 was sorted by name.</source>
        <translation>已按名称排序文件夹 %1。</translation>
    </message>
    <message>
        <source>Undo duplication of %1</source>
        <translation>撤销创建 %1 的副本</translation>
    </message>
    <message>
        <source>Redo duplication of %1</source>
        <translation>重做创建 %1 的副本</translation>
    </message>
    <message>
        <source>%1 was duplicated. The copy is selected.</source>
        <translation>已创建 %1 的副本。副本已被选中。</translation>
    </message>
    <message numerus="yes">
        <source>Undo duplication of %n items</source>
        <translation>
            <numerusform>撤销创建 %n 个项目的副本</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo duplication of %n items</source>
        <translation>
            <numerusform>重做创建 %n 个项目的副本</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were duplicated. The copies are selected.</source>
        <translation>
            <numerusform>已创建 %n 个项目的副本。这些副本已被选中。</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo deletion of %1 items (1 entry)</source>
        <translation>撤销删除 %1 个项目（1 个条目）</translation>
    </message>
    <message>
        <source>Redo deletion of %1 items (1 entry)</source>
        <translation>重做删除 %1 个项目（1 个条目）</translation>
    </message>
    <message>
        <source>%1 items were deleted (1 entry).</source>
        <translation>已删除 %1 个项目（1 个条目）。</translation>
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
    <message>
        <source>Can&apos;t link %1: %2</source>
        <translation>无法创建指向 %1 的链接：%2</translation>
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
    <message>
        <source>The file %1 is not a desktop entry: it has no group [Desktop Entry].</source>
        <translation>文件 %1 不是桌面条目：其中没有 [Desktop Entry] 组。</translation>
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
        <source>This menu is empty. Press %1 for a new entry, or right-click here for what else can be added.</source>
        <translation>此菜单为空。按 %1 新建条目，或在此处单击右键查看还可以添加什么。</translation>
    </message>
    <message>
        <source>the program %1 ended with an error</source>
        <translation>程序 %1 因错误而结束</translation>
    </message>
    <message>
        <source>the program %1 cannot be run</source>
        <translation>无法运行程序 %1</translation>
    </message>
    <message numerus="yes">
        <source>And %n more.</source>
        <translation>
            <numerusform>还有 %n 项。</numerusform>
        </translation>
    </message>
    <message>
        <source>Open containin&amp;g folder</source>
        <translation>打开所在文件夹(&amp;G)</translation>
    </message>
    <message>
        <source>The folder %1 was not opened: %2.</source>
        <translation>未能打开文件夹 %1：%2。</translation>
    </message>
    <message>
        <source>New &amp;folder</source>
        <translation>新建文件夹(&amp;F)</translation>
    </message>
    <message>
        <source>New entr&amp;y</source>
        <translation>新建条目(&amp;Y)</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>编辑(&amp;E)</translation>
    </message>
    <message>
        <source>&amp;Delete</source>
        <translation>删除(&amp;D)</translation>
    </message>
    <message>
        <source>E&amp;xecute</source>
        <translation>执行(&amp;X)</translation>
    </message>
    <message>
        <source>F&amp;ind</source>
        <translation>查找(&amp;I)</translation>
    </message>
    <message>
        <source>Find &amp;Next</source>
        <translation>查找下一个(&amp;N)</translation>
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
        <source>Default &amp;menu...</source>
        <translation>默认菜单(&amp;M)...</translation>
    </message>
    <message>
        <source>&amp;Up</source>
        <translation>上移(&amp;U)</translation>
    </message>
    <message>
        <source>D&amp;own</source>
        <translation>下移(&amp;O)</translation>
    </message>
    <message>
        <source>Dup&amp;licate</source>
        <translation>创建副本(&amp;L)</translation>
    </message>
    <message>
        <source>&amp;Hide</source>
        <translation>隐藏(&amp;H)</translation>
    </message>
    <message>
        <source>Sho&amp;w again</source>
        <translation>重新显示(&amp;W)</translation>
    </message>
    <message>
        <source>&amp;Reload</source>
        <translation>重新载入(&amp;R)</translation>
    </message>
    <message>
        <source>&amp;Sort by name</source>
        <translation>按名称排序(&amp;S)</translation>
    </message>
    <message>
        <source>The folder %1 is sorted by name already.</source>
        <translation>文件夹 %1 已按名称排序。</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1, because no application is installed. The menu was left as it is.</source>
        <translation>无法在 %1 中生成默认菜单，因为没有安装任何应用程序。菜单保持原样。</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1: %2. The menu was left as it is.</source>
        <translation>无法在 %1 中生成默认菜单：%2。菜单保持原样。</translation>
    </message>
    <message>
        <source>%1 is no file on this computer. Nothing was moved or copied.</source>
        <translation>%1 不是这台计算机上的文件。未移动或复制任何内容。</translation>
    </message>
    <message>
        <source>%1 was not started: %2.</source>
        <translation>未启动 %1：%2。</translation>
    </message>
    <message>
        <source>This menu is empty. Right-click here and choose &apos;%2&apos; to fill it with the applications that are installed, or press %1 for a new entry.</source>
        <translation>此菜单为空。在此处单击右键并选择“%2”，用已安装的应用程序填充菜单，或按 %1 新建条目。</translation>
    </message>
    <message>
        <source>This menu is empty, because no application was found that is installed. Once there is one, right-click here and choose &apos;%2&apos;. Until then, press %1 for an entry of your own.</source>
        <translation>此菜单为空，因为没有找到已安装的应用程序。安装之后，请在此处单击右键并选择“%2”。在此之前，可以按 %1 新建自己的条目。</translation>
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
    <name>VelUI::CategoryChooser</name>
    <message>
        <source>Main category</source>
        <translation>主类别</translation>
    </message>
    <message>
        <source>Goes with %1</source>
        <translation>与 %1 搭配使用</translation>
    </message>
    <message>
        <source>Only beside &quot;Only show in&quot;</source>
        <translation>仅与“仅显示于”同时使用</translation>
    </message>
    <message>
        <source>Deprecated</source>
        <translation>已弃用</translation>
    </message>
    <message>
        <source>Extension</source>
        <comment>a category of somebody&apos;s own, X-...</comment>
        <translation>扩展</translation>
    </message>
    <message>
        <source>Not registered</source>
        <translation>未注册</translation>
    </message>
    <message>
        <source>Choose categories</source>
        <translation>选择类别</translation>
    </message>
    <message>
        <source>Name</source>
        <comment>title of a column</comment>
        <translation>名称</translation>
    </message>
    <message>
        <source>Category</source>
        <comment>title of a column</comment>
        <translation>类别</translation>
    </message>
    <message>
        <source>Remark</source>
        <comment>title of a column</comment>
        <translation>备注</translation>
    </message>
</context>
<context>
    <name>VelUI::CategoryNames</name>
    <message>
        <source>Audio and video</source>
        <translation>音频和视频</translation>
    </message>
    <message>
        <source>Audio</source>
        <translation>音频</translation>
    </message>
    <message>
        <source>Video</source>
        <translation>视频</translation>
    </message>
    <message>
        <source>Software development</source>
        <translation>软件开发</translation>
    </message>
    <message>
        <source>Education</source>
        <translation>教育</translation>
    </message>
    <message>
        <source>Games</source>
        <translation>游戏</translation>
    </message>
    <message>
        <source>Graphics</source>
        <translation>图形</translation>
    </message>
    <message>
        <source>Internet and network</source>
        <translation>互联网和网络</translation>
    </message>
    <message>
        <source>Office</source>
        <translation>办公</translation>
    </message>
    <message>
        <source>Science</source>
        <translation>科学</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>设置</translation>
    </message>
    <message>
        <source>System tools</source>
        <translation>系统工具</translation>
    </message>
    <message>
        <source>Accessories</source>
        <translation>附件</translation>
    </message>
    <message>
        <source>Build tools</source>
        <translation>构建工具</translation>
    </message>
    <message>
        <source>Debuggers</source>
        <translation>调试器</translation>
    </message>
    <message>
        <source>Development environments</source>
        <translation>开发环境</translation>
    </message>
    <message>
        <source>Designers of user interfaces</source>
        <translation>用户界面设计</translation>
    </message>
    <message>
        <source>Profilers</source>
        <translation>性能分析器</translation>
    </message>
    <message>
        <source>Revision control</source>
        <translation>版本控制</translation>
    </message>
    <message>
        <source>Translation tools</source>
        <translation>翻译工具</translation>
    </message>
    <message>
        <source>Calendars</source>
        <translation>日历</translation>
    </message>
    <message>
        <source>Address books</source>
        <translation>通讯录</translation>
    </message>
    <message>
        <source>Databases</source>
        <translation>数据库</translation>
    </message>
    <message>
        <source>Dictionaries</source>
        <translation>词典</translation>
    </message>
    <message>
        <source>Charts</source>
        <translation>图表</translation>
    </message>
    <message>
        <source>Email</source>
        <translation>电子邮件</translation>
    </message>
    <message>
        <source>Finances</source>
        <translation>财务</translation>
    </message>
    <message>
        <source>Flow charts</source>
        <translation>流程图</translation>
    </message>
    <message>
        <source>Handheld devices</source>
        <translation>手持设备</translation>
    </message>
    <message>
        <source>Project management</source>
        <translation>项目管理</translation>
    </message>
    <message>
        <source>Presentations</source>
        <translation>演示文稿</translation>
    </message>
    <message>
        <source>Spreadsheets</source>
        <translation>电子表格</translation>
    </message>
    <message>
        <source>Word processors</source>
        <translation>文字处理</translation>
    </message>
    <message>
        <source>Two-dimensional graphics</source>
        <translation>二维图形</translation>
    </message>
    <message>
        <source>Vector graphics</source>
        <translation>矢量图形</translation>
    </message>
    <message>
        <source>Raster graphics</source>
        <translation>光栅图形</translation>
    </message>
    <message>
        <source>Three-dimensional graphics</source>
        <translation>三维图形</translation>
    </message>
    <message>
        <source>Scanning</source>
        <translation>扫描</translation>
    </message>
    <message>
        <source>Text recognition</source>
        <translation>文字识别</translation>
    </message>
    <message>
        <source>Photography</source>
        <translation>摄影</translation>
    </message>
    <message>
        <source>Desktop publishing</source>
        <translation>桌面排版</translation>
    </message>
    <message>
        <source>Viewers</source>
        <translation>查看器</translation>
    </message>
    <message>
        <source>Text tools</source>
        <translation>文本工具</translation>
    </message>
    <message>
        <source>Desktop settings</source>
        <translation>桌面设置</translation>
    </message>
    <message>
        <source>Hardware settings</source>
        <translation>硬件设置</translation>
    </message>
    <message>
        <source>Printing</source>
        <translation>打印</translation>
    </message>
    <message>
        <source>Package managers</source>
        <translation>软件包管理器</translation>
    </message>
    <message>
        <source>Dial-up connections</source>
        <translation>拨号连接</translation>
    </message>
    <message>
        <source>Instant messaging</source>
        <translation>即时通讯</translation>
    </message>
    <message>
        <source>Chat</source>
        <translation>聊天</translation>
    </message>
    <message>
        <source>IRC</source>
        <translation>IRC</translation>
    </message>
    <message>
        <source>News feeds</source>
        <translation>新闻源</translation>
    </message>
    <message>
        <source>File transfer</source>
        <translation>文件传输</translation>
    </message>
    <message>
        <source>Amateur radio</source>
        <translation>业余无线电</translation>
    </message>
    <message>
        <source>Newsgroups</source>
        <translation>新闻组</translation>
    </message>
    <message>
        <source>File sharing</source>
        <translation>文件共享</translation>
    </message>
    <message>
        <source>Remote access</source>
        <translation>远程访问</translation>
    </message>
    <message>
        <source>Telephony</source>
        <translation>电话</translation>
    </message>
    <message>
        <source>Telephony tools</source>
        <translation>电话工具</translation>
    </message>
    <message>
        <source>Video conferences</source>
        <translation>视频会议</translation>
    </message>
    <message>
        <source>Web browsers</source>
        <translation>网页浏览器</translation>
    </message>
    <message>
        <source>Web development</source>
        <translation>网站开发</translation>
    </message>
    <message>
        <source>MIDI</source>
        <translation>MIDI</translation>
    </message>
    <message>
        <source>Mixers</source>
        <translation>混音器</translation>
    </message>
    <message>
        <source>Sequencers</source>
        <translation>音序器</translation>
    </message>
    <message>
        <source>Tuners</source>
        <translation>调音器</translation>
    </message>
    <message>
        <source>Television</source>
        <translation>电视</translation>
    </message>
    <message>
        <source>Audio and video editing</source>
        <translation>音频和视频编辑</translation>
    </message>
    <message>
        <source>Players</source>
        <translation>播放器</translation>
    </message>
    <message>
        <source>Recorders</source>
        <translation>录制工具</translation>
    </message>
    <message>
        <source>Disc burning</source>
        <translation>光盘刻录</translation>
    </message>
    <message>
        <source>Action games</source>
        <translation>动作游戏</translation>
    </message>
    <message>
        <source>Adventure games</source>
        <translation>冒险游戏</translation>
    </message>
    <message>
        <source>Arcade games</source>
        <translation>街机游戏</translation>
    </message>
    <message>
        <source>Board games</source>
        <translation>棋盘游戏</translation>
    </message>
    <message>
        <source>Falling blocks games</source>
        <translation>落块游戏</translation>
    </message>
    <message>
        <source>Card games</source>
        <translation>纸牌游戏</translation>
    </message>
    <message>
        <source>Games for children</source>
        <translation>儿童游戏</translation>
    </message>
    <message>
        <source>Logic games</source>
        <translation>益智游戏</translation>
    </message>
    <message>
        <source>Role-playing games</source>
        <translation>角色扮演游戏</translation>
    </message>
    <message>
        <source>Shooters</source>
        <translation>射击游戏</translation>
    </message>
    <message>
        <source>Simulations</source>
        <translation>模拟</translation>
    </message>
    <message>
        <source>Sports games</source>
        <translation>体育游戏</translation>
    </message>
    <message>
        <source>Strategy games</source>
        <translation>策略游戏</translation>
    </message>
    <message>
        <source>Art</source>
        <translation>艺术</translation>
    </message>
    <message>
        <source>Construction</source>
        <translation>建筑</translation>
    </message>
    <message>
        <source>Music</source>
        <translation>音乐</translation>
    </message>
    <message>
        <source>Languages</source>
        <translation>语言</translation>
    </message>
    <message>
        <source>Artificial intelligence</source>
        <translation>人工智能</translation>
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
        <translation>计算机科学</translation>
    </message>
    <message>
        <source>Data visualization</source>
        <translation>数据可视化</translation>
    </message>
    <message>
        <source>Economics</source>
        <translation>经济学</translation>
    </message>
    <message>
        <source>Electricity</source>
        <translation>电学</translation>
    </message>
    <message>
        <source>Geography</source>
        <translation>地理学</translation>
    </message>
    <message>
        <source>Geology</source>
        <translation>地质学</translation>
    </message>
    <message>
        <source>Earth sciences</source>
        <translation>地球科学</translation>
    </message>
    <message>
        <source>History</source>
        <translation>历史</translation>
    </message>
    <message>
        <source>Humanities</source>
        <translation>人文学科</translation>
    </message>
    <message>
        <source>Image processing</source>
        <translation>图像处理</translation>
    </message>
    <message>
        <source>Literature</source>
        <translation>文学</translation>
    </message>
    <message>
        <source>Maps</source>
        <translation>地图</translation>
    </message>
    <message>
        <source>Mathematics</source>
        <translation>数学</translation>
    </message>
    <message>
        <source>Numerical analysis</source>
        <translation>数值分析</translation>
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
        <translation>机器人技术</translation>
    </message>
    <message>
        <source>Spirituality</source>
        <translation>灵修</translation>
    </message>
    <message>
        <source>Sports</source>
        <translation>体育</translation>
    </message>
    <message>
        <source>Parallel computing</source>
        <translation>并行计算</translation>
    </message>
    <message>
        <source>Amusement</source>
        <translation>娱乐</translation>
    </message>
    <message>
        <source>Archiving</source>
        <translation>归档</translation>
    </message>
    <message>
        <source>Compression</source>
        <translation>压缩</translation>
    </message>
    <message>
        <source>Electronics</source>
        <translation>电子学</translation>
    </message>
    <message>
        <source>Emulators</source>
        <translation>模拟器</translation>
    </message>
    <message>
        <source>Engineering</source>
        <translation>工程</translation>
    </message>
    <message>
        <source>File tools</source>
        <translation>文件工具</translation>
    </message>
    <message>
        <source>File managers</source>
        <translation>文件管理器</translation>
    </message>
    <message>
        <source>Terminals</source>
        <translation>终端</translation>
    </message>
    <message>
        <source>File systems</source>
        <translation>文件系统</translation>
    </message>
    <message>
        <source>Monitors</source>
        <translation>系统监视器</translation>
    </message>
    <message>
        <source>Security</source>
        <translation>安全</translation>
    </message>
    <message>
        <source>Accessibility</source>
        <translation>无障碍</translation>
    </message>
    <message>
        <source>Calculators</source>
        <translation>计算器</translation>
    </message>
    <message>
        <source>Clocks</source>
        <translation>时钟</translation>
    </message>
    <message>
        <source>Text editors</source>
        <translation>文本编辑器</translation>
    </message>
    <message>
        <source>Documentation</source>
        <translation>文档</translation>
    </message>
    <message>
        <source>For adults</source>
        <translation>成人</translation>
    </message>
    <message>
        <source>Core of the desktop</source>
        <translation>桌面核心</translation>
    </message>
    <message>
        <source>Made with KDE</source>
        <translation>使用 KDE 构建</translation>
    </message>
    <message>
        <source>Made with GNOME</source>
        <translation>使用 GNOME 构建</translation>
    </message>
    <message>
        <source>Made with Xfce</source>
        <translation>使用 Xfce 构建</translation>
    </message>
    <message>
        <source>Made with GTK</source>
        <translation>使用 GTK 构建</translation>
    </message>
    <message>
        <source>Made with Qt</source>
        <translation>使用 Qt 构建</translation>
    </message>
    <message>
        <source>Made with Motif</source>
        <translation>使用 Motif 构建</translation>
    </message>
    <message>
        <source>Made with Java</source>
        <translation>使用 Java 构建</translation>
    </message>
    <message>
        <source>For the console</source>
        <translation>用于控制台</translation>
    </message>
    <message>
        <source>Screen savers</source>
        <translation>屏幕保护程序</translation>
    </message>
    <message>
        <source>Icons of the system tray</source>
        <translation>系统托盘图标</translation>
    </message>
    <message>
        <source>Applets of a panel</source>
        <translation>面板小程序</translation>
    </message>
    <message>
        <source>Desktop shells</source>
        <translation>桌面外壳</translation>
    </message>
    <message>
        <source>Applications</source>
        <translation>应用程序</translation>
    </message>
</context>
<context>
    <name>VelUI::ChoiceDialog</name>
    <message>
        <source>Filter</source>
        <translation>筛选</translation>
    </message>
    <message>
        <source>Type to filter</source>
        <translation>输入以筛选</translation>
    </message>
    <message>
        <source>Reading...</source>
        <translation>正在读取...</translation>
    </message>
    <message>
        <source>No match</source>
        <translation>没有匹配项</translation>
    </message>
    <message numerus="yes">
        <source>%n chosen</source>
        <translation>
            <numerusform>已选择 %n 项</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>VelUI::DesktopChooser</name>
    <message>
        <source>Desktop environment</source>
        <translation>桌面环境</translation>
    </message>
    <message>
        <source>Remark</source>
        <comment>title of a column</comment>
        <translation>备注</translation>
    </message>
    <message>
        <source>This session</source>
        <translation>此会话</translation>
    </message>
    <message>
        <source>Not registered</source>
        <translation>未注册</translation>
    </message>
</context>
<context>
    <name>VelUI::EditActionsDialog</name>
    <message>
        <source>An action has no id. It can have &quot;%1&quot;.</source>
        <translation>有一个操作没有标识。可以用“%1”。</translation>
    </message>
    <message>
        <source>Two actions have the id &quot;%1&quot;. The second one can have &quot;%2&quot;.</source>
        <translation>两个操作的标识都是“%1”。第二个可以用“%2”。</translation>
    </message>
    <message>
        <source>No entry can hold the id &quot;%1&quot;. It can be &quot;%2&quot;.</source>
        <translation>条目中不能使用标识“%1”。可以改为“%2”。</translation>
    </message>
    <message>
        <source>The id &quot;%1&quot; should have only A to Z, a to z, 0 to 9 and &quot;-&quot; in it, as &quot;%2&quot; has.</source>
        <translation>标识“%1”应只包含 A 到 Z、a 到 z、0 到 9 和“-”，例如“%2”。</translation>
    </message>
    <message numerus="yes">
        <source>%n more id(s) should be changed.</source>
        <translation>
            <numerusform>还有 %n 个标识应更改。</numerusform>
        </translation>
    </message>
    <message>
        <source>Use &quot;%1&quot;</source>
        <translation>使用“%1”</translation>
    </message>
    <message>
        <source>Use the proposed ids</source>
        <translation>使用建议的标识</translation>
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
    <name>VelUI::EditStringsDialog</name>
    <message>
        <source>The &quot;;&quot; in &quot;%1&quot; does not separate items, it becomes part of one item.</source>
        <translation>“%1”中的“;”不会分隔项目，它会成为项目的一部分。</translation>
    </message>
    <message numerus="yes">
        <source>Make %n item(s) of it</source>
        <translation>
            <numerusform>将其分为 %n 个项目</numerusform>
        </translation>
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
    <name>VelUI::EntryFormAssistance</name>
    <message>
        <source>Te&amp;xt</source>
        <comment>button: shows the file of the entry</comment>
        <translation>文本(&amp;X)</translation>
    </message>
    <message>
        <source>Shows the file as it would be saved</source>
        <translation>显示将要保存的文件内容</translation>
    </message>
</context>
<context>
    <name>VelUI::EntryTextDialog</name>
    <message>
        <source>Text of the entry</source>
        <translation>条目的文本</translation>
    </message>
    <message>
        <source>The file as it would be saved</source>
        <translation>将要保存的文件内容</translation>
    </message>
    <message>
        <source>Nothing is changed.</source>
        <translation>没有任何更改。</translation>
    </message>
    <message>
        <source>≠ changed lines: %1, + new lines: %2, removed lines: %3</source>
        <translation>≠ 更改的行：%1，+ 新增的行：%2，删除的行：%3</translation>
    </message>
</context>
<context>
    <name>VelUI::FieldChoosers</name>
    <message>
        <source>Choose %1</source>
        <comment>name of a &quot;Choose...&quot; button</comment>
        <translation>选择 %1</translation>
    </message>
    <message>
        <source>Choose...</source>
        <translation>选择...</translation>
    </message>
    <message>
        <source>Chooses from all that are known (Alt+Down)</source>
        <translation>从所有已知项中选择 (Alt+Down)</translation>
    </message>
    <message>
        <source>Chooses an installed program (Alt+Down)</source>
        <translation>选择已安装的程序 (Alt+Down)</translation>
    </message>
    <message>
        <source>Insert</source>
        <comment>button: a field code</comment>
        <translation>插入</translation>
    </message>
    <message>
        <source>Insert a field code</source>
        <translation>插入字段代码</translation>
    </message>
    <message>
        <source>Inserts a code that stands for the files to open, or for a part of this entry</source>
        <translation>插入一个代码，表示要打开的文件或此条目的某个部分</translation>
    </message>
</context>
<context>
    <name>VelUI::FieldCodes</name>
    <message>
        <source>%f: one file; for several files the program is started several times</source>
        <translation>%f：一个文件；有多个文件时，程序会启动多次</translation>
    </message>
    <message>
        <source>%F: all files, each as a word of its own</source>
        <translation>%F：所有文件，每个文件作为单独的词</translation>
    </message>
    <message>
        <source>%u: one address (URL) or file; for several the program is started several times</source>
        <translation>%u：一个地址 (URL) 或文件；有多个时，程序会启动多次</translation>
    </message>
    <message>
        <source>%U: all addresses (URLs) or files, each as a word of its own</source>
        <translation>%U：所有地址 (URL) 或文件，每个作为单独的词</translation>
    </message>
    <message>
        <source>%i: --icon and the icon of this entry, if it has one</source>
        <translation>%i：--icon 和此条目的图标（如果有）</translation>
    </message>
    <message>
        <source>%c: the name of this entry, translated</source>
        <translation>%c：此条目的名称（已翻译）</translation>
    </message>
    <message>
        <source>%k: where the file of this entry lies</source>
        <translation>%k：此条目的文件所在位置</translation>
    </message>
    <message>
        <source>%%: a percent sign</source>
        <translation>%%：百分号</translation>
    </message>
</context>
<context>
    <name>VelUI::FindingLine</name>
    <message>
        <source>Fix</source>
        <translation>修复</translation>
    </message>
    <message>
        <source>Fix: %1</source>
        <comment>on a button; %1 is what it does</comment>
        <translation>修复：%1</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>how bad something is, and what it is</comment>
        <translation>%1：%2</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>错误</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>警告</translation>
    </message>
    <message>
        <source>Hint</source>
        <translation>提示</translation>
    </message>
</context>
<context>
    <name>VelUI::FormFindings</name>
    <message>
        <source>%1: %2</source>
        <comment>a key or an action of an entry, and what is wrong with it</comment>
        <translation>%1：%2</translation>
    </message>
</context>
<context>
    <name>VelUI::FormHistory</name>
    <message>
        <source>Undo change of %1</source>
        <translation>撤销更改 %1</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>撤销</translation>
    </message>
    <message>
        <source>Redo change of %1</source>
        <translation>重做更改 %1</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>重做</translation>
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
    <name>VelUI::LanguageBar</name>
    <message>
        <source>&amp;Language:</source>
        <translation>语言(&amp;L)：</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>语言</translation>
    </message>
    <message>
        <source>Another language...</source>
        <translation>其他语言...</translation>
    </message>
    <message>
        <source>Another language</source>
        <translation>其他语言</translation>
    </message>
    <message>
        <source>Unknown language</source>
        <translation>未知语言</translation>
    </message>
    <message>
        <source>%1 (%2), yours: %3 of %4 texts</source>
        <translation>%1 (%2)，您的语言：%4 条文本中的 %3 条</translation>
    </message>
    <message>
        <source>%1 (%2), yours: no text yet</source>
        <translation>%1 (%2)，您的语言：尚无文本</translation>
    </message>
    <message>
        <source>%1 (%2): %3 of %4 texts</source>
        <translation>%1 (%2)：%4 条文本中的 %3 条</translation>
    </message>
    <message>
        <source>%1 (%2): no text yet</source>
        <translation>%1 (%2)：尚无文本</translation>
    </message>
</context>
<context>
    <name>VelUI::LanguageDialog</name>
    <message>
        <source>Another language</source>
        <translation>其他语言</translation>
    </message>
    <message>
        <source>&amp;Language or its code, such as pt_BR:</source>
        <translation>语言或其代码，例如 pt_BR(&amp;L)：</translation>
    </message>
    <message>
        <source>Language or its code</source>
        <translation>语言或其代码</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>a language and its code</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>No language has such a code: it is like de, pt_BR or sr@latin.</source>
        <translation>没有语言使用这样的代码：代码的形式类似 de、pt_BR 或 sr@latin。</translation>
    </message>
    <message>
        <source>The code %1 is well-formed, but no language of this name is known.</source>
        <translation>代码 %1 的格式正确，但没有已知的语言使用此名称。</translation>
    </message>
</context>
<context>
    <name>VelUI::MimeTypeChooser</name>
    <message>
        <source>Choose MIME types</source>
        <translation>选择 MIME 类型</translation>
    </message>
</context>
<context>
    <name>VelUI::MimeTypeSource</name>
    <message>
        <source>MIME type</source>
        <translation>MIME 类型</translation>
    </message>
    <message>
        <source>Description</source>
        <translation>描述</translation>
    </message>
    <message>
        <source>File names</source>
        <translation>文件名</translation>
    </message>
    <message>
        <source>Not in the database</source>
        <translation>不在数据库中</translation>
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
<context>
    <name>VelUI::ProgramChooser</name>
    <message>
        <source>Choose a program</source>
        <translation>选择程序</translation>
    </message>
</context>
<context>
    <name>VelUI::ProgramSource</name>
    <message>
        <source>Program</source>
        <comment>title of a column</comment>
        <translation>程序</translation>
    </message>
    <message>
        <source>Folder</source>
        <comment>title of a column</comment>
        <translation>文件夹</translation>
    </message>
</context>
<context>
    <name>VelUI::RowFindings</name>
    <message numerus="yes">
        <source>And %n more.</source>
        <translation>
            <numerusform>还有 %n 项。</numerusform>
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
        <translation>试运行(&amp;R)</translation>
    </message>
    <message>
        <source>Stops the trial</source>
        <translation>停止试运行</translation>
    </message>
    <message>
        <source>Runs the entry as it is now, without saving it</source>
        <translation>按当前内容运行条目，而不保存它</translation>
    </message>
    <message>
        <source>The program vel-open, which runs entries, could not be started: %1</source>
        <translation>无法启动用于运行条目的程序 vel-open：%1</translation>
    </message>
    <message>
        <source>The trial was stopped.</source>
        <translation>试运行已停止。</translation>
    </message>
    <message>
        <source>The entry was started (exit status 0).</source>
        <translation>条目已启动（退出状态 0）。</translation>
    </message>
    <message>
        <source>The entry was started (exit status 0): %1</source>
        <translation>条目已启动（退出状态 0）：%1</translation>
    </message>
    <message>
        <source>The entry could not be started (exit status %1).</source>
        <translation>无法启动条目（退出状态 %1）。</translation>
    </message>
    <message>
        <source>The entry could not be started (exit status %1): %2</source>
        <translation>无法启动条目（退出状态 %1）：%2</translation>
    </message>
</context>
</TS>
