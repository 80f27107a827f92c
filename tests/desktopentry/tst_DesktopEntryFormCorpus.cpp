// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FormDriving.h"
#include "TestCase.h"

#include <VelDesktopEntryEditDialog.h>
#include <VelDesktopEntryPropsWidget.h>
#include <frame/DesktopEntryRecord.h>

#include <QDir>
#include <QFileInfo>
#include <QProcess>

using namespace FormDriving;

namespace {

constexpr int enoughPackages = 10;

struct Sample
{
    QString origin;
    QByteArray bytes;
};

// Some packages describe their plug-ins in files of the same form.
bool isOfAKnownType(const QString &file)
{
    const QString type = VelUIDesktopEntry(file).getType();
    return type == QLatin1String("Application") || type == QLatin1String("Link")
        || type == QLatin1String("Directory");
}

// What the validator says about a file, without its name.
QByteArrayList complaints(const QString &file)
{
    QProcess process;
    process.start(QStringLiteral("desktop-file-validate"), {file});
    process.waitForFinished();
    QByteArrayList lines = process.readAllStandardOutput().split('\n');
    for (QByteArray &line : lines)
        line = line.mid(line.indexOf(": ") + 2);
    return lines;
}

// The lines that stand in one text only, in order.
QByteArrayList linesOnlyIn(const QByteArray &text, const QByteArray &other)
{
    QByteArrayList left = other.split('\n');
    QByteArrayList only;
    for (const QByteArray &line : text.split('\n')) {
        if (!left.removeOne(line))
            only.append(line);
    }
    return only;
}

} // namespace

/// The desktop entries of the packages that are installed on this machine, through the dialog.
class tst_DesktopEntryFormCorpus : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void changesNothingWithoutAnEdit();
    void changesTheCommentOnly();
    void leavesNothingOfTheOldType();

private:
    QString copy(const Sample &sample);
    bool accept(VelDesktopEntryEditDialog &dialog, const VelUIDesktopEntry &entry);
    void saveThroughTheForm(const QString &file, const QString &comment);

    QVector<Sample> m_samples;
};

void tst_DesktopEntryFormCorpus::initTestCase()
{
    const QDir packages(QStringLiteral("/var/lib/dpkg/info"));
    int count = 0;
    for (const QString &name : packages.entryList({QStringLiteral("*.list")})) {
        const int before = m_samples.size();
        for (const QByteArray &line : read(packages.filePath(name)).split('\n')) {
            const QString file = QFile::decodeName(line);
            if ((line.endsWith(".desktop") || line.endsWith(".directory")) && QFileInfo(file).isFile()
                && isOfAKnownType(file))
                m_samples.append({file, read(file)});
        }
        count += m_samples.size() > before;
    }
    qInfo("%d entries of %d packages", int(m_samples.size()), count);
    if (count < enoughPackages)
        QSKIP("too few packages with desktop entries are installed");
}

QString tst_DesktopEntryFormCorpus::copy(const Sample &sample)
{
    const bool folder = sample.origin.endsWith(QLatin1String(".directory"));
    return write(folder ? QStringLiteral("x/.directory") : QStringLiteral("x.desktop"), sample.bytes);
}

bool tst_DesktopEntryFormCorpus::accept(VelDesktopEntryEditDialog &dialog, const VelUIDesktopEntry &entry)
{
    ModalDriver modal;
    modal.handle([&modal, &entry](QWidget *window) {
        if (!entry.isDisplayable(nullptr))
            modal.answer({QMessageBox::Warning, QStringLiteral("Warning"),
                          QStringLiteral("You create hidden desktop entry"), QMessageBox::Ok,
                          QMessageBox::NoButton},
                         QMessageBox::Ok);
        click(okButton(window));
    });
    return dialog.exec() == QDialog::Accepted && modal.finished();
}

// The dialog refuses an entry whose program is not installed; its form does not.
void tst_DesktopEntryFormCorpus::saveThroughTheForm(const QString &file, const QString &comment)
{
    VelUIDesktopEntry entry(file);
    QVERIFY2(entry.load(), qPrintable(file));
    VelDesktopEntryPropsWidget form;
    form.loadFrom(entry);
    if (!comment.isNull())
        retype(child<QLineEdit>(&form, "commentEdit"), comment);
    form.saveTo(&entry);
    QVERIFY(entry.save());
}

