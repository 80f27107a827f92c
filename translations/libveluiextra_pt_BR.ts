<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="pt_BR" sourcelanguage="en">
<context>
    <name>ActionListEdit</name>
    <message>
        <source>Form</source>
        <translation>Formulário</translation>
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
        <translation>Ir para</translation>
    </message>
    <message>
        <source>Go to action &apos;%1&apos;</source>
        <translation>Ir para a ação &quot;%1&quot;</translation>
    </message>
    <message>
        <source>Take over</source>
        <translation>Assumir</translation>
    </message>
    <message>
        <source>Take over &apos;%1&apos; from action &apos;%2&apos;</source>
        <translation>Assumir &quot;%1&quot; da ação &quot;%2&quot;</translation>
    </message>
    <message>
        <source>Further clashes: %1</source>
        <translation>Outros conflitos: %1</translation>
    </message>
</context>
<context>
    <name>EditActionsDialog</name>
    <message>
        <source>Actions</source>
        <translation>Ações</translation>
    </message>
</context>
<context>
    <name>EditActionsWidget</name>
    <message>
        <source>Form</source>
        <translation>Formulário</translation>
    </message>
    <message>
        <source>Add...</source>
        <translation>Adicionar...</translation>
    </message>
    <message>
        <source>Edit...</source>
        <translation>Editar...</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Excluir</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>Para cima</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>Para baixo</translation>
    </message>
</context>
<context>
    <name>EditShortcutsAssistance</name>
    <message>
        <source>Schemes</source>
        <translation>Esquemas</translation>
    </message>
    <message>
        <source>No action matches the filter.</source>
        <translation>Nenhuma ação corresponde ao filtro.</translation>
    </message>
    <message>
        <source>No action has the shortcut %1.</source>
        <translation>Nenhuma ação tem o atalho %1.</translation>
    </message>
</context>
<context>
    <name>EditShortcutsDialog</name>
    <message>
        <source>None</source>
        <translation>Nenhuma</translation>
    </message>
    <message>
        <source>Configure shortcuts</source>
        <translation>Configurar atalhos</translation>
    </message>
    <message>
        <source>Choose a key for selected action</source>
        <translation>Escolher uma tecla para a ação selecionada</translation>
    </message>
    <message>
        <source>Default key:</source>
        <translation>Tecla padrão:</translation>
    </message>
    <message>
        <source>Assign key:</source>
        <translation>Atribuir tecla:</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for global action &apos;%2&apos;.</source>
        <translation>O atalho &quot;%1&quot; já está em uso para a ação global &quot;%2&quot;.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for action &apos;%2&apos;. Please try another.</source>
        <translation>O atalho &quot;%1&quot; já está em uso para a ação &quot;%2&quot;. Tente outro.</translation>
    </message>
    <message>
        <source>Shortcuts conflict</source>
        <translation>Conflito de atalhos</translation>
    </message>
    <message>
        <source>Apply changes</source>
        <translation>Aplicar alterações</translation>
    </message>
    <message>
        <source>Some shortcuts have been changed. Do you want to apply changes?</source>
        <translation>Alguns atalhos foram alterados. Deseja aplicar as alterações?</translation>
    </message>
</context>
<context>
    <name>EditStringsDialog</name>
    <message>
        <source>Strings</source>
        <translation>Textos</translation>
    </message>
</context>
<context>
    <name>EditableListWidget</name>
    <message>
        <source>Form</source>
        <translation>Formulário</translation>
    </message>
    <message>
        <source>Add...</source>
        <translation>Adicionar...</translation>
    </message>
    <message>
        <source>Edit...</source>
        <translation>Editar...</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Excluir</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>Para cima</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>Para baixo</translation>
    </message>
</context>
<context>
    <name>EntryCheck</name>
    <message>
        <source>The condition &apos;%1&apos; needs a file.</source>
        <translation>A condição &quot;%1&quot; precisa de um arquivo.</translation>
    </message>
    <message>
        <source>The file of the condition &apos;%1&apos; is one in the folder of settings, without &apos;/&apos; before it.</source>
        <translation>O arquivo da condição &quot;%1&quot; fica na pasta de configurações e não leva &quot;/&quot; antes.</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs a key.</source>
        <translation>A condição &quot;%1&quot; precisa de uma chave.</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs &apos;if-session&apos; or &apos;unless-session&apos; and a session.</source>
        <translation>A condição &quot;%1&quot; precisa de &quot;if-session&quot; ou &quot;unless-session&quot; e de uma sessão.</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs a schema and a key.</source>
        <translation>A condição &quot;%1&quot; precisa de um esquema e de uma chave.</translation>
    </message>
    <message>
        <source>There is no condition &apos;%1&apos;.</source>
        <translation>Não existe a condição &quot;%1&quot;.</translation>
    </message>
    <message>
        <source>A category is empty.</source>
        <translation>Uma categoria está vazia.</translation>
    </message>
    <message>
        <source>There is no registered category &apos;%1&apos;; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>Não existe a categoria registrada &quot;%1&quot;; uma categoria própria deve começar com &quot;X-&quot;.</translation>
    </message>
    <message>
        <source>Change it to &apos;%1&apos;</source>
        <translation>Alterar para &quot;%1&quot;</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; also needs: %2.</source>
        <translation>A categoria &quot;%1&quot; também precisa de: %2.</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; goes with one of these: %2.</source>
        <translation>A categoria &quot;%1&quot; acompanha uma destas: %2.</translation>
    </message>
    <message>
        <source>Add &apos;%1&apos;</source>
        <translation>Adicionar &quot;%1&quot;</translation>
    </message>
    <message>
        <source>Remove it</source>
        <translation>Remover</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; is out of use.</source>
        <translation>A categoria &quot;%1&quot; caiu em desuso.</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; is only for entries that list desktops in &apos;Only show in&apos;.</source>
        <translation>A categoria &quot;%1&quot; é somente para entradas que listam ambientes em &quot;Mostrar somente em&quot;.</translation>
    </message>
    <message>
        <source>No main category is among them, so menus may not know where to show the entry.</source>
        <translation>Nenhuma delas é uma categoria principal; os menus podem não saber onde mostrar a entrada.</translation>
    </message>
    <message>
        <source>Several main categories are among them, so the entry may be shown more than once.</source>
        <translation>Várias delas são categorias principais; a entrada pode aparecer mais de uma vez.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; stands more than once.</source>
        <translation>&quot;%1&quot; aparece mais de uma vez.</translation>
    </message>
    <message>
        <source>Keep the first</source>
        <translation>Manter a primeira ocorrência</translation>
    </message>
    <message>
        <source>The application has no command.</source>
        <translation>O aplicativo não tem comando.</translation>
    </message>
    <message>
        <source>The link leads nowhere.</source>
        <translation>O link não leva a lugar nenhum.</translation>
    </message>
    <message>
        <source>A quote is not closed.</source>
        <translation>Há aspas que não foram fechadas.</translation>
    </message>
    <message>
        <source>In quotes, a backslash has to stand before &apos;%1&apos;.</source>
        <translation>Entre aspas, deve haver uma barra invertida antes de &quot;%1&quot;.</translation>
    </message>
    <message>
        <source>The command ends in a single backslash, which stands for nothing.</source>
        <translation>O comando termina com uma única barra invertida, que não representa nada.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has to stand in double quotes.</source>
        <translation>&quot;%1&quot; deve ficar entre aspas duplas.</translation>
    </message>
    <message>
        <source>Close the quote</source>
        <translation>Fechar as aspas</translation>
    </message>
    <message>
        <source>Put it in quotes</source>
        <translation>Colocar entre aspas</translation>
    </message>
    <message>
        <source>Have a shell run it</source>
        <translation>Executar por meio de um shell</translation>
    </message>
    <message>
        <source>Write &apos;%&apos; as &apos;%%&apos;</source>
        <translation>Escrever &quot;%&quot; como &quot;%%&quot;</translation>
    </message>
    <message>
        <source>A field code is not complete: &apos;%&apos; ends the command.</source>
        <translation>Um código de campo está incompleto: o comando termina com &quot;%&quot;.</translation>
    </message>
    <message>
        <source>There is no field code &apos;%%1&apos;.</source>
        <translation>Não existe o código de campo &quot;%%1&quot;.</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; is out of use; nothing is put in its place.</source>
        <translation>O código de campo &quot;%%1&quot; caiu em desuso; nada é posto em seu lugar.</translation>
    </message>
    <message>
        <source>Only one of &apos;%f&apos;, &apos;%F&apos;, &apos;%u&apos; and &apos;%U&apos; may stand in a command, and once.</source>
        <translation>Um comando só pode ter um dos códigos &quot;%f&quot;, &quot;%F&quot;, &quot;%u&quot; e &quot;%U&quot;, e uma única vez.</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; stands more than once.</source>
        <translation>O código de campo &quot;%%1&quot; aparece mais de uma vez.</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; has to be an argument of its own, not in quotes.</source>
        <translation>O código de campo &quot;%%1&quot; deve ser um argumento separado, sem aspas.</translation>
    </message>
    <message>
        <source>The path of the program has a blank: it has to stand in quotes.</source>
        <translation>O caminho do programa contém um espaço: ele deve ficar entre aspas.</translation>
    </message>
    <message>
        <source>There is no program &apos;%1&apos;.</source>
        <translation>Não existe o programa &quot;%1&quot;.</translation>
    </message>
    <message>
        <source>The command has to begin with a program.</source>
        <translation>O comando deve começar com um programa.</translation>
    </message>
    <message>
        <source>&apos;Try exec&apos; takes the program alone, without quotes and arguments.</source>
        <translation>&quot;Comando de teste&quot; aceita apenas o programa, sem aspas nem argumentos.</translation>
    </message>
    <message>
        <source>Keep the program</source>
        <translation>Manter somente o programa</translation>
    </message>
    <message>
        <source>There is no program &apos;%1&apos;, so the entry is not shown.</source>
        <translation>Não existe o programa &quot;%1&quot;; por isso, a entrada não é exibida.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is missing.</source>
        <translation>Falta &quot;%1&quot;.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has translations only, and nothing for all other languages.</source>
        <translation>&quot;%1&quot; só tem traduções e nada para todos os outros idiomas.</translation>
    </message>
    <message>
        <source>Take &apos;%1&apos;</source>
        <translation>Usar &quot;%1&quot;</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is only for entries of the type &apos;%2&apos;.</source>
        <translation>&quot;%1&quot; é somente para entradas do tipo &quot;%2&quot;.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is out of use here.</source>
        <translation>&quot;%1&quot; não é mais usado aqui.</translation>
    </message>
    <message>
        <source>No key can be called &apos;%1&apos;.</source>
        <translation>Nenhuma chave pode se chamar &quot;%1&quot;.</translation>
    </message>
    <message>
        <source>There is no key &apos;%1&apos; here; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>Não existe a chave &quot;%1&quot; aqui; uma chave própria deve começar com &quot;X-&quot;.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; cannot be translated.</source>
        <translation>&quot;%1&quot; não pode ser traduzido.</translation>
    </message>
    <message>
        <source>&apos;Only show in&apos; and &apos;Not show in&apos; exclude each other.</source>
        <translation>&quot;Mostrar somente em&quot; e &quot;Não mostrar em&quot; se excluem mutuamente.</translation>
    </message>
    <message>
        <source>The file is empty.</source>
        <translation>O arquivo está vazio.</translation>
    </message>
    <message>
        <source>The first group of the file is not &apos;[Desktop Entry]&apos;.</source>
        <translation>O primeiro grupo do arquivo não é &quot;[Desktop Entry]&quot;.</translation>
    </message>
    <message>
        <source>The name of the file has to end in &apos;.%1&apos;.</source>
        <translation>O nome do arquivo deve terminar em &quot;.%1&quot;.</translation>
    </message>
    <message>
        <source>Lines of the file end in a carriage return.</source>
        <translation>Há linhas do arquivo que terminam com um retorno de carro.</translation>
    </message>
    <message>
        <source>A line of the file says nothing: %1</source>
        <translation>Uma linha do arquivo não diz nada: %1</translation>
    </message>
    <message>
        <source>A line of the file stands before all groups: %1</source>
        <translation>Uma linha do arquivo vem antes de todos os grupos: %1</translation>
    </message>
    <message>
        <source>A line of the file begins with a blank: %1</source>
        <translation>Uma linha do arquivo começa com um espaço: %1</translation>
    </message>
    <message>
        <source>A blank stands behind a group: %1</source>
        <translation>Há um espaço depois de um grupo: %1</translation>
    </message>
    <message>
        <source>The group &apos;%1&apos; stands more than once.</source>
        <translation>O grupo &quot;%1&quot; aparece mais de uma vez.</translation>
    </message>
    <message>
        <source>No group can be called &apos;%1&apos;.</source>
        <translation>Nenhum grupo pode se chamar &quot;%1&quot;.</translation>
    </message>
    <message>
        <source>The group &apos;%1&apos; is out of use.</source>
        <translation>O grupo &quot;%1&quot; caiu em desuso.</translation>
    </message>
    <message>
        <source>There is no group &apos;%1&apos;; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>Não existe o grupo &quot;%1&quot;; um grupo próprio deve começar com &quot;X-&quot;.</translation>
    </message>
    <message>
        <source>The id &apos;%1&apos; of an action may only have letters A to Z, digits and &apos;-&apos;.</source>
        <translation>O identificador &quot;%1&quot; de uma ação só pode ter letras de A a Z, dígitos e &quot;-&quot;.</translation>
    </message>
    <message>
        <source>The action &apos;%1&apos; is described, but &apos;Actions&apos; does not name it.</source>
        <translation>A ação &quot;%1&quot; está descrita, mas não consta em &quot;Actions&quot;.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: it has no &apos;/&apos;.</source>
        <translation>&quot;%1&quot; não é um tipo MIME: falta a &quot;/&quot;.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: nothing stands behind the &apos;/&apos;.</source>
        <translation>&quot;%1&quot; não é um tipo MIME: não há nada depois da &quot;/&quot;.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: there is no kind &apos;%2&apos;.</source>
        <translation>&quot;%1&quot; não é um tipo MIME: não existe a classe &quot;%2&quot;.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: it has a character that none has.</source>
        <translation>&quot;%1&quot; não é um tipo MIME: contém um caractere que nenhum tipo tem.</translation>
    </message>
    <message>
        <source>MIME types like &apos;%1&apos; are not used for files.</source>
        <translation>Tipos MIME como &quot;%1&quot; não são usados para arquivos.</translation>
    </message>
    <message>
        <source>This computer does not know the MIME type &apos;%1&apos;.</source>
        <translation>Este computador não conhece o tipo MIME &quot;%1&quot;.</translation>
    </message>
    <message>
        <source>An action has no id.</source>
        <translation>Uma ação não tem identificador.</translation>
    </message>
    <message>
        <source>Nothing says what the action &apos;%1&apos; is.</source>
        <translation>Nada diz o que é a ação &quot;%1&quot;.</translation>
    </message>
    <message>
        <source>There is no registered desktop &apos;%1&apos;; others have to begin with &apos;X-&apos;.</source>
        <translation>Não existe o ambiente registrado &quot;%1&quot;; outros devem começar com &quot;X-&quot;.</translation>
    </message>
    <message>
        <source>In your language the entry is shown as &apos;%1&apos;.</source>
        <translation>No seu idioma, a entrada é exibida como &quot;%1&quot;.</translation>
    </message>
    <message>
        <source>The comment says no more than the name.</source>
        <translation>O comentário não diz nada além do nome.</translation>
    </message>
    <message>
        <source>The comment says no more than the generic name.</source>
        <translation>O comentário não diz nada além do nome genérico.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is out of use here; it has to be &apos;true&apos; or &apos;false&apos;.</source>
        <translation>&quot;%1&quot; não é mais usado aqui; o valor deve ser &quot;true&quot; ou &quot;false&quot;.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has to be &apos;true&apos; or &apos;false&apos;.</source>
        <translation>&quot;%1&quot; deve ser &quot;true&quot; ou &quot;false&quot;.</translation>
    </message>
    <message>
        <source>Change it to &apos;true&apos;</source>
        <translation>Alterar para &quot;true&quot;</translation>
    </message>
    <message>
        <source>The name of an icon has no suffix like &apos;%1&apos;.</source>
        <translation>O nome de um ícone não leva uma extensão como &quot;%1&quot;.</translation>
    </message>
    <message>
        <source>Remove the suffix</source>
        <translation>Remover a extensão</translation>
    </message>
    <message>
        <source>No icon theme has an icon &apos;%1&apos;.</source>
        <translation>Nenhum tema de ícones tem o ícone &quot;%1&quot;.</translation>
    </message>
    <message>
        <source>Write the folder in full</source>
        <translation>Escrever o caminho completo da pasta</translation>
    </message>
    <message>
        <source>The address does not say how to reach it, as &apos;https:&apos; and &apos;file:&apos; do.</source>
        <translation>O endereço não diz como chegar até ele, como fazem &quot;https:&quot; e &quot;file:&quot;.</translation>
    </message>
    <message>
        <source>The text is not encoded in UTF-8.</source>
        <translation>O texto não está codificado em UTF-8.</translation>
    </message>
    <message>
        <source>A control character or tab may not stand here.</source>
        <translation>Não pode haver aqui um caractere de controle ou uma tabulação.</translation>
    </message>
    <message>
        <source>The type has to be &apos;Application&apos;, &apos;Link&apos; or &apos;Directory&apos;, not &apos;%1&apos;.</source>
        <translation>O tipo deve ser &quot;Application&quot;, &quot;Link&quot; ou &quot;Directory&quot;, não &quot;%1&quot;.</translation>
    </message>
    <message>
        <source>There is no version &apos;%1&apos; of the standard.</source>
        <translation>Não existe a versão &quot;%1&quot; do padrão.</translation>
    </message>
    <message>
        <source>There is no encoding &apos;%1&apos;.</source>
        <translation>Não existe a codificação &quot;%1&quot;.</translation>
    </message>
    <message>
        <source>There is no picture &apos;%1&apos;.</source>
        <translation>Não existe a imagem &quot;%1&quot;.</translation>
    </message>
    <message>
        <source>An icon has a name or a path that begins with &apos;/&apos;.</source>
        <translation>Um ícone tem um nome ou um caminho que começa com &quot;/&quot;.</translation>
    </message>
    <message>
        <source>The path of a folder begins with &apos;/&apos;.</source>
        <translation>O caminho de uma pasta começa com &quot;/&quot;.</translation>
    </message>
    <message>
        <source>There is no folder &apos;%1&apos;.</source>
        <translation>Não existe a pasta &quot;%1&quot;.</translation>
    </message>
    <message>
        <source>There is no file &apos;%1&apos;.</source>
        <translation>Não existe o arquivo &quot;%1&quot;.</translation>
    </message>
    <message>
        <source>D-Bus cannot start &apos;%1&apos;: a file of a name like &apos;org.example.Program.desktop&apos; is needed.</source>
        <translation>O D-Bus não consegue iniciar &quot;%1&quot;: é preciso um arquivo com um nome como &quot;org.example.Program.desktop&quot;.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no name of an interface; such names are like &apos;org.example.Viewer&apos;.</source>
        <translation>&quot;%1&quot; não é o nome de uma interface; esses nomes são como &quot;org.example.Viewer&quot;.</translation>
    </message>
