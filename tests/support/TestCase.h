// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "TestEnvironment.h"

#include <QApplication>
#include <QObject>
#include <QRegularExpression>
#include <QScopedPointer>
#include <QTemporaryDir>
#include <QTest>

/**
 * Base of every test class.
 *
 * Each test function gets an empty folder, starts with English texts and an empty home, and
 * fails when a warning was logged that it did not announce, when an announced one did not
 * come, or when it left a modal window open.
 *
 * A class that needs init() or cleanup() of its own calls the one of the base in it.
 */
class TestCase : public QObject
{
    Q_OBJECT

public:
    explicit TestCase(QObject *parent = nullptr);
    ~TestCase() override;

    /// A folder that is empty when a test function begins, without a trailing "/".
    QString folder() const;
    /// The path of \a name in folder().
    QString path(const QString &name) const;

    /// Writes \a bytes to \a name below folder(), making the folders on the way; returns its path.
    QString write(const QString &name, const QByteArray &bytes);
    /// The contents of the file \a path; fails the test when it cannot be read.
    static QByteArray read(const QString &path);

    /// Announces a warning (or critical message) that this test function brings about.
    void expectWarning(const QRegularExpression &pattern);
    void expectWarning(const QString &text);

protected Q_SLOTS:
    void init();
    void cleanup();

private:
    void closeModalWindows();

    QScopedPointer<QTemporaryDir> m_folder;
};

/// Defines main() for a test of classes that need widgets.
#define VEL_TEST_MAIN(TestClass) \
    int main(int argc, char **argv) \
    { \
        VelTest::TestEnvironment environment; \
        QApplication application(argc, argv); \
        TestClass test; \
        QTEST_SET_MAIN_SOURCE_PATH \
        return QTest::qExec(&test, argc, argv); \
    }

/// Defines main() for a test of classes that need no more than an event loop.
#define VEL_TEST_GUILESS_MAIN(TestClass) \
    int main(int argc, char **argv) \
    { \
        VelTest::TestEnvironment environment; \
        QCoreApplication application(argc, argv); \
        TestClass test; \
        QTEST_SET_MAIN_SOURCE_PATH \
        return QTest::qExec(&test, argc, argv); \
    }
