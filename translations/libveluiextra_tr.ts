<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="tr" sourcelanguage="en">
<context>
    <name>ActionListEdit</name>
    <message>
        <source>Form</source>
        <translation>Form</translation>
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
        <translation>Git</translation>
    </message>
    <message>
        <source>Go to action &apos;%1&apos;</source>
        <translation>&apos;%1&apos; eylemine git</translation>
    </message>
    <message>
        <source>Take over</source>
        <translation>Devral</translation>
    </message>
    <message>
        <source>Take over &apos;%1&apos; from action &apos;%2&apos;</source>
        <translation>&apos;%1&apos; kısayolunu &apos;%2&apos; eyleminden devral</translation>
    </message>
    <message>
        <source>Further clashes: %1</source>
        <translation>Diğer çakışmalar: %1</translation>
    </message>
</context>
<context>
    <name>EditActionsDialog</name>
    <message>
        <source>Actions</source>
        <translation>Eylemler</translation>
    </message>
</context>
<context>
    <name>EditActionsWidget</name>
    <message>
        <source>Form</source>
        <translation>Form</translation>
    </message>
    <message>
        <source>Add...</source>
        <translation>Ekle...</translation>
    </message>
    <message>
        <source>Edit...</source>
        <translation>Düzenle...</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Sil</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>Yukarı</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>Aşağı</translation>
    </message>
</context>
<context>
    <name>EditShortcutsAssistance</name>
    <message>
        <source>Schemes</source>
        <translation>Şemalar</translation>
    </message>
    <message>
        <source>No action matches the filter.</source>
        <translation>Süzgece uyan eylem yok.</translation>
    </message>
    <message>
        <source>No action has the shortcut %1.</source>
        <translation>%1 kısayolu olan eylem yok.</translation>
    </message>
</context>
<context>
    <name>EditShortcutsDialog</name>
    <message>
        <source>None</source>
        <translation>Hiçbiri</translation>
    </message>
    <message>
        <source>Configure shortcuts</source>
        <translation>Kısayolları yapılandır</translation>
    </message>
    <message>
        <source>Choose a key for selected action</source>
        <translation>Seçili eylem için bir tuş seçin</translation>
    </message>
    <message>
        <source>Default key:</source>
        <translation>Öntanımlı tuş:</translation>
    </message>
    <message>
        <source>Assign key:</source>
        <translation>Tuş ata:</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for global action &apos;%2&apos;.</source>
        <translation>&apos;%1&apos; kısayolu zaten &apos;%2&apos; genel eylemi için kullanılıyor.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for action &apos;%2&apos;. Please try another.</source>
        <translation>&apos;%1&apos; kısayolu zaten &apos;%2&apos; eylemi için kullanılıyor. Lütfen başka bir tane deneyin.</translation>
    </message>
    <message>
        <source>Shortcuts conflict</source>
        <translation>Kısayol çakışması</translation>
    </message>
    <message>
        <source>Apply changes</source>
        <translation>Değişiklikleri uygula</translation>
    </message>
    <message>
        <source>Some shortcuts have been changed. Do you want to apply changes?</source>
        <translation>Bazı kısayollar değiştirildi. Değişiklikleri uygulamak istiyor musunuz?</translation>
    </message>
</context>
<context>
    <name>EditStringsDialog</name>
    <message>
        <source>Strings</source>
        <translation>Dizgeler</translation>
    </message>
</context>
<context>
    <name>EditableListWidget</name>
    <message>
        <source>Form</source>
        <translation>Form</translation>
    </message>
    <message>
        <source>Add...</source>
        <translation>Ekle...</translation>
    </message>
    <message>
        <source>Edit...</source>
        <translation>Düzenle...</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Sil</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>Yukarı</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>Aşağı</translation>
    </message>
</context>
<context>
    <name>EntryCheck</name>
    <message>
        <source>The condition &apos;%1&apos; needs a file.</source>
        <translation>&apos;%1&apos; koşulu için bir dosya gerekiyor.</translation>
    </message>
    <message>
        <source>The file of the condition &apos;%1&apos; is one in the folder of settings, without &apos;/&apos; before it.</source>
        <translation>&apos;%1&apos; koşulunun dosyası ayarlar klasöründedir ve önüne &apos;/&apos; konmaz.</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs a key.</source>
        <translation>&apos;%1&apos; koşulu için bir anahtar gerekiyor.</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs &apos;if-session&apos; or &apos;unless-session&apos; and a session.</source>
        <translation>&apos;%1&apos; koşulu için &apos;if-session&apos; veya &apos;unless-session&apos; ile bir oturum gerekiyor.</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs a schema and a key.</source>
        <translation>&apos;%1&apos; koşulu için bir şema ve bir anahtar gerekiyor.</translation>
    </message>
    <message>
        <source>There is no condition &apos;%1&apos;.</source>
        <translation>&apos;%1&apos; diye bir koşul yok.</translation>
    </message>
    <message>
        <source>A category is empty.</source>
        <translation>Kategorilerden biri boş.</translation>
    </message>
    <message>
        <source>There is no registered category &apos;%1&apos;; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>Kayıtlı bir &apos;%1&apos; kategorisi yok; size özel bir kategori &apos;X-&apos; ile başlamalıdır.</translation>
    </message>
    <message>
        <source>Change it to &apos;%1&apos;</source>
        <translation>&apos;%1&apos; olarak değiştir</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; also needs: %2.</source>
        <translation>&apos;%1&apos; kategorisi şunu da gerektirir: %2.</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; goes with one of these: %2.</source>
        <translation>&apos;%1&apos; kategorisi şunlardan biriyle birlikte kullanılır: %2.</translation>
    </message>
    <message>
        <source>Add &apos;%1&apos;</source>
        <translation>&apos;%1&apos; ekle</translation>
    </message>
    <message>
        <source>Remove it</source>
        <translation>Kaldır</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; is out of use.</source>
        <translation>&apos;%1&apos; kategorisi artık kullanılmıyor.</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; is only for entries that list desktops in &apos;Only show in&apos;.</source>
        <translation>&apos;%1&apos; kategorisi yalnızca &apos;Yalnızca şurada göster&apos; alanında masaüstü belirten girdiler içindir.</translation>
    </message>
    <message>
        <source>No main category is among them, so menus may not know where to show the entry.</source>
        <translation>Aralarında ana kategori yok; menüler girdiyi nerede göstereceğini bilemeyebilir.</translation>
    </message>
    <message>
        <source>Several main categories are among them, so the entry may be shown more than once.</source>
        <translation>Aralarında birkaç ana kategori var; girdi birden çok kez gösterilebilir.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; stands more than once.</source>
        <translation>&apos;%1&apos; birden çok kez geçiyor.</translation>
    </message>
    <message>
        <source>Keep the first</source>
        <translation>İlkini bırak</translation>
    </message>
    <message>
        <source>The application has no command.</source>
        <translation>Uygulamanın komutu yok.</translation>
    </message>
    <message>
        <source>The link leads nowhere.</source>
        <translation>Bağ hiçbir yere götürmüyor.</translation>
    </message>
    <message>
        <source>A quote is not closed.</source>
        <translation>Bir tırnak kapatılmamış.</translation>
    </message>
    <message>
        <source>In quotes, a backslash has to stand before &apos;%1&apos;.</source>
        <translation>Tırnak içinde &apos;%1&apos; önüne ters bölü konmalıdır.</translation>
    </message>
    <message>
        <source>The command ends in a single backslash, which stands for nothing.</source>
        <translation>Komut, hiçbir anlamı olmayan tek bir ters bölü ile bitiyor.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has to stand in double quotes.</source>
        <translation>&apos;%1&apos; çift tırnak içinde olmalıdır.</translation>
    </message>
    <message>
        <source>Close the quote</source>
        <translation>Tırnağı kapat</translation>
    </message>
    <message>
        <source>Put it in quotes</source>
        <translation>Tırnak içine al</translation>
    </message>
    <message>
        <source>Have a shell run it</source>
        <translation>Kabuğa çalıştır</translation>
    </message>
    <message>
        <source>Write &apos;%&apos; as &apos;%%&apos;</source>
        <translation>&apos;%&apos; yerine &apos;%%&apos; yaz</translation>
    </message>
    <message>
        <source>A field code is not complete: &apos;%&apos; ends the command.</source>
        <translation>Bir alan kodu eksik: komut &apos;%&apos; ile bitiyor.</translation>
    </message>
    <message>
        <source>There is no field code &apos;%%1&apos;.</source>
        <translation>&apos;%%1&apos; diye bir alan kodu yok.</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; is out of use; nothing is put in its place.</source>
        <translation>&apos;%%1&apos; alan kodu artık kullanılmıyor; yerine hiçbir şey konmaz.</translation>
    </message>
    <message>
        <source>Only one of &apos;%f&apos;, &apos;%F&apos;, &apos;%u&apos; and &apos;%U&apos; may stand in a command, and once.</source>
        <translation>Bir komutta &apos;%f&apos;, &apos;%F&apos;, &apos;%u&apos; ve &apos;%U&apos; kodlarından yalnızca biri ve yalnızca bir kez bulunabilir.</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; stands more than once.</source>
        <translation>&apos;%%1&apos; alan kodu birden çok kez geçiyor.</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; has to be an argument of its own, not in quotes.</source>
        <translation>&apos;%%1&apos; alan kodu tırnak içinde değil, ayrı bir argüman olmalıdır.</translation>
    </message>
    <message>
        <source>The path of the program has a blank: it has to stand in quotes.</source>
        <translation>Programın yolunda boşluk var: tırnak içinde olmalıdır.</translation>
    </message>
    <message>
        <source>There is no program &apos;%1&apos;.</source>
        <translation>&apos;%1&apos; diye bir program yok.</translation>
    </message>
    <message>
        <source>The command has to begin with a program.</source>
        <translation>Komut bir programla başlamalıdır.</translation>
    </message>
    <message>
        <source>&apos;Try exec&apos; takes the program alone, without quotes and arguments.</source>
        <translation>&apos;Denenecek komut&apos; yalnızca programı alır; tırnak ve argüman almaz.</translation>
    </message>
    <message>
        <source>Keep the program</source>
        <translation>Yalnızca programı bırak</translation>
    </message>
    <message>
        <source>There is no program &apos;%1&apos;, so the entry is not shown.</source>
        <translation>&apos;%1&apos; diye bir program olmadığı için girdi gösterilmiyor.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is missing.</source>
        <translation>&apos;%1&apos; eksik.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has translations only, and nothing for all other languages.</source>
        <translation>&apos;%1&apos; için yalnızca çeviriler var, diğer diller için bir değer yok.</translation>
    </message>
    <message>
        <source>Take &apos;%1&apos;</source>
        <translation>&apos;%1&apos; kullan</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is only for entries of the type &apos;%2&apos;.</source>
        <translation>&apos;%1&apos; yalnızca &apos;%2&apos; türündeki girdiler içindir.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is out of use here.</source>
        <translation>&apos;%1&apos; burada artık kullanılmıyor.</translation>
    </message>
    <message>
        <source>No key can be called &apos;%1&apos;.</source>
        <translation>Hiçbir anahtarın adı &apos;%1&apos; olamaz.</translation>
    </message>
    <message>
        <source>There is no key &apos;%1&apos; here; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>Burada &apos;%1&apos; diye bir anahtar yok; size özel bir anahtar &apos;X-&apos; ile başlamalıdır.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; cannot be translated.</source>
        <translation>&apos;%1&apos; çevrilemez.</translation>
    </message>
    <message>
        <source>&apos;Only show in&apos; and &apos;Not show in&apos; exclude each other.</source>
        <translation>&apos;Yalnızca şurada göster&apos; ve &apos;Şurada gösterme&apos; birbirini dışlar.</translation>
    </message>
    <message>
        <source>The file is empty.</source>
        <translation>Dosya boş.</translation>
    </message>
    <message>
        <source>The first group of the file is not &apos;[Desktop Entry]&apos;.</source>
        <translation>Dosyanın ilk grubu &apos;[Desktop Entry]&apos; değil.</translation>
    </message>
    <message>
        <source>The name of the file has to end in &apos;.%1&apos;.</source>
        <translation>Dosyanın adı &apos;.%1&apos; ile bitmelidir.</translation>
    </message>
    <message>
        <source>Lines of the file end in a carriage return.</source>
        <translation>Dosyanın satırları satır başı karakteriyle bitiyor.</translation>
    </message>
    <message>
        <source>A line of the file says nothing: %1</source>
        <translation>Dosyanın bir satırı hiçbir şey belirtmiyor: %1</translation>
    </message>
    <message>
        <source>A line of the file stands before all groups: %1</source>
        <translation>Dosyanın bir satırı tüm grupların önünde duruyor: %1</translation>
    </message>
    <message>
        <source>A line of the file begins with a blank: %1</source>
        <translation>Dosyanın bir satırı boşlukla başlıyor: %1</translation>
    </message>
    <message>
        <source>A blank stands behind a group: %1</source>
        <translation>Bir grubun ardında boşluk var: %1</translation>
    </message>
    <message>
        <source>The group &apos;%1&apos; stands more than once.</source>
        <translation>&apos;%1&apos; grubu birden çok kez geçiyor.</translation>
    </message>
    <message>
        <source>No group can be called &apos;%1&apos;.</source>
        <translation>Hiçbir grubun adı &apos;%1&apos; olamaz.</translation>
    </message>
    <message>
        <source>The group &apos;%1&apos; is out of use.</source>
        <translation>&apos;%1&apos; grubu artık kullanılmıyor.</translation>
    </message>
    <message>
        <source>There is no group &apos;%1&apos;; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>&apos;%1&apos; diye bir grup yok; size özel bir grup &apos;X-&apos; ile başlamalıdır.</translation>
    </message>
    <message>
        <source>The id &apos;%1&apos; of an action may only have letters A to Z, digits and &apos;-&apos;.</source>
        <translation>Bir eylemin &apos;%1&apos; kimliğinde yalnızca A ile Z arası harfler, rakamlar ve &apos;-&apos; bulunabilir.</translation>
    </message>
    <message>
        <source>The action &apos;%1&apos; is described, but &apos;Actions&apos; does not name it.</source>
        <translation>&apos;%1&apos; eylemi tanımlanmış, ama &apos;Actions&apos; alanında adı geçmiyor.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: it has no &apos;/&apos;.</source>
        <translation>&apos;%1&apos; bir MIME türü değil: &apos;/&apos; yok.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: nothing stands behind the &apos;/&apos;.</source>
        <translation>&apos;%1&apos; bir MIME türü değil: &apos;/&apos; işaretinden sonra bir şey yok.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: there is no kind &apos;%2&apos;.</source>
        <translation>&apos;%1&apos; bir MIME türü değil: &apos;%2&apos; diye bir sınıf yok.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: it has a character that none has.</source>
        <translation>&apos;%1&apos; bir MIME türü değil: hiçbirinde bulunmayan bir karakter içeriyor.</translation>
    </message>
    <message>
        <source>MIME types like &apos;%1&apos; are not used for files.</source>
        <translation>&apos;%1&apos; gibi MIME türleri dosyalar için kullanılmaz.</translation>
    </message>
    <message>
        <source>This computer does not know the MIME type &apos;%1&apos;.</source>
        <translation>Bu bilgisayar &apos;%1&apos; MIME türünü tanımıyor.</translation>
    </message>
    <message>
        <source>An action has no id.</source>
        <translation>Eylemlerden birinin kimliği yok.</translation>
    </message>
    <message>
        <source>Nothing says what the action &apos;%1&apos; is.</source>
        <translation>&apos;%1&apos; eyleminin ne olduğu hiçbir yerde belirtilmemiş.</translation>
    </message>
    <message>
        <source>There is no registered desktop &apos;%1&apos;; others have to begin with &apos;X-&apos;.</source>
        <translation>Kayıtlı bir &apos;%1&apos; masaüstü yok; diğerleri &apos;X-&apos; ile başlamalıdır.</translation>
    </message>
    <message>
        <source>In your language the entry is shown as &apos;%1&apos;.</source>
        <translation>Sizin dilinizde girdi &apos;%1&apos; olarak gösteriliyor.</translation>
    </message>
    <message>
        <source>The comment says no more than the name.</source>
        <translation>Yorum, addan fazlasını söylemiyor.</translation>
    </message>
    <message>
        <source>The comment says no more than the generic name.</source>
        <translation>Yorum, genel addan fazlasını söylemiyor.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is out of use here; it has to be &apos;true&apos; or &apos;false&apos;.</source>
        <translation>&apos;%1&apos; burada artık kullanılmıyor; &apos;true&apos; veya &apos;false&apos; olmalıdır.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has to be &apos;true&apos; or &apos;false&apos;.</source>
        <translation>&apos;%1&apos; için değer &apos;true&apos; veya &apos;false&apos; olmalıdır.</translation>
    </message>
    <message>
        <source>Change it to &apos;true&apos;</source>
        <translation>&apos;true&apos; olarak değiştir</translation>
    </message>
    <message>
        <source>The name of an icon has no suffix like &apos;%1&apos;.</source>
        <translation>Bir simgenin adında &apos;%1&apos; gibi bir uzantı olmaz.</translation>
    </message>
    <message>
        <source>Remove the suffix</source>
        <translation>Uzantıyı kaldır</translation>
    </message>
    <message>
        <source>No icon theme has an icon &apos;%1&apos;.</source>
        <translation>Hiçbir simge temasında &apos;%1&apos; simgesi yok.</translation>
    </message>
    <message>
        <source>Write the folder in full</source>
        <translation>Klasörün tam yolunu yaz</translation>
    </message>
    <message>
        <source>The address does not say how to reach it, as &apos;https:&apos; and &apos;file:&apos; do.</source>
        <translation>Adres, &apos;https:&apos; ve &apos;file:&apos; gibi, kendisine nasıl ulaşılacağını belirtmiyor.</translation>
    </message>
    <message>
        <source>The text is not encoded in UTF-8.</source>
        <translation>Metin UTF-8 ile kodlanmamış.</translation>
    </message>
    <message>
        <source>A control character or tab may not stand here.</source>
        <translation>Burada denetim karakteri veya sekme bulunamaz.</translation>
    </message>
    <message>
        <source>The type has to be &apos;Application&apos;, &apos;Link&apos; or &apos;Directory&apos;, not &apos;%1&apos;.</source>
        <translation>Tür &apos;Application&apos;, &apos;Link&apos; veya &apos;Directory&apos; olmalıdır, &apos;%1&apos; değil.</translation>
    </message>
    <message>
        <source>There is no version &apos;%1&apos; of the standard.</source>
        <translation>Standardın &apos;%1&apos; diye bir sürümü yok.</translation>
    </message>
    <message>
        <source>There is no encoding &apos;%1&apos;.</source>
        <translation>&apos;%1&apos; diye bir kodlama yok.</translation>
    </message>
    <message>
        <source>There is no picture &apos;%1&apos;.</source>
        <translation>&apos;%1&apos; diye bir resim yok.</translation>
    </message>
    <message>
        <source>An icon has a name or a path that begins with &apos;/&apos;.</source>
        <translation>Simge bir ad veya &apos;/&apos; ile başlayan bir yol olmalıdır.</translation>
    </message>
    <message>
        <source>The path of a folder begins with &apos;/&apos;.</source>
        <translation>Bir klasörün yolu &apos;/&apos; ile başlar.</translation>
    </message>
    <message>
        <source>There is no folder &apos;%1&apos;.</source>
        <translation>&apos;%1&apos; diye bir klasör yok.</translation>
    </message>
    <message>
        <source>There is no file &apos;%1&apos;.</source>
        <translation>&apos;%1&apos; diye bir dosya yok.</translation>
    </message>
    <message>
        <source>D-Bus cannot start &apos;%1&apos;: a file of a name like &apos;org.example.Program.desktop&apos; is needed.</source>
        <translation>D-Bus &apos;%1&apos; girdisini başlatamaz: &apos;org.example.Program.desktop&apos; gibi bir adı olan bir dosya gerekiyor.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no name of an interface; such names are like &apos;org.example.Viewer&apos;.</source>
        <translation>&apos;%1&apos; bir arayüz adı değil; böyle adlar &apos;org.example.Viewer&apos; gibidir.</translation>
    </message>