</context>
<context>
    <name>EntryTrial</name>
    <message>
        <source>The entry could not be written to a temporary file.</source>
        <translation>Não foi possível gravar a entrada em um arquivo temporário.</translation>
    </message>
</context>
<context>
    <name>KeyAssistance</name>
    <message>
        <source>Press the keys of the shortcut. Tab leaves the field.</source>
        <translation>Pressione as teclas do atalho. Tab sai do campo.</translation>
    </message>
    <message>
        <source>Key for action &apos;%1&apos;</source>
        <translation>Tecla para a ação &quot;%1&quot;</translation>
    </message>
    <message>
        <source>None: no key for action &apos;%1&apos;</source>
        <translation>Nenhuma: nenhum atalho para a ação &quot;%1&quot;</translation>
    </message>
    <message>
        <source>What speaks against the key for action &apos;%1&apos;</source>
        <translation>O que se opõe ao atalho da ação &quot;%1&quot;</translation>
    </message>
</context>
<context>
    <name>KeyDescription</name>
    <message>
        <source>Whether the entry starts a program, opens an address or describes a folder of the menu.</source>
        <translation>Se a entrada inicia um programa, abre um endereço ou descreve uma pasta do menu.</translation>
    </message>
    <message>
        <source>The name that menus show.</source>
        <translation>O nome que os menus mostram.</translation>
    </message>
    <message>
        <source>The icon that menus show: a name from the icon theme, or the full path of a picture.</source>
        <translation>O ícone que os menus mostram: um nome do tema de ícones ou o caminho completo de uma imagem.</translation>
    </message>
    <message>
        <source>The command that starts the program, with codes such as %f for the files that it opens.</source>
        <translation>O comando que inicia o programa, com códigos como %f para os arquivos que ele abre.</translation>
    </message>
    <message>
        <source>Whether the program needs a terminal window.</source>
        <translation>Se o programa precisa de uma janela de terminal.</translation>
    </message>
    <message>
        <source>The folder in which the program starts.</source>
        <translation>A pasta em que o programa é iniciado.</translation>
    </message>
    <message>
        <source>A program that has to be installed; without it menus leave the entry out.</source>
        <translation>Um programa que precisa estar instalado; sem ele, os menus omitem a entrada.</translation>
    </message>
    <message>
        <source>The address that the entry opens.</source>
        <translation>O endereço que a entrada abre.</translation>
    </message>
    <message>
        <source>What kind of program it is, such as: Web browser.</source>
        <translation>Que tipo de programa é, por exemplo: Navegador da Web.</translation>
    </message>
    <message>
        <source>A sentence about the program, which menus show as a tip.</source>
        <translation>Uma frase sobre o programa, que os menus mostram como dica.</translation>
    </message>
    <message>
        <source>Whether menus leave the entry out although the program can be used.</source>
        <translation>Se os menus omitem a entrada, embora o programa possa ser usado.</translation>
    </message>
    <message>
        <source>Whether the entry counts as deleted.</source>
        <translation>Se a entrada é considerada excluída.</translation>
    </message>
    <message>
        <source>The desktop environments that alone show the entry; none means all.</source>
        <translation>Os únicos ambientes de área de trabalho que mostram a entrada; nenhum significa todos.</translation>
    </message>
    <message>
        <source>The desktop environments that do not show the entry.</source>
        <translation>Os ambientes de área de trabalho que não mostram a entrada.</translation>
    </message>
    <message>
        <source>The types of files that the program opens.</source>
        <translation>Os tipos de arquivos que o programa abre.</translation>
    </message>
    <message>
        <source>The groups of the menu that the program belongs to.</source>
        <translation>Os grupos do menu a que o programa pertence.</translation>
    </message>
    <message>
        <source>Words by which a search finds the program beside its name.</source>
        <translation>Palavras pelas quais uma pesquisa encontra o programa, além do nome.</translation>
    </message>
    <message>
        <source>Whether the program tells when it has started, so that the pointer shows it until then.</source>
        <translation>Se o programa avisa quando terminou de iniciar, para que o ponteiro o indique até lá.</translation>
    </message>
    <message>
        <source>The class of the window by which the desktop knows that the program has started.</source>
        <translation>A classe da janela pela qual o ambiente reconhece que o programa foi iniciado.</translation>
    </message>
    <message>
        <source>Further things that the program can be started for, such as: New window.</source>
        <translation>Outras coisas para as quais o programa pode ser iniciado, por exemplo: Nova janela.</translation>
    </message>
    <message>
        <source>The version of the standard for entries that this one follows.</source>
        <translation>A versão do padrão de entradas que esta segue.</translation>
    </message>
    <message>
        <source>%1 Only for users of one language.</source>
        <comment>%1 is a sentence about a key</comment>
        <translation>%1 Somente para usuários de um idioma.</translation>
    </message>
</context>
<context>
    <name>LanguageNote</name>
    <message>
        <source>Users of %1 see these texts.</source>
        <translation>Os usuários de %1 veem estes textos.</translation>
    </message>
    <message>
        <source>Users of %1 see these texts, and those of %2 where one is missing.</source>
        <translation>Os usuários de %1 veem estes textos e, onde faltar algum, os de %2.</translation>
    </message>
    <message>
        <source>Users of %1 see these texts, and those without a language where one is missing.</source>
        <translation>Os usuários de %1 veem estes textos e, onde faltar algum, os sem idioma.</translation>
    </message>
    <message>
        <source>Users of %1 see the texts of %2.</source>
        <translation>Os usuários de %1 veem os textos de %2.</translation>
    </message>
    <message>
        <source>Users of %1 see the texts without a language.</source>
        <translation>Os usuários de %1 veem os textos sem idioma.</translation>
    </message>
    <message>
        <source>%1 Texts of their own have: %2.</source>
        <comment>%1 is a sentence, %2 a list of languages</comment>
        <translation>%1 Têm textos próprios: %2.</translation>
    </message>
