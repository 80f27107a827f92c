// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeyTestObject.h"
#include "QtMajor.h"
#include "ShortcutSheet.h"
#include "ShortcutsModelTestCase.h"

#include <QTranslator>
#include <QXmlStreamReader>

namespace {

// Stands in for a language in which the keys of the keyboard have other names.
class KeyTranslator : public QTranslator
{
public:
    using QTranslator::QTranslator;
    bool isEmpty() const override { return false; }
    QString translate(const char *context, const char *text, const char *, int) const override
    {
        const bool isCtrl = qstrcmp(context, "QShortcut") == 0 && qstrcmp(text, "Ctrl") == 0;
        return isCtrl ? QStringLiteral("Strg") : QString();
    }
};

} // namespace

class tst_ShortcutSheet : public ShortcutsModelTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup();

    void isEmptyWithoutAShortcut();
    void alignsThePlainText();
    void alignsWideCharacters();
    void leavesOutWhatIsGone();
    void keepsEachShortcutOnOneLine();
    void namesKeysAsTheUserKnowsThem();
    void showsPendingKeys();
    void showsFurtherKeys();

    void writesHtmlByGroup();
    void escapesHtml();
    void writesHtmlThatParses();
    void hasTheDirectionOfTheLanguage_data();
    void hasTheDirectionOfTheLanguage();

private:
    void add(const QString &name, const QString &group, const QKeySequence &key = QKeySequence())
    {
        m_model->registerShortcutObject(new KeyTestObject(name, group, key));
    }
};

void tst_ShortcutSheet::cleanup()
{
    QLocale::setDefault(QLocale::c());
    ShortcutsModelTestCase::cleanup();
}

void tst_ShortcutSheet::isEmptyWithoutAShortcut()
{
    QCOMPARE(ShortcutSheet::plainText(*m_model), QString());
    const QString html = ShortcutSheet::html(*m_model);
    QVERIFY(html.startsWith(str("<!DOCTYPE html>\n")));
    QVERIFY(html.contains(str("<h1>Keyboard shortcuts</h1>")));
    QVERIFY(!html.contains(str("<table")));
}

void tst_ShortcutSheet::alignsThePlainText()
{
    add(str("quit"), str("File"), QKeySequence(Qt::CTRL | Qt::Key_Q));
    add(str("open"), str("File"), f1);
    add(str("a long name"), str("Edit"), VelTest::keySequence(Qt::CTRL | Qt::Key_K, Qt::CTRL | Qt::Key_C));
    add(str("none"), str("Edit"));
    add(str("x"), QString(), f2);
    QCOMPARE(ShortcutSheet::plainText(*m_model),
             str("File\n"
                 "  Text of open         F1\n"
                 "  Text of quit         Ctrl+Q\n"
                 "\n"
                 "Edit\n"
                 "  Text of a long name  Ctrl+K, Ctrl+C\n"
                 "  Text of none\n"
                 "\n"
                 "  Text of x            F2\n"));
}

void tst_ShortcutSheet::alignsWideCharacters()
{
    add(QStringLiteral(u"1 \u65e5\u672c\u8a9e"), str("g"), f1);
    add(str("2 abcdef"), str("g"), f2);
    add(QStringLiteral(u"3 u\u0308"), str("g"), f3);
    QCOMPARE(ShortcutSheet::plainText(*m_model),
             QStringLiteral(u"g\n"
                            "  Text of 1 \u65e5\u672c\u8a9e  F1\n"
                            "  Text of 2 abcdef  F2\n"
                            "  Text of 3 u\u0308       F3\n"));
}

void tst_ShortcutSheet::leavesOutWhatIsGone()
{
    delete addAction("a", "g", f1);
    addAction("b", "h", f2);
    delete addAction("c", "h", f3);
    QCOMPARE(ShortcutSheet::plainText(*m_model), str("h\n  Text of b  F2\n"));
    QCOMPARE(ShortcutSheet::html(*m_model).count(str("<table>")), 1);
}

void tst_ShortcutSheet::keepsEachShortcutOnOneLine()
{
    add(str("a\n\tb  c \x01 "), str("g\nh"), f1);
    QCOMPARE(ShortcutSheet::plainText(*m_model), str("g h\n  Text of a b c  F1\n"));
    QVERIFY(ShortcutSheet::html(*m_model).contains(str("<bdi>Text of a b c</bdi>")));
}

void tst_ShortcutSheet::namesKeysAsTheUserKnowsThem()
{
    KeyTranslator translator;
    QCoreApplication::installTranslator(&translator);
    add(str("a"), str("g"), QKeySequence(Qt::CTRL | Qt::Key_A));
    QCOMPARE(ShortcutSheet::plainText(*m_model), str("g\n  Text of a  Strg+A\n"));
    QVERIFY(ShortcutSheet::html(*m_model).contains(str("<kbd>Strg+A</kbd>")));
}

