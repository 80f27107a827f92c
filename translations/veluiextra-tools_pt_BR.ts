<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="pt_BR" sourcelanguage="en">
<context>
    <name>DesktopEntryPages</name>
    <message>
        <source>&amp;Read-only</source>
        <translation>&amp;Somente leitura</translation>
    </message>
    <message>
        <source>&amp;Button beside the address</source>
        <translation>&amp;Botão ao lado do endereço</translation>
    </message>
    <message>
        <source>Information requested for %1</source>
        <translation>Informações solicitadas sobre %1</translation>
    </message>
    <message>
        <source>Use the buttons beside the fields to edit commands, files, icons, lists and actions.</source>
        <translation>Comandos e arquivos, ícones, listas e ações são editados com os botões de seus campos.</translation>
    </message>
    <message>
        <source>Properties form</source>
        <translation>Formulário de propriedades</translation>
    </message>
    <message>
        <source>Desktop entries</source>
        <translation>Entradas de desktop</translation>
    </message>
    <message>
        <source>Paths, icons, lists and actions</source>
        <translation>Caminhos, ícones, listas e ações</translation>
    </message>
    <message>
        <source>&amp;Assistance</source>
        <translation>&amp;Assistência</translation>
    </message>
</context>
<context>
    <name>EditorCommands</name>
    <message>
        <source>Open</source>
        <translation>Abrir</translation>
    </message>
    <message>
        <source>Cannot read %1.</source>
        <translation>Não foi possível ler %1.</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Salvar</translation>
    </message>
    <message>
        <source>Cannot write %1.</source>
        <translation>Não foi possível gravar %1.</translation>
    </message>
    <message>
        <source>Go to line</source>
        <translation>Ir para a linha</translation>
    </message>
    <message>
        <source>Line:</source>
        <translation>Linha:</translation>
    </message>
    <message>
        <source>File</source>
        <translation>Arquivo</translation>
    </message>
    <message>
        <source>&amp;New</source>
        <translation>&amp;Novo</translation>
    </message>
    <message>
        <source>&amp;Open...</source>
        <translation>A&amp;brir...</translation>
    </message>
    <message>
        <source>&amp;Save...</source>
        <translation>&amp;Salvar...</translation>
    </message>
    <message>
        <source>Insert &amp;date</source>
        <translation>Inserir &amp;data</translation>
    </message>
    <message>
        <source>Insert &amp;time</source>
        <translation>Inserir &amp;hora</translation>
    </message>
    <message>
        <source>Insert &amp;rule</source>
        <translation>Inserir &amp;linha separadora</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Editar</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>&amp;Desfazer</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>&amp;Refazer</translation>
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
        <translation>C&amp;olar</translation>
    </message>
    <message>
        <source>Select &amp;all</source>
        <translation>Selecion&amp;ar tudo</translation>
    </message>
    <message>
        <source>Select word</source>
        <translation>Selecionar palavra</translation>
    </message>
    <message>
        <source>Select line</source>
        <translation>Selecionar linha</translation>
    </message>
    <message>
        <source>Select paragraph</source>
        <translation>Selecionar parágrafo</translation>
    </message>
    <message>
        <source>Find selected a&amp;gain</source>
        <translation>Localizar próxima &amp;seleção</translation>
    </message>
    <message>
        <source>Find selected backward</source>
        <translation>Localizar seleção anterior</translation>
    </message>
    <message>
        <source>Find selected word</source>
        <translation>Localizar palavra selecionada</translation>
    </message>
    <message>
        <source>Find selected, matching case</source>
        <translation>Localizar seleção diferenciando maiúsculas</translation>
    </message>
    <message>
        <source>Go to &amp;line...</source>
        <translation>Ir para a &amp;linha...</translation>
    </message>
    <message>
        <source>Go to start</source>
        <translation>Ir para o início</translation>
    </message>
    <message>
        <source>Go to end</source>
        <translation>Ir para o fim</translation>
    </message>
    <message>
        <source>Go to next paragraph</source>
        <translation>Ir para o próximo parágrafo</translation>
    </message>
    <message>
        <source>Go to previous paragraph</source>
        <translation>Ir para o parágrafo anterior</translation>
    </message>
    <message>
        <source>Delete word to the left</source>
        <translation>Excluir palavra à esquerda</translation>
    </message>
    <message>
        <source>Delete word to the right</source>
        <translation>Excluir palavra à direita</translation>
    </message>
    <message>
        <source>Delete to start of line</source>
        <translation>Excluir até o início da linha</translation>
    </message>
    <message>
        <source>Delete to end of line</source>
        <translation>Excluir até o fim da linha</translation>
    </message>
    <message>
        <source>To upper case</source>
        <translation>Converter para maiúsculas</translation>
    </message>
    <message>
        <source>To lower case</source>
        <translation>Converter para minúsculas</translation>
    </message>
    <message>
        <source>Swap case</source>
        <translation>Inverter maiúsculas e minúsculas</translation>
    </message>
    <message>
        <source>Capitalize</source>
        <translation>Primeira letra maiúscula</translation>
    </message>
    <message>
        <source>Move line up</source>
        <translation>Mover linha para cima</translation>
    </message>
    <message>
        <source>Move line down</source>
        <translation>Mover linha para baixo</translation>
    </message>
    <message>
        <source>New line above</source>
        <translation>Nova linha acima</translation>
    </message>
    <message>
        <source>New line below</source>
        <translation>Nova linha abaixo</translation>
    </message>
    <message>
        <source>Duplicate lines</source>
        <translation>Duplicar linhas</translation>
    </message>
    <message>
        <source>Join lines</source>
        <translation>Juntar linhas</translation>
    </message>
    <message>
        <source>Sort lines</source>
        <translation>Ordenar linhas</translation>
    </message>
    <message>
        <source>Reverse lines</source>
        <translation>Inverter linhas</translation>
    </message>
    <message>
        <source>Remove duplicate lines</source>
        <translation>Remover linhas duplicadas</translation>
    </message>
    <message>
        <source>Remove empty lines</source>
        <translation>Remover linhas vazias</translation>
    </message>
    <message>
        <source>Trim lines</source>
        <translation>Aparar linhas</translation>
    </message>
    <message>
        <source>Indent lines</source>
        <translation>Recuar linhas</translation>
    </message>
    <message>
        <source>Unindent lines</source>
        <translation>Remover recuo das linhas</translation>
    </message>
    <message>
        <source>Comment lines</source>
        <translation>Comentar linhas</translation>
    </message>
    <message>
        <source>Uncomment lines</source>
        <translation>Descomentar linhas</translation>
    </message>
    <message>
        <source>Tabs to spaces</source>
        <translation>Tabulações em espaços</translation>
    </message>
    <message>
        <source>View</source>
        <translation>Exibir</translation>
    </message>
    <message>
        <source>Zoom &amp;in</source>
        <translation>Aument&amp;ar</translation>
    </message>
    <message>
        <source>Zoom &amp;out</source>
        <translation>&amp;Reduzir</translation>
    </message>
    <message>
        <source>&amp;Wrap lines</source>
        <translation>&amp;Quebra de linhas</translation>
    </message>
    <message>
        <source>&amp;Fixed-width font</source>
        <translation>Largura &amp;fixa</translation>
    </message>
    <message>
        <source>&amp;Proportional font</source>
        <translation>Largura &amp;proporcional</translation>
    </message>
    <message>
        <source>O&amp;verwrite</source>
        <translation>&amp;Sobrescrever</translation>
    </message>
    <message>
        <source>&amp;Read only</source>
        <translation>Somente &amp;leitura</translation>
    </message>
    <message>
        <source>Wide cur&amp;sor</source>
        <translation>Cursor lar&amp;go</translation>
    </message>
    <message>
        <source>&amp;Center on cursor</source>
        <translation>&amp;Centralizar no cursor</translation>
    </message>
    <message>
        <source>Scroll &amp;up</source>
        <translation>Rolar para c&amp;ima</translation>
    </message>
    <message>
        <source>Scroll &amp;down</source>
        <translation>Rolar para &amp;baixo</translation>
    </message>
    <message>
        <source>Scroll to &amp;top</source>
        <translation>Rolar até o iníci&amp;o</translation>
    </message>
    <message>
        <source>Scroll to botto&amp;m</source>
        <translation>Rolar até o fi&amp;m</translation>
    </message>
    <message>
        <source>Text</source>
        <translation>Texto</translation>
    </message>
    <message>
        <source>Keys</source>
        <translation>Teclas</translation>
    </message>
    <message>
        <source>The file has %1 for %2, but %3 has it, too.</source>
        <translation>O arquivo tem %1 para %2, mas %3 também o usa.</translation>
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
        <source>&amp;Export keys...</source>
        <translation>&amp;Exportar teclas...</translation>
    </message>
    <message>
        <source>&amp;Import keys...</source>
        <translation>&amp;Importar teclas...</translation>
    </message>
    <message>
        <source>Save cheat sheet as &amp;HTML...</source>
        <translation>Salvar &amp;a folha de consulta como HTML...</translation>
    </message>
    <message>
        <source>Save cheat sheet as te&amp;xt...</source>
        <translation>Salvar a folha de consulta como te&amp;xto...</translation>
    </message>
    <message>
        <source>&amp;Copy cheat sheet</source>
        <translation>&amp;Copiar a folha de consulta</translation>
    </message>
