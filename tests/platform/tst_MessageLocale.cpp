// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <MessageLocale.h>

#include <unistd.h>

#include <atomic>
#include <cstdlib>
#include <list>
#include <random>
#include <thread>
#include <vector>

/// The locale of messages, as the environment has it at the time.
class tst_MessageLocale : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void takesTheFirstVariableThatIsSet();
    void seesATextThatIsChangedWhereItStands();
    void followsAnyChangeOfTheEnvironment();
    void isTheSameInEachThread();

private:
    void use(std::vector<char *> environment);

    std::list<std::vector<char *>> m_environments; // each may still be in use
};

namespace {

constexpr const char *Variables[] = {"LC_ALL", "LC_MESSAGES", "LANG"};

// The C library moves its own array about, so one is only ever put in the place of it.
std::vector<char *> copyOfEnvironment()
{
    std::vector<char *> copy;
    for (char **place = ::environ; *place; ++place)
        copy.push_back(*place);
    copy.push_back(nullptr);
    return copy;
}

std::string allOf(const MessageLocale &locale)
{
    std::string all(locale.language());
    for (int rank = 1; rank <= MessageLocale::BestRank; ++rank)
        all += ' ' + locale.keyLocale(rank);
    return all;
}

// The rule, with nothing remembered.
std::string expected()
{
    for (const char *variable : Variables) {
        const char *const value = ::getenv(variable);
        if (value && *value)
            return allOf(MessageLocale(value));
    }
    return allOf(MessageLocale(""));
}

} // namespace

void tst_MessageLocale::init()
{
    TestCase::init();
    for (const char *variable : Variables)
        qunsetenv(variable);
    use(copyOfEnvironment());
}

void tst_MessageLocale::cleanup()
{
    use(m_environments.front());
    TestCase::cleanup();
}

void tst_MessageLocale::use(std::vector<char *> environment)
{
    m_environments.push_back(std::move(environment));
    ::environ = m_environments.back().data();
}

void tst_MessageLocale::takesTheFirstVariableThatIsSet()
{
    QCOMPARE(allOf(MessageLocale::current()), allOf(MessageLocale("en")));
    qputenv("LANG", "de_AT.UTF-8");
    QCOMPARE(allOf(MessageLocale::current()), allOf(MessageLocale("de_AT")));
    qputenv("LC_MESSAGES", "sr_RS@latin");
    QCOMPARE(allOf(MessageLocale::current()), allOf(MessageLocale("sr_RS@latin")));
    qputenv("LC_ALL", "");
    QCOMPARE(allOf(MessageLocale::current()), allOf(MessageLocale("sr_RS@latin")));
    qputenv("LC_ALL", "fr");
    QCOMPARE(allOf(MessageLocale::current()), allOf(MessageLocale("fr")));
    qunsetenv("LC_ALL");
    QCOMPARE(allOf(MessageLocale::current()), allOf(MessageLocale("sr_RS@latin")));
}

void tst_MessageLocale::seesATextThatIsChangedWhereItStands()
{
    static char text[] = "LANG=de_DE";
    QCOMPARE(::putenv(text), 0);
    QCOMPARE(MessageLocale::current().language(), std::string_view("de"));
    text[5] = 'f';
    text[6] = 'r';
    QCOMPARE(MessageLocale::current().language(), std::string_view("fr"));
    text[5] = '\0';
    QCOMPARE(MessageLocale::current().language(), std::string_view("en"));
    ::unsetenv("LANG");
}

void tst_MessageLocale::followsAnyChangeOfTheEnvironment()
{
    constexpr int Steps = 5000;
    const char *const values[] = {"", "C", "de", "de_AT.UTF-8", "sr_RS@latin", "pt_BR", "POSIX", "en_GB"};
    const char *const others[] = {"LC_TIME", "L", "LANGUAGE", "A", "LC_ALLES"};
    std::mt19937 random(1);
    const auto below = [&random](std::size_t count) { return std::size_t(random()) % count; };
    for (int step = 0; step < Steps; ++step) {
        const char *const variable =
            below(2) ? Variables[below(std::size(Variables))] : others[below(std::size(others))];
        switch (below(8)) {
        case 0:
            ::unsetenv(variable);
            break;
        case 1:
            use(copyOfEnvironment());
            break;
        case 2:
            use(below(4) ? m_environments.front() : std::vector<char *>{nullptr});
            break;
        default:
            ::setenv(variable, values[below(std::size(values))], 1);
        }
        QCOMPARE(allOf(MessageLocale::current()), expected());
    }
}

void tst_MessageLocale::isTheSameInEachThread()
{
    constexpr int Threads = 4;
    for (const char *language : {"de", "fr", "sr@latin"}) {
        qputenv("LANG", language);
        const std::string wanted = allOf(MessageLocale::current());
        std::atomic<int> wrong{0};
        std::vector<std::thread> threads;
        for (int i = 0; i < Threads; ++i) {
            threads.emplace_back([&] {
                for (int round = 0; round < 1000; ++round)
                    wrong += allOf(MessageLocale::current()) == wanted ? 0 : 1;
            });
        }
        for (std::thread &thread : threads)
            thread.join();
        QCOMPARE(wrong.load(), 0);
    }
}

VEL_TEST_GUILESS_MAIN(tst_MessageLocale)

#include "tst_MessageLocale.moc"
