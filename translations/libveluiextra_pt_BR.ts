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
        <source>Hide</source>
        <translation>Ocultar</translation>
    </message>
    <message>
        <source>Show again</source>
        <translation>Mostrar novamente</translation>
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
        <source>Reload</source>
        <translation>Recarregar</translation>
    </message>
    <message>
        <source>This menu is empty. Press %1 for a new entry, or right-click here for what else can be added.</source>
        <translation>Este menu está vazio. Pressione %1 para uma nova entrada ou clique aqui com o botão direito para ver o que mais pode ser adicionado.</translation>
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
    <name>VelUI::FormLayout</name>
    <message>
        <source>Edit %1</source>
        <comment>name of a &quot;...&quot; button</comment>
        <translation>Editar %1</translation>
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
</TS>