</context>
<context>
    <name>EntryWindow</name>
    <message>
        <source>Unsaved changes</source>
        <translation>Alterações não salvas</translation>
    </message>
    <message>
        <source>The entry %1 was changed.
Save the changes?</source>
        <translation>A entrada %1 foi alterada.
Deseja salvar as alterações?</translation>
    </message>
</context>
<context>
    <name>FileIconsPage</name>
    <message>
        <source>File icons</source>
        <translation>Ícones de arquivos</translation>
    </message>
    <message>
        <source>Models</source>
        <translation>Modelos</translation>
    </message>
</context>
<context>
    <name>GalleryWindow</name>
    <message>
        <source>Widget gallery</source>
        <translation>Galeria de widgets</translation>
    </message>
    <message>
        <source>Pages</source>
        <translation>Páginas</translation>
    </message>
    <message>
        <source>Code of this page</source>
        <translation>Código desta página</translation>
    </message>
</context>
<context>
    <name>KeyNamesPage</name>
    <message>
        <source>&amp;Press keys:</source>
        <translation>&amp;Pressione teclas:</translation>
    </message>
    <message>
        <source>In the window manager&apos;s notation:</source>
        <translation>Como o gerenciador de janelas as escreve:</translation>
    </message>
    <message>
        <source>Read back:</source>
        <translation>Lido de volta:</translation>
    </message>
    <message>
        <source>Global action with these keys:</source>
        <translation>Ação global com estas teclas:</translation>
    </message>
    <message>
        <source>Key names</source>
        <translation>Nomes de teclas</translation>
    </message>
    <message>
        <source>Shortcuts</source>
        <translation>Atalhos</translation>
    </message>
