// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <veluiaux/VelUIDesktopEntry.h>

#include <QDir>
#include <QRandomGenerator>

/**
 * Random files and random changes: what has to hold for every input.
 *
 * The seed is printed; VEL_TEST_SEED repeats a run, VEL_TEST_ROUNDS sets its length.
 */
class tst_DesktopEntryRandom : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();

    void survivesAnyBytes();
    void keepsEveryLineThatNoChangeTouched();
    void readsBackAnyChange();

private:
    QString write(const QByteArray &bytes);

    // In memory, where syncing thousands of files costs nothing.
    QTemporaryDir m_memory{QFileInfo(QStringLiteral("/dev/shm")).isWritable()
                               ? QStringLiteral("/dev/shm/veltest-XXXXXX")
                               : QDir::tempPath() + QStringLiteral("/veltest-XXXXXX")};
    int m_rounds = 20000;
    quint32 m_seed = 1;
};

namespace {

// Pieces that mean something to the reader, and some that mean nothing.
const QByteArrayList &pieces()
{
    static const QByteArrayList pieces = {"[Desktop Entry]",
                                          "[Desktop Action a]",
                                          "[Desktop Action b]",
                                          "[X]",
                                          "[",
                                          "]",
                                          "\n",
                                          "\n",
                                          "\n",
                                          "\n",
                                          "\r\n",
                                          "Name",
                                          "Name[de]",
                                          "Name[de_DE]",
                                          "Name[fr]",
                                          "Name[",
                                          "Actions",
                                          "Keywords",
                                          "Type",
                                          "Terminal",
                                          "=",
                                          "=",
                                          "=",
                                          "a;b;",
                                          "a",
                                          ";",
                                          "\\",
                                          "\\s",
                                          "\\n",
                                          "\\;",
                                          " ",
                                          "\t",
                                          "#",
                                          "# comment",
                                          "\xC3\xA4",
                                          "\xFF",
                                          "\xEF\xBB\xBF",
                                          QByteArray(1, '\0'),
                                          "true",
                                          "false",
                                          "Application",
                                          "Link",
                                          "Exec",
                                          "%f",
                                          "\"",
                                          "'"};
    return pieces;
}

QByteArray randomBytes(QRandomGenerator &random)
{
    QByteArray bytes = random.bounded(4) ? QByteArray("[Desktop Entry]\n") : QByteArray();
    for (int n = random.bounded(40); n > 0; --n)
        bytes += pieces().at(random.bounded(pieces().size()));
    return bytes;
}

QString randomText(QRandomGenerator &random)
{
    const QString alphabet = QString::fromUtf8("ab \\;\n\r\t=[]#%\xC3\xA4\xF0\x9F\x98\x80");
    QString text;
    for (int n = random.bounded(6); n > 0; --n)
        text += alphabet.mid(random.bounded(alphabet.size() - 2), 1);
    return text;
}

QStringList randomList(QRandomGenerator &random)
{
    QStringList list;
    for (int n = random.bounded(4); n > 0; --n)
        list += randomText(random);
    return list;
}

QStringList withoutEmpty(QStringList list)
{
    list.removeAll(QString());
    return list;
}

// A file is the same to a reader when all of this is.
QStringList everythingOf(const VelUIDesktopEntry &record)
{
    QStringList all{record.getType(),
                    record.getName(),
                    record.getLocalName(),
                    record.getExec(),
                    record.getTryExec(),
                    record.getKeywords().join(QChar(1)),
                    record.getLocalKeywords().join(QChar(1)),
                    QString::number(record.getTerminal())};
    for (const VelUIDesktopAction &action : record.getActions())
        all << action.getId() << action.getName() << action.getLocalName() << action.getExec()
            << action.getOnlyShowIn().join(QChar(1));
    return all;
}

} // namespace

QString tst_DesktopEntryRandom::write(const QByteArray &bytes)
{
    const QString path = m_memory.filePath(QStringLiteral("x.desktop"));
    QFile file(path);
    if (!file.open(QIODevice::WriteOnly) || file.write(bytes) != bytes.size())
        QTest::qFail(qPrintable(QStringLiteral("cannot write ") + path), __FILE__, __LINE__);
    return path;
}

void tst_DesktopEntryRandom::initTestCase()
{
    if (qEnvironmentVariableIsSet("VEL_TEST_ROUNDS"))
        m_rounds = qEnvironmentVariableIntValue("VEL_TEST_ROUNDS");
    if (qEnvironmentVariableIsSet("VEL_TEST_SEED"))
        m_seed = quint32(qEnvironmentVariableIntValue("VEL_TEST_SEED"));
    qInfo("seed %u, %d inputs", m_seed, m_rounds);
    qputenv("LANG", "de_DE.UTF-8");
}

