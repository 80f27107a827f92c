// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FormDriving.h"
#include "PropsFormTestCase.h"

#include <VelDesktopEntryPropsWidget.h>
#include <desktopentry/EntryFormAssistance.h>
#include <desktopentry/FieldEdit.h>
#include <desktopentry/IconEdit.h>
#include <desktopentry/LanguageCode.h>
#include <desktopentry/StringListEdit.h>
#include <desktopentry/VelDesktopEntryPropsWidgetPrivate.h>

#include <QComboBox>
#include <QSignalSpy>
#include <QToolButton>

using namespace FormDriving;
using namespace VelUI;

/// All languages of an entry in the assisted form. The user's own is German.
class tst_EntryFormLanguages : public PropsFormTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void showsTheUsersLanguageAtFirst();
    void listsTheLanguagesOfTheEntry();
    void turnsEveryRowOfALanguage();
    void savesTheEditsOfSeveralLanguages();
    void changesNoByteByTurning();
    void removesATranslationThatIsEmptied();
    void keepsTheTieToTheUsersLanguage();
    void carriesNothingIntoAnotherLanguage();
    void editsTheVariantThatTheUserSees();
    void addsALanguageByItsCode();
    void addsALanguageByItsName();
    void refusesWhatIsNoCode();
    void turnsBackForAnotherEntry();
    void turnsBackWithoutAssistance();
    void savesTheTranslationsWithoutAssistance();
    void hidesTheRowsOfAnotherType();
    void savesNoKeywordsOfALink();
    void isReadOnlyInEveryLanguage();
    void tellsWhoSeesTheLanguage();

private:
    const QByteArray m_bytes =
        "[Desktop Entry]\nType=Application\nName=Editor\nName[de]=Editor\nName[fr]=\xC3\x89"
        "diteur\n"
        "Comment=Edits\nComment[fr]=\xC3\x89"
        "dite\n# kept\nIcon=a\nIcon[pt_BR]=b\nKeywords=t;\n"
        "Keywords[fr]=u;v;\nExec=e\n";

    static QComboBox *box(const QWidget &form) { return child<QComboBox>(&form, "languageBox"); }
    static void turn(const QWidget &form, const QString &language)
    {
        box(form)->setCurrentIndex(box(form)->findData(language));
        QCOMPARE(box(form)->currentData().toString(), language);
    }
    static QStringList items(const QWidget &form)
    {
        QStringList items;
        for (int i = 0; i < box(form)->count(); ++i)
            items.append(box(form)->itemText(i)
                         + (box(form)->itemIcon(i).isNull() ? QString() : QStringLiteral(" *")));
        return items;
    }
    static QLineEdit *line(const QWidget &form, const char *name) { return child<QLineEdit>(&form, name); }
    QByteArray saved(VelDesktopEntryPropsWidget &form)
    {
        VelUIDesktopEntry record = entry(m_bytes, QStringLiteral("again.desktop"));
        form.saveTo(&record);
        return PropsFormTestCase::saved(record);
    }
    static void addLanguage(const QWidget &form, const QString &text, bool isValid)
    {
        ModalDriver modal;
        modal.handle([&](QWidget *window) {
            child<QComboBox>(window, "newLanguageBox")->setEditText(text);
            QCOMPARE(okButton(window)->isEnabled(), isValid);
            if (isValid)
                click(okButton(window));
            else
                click(cancelButton(window));
        });
        click(child<QToolButton>(&form, "newLanguageButton"));
        QVERIFY(modal.finished());
    }
};

void tst_EntryFormLanguages::showsTheUsersLanguageAtFirst()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(entry(m_bytes));
    QCOMPARE(box(form)->currentIndex(), 0);
    QCOMPARE(box(form)->currentData(), QVariant(QString()));
    QVERIFY(shownRows(form).contains(QStringLiteral("Name [de]:")));
}

