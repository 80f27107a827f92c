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
        <source>Hide</source>
        <translation>Gizle</translation>
    </message>
    <message>
        <source>Show again</source>
        <translation>Yeniden göster</translation>
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
        <source>Reload</source>
        <translation>Yeniden yükle</translation>
    </message>
    <message>
        <source>This menu is empty. Press %1 for a new entry, or right-click here for what else can be added.</source>
        <translation>Bu menü boş. Yeni girdi için %1 tuşuna basın veya başka neler eklenebileceğini görmek için burada sağ tıklayın.</translation>
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