void tst_DesktopEntryRandom::survivesAnyBytes()
{
    QRandomGenerator random(m_seed);
    for (int round = 0; round < m_rounds / 2; ++round) {
        const QByteArray bytes = randomBytes(random);
        const QString file = write(bytes);
        VelUIDesktopEntry record(file);
        record.isSuitable(nullptr);
        record.isDisplayable(nullptr);
        record.setType(record.getType());
        record.setName(record.getName());
        record.setLocalName(record.getLocalName());
        record.setKeywords(record.getKeywords());
        record.setLocalKeywords(record.getLocalKeywords());
        record.setTerminal(record.getTerminal());
        record.setActions(record.getActions());
        QVERIFY(record.save());
        QVERIFY2(read(file) == bytes, QByteArray::number(round) + ": " + bytes.toPercentEncoding());
    }
}

void tst_DesktopEntryRandom::keepsEveryLineThatNoChangeTouched()
{
    QRandomGenerator random(m_seed);
    for (int round = 0; round < m_rounds / 4; ++round) {
        const QByteArray bytes = randomBytes(random);
        const QString file = write(bytes);
        VelUIDesktopEntry record(file);
        record.setComment(QStringLiteral("new"));
        QVERIFY(record.save());
        QByteArray after = read(file);
        // Taking our line out again has to give the old file, but for a line end it lacked and
        // the group if it was missing.
        QCOMPARE(after.count("Comment=new"), 1);
        if (record.isValid()) {
            int at = after.indexOf("Comment=new");
            const bool carriageReturn = after.mid(at + 11, 2) == "\r\n";
            after.remove(at, 11 + (carriageReturn ? 2 : 1));
            if (after.size() > bytes.size())
                QVERIFY(after == bytes + "\n" || after == bytes + "\r\n");
            else
                QVERIFY2(after == bytes, QByteArray::number(round) + ": " + bytes.toPercentEncoding());
        } else {
            // A new group may come between a byte order mark and the rest of its line.
            QByteArray rest = bytes;
            if (rest.startsWith("\xEF\xBB\xBF"))
                rest.remove(0, 3);
            for (const QByteArray &line : rest.split('\n'))
                QVERIFY2(after.contains(line), QByteArray::number(round) + ": " + bytes.toPercentEncoding());
        }
    }
}

void tst_DesktopEntryRandom::readsBackAnyChange()
{
    QRandomGenerator random(m_seed);
    for (int round = 0; round < m_rounds / 4; ++round) {
        const QByteArray bytes = randomBytes(random);
        const QString file = write(bytes);
        VelUIDesktopEntry record(file);
        QList<VelUIDesktopAction> actions = record.getActions();
        for (int step = random.bounded(1, 6); step > 0; --step) {
            const QString text = randomText(random);
            const QStringList list = randomList(random);
            switch (random.bounded(7)) {
            case 0:
                record.setName(text);
                QCOMPARE(record.getName(), text);
                break;
            case 1:
                record.setLocalName(text);
                if (!text.isEmpty())
                    QCOMPARE(record.getLocalName(), text);
                break;
            case 2:
                record.setKeywords(list);
                QCOMPARE(record.getKeywords(), withoutEmpty(list));
                break;
            case 3:
                record.setTerminal(text.isEmpty());
                QCOMPARE(record.getTerminal(), text.isEmpty());
                break;
            case 4:
                record.setType(random.bounded(2) ? QStringLiteral("Application") : QStringLiteral("Link"));
                break;
            case 5:
                actions.append(VelUIDesktopAction(QStringLiteral("id%1").arg(random.bounded(3))));
                actions.last().setName(text);
                actions.last().setOnlyShowIn(withoutEmpty(list));
                record.setActions(actions);
                break;
            default:
                record.setActions({});
                actions.clear();
            }
        }
        const QStringList expected = everythingOf(record);
        QVERIFY(record.save());
        const QByteArray message = QByteArray::number(round) + ": " + bytes.toPercentEncoding();
        QVERIFY2(everythingOf(record) == expected, message);
        QVERIFY2(everythingOf(VelUIDesktopEntry(file)) == expected, message);
        const QByteArray saved = read(file);
        QVERIFY(record.save());
        QVERIFY(read(file) == saved);
    }
}

VEL_TEST_GUILESS_MAIN(tst_DesktopEntryRandom)

#include "tst_DesktopEntryRandom.moc"