void tst_EntryFormLanguages::listsTheLanguagesOfTheEntry()
{
    VelDesktopEntryPropsWidget form;
    form.loadFrom(entry(m_bytes));
    form.setAssistance(true);
    QCOMPARE(items(form),
             QStringList({QStringLiteral("Deutsch (de), yours: 1 of 3 texts *"),
                          QString::fromUtf8("Fran\xC3\xA7"
                                            "ais (fr): 3 of 3 texts *"),
                          QString::fromUtf8("Portugu\xC3\xAAs (pt_BR): 0 of 3 texts *")}));
    form.loadFrom(entry("[Desktop Entry]\nType=Application\nName=a\n"));
    QCOMPARE(items(form), QStringList({QStringLiteral("Deutsch (de), yours: no text yet")}));
}

void tst_EntryFormLanguages::turnsEveryRowOfALanguage()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(entry(m_bytes));
    const QStringList formerRows = shownRows(form);
    turn(form, QStringLiteral("fr"));
    QCOMPARE(shownRows(form),
             QStringList(formerRows).replaceInStrings(QStringLiteral("[de]"), QStringLiteral("[fr]")));
    QCOMPARE(line(form, "otherNameEdit")->text(),
             QString::fromUtf8("\xC3\x89"
                               "diteur"));
    QCOMPARE(line(form, "otherNameEdit")->accessibleName(), QStringLiteral("Name [fr]"));
    QCOMPARE(line(form, "otherCommentEdit")->text(),
             QString::fromUtf8("\xC3\x89"
                               "dite"));
    QCOMPARE(line(form, "otherGenericNameEdit")->text(), QString());
    QCOMPARE(child<StringListEdit>(&form, "otherKeywordsEdit")->strings(),
             QStringList({QStringLiteral("u"), QStringLiteral("v")}));
    QVERIFY(line(form, "localNameEdit")->isHidden());
    turn(form, QStringLiteral("pt_BR"));
    QCOMPARE(child<IconEdit>(&form, "otherIconEdit")->icon(), QStringLiteral("b"));
    QCOMPARE(line(form, "otherNameEdit")->text(), QString());
    turn(form, QString());
    QCOMPARE(shownRows(form), formerRows);
    QVERIFY(!line(form, "localNameEdit")->isHidden());
    QVERIFY(line(form, "otherNameEdit")->isHidden());
}

void tst_EntryFormLanguages::savesTheEditsOfSeveralLanguages()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(entry(m_bytes));
    turn(form, QStringLiteral("fr"));
    retype(line(form, "otherCommentEdit"), QStringLiteral("Un"));
    FieldEdit::setValue(child<StringListEdit>(&form, "otherKeywordsEdit"), QStringList{QStringLiteral("w")});
    turn(form, QStringLiteral("pt_BR"));
    FieldEdit::setValue(child<IconEdit>(&form, "otherIconEdit"), QStringLiteral("c"));
    retype(line(form, "otherNameEdit"), QStringLiteral("Dois"));
    turn(form, QString());
    retype(line(form, "localCommentEdit"), QStringLiteral("Eins"));
    turn(form, QStringLiteral("fr"));
    QCOMPARE(line(form, "otherCommentEdit")->text(), QStringLiteral("Un"));

    QByteArray expected = m_bytes;
    expected
        .replace("Comment[fr]=\xC3\x89"
                 "dite\n",
                 "Comment[fr]=Un\nComment[de]=Eins\n")
        .replace("u;v;", "w;")
        .replace("Icon[pt_BR]=b", "Icon[pt_BR]=c")
        .replace("diteur\n", "diteur\nName[pt_BR]=Dois\n");
    QCOMPARE(saved(form), expected);
}

void tst_EntryFormLanguages::changesNoByteByTurning()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(entry(m_bytes));
    const QSignalSpy changed(&form, &VelDesktopEntryPropsWidget::changed);
    for (const char *language : {"fr", "pt_BR", "", "fr"})
        turn(form, QString::fromLatin1(language));
    QCOMPARE(changed.size(), 0);
    QCOMPARE(saved(form), m_bytes);
    retype(line(form, "otherNameEdit"), QStringLiteral("x"));
    QVERIFY(!changed.isEmpty());
    retype(line(form, "otherNameEdit"),
           QString::fromUtf8("\xC3\x89"
                             "diteur"));
    QCOMPARE(saved(form), m_bytes);
}

