<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="tr" sourcelanguage="en">
<context>
    <name>DesktopEntryPages</name>
    <message>
        <source>&amp;Read-only</source>
        <translation>&amp;Salt okunur</translation>
    </message>
    <message>
        <source>&amp;Button beside the address</source>
        <translation>Adresin yanında &amp;düğme</translation>
    </message>
    <message>
        <source>Information requested for %1</source>
        <translation>%1 hakkında bilgi istendi</translation>
    </message>
    <message>
        <source>Use the buttons beside the fields to edit commands, files, icons, lists and actions.</source>
        <translation>Komutlar ve dosyalar, simgeler, listeler ve eylemler alanlarının düğmeleriyle düzenlenir.</translation>
    </message>
    <message>
        <source>Properties form</source>
        <translation>Özellikler formu</translation>
    </message>
    <message>
        <source>Desktop entries</source>
        <translation>Masaüstü girdileri</translation>
    </message>
    <message>
        <source>Paths, icons, lists and actions</source>
        <translation>Yollar, simgeler, listeler ve eylemler</translation>
    </message>
    <message>
        <source>&amp;Assistance</source>
        <translation>&amp;Yardımcı</translation>
    </message>
</context>
<context>
    <name>EditorCommands</name>
    <message>
        <source>Open</source>
        <translation>Aç</translation>
    </message>
    <message>
        <source>Cannot read %1.</source>
        <translation>%1 okunamıyor.</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Kaydet</translation>
    </message>
    <message>
        <source>Cannot write %1.</source>
        <translation>%1 yazılamıyor.</translation>
    </message>
    <message>
        <source>Go to line</source>
        <translation>Satıra git</translation>
    </message>
    <message>
        <source>Line:</source>
        <translation>Satır:</translation>
    </message>
    <message>
        <source>File</source>
        <translation>Dosya</translation>
    </message>
    <message>
        <source>&amp;New</source>
        <translation>&amp;Yeni</translation>
    </message>
    <message>
        <source>&amp;Open...</source>
        <translation>&amp;Aç...</translation>
    </message>
    <message>
        <source>&amp;Save...</source>
        <translation>&amp;Kaydet...</translation>
    </message>
    <message>
        <source>Insert &amp;date</source>
        <translation>&amp;Tarih ekle</translation>
    </message>
    <message>
        <source>Insert &amp;time</source>
        <translation>&amp;Saat ekle</translation>
    </message>
    <message>
        <source>Insert &amp;rule</source>
        <translation>Ayı&amp;rma çizgisi ekle</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Düzen</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>&amp;Geri al</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>&amp;Yinele</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>Ke&amp;s</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>&amp;Kopyala</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>Ya&amp;pıştır</translation>
    </message>
    <message>
        <source>Select &amp;all</source>
        <translation>&amp;Tümünü seç</translation>
    </message>
    <message>
        <source>Select word</source>
        <translation>Sözcüğü seç</translation>
    </message>
    <message>
        <source>Select line</source>
        <translation>Satırı seç</translation>
    </message>
    <message>
        <source>Select paragraph</source>
        <translation>Paragrafı seç</translation>
    </message>
    <message>
        <source>Find selected a&amp;gain</source>
        <translation>Seçileni yine &amp;bul</translation>
    </message>
    <message>
        <source>Find selected backward</source>
        <translation>Seçileni önceki konumda bul</translation>
    </message>
    <message>
        <source>Find selected word</source>
        <translation>Seçili sözcüğü bul</translation>
    </message>
    <message>
        <source>Find selected, matching case</source>
        <translation>Seçileni büyük/küçük harfe duyarlı bul</translation>
    </message>
    <message>
        <source>Go to &amp;line...</source>
        <translation>S&amp;atıra git...</translation>
    </message>
    <message>
        <source>Go to start</source>
        <translation>Başa git</translation>
    </message>
    <message>
        <source>Go to end</source>
        <translation>Sona git</translation>
    </message>
    <message>
        <source>Go to next paragraph</source>
        <translation>Sonraki paragrafa git</translation>
    </message>
    <message>
        <source>Go to previous paragraph</source>
        <translation>Önceki paragrafa git</translation>
    </message>
    <message>
        <source>Delete word to the left</source>
        <translation>Soldaki sözcüğü sil</translation>
    </message>
    <message>
        <source>Delete word to the right</source>
        <translation>Sağdaki sözcüğü sil</translation>
    </message>
    <message>
        <source>Delete to start of line</source>
        <translation>Satır başına kadar sil</translation>
    </message>
    <message>
        <source>Delete to end of line</source>
        <translation>Satır sonuna kadar sil</translation>
    </message>
    <message>
        <source>To upper case</source>
        <translation>Büyük harfe çevir</translation>
    </message>
    <message>
        <source>To lower case</source>
        <translation>Küçük harfe çevir</translation>
    </message>
    <message>
        <source>Swap case</source>
        <translation>Büyük ve küçük harfleri değiştir</translation>
    </message>
    <message>
        <source>Capitalize</source>
        <translation>İlk harfi büyüt</translation>
    </message>
    <message>
        <source>Move line up</source>
        <translation>Satırı yukarı taşı</translation>
    </message>
    <message>
        <source>Move line down</source>
        <translation>Satırı aşağı taşı</translation>
    </message>
    <message>
        <source>New line above</source>
        <translation>Üste yeni satır</translation>
    </message>
    <message>
        <source>New line below</source>
        <translation>Alta yeni satır</translation>
    </message>
    <message>
        <source>Duplicate lines</source>
        <translation>Satırları çoğalt</translation>
    </message>
    <message>
        <source>Join lines</source>
        <translation>Satırları birleştir</translation>
    </message>
    <message>
        <source>Sort lines</source>
        <translation>Satırları sırala</translation>
    </message>
    <message>
        <source>Reverse lines</source>
        <translation>Satırları ters çevir</translation>
    </message>
    <message>
        <source>Remove duplicate lines</source>
        <translation>Yinelenen satırları kaldır</translation>
    </message>
    <message>
        <source>Remove empty lines</source>
        <translation>Boş satırları kaldır</translation>
    </message>
    <message>
        <source>Trim lines</source>
        <translation>Satır boşluklarını kırp</translation>
    </message>
    <message>
        <source>Indent lines</source>
        <translation>Satırları girintile</translation>
    </message>
    <message>
        <source>Unindent lines</source>
        <translation>Satır girintisini azalt</translation>
    </message>
    <message>
        <source>Comment lines</source>
        <translation>Satırları yorum yap</translation>
    </message>
    <message>
        <source>Uncomment lines</source>
        <translation>Satırları yorumdan çıkar</translation>
    </message>
    <message>
        <source>Tabs to spaces</source>
        <translation>Sekmeleri boşluğa çevir</translation>
    </message>
    <message>
        <source>View</source>
        <translation>Görünüm</translation>
    </message>
    <message>
        <source>Zoom &amp;in</source>
        <translation>&amp;Yakınlaştır</translation>
    </message>
    <message>
        <source>Zoom &amp;out</source>
        <translation>&amp;Uzaklaştır</translation>
    </message>
    <message>
        <source>&amp;Wrap lines</source>
        <translation>Satırları &amp;kaydır</translation>
    </message>
    <message>
        <source>&amp;Fixed-width font</source>
        <translation>&amp;Sabit genişlik</translation>
    </message>
    <message>
        <source>&amp;Proportional font</source>
        <translation>&amp;Orantılı genişlik</translation>
    </message>
    <message>
        <source>O&amp;verwrite</source>
        <translation>Ü&amp;zerine yaz</translation>
    </message>
    <message>
        <source>&amp;Read only</source>
        <translation>Sal&amp;t okunur</translation>
    </message>
    <message>
        <source>Wide cur&amp;sor</source>
        <translation>&amp;Geniş imleç</translation>
    </message>
    <message>
        <source>&amp;Center on cursor</source>
        <translation>İ&amp;mlece ortala</translation>
    </message>
    <message>
        <source>Scroll &amp;up</source>
        <translation>Yuka&amp;rı kaydır</translation>
    </message>
    <message>
        <source>Scroll &amp;down</source>
        <translation>&amp;Aşağı kaydır</translation>
    </message>
    <message>
        <source>Scroll to &amp;top</source>
        <translation>En başa kay&amp;dır</translation>
    </message>
    <message>
        <source>Scroll to botto&amp;m</source>
        <translation>&amp;En sona kaydır</translation>
    </message>
    <message>
        <source>Text</source>
        <translation>Metin</translation>
    </message>
    <message>
        <source>Keys</source>
        <translation>Tuşlar</translation>
    </message>
    <message>
        <source>The file has %1 for %2, but %3 has it, too.</source>
        <translation>Dosyada %1 kısayolu %2 için, ama %3 de bunu kullanıyor.</translation>
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
        <source>Save cheat sheet as te&amp;xt...</source>
        <translation>Özet sayfasını &amp;metin olarak kaydet...</translation>
    </message>
    <message>
        <source>&amp;Copy cheat sheet</source>
        <translation>&amp;Özet sayfasını kopyala</translation>
    </message>