</context>
<context>
    <name>EntryTrial</name>
    <message>
        <source>The entry could not be written to a temporary file.</source>
        <translation>Girdi geçici bir dosyaya yazılamadı.</translation>
    </message>
</context>
<context>
    <name>KeyAssistance</name>
    <message>
        <source>Press the keys of the shortcut. Tab leaves the field.</source>
        <translation>Kısayolun tuşlarına basın. Tab alandan çıkar.</translation>
    </message>
    <message>
        <source>Key for action &apos;%1&apos;</source>
        <translation>&apos;%1&apos; eylemi için tuş</translation>
    </message>
    <message>
        <source>None: no key for action &apos;%1&apos;</source>
        <translation>Hiçbiri: &apos;%1&apos; eylemi için tuş yok</translation>
    </message>
    <message>
        <source>What speaks against the key for action &apos;%1&apos;</source>
        <translation>&apos;%1&apos; eyleminin tuşuna karşı olanlar</translation>
    </message>
</context>
<context>
    <name>KeyDescription</name>
    <message>
        <source>Whether the entry starts a program, opens an address or describes a folder of the menu.</source>
        <translation>Girdinin bir program mı başlattığı, bir adres mi açtığı, yoksa menünün bir klasörünü mü tanımladığı.</translation>
    </message>
    <message>
        <source>The name that menus show.</source>
        <translation>Menülerin gösterdiği ad.</translation>
    </message>
    <message>
        <source>The icon that menus show: a name from the icon theme, or the full path of a picture.</source>
        <translation>Menülerin gösterdiği simge: simge temasından bir ad veya bir resmin tam yolu.</translation>
    </message>
    <message>
        <source>The command that starts the program, with codes such as %f for the files that it opens.</source>
        <translation>Programı başlatan komut; açacağı dosyalar için %f gibi kodlar içerebilir.</translation>
    </message>
    <message>
        <source>Whether the program needs a terminal window.</source>
        <translation>Programın bir uçbirim penceresi gerektirip gerektirmediği.</translation>
    </message>
    <message>
        <source>The folder in which the program starts.</source>
        <translation>Programın başlatıldığı klasör.</translation>
    </message>
    <message>
        <source>A program that has to be installed; without it menus leave the entry out.</source>
        <translation>Kurulu olması gereken bir program; o yoksa menüler girdiyi göstermez.</translation>
    </message>
    <message>
        <source>The address that the entry opens.</source>
        <translation>Girdinin açtığı adres.</translation>
    </message>
    <message>
        <source>What kind of program it is, such as: Web browser.</source>
        <translation>Programın ne tür bir program olduğu, örneğin: Web tarayıcısı.</translation>
    </message>
    <message>
        <source>A sentence about the program, which menus show as a tip.</source>
        <translation>Program hakkında, menülerin ipucu olarak gösterdiği bir cümle.</translation>
    </message>
    <message>
        <source>Whether menus leave the entry out although the program can be used.</source>
        <translation>Program kullanılabildiği hâlde menülerin girdiyi dışarıda bırakıp bırakmayacağı.</translation>
    </message>
    <message>
        <source>Whether the entry counts as deleted.</source>
        <translation>Girdinin silinmiş sayılıp sayılmayacağı.</translation>
    </message>
    <message>
        <source>The desktop environments that alone show the entry; none means all.</source>
        <translation>Girdiyi gösteren tek masaüstü ortamları; hiçbiri yoksa tümü gösterir.</translation>
    </message>
    <message>
        <source>The desktop environments that do not show the entry.</source>
        <translation>Girdiyi göstermeyen masaüstü ortamları.</translation>
    </message>
    <message>
        <source>The types of files that the program opens.</source>
        <translation>Programın açtığı dosya türleri.</translation>
    </message>
    <message>
        <source>The groups of the menu that the program belongs to.</source>
        <translation>Programın ait olduğu menü grupları.</translation>
    </message>
    <message>
        <source>Words by which a search finds the program beside its name.</source>
        <translation>Bir aramanın, adının yanı sıra programı bulmasını sağlayan sözcükler.</translation>
    </message>
    <message>
        <source>Whether the program tells when it has started, so that the pointer shows it until then.</source>
        <translation>Programın başladığını bildirip bildirmediği; bildirirse imleç o ana kadar bunu gösterir.</translation>
    </message>
    <message>
        <source>The class of the window by which the desktop knows that the program has started.</source>
        <translation>Masaüstünün programın başladığını anlamasını sağlayan pencere sınıfı.</translation>
    </message>
    <message>
        <source>Further things that the program can be started for, such as: New window.</source>
        <translation>Programın başlatılabileceği diğer işler, örneğin: Yeni pencere.</translation>
    </message>
    <message>
        <source>The version of the standard for entries that this one follows.</source>
        <translation>Bu girdinin uyduğu girdi standardının sürümü.</translation>
    </message>
    <message>
        <source>%1 Only for users of one language.</source>
        <comment>%1 is a sentence about a key</comment>
        <translation>%1 Yalnızca tek bir dilin kullanıcıları için.</translation>
    </message>
</context>
<context>
    <name>LanguageNote</name>
    <message>
        <source>Users of %1 see these texts.</source>
        <translation>%1 kullananlar bu metinleri görür.</translation>
    </message>
    <message>
        <source>Users of %1 see these texts, and those of %2 where one is missing.</source>
        <translation>%1 kullananlar bu metinleri, eksik olanların yerine %2 metinlerini görür.</translation>
    </message>
    <message>
        <source>Users of %1 see these texts, and those without a language where one is missing.</source>
        <translation>%1 kullananlar bu metinleri, eksik olanların yerine dili belirtilmemiş metinleri görür.</translation>
    </message>
    <message>
        <source>Users of %1 see the texts of %2.</source>
        <translation>%1 kullananlar %2 metinlerini görür.</translation>
    </message>
    <message>
        <source>Users of %1 see the texts without a language.</source>
        <translation>%1 kullananlar dili belirtilmemiş metinleri görür.</translation>
    </message>
    <message>
        <source>%1 Texts of their own have: %2.</source>
        <comment>%1 is a sentence, %2 a list of languages</comment>
        <translation>%1 Kendi metinleri olanlar: %2.</translation>
    </message>