</context>
<context>
    <name>MenuPages</name>
    <message>
        <source>&amp;Pick an entry...</source>
        <translation>Es&amp;colher uma entrada...</translation>
    </message>
    <message>
        <source>Edit the &amp;menu...</source>
        <translation>Editar o &amp;menu...</translation>
    </message>
    <message>
        <source>Edit an e&amp;ntry...</source>
        <translation>Editar uma e&amp;ntrada...</translation>
    </message>
    <message>
        <source>Menu tree</source>
        <translation>Árvore do menu</translation>
    </message>
    <message>
        <source>Menus</source>
        <translation>Menus</translation>
    </message>
    <message>
        <source>Menu and entry dialogs</source>
        <translation>Diálogos de menu e de entrada</translation>
    </message>
    <message>
        <source>&amp;Assistance</source>
        <translation>&amp;Assistência</translation>
    </message>
</context>
<context>
    <name>RadioGroupBoxPage</name>
    <message>
        <source>&amp;Automatic configuration</source>
        <translation>Configuração &amp;automática</translation>
    </message>
    <message>
        <source>Script address:</source>
        <translation>Endereço do script:</translation>
    </message>
    <message>
        <source>Ask again at every start</source>
        <translation>Perguntar novamente a cada início</translation>
    </message>
    <message>
        <source>&amp;Manual configuration</source>
        <translation>Configuração &amp;manual</translation>
    </message>
    <message>
        <source>Host:</source>
        <translation>Máquina:</translation>
    </message>
    <message>
        <source>Port:</source>
        <translation>Porta:</translation>
    </message>
    <message>
        <source>Protocol:</source>
        <translation>Protocolo:</translation>
    </message>
    <message>
        <source>&amp;Direct connection</source>
        <translation>Conexão &amp;direta</translation>
    </message>
    <message>
        <source>There is nothing to set.</source>
        <translation>Nada precisa ser configurado.</translation>
    </message>
    <message>
        <source>Radio group boxes</source>
        <translation>Caixas de grupo com botão de opção</translation>
    </message>
    <message>
        <source>Widgets</source>
        <translation>Widgets</translation>
    </message>