</context>
<context>
    <name>EntryWindow</name>
    <message>
        <source>Unsaved changes</source>
        <translation>Kaydedilmemiş değişiklikler</translation>
    </message>
    <message>
        <source>The entry %1 was changed.
Save the changes?</source>
        <translation>%1 girdisi değiştirildi.
Değişiklikler kaydedilsin mi?</translation>
    </message>
</context>
<context>
    <name>FileIconsPage</name>
    <message>
        <source>File icons</source>
        <translation>Dosya simgeleri</translation>
    </message>
    <message>
        <source>Models</source>
        <translation>Modeller</translation>
    </message>
</context>
<context>
    <name>GalleryWindow</name>
    <message>
        <source>Widget gallery</source>
        <translation>Parçacık galerisi</translation>
    </message>
    <message>
        <source>Pages</source>
        <translation>Sayfalar</translation>
    </message>
    <message>
        <source>Code of this page</source>
        <translation>Bu sayfanın kodu</translation>
    </message>
</context>
<context>
    <name>KeyNamesPage</name>
    <message>
        <source>&amp;Press keys:</source>
        <translation>&amp;Tuşlara basın:</translation>
    </message>
    <message>
        <source>In the window manager&apos;s notation:</source>
        <translation>Pencere yöneticisinin yazdığı biçimde:</translation>
    </message>
    <message>
        <source>Read back:</source>
        <translation>Geri okunan:</translation>
    </message>
    <message>
        <source>Global action with these keys:</source>
        <translation>Bu tuşlarla genel eylem:</translation>
    </message>
    <message>
        <source>Key names</source>
        <translation>Tuş adları</translation>
    </message>
    <message>
        <source>Shortcuts</source>
        <translation>Kısayollar</translation>
    </message>