</context>
<context>
    <name>MenuDeletion</name>
    <message>
        <source>There is no trash for %1. It would be deleted for good: this cannot be undone. Delete it?</source>
        <translation>%1 için çöp kutusu yok. Kalıcı olarak silinir, bu geri alınamaz. Silinsin mi?</translation>
    </message>
    <message numerus="yes">
        <source>There is no trash for %n of these items. They would be deleted for good: this cannot be undone. Delete them?</source>
        <translation>
            <numerusform>Bu ögelerden %n tanesi için çöp kutusu yok. Kalıcı olarak silinirler, bu geri alınamaz. Silinsinler mi?</numerusform>
        </translation>
    </message>
    <message>
        <source>%1 cannot be deleted: %2</source>
        <translation>%1 silinemiyor: %2</translation>
    </message>
    <message numerus="yes">
        <source>The deletion was canceled. %n items are still there, in whole or in part.</source>
        <translation>
            <numerusform>Silme işlemi iptal edildi. %n öge tümüyle veya kısmen hâlâ duruyor.</numerusform>
        </translation>
    </message>
    <message>
        <source>The deletion was canceled. Still there, in whole or in part: %1.</source>
        <translation>Silme işlemi iptal edildi. Tümüyle veya kısmen hâlâ duranlar: %1.</translation>
    </message>
</context>
<context>
    <name>MenuDrop</name>
    <message>
        <source>The folder &apos;%1&apos; already has &apos;%2&apos;. Keep both gives the new one another file name, Replace puts the old one into the trash, Skip leaves the new one where it is; Cancel leaves everything as it is.</source>
        <translation>&apos;%1&apos; klasöründe &apos;%2&apos; zaten var. &apos;İkisini de tut&apos; yenisine başka bir dosya adı verir, &apos;Değiştir&apos; eskisini çöp kutusuna atar, &apos;Atla&apos; yenisini olduğu yerde bırakır; &apos;İptal&apos; her şeyi olduğu gibi bırakır.</translation>
    </message>
    <message>
        <source>The folder &apos;%1&apos; already has &apos;%2&apos;, which the new one comes from. Keep both gives the new one another file name, Skip leaves it where it is; Cancel leaves everything as it is.</source>
        <translation>&apos;%1&apos; klasöründe, yenisinin de kaynağı olan &apos;%2&apos; zaten var. &apos;İkisini de tut&apos; yenisine başka bir dosya adı verir, &apos;Atla&apos; onu olduğu yerde bırakır; &apos;İptal&apos; her şeyi olduğu gibi bırakır.</translation>
    </message>
    <message>
        <source>Another one that comes to the folder &apos;%1&apos; has the same file name as &apos;%2&apos;. Keep both gives this one another file name, Skip leaves it where it is; Cancel leaves everything as it is.</source>
        <translation>&apos;%1&apos; klasörüne gelen başka bir ögenin dosya adı &apos;%2&apos; ile aynı. &apos;İkisini de tut&apos; buna başka bir dosya adı verir, &apos;Atla&apos; bunu olduğu yerde bırakır; &apos;İptal&apos; her şeyi olduğu gibi bırakır.</translation>
    </message>
    <message>
        <source>Name already taken</source>
        <translation>Ad zaten kullanılıyor</translation>
    </message>
    <message>
        <source>&amp;Keep both</source>
        <translation>İkisini de t&amp;ut</translation>
    </message>
    <message>
        <source>&amp;Replace</source>
        <translation>&amp;Değiştir</translation>
    </message>
    <message>
        <source>&amp;Skip</source>
        <translation>&amp;Atla</translation>
    </message>
    <message>
        <source>&amp;Do the same with all further ones</source>
        <translation>Sonrakilerin &amp;tümü için aynısını yap</translation>
    </message>
</context>
<context>
    <name>MenuHistory</name>
    <message>
        <source>Undo</source>
        <translation>Geri al</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Yinele</translation>
    </message>
    <message>
        <source>Done: %1</source>
        <translation>Tamamlandı: %1</translation>
    </message>
    <message>
        <source>Moving files...</source>
        <translation>Dosyalar taşınıyor...</translation>
    </message>
    <message>
        <source>Nothing was undone: %1</source>
        <translation>Hiçbir şey geri alınmadı: %1</translation>
    </message>
    <message>
        <source>Nothing was done again: %1</source>
        <translation>Hiçbir şey yinelenmedi: %1</translation>
    </message>
    <message>
        <source>%1 is not there any more.</source>
        <translation>%1 artık yok.</translation>
    </message>
    <message>
        <source>There is another %1 by now.</source>
        <translation>Artık başka bir %1 var.</translation>
    </message>
    <message>
        <source>%1 was changed by another program.</source>
        <translation>%1 başka bir program tarafından değiştirildi.</translation>
    </message>
    <message>
        <source>%1 is not in the trash any more.</source>
        <translation>%1 artık çöp kutusunda değil.</translation>
    </message>
    <message>
        <source>%1 cannot be put into the trash.</source>
        <translation>%1 çöp kutusuna atılamıyor.</translation>
    </message>
    <message>
        <source>It was canceled.</source>
        <translation>İptal edildi.</translation>
    </message>
    <message>
        <source>%1 cannot be changed: %2</source>
        <translation>%1 değiştirilemiyor: %2</translation>
    </message>
    <message>
        <source>Undo creation of %1</source>
        <translation>%1 oluşturmayı geri al</translation>
    </message>
    <message>
        <source>Redo creation of %1</source>
        <translation>%1 oluşturmayı yinele</translation>
    </message>
    <message>
        <source>%1 was created.</source>
        <translation>%1 oluşturuldu.</translation>
    </message>
    <message>
        <source>Undo change of %1</source>
        <translation>%1 değişikliğini geri al</translation>
    </message>
    <message>
        <source>Redo change of %1</source>
        <translation>%1 değişikliğini yinele</translation>
    </message>
    <message>
        <source>%1 was changed.</source>
        <translation>%1 değiştirildi.</translation>
    </message>
    <message>
        <source>Undo deletion of %1</source>
        <translation>%1 silmeyi geri al</translation>
    </message>
    <message>
        <source>Redo deletion of %1</source>
        <translation>%1 silmeyi yinele</translation>
    </message>
    <message>
        <source>%1 was deleted.</source>
        <translation>%1 silindi.</translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of folder %1 (%n entries)</source>
        <translation>
            <numerusform>%1 klasörünü (%n girdi) silmeyi geri al</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of folder %1 (%n entries)</source>
        <translation>
            <numerusform>%1 klasörünü (%n girdi) silmeyi yinele</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The folder %1 was deleted (%n entries).</source>
        <translation>
            <numerusform>%1 klasörü silindi (%n girdi).</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of %n items</source>
        <translation>
            <numerusform>%n ögeyi silmeyi geri al</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of %n items</source>
        <translation>
            <numerusform>%n ögeyi silmeyi yinele</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were deleted.</source>
        <translation>
            <numerusform>%n öge silindi.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo moving of %1 to %2</source>
        <translation>%1 ögesini %2 konumuna taşımayı geri al</translation>
    </message>
    <message>
        <source>Redo moving of %1 to %2</source>
        <translation>%1 ögesini %2 konumuna taşımayı yinele</translation>
    </message>
    <message>
        <source>%1 was moved to %2.</source>
        <translation>%1, %2 konumuna taşındı.</translation>
    </message>
    <message numerus="yes">
        <source>Undo moving of %n items to %2</source>
        <translation>
            <numerusform>%n ögeyi %2 konumuna taşımayı geri al</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo moving of %n items to %2</source>
        <translation>
            <numerusform>%n ögeyi %2 konumuna taşımayı yinele</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were moved to %2.</source>
        <translation>
            <numerusform>%n öge %2 konumuna taşındı.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo copying of %1 to %2</source>
        <translation>%1 ögesini %2 konumuna kopyalamayı geri al</translation>
    </message>
    <message>
        <source>Redo copying of %1 to %2</source>
        <translation>%1 ögesini %2 konumuna kopyalamayı yinele</translation>
    </message>
    <message>
        <source>%1 was copied to %2.</source>
        <translation>%1, %2 konumuna kopyalandı.</translation>
    </message>
    <message numerus="yes">
        <source>Undo copying of %n items to %2</source>
        <translation>
            <numerusform>%n ögeyi %2 konumuna kopyalamayı geri al</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo copying of %n items to %2</source>
        <translation>
            <numerusform>%n ögeyi %2 konumuna kopyalamayı yinele</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were copied to %2.</source>
        <translation>
            <numerusform>%n öge %2 konumuna kopyalandı.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo reordering of %1</source>
        <translation>%1 sıralamasını geri al</translation>
    </message>
    <message>
        <source>Redo reordering of %1</source>
        <translation>%1 sıralamasını yinele</translation>
    </message>
    <message>
        <source>%1 has another place.</source>
        <translation>%1 başka bir yerde.</translation>
    </message>
    <message>
        <source>Undo default menu</source>
        <translation>Öntanımlı menüyü geri al</translation>
    </message>
    <message>
        <source>Redo default menu</source>
        <translation>Öntanımlı menüyü yinele</translation>
    </message>
    <message>
        <source>The default menu was built.</source>
        <translation>Öntanımlı menü oluşturuldu.</translation>
    </message>
    <message>
        <source>Undo hiding of %1</source>
        <translation>%1 gizlemeyi geri al</translation>
    </message>
    <message>
        <source>Redo hiding of %1</source>
        <translation>%1 gizlemeyi yinele</translation>
    </message>
    <message>
        <source>%1 is hidden: the menu no longer shows it.</source>
        <translation>%1 gizlendi: menü artık göstermiyor.</translation>
    </message>
    <message>
        <source>Undo showing %1 again</source>
        <translation>%1 ögesini yeniden göstermeyi geri al</translation>
    </message>
    <message>
        <source>Redo showing %1 again</source>
        <translation>%1 ögesini yeniden göstermeyi yinele</translation>
    </message>
    <message>
        <source>The menu shows %1 again.</source>
        <translation>Menü %1 ögesini yeniden gösteriyor.</translation>
    </message>
    <message>
        <source>Undo deletion of folder %1 (1 entry)</source>
        <translation>%1 klasörünü (1 girdi) silmeyi geri al</translation>
    </message>
    <message>
        <source>Redo deletion of folder %1 (1 entry)</source>
        <translation>%1 klasörünü (1 girdi) silmeyi yinele</translation>
    </message>
    <message>
        <source>The folder %1 was deleted (1 entry).</source>
        <translation>%1 klasörü silindi (1 girdi).</translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of %1 items (%n entries)</source>
        <translation>
            <numerusform>%1 ögeyi (%n girdi) silmeyi geri al</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of %1 items (%n entries)</source>
        <translation>
            <numerusform>%1 ögeyi (%n girdi) silmeyi yinele</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%1 items were deleted (%n entries).</source>
        <translation>
            <numerusform>%1 öge silindi (%n girdi).</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo reordering of %n items</source>
        <translation>
            <numerusform>%n ögeyi sıralamayı geri al</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo reordering of %n items</source>
        <translation>
            <numerusform>%n ögeyi sıralamayı yinele</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items have other places.</source>
        <translation>
            <numerusform>%n öge başka bir yerde.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo hiding of %n items</source>
        <translation>
            <numerusform>%n ögeyi gizlemeyi geri al</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo hiding of %n items</source>
        <translation>
            <numerusform>%n ögeyi gizlemeyi yinele</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items are hidden: the menu no longer shows them.</source>
        <translation>
            <numerusform>%n öge gizlendi: menü artık göstermiyor.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo showing %n items again</source>
        <translation>
            <numerusform>%n ögeyi yeniden göstermeyi geri al</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo showing %n items again</source>
        <translation>
            <numerusform>%n ögeyi yeniden göstermeyi yinele</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The menu shows %n items again.</source>
        <translation>
            <numerusform>Menü %n ögeyi yeniden gösteriyor.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo sorting of folder %1</source>
        <translation>%1 klasörünü ada göre sıralamayı geri al</translation>
    </message>
    <message>
        <source>Redo sorting of folder %1</source>
        <translation>%1 klasörünü ada göre sıralamayı yinele</translation>
    </message>
    <message>
        <source>The folder %1 was sorted by name.</source>
        <translation>%1 klasörü ada göre sıralandı.</translation>
    </message>
    <message>
        <source>Undo duplication of %1</source>
        <translation>%1 çoğaltmayı geri al</translation>
    </message>
    <message>
        <source>Redo duplication of %1</source>
        <translation>%1 çoğaltmayı yinele</translation>
    </message>
    <message>
        <source>%1 was duplicated. The copy is selected.</source>
        <translation>%1 çoğaltıldı. Kopyası seçili.</translation>
    </message>
    <message numerus="yes">
        <source>Undo duplication of %n items</source>
        <translation>
            <numerusform>%n ögeyi çoğaltmayı geri al</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo duplication of %n items</source>
        <translation>
            <numerusform>%n ögeyi çoğaltmayı yinele</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were duplicated. The copies are selected.</source>
        <translation>
            <numerusform>%n öge çoğaltıldı. Kopyaları seçili.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo deletion of %1 items (1 entry)</source>
        <translation>%1 ögeyi (1 girdi) silmeyi geri al</translation>
    </message>
    <message>
        <source>Redo deletion of %1 items (1 entry)</source>
        <translation>%1 ögeyi (1 girdi) silmeyi yinele</translation>
    </message>
    <message>
        <source>%1 items were deleted (1 entry).</source>
        <translation>%1 öge silindi (1 girdi).</translation>
    </message>
