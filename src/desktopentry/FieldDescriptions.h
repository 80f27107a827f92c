// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EntryFormHost.h"

#include <QObject>
#include <QPointer>

namespace VelUI {

class LanguageRows;

/// Tells what each field of the form is for: to screen readers beside its name, to others as the tip of
/// its label. Takes that back when it is destroyed.
class FieldDescriptions : public QObject
{
    Q_OBJECT

public:
    FieldDescriptions(EntryFormHost &form, LanguageRows &rows);
    ~FieldDescriptions() override;

private:
    void describe();
    void setDescription(QWidget *widget, const QString &text);
    void setTip(QWidget *widget, const QString &text);

    EntryFormHost &m_form;
    LanguageRows &m_rows;
    QVector<QPointer<QWidget>> m_described;
    QVector<QPointer<QWidget>> m_tipped;
};

} // namespace VelUI
