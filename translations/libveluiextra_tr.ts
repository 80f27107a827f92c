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
    <name>VelUI::FormLayout</name>
    <message>
        <source>Edit %1</source>
        <comment>name of a &quot;...&quot; button</comment>
        <translation>%1 düzenle</translation>
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
</TS>