</context>
<context>
    <name>SettingsPage</name>
    <message>
        <source>Settings file</source>
        <translation>Arquivo de configurações</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Configurações</translation>
    </message>
    <message>
        <source>F&amp;lat buttons</source>
        <translation>Botões &amp;planos</translation>
    </message>
    <message>
        <source>S&amp;ection:</source>
        <translation>S&amp;eção:</translation>
    </message>
    <message>
        <source>&amp;Font:</source>
        <translation>&amp;Fonte:</translation>
    </message>
    <message>
        <source>&amp;Size:</source>
        <translation>&amp;Tamanho:</translation>
    </message>
    <message>
        <source>Contents of the file on disk</source>
        <translation>Conteúdo do arquivo no disco</translation>
    </message>
    <message>
        <source>Name a settings file on the command line to edit it here.</source>
        <translation>Informe um arquivo de configurações na linha de comando para editá-lo aqui.</translation>
    </message>
    <message>
        <source>%1 cannot be opened.</source>
        <translation>Não foi possível abrir %1.</translation>
    </message>
</context>
<context>
    <name>ShortcutsPage</name>
    <message>
        <source>Delete the whole line</source>
        <translation>Excluir a linha inteira</translation>
    </message>
    <message>
        <source>Last command: %1</source>
        <translation>Último comando: %1</translation>
    </message>
    <message>
        <source>one line
another line
and a third one
</source>
        <translation>uma linha
outra linha
e uma terceira
</translation>
    </message>
    <message>
        <source>Go to the editor</source>
        <translation>Ir para o editor</translation>
    </message>
    <message>
        <source>View</source>
        <translation>Exibir</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Configurações</translation>
    </message>
    <message>
        <source>Configure shortcuts...</source>
        <translation>Configurar atalhos...</translation>
    </message>
    <message>
        <source>Shortcuts</source>
        <translation>Atalhos</translation>
    </message>
    <message>
        <source>Configure shortcuts in the plain dialog...</source>
        <translation>Configurar atalhos no diálogo simples...</translation>
    </message>
</context>
<context>
    <name>vel-entryedit</name>
    <message>
        <source>Edits a desktop entry.</source>
        <translation>Edita uma entrada de desktop.</translation>
    </message>
    <message>
        <source>Make a new entry when there is no such file.</source>
        <translation>Criar uma nova entrada se o arquivo não existir.</translation>
    </message>
    <message>
        <source>Begin with the values of the entry &lt;file&gt;.</source>
        <translation>Começar com os valores da entrada &lt;file&gt;.</translation>
    </message>
    <message>
        <source>Show the entry only.</source>
        <translation>Apenas mostrar a entrada.</translation>
    </message>
    <message>
        <source>The entry to edit.</source>
        <translation>A entrada a editar.</translation>
    </message>
    <message>
        <source>one file has to be named</source>
        <translation>é preciso informar um arquivo</translation>
    </message>
    <message>
        <source>cannot open %1</source>
        <translation>não foi possível abrir %1</translation>
    </message>
    <message>
        <source>cannot open %1: there is no such file, --create makes a new entry</source>
        <translation>não foi possível abrir %1: o arquivo não existe, --create cria uma nova entrada</translation>
    </message>
    <message>
        <source>cannot open %1: it is no regular file</source>
        <translation>não foi possível abrir %1: não é um arquivo comum</translation>
    </message>
    <message>
        <source>cannot open %1: %2</source>
        <translation>não foi possível abrir %1: %2</translation>
    </message>