</context>
<context>
    <name>MenuPages</name>
    <message>
        <source>&amp;Pick an entry...</source>
        <translation>Bir girdi &amp;seç...</translation>
    </message>
    <message>
        <source>Edit the &amp;menu...</source>
        <translation>&amp;Menüyü düzenle...</translation>
    </message>
    <message>
        <source>Edit an e&amp;ntry...</source>
        <translation>Bir &amp;girdiyi düzenle...</translation>
    </message>
    <message>
        <source>Menu tree</source>
        <translation>Menü ağacı</translation>
    </message>
    <message>
        <source>Menus</source>
        <translation>Menüler</translation>
    </message>
    <message>
        <source>Menu and entry dialogs</source>
        <translation>Menü ve girdi iletişim kutuları</translation>
    </message>
    <message>
        <source>&amp;Assistance</source>
        <translation>&amp;Yardımcı</translation>
    </message>
</context>
<context>
    <name>RadioGroupBoxPage</name>
    <message>
        <source>&amp;Automatic configuration</source>
        <translation>&amp;Otomatik yapılandırma</translation>
    </message>
    <message>
        <source>Script address:</source>
        <translation>Betik adresi:</translation>
    </message>
    <message>
        <source>Ask again at every start</source>
        <translation>Her başlangıçta yeniden sor</translation>
    </message>
    <message>
        <source>&amp;Manual configuration</source>
        <translation>&amp;Elle yapılandırma</translation>
    </message>
    <message>
        <source>Host:</source>
        <translation>Makine:</translation>
    </message>
    <message>
        <source>Port:</source>
        <translation>Kapı:</translation>
    </message>
    <message>
        <source>Protocol:</source>
        <translation>İletişim kuralı:</translation>
    </message>
    <message>
        <source>&amp;Direct connection</source>
        <translation>&amp;Doğrudan bağlantı</translation>
    </message>
    <message>
        <source>There is nothing to set.</source>
        <translation>Hiçbir şeyin ayarlanması gerekmiyor.</translation>
    </message>
    <message>
        <source>Radio group boxes</source>
        <translation>Radyo düğmeli grup kutuları</translation>
    </message>
    <message>
        <source>Widgets</source>
        <translation>Parçacıklar</translation>
    </message>
