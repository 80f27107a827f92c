// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FileWork.h"

#include <QCoreApplication>
#include <QWidget>

namespace {

// Most operations are done before anybody notices, and nothing has to be handled in them.
constexpr int Unnoticed = 100; // milliseconds

} // namespace

FileWork::FileWork(QWidget *owner, const QString &title, const QString &text)
    : m_owner(owner)
    , m_title(title)
    , m_text(text)
{
    m_sinceBegun.start();
}

FileWork::~FileWork() = default;

bool FileWork::goOn()
{
    if (m_sinceBegun.elapsed() < Unnoticed)
        return true;
    if (m_isEnded) {
        m_work->goOn();
        return false;
    }
    if (!m_work)
        m_work = std::make_unique<LongWork>(m_owner, m_title, m_text);
    m_work->setProgress(done(), expected());
    if (m_work->goOn())
        return true;
    m_isEnded = true;
    m_work = std::make_unique<LongWork>(
        m_owner, m_title, QCoreApplication::translate("VelMenuView", "Taking back what was done..."),
        LongWork::End::ByItself);
    return false;
}