</context>
<context>
    <name>QFileSystemModel</name>
    <message>
        <source>%1 does not exist.</source>
        <translation>%1 mevcut değil.</translation>
    </message>
    <message>
        <source>%1 exists and was left as it is.</source>
        <translation>%1 zaten var ve olduğu gibi bırakıldı.</translation>
    </message>
    <message>
        <source>%1 cannot be put into itself.</source>
        <translation>%1 kendi içine konulamaz.</translation>
    </message>
    <message>
        <source>%1 cannot be written.</source>
        <translation>%1 yazılamıyor.</translation>
    </message>
    <message>
        <source>Can&apos;t move %1: %2</source>
        <translation>%1 taşınamıyor: %2</translation>
    </message>
    <message>
        <source>Can&apos;t copy %1: %2</source>
        <translation>%1 kopyalanamıyor: %2</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Dikkat</translation>
    </message>
    <message>
        <source>%1 already exists. Overwrite?</source>
        <translation>%1 zaten var. Üzerine yazılsın mı?</translation>
    </message>
    <message>
        <source>Can&apos;t link %1: %2</source>
        <translation>%1 için bağ oluşturulamıyor: %2</translation>
    </message>
</context>
<context>
    <name>SchemeMenu</name>
    <message>
        <source>This is not a regular file.</source>
        <translation>Bu sıradan bir dosya değil.</translation>
    </message>
    <message>
        <source>Shortcuts taken over: %1, left out: %2. Ok puts them into force, Reset takes them back.</source>
        <translation>Devralınan kısayollar: %1, dışarıda bırakılanlar: %2. Tamam bunları geçerli kılar, Sıfırla geri alır.</translation>
    </message>
    <message>
        <source>%3
Shortcuts taken over: %1, left out: %2. Ok puts them into force, Reset takes them back.</source>
        <comment>%3: a sentence about lines that were skipped</comment>
        <translation>%3
Devralınan kısayollar: %1, dışarıda bırakılanlar: %2. Tamam bunları geçerli kılar, Sıfırla geri alır.</translation>
    </message>
    <message>
        <source>&amp;Export keys...</source>
        <translation>Tuşları &amp;dışa aktar...</translation>
    </message>
    <message>
        <source>&amp;Import keys...</source>
        <translation>Tuşları &amp;içe aktar...</translation>
    </message>
    <message>
        <source>Save cheat sheet as &amp;HTML...</source>
        <translation>Özet sayfasını &amp;HTML olarak kaydet...</translation>
    </message>
    <message>
        <source>Save cheat sheet as &amp;text...</source>
        <translation>Özet sayfasını &amp;metin olarak kaydet...</translation>
    </message>
    <message>
        <source>&amp;Copy cheat sheet</source>
        <translation>Özet sayfasını &amp;kopyala</translation>
    </message>
    <message>
        <source>Export keys</source>
        <translation>Tuşları dışa aktar</translation>
    </message>
    <message>
        <source>Keys (*.ini);;All files (*)</source>
        <translation>Tuşlar (*.ini);;Tüm dosyalar (*)</translation>
    </message>
    <message>
        <source>%1
Choose another folder or another name, and try again.</source>
        <translation>%1
Başka bir klasör veya ad seçip yeniden deneyin.</translation>
    </message>
    <message>
        <source>Import keys</source>
        <translation>Tuşları içe aktar</translation>
    </message>
    <message>
        <source>%1
Choose a file that was written with &apos;Export keys...&apos;.</source>
        <translation>%1
&apos;Tuşları dışa aktar...&apos; ile yazılmış bir dosya seçin.</translation>
    </message>
    <message>
        <source>HTML documents (*.html);;All files (*)</source>
        <translation>HTML belgeleri (*.html);;Tüm dosyalar (*)</translation>
    </message>
    <message>
        <source>Plain text (*.txt);;All files (*)</source>
        <translation>Düz metin (*.txt);;Tüm dosyalar (*)</translation>
    </message>
    <message>
        <source>Save cheat sheet</source>
        <translation>Özet sayfasını kaydet</translation>
    </message>
    <message>
        <source>The cheat sheet could not be saved to %1: %2
Choose another folder or another name, and try again.</source>
        <comment>%2: what the system says</comment>
        <translation>Özet sayfası %1 konumuna kaydedilemedi: %2
Başka bir klasör veya ad seçip yeniden deneyin.</translation>
    </message>
</context>
<context>
    <name>SchemeQuestion</name>
    <message>
        <source>Import keys</source>
        <translation>Tuşları içe aktar</translation>
    </message>
    <message>
        <source>&amp;Replace</source>
        <translation>&amp;Değiştir</translation>
    </message>
    <message>
        <source>&amp;Skip</source>
        <translation>&amp;Atla</translation>
    </message>
    <message>
        <source>&amp;Do the same with all further ones</source>
        <translation>Sonrakilerin &amp;tümü için aynısını yap</translation>
    </message>
    <message>
        <source>The file has shortcut &apos;%1&apos; for action &apos;%2&apos;, but the global action &apos;%3&apos; has it. Skip leaves action &apos;%2&apos; as it is; Cancel takes nothing over.</source>
        <translation>Dosyada &apos;%1&apos; kısayolu &apos;%2&apos; eylemi için, ama genel &apos;%3&apos; eylemi bunu kullanıyor. Atla &apos;%2&apos; eylemini olduğu gibi bırakır; İptal hiçbir şey devralmaz.</translation>
    </message>
    <message>
        <source>The file has shortcut &apos;%1&apos; for action &apos;%2&apos;, but action &apos;%3&apos; has it, too. Replace takes it away from action &apos;%3&apos;, Skip leaves action &apos;%2&apos; as it is; Cancel takes nothing over.</source>
        <translation>Dosyada &apos;%1&apos; kısayolu &apos;%2&apos; eylemi için, ama &apos;%3&apos; eylemi de bunu kullanıyor. Değiştir onu &apos;%3&apos; eyleminden alır, Atla &apos;%2&apos; eylemini olduğu gibi bırakır; İptal hiçbir şey devralmaz.</translation>
    </message>
</context>
<context>
    <name>ShortcutClash</name>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for action &apos;%2&apos;.</source>
        <translation>&apos;%1&apos; kısayolu zaten &apos;%2&apos; eylemi için kullanılıyor.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%2&apos; of action &apos;%3&apos; begins with &apos;%1&apos;.</source>
        <translation>&apos;%3&apos; eyleminin &apos;%2&apos; kısayolu &apos;%1&apos; ile başlıyor.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%2&apos; begins with &apos;%1&apos;, the shortcut of action &apos;%3&apos;.</source>
        <translation>&apos;%2&apos; kısayolu, &apos;%3&apos; eyleminin kısayolu olan &apos;%1&apos; ile başlıyor.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; opens the menu &apos;%2&apos;.</source>
        <translation>&apos;%1&apos; kısayolu &apos;%2&apos; menüsünü açıyor.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; leads to &apos;%2&apos; in the window.</source>
        <translation>&apos;%1&apos; kısayolu penceredeki &apos;%2&apos; ögesine götürüyor.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is the standard shortcut for &apos;%2&apos;.</source>
        <translation>&apos;%1&apos; kısayolu &apos;%2&apos; için standart kısayoldur.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for global action &apos;%2&apos;.</source>
        <translation>&apos;%1&apos; kısayolu zaten &apos;%2&apos; genel eylemi için kullanılıyor.</translation>
    </message>
    <message>
        <source>With &apos;%1&apos; as a shortcut this key cannot be typed into texts.</source>
        <translation>&apos;%1&apos; kısayol olursa bu tuş metinlere yazılamaz.</translation>
    </message>
    <message>
        <source>The current keyboard layout cannot produce &apos;%1&apos;.</source>
        <translation>Geçerli klavye düzeni &apos;%1&apos; üretemiyor.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is a further shortcut of action &apos;%2&apos;.</source>
        <translation>&apos;%1&apos; kısayolu &apos;%2&apos; eyleminin ek bir kısayoludur.</translation>
    </message>
</context>
<context>
    <name>ShortcutDelegate</name>
    <message>
        <source>Back to no shortcut</source>
        <translation>Kısayolsuza dön</translation>
    </message>
    <message>
        <source>Back to %1</source>
        <translation>%1 kısayoluna dön</translation>
    </message>
</context>
<context>
    <name>ShortcutFilterBar</name>
    <message>
        <source>Press keys</source>
        <translation>Tuşlara bas</translation>
    </message>
    <message>
        <source>Changed only</source>
        <translation>Yalnızca değişenler</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>Süzgeç</translation>
    </message>
    <message>
        <source>Shows who has the keys that you press; Escape ends it.</source>
        <translation>Bastığınız tuşların kimde olduğunu gösterir; Escape bitirir.</translation>
    </message>
    <message>
        <source>Shows the actions alone whose shortcut is not the default one, or was edited.</source>
        <translation>Yalnızca kısayolu öntanımlı olmayan veya düzenlenmiş eylemleri gösterir.</translation>
    </message>
    <message>
        <source>Press the keys to look for</source>
        <translation>Aranacak tuşlara basın</translation>
    </message>
    <message>
        <source>Filter by name, group or shortcut</source>
        <translation>Ada, gruba veya kısayola göre süz</translation>
    </message>
</context>
<context>
    <name>ShortcutScheme</name>
    <message>
        <source>The shortcuts could not be saved to %1: %2</source>
        <comment>%2: what the system says</comment>
        <translation>Kısayollar %1 dosyasına kaydedilemedi: %2</translation>
    </message>
    <message>
        <source>The shortcuts could not be read from %1: %2</source>
        <comment>%2: what the system says</comment>
        <translation>Kısayollar %1 dosyasından okunamadı: %2</translation>
    </message>
    <message>
        <source>%1 is not a regular file.</source>
        <translation>%1 normal bir dosya değil.</translation>
    </message>
    <message>
        <source>%1 is too large for a file of shortcuts.</source>
        <translation>%1 bir kısayol dosyası için çok büyük.</translation>
    </message>
    <message>
        <source>%1 holds no shortcuts.</source>
        <translation>%1 kısayol içermiyor.</translation>
    </message>
    <message>
        <source>Unreadable shortcuts in %1 were skipped: %2</source>
        <comment>%2: their number</comment>
        <translation>%1 içindeki okunamayan kısayollar atlandı: %2</translation>
    </message>
</context>
<context>
    <name>ShortcutSheet</name>
    <message>
        <source>Keyboard shortcuts</source>
        <comment>title of a printed sheet</comment>
        <translation>Klavye kısayolları</translation>
    </message>
</context>
<context>
    <name>ShortcutsModel</name>
    <message>
        <source>Action</source>
        <translation>Eylem</translation>
    </message>
    <message>
        <source>Shortcut</source>
        <translation>Kısayol</translation>
    </message>
    <message>
        <source>%1, changed</source>
        <comment>%1: an action or a key</comment>
        <translation>%1, değiştirildi</translation>
    </message>
    <message>
        <source>No shortcut</source>
        <translation>Kısayol yok</translation>
    </message>
    <message>
        <source>There is no default shortcut.</source>
        <translation>Öntanımlı kısayol yok.</translation>
    </message>
    <message>
        <source>The default shortcut is %1.</source>
        <translation>Öntanımlı kısayol: %1.</translation>
    </message>