</context>
<context>
    <name>SettingsPage</name>
    <message>
        <source>Settings file</source>
        <translation>Ayarlar dosyası</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Ayarlar</translation>
    </message>
    <message>
        <source>F&amp;lat buttons</source>
        <translation>&amp;Düz düğmeler</translation>
    </message>
    <message>
        <source>S&amp;ection:</source>
        <translation>&amp;Bölüm:</translation>
    </message>
    <message>
        <source>&amp;Font:</source>
        <translation>&amp;Yazı tipi:</translation>
    </message>
    <message>
        <source>&amp;Size:</source>
        <translation>B&amp;oyut:</translation>
    </message>
    <message>
        <source>Contents of the file on disk</source>
        <translation>Diskteki dosyanın içeriği</translation>
    </message>
    <message>
        <source>Name a settings file on the command line to edit it here.</source>
        <translation>Burada düzenlemek için komut satırında bir ayarlar dosyası belirtin.</translation>
    </message>
    <message>
        <source>%1 cannot be opened.</source>
        <translation>%1 açılamıyor.</translation>
    </message>
</context>
<context>
    <name>ShortcutsPage</name>
    <message>
        <source>Delete the whole line</source>
        <translation>Tüm satırı sil</translation>
    </message>
    <message>
        <source>Last command: %1</source>
        <translation>Son komut: %1</translation>
    </message>
    <message>
        <source>one line
another line
and a third one
</source>
        <translation>bir satır
bir satır daha
ve bir üçüncüsü
</translation>
    </message>
    <message>
        <source>Go to the editor</source>
        <translation>Düzenleyiciye git</translation>
    </message>
    <message>
        <source>View</source>
        <translation>Görünüm</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Ayarlar</translation>
    </message>
    <message>
        <source>Configure shortcuts...</source>
        <translation>Kısayolları yapılandır...</translation>
    </message>
    <message>
        <source>Shortcuts</source>
        <translation>Kısayollar</translation>
    </message>
    <message>
        <source>Configure shortcuts in the plain dialog...</source>
        <translation>Kısayolları yalın pencerede yapılandır...</translation>
    </message>
</context>
<context>
    <name>vel-entryedit</name>
    <message>
        <source>Edits a desktop entry.</source>
        <translation>Bir masaüstü girdisini düzenler.</translation>
    </message>
    <message>
        <source>Make a new entry when there is no such file.</source>
        <translation>Böyle bir dosya yoksa yeni bir girdi oluştur.</translation>
    </message>
    <message>
        <source>Begin with the values of the entry &lt;file&gt;.</source>
        <translation>&lt;file&gt; girdisinin değerleriyle başla.</translation>
    </message>
    <message>
        <source>Show the entry only.</source>
        <translation>Girdiyi yalnızca göster.</translation>
    </message>
    <message>
        <source>The entry to edit.</source>
        <translation>Düzenlenecek girdi.</translation>
    </message>
    <message>
        <source>one file has to be named</source>
        <translation>bir dosya belirtilmeli</translation>
    </message>
    <message>
        <source>cannot open %1</source>
        <translation>%1 açılamıyor</translation>
    </message>
    <message>
        <source>cannot open %1: there is no such file, --create makes a new entry</source>
        <translation>%1 açılamıyor: böyle bir dosya yok, --create yeni bir girdi oluşturur</translation>
    </message>
    <message>
        <source>cannot open %1: it is no regular file</source>
        <translation>%1 açılamıyor: sıradan bir dosya değil</translation>
    </message>
    <message>
        <source>cannot open %1: %2</source>
        <translation>%1 açılamıyor: %2</translation>
    </message>