</context>
<context>
    <name>MenuDeletion</name>
    <message>
        <source>There is no trash for %1. It would be deleted for good: this cannot be undone. Delete it?</source>
        <translation>Não há lixeira para %1. A exclusão seria definitiva e não poderia ser desfeita. Deseja excluir?</translation>
    </message>
    <message numerus="yes">
        <source>There is no trash for %n of these items. They would be deleted for good: this cannot be undone. Delete them?</source>
        <translation>
            <numerusform>Não há lixeira para %n destes itens. A exclusão seria definitiva e não poderia ser desfeita. Deseja excluir?</numerusform>
            <numerusform>Não há lixeira para %n destes itens. A exclusão seria definitiva e não poderia ser desfeita. Deseja excluir?</numerusform>
        </translation>
    </message>
    <message>
        <source>%1 cannot be deleted: %2</source>
        <translation>Não foi possível excluir %1: %2</translation>
    </message>
    <message numerus="yes">
        <source>The deletion was canceled. %n items are still there, in whole or in part.</source>
        <translation>
            <numerusform>A exclusão foi cancelada. %n item ainda existe, no todo ou em parte.</numerusform>
            <numerusform>A exclusão foi cancelada. %n itens ainda existem, no todo ou em parte.</numerusform>
        </translation>
    </message>
    <message>
        <source>The deletion was canceled. Still there, in whole or in part: %1.</source>
        <translation>A exclusão foi cancelada. Ainda existem, no todo ou em parte: %1.</translation>
    </message>
</context>
<context>
    <name>MenuDrop</name>
    <message>
        <source>The folder &apos;%1&apos; already has &apos;%2&apos;. Keep both gives the new one another file name, Replace puts the old one into the trash, Skip leaves the new one where it is; Cancel leaves everything as it is.</source>
        <translation>A pasta &quot;%1&quot; já tem &quot;%2&quot;. &quot;Manter ambos&quot; dá ao novo outro nome de arquivo, &quot;Substituir&quot; move o antigo para a lixeira, &quot;Pular&quot; deixa o novo onde está; &quot;Cancelar&quot; deixa tudo como está.</translation>
    </message>
    <message>
        <source>The folder &apos;%1&apos; already has &apos;%2&apos;, which the new one comes from. Keep both gives the new one another file name, Skip leaves it where it is; Cancel leaves everything as it is.</source>
        <translation>A pasta &quot;%1&quot; já tem &quot;%2&quot;, do qual o novo provém. &quot;Manter ambos&quot; dá ao novo outro nome de arquivo, &quot;Pular&quot; o deixa onde está; &quot;Cancelar&quot; deixa tudo como está.</translation>
    </message>
    <message>
        <source>Another one that comes to the folder &apos;%1&apos; has the same file name as &apos;%2&apos;. Keep both gives this one another file name, Skip leaves it where it is; Cancel leaves everything as it is.</source>
        <translation>Outro item que vai para a pasta &quot;%1&quot; tem o mesmo nome de arquivo que &quot;%2&quot;. &quot;Manter ambos&quot; dá a este outro nome de arquivo, &quot;Pular&quot; o deixa onde está; &quot;Cancelar&quot; deixa tudo como está.</translation>
    </message>
    <message>
        <source>Name already taken</source>
        <translation>Nome já em uso</translation>
    </message>
    <message>
        <source>&amp;Keep both</source>
        <translation>Manter &amp;ambos</translation>
    </message>
    <message>
        <source>&amp;Replace</source>
        <translation>&amp;Substituir</translation>
    </message>
    <message>
        <source>&amp;Skip</source>
        <translation>&amp;Pular</translation>
    </message>
    <message>
        <source>&amp;Do the same with all further ones</source>
        <translation>&amp;Fazer o mesmo com todos os demais</translation>
    </message>
</context>
<context>
    <name>MenuHistory</name>
    <message>
        <source>Undo</source>
        <translation>Desfazer</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Refazer</translation>
    </message>
    <message>
        <source>Done: %1</source>
        <translation>Feito: %1</translation>
    </message>
    <message>
        <source>Moving files...</source>
        <translation>Movendo arquivos...</translation>
    </message>
    <message>
        <source>Nothing was undone: %1</source>
        <translation>Nada foi desfeito: %1</translation>
    </message>
    <message>
        <source>Nothing was done again: %1</source>
        <translation>Nada foi refeito: %1</translation>
    </message>
    <message>
        <source>%1 is not there any more.</source>
        <translation>%1 não está mais lá.</translation>
    </message>
    <message>
        <source>There is another %1 by now.</source>
        <translation>Agora há outro %1.</translation>
    </message>
    <message>
        <source>%1 was changed by another program.</source>
        <translation>%1 foi alterado por outro programa.</translation>
    </message>
    <message>
        <source>%1 is not in the trash any more.</source>
        <translation>%1 não está mais na lixeira.</translation>
    </message>
    <message>
        <source>%1 cannot be put into the trash.</source>
        <translation>%1 não pode ser movido para a lixeira.</translation>
    </message>
    <message>
        <source>It was canceled.</source>
        <translation>Foi cancelado.</translation>
    </message>
    <message>
        <source>%1 cannot be changed: %2</source>
        <translation>Não foi possível alterar %1: %2</translation>
    </message>
    <message>
        <source>Undo creation of %1</source>
        <translation>Desfazer a criação de %1</translation>
    </message>
    <message>
        <source>Redo creation of %1</source>
        <translation>Refazer a criação de %1</translation>
    </message>
    <message>
        <source>%1 was created.</source>
        <translation>%1 foi criado.</translation>
    </message>
    <message>
        <source>Undo change of %1</source>
        <translation>Desfazer a alteração de %1</translation>
    </message>
    <message>
        <source>Redo change of %1</source>
        <translation>Refazer a alteração de %1</translation>
    </message>
    <message>
        <source>%1 was changed.</source>
        <translation>%1 foi alterado.</translation>
    </message>
    <message>
        <source>Undo deletion of %1</source>
        <translation>Desfazer a exclusão de %1</translation>
    </message>
    <message>
        <source>Redo deletion of %1</source>
        <translation>Refazer a exclusão de %1</translation>
    </message>
    <message>
        <source>%1 was deleted.</source>
        <translation>%1 foi excluído.</translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of folder %1 (%n entries)</source>
        <translation>
            <numerusform>Desfazer a exclusão da pasta %1 (%n entrada)</numerusform>
            <numerusform>Desfazer a exclusão da pasta %1 (%n entradas)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of folder %1 (%n entries)</source>
        <translation>
            <numerusform>Refazer a exclusão da pasta %1 (%n entrada)</numerusform>
            <numerusform>Refazer a exclusão da pasta %1 (%n entradas)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The folder %1 was deleted (%n entries).</source>
        <translation>
            <numerusform>A pasta %1 foi excluída (%n entrada).</numerusform>
            <numerusform>A pasta %1 foi excluída (%n entradas).</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of %n items</source>
        <translation>
            <numerusform>Desfazer a exclusão de %n item</numerusform>
            <numerusform>Desfazer a exclusão de %n itens</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of %n items</source>
        <translation>
            <numerusform>Refazer a exclusão de %n item</numerusform>
            <numerusform>Refazer a exclusão de %n itens</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were deleted.</source>
        <translation>
            <numerusform>%n item foi excluído.</numerusform>
            <numerusform>%n itens foram excluídos.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo moving of %1 to %2</source>
        <translation>Desfazer a movimentação de %1 para %2</translation>
    </message>
    <message>
        <source>Redo moving of %1 to %2</source>
        <translation>Refazer a movimentação de %1 para %2</translation>
    </message>
    <message>
        <source>%1 was moved to %2.</source>
        <translation>%1 foi movido para %2.</translation>
    </message>
    <message numerus="yes">
        <source>Undo moving of %n items to %2</source>
        <translation>
            <numerusform>Desfazer a movimentação de %n item para %2</numerusform>
            <numerusform>Desfazer a movimentação de %n itens para %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo moving of %n items to %2</source>
        <translation>
            <numerusform>Refazer a movimentação de %n item para %2</numerusform>
            <numerusform>Refazer a movimentação de %n itens para %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were moved to %2.</source>
        <translation>
            <numerusform>%n item foi movido para %2.</numerusform>
            <numerusform>%n itens foram movidos para %2.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo copying of %1 to %2</source>
        <translation>Desfazer a cópia de %1 para %2</translation>
    </message>
    <message>
        <source>Redo copying of %1 to %2</source>
        <translation>Refazer a cópia de %1 para %2</translation>
    </message>
    <message>
        <source>%1 was copied to %2.</source>
        <translation>%1 foi copiado para %2.</translation>
    </message>
    <message numerus="yes">
        <source>Undo copying of %n items to %2</source>
        <translation>
            <numerusform>Desfazer a cópia de %n item para %2</numerusform>
            <numerusform>Desfazer a cópia de %n itens para %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo copying of %n items to %2</source>
        <translation>
            <numerusform>Refazer a cópia de %n item para %2</numerusform>
            <numerusform>Refazer a cópia de %n itens para %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were copied to %2.</source>
        <translation>
            <numerusform>%n item foi copiado para %2.</numerusform>
            <numerusform>%n itens foram copiados para %2.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo reordering of %1</source>
        <translation>Desfazer a reordenação de %1</translation>
    </message>
    <message>
        <source>Redo reordering of %1</source>
        <translation>Refazer a reordenação de %1</translation>
    </message>
    <message>
        <source>%1 has another place.</source>
        <translation>%1 tem outro lugar.</translation>
    </message>
    <message>
        <source>Undo default menu</source>
        <translation>Desfazer o menu padrão</translation>
    </message>
    <message>
        <source>Redo default menu</source>
        <translation>Refazer o menu padrão</translation>
    </message>
    <message>
        <source>The default menu was built.</source>
        <translation>O menu padrão foi criado.</translation>
    </message>
    <message>
        <source>Undo hiding of %1</source>
        <translation>Desfazer a ocultação de %1</translation>
    </message>
    <message>
        <source>Redo hiding of %1</source>
        <translation>Refazer a ocultação de %1</translation>
    </message>
    <message>
        <source>%1 is hidden: the menu no longer shows it.</source>
        <translation>%1 está oculto: o menu não o mostra mais.</translation>
    </message>
    <message>
        <source>Undo showing %1 again</source>
        <translation>Desfazer a reexibição de %1</translation>
    </message>
    <message>
        <source>Redo showing %1 again</source>
        <translation>Refazer a reexibição de %1</translation>
    </message>
    <message>
        <source>The menu shows %1 again.</source>
        <translation>O menu mostra %1 novamente.</translation>
    </message>
    <message>
        <source>Undo deletion of folder %1 (1 entry)</source>
        <translation>Desfazer a exclusão da pasta %1 (1 entrada)</translation>
    </message>
    <message>
        <source>Redo deletion of folder %1 (1 entry)</source>
        <translation>Refazer a exclusão da pasta %1 (1 entrada)</translation>
    </message>
    <message>
        <source>The folder %1 was deleted (1 entry).</source>
        <translation>A pasta %1 foi excluída (1 entrada).</translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of %1 items (%n entries)</source>
        <translation>
            <numerusform>Desfazer a exclusão de %1 itens (%n entrada)</numerusform>
            <numerusform>Desfazer a exclusão de %1 itens (%n entradas)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of %1 items (%n entries)</source>
        <translation>
            <numerusform>Refazer a exclusão de %1 itens (%n entrada)</numerusform>
            <numerusform>Refazer a exclusão de %1 itens (%n entradas)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%1 items were deleted (%n entries).</source>
        <translation>
            <numerusform>%1 itens foram excluídos (%n entrada).</numerusform>
            <numerusform>%1 itens foram excluídos (%n entradas).</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo reordering of %n items</source>
        <translation>
            <numerusform>Desfazer a reordenação de %n item</numerusform>
            <numerusform>Desfazer a reordenação de %n itens</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo reordering of %n items</source>
        <translation>
            <numerusform>Refazer a reordenação de %n item</numerusform>
            <numerusform>Refazer a reordenação de %n itens</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items have other places.</source>
        <translation>
            <numerusform>%n item tem outro lugar.</numerusform>
            <numerusform>%n itens têm outros lugares.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo hiding of %n items</source>
        <translation>
            <numerusform>Desfazer a ocultação de %n item</numerusform>
            <numerusform>Desfazer a ocultação de %n itens</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo hiding of %n items</source>
        <translation>
            <numerusform>Refazer a ocultação de %n item</numerusform>
            <numerusform>Refazer a ocultação de %n itens</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items are hidden: the menu no longer shows them.</source>
        <translation>
            <numerusform>%n item está oculto: o menu não o mostra mais.</numerusform>
            <numerusform>%n itens estão ocultos: o menu não os mostra mais.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo showing %n items again</source>
        <translation>
            <numerusform>Desfazer a reexibição de %n item</numerusform>
            <numerusform>Desfazer a reexibição de %n itens</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo showing %n items again</source>
        <translation>
            <numerusform>Refazer a reexibição de %n item</numerusform>
            <numerusform>Refazer a reexibição de %n itens</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The menu shows %n items again.</source>
        <translation>
            <numerusform>O menu mostra %n item novamente.</numerusform>
            <numerusform>O menu mostra %n itens novamente.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo sorting of folder %1</source>
        <translation>Desfazer a ordenação da pasta %1</translation>
    </message>
    <message>
        <source>Redo sorting of folder %1</source>
        <translation>Refazer a ordenação da pasta %1</translation>
    </message>
    <message>
        <source>The folder %1 was sorted by name.</source>
        <translation>A pasta %1 foi ordenada por nome.</translation>
    </message>
    <message>
        <source>Undo duplication of %1</source>
        <translation>Desfazer a duplicação de %1</translation>
    </message>
    <message>
        <source>Redo duplication of %1</source>
        <translation>Refazer a duplicação de %1</translation>
    </message>
    <message>
        <source>%1 was duplicated. The copy is selected.</source>
        <translation>%1 foi duplicado. A cópia está selecionada.</translation>
    </message>
    <message numerus="yes">
        <source>Undo duplication of %n items</source>
        <translation>
            <numerusform>Desfazer a duplicação de %n item</numerusform>
            <numerusform>Desfazer a duplicação de %n itens</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo duplication of %n items</source>
        <translation>
            <numerusform>Refazer a duplicação de %n item</numerusform>
            <numerusform>Refazer a duplicação de %n itens</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were duplicated. The copies are selected.</source>
        <translation>
            <numerusform>%n item foi duplicado. A cópia está selecionada.</numerusform>
            <numerusform>%n itens foram duplicados. As cópias estão selecionadas.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo deletion of %1 items (1 entry)</source>
        <translation>Desfazer a exclusão de %1 itens (1 entrada)</translation>
    </message>
    <message>
        <source>Redo deletion of %1 items (1 entry)</source>
        <translation>Refazer a exclusão de %1 itens (1 entrada)</translation>
    </message>
    <message>
        <source>%1 items were deleted (1 entry).</source>
        <translation>%1 itens foram excluídos (1 entrada).</translation>
    </message>
