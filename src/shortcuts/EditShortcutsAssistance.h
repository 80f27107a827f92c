// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EditShortcutsForm.h"
#include "ShortcutsModel.h"

#include <QObject>
#include <QPointer>

/**
 * What the shortcuts dialog has beyond its plain form.
 *
 * It puts its parts into the form when it is made and takes them out again when it is destroyed;
 * then the form is as it was.
 */
class EditShortcutsAssistance : public QObject
{
    Q_OBJECT

public:
    /// Completes \a form, which shows \a shortcuts, or nothing when that is null.
    EditShortcutsAssistance(const EditShortcutsForm &form, ShortcutsModel *shortcuts);
    ~EditShortcutsAssistance() override;

Q_SIGNALS:
    /// A part made other keys pending.
    void keysChanged();

private:
    const EditShortcutsForm m_form;
    const QPointer<ShortcutsModel> m_model;
};