</context>
<context>
    <name>vel-gallery</name>
    <message>
        <source>the page %1 did not finish loading</source>
        <translation>%1 sayfası hazır olmadı</translation>
    </message>
    <message>
        <source>cannot write %1</source>
        <translation>%1 yazılamıyor</translation>
    </message>
    <message>
        <source>cannot make the folder %1</source>
        <translation>%1 klasörü oluşturulamıyor</translation>
    </message>
    <message>
        <source>Shows the library&apos;s widgets, dialogs and models in action.</source>
        <translation>Kitaplığın parçacıklarını, iletişim kutularını ve modellerini çalışırken gösterir.</translation>
    </message>
    <message>
        <source>Start with the page &lt;name&gt;.</source>
        <translation>&lt;name&gt; sayfasıyla başla.</translation>
    </message>
    <message>
        <source>Write screenshots of every page, or of the page given with --page, to &lt;dir&gt; and exit.</source>
        <translation>Tüm sayfaların ya da --page ile verilen sayfanın resimlerini &lt;dir&gt; dizinine yaz ve bitir.</translation>
    </message>
    <message>
        <source>The settings file that the settings page edits.</source>
        <translation>Ayarlar sayfasının düzenlediği ayarlar dosyası.</translation>
    </message>
    <message>
        <source>Widget gallery</source>
        <translation>Parçacık galerisi</translation>
    </message>
    <message>
        <source>there is no page %1</source>
        <translation>%1 adlı bir sayfa yok</translation>
    </message>
</context>
<context>
    <name>vel-menuedit</name>
    <message>
        <source>cannot create the start menu %1</source>
        <translation>%1 başlat menüsü oluşturulamıyor</translation>
    </message>
    <message>
        <source>no such directory: %1</source>
        <translation>böyle bir klasör yok: %1</translation>
    </message>
    <message>
        <source>not a directory: %1</source>
        <translation>klasör değil: %1</translation>
    </message>
    <message>
        <source>cannot read the directory %1</source>
        <translation>%1 klasörü okunamıyor</translation>
    </message>
    <message>
        <source>Edits the start menu, or picks an entry of it.</source>
        <translation>Başlat menüsünü düzenler veya ondan bir girdi seçer.</translation>
    </message>
    <message>
        <source>Show the menu directory &lt;dir&gt; instead of the start menu.</source>
        <translation>Başlat menüsü yerine &lt;dir&gt; menü klasörünü göster.</translation>
    </message>
    <message>
        <source>Show the desktop folder.</source>
        <translation>Masaüstü klasörünü göster.</translation>
    </message>
    <message>
        <source>Show the tool bar.</source>
        <translation>Araç çubuğunu göster.</translation>
    </message>
    <message>
        <source>Look only, change nothing.</source>
        <translation>Yalnızca bak, hiçbir şeyi değiştirme.</translation>
    </message>
    <message>
        <source>Show icons of &lt;pixels&gt; pixels.</source>
        <translation>&lt;pixels&gt; piksellik simgeler göster.</translation>
    </message>
    <message>
        <source>Pick an entry and print its path and its command line.</source>
        <translation>Bir girdi seç ve yolunu ve komut satırını yazdır.</translation>
    </message>
    <message>
        <source>unexpected argument: %1</source>
        <translation>beklenmeyen argüman: %1</translation>
    </message>
    <message>
        <source>only one of --dir, --desktop and --toolbar can be given</source>
        <translation>--dir, --desktop ve --toolbar seçeneklerinden yalnızca biri verilebilir</translation>
    </message>
    <message>
        <source>--icon-size needs a number of pixels from 1 to 512, not &quot;%1&quot;</source>
        <translation>--icon-size için 1 ile 512 arasında bir piksel sayısı gerekir, &quot;%1&quot; değil</translation>
    </message>
