// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <QDir>
#include <QFile>
#include <QMutex>
#include <QMutexLocker>
#include <QSettings>

#include <filesystem>
#include <system_error>

namespace {

// What the running test function logged and announced. Messages may come from any thread.
struct MessageLog
{
    QMutex mutex;
    QtMessageHandler previous = nullptr;
    QStringList unexpected;
    QVector<QRegularExpression> announced;
};

MessageLog &messageLog()
{
    static MessageLog log;
    return log;
}

bool takeAnnounced(MessageLog &log, const QString &message)
{
    for (int i = 0; i < log.announced.size(); ++i) {
        if (log.announced.at(i).match(message).hasMatch()) {
            log.announced.remove(i);
            return true;
        }
    }
    return false;
}

void handleMessage(QtMsgType type, const QMessageLogContext &context, const QString &message)
{
    MessageLog &log = messageLog();
    {
        QMutexLocker lock(&log.mutex);
        // The offscreen platform complains about every window with a smallest size and every
        // tool tip.
        if (message == QLatin1String("This plugin does not support propagateSizeHints()")
            || message == QLatin1String("This plugin does not support raise()"))
            return;
        // Qt asks for the place of a window that the window manager takes away at that moment.
        if (message.startsWith(QLatin1String("QXcbConnection: XCB error: 3 (BadWindow)")))
            return;
        // Qt 6 complains about drawings of installed themes, which it shows when all icons are offered.
        if (message == QLatin1String("The requested buffer size is too big, ignoring"))
            return;
        if (type == QtWarningMsg || type == QtCriticalMsg) {
            if (takeAnnounced(log, message))
                return;
            log.unexpected.append(message);
        }
    }
    if (log.previous)
        log.previous(type, context, message);
}

} // namespace

TestCase::TestCase(QObject *parent)
    : QObject(parent)
{
}

TestCase::~TestCase() = default;

QString TestCase::folder() const
{
    return QFileInfo(m_folder->path()).canonicalFilePath();
}

QString TestCase::path(const QString &name) const
{
    return folder() + QLatin1Char('/') + name;
}

QString TestCase::write(const QString &name, const QByteArray &bytes)
{
    const QString target = path(name);
    QDir().mkpath(QFileInfo(target).absolutePath());
    QFile file(target);
    if (!file.open(QIODevice::WriteOnly) || file.write(bytes) != bytes.size())
        QTest::qFail(qPrintable(QStringLiteral("cannot write ") + target), __FILE__, __LINE__);
    return target;
}

QByteArray TestCase::read(const QString &path)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly)) {
        QTest::qFail(qPrintable(QStringLiteral("cannot read ") + path), __FILE__, __LINE__);
        return {};
    }
    return file.readAll();
}

void TestCase::expectWarning(const QRegularExpression &pattern)
{
    QMutexLocker lock(&messageLog().mutex);
    messageLog().announced.append(pattern);
}

void TestCase::expectWarning(const QString &text)
{
    expectWarning(QRegularExpression(QRegularExpression::escape(text)));
}

void TestCase::init()
{
    m_folder.reset(new QTemporaryDir);
    QVERIFY2(m_folder->isValid(), qPrintable(m_folder->errorString()));
    QSettings().clear();

    MessageLog &log = messageLog();
    QMutexLocker lock(&log.mutex);
    log.unexpected.clear();
    log.announced.clear();
    log.previous = qInstallMessageHandler(handleMessage);
}

void TestCase::cleanup()
{
    closeModalWindows();
    if (QCoreApplication::instance())
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);

    MessageLog &log = messageLog();
    QMutexLocker lock(&log.mutex);
    qInstallMessageHandler(log.previous);
    log.previous = nullptr;
    // Qt removes no file whose name is no text.
    std::error_code left;
    if (m_folder)
        std::filesystem::remove_all(QFile::encodeName(m_folder->path()).toStdString(), left);
    m_folder.reset();

    if (QTest::currentTestFailed())
        return;
    QVERIFY2(log.unexpected.isEmpty(),
             qPrintable(QStringLiteral("unexpected message: ") + log.unexpected.join(QStringLiteral(" | "))));
    QVERIFY2(log.announced.isEmpty(),
             qPrintable(QStringLiteral("announced message did not come: ")
                        + (log.announced.isEmpty() ? QString() : log.announced.constFirst().pattern())));
}

void TestCase::closeModalWindows()
{
    if (!qobject_cast<QApplication *>(QCoreApplication::instance()))
        return;
    QStringList left;
    while (QWidget *window = QApplication::activeModalWidget()) {
        left.append(window->windowTitle());
        window->close();
        if (QApplication::activeModalWidget() == window)
            window->hide();
    }
    if (!left.isEmpty() && !QTest::currentTestFailed())
        QTest::qFail(
            qPrintable(QStringLiteral("modal windows left open: ") + left.join(QStringLiteral(", "))),
            __FILE__, __LINE__);
}