</context>
<context>
    <name>StandardKeyNames</name>
    <message>
        <source>Help</source>
        <translation>Yardım</translation>
    </message>
    <message>
        <source>What&apos;s this?</source>
        <translation>Bu nedir?</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Aç</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Kapat</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Kaydet</translation>
    </message>
    <message>
        <source>Save as</source>
        <translation>Farklı kaydet</translation>
    </message>
    <message>
        <source>New</source>
        <translation>Yeni</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Sil</translation>
    </message>
    <message>
        <source>Cut</source>
        <translation>Kes</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Kopyala</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation>Yapıştır</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Geri al</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Yinele</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Geri</translation>
    </message>
    <message>
        <source>Forward</source>
        <translation>İleri</translation>
    </message>
    <message>
        <source>Refresh</source>
        <translation>Yenile</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>Yakınlaştır</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>Uzaklaştır</translation>
    </message>
    <message>
        <source>Print</source>
        <translation>Yazdır</translation>
    </message>
    <message>
        <source>New tab</source>
        <translation>Yeni sekme</translation>
    </message>
    <message>
        <source>Next tab</source>
        <translation>Sonraki sekme</translation>
    </message>
    <message>
        <source>Previous tab</source>
        <translation>Önceki sekme</translation>
    </message>
    <message>
        <source>Find</source>
        <translation>Bul</translation>
    </message>
    <message>
        <source>Find next</source>
        <translation>Sonrakini bul</translation>
    </message>
    <message>
        <source>Find previous</source>
        <translation>Öncekini bul</translation>
    </message>
    <message>
        <source>Replace</source>
        <translation>Değiştir</translation>
    </message>
    <message>
        <source>Select all</source>
        <translation>Tümünü seç</translation>
    </message>
    <message>
        <source>Deselect</source>
        <translation>Seçimi kaldır</translation>
    </message>
    <message>
        <source>Full screen</source>
        <translation>Tam ekran</translation>
    </message>
    <message>
        <source>Preferences</source>
        <translation>Tercihler</translation>
    </message>
    <message>
        <source>Quit</source>
        <translation>Çık</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>İptal</translation>
    </message>
    <message>
        <source>Bold</source>
        <translation>Kalın</translation>
    </message>
    <message>
        <source>Italic</source>
        <translation>İtalik</translation>
    </message>
    <message>
        <source>Underline</source>
        <translation>Altı çizili</translation>
    </message>
    <message>
        <source>Move the cursor</source>
        <translation>İmleci taşı</translation>
    </message>
    <message>
        <source>Select text</source>
        <translation>Metin seç</translation>
    </message>
    <message>
        <source>Edit text</source>
        <translation>Metni düzenle</translation>
    </message>
</context>
<context>
    <name>StringListEdit</name>
    <message>
        <source>Form</source>
        <translation>Form</translation>
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
        <translation>Bu kısayolu &amp;sıfırla</translation>
    </message>
</context>
<context>
    <name>VelDesktopEntryEditDialog</name>
    <message>
        <source>Warning</source>
        <translation>Uyarı</translation>
    </message>
    <message>
        <source>no executable</source>
        <translation>çalıştırılabilir dosya yok</translation>
    </message>
    <message>
        <source>can&apos;t find executable</source>
        <translation>çalıştırılabilir dosya bulunamıyor</translation>
    </message>
    <message>
        <source>can&apos;t find try executable</source>
        <translation>denenecek çalıştırılabilir dosya bulunamıyor</translation>
    </message>
    <message>
        <source>can&apos;t find URL</source>
        <translation>URL bulunamıyor</translation>
    </message>
    <message>
        <source>wrong/incomplete desktop entry</source>
        <translation>yanlış veya eksik masaüstü girdisi</translation>
    </message>
    <message>
        <source>Can&apos;t save position on desktop for %1</source>
        <translation>%1 için masaüstündeki konum kaydedilemiyor</translation>
    </message>
    <message>
        <source>Copy from...</source>
        <translation>Şuradan kopyala...</translation>
    </message>
    <message>
        <source>Can&apos;t load file %1</source>
        <translation>%1 dosyası yüklenemiyor</translation>
    </message>
    <message>
        <source>Desktop Entry Editor</source>
        <translation>Masaüstü Girdisi Düzenleyici</translation>
    </message>
    <message>
        <source>You create hidden desktop entry</source>
        <translation>Gizli bir masaüstü girdisi oluşturuyorsunuz</translation>
    </message>
    <message>
        <source>Can&apos;t save file %1</source>
        <translation>%1 dosyası kaydedilemiyor</translation>
    </message>
    <message>
        <source>Help</source>
        <translation>Yardım</translation>
    </message>
    <message>
        <source>&lt;b&gt;Desktop entry&lt;/b&gt; is a multipurpose info file for installed apps, devices, etc. It can be used to build menu entries, shortcuts, etc. This dialog implements the &apos;Desktop Entry Standard&apos; of &lt;a href=&quot;https://www.freedesktop.org&quot;&gt;https://www.freedesktop.org&lt;/a&gt;.&lt;br&gt;&lt;br&gt;Desktop entry file is a text ini-like file with one main section [Desktop Entry] and possible additional sections for each action defined in the main section field &apos;Actions&apos;. All fields are text string pairs: key=value. Value can also be a semicolon separated string list.</source>
        <translation>&lt;b&gt;Masaüstü girdisi&lt;/b&gt;, kurulu uygulamalar, aygıtlar vb. için çok amaçlı bir bilgi dosyasıdır. Menü ögeleri, kısayollar vb. oluşturmak için kullanılabilir. Bu iletişim kutusu, &lt;a href=&quot;https://www.freedesktop.org&quot;&gt;https://www.freedesktop.org&lt;/a&gt; adresindeki &apos;Desktop Entry Standard&apos; standardını uygular.&lt;br&gt;&lt;br&gt;Masaüstü girdisi dosyası, bir ana bölümü [Desktop Entry] ve ana bölümün &apos;Actions&apos; alanında tanımlanan her eylem için ek bölümleri olabilen, ini benzeri bir metin dosyasıdır. Tüm alanlar metin çiftleridir: anahtar=değer. Değer, noktalı virgülle ayrılmış bir dizge listesi de olabilir.</translation>
    </message>
    <message>
        <source>The file %1 is not a desktop entry: it has no group [Desktop Entry].</source>
        <translation>%1 dosyası bir masaüstü girdisi değil: [Desktop Entry] grubu yok.</translation>
    </message>
</context>
<context>
    <name>VelDesktopEntryPropsWidgetPrivate</name>
    <message>
        <source>Information about the URL</source>
        <translation>URL hakkında bilgi</translation>
    </message>
    <message>
        <source>Only show in</source>
        <translation>Yalnızca şurada göster</translation>
    </message>
    <message>
        <source>Not show in</source>
        <translation>Şurada gösterme</translation>
    </message>
    <message>
        <source>Add desktop environment:</source>
        <translation>Masaüstü ortamı ekle:</translation>
    </message>
    <message>
        <source>Edit desktop environment:</source>
        <translation>Masaüstü ortamını düzenle:</translation>
    </message>
    <message>
        <source>MIME type or file name extension:</source>
        <translation>MIME türü veya dosya adı uzantısı:</translation>
    </message>
    <message>
        <source>MIME type</source>
        <translation>MIME türü</translation>
    </message>
    <message>
        <source>Add MIME type</source>
        <translation>MIME türü ekle</translation>
    </message>
    <message>
        <source>Edit MIME type</source>
        <translation>MIME türünü düzenle</translation>
    </message>
    <message>
        <source>Categories</source>
        <translation>Kategoriler</translation>
    </message>
    <message>
        <source>Add category</source>
        <translation>Kategori ekle</translation>
    </message>
    <message>
        <source>Category:</source>
        <translation>Kategori:</translation>
    </message>
    <message>
        <source>Edit category</source>
        <translation>Kategoriyi düzenle</translation>
    </message>
    <message>
        <source>Keywords</source>
        <translation>Anahtar sözcükler</translation>
    </message>
    <message>
        <source>Add keyword</source>
        <translation>Anahtar sözcük ekle</translation>
    </message>
    <message>
        <source>Keyword:</source>
        <translation>Anahtar sözcük:</translation>
    </message>
    <message>
        <source>Edit keyword</source>
        <translation>Anahtar sözcüğü düzenle</translation>
    </message>
    <message>
        <source>Actions</source>
        <translation>Eylemler</translation>
    </message>
    <message>
        <source>Add action</source>
        <translation>Eylem ekle</translation>
    </message>
    <message>
        <source>Edit action</source>
        <translation>Eylemi düzenle</translation>
    </message>
    <message>
        <source>Application</source>
        <translation>Uygulama</translation>
    </message>
    <message>
        <source>Link</source>
        <translation>Bağ</translation>
    </message>
    <message>
        <source>Directory</source>
        <translation>Klasör</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Dikkat</translation>
    </message>
    <message>
        <source>Desktop entry type was changed.
Some field values may be lost...
Continue?</source>
        <translation>Masaüstü girdisinin türü değiştirildi.
Bazı alan değerleri kaybolabilir...
Devam edilsin mi?</translation>
    </message>
    <message>
        <source>Type</source>
        <translation>Tür</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Ad</translation>
    </message>
    <message>
        <source>Icon</source>
        <translation>Simge</translation>
    </message>
    <message>
        <source>Exec</source>
        <translation>Komut</translation>
    </message>
    <message>
        <source>Terminal</source>
        <translation>Uçbirim</translation>
    </message>
    <message>
        <source>Path</source>
        <translation>Çalışma yolu</translation>
    </message>
    <message>
        <source>Try exec</source>
        <translation>Denenecek komut</translation>
    </message>
    <message>
        <source>Url</source>
        <translation>URL</translation>
    </message>
    <message>
        <source>Generic name</source>
        <translation>Genel ad</translation>
    </message>
    <message>
        <source>Comment</source>
        <translation>Yorum</translation>
    </message>
    <message>
        <source>No display</source>
        <translation>Gösterme</translation>
    </message>
    <message>
        <source>Hidden</source>
        <translation>Gizli</translation>
    </message>
    <message>
        <source>Startup notify</source>
        <translation>Başlangıç bildirimi</translation>
    </message>
    <message>
        <source>Startup WM class</source>
        <translation>Başlangıç pencere sınıfı</translation>
    </message>
    <message>
        <source>Version</source>
        <translation>Sürüm</translation>
    </message>
</context>
<context>
    <name>VelMenuDialog</name>
    <message>
        <source>Edit</source>
        <translation>Düzenle</translation>
    </message>
    <message>
        <source>Send command to vel-wm to update
 edited menu, toolbar, etc.</source>
        <translation>Düzenlenen menüyü, araç çubuğunu vb.
 güncellemek için vel-wm programına komut gönder</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Uyarı</translation>
    </message>
    <message>
        <source>Can&apos;t send command to vel-wm</source>
        <translation>vel-wm programına komut gönderilemiyor</translation>
    </message>
    <message>
        <source>This menu cannot be changed: the folder %1 does not exist.</source>
        <translation>Bu menü değiştirilemez: %1 klasörü yok.</translation>
    </message>
    <message>
        <source>This menu cannot be changed: you may not write to the folder %1.</source>
        <translation>Bu menü değiştirilemez: %1 klasörüne yazamazsınız.</translation>
    </message>
    <message>
        <source>Show hidden</source>
        <translation>Gizlileri göster</translation>
    </message>
    <message>
        <source>Filter by name, command or keyword</source>
        <translation>Ada, komuta veya anahtar sözcüğe göre süz</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>Süzgeç</translation>
    </message>
    <message>
        <source>Also show the entries that the menu leaves out</source>
        <translation>Menünün dışarıda bıraktığı girdileri de göster</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Geri al</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Hata</translation>
    </message>
    <message>
        <source>Start menu</source>
        <translation>Başlat menüsü</translation>
    </message>
</context>
<context>
    <name>VelMenuView</name>
    <message>
        <source>Warning</source>
        <translation>Uyarı</translation>
    </message>
    <message>
        <source>Can&apos;t start:
%1 %2</source>
        <translation>Başlatılamıyor:
%1 %2</translation>
    </message>
    <message>
        <source>All previous shortcuts
will be lost. Are you sure?</source>
        <translation>Önceki tüm kısayollar