void tst_ShortcutSheet::showsPendingKeys()
{
    add(str("a"), str("g"), f1);
    m_model->setKeySequence(row(0, 0), f2);
    QCOMPARE(ShortcutSheet::plainText(*m_model), str("g\n  Text of a  F2\n"));
}

void tst_ShortcutSheet::showsFurtherKeys()
{
    addAction("a", "g", f1)->setShortcuts({f1, f2});
    m_model->setKeySequence(row(0, 0), f3);
    QCOMPARE(ShortcutSheet::plainText(*m_model), str("g\n  Text of a  F3; F2\n"));
    QVERIFY(ShortcutSheet::html(*m_model).contains(str("<kbd>F3; F2</kbd>")));
    m_model->setKeySequence(row(0, 0), QKeySequence());
    QCOMPARE(ShortcutSheet::plainText(*m_model), str("g\n  Text of a  F2\n"));
}

void tst_ShortcutSheet::writesHtmlByGroup()
{
    add(str("b"), str("File"), f1);
    add(str("a"), str("File"));
    add(str("c"), str("Edit"), f2);
    const QString html = ShortcutSheet::html(*m_model);
    const QString head =
        str("<table>\n<thead>\n<tr><th scope=\"col\">Action</th><th scope=\"col\">Shortcut</th>"
            "</tr>\n</thead>\n<tbody>\n");
    QCOMPARE(html.mid(html.indexOf(str("<h1>"))),
             str("<h1>Keyboard shortcuts</h1>\n<h2>File</h2>\n") + head
                 + str("<tr><td><bdi>Text of a</bdi></td><td></td></tr>\n"
                       "<tr><td><bdi>Text of b</bdi></td><td><kbd>F1</kbd></td></tr>\n"
                       "</tbody>\n</table>\n<h2>Edit</h2>\n")
                 + head
                 + str("<tr><td><bdi>Text of c</bdi></td><td><kbd>F2</kbd></td></tr>\n"
                       "</tbody>\n</table>\n</body>\n</html>\n"));
}

void tst_ShortcutSheet::escapesHtml()
{
    add(str("<b>&amp;\"%1"), str("</h2>%2&"), QKeySequence(Qt::CTRL | Qt::Key_Less));
    const QString html = ShortcutSheet::html(*m_model);
    QVERIFY(html.contains(str("<h2>&lt;/h2&gt;%2&amp;</h2>")));
    QVERIFY(html.contains(
        str("<td><bdi>Text of &lt;b&gt;&amp;amp;&quot;%1</bdi></td><td><kbd>Ctrl+&lt;</kbd></td>")));
}

// Every element but <meta> is closed, so that an XML parser finds what is not well-formed.
void tst_ShortcutSheet::writesHtmlThatParses()
{
    add(str("<a & b>\x02"), QStringLiteral(u"\ufffe\u65e5"), f1);
    add(QString(QChar(0xd800)), str("g"), QKeySequence(Qt::CTRL | Qt::Key_Ampersand));
    QString html = ShortcutSheet::html(*m_model);
    QVERIFY(html.contains(str("<meta charset=\"utf-8\">")));
    html.replace(str("<meta charset=\"utf-8\">"), str("<meta charset=\"utf-8\"/>"));
    QXmlStreamReader reader(html.toUtf8());
    int rows = 0;
    while (!reader.atEnd()) {
        if (reader.readNext() == QXmlStreamReader::StartElement && reader.name() == str("tr"))
            ++rows;
    }
    QVERIFY2(!reader.hasError(), qPrintable(reader.errorString()));
    QCOMPARE(rows, 4);
}

void tst_ShortcutSheet::hasTheDirectionOfTheLanguage_data()
{
    QTest::addColumn<QString>("locale");
    QTest::addColumn<QString>("tag");
    QTest::newRow("German") << str("de_DE") << str("<html lang=\"de\">");
    QTest::newRow("Portuguese of Brazil") << str("pt_BR") << str("<html lang=\"pt\">");
    QTest::newRow("Arabic") << str("ar_EG") << str("<html lang=\"ar\" dir=\"rtl\">");
    QTest::newRow("Hebrew") << str("he_IL") << str("<html lang=\"he\" dir=\"rtl\">");
}

void tst_ShortcutSheet::hasTheDirectionOfTheLanguage()
{
    QFETCH(QString, locale);
    QFETCH(QString, tag);
    QLocale::setDefault(QLocale(locale));
    const QString html = ShortcutSheet::html(*m_model);
    QVERIFY2(html.contains(tag), qPrintable(html.left(100)));
}

VEL_TEST_MAIN(tst_ShortcutSheet)

#include "tst_ShortcutSheet.moc"