</context>
<context>
    <name>QFileSystemModel</name>
    <message>
        <source>%1 does not exist.</source>
        <translation>%1 não existe.</translation>
    </message>
    <message>
        <source>%1 exists and was left as it is.</source>
        <translation>%1 já existe e não foi modificado.</translation>
    </message>
    <message>
        <source>%1 cannot be put into itself.</source>
        <translation>%1 não pode ser colocado dentro de si mesmo.</translation>
    </message>
    <message>
        <source>%1 cannot be written.</source>
        <translation>Não foi possível gravar %1.</translation>
    </message>
    <message>
        <source>Can&apos;t move %1: %2</source>
        <translation>Não foi possível mover %1: %2</translation>
    </message>
    <message>
        <source>Can&apos;t copy %1: %2</source>
        <translation>Não foi possível copiar %1: %2</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Atenção</translation>
    </message>
    <message>
        <source>%1 already exists. Overwrite?</source>
        <translation>%1 já existe. Deseja sobrescrever?</translation>
    </message>
    <message>
        <source>Can&apos;t link %1: %2</source>
        <translation>Não foi possível criar o link %1: %2</translation>
    </message>
</context>
<context>
    <name>SchemeMenu</name>
    <message>
        <source>This is not a regular file.</source>
        <translation>Este não é um arquivo comum.</translation>
    </message>
    <message>
        <source>Shortcuts taken over: %1, left out: %2. Ok puts them into force, Reset takes them back.</source>
        <translation>Atalhos assumidos: %1, deixados de fora: %2. OK os põe em vigor, Redefinir os retira.</translation>
    </message>
    <message>
        <source>%3
Shortcuts taken over: %1, left out: %2. Ok puts them into force, Reset takes them back.</source>
        <comment>%3: a sentence about lines that were skipped</comment>
        <translation>%3
Atalhos assumidos: %1, deixados de fora: %2. OK os põe em vigor, Redefinir os retira.</translation>
    </message>
    <message>
        <source>&amp;Export keys...</source>
        <translation>&amp;Exportar teclas...</translation>
    </message>
    <message>
        <source>&amp;Import keys...</source>
        <translation>&amp;Importar teclas...</translation>
    </message>
    <message>
        <source>Save cheat sheet as &amp;HTML...</source>
        <translation>Salvar a folha de consulta como &amp;HTML...</translation>
    </message>
    <message>
        <source>Save cheat sheet as &amp;text...</source>
        <translation>Salvar a folha de consulta como &amp;texto...</translation>
    </message>
    <message>
        <source>&amp;Copy cheat sheet</source>
        <translation>&amp;Copiar a folha de consulta</translation>
    </message>
    <message>
        <source>Export keys</source>
        <translation>Exportar teclas</translation>
    </message>
    <message>
        <source>Keys (*.ini);;All files (*)</source>
        <translation>Teclas (*.ini);;Todos os arquivos (*)</translation>
    </message>
    <message>
        <source>%1
Choose another folder or another name, and try again.</source>
        <translation>%1
Escolha outra pasta ou outro nome e tente novamente.</translation>
    </message>
    <message>
        <source>Import keys</source>
        <translation>Importar teclas</translation>
    </message>
    <message>
        <source>%1
Choose a file that was written with &apos;Export keys...&apos;.</source>
        <translation>%1
Escolha um arquivo gravado com &quot;Exportar teclas...&quot;.</translation>
    </message>
    <message>
        <source>HTML documents (*.html);;All files (*)</source>
        <translation>Documentos HTML (*.html);;Todos os arquivos (*)</translation>
    </message>
    <message>
        <source>Plain text (*.txt);;All files (*)</source>
        <translation>Texto simples (*.txt);;Todos os arquivos (*)</translation>
    </message>
    <message>
        <source>Save cheat sheet</source>
        <translation>Salvar a folha de consulta</translation>
    </message>
    <message>
        <source>The cheat sheet could not be saved to %1: %2
Choose another folder or another name, and try again.</source>
        <comment>%2: what the system says</comment>
        <translation>Não foi possível salvar a folha de consulta em %1: %2
Escolha outra pasta ou outro nome e tente novamente.</translation>
    </message>
</context>
<context>
    <name>SchemeQuestion</name>
    <message>
        <source>Import keys</source>
        <translation>Importar teclas</translation>
    </message>
    <message>
        <source>&amp;Replace</source>
        <translation>&amp;Substituir</translation>
    </message>
    <message>
        <source>&amp;Skip</source>
        <translation>&amp;Pular</translation>
    </message>
    <message>
        <source>&amp;Do the same with all further ones</source>
        <translation>&amp;Fazer o mesmo com todas as demais</translation>
    </message>
    <message>
        <source>The file has shortcut &apos;%1&apos; for action &apos;%2&apos;, but the global action &apos;%3&apos; has it. Skip leaves action &apos;%2&apos; as it is; Cancel takes nothing over.</source>
        <translation>O arquivo tem o atalho &quot;%1&quot; para a ação &quot;%2&quot;, mas a ação global &quot;%3&quot; o usa. Pular deixa a ação &quot;%2&quot; como está; Cancelar não assume nada.</translation>
    </message>
    <message>
        <source>The file has shortcut &apos;%1&apos; for action &apos;%2&apos;, but action &apos;%3&apos; has it, too. Replace takes it away from action &apos;%3&apos;, Skip leaves action &apos;%2&apos; as it is; Cancel takes nothing over.</source>
        <translation>O arquivo tem o atalho &quot;%1&quot; para a ação &quot;%2&quot;, mas a ação &quot;%3&quot; também o usa. Substituir o retira da ação &quot;%3&quot;, Pular deixa a ação &quot;%2&quot; como está; Cancelar não assume nada.</translation>
    </message>
</context>
<context>
    <name>ShortcutClash</name>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for action &apos;%2&apos;.</source>
        <translation>O atalho &quot;%1&quot; já está em uso para a ação &quot;%2&quot;.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%2&apos; of action &apos;%3&apos; begins with &apos;%1&apos;.</source>
        <translation>O atalho &quot;%2&quot; da ação &quot;%3&quot; começa com &quot;%1&quot;.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%2&apos; begins with &apos;%1&apos;, the shortcut of action &apos;%3&apos;.</source>
        <translation>O atalho &quot;%2&quot; começa com &quot;%1&quot;, o atalho da ação &quot;%3&quot;.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; opens the menu &apos;%2&apos;.</source>
        <translation>O atalho &quot;%1&quot; abre o menu &quot;%2&quot;.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; leads to &apos;%2&apos; in the window.</source>
        <translation>O atalho &quot;%1&quot; leva a &quot;%2&quot; na janela.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is the standard shortcut for &apos;%2&apos;.</source>
        <translation>O atalho &quot;%1&quot; é o atalho padrão para &quot;%2&quot;.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for global action &apos;%2&apos;.</source>
        <translation>O atalho &quot;%1&quot; já está em uso para a ação global &quot;%2&quot;.</translation>
    </message>
    <message>
        <source>With &apos;%1&apos; as a shortcut this key cannot be typed into texts.</source>
        <translation>Com &quot;%1&quot; como atalho, esta tecla não pode ser digitada em textos.</translation>
    </message>
    <message>
        <source>The current keyboard layout cannot produce &apos;%1&apos;.</source>
        <translation>O layout de teclado atual não consegue produzir &quot;%1&quot;.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is a further shortcut of action &apos;%2&apos;.</source>
        <translation>O atalho &quot;%1&quot; é outro atalho da ação &quot;%2&quot;.</translation>
    </message>
</context>
<context>
    <name>ShortcutDelegate</name>
    <message>
        <source>Back to no shortcut</source>
        <translation>Voltar a nenhum atalho</translation>
    </message>
    <message>
        <source>Back to %1</source>
        <translation>Voltar a %1</translation>
    </message>
</context>
<context>
    <name>ShortcutFilterBar</name>
    <message>
        <source>Press keys</source>
        <translation>Pressionar teclas</translation>
    </message>
    <message>
        <source>Changed only</source>
        <translation>Somente alterados</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>Filtro</translation>
    </message>
    <message>
        <source>Shows who has the keys that you press; Escape ends it.</source>
        <translation>Mostra quem tem as teclas que você pressiona; Escape encerra.</translation>
    </message>
    <message>
        <source>Shows the actions alone whose shortcut is not the default one, or was edited.</source>
        <translation>Mostra somente as ações cujo atalho não é o padrão ou foi editado.</translation>
    </message>
    <message>
        <source>Press the keys to look for</source>
        <translation>Pressione as teclas a procurar</translation>
    </message>
    <message>
        <source>Filter by name, group or shortcut</source>
        <translation>Filtrar por nome, grupo ou atalho</translation>
    </message>
</context>
<context>
    <name>ShortcutScheme</name>
    <message>
        <source>The shortcuts could not be saved to %1: %2</source>
        <comment>%2: what the system says</comment>
        <translation>Não foi possível salvar os atalhos em %1: %2</translation>
    </message>
    <message>
        <source>The shortcuts could not be read from %1: %2</source>
        <comment>%2: what the system says</comment>
        <translation>Não foi possível ler os atalhos de %1: %2</translation>
    </message>
    <message>
        <source>%1 is not a regular file.</source>
        <translation>%1 não é um arquivo comum.</translation>
    </message>
    <message>
        <source>%1 is too large for a file of shortcuts.</source>
        <translation>%1 é grande demais para um arquivo de atalhos.</translation>
    </message>
    <message>
        <source>%1 holds no shortcuts.</source>
        <translation>%1 não contém atalhos.</translation>
    </message>
    <message>
        <source>Unreadable shortcuts in %1 were skipped: %2</source>
        <comment>%2: their number</comment>
        <translation>Atalhos ilegíveis em %1 foram ignorados: %2</translation>
    </message>
</context>
<context>
    <name>ShortcutSheet</name>
    <message>
        <source>Keyboard shortcuts</source>
        <comment>title of a printed sheet</comment>
        <translation>Atalhos de teclado</translation>
    </message>
</context>
<context>
    <name>ShortcutsModel</name>
    <message>
        <source>Action</source>
        <translation>Ação</translation>
    </message>
    <message>
        <source>Shortcut</source>
        <translation>Atalho</translation>
    </message>
    <message>
        <source>%1, changed</source>
        <comment>%1: an action or a key</comment>
        <translation>%1, alterado</translation>
    </message>
    <message>
        <source>No shortcut</source>
        <translation>Nenhum atalho</translation>
    </message>
    <message>
        <source>There is no default shortcut.</source>
        <translation>Não há atalho padrão.</translation>
    </message>
    <message>
        <source>The default shortcut is %1.</source>
        <translation>O atalho padrão é %1.</translation>
    </message>
