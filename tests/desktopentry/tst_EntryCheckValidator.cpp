// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OddEntries.h"
#include "TestCase.h"
#include "Validator.h"

#include <desktopentry/check/EntryCheck.h>
#include <desktopentry/check/EntryText.h>

#include <QDirIterator>
#include <QFileInfo>
#include <QRandomGenerator>
#include <QStandardPaths>

#include <algorithm>

using Validator::Complaint;
using Validator::Complaints;
using Validator::Sample;

namespace {

// What the machine has is left out here: the validator does not look, either.
class NothingKnown : public EntryLookups
{
public:
    Answer program(const QString &, const QString &) const override { return Answer::Unknown; }
    Answer icon(const QString &) const override { return Answer::Unknown; }
    Answer file(const QString &) const override { return Answer::Unknown; }
    Answer mimeType(const QString &) const override { return Answer::Unknown; }
};

// Entries from all over the machine: the packages of the corpus bring them.
QVector<Sample> corpus()
{
    QVector<Sample> samples;
    for (const char *folder :
         {"/usr/share/applications", "/usr/share/kservices5", "/usr/share/kservicetypes5",
          "/etc/xdg/autostart", "/usr/share/xsessions", "/usr/share/desktop-directories"}) {
        QDirIterator files(QString::fromLatin1(folder),
                           {QStringLiteral("*.desktop"), QStringLiteral("*.directory")},
                           QDir::Files | QDir::Hidden, QDirIterator::Subdirectories);
        while (files.hasNext()) {
            const QString path = files.next();
            samples.append({QFileInfo(path).fileName(), TestCase::read(path)});
        }
    }
    for (const char *folder : {"apps", "data", "examples", "tests"}) {
        QDirIterator files(
            QStringLiteral(VEL_SOURCE_DIR "/") + QString::fromLatin1(folder),
            {QStringLiteral("*.desktop"), QStringLiteral("*.directory"), QStringLiteral(".directory")},
            QDir::Files | QDir::Hidden, QDirIterator::Subdirectories);
        while (files.hasNext()) {
            const QString path = files.next();
            samples.append({QFileInfo(path).fileName(), TestCase::read(path)});
        }
    }
    return samples;
}

// What the fuzz target of entries starts from.
QVector<Sample> seeds()
{
    QVector<Sample> samples;
    QDirIterator files(QStringLiteral(VEL_SOURCE_DIR "/tests/fuzz/seeds/EntryText"), QDir::Files);
    while (files.hasNext())
        samples.append({QStringLiteral("seed.desktop"), TestCase::read(files.next())});
    return samples;
}

QVector<Sample> everyFourth(const QVector<Sample> &samples)
{
    QVector<Sample> some;
    for (int i = 0; i < samples.size(); i += 4)
        some.append(samples.at(i));
    return some;
}

bool isAbout(const EntryFinding &finding, const Complaint &complaint)
{
    const QString name = complaint.key.section(QLatin1Char('['), 0, 0);
    return finding.problem == complaint.problem
        && (complaint.key.isEmpty() || finding.key == complaint.key || finding.key == name);
}

bool has(const EntryFindings &findings, const Complaint &complaint)
{
    return complaint.isKnown
        && std::any_of(findings.cbegin(), findings.cend(), [&](const EntryFinding &finding) {
               return finding.severity == EntryFinding::Error && isAbout(finding, complaint);
           });
}

bool has(const Complaints &complaints, const EntryFinding &finding)
{
    return std::any_of(complaints.cbegin(), complaints.cend(), [&](const Complaint &complaint) {
        return complaint.isKnown && isAbout(finding, complaint);
    });
}

QString shown(const Sample &sample)
{
    return sample.name + QLatin1Char('\n')
        + QString::fromLatin1(sample.bytes.toPercentEncoding("\n =[];/%\"'\\"));
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

int errorsLike(const Complaints &complaints, const EntryFinding &finding)
{
    return int(std::count_if(complaints.cbegin(), complaints.cend(), [&](const Complaint &complaint) {
        return complaint.isKnown && isAbout(finding, complaint);
    }));
}

} // namespace

/// The checks of an entry beside desktop-file-validate: never milder, and every repair does what it says.
///
/// VEL_TEST_FULL takes all odd entries and 20,000 random changes; VEL_TEST_SEED gives other ones.
class tst_EntryCheckValidator : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void neverMilder_data();
    void neverMilder();
    void repairsWhatItOffersTo_data();
    void repairsWhatItOffersTo();

private:
    struct Repaired
    {
        int sample;
        EntryFinding finding;
        Sample after;
    };

