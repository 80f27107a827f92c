// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <frame/DialogSize.h>

#include <QDialog>
#include <QDir>
#include <QFileInfo>
#include <QLockFile>
#include <QScreen>
#include <QSettings>

/// Sizes that dialogs take from the settings and leave there.
class tst_DialogSize : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void restores_data();
    void restores();
    void cutsToTheScreenWhenShown_data();
    void cutsToTheScreenWhenShown();
    void restoresWhileItIsShown();
    void remembers();
    void writesNothingWhenTheSizeStandsThere();
    void waitsForNobodyWhenTheSizeStandsThere();
};

void tst_DialogSize::restores_data()
{
    QTest::addColumn<QVariant>("width");
    QTest::addColumn<QVariant>("height");
    QTest::addColumn<QSize>("size");
    QTest::newRow("nothing kept") << QVariant() << QVariant() << QSize(300, 200);
    QTest::newRow("a width kept") << QVariant(640) << QVariant() << QSize(640, 200);
    QTest::newRow("a height kept") << QVariant() << QVariant(480) << QSize(300, 480);
    QTest::newRow("texts") << QVariant(QStringLiteral("640")) << QVariant(QStringLiteral("480"))
                           << QSize(640, 480);
    QTest::newRow("no numbers") << QVariant(QStringLiteral("wide")) << QVariant(QStringLiteral("7x"))
                                << QSize(0, 0);
}

void tst_DialogSize::restores()
{
    QFETCH(QVariant, width);
    QFETCH(QVariant, height);
    QSettings settings;
    if (width.isValid())
        settings.setValue(QStringLiteral("Some/Width"), width);
    if (height.isValid())
        settings.setValue(QStringLiteral("Some/Height"), height);

    QDialog dialog;
    DialogSize::restore(dialog, QStringLiteral("Some"), QSize(300, 200));
    QTEST(dialog.size(), "size");
}

void tst_DialogSize::cutsToTheScreenWhenShown_data()
{
    QTest::addColumn<QSize>("kept");
    QTest::addColumn<QSize>("least");
    QTest::newRow("both") << QSize(9000, 8000) << QSize();
    QTest::newRow("the width") << QSize(9000, 300) << QSize();
    QTest::newRow("the height") << QSize(300, 8000) << QSize();
    QTest::newRow("neither") << QSize(300, 200) << QSize();
    QTest::newRow("no more than its contents allow") << QSize(9000, 300) << QSize(3000, 10);
}

void tst_DialogSize::cutsToTheScreenWhenShown()
{
    QFETCH(QSize, kept);
    QFETCH(QSize, least);
    QSettings settings;
    settings.setValue(QStringLiteral("Some/Width"), kept.width());
    settings.setValue(QStringLiteral("Some/Height"), kept.height());
    QDialog dialog;
    if (least.isValid())
        dialog.setMinimumSize(least);
    DialogSize::restore(dialog, QStringLiteral("Some"), QSize(300, 200));
    QCOMPARE(dialog.size(), kept);

    dialog.show();
    QVERIFY(QTest::qWaitForWindowExposed(&dialog));

    const QSize screen = dialog.screen()->availableSize();
    const QSize shown = dialog.size();
    QVERIFY(shown.width() <= qMax(screen.width(), least.width()));
    QVERIFY(shown.height() <= screen.height());
    // What fits stays, and nothing is cut by more than a frame takes.
    QCOMPARE(shown.width(), qMax(qMin(kept.width(), screen.width()), least.width()));
    if (kept.height() < screen.height())
        QCOMPARE(shown.height(), kept.height());
    QVERIFY(shown.height() >= qMin(kept.height(), screen.height() - 60));
    QVERIFY(dialog.frameGeometry().height() <= screen.height());

    // From then on the size is the user's.
    dialog.resize(kept.expandedTo(least));
    dialog.hide();
    dialog.show();
    QCOMPARE(dialog.size(), kept.expandedTo(least));
}

void tst_DialogSize::restoresWhileItIsShown()
{
    QDialog dialog;
    dialog.resize(310, 210);
    DialogSize::restoreShown(dialog, QStringLiteral("Shown"));
    QCOMPARE(dialog.size(), QSize(310, 210));
    QSettings().setValue(QStringLiteral("Shown/Width"), 320);
    QSettings().setValue(QStringLiteral("Shown/Height"), 90000);
    DialogSize::restoreShown(dialog, QStringLiteral("Shown"));
    QCOMPARE(dialog.width(), 320);
    QVERIFY(dialog.height() > 210 && dialog.height() <= dialog.screen()->availableSize().height());
}

void tst_DialogSize::remembers()
{
    QDialog dialog;
    dialog.resize(701, 602);
    DialogSize::remember(dialog, QStringLiteral("/Some"));
    QSettings settings;
    QCOMPARE(settings.value(QStringLiteral("Some/Width")).toString(), QStringLiteral("701"));
    QCOMPARE(settings.value(QStringLiteral("Some/Height")).toString(), QStringLiteral("602"));

    dialog.resize(701, 400);
    DialogSize::remember(dialog, QStringLiteral("/Some"));
    settings.sync();
    QCOMPARE(settings.value(QStringLiteral("Some/Height")).toString(), QStringLiteral("400"));
    QCOMPARE(settings.allKeys().size(), 2);
}

void tst_DialogSize::writesNothingWhenTheSizeStandsThere()
{
    QDialog dialog;
    dialog.resize(701, 602);
    DialogSize::remember(dialog, QStringLiteral("Some"));
    const QString file = QSettings().fileName();
    const QByteArray text = read(file) + "; a comment that a rewrite would drop\n";
    QFile note(file);
    QVERIFY(note.open(QIODevice::WriteOnly) && note.write(text) == text.size());
    note.close();

    DialogSize::remember(dialog, QStringLiteral("Some"));
    QCOMPARE(read(file), text);
    dialog.resize(702, 602);
    DialogSize::remember(dialog, QStringLiteral("Some"));
    QVERIFY(read(file) != text);
}

// Whoever was ended while it wrote may leave the lock behind, and a full disk keeps it there.
void tst_DialogSize::waitsForNobodyWhenTheSizeStandsThere()
{
    QDialog dialog;
    dialog.resize(701, 602);
    DialogSize::remember(dialog, QStringLiteral("Some"));
    QLockFile lock(QSettings().fileName() + QLatin1String(".lock"));
    QVERIFY(lock.tryLock());
    DialogSize::remember(dialog, QStringLiteral("Some"));
    QVERIFY(lock.isLocked());
}

VEL_TEST_MAIN(tst_DialogSize)
#include "tst_DialogSize.moc"