kaybolacak. Emin misiniz?</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Düzenle</translation>
    </message>
    <message>
        <source>New folder</source>
        <translation>Yeni klasör</translation>
    </message>
    <message>
        <source>New entry</source>
        <translation>Yeni girdi</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Sil</translation>
    </message>
    <message>
        <source>Execute</source>
        <translation>Çalıştır</translation>
    </message>
    <message>
        <source>Find</source>
        <translation>Bul</translation>
    </message>
    <message>
        <source>Find Next</source>
        <translation>Sonrakini Bul</translation>
    </message>
    <message>
        <source>Cut</source>
        <translation>Kes</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Kopyala</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation>Yapıştır</translation>
    </message>
    <message>
        <source>Default menu...</source>
        <translation>Öntanımlı menü...</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>Yukarı</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>Aşağı</translation>
    </message>
    <message>
        <source>Move</source>
        <translation>Taşı</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>İptal</translation>
    </message>
    <message>
        <source>Group</source>
        <translation>Grup</translation>
    </message>
    <message>
        <source>Shortcut</source>
        <translation>Kısayol</translation>
    </message>
    <message>
        <source>Can&apos;t edit non desktop file</source>
        <translation>Desktop dosyası olmayan dosya düzenlenemez</translation>
    </message>
    <message>
        <source>Desktop Entry %1</source>
        <translation>Masaüstü Girdisi %1</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Dikkat</translation>
    </message>
    <message>
        <source>Are you sure to delete it?</source>
        <translation>Silmek istediğinize emin misiniz?</translation>
    </message>
    <message>
        <source>Find string:</source>
        <translation>Dizge bul:</translation>
    </message>
    <message>
        <source>&apos;%1&apos; not found .</source>
        <translation>&apos;%1&apos; bulunamadı.</translation>
    </message>
    <message>
        <source>Not in the menu: it is not meant for this desktop.</source>
        <translation>Menüde değil: bu masaüstü için değil.</translation>
    </message>
    <message>
        <source>Not in the menu: it is meant for other desktops only (%1).</source>
        <translation>Menüde değil: yalnızca başka masaüstleri için (%1).</translation>
    </message>
    <message>
        <source>Not in the menu: it is marked as deleted (Hidden).</source>
        <translation>Menüde değil: silinmiş olarak işaretli (Hidden).</translation>
    </message>
    <message>
        <source>Not in the menu: it is marked not to be displayed (NoDisplay).</source>
        <translation>Menüde değil: gösterilmeyecek olarak işaretli (NoDisplay).</translation>
    </message>
    <message>
        <source>Not in the menu: the program %1 is not installed (TryExec).</source>
        <translation>Menüde değil: %1 programı kurulu değil (TryExec).</translation>
    </message>
    <message>
        <source>This file is not a desktop entry, whatever its name says.</source>
        <translation>Adı ne derse desin, bu dosya bir masaüstü girdisi değil.</translation>
    </message>
    <message>
        <source>This file cannot be read.</source>
        <translation>Bu dosya okunamıyor.</translation>
    </message>
    <message>
        <source>This entry has no name. The name of its file is shown.</source>
        <translation>Bu girdinin adı yok. Dosyasının adı gösteriliyor.</translation>
    </message>
    <message>
        <source>Taking back what was done...</source>
        <translation>Yapılanlar geri alınıyor...</translation>
    </message>
    <message>
        <source>The program that holds the clipboard does not answer. Nothing was pasted.</source>
        <translation>Panonun sahibi olan program yanıt vermiyor. Hiçbir şey yapıştırılmadı.</translation>
    </message>
    <message>
        <source>Nothing can be created in %1, because there is no such folder.</source>
        <translation>%1 içinde bir şey oluşturulamaz, çünkü böyle bir klasör yok.</translation>
    </message>
    <message>
        <source>%1 could not be saved. Make sure that the folder %2 may be written and that the disk is not full, then try again.</source>
        <translation>%1 kaydedilemedi. %2 klasörüne yazılabildiğinden ve diskin dolu olmadığından emin olup yeniden deneyin.</translation>
    </message>
    <message>
        <source>%1 could not be deleted: %2. Make sure that the folder that holds it may be written, then try again.</source>
        <translation>%1 silinemedi: %2. İçinde bulunduğu klasöre yazılabildiğinden emin olup yeniden deneyin.</translation>
    </message>
    <message>
        <source>%1 was deleted in part only, because %2 could not be deleted: %3. Make sure that its folder may be written, then delete the rest.</source>
        <translation>%1 yalnızca kısmen silindi, çünkü %2 silinemedi: %3. Klasörüne yazılabildiğinden emin olup kalanı silin.</translation>
    </message>
    <message>
        <source>Nothing in this menu matches &apos;%1&apos;.</source>
        <translation>Bu menüde &apos;%1&apos; ile eşleşen bir şey yok.</translation>
    </message>
    <message>
        <source>Searching the menu for &apos;%1&apos;...</source>
        <translation>Menüde &apos;%1&apos; aranıyor...</translation>
    </message>
    <message>
        <source>The menu is too large to be searched as a whole. Only a part of it was searched.</source>
        <translation>Menü tümüyle aranamayacak kadar büyük. Yalnızca bir bölümü arandı.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; was not changed: the file %2 cannot be written.</source>
        <translation>&apos;%1&apos; değiştirilmedi: %2 dosyasına yazılamıyor.</translation>
    </message>
    <message>
        <source>The order of the folder %1 could not be saved. Make sure that the folder may be written and that the disk is not full, then try again.</source>
        <translation>%1 klasörünün sırası kaydedilemedi. Klasöre yazılabildiğinden ve diskin dolu olmadığından emin olup yeniden deneyin.</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1. The menu was left as it is.</source>
        <translation>Öntanımlı menü %1 içinde oluşturulamadı. Menü olduğu gibi kaldı.</translation>
    </message>
    <message>
        <source>Menu</source>
        <comment>the tree</comment>
        <translation>Menü</translation>
    </message>
    <message>
        <source>%1 cannot be edited, because the folder %2 may not be written.</source>
        <translation>%1 düzenlenemez, çünkü %2 klasörüne yazılamıyor.</translation>
    </message>
    <message>
        <source>Moving files...</source>
        <translation>Dosyalar taşınıyor...</translation>
    </message>
    <message>
        <source>Copying files...</source>
        <translation>Dosyalar kopyalanıyor...</translation>
    </message>
    <message>
        <source>Deleting files...</source>
        <translation>Dosyalar siliniyor...</translation>
    </message>
    <message>
        <source>The deletion of %1 was canceled. What was not yet deleted is still there.</source>
        <translation>%1 silme işlemi iptal edildi. Henüz silinmemiş olanlar hâlâ duruyor.</translation>
    </message>
    <message>
        <source>This menu is empty. Press %1 for a new entry, or right-click here for what else can be added.</source>
        <translation>Bu menü boş. Yeni girdi için %1 tuşuna basın veya başka neler eklenebileceğini görmek için burada sağ tıklayın.</translation>
    </message>
    <message>
        <source>the program %1 ended with an error</source>
        <translation>%1 programı bir hatayla sonlandı</translation>
    </message>
    <message>
        <source>the program %1 cannot be run</source>
        <translation>%1 programı çalıştırılamıyor</translation>
    </message>
    <message numerus="yes">
        <source>And %n more.</source>
        <translation>
            <numerusform>Ve %n tane daha.</numerusform>
        </translation>
    </message>
    <message>
        <source>Open containin&amp;g folder</source>
        <translation>Bulunduğu &amp;klasörü aç</translation>
    </message>
    <message>
        <source>The folder %1 was not opened: %2.</source>
        <translation>%1 klasörü açılmadı: %2.</translation>
    </message>
    <message>
        <source>New &amp;folder</source>
        <translation>Yeni klas&amp;ör</translation>
    </message>
    <message>
        <source>New entr&amp;y</source>
        <translation>Yeni &amp;girdi</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>&amp;Düzenle</translation>
    </message>
    <message>
        <source>&amp;Delete</source>
        <translation>&amp;Sil</translation>
    </message>
    <message>
        <source>E&amp;xecute</source>
        <translation>&amp;Çalıştır</translation>
    </message>
    <message>
        <source>F&amp;ind</source>
        <translation>&amp;Bul</translation>
    </message>
    <message>
        <source>Find &amp;Next</source>
        <translation>S&amp;onrakini Bul</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>K&amp;es</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>Ko&amp;pyala</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>Yapış&amp;tır</translation>
    </message>
    <message>
        <source>Default &amp;menu...</source>
        <translation>Öntanımlı &amp;menü...</translation>
    </message>
    <message>
        <source>&amp;Up</source>
        <translation>&amp;Yukarı</translation>
    </message>
    <message>
        <source>D&amp;own</source>
        <translation>A&amp;şağı</translation>
    </message>
    <message>
        <source>Dup&amp;licate</source>
        <translation>Çoğa&amp;lt</translation>
    </message>
    <message>
        <source>&amp;Hide</source>
        <translation>Gi&amp;zle</translation>
    </message>
    <message>
        <source>Sho&amp;w again</source>
        <translation>Ye&amp;niden göster</translation>
    </message>
    <message>
        <source>&amp;Reload</source>
        <translation>Yeniden y&amp;ükle</translation>
    </message>
    <message>
        <source>&amp;Sort by name</source>
        <translation>Ada göre sı&amp;rala</translation>
    </message>
    <message>
        <source>The folder %1 is sorted by name already.</source>
        <translation>%1 klasörü zaten ada göre sıralı.</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1, because no application is installed. The menu was left as it is.</source>
        <translation>Öntanımlı menü %1 içinde oluşturulamadı, çünkü kurulu uygulama yok. Menü olduğu gibi kaldı.</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1: %2. The menu was left as it is.</source>
        <translation>Öntanımlı menü %1 içinde oluşturulamadı: %2. Menü olduğu gibi kaldı.</translation>
    </message>
    <message>
        <source>%1 is no file on this computer. Nothing was moved or copied.</source>
        <translation>%1 bu bilgisayardaki bir dosya değil. Hiçbir şey taşınmadı veya kopyalanmadı.</translation>
    </message>
    <message>
        <source>%1 was not started: %2.</source>
        <translation>%1 başlatılmadı: %2.</translation>
    </message>
    <message>
        <source>This menu is empty. Right-click here and choose &apos;%2&apos; to fill it with the applications that are installed, or press %1 for a new entry.</source>
        <translation>Bu menü boş. Kurulu uygulamalarla doldurmak için burada sağ tıklayıp &apos;%2&apos; seçeneğini seçin veya yeni girdi için %1 tuşuna basın.</translation>
    </message>
    <message>
        <source>This menu is empty, because no application was found that is installed. Once there is one, right-click here and choose &apos;%2&apos;. Until then, press %1 for an entry of your own.</source>
        <translation>Bu menü boş, çünkü kurulu bir uygulama bulunamadı. Bir uygulama kurulunca burada sağ tıklayıp &apos;%2&apos; seçeneğini seçin. O zamana kadar kendi girdiniz için %1 tuşuna basın.</translation>
    </message>
</context>
<context>
    <name>VelUI::ActionPropsDialog</name>
    <message>
        <source>Id</source>
        <translation>Kimlik</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Ad</translation>
    </message>
    <message>
        <source>Icon</source>
        <translation>Simge</translation>
    </message>
    <message>
        <source>Exec</source>
        <translation>Komut</translation>
    </message>
    <message>
        <source>Only show in</source>
        <translation>Yalnızca şurada göster</translation>
    </message>
    <message>
        <source>Add desktop environment:</source>
        <translation>Masaüstü ortamı ekle:</translation>
    </message>
    <message>
        <source>Edit desktop environment:</source>
        <translation>Masaüstü ortamını düzenle:</translation>
    </message>
    <message>
        <source>Not show in</source>
        <translation>Şurada gösterme</translation>
    </message>
</context>
<context>
    <name>VelUI::CategoryChooser</name>
    <message>
        <source>Main category</source>
        <translation>Ana kategori</translation>
    </message>
    <message>
        <source>Goes with %1</source>
        <translation>%1 ile birlikte</translation>
    </message>
    <message>
        <source>Only beside &quot;Only show in&quot;</source>
        <translation>Yalnızca &quot;Yalnızca şurada göster&quot; ile birlikte</translation>
    </message>
    <message>
        <source>Deprecated</source>
        <translation>Kullanımdan kalkmış</translation>
    </message>
    <message>
        <source>Extension</source>
        <comment>a category of somebody&apos;s own, X-...</comment>
        <translation>Uzantı</translation>
    </message>
    <message>
        <source>Not registered</source>
        <translation>Kayıtlı değil</translation>
    </message>
    <message>
        <source>Choose categories</source>
        <translation>Kategorileri seçin</translation>
    </message>
    <message>
        <source>Name</source>
        <comment>title of a column</comment>
        <translation>Ad</translation>
    </message>
    <message>
        <source>Category</source>
        <comment>title of a column</comment>
        <translation>Kategori</translation>
    </message>
    <message>
        <source>Remark</source>
        <comment>title of a column</comment>
        <translation>Not</translation>
    </message>