void tst_DesktopEntryFormCorpus::changesNothingWithoutAnEdit()
{
    int accepted = 0;
    for (const Sample &sample : qAsConst(m_samples)) {
        const QString file = copy(sample);
        const VelUIDesktopEntry entry(file);
        if (entry.isSuitable(nullptr)) {
            VelDesktopEntryEditDialog dialog;
            QVERIFY2(dialog.setDesktopEntryPath(file), qPrintable(sample.origin));
            QVERIFY2(accept(dialog, entry), qPrintable(sample.origin));
            ++accepted;
        } else if (entry.isValid()) {
            saveThroughTheForm(file, QString());
        }
        QVERIFY2(read(file) == sample.bytes, qPrintable(sample.origin));
    }
    qInfo("%d accepted in the dialog", accepted);
    QVERIFY(accepted >= enoughPackages);
}

void tst_DesktopEntryFormCorpus::changesTheCommentOnly()
{
    const QString typed = QStringLiteral("Typed comment");
    for (const Sample &sample : qAsConst(m_samples)) {
        const QString file = copy(sample);
        const QByteArrayList before = complaints(file);
        const VelUIDesktopEntry entry(file);
        if (!entry.isValid())
            continue;
        const bool had = !entry.getComment().isEmpty();
        if (entry.isSuitable(nullptr)) {
            VelDesktopEntryEditDialog dialog;
            QVERIFY(dialog.setDesktopEntryPath(file));
            retype(child<QLineEdit>(&dialog, "commentEdit"), typed);
            QVERIFY2(accept(dialog, entry), qPrintable(sample.origin));
        } else {
            saveThroughTheForm(file, typed);
        }
        const QByteArray after = read(file);
        const QByteArrayList gone = linesOnlyIn(sample.bytes, after);
        const QByteArrayList come = linesOnlyIn(after, sample.bytes);
        QVERIFY2(come.size() == 1 && come.constFirst().startsWith("Comment"), qPrintable(sample.origin));
        QVERIFY2(come.constFirst().endsWith("Typed comment"), qPrintable(sample.origin));
        QVERIFY2(gone.size() == (had ? 1 : 0), qPrintable(sample.origin));
        const QByteArrayList said = complaints(file);
        for (const QByteArray &complaint : said)
            QVERIFY2(before.contains(complaint), qPrintable(sample.origin + QString::fromUtf8(complaint)));
    }
}

void tst_DesktopEntryFormCorpus::leavesNothingOfTheOldType()
{
    const QByteArrayList ofApplications{"Exec",           "TryExec",    "Path",           "Terminal",
                                        "MimeType",       "Categories", "Keywords",       "StartupNotify",
                                        "StartupWMClass", "Actions",    "DBusActivatable"};
    int changed = 0;
    for (const Sample &sample : qAsConst(m_samples)) {
        const QByteArrayList before = complaints(copy(sample));
        // The validator wants the name that goes with the new type.
        const QString file = write(QStringLiteral("x/.directory"), sample.bytes);
        VelUIDesktopEntry entry(file);
        if (entry.getType() != QLatin1String("Application"))
            continue;
        VelDesktopEntryPropsWidget form;
        form.loadFrom(entry);
        form.setType(QStringLiteral("Directory"), {});
        form.saveTo(&entry);
        QVERIFY(entry.save());
        const QByteArray after = read(file);
        for (const QByteArray &key : ofApplications) {
            QVERIFY2(!after.contains('\n' + key + '='), qPrintable(sample.origin));
            QVERIFY2(!after.contains('\n' + key + '['), qPrintable(sample.origin));
        }
        QVERIFY2(!after.contains("[Desktop Action"), qPrintable(sample.origin));
        for (const QByteArray &complaint : complaints(file))
            QVERIFY2(before.contains(complaint), qPrintable(sample.origin + QString::fromUtf8(complaint)));
        ++changed;
    }
    QVERIFY(changed >= enoughPackages);
}

VEL_TEST_MAIN(tst_DesktopEntryFormCorpus)

#include "tst_DesktopEntryFormCorpus.moc"