</context>
<context>
    <name>vel-menuprint</name>
    <message>
        <source>Prints a menu directory in its order.</source>
        <translation>Bir menü klasörünü kendi sırasıyla yazdırır.</translation>
    </message>
    <message>
        <source>The menu directory; the start menu when none is given.</source>
        <translation>Menü klasörü; verilmezse başlat menüsü.</translation>
    </message>
    <message>
        <source>unknown format: %1</source>
        <translation>bilinmeyen biçim: %1</translation>
    </message>
    <message>
        <source>more than one directory</source>
        <translation>birden çok klasör</translation>
    </message>
    <message>
        <source>no such directory: %1</source>
        <translation>böyle bir klasör yok: %1</translation>
    </message>
    <message>
        <source>cannot read the directory %1</source>
        <translation>%1 klasörü okunamıyor</translation>
    </message>
    <message>
        <source>The menu has more than %1 items or %2 levels, and the rest of it is left out. Look for links that lead into the same folders again.</source>
        <translation>Menüde %1 ögeden veya %2 düzeyden fazlası var; geri kalanı atlandı. Aynı klasörlere tekrar tekrar götüren bağlantıları arayın.</translation>
    </message>
    <message>
        <source>What to print: %1. The default is text.</source>
        <translation>Ne yazdırılacağı: %1. Öntanımlısı text.</translation>
    </message>
    <message>
        <source>The icon theme to take the files of icons from; the user&apos;s own when none is given.</source>
        <translation>Simge dosyalarının alınacağı simge teması; verilmezse kullanıcının kendi teması.</translation>
    </message>
    <message>
        <source>The edge of the icons in pixels, 24 by default.</source>
        <translation>Simgelerin piksel olarak kenar uzunluğu, öntanımlı 24.</translation>
    </message>
    <message>
        <source>Reads one of the lines that rofi or dmenu was given from standard input and starts its entry.</source>
        <translation>rofi veya dmenu programına verilen satırlardan birini standart girdiden oku ve girdisini başlat.</translation>
    </message>
    <message>
        <source>the size of icons is not between 1 and %1</source>
        <translation>simge boyutu 1 ile %1 arasında değil</translation>
    </message>
    <message>
        <source>The start menu is empty: no application is installed.</source>
        <translation>Başlat menüsü boş: kurulu uygulama yok.</translation>
    </message>
    <message>
        <source>The start menu %1 cannot be made: %2</source>
        <translation>%1 başlat menüsü oluşturulamıyor: %2</translation>
    </message>
    <message>
        <source>%1 is left out, as the line end in its name cannot be written in this format. Rename it.</source>
        <translation>%1 dışarıda bırakıldı, çünkü adındaki satır sonu bu biçimde yazılamaz. Yeniden adlandırın.</translation>
    </message>
    <message>
        <source>The start menu is empty: nothing in %1 is shown.</source>
        <translation>Başlat menüsü boş: %1 içindeki hiçbir şey gösterilmiyor.</translation>
    </message>
    <message>
        <source>cannot run vel-open: %1</source>
        <translation>vel-open çalıştırılamıyor: %1</translation>
    </message>
    <message>
        <source>There is no &quot;%1&quot; in the menu.</source>
        <translation>Menüde &quot;%1&quot; yok.</translation>
    </message>
</context>
<context>
    <name>vel-wmbridge</name>
    <message>
        <source>Owns the window manager&apos;s command channel on a desktop that has none, and runs a command of the shell for each kind of update. The variable VEL_COMMAND holds the line that came.</source>
        <translation>Pencere yöneticisi komut kanalı olmayan bir masaüstünde bu kanalı üstlenir ve her güncelleme türü için bir kabuk komutu çalıştırır. VEL_COMMAND değişkeni gelen satırı içerir.</translation>
    </message>
    <message>
        <source>Run when the start menu has changed.</source>
        <translation>Başlat menüsü değiştiğinde çalıştır.</translation>
    </message>
    <message>
        <source>Run when the tool bar has changed.</source>
        <translation>Araç çubuğu değiştiğinde çalıştır.</translation>
    </message>
    <message>
        <source>Run when the desktop&apos;s entries have changed.</source>
        <translation>Masaüstünün girdileri değiştiğinde çalıştır.</translation>
    </message>
    <message>
        <source>Run for every other line.</source>
        <translation>Diğer her satır için çalıştır.</translation>
    </message>
    <message>
        <source>Take the channel from the program that has it.</source>
        <translation>Kanalı elinde tutan programdan al.</translation>
    </message>
    <message>
        <source>unexpected argument: %1</source>
        <translation>beklenmeyen argüman: %1</translation>
    </message>
    <message>
        <source>cannot run the command for %1</source>
        <translation>%1 için komut çalıştırılamıyor</translation>
    </message>
    <message>
        <source>another program has taken the channel</source>
        <translation>kanalı başka bir program aldı</translation>
    </message>
    <message>
        <source>cannot take the channel: there is no display, or another program has it</source>
        <translation>kanal alınamıyor: ekran yok veya kanal başka bir programda</translation>
    </message>
    <message>
        <source>unknown window manager: %1 (known are %2)</source>
        <translation>bilinmeyen pencere yöneticisi: %1 (bilinenler: %2)</translation>
    </message>
    <message>
        <source>Do what this window manager needs to show the start menu as it is: %1.</source>
        <translation>Bu pencere yöneticisinin başlat menüsünü olduğu gibi göstermesi için gerekeni yap: %1.</translation>
    </message>
</context>
</TS>
