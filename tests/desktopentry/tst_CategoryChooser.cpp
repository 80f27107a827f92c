// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <desktopentry/CategoryChooser.h>
#include <desktopentry/CategoryNames.h>
#include <desktopentry/check/RegisteredCategories.h>

#include <algorithm>

using namespace VelUI;

namespace {

const Choice *find(const QVector<Choice> &choices, const char *category)
{
    const auto found = std::find_if(choices.begin(), choices.end(), [category](const Choice &choice) {
        return choice.value == QLatin1String(category);
    });
    return found == choices.end() ? nullptr : &*found;
}

QString remark(const QVector<Choice> &choices, const char *category)
{
    const Choice *choice = find(choices, category);
    return choice ? choice->texts.value(2) : QStringLiteral("(missing)");
}

} // namespace

class tst_CategoryChooser : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void namesEveryRegisteredCategory();
    void offersEachOnce();
    void tellsWhatACategoryIs();
    void keepsWhatIsNotRegistered();
};

void tst_CategoryChooser::namesEveryRegisteredCategory()
{
    QStringList names;
    for (const RegisteredCategories::Category &category : RegisteredCategories::all()) {
        const QString name = CategoryNames::of(category.name);
        if (category.kind != RegisteredCategories::Kind::Deprecated)
            names.append(name);
        // A name for users has words where the category has capital letters.
        const auto isCapital = [](QChar c) { return c.isUpper(); };
        const auto rest = category.name.mid(1);
        if (std::any_of(rest.begin(), rest.end(), isCapital)
            && std::any_of(rest.begin(), rest.end(), [](QChar c) { return c.isLower(); }))
            QVERIFY2(name != category.name, qPrintable(name));
    }
    QCOMPARE(names.removeDuplicates(), 0);
    QCOMPARE(CategoryNames::of(QStringLiteral("IDE")), QStringLiteral("Development environments"));
    QCOMPARE(CategoryNames::of(QStringLiteral("X-Mine")), QStringLiteral("X-Mine"));
}

void tst_CategoryChooser::offersEachOnce()
{
    const QVector<Choice> choices = CategoryChooser::choices({});
    QStringList values;
    for (const Choice &choice : choices)
        values.append(choice.value);
    QCOMPARE(values.removeDuplicates(), 0);
    for (const RegisteredCategories::Category &category : RegisteredCategories::all())
        QCOMPARE(values.contains(category.name), category.kind != RegisteredCategories::Kind::Deprecated);
}

void tst_CategoryChooser::tellsWhatACategoryIs()
{
    const QVector<Choice> choices = CategoryChooser::choices({});
    QCOMPARE(find(choices, "AudioVideo")->texts,
             (QStringList{QStringLiteral("Audio and video"), QStringLiteral("AudioVideo"),
                          QStringLiteral("Main category")}));
    QCOMPARE(remark(choices, "WebBrowser"), QStringLiteral("Goes with Internet and network"));
    QCOMPARE(remark(choices, "Database"),
             QStringLiteral("Goes with Office / Software development / Audio and video"));
    QCOMPARE(remark(choices, "OCR"), QStringLiteral("Goes with Graphics + Scanning"));
    QCOMPARE(remark(choices, "Core"), QString());
    QCOMPARE(remark(choices, "TrayIcon"), QStringLiteral("Only beside \"Only show in\""));
    QVERIFY(find(choices, "AudioVideo")->group < find(choices, "Core")->group);
    QVERIFY(find(choices, "Core")->group < find(choices, "TrayIcon")->group);
}

void tst_CategoryChooser::keepsWhatIsNotRegistered()
{
    const QVector<Choice> choices =
        CategoryChooser::choices({QStringLiteral("X-Mine"), QStringLiteral("game"), QStringLiteral("game"),
                                  QStringLiteral("Application"), QStringLiteral("Game")});
    QCOMPARE(remark(choices, "X-Mine"), QStringLiteral("Extension"));
    QCOMPARE(remark(choices, "game"), QStringLiteral("Not registered"));
    QCOMPARE(remark(choices, "Application"), QStringLiteral("Deprecated"));
    QCOMPARE(remark(choices, "Game"), QStringLiteral("Main category"));
    QCOMPARE(remark(choices, "Applications"), QStringLiteral("(missing)"));
    QCOMPARE(choices.size(), CategoryChooser::choices({}).size() + 3);
}

VEL_TEST_GUILESS_MAIN(tst_CategoryChooser)

#include "tst_CategoryChooser.moc"