</context>
<context>
    <name>vel-gallery</name>
    <message>
        <source>the page %1 did not finish loading</source>
        <translation>a página %1 não ficou pronta</translation>
    </message>
    <message>
        <source>cannot write %1</source>
        <translation>não foi possível gravar %1</translation>
    </message>
    <message>
        <source>cannot make the folder %1</source>
        <translation>não foi possível criar a pasta %1</translation>
    </message>
    <message>
        <source>Shows the library&apos;s widgets, dialogs and models in action.</source>
        <translation>Mostra os widgets, janelas e modelos da biblioteca em funcionamento.</translation>
    </message>
    <message>
        <source>Start with the page &lt;name&gt;.</source>
        <translation>Começar pela página &lt;name&gt;.</translation>
    </message>
    <message>
        <source>Write screenshots of every page, or of the page given with --page, to &lt;dir&gt; and exit.</source>
        <translation>Gravar em &lt;dir&gt; imagens de todas as páginas, ou da indicada com --page, e terminar.</translation>
    </message>
    <message>
        <source>The settings file that the settings page edits.</source>
        <translation>O arquivo de configurações que a página de configurações edita.</translation>
    </message>
    <message>
        <source>Widget gallery</source>
        <translation>Galeria de widgets</translation>
    </message>
    <message>
        <source>there is no page %1</source>
        <translation>não existe a página %1</translation>
    </message>
</context>
<context>
    <name>vel-menuedit</name>
    <message>
        <source>cannot create the start menu %1</source>
        <translation>não foi possível criar o menu Iniciar %1</translation>
    </message>
    <message>
        <source>no such directory: %1</source>
        <translation>esta pasta não existe: %1</translation>
    </message>
    <message>
        <source>not a directory: %1</source>
        <translation>não é uma pasta: %1</translation>
    </message>
    <message>
        <source>cannot read the directory %1</source>
        <translation>não foi possível ler a pasta %1</translation>
    </message>
    <message>
        <source>Edits the start menu, or picks an entry of it.</source>
        <translation>Edita o menu Iniciar ou escolhe uma de suas entradas.</translation>
    </message>
    <message>
        <source>Show the menu directory &lt;dir&gt; instead of the start menu.</source>
        <translation>Mostrar a pasta de menu &lt;dir&gt; em vez do menu Iniciar.</translation>
    </message>
    <message>
        <source>Show the desktop folder.</source>
        <translation>Mostrar a pasta da área de trabalho.</translation>
    </message>
    <message>
        <source>Show the tool bar.</source>
        <translation>Mostrar a barra de ferramentas.</translation>
    </message>
    <message>
        <source>Look only, change nothing.</source>
        <translation>Apenas olhar, sem alterar nada.</translation>
    </message>
    <message>
        <source>Show icons of &lt;pixels&gt; pixels.</source>
        <translation>Mostrar ícones de &lt;pixels&gt; pixels.</translation>
    </message>
    <message>
        <source>Pick an entry and print its path and its command line.</source>
        <translation>Escolher uma entrada e imprimir seu caminho e sua linha de comando.</translation>
    </message>
    <message>
        <source>unexpected argument: %1</source>
        <translation>argumento inesperado: %1</translation>
    </message>
    <message>
        <source>only one of --dir, --desktop and --toolbar can be given</source>
        <translation>somente uma das opções --dir, --desktop e --toolbar pode ser informada</translation>
    </message>
    <message>
        <source>--icon-size needs a number of pixels from 1 to 512, not &quot;%1&quot;</source>
        <translation>--icon-size precisa de um número de pixels de 1 a 512, não &quot;%1&quot;</translation>
    </message>