</context>
<context>
    <name>VelUI::CategoryNames</name>
    <message>
        <source>Audio and video</source>
        <translation>Ses ve video</translation>
    </message>
    <message>
        <source>Audio</source>
        <translation>Ses</translation>
    </message>
    <message>
        <source>Video</source>
        <translation>Video</translation>
    </message>
    <message>
        <source>Software development</source>
        <translation>Yazılım geliştirme</translation>
    </message>
    <message>
        <source>Education</source>
        <translation>Eğitim</translation>
    </message>
    <message>
        <source>Games</source>
        <translation>Oyunlar</translation>
    </message>
    <message>
        <source>Graphics</source>
        <translation>Grafik</translation>
    </message>
    <message>
        <source>Internet and network</source>
        <translation>İnternet ve ağ</translation>
    </message>
    <message>
        <source>Office</source>
        <translation>Ofis</translation>
    </message>
    <message>
        <source>Science</source>
        <translation>Bilim</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Ayarlar</translation>
    </message>
    <message>
        <source>System tools</source>
        <translation>Sistem araçları</translation>
    </message>
    <message>
        <source>Accessories</source>
        <translation>Donatılar</translation>
    </message>
    <message>
        <source>Build tools</source>
        <translation>Derleme araçları</translation>
    </message>
    <message>
        <source>Debuggers</source>
        <translation>Hata ayıklayıcılar</translation>
    </message>
    <message>
        <source>Development environments</source>
        <translation>Geliştirme ortamları</translation>
    </message>
    <message>
        <source>Designers of user interfaces</source>
        <translation>Arayüz tasarlayıcıları</translation>
    </message>
    <message>
        <source>Profilers</source>
        <translation>Başarım çözümleyiciler</translation>
    </message>
    <message>
        <source>Revision control</source>
        <translation>Sürüm denetimi</translation>
    </message>
    <message>
        <source>Translation tools</source>
        <translation>Çeviri araçları</translation>
    </message>
    <message>
        <source>Calendars</source>
        <translation>Takvimler</translation>
    </message>
    <message>
        <source>Address books</source>
        <translation>Adres defterleri</translation>
    </message>
    <message>
        <source>Databases</source>
        <translation>Veri tabanları</translation>
    </message>
    <message>
        <source>Dictionaries</source>
        <translation>Sözlükler</translation>
    </message>
    <message>
        <source>Charts</source>
        <translation>Çizelgeler</translation>
    </message>
    <message>
        <source>Email</source>
        <translation>E-posta</translation>
    </message>
    <message>
        <source>Finances</source>
        <translation>Finans</translation>
    </message>
    <message>
        <source>Flow charts</source>
        <translation>Akış şemaları</translation>
    </message>
    <message>
        <source>Handheld devices</source>
        <translation>El aygıtları</translation>
    </message>
    <message>
        <source>Project management</source>
        <translation>Proje yönetimi</translation>
    </message>
    <message>
        <source>Presentations</source>
        <translation>Sunumlar</translation>
    </message>
    <message>
        <source>Spreadsheets</source>
        <translation>Hesap tabloları</translation>
    </message>
    <message>
        <source>Word processors</source>
        <translation>Sözcük işlemciler</translation>
    </message>
    <message>
        <source>Two-dimensional graphics</source>
        <translation>İki boyutlu grafik</translation>
    </message>
    <message>
        <source>Vector graphics</source>
        <translation>Vektör grafik</translation>
    </message>
    <message>
        <source>Raster graphics</source>
        <translation>Piksel grafik</translation>
    </message>
    <message>
        <source>Three-dimensional graphics</source>
        <translation>Üç boyutlu grafik</translation>
    </message>
    <message>
        <source>Scanning</source>
        <translation>Tarama</translation>
    </message>
    <message>
        <source>Text recognition</source>
        <translation>Metin tanıma</translation>
    </message>
    <message>
        <source>Photography</source>
        <translation>Fotoğrafçılık</translation>
    </message>
    <message>
        <source>Desktop publishing</source>
        <translation>Masaüstü yayıncılık</translation>
    </message>
    <message>
        <source>Viewers</source>
        <translation>Görüntüleyiciler</translation>
    </message>
    <message>
        <source>Text tools</source>
        <translation>Metin araçları</translation>
    </message>
    <message>
        <source>Desktop settings</source>
        <translation>Masaüstü ayarları</translation>
    </message>
    <message>
        <source>Hardware settings</source>
        <translation>Donanım ayarları</translation>
    </message>
    <message>
        <source>Printing</source>
        <translation>Yazdırma</translation>
    </message>
    <message>
        <source>Package managers</source>
        <translation>Paket yöneticileri</translation>
    </message>
    <message>
        <source>Dial-up connections</source>
        <translation>Çevirmeli bağlantılar</translation>
    </message>
    <message>
        <source>Instant messaging</source>
        <translation>Anlık ileti</translation>
    </message>
    <message>
        <source>Chat</source>
        <translation>Sohbet</translation>
    </message>
    <message>
        <source>IRC</source>
        <translation>IRC</translation>
    </message>
    <message>
        <source>News feeds</source>
        <translation>Haber akışları</translation>
    </message>
    <message>
        <source>File transfer</source>
        <translation>Dosya aktarımı</translation>
    </message>
    <message>
        <source>Amateur radio</source>
        <translation>Amatör telsiz</translation>
    </message>
    <message>
        <source>Newsgroups</source>
        <translation>Haber grupları</translation>
    </message>
    <message>
        <source>File sharing</source>
        <translation>Dosya paylaşımı</translation>
    </message>
    <message>
        <source>Remote access</source>
        <translation>Uzaktan erişim</translation>
    </message>
    <message>
        <source>Telephony</source>
        <translation>Telefon</translation>
    </message>
    <message>
        <source>Telephony tools</source>
        <translation>Telefon araçları</translation>
    </message>
    <message>
        <source>Video conferences</source>
        <translation>Görüntülü görüşmeler</translation>
    </message>
    <message>
        <source>Web browsers</source>
        <translation>Web tarayıcıları</translation>
    </message>
    <message>
        <source>Web development</source>
        <translation>Web geliştirme</translation>
    </message>
    <message>
        <source>MIDI</source>
        <translation>MIDI</translation>
    </message>
    <message>
        <source>Mixers</source>
        <translation>Karıştırıcılar</translation>
    </message>
    <message>
        <source>Sequencers</source>
        <translation>Sıralayıcılar</translation>
    </message>
    <message>
        <source>Tuners</source>
        <translation>Akort araçları</translation>
    </message>
    <message>
        <source>Television</source>
        <translation>Televizyon</translation>
    </message>
    <message>
        <source>Audio and video editing</source>
        <translation>Ses ve video düzenleme</translation>
    </message>
    <message>
        <source>Players</source>
        <translation>Oynatıcılar</translation>
    </message>
    <message>
        <source>Recorders</source>
        <translation>Kaydediciler</translation>
    </message>
    <message>
        <source>Disc burning</source>
        <translation>Disk yazma</translation>
    </message>
    <message>
        <source>Action games</source>
        <translation>Aksiyon oyunları</translation>
    </message>
    <message>
        <source>Adventure games</source>
        <translation>Macera oyunları</translation>
    </message>
    <message>
        <source>Arcade games</source>
        <translation>Atari oyunları</translation>
    </message>
    <message>
        <source>Board games</source>
        <translation>Masa oyunları</translation>
    </message>
    <message>
        <source>Falling blocks games</source>
        <translation>Düşen blok oyunları</translation>
    </message>
    <message>
        <source>Card games</source>
        <translation>Kart oyunları</translation>
    </message>
    <message>
        <source>Games for children</source>
        <translation>Çocuk oyunları</translation>
    </message>
    <message>
        <source>Logic games</source>
        <translation>Mantık oyunları</translation>
    </message>
    <message>
        <source>Role-playing games</source>
        <translation>Rol yapma oyunları</translation>
    </message>
    <message>
        <source>Shooters</source>
        <translation>Nişancı oyunları</translation>
    </message>
    <message>
        <source>Simulations</source>
        <translation>Benzetimler</translation>
    </message>
    <message>
        <source>Sports games</source>
        <translation>Spor oyunları</translation>
    </message>
    <message>
        <source>Strategy games</source>
        <translation>Strateji oyunları</translation>
    </message>
    <message>
        <source>Art</source>
        <translation>Sanat</translation>
    </message>
    <message>
        <source>Construction</source>
        <translation>İnşaat</translation>
    </message>
    <message>
        <source>Music</source>
        <translation>Müzik</translation>
    </message>
    <message>
        <source>Languages</source>
        <translation>Diller</translation>
    </message>
    <message>
        <source>Artificial intelligence</source>
        <translation>Yapay zekâ</translation>
    </message>
    <message>
        <source>Astronomy</source>
        <translation>Gökbilim</translation>
    </message>
    <message>
        <source>Biology</source>
        <translation>Biyoloji</translation>
    </message>
    <message>
        <source>Chemistry</source>
        <translation>Kimya</translation>
    </message>
    <message>
        <source>Computer science</source>
        <translation>Bilgisayar bilimi</translation>
    </message>
    <message>
        <source>Data visualization</source>
        <translation>Veri görselleştirme</translation>
    </message>
    <message>
        <source>Economics</source>
        <translation>Ekonomi</translation>
    </message>
    <message>
        <source>Electricity</source>
        <translation>Elektrik</translation>
    </message>
    <message>
        <source>Geography</source>
        <translation>Coğrafya</translation>
    </message>
    <message>
        <source>Geology</source>
        <translation>Jeoloji</translation>
    </message>
    <message>
        <source>Earth sciences</source>
        <translation>Yer bilimleri</translation>
    </message>
    <message>
        <source>History</source>
        <translation>Tarih</translation>
    </message>
    <message>
        <source>Humanities</source>
        <translation>Beşerî bilimler</translation>
    </message>
    <message>
        <source>Image processing</source>
        <translation>Görüntü işleme</translation>
    </message>
    <message>
        <source>Literature</source>
        <translation>Edebiyat</translation>
    </message>
    <message>
        <source>Maps</source>
        <translation>Haritalar</translation>
    </message>
    <message>
        <source>Mathematics</source>
        <translation>Matematik</translation>
    </message>
    <message>
        <source>Numerical analysis</source>
        <translation>Sayısal çözümleme</translation>
    </message>
    <message>
        <source>Medicine</source>
        <translation>Tıp</translation>
    </message>
    <message>
        <source>Physics</source>
        <translation>Fizik</translation>
    </message>
    <message>
        <source>Robotics</source>
        <translation>Robotik</translation>
    </message>
    <message>
        <source>Spirituality</source>
        <translation>Maneviyat</translation>
    </message>
    <message>
        <source>Sports</source>
        <translation>Spor</translation>
    </message>
    <message>
        <source>Parallel computing</source>
        <translation>Koşut hesaplama</translation>
    </message>
    <message>
        <source>Amusement</source>
        <translation>Eğlence</translation>
    </message>
    <message>
        <source>Archiving</source>
        <translation>Arşivleme</translation>
    </message>
    <message>
        <source>Compression</source>
        <translation>Sıkıştırma</translation>
    </message>
    <message>
        <source>Electronics</source>
        <translation>Elektronik</translation>
    </message>
    <message>
        <source>Emulators</source>
        <translation>Öykünücüler</translation>
    </message>
    <message>
        <source>Engineering</source>
        <translation>Mühendislik</translation>
    </message>
    <message>
        <source>File tools</source>
        <translation>Dosya araçları</translation>
    </message>
    <message>
        <source>File managers</source>
        <translation>Dosya yöneticileri</translation>
    </message>
    <message>
        <source>Terminals</source>
        <translation>Uçbirimler</translation>
    </message>
    <message>
        <source>File systems</source>
        <translation>Dosya sistemleri</translation>
    </message>
    <message>
        <source>Monitors</source>
        <translation>Sistem izleyicileri</translation>
    </message>
    <message>
        <source>Security</source>
        <translation>Güvenlik</translation>
    </message>
    <message>
        <source>Accessibility</source>
        <translation>Erişilebilirlik</translation>
    </message>
    <message>
        <source>Calculators</source>
        <translation>Hesap makineleri</translation>
    </message>
    <message>
        <source>Clocks</source>
        <translation>Saatler</translation>
    </message>
    <message>
        <source>Text editors</source>
        <translation>Metin düzenleyiciler</translation>
    </message>
    <message>
        <source>Documentation</source>
        <translation>Belgelendirme</translation>
    </message>
    <message>
        <source>For adults</source>
        <translation>Yetişkinler için</translation>
    </message>
    <message>
        <source>Core of the desktop</source>
        <translation>Masaüstünün çekirdeği</translation>
    </message>
    <message>
        <source>Made with KDE</source>
        <translation>KDE ile yapılanlar</translation>
    </message>
    <message>
        <source>Made with GNOME</source>
        <translation>GNOME ile yapılanlar</translation>
    </message>
    <message>
        <source>Made with Xfce</source>
        <translation>Xfce ile yapılanlar</translation>
    </message>
    <message>
        <source>Made with GTK</source>
        <translation>GTK ile yapılanlar</translation>
    </message>
    <message>
        <source>Made with Qt</source>
        <translation>Qt ile yapılanlar</translation>
    </message>
    <message>
        <source>Made with Motif</source>
        <translation>Motif ile yapılanlar</translation>
    </message>
    <message>
        <source>Made with Java</source>
        <translation>Java ile yapılanlar</translation>
    </message>
    <message>
        <source>For the console</source>
        <translation>Konsol için</translation>
    </message>
    <message>
        <source>Screen savers</source>
        <translation>Ekran koruyucular</translation>
    </message>
    <message>
        <source>Icons of the system tray</source>
        <translation>Sistem tepsisi simgeleri</translation>
    </message>
    <message>
        <source>Applets of a panel</source>
        <translation>Panel uygulamacıkları</translation>
    </message>
    <message>
        <source>Desktop shells</source>
        <translation>Masaüstü kabukları</translation>
    </message>
    <message>
        <source>Applications</source>
        <translation>Uygulamalar</translation>
    </message>