void tst_EntryFormLanguages::removesATranslationThatIsEmptied()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(entry(m_bytes));
    turn(form, QStringLiteral("fr"));
    retype(line(form, "otherNameEdit"), QString());
    FieldEdit::setValue(child<StringListEdit>(&form, "otherKeywordsEdit"), QStringList());
    QByteArray expected = m_bytes;
    expected
        .replace("Name[fr]=\xC3\x89"
                 "diteur\n",
                 "")
        .replace("Keywords[fr]=u;v;\n", "");
    QCOMPARE(saved(form), expected);
    QCOMPARE(items(form).at(1),
             QString::fromUtf8("Fran\xC3\xA7"
                               "ais (fr): 1 of 3 texts *"));
}

void tst_EntryFormLanguages::keepsTheTieToTheUsersLanguage()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(entry(m_bytes));
    turn(form, QStringLiteral("fr"));
    retype(line(form, "nameEdit"), QStringLiteral("Neu"));
    QCOMPARE(saved(form), QByteArray(m_bytes).replace("=Editor", "=Neu"));
    turn(form, QString());
    QCOMPARE(line(form, "localNameEdit")->text(), QStringLiteral("Neu"));
}

void tst_EntryFormLanguages::carriesNothingIntoAnotherLanguage()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(entry("[Desktop Entry]\nType=Application\nName=Same\nName[fr]=Same\n"));
    turn(form, QStringLiteral("fr"));
    retype(line(form, "nameEdit"), QStringLiteral("Other"));
    QCOMPARE(line(form, "otherNameEdit")->text(), QStringLiteral("Same"));
}

void tst_EntryFormLanguages::editsTheVariantThatTheUserSees()
{
    qputenv("LANG", "de_AT.UTF-8");
    const QByteArray bytes =
        "[Desktop Entry]\nType=Application\nName=a\nName[de]=d\nName[de_AT]=at\nExec=e\n";
    VelUIDesktopEntry record = entry(bytes);
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(record);
    QCOMPARE(line(form, "localNameEdit")->text(), QStringLiteral("at"));
    retype(line(form, "localNameEdit"), QStringLiteral("mine"));

    turn(form, QStringLiteral("de_AT"));
    QCOMPARE(line(form, "otherNameEdit")->text(), QStringLiteral("mine"));
    retype(line(form, "otherNameEdit"), QStringLiteral("exact"));
    turn(form, QStringLiteral("de"));
    QCOMPARE(line(form, "otherNameEdit")->text(), QStringLiteral("d"));
    retype(line(form, "otherNameEdit"), QStringLiteral("all"));
    turn(form, QString());
    QCOMPARE(line(form, "localNameEdit")->text(), QStringLiteral("exact"));
    retype(line(form, "localNameEdit"), QStringLiteral("last"));

    form.saveTo(&record);
    QCOMPARE(PropsFormTestCase::saved(record),
             QByteArray(bytes).replace("[de]=d", "[de]=all").replace("=at", "=last"));
}

void tst_EntryFormLanguages::addsALanguageByItsCode()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(entry(m_bytes));
    addLanguage(form, QStringLiteral("sr@latin"), true);
    QCOMPARE(box(form)->currentData().toString(), QStringLiteral("sr@latin"));
    QCOMPARE(saved(form), m_bytes);
    retype(line(form, "otherNameEdit"), QStringLiteral("x"));
    QCOMPARE(saved(form), QByteArray(m_bytes).replace("diteur\n", "diteur\nName[sr@latin]=x\n"));
}

void tst_EntryFormLanguages::addsALanguageByItsName()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(entry(m_bytes));
    addLanguage(form, LanguageCode::nativeName(QStringLiteral("ja")) + QStringLiteral(" (ja)"), true);
    QCOMPARE(box(form)->currentData().toString(), QStringLiteral("ja"));

    addLanguage(form, QStringLiteral("de"), true);
    QCOMPARE(box(form)->currentIndex(), 0);
}