</context>
<context>
    <name>StandardKeyNames</name>
    <message>
        <source>Help</source>
        <translation>Ajuda</translation>
    </message>
    <message>
        <source>What&apos;s this?</source>
        <translation>O que é isto?</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Abrir</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Fechar</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Salvar</translation>
    </message>
    <message>
        <source>Save as</source>
        <translation>Salvar como</translation>
    </message>
    <message>
        <source>New</source>
        <translation>Novo</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Excluir</translation>
    </message>
    <message>
        <source>Cut</source>
        <translation>Recortar</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Copiar</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation>Colar</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Desfazer</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Refazer</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Voltar</translation>
    </message>
    <message>
        <source>Forward</source>
        <translation>Avançar</translation>
    </message>
    <message>
        <source>Refresh</source>
        <translation>Atualizar</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>Ampliar</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>Reduzir</translation>
    </message>
    <message>
        <source>Print</source>
        <translation>Imprimir</translation>
    </message>
    <message>
        <source>New tab</source>
        <translation>Nova aba</translation>
    </message>
    <message>
        <source>Next tab</source>
        <translation>Próxima aba</translation>
    </message>
    <message>
        <source>Previous tab</source>
        <translation>Aba anterior</translation>
    </message>
    <message>
        <source>Find</source>
        <translation>Localizar</translation>
    </message>
    <message>
        <source>Find next</source>
        <translation>Localizar próximo</translation>
    </message>
    <message>
        <source>Find previous</source>
        <translation>Localizar anterior</translation>
    </message>
    <message>
        <source>Replace</source>
        <translation>Substituir</translation>
    </message>
    <message>
        <source>Select all</source>
        <translation>Selecionar tudo</translation>
    </message>
    <message>
        <source>Deselect</source>
        <translation>Remover seleção</translation>
    </message>
    <message>
        <source>Full screen</source>
        <translation>Tela cheia</translation>
    </message>
    <message>
        <source>Preferences</source>
        <translation>Preferências</translation>
    </message>
    <message>
        <source>Quit</source>
        <translation>Sair</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
    <message>
        <source>Bold</source>
        <translation>Negrito</translation>
    </message>
    <message>
        <source>Italic</source>
        <translation>Itálico</translation>
    </message>
    <message>
        <source>Underline</source>
        <translation>Sublinhado</translation>
    </message>
    <message>
        <source>Move the cursor</source>
        <translation>Mover o cursor</translation>
    </message>
    <message>
        <source>Select text</source>
        <translation>Selecionar texto</translation>
    </message>
    <message>
        <source>Edit text</source>
        <translation>Editar texto</translation>
    </message>
</context>
<context>
    <name>StringListEdit</name>
    <message>
        <source>Form</source>
        <translation>Formulário</translation>
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
        <translation>&amp;Redefinir este atalho</translation>
    </message>
</context>
<context>
    <name>VelDesktopEntryEditDialog</name>
    <message>
        <source>Warning</source>
        <translation>Aviso</translation>
    </message>
    <message>
        <source>no executable</source>
        <translation>nenhum executável</translation>
    </message>
    <message>
        <source>can&apos;t find executable</source>
        <translation>não foi possível encontrar o executável</translation>
    </message>
    <message>
        <source>can&apos;t find try executable</source>
        <translation>não foi possível encontrar o executável de teste</translation>
    </message>
    <message>
        <source>can&apos;t find URL</source>
        <translation>não foi possível encontrar a URL</translation>
    </message>
    <message>
        <source>wrong/incomplete desktop entry</source>
        <translation>entrada de desktop errada ou incompleta</translation>
    </message>
    <message>
        <source>Can&apos;t save position on desktop for %1</source>
        <translation>Não foi possível salvar a posição de %1 na área de trabalho</translation>
    </message>
    <message>
        <source>Copy from...</source>
        <translation>Copiar de...</translation>
    </message>
    <message>
        <source>Can&apos;t load file %1</source>
        <translation>Não foi possível carregar o arquivo %1</translation>
    </message>
    <message>
        <source>Desktop Entry Editor</source>
        <translation>Editor de entradas de desktop</translation>
    </message>
    <message>
        <source>You create hidden desktop entry</source>
        <translation>Você está criando uma entrada de desktop oculta</translation>
    </message>
    <message>
        <source>Can&apos;t save file %1</source>
        <translation>Não foi possível salvar o arquivo %1</translation>
    </message>
    <message>
        <source>Help</source>
        <translation>Ajuda</translation>
    </message>
    <message>
        <source>&lt;b&gt;Desktop entry&lt;/b&gt; is a multipurpose info file for installed apps, devices, etc. It can be used to build menu entries, shortcuts, etc. This dialog implements the &apos;Desktop Entry Standard&apos; of &lt;a href=&quot;https://www.freedesktop.org&quot;&gt;https://www.freedesktop.org&lt;/a&gt;.&lt;br&gt;&lt;br&gt;Desktop entry file is a text ini-like file with one main section [Desktop Entry] and possible additional sections for each action defined in the main section field &apos;Actions&apos;. All fields are text string pairs: key=value. Value can also be a semicolon separated string list.</source>
        <translation>Uma &lt;b&gt;entrada de desktop&lt;/b&gt; é um arquivo de informações de múltiplos usos para aplicativos instalados, dispositivos, etc. Ela pode ser usada para criar itens de menu, atalhos, etc. Esta janela implementa o &quot;Desktop Entry Standard&quot; de &lt;a href=&quot;https://www.freedesktop.org&quot;&gt;https://www.freedesktop.org&lt;/a&gt;.&lt;br&gt;&lt;br&gt;O arquivo de uma entrada de desktop é um arquivo de texto no estilo INI com uma seção principal [Desktop Entry] e possíveis seções adicionais para cada ação definida no campo &quot;Actions&quot; da seção principal. Todos os campos são pares de textos: chave=valor. O valor também pode ser uma lista de textos separados por ponto e vírgula.</translation>
    </message>
    <message>
        <source>The file %1 is not a desktop entry: it has no group [Desktop Entry].</source>
        <translation>O arquivo %1 não é uma entrada de desktop: não tem o grupo [Desktop Entry].</translation>
    </message>
</context>
<context>
    <name>VelDesktopEntryPropsWidgetPrivate</name>
    <message>
        <source>Information about the URL</source>
        <translation>Informações sobre a URL</translation>
    </message>
    <message>
        <source>Only show in</source>
        <translation>Mostrar somente em</translation>
    </message>
    <message>
        <source>Not show in</source>
        <translation>Não mostrar em</translation>
    </message>
    <message>
        <source>Add desktop environment:</source>
        <translation>Adicionar ambiente de área de trabalho:</translation>
    </message>
    <message>
        <source>Edit desktop environment:</source>
        <translation>Editar ambiente de área de trabalho:</translation>
    </message>
    <message>
        <source>MIME type or file name extension:</source>
        <translation>Tipo MIME ou extensão do nome do arquivo:</translation>
    </message>
    <message>
        <source>MIME type</source>
        <translation>Tipo MIME</translation>
    </message>
    <message>
        <source>Add MIME type</source>
        <translation>Adicionar tipo MIME</translation>
    </message>
    <message>
        <source>Edit MIME type</source>
        <translation>Editar tipo MIME</translation>
    </message>
    <message>
        <source>Categories</source>
        <translation>Categorias</translation>
    </message>
    <message>
        <source>Add category</source>
        <translation>Adicionar categoria</translation>
    </message>
    <message>
        <source>Category:</source>
        <translation>Categoria:</translation>
    </message>
    <message>
        <source>Edit category</source>
        <translation>Editar categoria</translation>
    </message>
    <message>
        <source>Keywords</source>
        <translation>Palavras-chave</translation>
    </message>
    <message>
        <source>Add keyword</source>
        <translation>Adicionar palavra-chave</translation>
    </message>
    <message>
        <source>Keyword:</source>
        <translation>Palavra-chave:</translation>
    </message>
    <message>
        <source>Edit keyword</source>
        <translation>Editar palavra-chave</translation>
    </message>
    <message>
        <source>Actions</source>
        <translation>Ações</translation>
    </message>
    <message>
        <source>Add action</source>
        <translation>Adicionar ação</translation>
    </message>
    <message>
        <source>Edit action</source>
        <translation>Editar ação</translation>
    </message>
    <message>
        <source>Application</source>
        <translation>Aplicativo</translation>
    </message>
    <message>
        <source>Link</source>
        <translation>Link</translation>
    </message>
    <message>
        <source>Directory</source>
        <translation>Pasta</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Atenção</translation>
    </message>
    <message>
        <source>Desktop entry type was changed.
Some field values may be lost...
Continue?</source>
        <translation>O tipo da entrada de desktop foi alterado.
Os valores de alguns campos podem ser perdidos...
Continuar?</translation>
    </message>
    <message>
        <source>Type</source>
        <translation>Tipo</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Nome</translation>
    </message>
    <message>
        <source>Icon</source>
        <translation>Ícone</translation>
    </message>
    <message>
        <source>Exec</source>
        <translation>Comando</translation>
    </message>
    <message>
        <source>Terminal</source>
        <translation>Terminal</translation>
    </message>
    <message>
        <source>Path</source>
        <translation>Caminho de trabalho</translation>
    </message>
    <message>
        <source>Try exec</source>
        <translation>Comando de teste</translation>
    </message>
    <message>
        <source>Url</source>
        <translation>URL</translation>
    </message>
    <message>
        <source>Generic name</source>
        <translation>Nome genérico</translation>
    </message>
    <message>
        <source>Comment</source>
        <translation>Comentário</translation>
    </message>
    <message>
        <source>No display</source>
        <translation>Não exibir</translation>
    </message>
    <message>
        <source>Hidden</source>
        <translation>Oculto</translation>
    </message>
    <message>
        <source>Startup notify</source>
        <translation>Notificação de inicialização</translation>
    </message>
    <message>
        <source>Startup WM class</source>
        <translation>Classe de janela ao iniciar</translation>
    </message>
    <message>
        <source>Version</source>
        <translation>Versão</translation>
    </message>
</context>
<context>
    <name>VelMenuDialog</name>
    <message>
        <source>Edit</source>
        <translation>Editar</translation>
    </message>
    <message>
        <source>Send command to vel-wm to update
 edited menu, toolbar, etc.</source>
        <translation>Enviar ao vel-wm o comando para atualizar
 o menu, a barra de ferramentas, etc. editados</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Aviso</translation>
    </message>
    <message>
        <source>Can&apos;t send command to vel-wm</source>
        <translation>Não foi possível enviar o comando ao vel-wm</translation>
    </message>
    <message>
        <source>This menu cannot be changed: the folder %1 does not exist.</source>
        <translation>Este menu não pode ser alterado: a pasta %1 não existe.</translation>
    </message>
    <message>
        <source>This menu cannot be changed: you may not write to the folder %1.</source>
        <translation>Este menu não pode ser alterado: você não pode gravar na pasta %1.</translation>
    </message>
    <message>
        <source>Show hidden</source>
        <translation>Mostrar ocultos</translation>
    </message>
    <message>
        <source>Filter by name, command or keyword</source>
        <translation>Filtrar por nome, comando ou palavra-chave</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>Filtro</translation>
    </message>
    <message>
        <source>Also show the entries that the menu leaves out</source>
        <translation>Mostrar também as entradas que o menu omite</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Desfazer</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Erro</translation>
    </message>
    <message>
        <source>Start menu</source>
        <translation>Menu Iniciar</translation>
    </message>
</context>
<context>
    <name>VelMenuView</name>
    <message>
        <source>Warning</source>
        <translation>Aviso</translation>
    </message>
    <message>
        <source>Can&apos;t start:
%1 %2</source>
        <translation>Não foi possível iniciar:
%1 %2</translation>
    </message>
    <message>
        <source>All previous shortcuts
will be lost. Are you sure?</source>
        <translation>Todos os atalhos anteriores
