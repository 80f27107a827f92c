// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ModelTestCase.h"

#include <QSignalSpy>

/// The name of a row and whether it is hidden: read, kept, forgotten.
class tst_VelMenuModelNames : public ModelTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void showsNames_data();
    void showsNames();
    void marksHiddenEntries_data();
    void marksHiddenEntries();
    void keepsANameUntilItIsForgotten();
    void remembersNothingOfAFileThatIsGone();
    void readsAnEmptyNameAtEveryRequest();
    void showsANameThatWasSet();
    void announcesTheRowOfAForgottenName();
    void announcesTheFolderOfAForgottenDirectoryFile();
};

void tst_VelMenuModelNames::showsNames_data()
{
    QTest::addColumn<QString>("file");
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QString>("row");
    QTest::addColumn<QString>("expected");
    const auto row = [](const char *title, const char *file, const QByteArray &bytes, const char *shown,
                        const char *expected) {
        QTest::newRow(title) << QString::fromUtf8(file) << bytes << QString::fromUtf8(shown)
                             << QString::fromUtf8(expected);
    };
    row("translated", "a.desktop", entry("Name=A\nName[en]=Local\nGenericName[en]=Kind\n"), "a.desktop",
        "Local");
    row("untranslated with its kind", "a.desktop", entry("Name=A\nGenericName[en]=Kind\n"), "a.desktop",
        "A Kind");
    row("without a name", "a.desktop", entry(""), "a.desktop", "");
    row("other file", "a.txt", "x", "a.txt", "a.txt");
    row("suffix in capitals", "a.DESKTOP", entry("Name=A\n"), "a.DESKTOP", "a.DESKTOP");
    row("folder", "d/x", "x", "d", "d");
    row("folder with names", "d/.directory",
        "[Desktop Entry]\nType=Directory\nName=D\nGenericName[en]=Kind\n", "d", "D Kind");
    row("folder without a name", "d/.directory", "[Desktop Entry]\nType=Directory\n", "d", "");
    row("folder called like an entry", "d.desktop/.directory", "[Desktop Entry]\nType=Directory\nName=D\n",
        "d.desktop", "D");
    row("empty folder called like an entry", "d.desktop/x", "x", "d.desktop", "");
    row("directory file that is a folder", "d/.directory/x", "x", "d", "");
    row("garbage", "a.desktop", QByteArray(1 << 20, '\x7f'), "a.desktop", "");
}

void tst_VelMenuModelNames::showsNames()
{
    QFETCH(QString, file);
    QFETCH(QByteArray, bytes);
    QFETCH(QString, row);
    QFETCH(QString, expected);
    write(file, bytes);
    m_model = modelOf(folder(), 1);

    QCOMPARE(shown(row), expected);
    QCOMPARE(indexOf(row).data(QFileSystemModel::FileNameRole).toString(), row);
    QCOMPARE(indexOf(row).data(QFileSystemModel::FilePathRole).toString(), path(row));
}

void tst_VelMenuModelNames::marksHiddenEntries_data()
{
    QTest::addColumn<QString>("file");
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QString>("row");
    QTest::addColumn<bool>("hidden");
    const QString a = QStringLiteral("a.desktop");
    QTest::newRow("shown") << a << entry("Name=A\n") << a << false;
    QTest::newRow("hidden") << a << entry("Name=A\nHidden=true\n") << a << true;
    QTest::newRow("not displayed") << a << entry("Name=A\nNoDisplay=true\n") << a << false;
    QTest::newRow("another desktop's") << a << entry("Name=A\nOnlyShowIn=OTHER;\n") << a << true;
    QTest::newRow("not for this desktop") << a << entry("Name=A\nNotShowIn=VEL;\n") << a << true;
    QTest::newRow("program missing") << a << entry("Name=A\nTryExec=/missing/program\n") << a << false;
    QTest::newRow("hidden without a name") << a << entry("Hidden=true\n") << a << true;
    QTest::newRow("folder") << QStringLiteral("d/.directory")
                            << QByteArray("[Desktop Entry]\nType=Directory\nName=D\nHidden=true\n")
                            << QStringLiteral("d") << false;
    QTest::newRow("other file") << QStringLiteral("a.txt") << entry("Hidden=true\n")
                                << QStringLiteral("a.txt") << false;
}

void tst_VelMenuModelNames::marksHiddenEntries()
{
    QFETCH(QString, file);
    QFETCH(QByteArray, bytes);
    QFETCH(QString, row);
    QFETCH(bool, hidden);
    qputenv("XDG_CURRENT_DESKTOP", "VEL");
    write(file, bytes);
    m_model = modelOf(folder(), 1);

    QCOMPARE(indexOf(row).data(Qt::UserRole), QVariant(hidden));
    QVERIFY(indexOf(row).data().isValid());
    QCOMPARE(indexOf(row).data(Qt::UserRole), QVariant(hidden));
}