</context>
<context>
    <name>vel-menuprint</name>
    <message>
        <source>Prints a menu directory in its order.</source>
        <translation>Imprime uma pasta de menu em sua ordem.</translation>
    </message>
    <message>
        <source>The menu directory; the start menu when none is given.</source>
        <translation>A pasta de menu; o menu Iniciar se nenhuma for informada.</translation>
    </message>
    <message>
        <source>unknown format: %1</source>
        <translation>formato desconhecido: %1</translation>
    </message>
    <message>
        <source>more than one directory</source>
        <translation>mais de uma pasta</translation>
    </message>
    <message>
        <source>no such directory: %1</source>
        <translation>esta pasta não existe: %1</translation>
    </message>
    <message>
        <source>cannot read the directory %1</source>
        <translation>não foi possível ler a pasta %1</translation>
    </message>
    <message>
        <source>The menu has more than %1 items or %2 levels, and the rest of it is left out. Look for links that lead into the same folders again.</source>
        <translation>O menu tem mais de %1 itens ou %2 níveis; o restante foi omitido. Procure links que levem repetidamente às mesmas pastas.</translation>
    </message>
    <message>
        <source>What to print: %1. The default is text.</source>
        <translation>O que imprimir: %1. O padrão é text.</translation>
    </message>
    <message>
        <source>The icon theme to take the files of icons from; the user&apos;s own when none is given.</source>
        <translation>O tema de ícones do qual obter os arquivos dos ícones; o do próprio usuário se nenhum for informado.</translation>
    </message>
    <message>
        <source>The edge of the icons in pixels, 24 by default.</source>
        <translation>O lado dos ícones em pixels, 24 por padrão.</translation>
    </message>
    <message>
        <source>Reads one of the lines that rofi or dmenu was given from standard input and starts its entry.</source>
        <translation>Ler da entrada padrão uma das linhas passadas ao rofi ou ao dmenu e iniciar sua entrada.</translation>
    </message>
    <message>
        <source>the size of icons is not between 1 and %1</source>
        <translation>o tamanho dos ícones não está entre 1 e %1</translation>
    </message>
    <message>
        <source>The start menu is empty: no application is installed.</source>
        <translation>O menu Iniciar está vazio: nenhum aplicativo está instalado.</translation>
    </message>
    <message>
        <source>The start menu %1 cannot be made: %2</source>
        <translation>Não foi possível criar o menu Iniciar %1: %2</translation>
    </message>
    <message>
        <source>%1 is left out, as the line end in its name cannot be written in this format. Rename it.</source>
        <translation>%1 foi omitido, pois a quebra de linha em seu nome não pode ser escrita neste formato. Renomeie-o.</translation>
    </message>
    <message>
        <source>The start menu is empty: nothing in %1 is shown.</source>
        <translation>O menu Iniciar está vazio: nada em %1 é exibido.</translation>
    </message>
    <message>
        <source>cannot run vel-open: %1</source>
        <translation>não foi possível executar vel-open: %1</translation>
    </message>
    <message>
        <source>There is no &quot;%1&quot; in the menu.</source>
        <translation>Não há &quot;%1&quot; no menu.</translation>
    </message>
</context>
<context>
    <name>vel-wmbridge</name>
    <message>
        <source>Owns the window manager&apos;s command channel on a desktop that has none, and runs a command of the shell for each kind of update. The variable VEL_COMMAND holds the line that came.</source>
        <translation>Mantém o canal de comandos do gerenciador de janelas em um ambiente que não tem um e executa um comando do shell para cada tipo de atualização. A variável VEL_COMMAND contém a linha recebida.</translation>
    </message>
    <message>
        <source>Run when the start menu has changed.</source>
        <translation>Executar quando o menu Iniciar for alterado.</translation>
    </message>
    <message>
        <source>Run when the tool bar has changed.</source>
        <translation>Executar quando a barra de ferramentas for alterada.</translation>
    </message>
    <message>
        <source>Run when the desktop&apos;s entries have changed.</source>
        <translation>Executar quando as entradas da área de trabalho forem alteradas.</translation>
    </message>
    <message>
        <source>Run for every other line.</source>
        <translation>Executar para qualquer outra linha.</translation>
    </message>
    <message>
        <source>Take the channel from the program that has it.</source>
        <translation>Tomar o canal do programa que o tem.</translation>
    </message>
    <message>
        <source>unexpected argument: %1</source>
        <translation>argumento inesperado: %1</translation>
    </message>
    <message>
        <source>cannot run the command for %1</source>
        <translation>não foi possível executar o comando para %1</translation>
    </message>
    <message>
        <source>another program has taken the channel</source>
        <translation>outro programa tomou o canal</translation>
    </message>
    <message>
        <source>cannot take the channel: there is no display, or another program has it</source>
        <translation>não foi possível tomar o canal: não há tela ou outro programa o tem</translation>
    </message>
    <message>
        <source>unknown window manager: %1 (known are %2)</source>
        <translation>gerenciador de janelas desconhecido: %1 (os conhecidos são %2)</translation>
    </message>
    <message>
        <source>Do what this window manager needs to show the start menu as it is: %1.</source>
        <translation>Fazer o que este gerenciador de janelas precisa para mostrar o menu Iniciar como ele é: %1.</translation>
    </message>
</context>
</TS>