serão perdidos. Tem certeza?</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Editar</translation>
    </message>
    <message>
        <source>New folder</source>
        <translation>Nova pasta</translation>
    </message>
    <message>
        <source>New entry</source>
        <translation>Nova entrada</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Excluir</translation>
    </message>
    <message>
        <source>Execute</source>
        <translation>Executar</translation>
    </message>
    <message>
        <source>Find</source>
        <translation>Localizar</translation>
    </message>
    <message>
        <source>Find Next</source>
        <translation>Localizar próxima</translation>
    </message>
    <message>
        <source>Cut</source>
        <translation>Recortar</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Copiar</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation>Colar</translation>
    </message>
    <message>
        <source>Default menu...</source>
        <translation>Menu padrão...</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>Para cima</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>Para baixo</translation>
    </message>
    <message>
        <source>Move</source>
        <translation>Mover</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
    <message>
        <source>Group</source>
        <translation>Grupo</translation>
    </message>
    <message>
        <source>Shortcut</source>
        <translation>Atalho</translation>
    </message>
    <message>
        <source>Can&apos;t edit non desktop file</source>
        <translation>Não é possível editar um arquivo que não é do tipo &quot;desktop&quot;</translation>
    </message>
    <message>
        <source>Desktop Entry %1</source>
        <translation>Entrada de desktop %1</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Atenção</translation>
    </message>
    <message>
        <source>Are you sure to delete it?</source>
        <translation>Tem certeza de que deseja excluir?</translation>
    </message>
    <message>
        <source>Find string:</source>
        <translation>Localizar texto:</translation>
    </message>
    <message>
        <source>&apos;%1&apos; not found .</source>
        <translation>&quot;%1&quot; não foi encontrado.</translation>
    </message>
    <message>
        <source>Not in the menu: it is not meant for this desktop.</source>
        <translation>Fora do menu: a entrada não se destina a este ambiente.</translation>
    </message>
    <message>
        <source>Not in the menu: it is meant for other desktops only (%1).</source>
        <translation>Fora do menu: a entrada se destina somente a outros ambientes (%1).</translation>
    </message>
    <message>
        <source>Not in the menu: it is marked as deleted (Hidden).</source>
        <translation>Fora do menu: a entrada está marcada como excluída (Hidden).</translation>
    </message>
    <message>
        <source>Not in the menu: it is marked not to be displayed (NoDisplay).</source>
        <translation>Fora do menu: a entrada está marcada para não ser exibida (NoDisplay).</translation>
    </message>
    <message>
        <source>Not in the menu: the program %1 is not installed (TryExec).</source>
        <translation>Fora do menu: o programa %1 não está instalado (TryExec).</translation>
    </message>
    <message>
        <source>This file is not a desktop entry, whatever its name says.</source>
        <translation>Este arquivo não é uma entrada de desktop, diga o nome o que disser.</translation>
    </message>
    <message>
        <source>This file cannot be read.</source>
        <translation>Este arquivo não pode ser lido.</translation>
    </message>
    <message>
        <source>This entry has no name. The name of its file is shown.</source>
        <translation>Esta entrada não tem nome. O nome do seu arquivo é exibido.</translation>
    </message>
    <message>
        <source>Taking back what was done...</source>
        <translation>Desfazendo o que foi feito...</translation>
    </message>
    <message>
        <source>The program that holds the clipboard does not answer. Nothing was pasted.</source>
        <translation>O programa que detém a área de transferência não responde. Nada foi colado.</translation>
    </message>
    <message>
        <source>Nothing can be created in %1, because there is no such folder.</source>
        <translation>Nada pode ser criado em %1, porque essa pasta não existe.</translation>
    </message>
    <message>
        <source>%1 could not be saved. Make sure that the folder %2 may be written and that the disk is not full, then try again.</source>
        <translation>Não foi possível salvar %1. Verifique se é permitido gravar na pasta %2 e se o disco não está cheio e tente novamente.</translation>
    </message>
    <message>
        <source>%1 could not be deleted: %2. Make sure that the folder that holds it may be written, then try again.</source>
        <translation>Não foi possível excluir %1: %2. Verifique se é permitido gravar na pasta que o contém e tente novamente.</translation>
    </message>
    <message>
        <source>%1 was deleted in part only, because %2 could not be deleted: %3. Make sure that its folder may be written, then delete the rest.</source>
        <translation>%1 foi excluído somente em parte, porque não foi possível excluir %2: %3. Verifique se é permitido gravar na pasta dele e depois exclua o restante.</translation>
    </message>
    <message>
        <source>Nothing in this menu matches &apos;%1&apos;.</source>
        <translation>Nada neste menu corresponde a &quot;%1&quot;.</translation>
    </message>
    <message>
        <source>Searching the menu for &apos;%1&apos;...</source>
        <translation>Procurando &quot;%1&quot; no menu...</translation>
    </message>
    <message>
        <source>The menu is too large to be searched as a whole. Only a part of it was searched.</source>
        <translation>O menu é grande demais para ser pesquisado por inteiro. Somente uma parte foi pesquisada.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; was not changed: the file %2 cannot be written.</source>
        <translation>&quot;%1&quot; não foi alterado: não é possível gravar no arquivo %2.</translation>
    </message>
    <message>
        <source>The order of the folder %1 could not be saved. Make sure that the folder may be written and that the disk is not full, then try again.</source>
        <translation>Não foi possível salvar a ordem da pasta %1. Verifique se é permitido gravar na pasta e se o disco não está cheio e tente novamente.</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1. The menu was left as it is.</source>
        <translation>Não foi possível criar o menu padrão em %1. O menu ficou como estava.</translation>
    </message>
    <message>
        <source>Menu</source>
        <comment>the tree</comment>
        <translation>Menu</translation>
    </message>
    <message>
        <source>%1 cannot be edited, because the folder %2 may not be written.</source>
        <translation>%1 não pode ser editado, porque não é permitido gravar na pasta %2.</translation>
    </message>
    <message>
        <source>Moving files...</source>
        <translation>Movendo arquivos...</translation>
    </message>
    <message>
        <source>Copying files...</source>
        <translation>Copiando arquivos...</translation>
    </message>
    <message>
        <source>Deleting files...</source>
        <translation>Excluindo arquivos...</translation>
    </message>
    <message>
        <source>The deletion of %1 was canceled. What was not yet deleted is still there.</source>
        <translation>A exclusão de %1 foi cancelada. O que ainda não havia sido excluído continua lá.</translation>
    </message>
    <message>
        <source>This menu is empty. Press %1 for a new entry, or right-click here for what else can be added.</source>
        <translation>Este menu está vazio. Pressione %1 para uma nova entrada ou clique aqui com o botão direito para ver o que mais pode ser adicionado.</translation>
    </message>
    <message>
        <source>the program %1 ended with an error</source>
        <translation>o programa %1 terminou com um erro</translation>
    </message>
    <message>
        <source>the program %1 cannot be run</source>
        <translation>não foi possível executar o programa %1</translation>
    </message>
    <message numerus="yes">
        <source>And %n more.</source>
        <translation>
            <numerusform>E mais %n.</numerusform>
            <numerusform>E mais %n.</numerusform>
        </translation>
    </message>
    <message>
        <source>Open containin&amp;g folder</source>
        <translation>Abrir pasta &amp;que contém o item</translation>
    </message>
    <message>
        <source>The folder %1 was not opened: %2.</source>
        <translation>A pasta %1 não foi aberta: %2.</translation>
    </message>
    <message>
        <source>New &amp;folder</source>
        <translation>Nova pa&amp;sta</translation>
    </message>
    <message>
        <source>New entr&amp;y</source>
        <translation>Nova e&amp;ntrada</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>&amp;Editar</translation>
    </message>
    <message>
        <source>&amp;Delete</source>
        <translation>Exc&amp;luir</translation>
    </message>
    <message>
        <source>E&amp;xecute</source>
        <translation>E&amp;xecutar</translation>
    </message>
    <message>
        <source>F&amp;ind</source>
        <translation>Locali&amp;zar</translation>
    </message>
    <message>
        <source>Find &amp;Next</source>
        <translation>Localizar &amp;próxima</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>Recor&amp;tar</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>&amp;Copiar</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>Col&amp;ar</translation>
    </message>
    <message>
        <source>Default &amp;menu...</source>
        <translation>&amp;Menu padrão...</translation>
    </message>
    <message>
        <source>&amp;Up</source>
        <translation>Para c&amp;ima</translation>
    </message>
    <message>
        <source>D&amp;own</source>
        <translation>Para &amp;baixo</translation>
    </message>
    <message>
        <source>Dup&amp;licate</source>
        <translation>D&amp;uplicar</translation>
    </message>
    <message>
        <source>&amp;Hide</source>
        <translation>&amp;Ocultar</translation>
    </message>
    <message>
        <source>Sho&amp;w again</source>
        <translation>Mostrar no&amp;vamente</translation>
    </message>
    <message>
        <source>&amp;Reload</source>
        <translation>&amp;Recarregar</translation>
    </message>
    <message>
        <source>&amp;Sort by name</source>
        <translation>Or&amp;denar por nome</translation>
    </message>
    <message>
        <source>The folder %1 is sorted by name already.</source>
        <translation>A pasta %1 já está ordenada por nome.</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1, because no application is installed. The menu was left as it is.</source>
        <translation>Não foi possível criar o menu padrão em %1, porque nenhum aplicativo está instalado. O menu ficou como estava.</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1: %2. The menu was left as it is.</source>
        <translation>Não foi possível criar o menu padrão em %1: %2. O menu ficou como estava.</translation>
    </message>
    <message>
        <source>%1 is no file on this computer. Nothing was moved or copied.</source>
        <translation>%1 não é um arquivo deste computador. Nada foi movido nem copiado.</translation>
    </message>
    <message>
        <source>%1 was not started: %2.</source>
        <translation>%1 não foi iniciado: %2.</translation>
    </message>
    <message>
        <source>This menu is empty. Right-click here and choose &apos;%2&apos; to fill it with the applications that are installed, or press %1 for a new entry.</source>
        <translation>Este menu está vazio. Clique aqui com o botão direito e escolha &quot;%2&quot; para preenchê-lo com os aplicativos instalados, ou pressione %1 para uma nova entrada.</translation>
    </message>
    <message>
        <source>This menu is empty, because no application was found that is installed. Once there is one, right-click here and choose &apos;%2&apos;. Until then, press %1 for an entry of your own.</source>
        <translation>Este menu está vazio, porque nenhum aplicativo instalado foi encontrado. Quando houver um, clique aqui com o botão direito e escolha &quot;%2&quot;. Até lá, pressione %1 para uma entrada sua.</translation>
    </message>
</context>
<context>
    <name>VelUI::ActionPropsDialog</name>
    <message>
        <source>Id</source>
        <translation>Identificador</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Nome</translation>
    </message>
    <message>
        <source>Icon</source>
        <translation>Ícone</translation>
    </message>
    <message>
        <source>Exec</source>
        <translation>Comando</translation>
    </message>
    <message>
        <source>Only show in</source>
        <translation>Mostrar somente em</translation>
    </message>
    <message>
        <source>Add desktop environment:</source>
        <translation>Adicionar ambiente de área de trabalho:</translation>
    </message>
    <message>
        <source>Edit desktop environment:</source>
        <translation>Editar ambiente de área de trabalho:</translation>
    </message>
    <message>
        <source>Not show in</source>
        <translation>Não mostrar em</translation>
    </message>
</context>
<context>
    <name>VelUI::CategoryChooser</name>
    <message>
        <source>Main category</source>
        <translation>Categoria principal</translation>
    </message>
    <message>
        <source>Goes with %1</source>
        <translation>Acompanha %1</translation>
    </message>
    <message>
        <source>Only beside &quot;Only show in&quot;</source>
        <translation>Somente junto com &quot;Mostrar somente em&quot;</translation>
    </message>
    <message>
        <source>Deprecated</source>
        <translation>Obsoleta</translation>
    </message>
    <message>
        <source>Extension</source>
        <comment>a category of somebody&apos;s own, X-...</comment>
        <translation>Extensão</translation>
    </message>
    <message>
        <source>Not registered</source>
        <translation>Não registrada</translation>
    </message>
    <message>
        <source>Choose categories</source>
        <translation>Escolher categorias</translation>
    </message>
    <message>
        <source>Name</source>
        <comment>title of a column</comment>
        <translation>Nome</translation>
    </message>
    <message>
        <source>Category</source>
        <comment>title of a column</comment>
        <translation>Categoria</translation>
    </message>
    <message>
        <source>Remark</source>
        <comment>title of a column</comment>
        <translation>Observação</translation>
    </message>