void tst_VelMenuModelNames::keepsANameUntilItIsForgotten()
{
    const QString file = write(QStringLiteral("a.desktop"), entry("Name=Old\nHidden=true\n"));
    m_model = modelOf(folder(), 1);
    QCOMPARE(shown(QStringLiteral("a.desktop")), QStringLiteral("Old"));

    write(QStringLiteral("a.desktop"), entry("Name=New\n"));
    QCOMPARE(shown(QStringLiteral("a.desktop")), QStringLiteral("Old"));
    QCOMPARE(indexOf(QStringLiteral("a.desktop")).data(Qt::UserRole), QVariant(true));

    m_model->forgetItemInfo(file);
    QCOMPARE(shown(QStringLiteral("a.desktop")), QStringLiteral("New"));
    QCOMPARE(indexOf(QStringLiteral("a.desktop")).data(Qt::UserRole), QVariant(false));
}

// Rows outlive their files until the watcher has seen it.
void tst_VelMenuModelNames::remembersNothingOfAFileThatIsGone()
{
    const QString file = write(QStringLiteral("a.desktop"), entry("Name=A\n"));
    m_model = modelOf(folder(), 1);
    const QPersistentModelIndex index = indexOf(QStringLiteral("a.desktop"));
    QCOMPARE(index.data().toString(), QStringLiteral("A"));

    QVERIFY(QFile::remove(file));
    m_model->forgetItemInfo(file);
    QCOMPARE(index.data().toString(), QString());
    QCOMPARE(index.data(Qt::UserRole).toBool(), false);

    write(QStringLiteral("a.desktop"), entry("Name=B\nHidden=true\n"));
    QCOMPARE(index.data(Qt::UserRole).toBool(), true);
    QCOMPARE(index.data().toString(), QStringLiteral("B"));
}

void tst_VelMenuModelNames::readsAnEmptyNameAtEveryRequest()
{
    write(QStringLiteral("a.desktop"), entry(""));
    m_model = modelOf(folder(), 1);
    QCOMPARE(shown(QStringLiteral("a.desktop")), QString());

    write(QStringLiteral("a.desktop"), entry("Name=A\n"));

    QCOMPARE(shown(QStringLiteral("a.desktop")), QStringLiteral("A"));
}

void tst_VelMenuModelNames::showsANameThatWasSet()
{
    const QString file = write(QStringLiteral("a.desktop"), entry("Name=A\n"));
    m_model = modelOf(folder(), 1);

    m_model->setItemName(file, QStringLiteral("Chosen"));
    QCOMPARE(shown(QStringLiteral("a.desktop")), QStringLiteral("Chosen"));

    m_model->forgetItemInfo(file);
    QCOMPARE(shown(QStringLiteral("a.desktop")), QStringLiteral("A"));
}

void tst_VelMenuModelNames::announcesTheRowOfAForgottenName()
{
    const QString file = write(QStringLiteral("a.desktop"), entry("Name=A\n"));
    write(QStringLiteral("b.desktop"), entry("Name=B\n"));
    m_model = modelOf(folder(), 2);
    QSignalSpy changed(m_model.get(), &QAbstractItemModel::dataChanged);

    m_model->forgetItemInfo(file);

    QCOMPARE(changed.size(), 1);
    QCOMPARE(changed.first().at(0).toModelIndex(), indexOf(QStringLiteral("a.desktop")));
    QCOMPARE(changed.first().at(1).toModelIndex(), indexOf(QStringLiteral("a.desktop")));
}

void tst_VelMenuModelNames::announcesTheFolderOfAForgottenDirectoryFile()
{
    const QString file = write(QStringLiteral("d/.directory"), "[Desktop Entry]\nType=Directory\nName=D\n");
    write(QStringLiteral("d/x"), "x");
    m_model = modelOf(folder(), 1);
    QCOMPARE(shown(QStringLiteral("d")), QStringLiteral("D"));
    m_model->fetchMore(indexOf(QStringLiteral("d")));
    QTRY_COMPARE(m_model->rowCount(indexOf(QStringLiteral("d"))), 1);
    QSignalSpy changed(m_model.get(), &QAbstractItemModel::dataChanged);

    write(QStringLiteral("d/.directory"), "[Desktop Entry]\nType=Directory\nName=New\n");
    m_model->forgetItemInfo(file);

    QCOMPARE(changed.size(), 1);
    QCOMPARE(changed.first().at(0).toModelIndex(), indexOf(QStringLiteral("d")));
    QCOMPARE(shown(QStringLiteral("d")), QStringLiteral("D"));
    QCOMPARE(m_model->rowCount(indexOf(QStringLiteral("d"))), 1);

    m_model->forgetItemInfo(path(QStringLiteral("d")));
    QCOMPARE(shown(QStringLiteral("d")), QStringLiteral("New"));
}

VEL_TEST_MAIN(tst_VelMenuModelNames)
#include "tst_VelMenuModelNames.moc"
