// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeyTestObject.h"
#include "ShortcutsModel.h"
#include "TestCase.h"

#include <shortcuts/ShortcutIndex.h>

#include <QAction>

/// What a filter finds in a model: "open" (F1) and "save" (Ctrl+S) in "File", "copy" in "Édition".
class tst_ShortcutIndex : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();

    void findsByWhatTheModelShows_data();
    void findsByWhatTheModelShows();
    void followsKeys();
    void findsFurtherKeys();
    void followsRows();
    void leavesRowsOutThatShowNothing();
    void findsNothingInAnEmptyModel();

private:
    KeyTestObject *add(const char *name, const QString &group, const QKeySequence &key)
    {
        auto *object = new KeyTestObject(QString::fromLatin1(name), group, key);
        m_model->registerShortcutObject(object);
        return object;
    }
    // The texts of the rows that are found.
    QString found(const ShortcutFilter &filter)
    {
        QStringList texts;
        const ShortcutIndex::Matches matches = m_index.matches(*m_model, filter);
        for (int group = 0; group < matches.size(); ++group) {
            for (int row = 0; row < matches.at(group).size(); ++row) {
                if (matches.at(group).at(row))
                    texts.append(m_model->index(row, 0, m_model->index(group, 0)).data().toString());
            }
        }
        return texts.join(QLatin1String(", "));
    }
    QString found(const QString &text)
    {
        ShortcutFilter filter;
        filter.setText(text);
        return found(filter);
    }

    std::unique_ptr<ShortcutsModel> m_model;
    ShortcutIndex m_index;
    KeyTestObject *m_open = nullptr;
};

void tst_ShortcutIndex::init()
{
    TestCase::init();
    m_model = std::make_unique<ShortcutsModel>(nullptr, QString());
    m_index.clear();
    m_open = add("open", QStringLiteral("File"), QKeySequence(Qt::Key_F1));
    add("save", QStringLiteral("File"), QKeySequence(Qt::CTRL | Qt::Key_S));
    add("copy", QStringLiteral("Édition"), QKeySequence());
}

void tst_ShortcutIndex::findsByWhatTheModelShows_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("texts");
    QTest::newRow("a name") << QStringLiteral("OPEN") << QStringLiteral("Text of open");
    QTest::newRow("a group") << QStringLiteral("edition") << QStringLiteral("Text of copy");
    QTest::newRow("a group of two") << QStringLiteral("file") << QStringLiteral("Text of open, Text of save");
    QTest::newRow("a key") << QStringLiteral("ctrl+s") << QStringLiteral("Text of save");
    QTest::newRow("all of these") << QStringLiteral("ctrl+s file save") << QStringLiteral("Text of save");
    QTest::newRow("over a border") << QStringLiteral("openfile") << QString();
}

void tst_ShortcutIndex::findsByWhatTheModelShows()
{
    QFETCH(QString, text);
    QTEST(found(text), "texts");
}

void tst_ShortcutIndex::followsKeys()
{
    QCOMPARE(found(QStringLiteral("f9")), QString());
    m_open->setKeySequence(QKeySequence(Qt::Key_F9));
    QCOMPARE(found(QStringLiteral("f9")), QStringLiteral("Text of open"));
    QCOMPARE(found(QStringLiteral("f1")), QString());
    ShortcutFilter filter;
    filter.setKey(QKeySequence(Qt::Key_F9));
    filter.setChangedOnly(true);
    QCOMPARE(found(filter), QStringLiteral("Text of open"));
    m_open->reset();
    QCOMPARE(found(filter), QString());
    QCOMPARE(found(QStringLiteral("f1")), QStringLiteral("Text of open"));
}

void tst_ShortcutIndex::findsFurtherKeys()
{
    QAction paste(QStringLiteral("Paste"), nullptr);
    paste.setShortcuts({QKeySequence(Qt::CTRL | Qt::Key_V), QKeySequence(Qt::SHIFT | Qt::Key_Insert)});
    m_model->registerAction(QStringLiteral("paste"), &paste, QStringLiteral("File"));
    QCOMPARE(found(QStringLiteral("ins")), QStringLiteral("Paste"));
    ShortcutFilter filter;
    filter.setKey(QKeySequence(Qt::SHIFT | Qt::Key_Insert));
    QCOMPARE(found(filter), QStringLiteral("Paste"));
}

void tst_ShortcutIndex::followsRows()
{
    QCOMPARE(found(QStringLiteral("of")), QStringLiteral("Text of open, Text of save, Text of copy"));
    add("new", QStringLiteral("File"), QKeySequence());
    add("about", QStringLiteral("Help"), QKeySequence());
    QCOMPARE(found(QStringLiteral("file")), QStringLiteral("Text of new, Text of open, Text of save"));
    QCOMPARE(found(QStringLiteral("help")), QStringLiteral("Text of about"));
}

void tst_ShortcutIndex::leavesRowsOutThatShowNothing()
{
    QCOMPARE(found(QStringLiteral("open")), QStringLiteral("Text of open"));
    Q_EMIT m_open->deleteMe();
    QCOMPARE(found(QString()), QStringLiteral("Text of save, Text of copy"));
}

void tst_ShortcutIndex::findsNothingInAnEmptyModel()
{
    m_model = std::make_unique<ShortcutsModel>(nullptr, QString());
    QCOMPARE(found(QStringLiteral("open")), QString());
}

VEL_TEST_MAIN(tst_ShortcutIndex)

#include "tst_ShortcutIndex.moc"