void tst_EntryFormLanguages::refusesWhatIsNoCode()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(entry(m_bytes));
    addLanguage(form, QStringLiteral("de]=x"), false);
    QCOMPARE(box(form)->currentIndex(), 0);
    QCOMPARE(box(form)->count(), 3);
}

void tst_EntryFormLanguages::turnsBackForAnotherEntry()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(entry(m_bytes));
    turn(form, QStringLiteral("fr"));
    retype(line(form, "otherNameEdit"), QStringLiteral("dropped"));
    form.loadFrom(entry(m_bytes));
    QCOMPARE(box(form)->currentIndex(), 0);
    QCOMPARE(saved(form), m_bytes);
}

void tst_EntryFormLanguages::turnsBackWithoutAssistance()
{
    VelDesktopEntryPropsWidget form;
    form.loadFrom(entry(m_bytes));
    form.show();
    const QStringList formerRows = shownRows(form);
    form.setAssistance(true);
    turn(form, QStringLiteral("fr"));
    line(form, "otherNameEdit")->setFocus();
    form.setAssistance(false);
    QCOMPARE(shownRows(form), formerRows);
    QVERIFY(!form.findChild<QWidget *>(QStringLiteral("languageBox")));
    QVERIFY(!form.findChild<QWidget *>(QStringLiteral("otherNameEdit")));
    QVERIFY(line(form, "localNameEdit")->isVisible());
}

void tst_EntryFormLanguages::savesTheTranslationsWithoutAssistance()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(entry(m_bytes));
    turn(form, QStringLiteral("fr"));
    retype(line(form, "otherNameEdit"), QStringLiteral("x"));
    form.setAssistance(false);
    QCOMPARE(saved(form),
             QByteArray(m_bytes).replace("Name[fr]=\xC3\x89"
                                         "diteur",
                                         "Name[fr]=x"));
}

void tst_EntryFormLanguages::hidesTheRowsOfAnotherType()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(entry(m_bytes));
    turn(form, QStringLiteral("fr"));
    form.setType(link, {});
    QVERIFY(child<StringListEdit>(&form, "otherKeywordsEdit")->isHidden());
    QVERIFY(child<StringListEdit>(&form, "localKeywordsEdit")->isHidden());
    QVERIFY(!line(form, "otherNameEdit")->isHidden());
    turn(form, QString());
    QVERIFY(child<StringListEdit>(&form, "localKeywordsEdit")->isHidden());
    form.setType(application, {});
    QVERIFY(!child<StringListEdit>(&form, "localKeywordsEdit")->isHidden());
    QVERIFY(child<StringListEdit>(&form, "otherKeywordsEdit")->isHidden());
}

void tst_EntryFormLanguages::savesNoKeywordsOfALink()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(entry(m_bytes));
    turn(form, QStringLiteral("fr"));
    FieldEdit::setValue(child<StringListEdit>(&form, "otherKeywordsEdit"), QStringList{QStringLiteral("w")});
    form.setType(link, {});
    QVERIFY(!saved(form).contains("Keywords"));
}

void tst_EntryFormLanguages::isReadOnlyInEveryLanguage()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.setReadOnly(true);
    form.loadFrom(entry(m_bytes));
    turn(form, QStringLiteral("fr"));
    QVERIFY(line(form, "otherNameEdit")->isReadOnly());
    form.setReadOnly(false);
    QVERIFY(!line(form, "otherNameEdit")->isReadOnly());
}

void tst_EntryFormLanguages::tellsWhoSeesTheLanguage()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(entry(m_bytes));
    auto *note = child<QLabel>(&form, "languageNote");
    QCOMPARE(
        note->text(),
        QStringLiteral("Users of de see these texts, and those without a language where one is missing."));
    turn(form, QStringLiteral("fr"));
    QCOMPARE(note->text(), QStringLiteral("Users of fr see these texts."));
    addLanguage(form, QStringLiteral("fr_CA"), true);
    QCOMPARE(note->text(), QStringLiteral("Users of fr_CA see the texts of fr."));
    QCOMPARE(box(form)->accessibleDescription(), note->text());
}

VEL_TEST_MAIN(tst_EntryFormLanguages)

#include "tst_EntryFormLanguages.moc"
