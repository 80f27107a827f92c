// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "CountedSystem.h"
#include "StartMenuUpdateTestCase.h"

/// By what an update sees that it has nothing to do.
class tst_startmenu_stamps : public StartMenuUpdateTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void looksAtFoldersAloneWhenAllIsQuiet();
    void looksAtNoFileOfAMenuThatWasJustMade();

private:
    QByteArrayList calls() const;
};

void tst_startmenu_stamps::initTestCase()
{
    CountedSystem::begin();
    QFile(QStringLiteral("/etc/hostname")).open(QIODevice::ReadOnly);
    QVERIFY(CountedSystem::end().contains("open /etc/hostname"));
}

QByteArrayList tst_startmenu_stamps::calls() const
{
    const QByteArray directory = QFile::encodeName(menu());
    CountedSystem::begin();
    const bool isDone = UpdateStartMenu(directory.constData(), nullptr);
    QByteArrayList calls = CountedSystem::end();
    return isDone ? calls : QByteArrayList();
}

void tst_startmenu_stamps::looksAtFoldersAloneWhenAllIsQuiet()
{
    for (int i = 0; i < 200; ++i)
        install(QStringLiteral("a%1.desktop").arg(i), i % 2 ? "Game;" : "Office;");
    QVERIFY(update());
    // Until everything is older than what some file systems take for a moment.
    QTRY_COMPARE_WITH_TIMEOUT(calls().join('\n').count("open "), 1, 20000);

    const auto before = times(path(QStringLiteral("config")));
    const QByteArrayList made = calls();
    QCOMPARE(times(path(QStringLiteral("config"))), before);
    QStringList opened;
    for (const QByteArray &call : made) {
        const QString file = QFile::decodeName(call.mid(5));
        if (call.startsWith("open "))
            opened.append(file);
        else if (QFileInfo(file).isFile())
            QCOMPARE(file, menu() + QStringLiteral(".sources"));
    }
    QCOMPARE(opened, QStringList(menu() + QStringLiteral(".sources")));
    QVERIFY2(made.size() < 40, qPrintable(QString::number(made.size())));

    install(QStringLiteral("b.desktop"), "Game;");
    QVERIFY(update());
    QCOMPARE(entries().size(), 201);
}

// Files may be written to just after they came, which the times of a folder do not tell.
void tst_startmenu_stamps::looksAtNoFileOfAMenuThatWasJustMade()
{
    for (int i = 0; i < 50; ++i)
        install(QStringLiteral("a%1.desktop").arg(i), "Game;");
    QVERIFY(update());
    for (const QByteArray &call : calls()) {
        if (call.startsWith("open "))
            QVERIFY2(!call.endsWith(".desktop"), call.constData());
    }
}

VEL_TEST_GUILESS_MAIN(tst_startmenu_stamps)
#include "tst_startmenu_stamps.moc"