</context>
<context>
    <name>VelUI::CategoryNames</name>
    <message>
        <source>Audio and video</source>
        <translation>Áudio e vídeo</translation>
    </message>
    <message>
        <source>Audio</source>
        <translation>Áudio</translation>
    </message>
    <message>
        <source>Video</source>
        <translation>Vídeo</translation>
    </message>
    <message>
        <source>Software development</source>
        <translation>Desenvolvimento de software</translation>
    </message>
    <message>
        <source>Education</source>
        <translation>Educação</translation>
    </message>
    <message>
        <source>Games</source>
        <translation>Jogos</translation>
    </message>
    <message>
        <source>Graphics</source>
        <translation>Gráficos</translation>
    </message>
    <message>
        <source>Internet and network</source>
        <translation>Internet e rede</translation>
    </message>
    <message>
        <source>Office</source>
        <translation>Escritório</translation>
    </message>
    <message>
        <source>Science</source>
        <translation>Ciência</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Configurações</translation>
    </message>
    <message>
        <source>System tools</source>
        <translation>Ferramentas do sistema</translation>
    </message>
    <message>
        <source>Accessories</source>
        <translation>Acessórios</translation>
    </message>
    <message>
        <source>Build tools</source>
        <translation>Ferramentas de compilação</translation>
    </message>
    <message>
        <source>Debuggers</source>
        <translation>Depuradores</translation>
    </message>
    <message>
        <source>Development environments</source>
        <translation>Ambientes de desenvolvimento</translation>
    </message>
    <message>
        <source>Designers of user interfaces</source>
        <translation>Projeto de interfaces gráficas</translation>
    </message>
    <message>
        <source>Profilers</source>
        <translation>Analisadores de desempenho</translation>
    </message>
    <message>
        <source>Revision control</source>
        <translation>Controle de versões</translation>
    </message>
    <message>
        <source>Translation tools</source>
        <translation>Ferramentas de tradução</translation>
    </message>
    <message>
        <source>Calendars</source>
        <translation>Calendários</translation>
    </message>
    <message>
        <source>Address books</source>
        <translation>Catálogos de endereços</translation>
    </message>
    <message>
        <source>Databases</source>
        <translation>Bancos de dados</translation>
    </message>
    <message>
        <source>Dictionaries</source>
        <translation>Dicionários</translation>
    </message>
    <message>
        <source>Charts</source>
        <translation>Gráficos de dados</translation>
    </message>
    <message>
        <source>Email</source>
        <translation>E-mail</translation>
    </message>
    <message>
        <source>Finances</source>
        <translation>Finanças</translation>
    </message>
    <message>
        <source>Flow charts</source>
        <translation>Fluxogramas</translation>
    </message>
    <message>
        <source>Handheld devices</source>
        <translation>Dispositivos portáteis</translation>
    </message>
    <message>
        <source>Project management</source>
        <translation>Gerenciamento de projetos</translation>
    </message>
    <message>
        <source>Presentations</source>
        <translation>Apresentações</translation>
    </message>
    <message>
        <source>Spreadsheets</source>
        <translation>Planilhas</translation>
    </message>
    <message>
        <source>Word processors</source>
        <translation>Processadores de texto</translation>
    </message>
    <message>
        <source>Two-dimensional graphics</source>
        <translation>Gráficos bidimensionais</translation>
    </message>
    <message>
        <source>Vector graphics</source>
        <translation>Gráficos vetoriais</translation>
    </message>
    <message>
        <source>Raster graphics</source>
        <translation>Gráficos rasterizados</translation>
    </message>
    <message>
        <source>Three-dimensional graphics</source>
        <translation>Gráficos tridimensionais</translation>
    </message>
    <message>
        <source>Scanning</source>
        <translation>Digitalização</translation>
    </message>
    <message>
        <source>Text recognition</source>
        <translation>Reconhecimento de texto</translation>
    </message>
    <message>
        <source>Photography</source>
        <translation>Fotografia</translation>
    </message>
    <message>
        <source>Desktop publishing</source>
        <translation>Editoração eletrônica</translation>
    </message>
    <message>
        <source>Viewers</source>
        <translation>Visualizadores</translation>
    </message>
    <message>
        <source>Text tools</source>
        <translation>Ferramentas de texto</translation>
    </message>
    <message>
        <source>Desktop settings</source>
        <translation>Configurações da área de trabalho</translation>
    </message>
    <message>
        <source>Hardware settings</source>
        <translation>Configurações de hardware</translation>
    </message>
    <message>
        <source>Printing</source>
        <translation>Impressão</translation>
    </message>
    <message>
        <source>Package managers</source>
        <translation>Gerenciadores de pacotes</translation>
    </message>
    <message>
        <source>Dial-up connections</source>
        <translation>Conexões discadas</translation>
    </message>
    <message>
        <source>Instant messaging</source>
        <translation>Mensagens instantâneas</translation>
    </message>
    <message>
        <source>Chat</source>
        <translation>Bate-papo</translation>
    </message>
    <message>
        <source>IRC</source>
        <translation>IRC</translation>
    </message>
    <message>
        <source>News feeds</source>
        <translation>Fontes de notícias</translation>
    </message>
    <message>
        <source>File transfer</source>
        <translation>Transferência de arquivos</translation>
    </message>
    <message>
        <source>Amateur radio</source>
        <translation>Radioamadorismo</translation>
    </message>
    <message>
        <source>Newsgroups</source>
        <translation>Grupos de notícias</translation>
    </message>
    <message>
        <source>File sharing</source>
        <translation>Compartilhamento de arquivos</translation>
    </message>
    <message>
        <source>Remote access</source>
        <translation>Acesso remoto</translation>
    </message>
    <message>
        <source>Telephony</source>
        <translation>Telefonia</translation>
    </message>
    <message>
        <source>Telephony tools</source>
        <translation>Ferramentas de telefonia</translation>
    </message>
    <message>
        <source>Video conferences</source>
        <translation>Videoconferências</translation>
    </message>
    <message>
        <source>Web browsers</source>
        <translation>Navegadores da Web</translation>
    </message>
    <message>
        <source>Web development</source>
        <translation>Desenvolvimento Web</translation>
    </message>
    <message>
        <source>MIDI</source>
        <translation>MIDI</translation>
    </message>
    <message>
        <source>Mixers</source>
        <translation>Mixers</translation>
    </message>
    <message>
        <source>Sequencers</source>
        <translation>Sequenciadores</translation>
    </message>
    <message>
        <source>Tuners</source>
        <translation>Afinadores</translation>
    </message>
    <message>
        <source>Television</source>
        <translation>Televisão</translation>
    </message>
    <message>
        <source>Audio and video editing</source>
        <translation>Edição de áudio e vídeo</translation>
    </message>
    <message>
        <source>Players</source>
        <translation>Reprodutores</translation>
    </message>
    <message>
        <source>Recorders</source>
        <translation>Gravadores</translation>
    </message>
    <message>
        <source>Disc burning</source>
        <translation>Gravação de discos</translation>
    </message>
    <message>
        <source>Action games</source>
        <translation>Jogos de ação</translation>
    </message>
    <message>
        <source>Adventure games</source>
        <translation>Jogos de aventura</translation>
    </message>
    <message>
        <source>Arcade games</source>
        <translation>Jogos de fliperama</translation>
    </message>
    <message>
        <source>Board games</source>
        <translation>Jogos de tabuleiro</translation>
    </message>
    <message>
        <source>Falling blocks games</source>
        <translation>Jogos de blocos que caem</translation>
    </message>
    <message>
        <source>Card games</source>
        <translation>Jogos de cartas</translation>
    </message>
    <message>
        <source>Games for children</source>
        <translation>Jogos infantis</translation>
    </message>
    <message>
        <source>Logic games</source>
        <translation>Jogos de lógica</translation>
    </message>
    <message>
        <source>Role-playing games</source>
        <translation>Jogos de RPG</translation>
    </message>
    <message>
        <source>Shooters</source>
        <translation>Jogos de tiro</translation>
    </message>
    <message>
        <source>Simulations</source>
        <translation>Simulações</translation>
    </message>
    <message>
        <source>Sports games</source>
        <translation>Jogos de esportes</translation>
    </message>
    <message>
        <source>Strategy games</source>
        <translation>Jogos de estratégia</translation>
    </message>
    <message>
        <source>Art</source>
        <translation>Arte</translation>
    </message>
    <message>
        <source>Construction</source>
        <translation>Construção</translation>
    </message>
    <message>
        <source>Music</source>
        <translation>Música</translation>
    </message>
    <message>
        <source>Languages</source>
        <translation>Idiomas</translation>
    </message>
    <message>
        <source>Artificial intelligence</source>
        <translation>Inteligência artificial</translation>
    </message>
    <message>
        <source>Astronomy</source>
        <translation>Astronomia</translation>
    </message>
    <message>
        <source>Biology</source>
        <translation>Biologia</translation>
    </message>
    <message>
        <source>Chemistry</source>
        <translation>Química</translation>
    </message>
    <message>
        <source>Computer science</source>
        <translation>Ciência da computação</translation>
    </message>
    <message>
        <source>Data visualization</source>
        <translation>Visualização de dados</translation>
    </message>
    <message>
        <source>Economics</source>
        <translation>Economia</translation>
    </message>
    <message>
        <source>Electricity</source>
        <translation>Eletricidade</translation>
    </message>
    <message>
        <source>Geography</source>
        <translation>Geografia</translation>
    </message>
    <message>
        <source>Geology</source>
        <translation>Geologia</translation>
    </message>
    <message>
        <source>Earth sciences</source>
        <translation>Ciências da Terra</translation>
    </message>
    <message>
        <source>History</source>
        <translation>História</translation>
    </message>
    <message>
        <source>Humanities</source>
        <translation>Ciências humanas</translation>
    </message>
    <message>
        <source>Image processing</source>
        <translation>Processamento de imagens</translation>
    </message>
    <message>
        <source>Literature</source>
        <translation>Literatura</translation>
    </message>
    <message>
        <source>Maps</source>
        <translation>Mapas</translation>
    </message>
    <message>
        <source>Mathematics</source>
        <translation>Matemática</translation>
    </message>
    <message>
        <source>Numerical analysis</source>
        <translation>Análise numérica</translation>
    </message>
    <message>
        <source>Medicine</source>
        <translation>Medicina</translation>
    </message>
    <message>
        <source>Physics</source>
        <translation>Física</translation>
    </message>
    <message>
        <source>Robotics</source>
        <translation>Robótica</translation>
    </message>
    <message>
        <source>Spirituality</source>
        <translation>Espiritualidade</translation>
    </message>
    <message>
        <source>Sports</source>
        <translation>Esportes</translation>
    </message>
    <message>
        <source>Parallel computing</source>
        <translation>Computação paralela</translation>
    </message>
    <message>
        <source>Amusement</source>
        <translation>Diversão</translation>
    </message>
    <message>
        <source>Archiving</source>
        <translation>Arquivamento</translation>
    </message>
    <message>
        <source>Compression</source>
        <translation>Compressão</translation>
    </message>
    <message>
        <source>Electronics</source>
        <translation>Eletrônica</translation>
    </message>
    <message>
        <source>Emulators</source>
        <translation>Emuladores</translation>
    </message>
    <message>
        <source>Engineering</source>
        <translation>Engenharia</translation>
    </message>
    <message>
        <source>File tools</source>
        <translation>Ferramentas de arquivos</translation>
    </message>
    <message>
        <source>File managers</source>
        <translation>Gerenciadores de arquivos</translation>
    </message>
    <message>
        <source>Terminals</source>
        <translation>Terminais</translation>
    </message>
    <message>
        <source>File systems</source>
        <translation>Sistemas de arquivos</translation>
    </message>
    <message>
        <source>Monitors</source>
        <translation>Monitores do sistema</translation>
    </message>
    <message>
        <source>Security</source>
        <translation>Segurança</translation>
    </message>
    <message>
        <source>Accessibility</source>
        <translation>Acessibilidade</translation>
    </message>
    <message>
        <source>Calculators</source>
        <translation>Calculadoras</translation>
    </message>
    <message>
        <source>Clocks</source>
        <translation>Relógios</translation>
    </message>
    <message>
        <source>Text editors</source>
        <translation>Editores de texto</translation>
    </message>
    <message>
        <source>Documentation</source>
        <translation>Documentação</translation>
    </message>
    <message>
        <source>For adults</source>
        <translation>Para adultos</translation>
    </message>
    <message>
        <source>Core of the desktop</source>
        <translation>Núcleo do ambiente de área de trabalho</translation>
    </message>
    <message>
        <source>Made with KDE</source>
        <translation>Feitos com KDE</translation>
    </message>
    <message>
        <source>Made with GNOME</source>
        <translation>Feitos com GNOME</translation>
    </message>
    <message>
        <source>Made with Xfce</source>
        <translation>Feitos com Xfce</translation>
    </message>
    <message>
        <source>Made with GTK</source>
        <translation>Feitos com GTK</translation>
    </message>
    <message>
        <source>Made with Qt</source>
        <translation>Feitos com Qt</translation>
    </message>
    <message>
        <source>Made with Motif</source>
        <translation>Feitos com Motif</translation>
    </message>
    <message>
        <source>Made with Java</source>
        <translation>Feitos com Java</translation>
    </message>
    <message>
        <source>For the console</source>
        <translation>Para o console</translation>
    </message>
    <message>
        <source>Screen savers</source>
        <translation>Protetores de tela</translation>
    </message>
    <message>
        <source>Icons of the system tray</source>
        <translation>Ícones da bandeja do sistema</translation>
    </message>
    <message>
        <source>Applets of a panel</source>
        <translation>Miniaplicativos de um painel</translation>
    </message>
    <message>
        <source>Desktop shells</source>
        <translation>Shells da área de trabalho</translation>
    </message>
    <message>
        <source>Applications</source>
        <translation>Aplicativos</translation>
    </message>
