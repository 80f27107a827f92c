// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <menuedit/DropTargets.h>

#include <QDir>
#include <QFile>
#include <QFileInfo>

using Choice = NameClash::Choice;
using Kind = NameClash::Kind;

/// Where dropped files go when their names are taken.
class tst_DropTargets : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();

    void asksOnlyWhereANameIsTaken();
    void doesWhatIsAnswered_data();
    void doesWhatIsAnswered();
    void asksNoMoreAfterAnAnswerForAll();
    void asksAgainWhereAnAnswerForAllCannotBe();
    void takesEachFileOnce();
    void leavesTheNamesOfTheOthersToThem();
    void knowsWhatCannotBeReplaced_data();
    void knowsWhatCannotBeReplaced();
    void replacesNothingThatIsGone();
    void givesFoldersNumbersAtTheirEnd();
    void looksThroughNoLink();

private:
    QStringList settle(const QStringList &sources, const QVector<NameClash::Answer> &answers);

    QVector<NameClash> m_asked;
};

void tst_DropTargets::init()
{
    TestCase::init();
    m_asked.clear();
    for (const char *name : {"to/x.desktop", "to/y.desktop", "from/x.desktop", "from/y.desktop",
                             "from/z.desktop", "other/x.desktop"})
        write(QString::fromUtf8(name), name);
}

// Answers in turn; what comes of each: the source, how, and the file name of its target.
QStringList tst_DropTargets::settle(const QStringList &sources, const QVector<NameClash::Answer> &answers)
{
    QStringList paths;
    for (const QString &source : sources)
        paths.append(path(source));
    const auto items = DropTargets(path(QStringLiteral("to")), paths).settled([&](const NameClash &clash) {
        m_asked.append(clash);
        return answers.value(m_asked.size() - 1);
    });
    if (!items)
        return {QStringLiteral("canceled")};
    QStringList found;
    for (const DropItem &item : *items) {
        QString text = item.source.mid(folder().size() + 1);
        text += QLatin1String(item.isHere ? " stays " : item.isReplacing ? " replaces " : " becomes ");
        found.append(text + QFileInfo(item.target).fileName());
    }
    return found;
}

void tst_DropTargets::asksOnlyWhereANameIsTaken()
{
    const QStringList found = settle(
        {QStringLiteral("from/z.desktop"), QStringLiteral("from/x.desktop"), QStringLiteral("to/y.desktop")},
        {{Choice::Skip, false}});
    QCOMPARE(found,
             QStringList({QStringLiteral("from/z.desktop becomes z.desktop"),
                          QStringLiteral("to/y.desktop stays y.desktop")}));
    QCOMPARE(m_asked.size(), 1);
    QCOMPARE(m_asked.constFirst().source, path(QStringLiteral("from/x.desktop")));
    QCOMPARE(m_asked.constFirst().target, path(QStringLiteral("to/x.desktop")));
    QVERIFY(m_asked.constFirst().isReplaceable() && m_asked.constFirst().isOneOfSeveral);
}

void tst_DropTargets::doesWhatIsAnswered_data()
{
    QTest::addColumn<int>("first");
    QTest::addColumn<int>("second");
    QTest::addColumn<QString>("expected");
    const auto row = [](const char *title, Choice first, Choice second, const char *expected) {
        QTest::newRow(title) << int(first) << int(second) << QString::fromLatin1(expected);
    };
    row("keep both", Choice::KeepBoth, Choice::KeepBoth,
        "from/x.desktop becomes x-2.desktop, from/y.desktop becomes y-2.desktop");
    row("replace", Choice::Replace, Choice::KeepBoth,
        "from/x.desktop replaces x.desktop, from/y.desktop becomes y-2.desktop");
    row("skip", Choice::Skip, Choice::Replace, "from/y.desktop replaces y.desktop");
    row("skip all", Choice::Skip, Choice::Skip, "");
    row("cancel", Choice::Cancel, Choice::KeepBoth, "canceled");
    row("cancel later", Choice::Replace, Choice::Cancel, "canceled");
}

void tst_DropTargets::doesWhatIsAnswered()
{
    QFETCH(int, first);
    QFETCH(int, second);
    QFETCH(QString, expected);
    QCOMPARE(settle({QStringLiteral("from/x.desktop"), QStringLiteral("from/y.desktop")},
                    {{Choice(first), false}, {Choice(second), false}})
                 .join(QStringLiteral(", ")),
             expected);
}

void tst_DropTargets::asksNoMoreAfterAnAnswerForAll()
{
    const QStringList found = settle({QStringLiteral("from/x.desktop"), QStringLiteral("from/y.desktop")},
                                     {{Choice::Replace, true}});
    QCOMPARE(found.join(QStringLiteral(", ")),
             QStringLiteral("from/x.desktop replaces x.desktop, from/y.desktop replaces y.desktop"));
    QCOMPARE(m_asked.size(), 1);
}

