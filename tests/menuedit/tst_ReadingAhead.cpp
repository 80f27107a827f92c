// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ModelTestCase.h"

#include <QDir>
#include <QFileIconProvider>
#include <QMap>

#include <random>

/// Menus that open, close and change while their entries are read ahead.
class tst_ReadingAhead : public ModelTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void hasNothingToDoWithRecordFiles();
    void leavesNoThreadWithTheModel();
    void showsWhatTheDiskHolds_data();
    void showsWhatTheDiskHolds();
};

namespace {

constexpr int Folders = 6;
constexpr int Entries = 60;

int threads()
{
    return QDir(QStringLiteral("/proc/self/task")).entryList(QDir::Dirs | QDir::NoDotAndDotDot).size();
}

QStringList namesIn(const VelMenuModel &model, const QModelIndex &folder)
{
    QStringList names;
    for (int row = 0; row < model.rowCount(folder); ++row) {
        const QModelIndex index = model.index(row, 0, folder);
        names.append(index.data(QFileSystemModel::FileNameRole).toString() + QLatin1Char('=')
                     + index.data().toString());
    }
    names.sort();
    return names;
}

} // namespace

void tst_ReadingAhead::hasNothingToDoWithRecordFiles()
{
    write(QStringLiteral("a.desktop"), entry("Name=A\n"));
    write(QStringLiteral(".directory"), "[Desktop Entry]\nIcon=folder\n");
    m_model = modelOf(folder(), 1);
    const QFileInfo record(path(QStringLiteral(".directory")));
    QVERIFY(m_model->iconProvider()->icon(record).isNull());
    QVERIFY(QFile::remove(record.filePath()));
    QCOMPARE(m_model->iconProvider()->type(record), QStringLiteral("application/x-desktop"));
}

void tst_ReadingAhead::leavesNoThreadWithTheModel()
{
    for (int i = 0; i < 400; ++i)
        write(QStringLiteral("%1.desktop").arg(i), entry("Name=A\n"));
    m_model = modelOf(folder(), 400);
    m_model.reset();
    const int before = threads();
    // Qt's own thread ends with the model, too.
    m_model = std::make_unique<VelMenuModel>(folder(), nullptr, nullptr);
    m_model.reset();
    QTRY_VERIFY(threads() <= before);
}

void tst_ReadingAhead::showsWhatTheDiskHolds_data()
{
    QTest::addColumn<int>("seed");
    for (int seed = 1; seed <= 3; ++seed)
        QTest::newRow(qPrintable(QString::number(seed))) << seed;
}

// The plain model: of each folder, the files and the names that stand in them. What changes while
// no model shows it is what the next one shows.
void tst_ReadingAhead::showsWhatTheDiskHolds()
{
    QFETCH(int, seed);
    constexpr int Rounds = 60;
    std::mt19937 random{std::mt19937::result_type(seed)};
    const auto below = [&random](int count) { return int(random() % unsigned(count)); };
    QMap<QString, QString> disk[Folders];
    const auto change = [&](int folder) {
        const QString file = QStringLiteral("%1.desktop").arg(below(Entries));
        const QString place = QStringLiteral("%1/%2").arg(folder).arg(file);
        if (disk[folder].contains(file) && below(4) == 0) {
            QVERIFY(QFile::remove(path(place)));
            disk[folder].remove(file);
            return;
        }
        const QString name = QString::number(1000 + below(9000));
        write(place, entry("Name=" + name.toLatin1() + '\n'));
        disk[folder].insert(file, name);
    };
    for (int i = 0; i < Folders; ++i) {
        for (int j = 0; j < Entries; ++j)
            change(i);
    }
    int compared = 0;
    for (int round = 0; round < Rounds; ++round) {
        const int shown = below(Folders);
        for (int i = below(10); i > 0; --i)
            change(shown);
        if (below(6) == 0) {
            // Old enough for what is read to be kept.
            const QDateTime later = QDateTime::currentDateTime().addMSecs(60);
            QTRY_VERIFY(QDateTime::currentDateTime() >= later);
        }
        m_model = std::make_unique<VelMenuModel>(path(QString::number(shown)), nullptr, nullptr);
        for (int i = below(20); i > 0; --i)
            QCoreApplication::processEvents();
        if (below(3) == 0) {
            m_model.reset();
            continue;
        }
        QStringList expected;
        for (auto it = disk[shown].cbegin(); it != disk[shown].cend(); ++it)
            expected.append(it.key() + QLatin1Char('=') + it.value());
        expected.sort();
        const QModelIndex root = m_model->index(path(QString::number(shown)));
        QTRY_COMPARE_WITH_TIMEOUT(m_model->rowCount(root), expected.size(), 20000);
        QCOMPARE(namesIn(*m_model, root), expected);
        ++compared;
    }
    QVERIFY(compared > Rounds / 3);
}

VEL_TEST_MAIN(tst_ReadingAhead)

#include "tst_ReadingAhead.moc"