</context>
<context>
    <name>VelUI::ChoiceDialog</name>
    <message>
        <source>Filter</source>
        <translation>Filtro</translation>
    </message>
    <message>
        <source>Type to filter</source>
        <translation>Digite para filtrar</translation>
    </message>
    <message>
        <source>Reading...</source>
        <translation>Lendo...</translation>
    </message>
    <message>
        <source>No match</source>
        <translation>Nenhuma correspondência</translation>
    </message>
    <message numerus="yes">
        <source>%n chosen</source>
        <translation>
            <numerusform>%n escolhido</numerusform>
            <numerusform>%n escolhidos</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>VelUI::DesktopChooser</name>
    <message>
        <source>Desktop environment</source>
        <translation>Ambiente de área de trabalho</translation>
    </message>
    <message>
        <source>Remark</source>
        <comment>title of a column</comment>
        <translation>Observação</translation>
    </message>
    <message>
        <source>This session</source>
        <translation>Esta sessão</translation>
    </message>
    <message>
        <source>Not registered</source>
        <translation>Não registrado</translation>
    </message>
</context>
<context>
    <name>VelUI::EditActionsDialog</name>
    <message>
        <source>An action has no id. It can have &quot;%1&quot;.</source>
        <translation>Uma ação não tem identificador. Ele pode ser &quot;%1&quot;.</translation>
    </message>
    <message>
        <source>Two actions have the id &quot;%1&quot;. The second one can have &quot;%2&quot;.</source>
        <translation>Duas ações têm o identificador &quot;%1&quot;. A segunda pode ter &quot;%2&quot;.</translation>
    </message>
    <message>
        <source>No entry can hold the id &quot;%1&quot;. It can be &quot;%2&quot;.</source>
        <translation>Nenhuma entrada pode conter o identificador &quot;%1&quot;. Ele pode ser &quot;%2&quot;.</translation>
    </message>
    <message>
        <source>The id &quot;%1&quot; should have only A to Z, a to z, 0 to 9 and &quot;-&quot; in it, as &quot;%2&quot; has.</source>
        <translation>O identificador &quot;%1&quot; deveria ter apenas A a Z, a a z, 0 a 9 e &quot;-&quot;, como &quot;%2&quot;.</translation>
    </message>
    <message numerus="yes">
        <source>%n more id(s) should be changed.</source>
        <translation>
            <numerusform>Mais %n identificador deveria ser alterado.</numerusform>
            <numerusform>Mais %n identificadores deveriam ser alterados.</numerusform>
        </translation>
    </message>
    <message>
        <source>Use &quot;%1&quot;</source>
        <translation>Usar &quot;%1&quot;</translation>
    </message>
    <message>
        <source>Use the proposed ids</source>
        <translation>Usar os identificadores propostos</translation>
    </message>
</context>
<context>
    <name>VelUI::EditActionsWidget</name>
    <message>
        <source>Add action</source>
        <translation>Adicionar ação</translation>
    </message>
    <message>
        <source>Edit action</source>
        <translation>Editar ação</translation>
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
        <translation>O &quot;;&quot; em &quot;%1&quot; não separa itens; ele passa a fazer parte de um item.</translation>
    </message>
    <message numerus="yes">
        <source>Make %n item(s) of it</source>
        <translation>
            <numerusform>Transformar em %n item</numerusform>
            <numerusform>Transformar em %n itens</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>VelUI::EditableListWidget</name>
    <message>
        <source>Add string</source>
        <translation>Adicionar texto</translation>
    </message>
    <message>
        <source>String:</source>
        <translation>Texto:</translation>
    </message>
    <message>
        <source>Edit string</source>
        <translation>Editar texto</translation>
    </message>
</context>
<context>
    <name>VelUI::EntryFormAssistance</name>
    <message>
        <source>Te&amp;xt</source>
        <comment>button: shows the file of the entry</comment>
        <translation>Te&amp;xto</translation>
    </message>
    <message>
        <source>Shows the file as it would be saved</source>
        <translation>Mostra o arquivo como seria salvo</translation>
    </message>
</context>
<context>
    <name>VelUI::EntryTextDialog</name>
    <message>
        <source>Text of the entry</source>
        <translation>Texto da entrada</translation>
    </message>
    <message>
        <source>The file as it would be saved</source>
        <translation>O arquivo como seria salvo</translation>
    </message>
    <message>
        <source>Nothing is changed.</source>
        <translation>Nada foi alterado.</translation>
    </message>
    <message>
        <source>≠ changed lines: %1, + new lines: %2, removed lines: %3</source>
        <translation>≠ linhas alteradas: %1, + linhas novas: %2, linhas removidas: %3</translation>
    </message>
</context>
<context>
    <name>VelUI::FieldChoosers</name>
    <message>
        <source>Choose %1</source>
        <comment>name of a &quot;Choose...&quot; button</comment>
        <translation>Escolher %1</translation>
    </message>
    <message>
        <source>Choose...</source>
        <translation>Escolher...</translation>
    </message>
    <message>
        <source>Chooses from all that are known (Alt+Down)</source>
        <translation>Escolhe entre todos os conhecidos (Alt+Seta para baixo)</translation>
    </message>
    <message>
        <source>Chooses an installed program (Alt+Down)</source>
        <translation>Escolhe um programa instalado (Alt+Seta para baixo)</translation>
    </message>
    <message>
        <source>Insert</source>
        <comment>button: a field code</comment>
        <translation>Inserir</translation>
    </message>
    <message>
        <source>Insert a field code</source>
        <translation>Inserir um código de campo</translation>
    </message>
    <message>
        <source>Inserts a code that stands for the files to open, or for a part of this entry</source>
        <translation>Insere um código que representa os arquivos a abrir ou uma parte desta entrada</translation>
    </message>
</context>
<context>
    <name>VelUI::FieldCodes</name>
    <message>
        <source>%f: one file; for several files the program is started several times</source>
        <translation>%f: um arquivo; para vários arquivos, o programa é iniciado várias vezes</translation>
    </message>
    <message>
        <source>%F: all files, each as a word of its own</source>
        <translation>%F: todos os arquivos, cada um como uma palavra separada</translation>
    </message>
    <message>
        <source>%u: one address (URL) or file; for several the program is started several times</source>
        <translation>%u: um endereço (URL) ou arquivo; para vários, o programa é iniciado várias vezes</translation>
    </message>
    <message>
        <source>%U: all addresses (URLs) or files, each as a word of its own</source>
        <translation>%U: todos os endereços (URLs) ou arquivos, cada um como uma palavra separada</translation>
    </message>
    <message>
        <source>%i: --icon and the icon of this entry, if it has one</source>
        <translation>%i: --icon e o ícone desta entrada, se ela tiver um</translation>
    </message>
    <message>
        <source>%c: the name of this entry, translated</source>
        <translation>%c: o nome desta entrada, traduzido</translation>
    </message>
    <message>
        <source>%k: where the file of this entry lies</source>
        <translation>%k: onde fica o arquivo desta entrada</translation>
    </message>
    <message>
        <source>%%: a percent sign</source>
        <translation>%%: um sinal de porcentagem</translation>
    </message>
</context>
<context>
    <name>VelUI::FindingLine</name>
    <message>
        <source>Fix</source>
        <translation>Corrigir</translation>
    </message>
    <message>
        <source>Fix: %1</source>
        <comment>on a button; %1 is what it does</comment>
        <translation>Corrigir: %1</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>how bad something is, and what it is</comment>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Erro</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Aviso</translation>
    </message>
    <message>
        <source>Hint</source>
        <translation>Dica</translation>
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
        <translation>Desfazer a alteração de %1</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Desfazer</translation>
    </message>
    <message>
        <source>Redo change of %1</source>
        <translation>Refazer a alteração de %1</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Refazer</translation>
    </message>
</context>
<context>
    <name>VelUI::FormLayout</name>
    <message>
        <source>Edit %1</source>
        <comment>name of a &quot;...&quot; button</comment>
        <translation>Editar %1</translation>
    </message>
</context>
<context>
    <name>VelUI::LanguageBar</name>
    <message>
        <source>&amp;Language:</source>
        <translation>&amp;Idioma:</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Idioma</translation>
    </message>
    <message>
        <source>Another language...</source>
        <translation>Outro idioma...</translation>
    </message>
    <message>
        <source>Another language</source>
        <translation>Outro idioma</translation>
    </message>
    <message>
        <source>Unknown language</source>
        <translation>Idioma desconhecido</translation>
    </message>
    <message>
        <source>%1 (%2), yours: %3 of %4 texts</source>
        <translation>%1 (%2), o seu: %3 de %4 textos</translation>
    </message>
    <message>
        <source>%1 (%2), yours: no text yet</source>
        <translation>%1 (%2), o seu: nenhum texto ainda</translation>
    </message>
    <message>
        <source>%1 (%2): %3 of %4 texts</source>
        <translation>%1 (%2): %3 de %4 textos</translation>
    </message>
    <message>
        <source>%1 (%2): no text yet</source>
        <translation>%1 (%2): nenhum texto ainda</translation>
    </message>
</context>
<context>
    <name>VelUI::LanguageDialog</name>
    <message>
        <source>Another language</source>
        <translation>Outro idioma</translation>
    </message>
    <message>
        <source>&amp;Language or its code, such as pt_BR:</source>
        <translation>&amp;Idioma ou seu código, por exemplo pt_BR:</translation>
    </message>
    <message>
        <source>Language or its code</source>
        <translation>Idioma ou seu código</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>a language and its code</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>No language has such a code: it is like de, pt_BR or sr@latin.</source>
        <translation>Nenhum idioma tem um código assim: ele é como de, pt_BR ou sr@latin.</translation>
    </message>
    <message>
        <source>The code %1 is well-formed, but no language of this name is known.</source>
        <translation>O código %1 está bem formado, mas não se conhece nenhum idioma com esse nome.</translation>
    </message>
</context>
<context>
    <name>VelUI::MimeTypeChooser</name>
    <message>
        <source>Choose MIME types</source>
        <translation>Escolher tipos MIME</translation>
    </message>
</context>
<context>
    <name>VelUI::MimeTypeSource</name>
    <message>
        <source>MIME type</source>
        <translation>Tipo MIME</translation>
    </message>
    <message>
        <source>Description</source>
        <translation>Descrição</translation>
    </message>
    <message>
        <source>File names</source>
        <translation>Nomes de arquivos</translation>
    </message>
    <message>
        <source>Not in the database</source>
        <translation>Não consta no banco de dados</translation>
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
        <translation>Escolher o caminho do executável do aplicativo</translation>
    </message>
</context>
<context>
    <name>VelUI::ProgramChooser</name>
    <message>
        <source>Choose a program</source>
        <translation>Escolher um programa</translation>
    </message>
</context>
<context>
    <name>VelUI::ProgramSource</name>
    <message>
        <source>Program</source>
        <comment>title of a column</comment>
        <translation>Programa</translation>
    </message>
    <message>
        <source>Folder</source>
        <comment>title of a column</comment>
        <translation>Pasta</translation>
    </message>
</context>
<context>
    <name>VelUI::RowFindings</name>
    <message numerus="yes">
        <source>And %n more.</source>
        <translation>
            <numerusform>E mais %n.</numerusform>
            <numerusform>E mais %n.</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>VelUI::TrialLine</name>
    <message>
        <source>Stop</source>
        <comment>button: ends the trial of an entry</comment>
        <translation>Parar</translation>
    </message>
    <message>
        <source>T&amp;ry</source>
        <comment>button: runs the entry</comment>
        <translation>Te&amp;star</translation>
    </message>
    <message>
        <source>Stops the trial</source>
        <translation>Interrompe o teste</translation>
    </message>
    <message>
        <source>Runs the entry as it is now, without saving it</source>
        <translation>Executa a entrada como está agora, sem salvá-la</translation>
    </message>
    <message>
        <source>The program vel-open, which runs entries, could not be started: %1</source>
        <translation>Não foi possível iniciar o programa vel-open, que executa as entradas: %1</translation>
    </message>
    <message>
        <source>The trial was stopped.</source>
        <translation>O teste foi interrompido.</translation>
    </message>
    <message>
        <source>The entry was started (exit status 0).</source>
        <translation>A entrada foi iniciada (status de saída 0).</translation>
    </message>
    <message>
        <source>The entry was started (exit status 0): %1</source>
        <translation>A entrada foi iniciada (status de saída 0): %1</translation>
    </message>
    <message>
        <source>The entry could not be started (exit status %1).</source>
        <translation>Não foi possível iniciar a entrada (status de saída %1).</translation>
    </message>
    <message>
        <source>The entry could not be started (exit status %1): %2</source>
        <translation>Não foi possível iniciar a entrada (status de saída %1): %2</translation>
    </message>
</context>
</TS>