</context>
<context>
    <name>VelUI::ChoiceDialog</name>
    <message>
        <source>Filter</source>
        <translation>Süzgeç</translation>
    </message>
    <message>
        <source>Type to filter</source>
        <translation>Süzmek için yazın</translation>
    </message>
    <message>
        <source>Reading...</source>
        <translation>Okunuyor...</translation>
    </message>
    <message>
        <source>No match</source>
        <translation>Eşleşme yok</translation>
    </message>
    <message numerus="yes">
        <source>%n chosen</source>
        <translation>
            <numerusform>%n seçildi</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>VelUI::DesktopChooser</name>
    <message>
        <source>Desktop environment</source>
        <translation>Masaüstü ortamı</translation>
    </message>
    <message>
        <source>Remark</source>
        <comment>title of a column</comment>
        <translation>Not</translation>
    </message>
    <message>
        <source>This session</source>
        <translation>Bu oturum</translation>
    </message>
    <message>
        <source>Not registered</source>
        <translation>Kayıtlı değil</translation>
    </message>
</context>
<context>
    <name>VelUI::EditActionsDialog</name>
    <message>
        <source>An action has no id. It can have &quot;%1&quot;.</source>
        <translation>Bir eylemin kimliği yok. Kimliği &quot;%1&quot; olabilir.</translation>
    </message>
    <message>
        <source>Two actions have the id &quot;%1&quot;. The second one can have &quot;%2&quot;.</source>
        <translation>İki eylemin kimliği &quot;%1&quot;. İkincisininki &quot;%2&quot; olabilir.</translation>
    </message>
    <message>
        <source>No entry can hold the id &quot;%1&quot;. It can be &quot;%2&quot;.</source>
        <translation>Hiçbir girdi &quot;%1&quot; kimliğini içeremez. &quot;%2&quot; olabilir.</translation>
    </message>
    <message>
        <source>The id &quot;%1&quot; should have only A to Z, a to z, 0 to 9 and &quot;-&quot; in it, as &quot;%2&quot; has.</source>
        <translation>&quot;%1&quot; kimliğinde, &quot;%2&quot; kimliğinde olduğu gibi, yalnızca A-Z, a-z, 0-9 ve &quot;-&quot; bulunmalıdır.</translation>
    </message>
    <message numerus="yes">
        <source>%n more id(s) should be changed.</source>
        <translation>
            <numerusform>%n kimlik daha değiştirilmelidir.</numerusform>
        </translation>
    </message>
    <message>
        <source>Use &quot;%1&quot;</source>
        <translation>&quot;%1&quot; kullan</translation>
    </message>
    <message>
        <source>Use the proposed ids</source>
        <translation>Önerilen kimlikleri kullan</translation>
    </message>
</context>
<context>
    <name>VelUI::EditActionsWidget</name>
    <message>
        <source>Add action</source>
        <translation>Eylem ekle</translation>
    </message>
    <message>
        <source>Edit action</source>
        <translation>Eylemi düzenle</translation>
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
        <translation>&quot;%1&quot; içindeki &quot;;&quot; ögeleri ayırmaz, tek bir ögenin parçası olur.</translation>
    </message>
    <message numerus="yes">
        <source>Make %n item(s) of it</source>
        <translation>
            <numerusform>Bundan %n öge yap</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>VelUI::EditableListWidget</name>
    <message>
        <source>Add string</source>
        <translation>Dizge ekle</translation>
    </message>
    <message>
        <source>String:</source>
        <translation>Dizge:</translation>
    </message>
    <message>
        <source>Edit string</source>
        <translation>Dizgeyi düzenle</translation>
    </message>
</context>
<context>
    <name>VelUI::EntryFormAssistance</name>
    <message>
        <source>Te&amp;xt</source>
        <comment>button: shows the file of the entry</comment>
        <translation>&amp;Metin</translation>
    </message>
    <message>
        <source>Shows the file as it would be saved</source>
        <translation>Dosyayı kaydedileceği biçimiyle gösterir</translation>
    </message>
</context>
<context>
    <name>VelUI::EntryTextDialog</name>
    <message>
        <source>Text of the entry</source>
        <translation>Girdinin metni</translation>
    </message>
    <message>
        <source>The file as it would be saved</source>
        <translation>Kaydedileceği biçimiyle dosya</translation>
    </message>
    <message>
        <source>Nothing is changed.</source>
        <translation>Hiçbir şey değişmedi.</translation>
    </message>
    <message>
        <source>≠ changed lines: %1, + new lines: %2, removed lines: %3</source>
        <translation>≠ değişen satırlar: %1, + yeni satırlar: %2, kaldırılan satırlar: %3</translation>
    </message>
</context>
<context>
    <name>VelUI::FieldChoosers</name>
    <message>
        <source>Choose %1</source>
        <comment>name of a &quot;Choose...&quot; button</comment>
        <translation>%1 seç</translation>
    </message>
    <message>
        <source>Choose...</source>
        <translation>Seç...</translation>
    </message>
    <message>
        <source>Chooses from all that are known (Alt+Down)</source>
        <translation>Bilinenlerin tümü arasından seçtirir (Alt+Aşağı)</translation>
    </message>
    <message>
        <source>Chooses an installed program (Alt+Down)</source>
        <translation>Kurulu bir program seçtirir (Alt+Aşağı)</translation>
    </message>
    <message>
        <source>Insert</source>
        <comment>button: a field code</comment>
        <translation>Ekle</translation>
    </message>
    <message>
        <source>Insert a field code</source>
        <translation>Alan kodu ekle</translation>
    </message>
    <message>
        <source>Inserts a code that stands for the files to open, or for a part of this entry</source>
        <translation>Açılacak dosyaların veya bu girdinin bir bölümünün yerini tutan bir kod ekler</translation>
    </message>
</context>
<context>
    <name>VelUI::FieldCodes</name>
    <message>
        <source>%f: one file; for several files the program is started several times</source>
        <translation>%f: tek dosya; birden çok dosya için program birden çok kez başlatılır</translation>
    </message>
    <message>
        <source>%F: all files, each as a word of its own</source>
        <translation>%F: tüm dosyalar, her biri ayrı bir sözcük olarak</translation>
    </message>
    <message>
        <source>%u: one address (URL) or file; for several the program is started several times</source>
        <translation>%u: tek adres (URL) veya dosya; birden çoğu için program birden çok kez başlatılır</translation>
    </message>
    <message>
        <source>%U: all addresses (URLs) or files, each as a word of its own</source>
        <translation>%U: tüm adresler (URL) veya dosyalar, her biri ayrı bir sözcük olarak</translation>
    </message>
    <message>
        <source>%i: --icon and the icon of this entry, if it has one</source>
        <translation>%i: --icon ve varsa bu girdinin simgesi</translation>
    </message>
    <message>
        <source>%c: the name of this entry, translated</source>
        <translation>%c: bu girdinin çevrilmiş adı</translation>
    </message>
    <message>
        <source>%k: where the file of this entry lies</source>
        <translation>%k: bu girdinin dosyasının bulunduğu yer</translation>
    </message>
    <message>
        <source>%%: a percent sign</source>
        <translation>%%: yüzde işareti</translation>
    </message>
</context>
<context>
    <name>VelUI::FindingLine</name>
    <message>
        <source>Fix</source>
        <translation>Düzelt</translation>
    </message>
    <message>
        <source>Fix: %1</source>
        <comment>on a button; %1 is what it does</comment>
        <translation>Düzelt: %1</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>how bad something is, and what it is</comment>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Hata</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Uyarı</translation>
    </message>
    <message>
        <source>Hint</source>
        <translation>İpucu</translation>
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
        <translation>%1 değişikliğini geri al</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Geri al</translation>
    </message>
    <message>
        <source>Redo change of %1</source>
        <translation>%1 değişikliğini yinele</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Yinele</translation>
    </message>
</context>
<context>
    <name>VelUI::FormLayout</name>
    <message>
        <source>Edit %1</source>
        <comment>name of a &quot;...&quot; button</comment>
        <translation>%1 düzenle</translation>
    </message>
</context>
<context>
    <name>VelUI::LanguageBar</name>
    <message>
        <source>&amp;Language:</source>
        <translation>&amp;Dil:</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Dil</translation>
    </message>
    <message>
        <source>Another language...</source>
        <translation>Başka dil...</translation>
    </message>
    <message>
        <source>Another language</source>
        <translation>Başka dil</translation>
    </message>
    <message>
        <source>Unknown language</source>
        <translation>Bilinmeyen dil</translation>
    </message>
    <message>
        <source>%1 (%2), yours: %3 of %4 texts</source>
        <translation>%1 (%2), sizin diliniz: %3 / %4 metin</translation>
    </message>
    <message>
        <source>%1 (%2), yours: no text yet</source>
        <translation>%1 (%2), sizin diliniz: henüz metin yok</translation>
    </message>
    <message>
        <source>%1 (%2): %3 of %4 texts</source>
        <translation>%1 (%2): %3 / %4 metin</translation>
    </message>
    <message>
        <source>%1 (%2): no text yet</source>
        <translation>%1 (%2): henüz metin yok</translation>
    </message>
</context>
<context>
    <name>VelUI::LanguageDialog</name>
    <message>
        <source>Another language</source>
        <translation>Başka dil</translation>
    </message>
    <message>
        <source>&amp;Language or its code, such as pt_BR:</source>
        <translation>&amp;Dil veya kodu, örneğin pt_BR:</translation>
    </message>
    <message>
        <source>Language or its code</source>
        <translation>Dil veya kodu</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>a language and its code</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>No language has such a code: it is like de, pt_BR or sr@latin.</source>
        <translation>Hiçbir dilin böyle bir kodu yok: kodlar de, pt_BR veya sr@latin gibidir.</translation>
    </message>
    <message>
        <source>The code %1 is well-formed, but no language of this name is known.</source>
        <translation>%1 kodu doğru biçimde, ama bu adla bilinen bir dil yok.</translation>
    </message>
</context>
<context>
    <name>VelUI::MimeTypeChooser</name>
    <message>
        <source>Choose MIME types</source>
        <translation>MIME türlerini seçin</translation>
    </message>
</context>
<context>
    <name>VelUI::MimeTypeSource</name>
    <message>
        <source>MIME type</source>
        <translation>MIME türü</translation>
    </message>
    <message>
        <source>Description</source>
        <translation>Açıklama</translation>
    </message>
    <message>
        <source>File names</source>
        <translation>Dosya adları</translation>
    </message>
    <message>
        <source>Not in the database</source>
        <translation>Veri tabanında yok</translation>
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
        <translation>Uygulamanın çalıştırma yolunu seçin</translation>
    </message>
</context>
<context>
    <name>VelUI::ProgramChooser</name>
    <message>
        <source>Choose a program</source>
        <translation>Program seçin</translation>
    </message>
</context>
<context>
    <name>VelUI::ProgramSource</name>
    <message>
        <source>Program</source>
        <comment>title of a column</comment>
        <translation>Program</translation>
    </message>
    <message>
        <source>Folder</source>
        <comment>title of a column</comment>
        <translation>Klasör</translation>
    </message>
</context>
<context>
    <name>VelUI::RowFindings</name>
    <message numerus="yes">
        <source>And %n more.</source>
        <translation>
            <numerusform>Ve %n tane daha.</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>VelUI::TrialLine</name>
    <message>
        <source>Stop</source>
        <comment>button: ends the trial of an entry</comment>
        <translation>Durdur</translation>
    </message>
    <message>
        <source>T&amp;ry</source>
        <comment>button: runs the entry</comment>
        <translation>D&amp;ene</translation>
    </message>
    <message>
        <source>Stops the trial</source>
        <translation>Denemeyi durdurur</translation>
    </message>
    <message>
        <source>Runs the entry as it is now, without saving it</source>
        <translation>Girdiyi kaydetmeden, şu anki hâliyle çalıştırır</translation>
    </message>
    <message>
        <source>The program vel-open, which runs entries, could not be started: %1</source>
        <translation>Girdileri çalıştıran vel-open programı başlatılamadı: %1</translation>
    </message>
    <message>
        <source>The trial was stopped.</source>
        <translation>Deneme durduruldu.</translation>
    </message>
    <message>
        <source>The entry was started (exit status 0).</source>
        <translation>Girdi başlatıldı (çıkış durumu 0).</translation>
    </message>
    <message>
        <source>The entry was started (exit status 0): %1</source>
        <translation>Girdi başlatıldı (çıkış durumu 0): %1</translation>
    </message>
    <message>
        <source>The entry could not be started (exit status %1).</source>
        <translation>Girdi başlatılamadı (çıkış durumu %1).</translation>
    </message>
    <message>
        <source>The entry could not be started (exit status %1): %2</source>
        <translation>Girdi başlatılamadı (çıkış durumu %1): %2</translation>
    </message>
</context>
</TS>