    static void origins();
    QVector<Sample> samplesOf(const QString &origin) const;
    EntryFindings findingsOf(const Sample &sample);
    QVector<Repaired> repairsOf(const QVector<Sample> &samples);
    QString faultOf(const Repaired &repair, const Sample &sample, const Complaints &complaintsBefore,
                    const Complaints &complaintsAfter);

    QVector<Sample> m_corpus;
};

void tst_EntryCheckValidator::initTestCase()
{
    if (QStandardPaths::findExecutable(QStringLiteral("desktop-file-validate")).isEmpty())
        QSKIP("desktop-file-validate is not installed");
    m_corpus = corpus();
    QVERIFY(m_corpus.size() > 20);
}

void tst_EntryCheckValidator::origins()
{
    QTest::addColumn<QString>("origin");
    for (const char *origin : {"corpus", "odd", "seeds", "random"})
        QTest::newRow(origin) << origin;
}

QVector<Sample> tst_EntryCheckValidator::samplesOf(const QString &origin) const
{
    if (origin == QLatin1String("corpus"))
        return m_corpus;
    const bool isFull = qEnvironmentVariableIsSet("VEL_TEST_FULL");
    if (origin == QLatin1String("odd"))
        return isFull ? OddEntries::all() : everyFourth(OddEntries::all());
    if (origin == QLatin1String("seeds"))
        return seeds();
    const quint32 seed = qEnvironmentVariableIsSet("VEL_TEST_SEED")
        ? quint32(qEnvironmentVariableIntValue("VEL_TEST_SEED"))
        : 20251;
    QRandomGenerator random(seed);
    QVector<Sample> samples;
    for (int i = 0; i < (isFull ? 20000 : 1000); ++i) {
        const Sample &sample = m_corpus.at(random.bounded(m_corpus.size()));
        samples.append({sample.name, OddEntries::changed(sample.bytes, &random)});
    }
    return samples;
}

EntryFindings tst_EntryCheckValidator::findingsOf(const Sample &sample)
{
    const VelUIDesktopEntry record(write(QStringLiteral("record/") + sample.name, sample.bytes));
    return EntryCheck::check(record, sample.bytes, sample.name, NothingKnown());
}

void tst_EntryCheckValidator::neverMilder_data()
{
    origins();
}

void tst_EntryCheckValidator::neverMilder()
{
    QFETCH(QString, origin);
    const QVector<Sample> samples = samplesOf(origin);
    const QVector<Complaints> complaints = Validator::check(samples, path(QStringLiteral("files")));
    QCOMPARE(complaints.size(), samples.size());
    QStringList missed;
    QStringList ownErrors;
    int errors = 0;
    for (int i = 0; i < samples.size(); ++i) {
        const EntryFindings findings = findingsOf(samples.at(i));
        for (const Complaint &complaint : complaints.at(i)) {
            if (complaint.severity != EntryFinding::Error)
                continue;
            ++errors;
            if (!has(findings, complaint))
                missed.append(complaint.text + QLatin1Char('\n') + shown(samples.at(i)));
        }
        for (const EntryFinding &finding : findings) {
            if (finding.severity == EntryFinding::Error && Validator::looksFor(finding)
                && !has(complaints.at(i), finding))
                ownErrors.append(finding.sentence + QLatin1Char('\n') + shown(samples.at(i)));
        }
    }
    qInfo().noquote() << QStringLiteral("%1: %2 files, %3 errors, %4 missed, %5 of ours alone")
                             .arg(origin)
                             .arg(samples.size())
                             .arg(errors)
                             .arg(missed.size())
                             .arg(ownErrors.size());
    QVERIFY(errors > 0);
    QVERIFY2(missed.isEmpty(), qPrintable(missed.value(0)));
    // Seeing errors everywhere would miss none, either.
    const int allowed = origin == QLatin1String("corpus") ? 0 : 1 + errors / 40;
    QVERIFY2(ownErrors.size() <= allowed, qPrintable(ownErrors.value(0)));
}