// The second would replace the first.
void tst_DropTargets::asksAgainWhereAnAnswerForAllCannotBe()
{
    const QStringList found = settle({QStringLiteral("from/x.desktop"), QStringLiteral("other/x.desktop"),
                                      QStringLiteral("from/y.desktop")},
                                     {{Choice::Replace, true}, {Choice::KeepBoth, false}});
    QCOMPARE(found.join(QStringLiteral(", ")),
             QStringLiteral("from/x.desktop replaces x.desktop, other/x.desktop becomes x-2.desktop, "
                            "from/y.desktop replaces y.desktop"));
    QCOMPARE(m_asked.size(), 2);
    QVERIFY(m_asked.at(1).kind == Kind::IsPromised);
}

void tst_DropTargets::takesEachFileOnce()
{
    const QString z = QStringLiteral("from/z.desktop");
    QCOMPARE(settle({z, z}, {}), QStringList{QStringLiteral("from/z.desktop becomes z.desktop")});
}

void tst_DropTargets::leavesTheNamesOfTheOthersToThem()
{
    write(QStringLiteral("from/x-2.desktop"), "x-2");
    const QStringList found = settle({QStringLiteral("from/x.desktop"), QStringLiteral("from/x-2.desktop")},
                                     {{Choice::KeepBoth, true}});
    QCOMPARE(found.join(QStringLiteral(", ")),
             QStringLiteral("from/x.desktop becomes x-3.desktop, from/x-2.desktop becomes x-2.desktop"));
}

void tst_DropTargets::knowsWhatCannotBeReplaced_data()
{
    QTest::addColumn<QString>("source");
    QTest::addColumn<bool>("isReplaceable");
    QTest::newRow("folder that it lies in") << "to/inner/inner" << false;
    QTest::newRow("link to what is there") << "from/link/x.desktop" << false;
    QTest::newRow("beside") << "from/x.desktop" << true;
    QTest::newRow("folder with the same beginning") << "to/inner and more/inner" << true;
}

void tst_DropTargets::knowsWhatCannotBeReplaced()
{
    QFETCH(QString, source);
    QFETCH(bool, isReplaceable);
    QVERIFY(QDir(folder()).mkpath(QStringLiteral("to/inner/inner")));
    QVERIFY(QDir(folder()).mkpath(QStringLiteral("to/inner and more/inner")));
    QVERIFY(QDir(folder()).mkpath(QStringLiteral("from/link")));
    QVERIFY(QFile::link(path(QStringLiteral("to/x.desktop")), path(QStringLiteral("from/link/x.desktop"))));
    const QStringList found = settle({source}, {{Choice::Replace, false}});
    QCOMPARE(m_asked.size(), 1);
    QCOMPARE(m_asked.constFirst().isReplaceable(), isReplaceable);
    QCOMPARE(found.constFirst() == QLatin1String("canceled"), !isReplaceable);
    QVERIFY(!m_asked.constFirst().isOneOfSeveral);
}

void tst_DropTargets::replacesNothingThatIsGone()
{
    const QString target = path(QStringLiteral("to/x.desktop"));
    const auto items = DropTargets(path(QStringLiteral("to")), {path(QStringLiteral("from/x.desktop"))})
                           .settled([&](const NameClash &) {
                               QFile::remove(target);
                               return NameClash::Answer{Choice::Replace, false};
                           });
    QCOMPARE(items->constFirst().target, target);
    QVERIFY(!items->constFirst().isReplacing);
}

void tst_DropTargets::givesFoldersNumbersAtTheirEnd()
{
    QVERIFY(QDir(folder()).mkpath(QStringLiteral("to/v1.5")));
    QVERIFY(QDir(folder()).mkpath(QStringLiteral("from/v1.5")));
    QCOMPARE(settle({QStringLiteral("from/v1.5")}, {{Choice::KeepBoth, false}}),
             QStringList{QStringLiteral("from/v1.5 becomes v1.5-2")});
}

// What is written through a link would come to be where that leads.
void tst_DropTargets::looksThroughNoLink()
{
    QVERIFY(QFile::link(path(QStringLiteral("nowhere")), path(QStringLiteral("to/z.desktop"))));
    QVERIFY(QFile::link(path(QStringLiteral("nowhere")), path(QStringLiteral("to/z-2.desktop"))));
    QCOMPARE(settle({QStringLiteral("from/z.desktop")}, {{Choice::KeepBoth, false}}),
             QStringList{QStringLiteral("from/z.desktop becomes z-3.desktop")});
}

VEL_TEST_GUILESS_MAIN(tst_DropTargets)

#include "tst_DropTargets.moc"