QVector<tst_EntryCheckValidator::Repaired> tst_EntryCheckValidator::repairsOf(const QVector<Sample> &samples)
{
    QVector<Repaired> all;
    for (int i = 0; i < samples.size(); ++i) {
        const Sample &sample = samples.at(i);
        for (const EntryFinding &finding : findingsOf(sample)) {
            if (!finding.repair)
                continue;
            const QString file = write(QStringLiteral("repaired/") + sample.name, sample.bytes);
            VelUIDesktopEntry record(file);
            finding.repair->applyTo(&record);
            if (record.save())
                all.append({i, finding, {sample.name, read(file)}});
        }
    }
    return all;
}

void tst_EntryCheckValidator::repairsWhatItOffersTo_data()
{
    origins();
}

// What a repair did wrong; empty when it did what it says.
QString tst_EntryCheckValidator::faultOf(const Repaired &repair, const Sample &sample,
                                         const Complaints &complaintsBefore,
                                         const Complaints &complaintsAfter)
{
    const QByteArray key = repair.finding.key.toUtf8();
    QByteArray before = sample.bytes;
    // A new line behind the last one gives that the end that it lacks; what goes leaves a whole line before.
    if (!before.endsWith('\n') && repair.after.bytes.endsWith('\n'))
        before.append('\n');
    for (const QByteArray &line :
         linesOnlyIn(repair.after.bytes, before) + linesOnlyIn(before, repair.after.bytes)) {
        if (!line.trimmed().startsWith(key))
            return QStringLiteral("changes another line: ") + QString::fromUtf8(line);
    }
    const int had = errorsLike(complaintsBefore, repair.finding);
    if (had > 0 && errorsLike(complaintsAfter, repair.finding) >= had)
        return QStringLiteral("does not help the validator");
    const EntryFindings findings = findingsOf(repair.after);
    const bool isStillThere = std::any_of(findings.cbegin(), findings.cend(), [&](const EntryFinding &other) {
        return other.problem == repair.finding.problem && other.key == repair.finding.key
            && other.group == repair.finding.group && other.sentence == repair.finding.sentence;
    });
    return isStillThere ? QStringLiteral("does not help us") : QString();
}

void tst_EntryCheckValidator::repairsWhatItOffersTo()
{
    QFETCH(QString, origin);
    const QVector<Sample> samples = samplesOf(origin);
    const QVector<Repaired> repairs = repairsOf(samples);
    QVector<Sample> before;
    QVector<Sample> after;
    for (const Repaired &repair : repairs) {
        before.append(samples.at(repair.sample));
        after.append(repair.after);
    }
    const QVector<Complaints> complaintsBefore = Validator::check(before, path(QStringLiteral("before")));
    const QVector<Complaints> complaintsAfter = Validator::check(after, path(QStringLiteral("after")));
    QStringList wrong;
    for (int i = 0; i < repairs.size(); ++i) {
        const QString fault =
            faultOf(repairs.at(i), before.at(i), complaintsBefore.at(i), complaintsAfter.at(i));
        if (!fault.isEmpty())
            wrong.append(repairs.at(i).finding.sentence + QLatin1Char(' ') + fault + QLatin1Char('\n')
                         + shown(before.at(i)) + QLatin1String("\n->") + shown(after.at(i)));
    }
    qInfo().noquote() << QStringLiteral("%1: %2 repairs").arg(origin).arg(repairs.size());
    QVERIFY2(wrong.isEmpty(), qPrintable(QString::number(wrong.size()) + QLatin1Char('\n') + wrong.value(0)));
}

VEL_TEST_GUILESS_MAIN(tst_EntryCheckValidator)

#include "tst_EntryCheckValidator.moc"
