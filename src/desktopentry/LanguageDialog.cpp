// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "LanguageDialog.h"

#include "LanguageCode.h"

#include <QComboBox>
#include <QCompleter>
#include <QDialogButtonBox>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QVBoxLayout>

namespace VelUI {

LanguageDialog::LanguageDialog(QWidget *parent)
    : QDialog(parent)
    , m_box(new QComboBox(this))
    , m_verdict(new QLabel(this))
    , m_buttons(new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel, this))
{
    setWindowTitle(tr("Another language"));
    auto *label = new QLabel(tr("&Language or its code, such as pt_BR:"), this);
    label->setBuddy(m_box);
    m_box->setObjectName(QStringLiteral("newLanguageBox"));
    m_box->setAccessibleName(tr("Language or its code"));
    m_verdict->setObjectName(QStringLiteral("verdictLabel"));
    m_verdict->setTextFormat(Qt::PlainText);
    m_verdict->setWordWrap(true);
    // The dialog must not grow while one types.
    m_verdict->setMinimumSize(fontMetrics().averageCharWidth() * 50, fontMetrics().lineSpacing() * 2);
    m_verdict->setAlignment(Qt::AlignLeading | Qt::AlignTop);
    fill();

    auto *layout = new QVBoxLayout(this);
    for (QWidget *widget : {static_cast<QWidget *>(label), static_cast<QWidget *>(m_box),
                            static_cast<QWidget *>(m_verdict), static_cast<QWidget *>(m_buttons)})
        layout->addWidget(widget);
    connect(m_box, &QComboBox::editTextChanged, this, &LanguageDialog::judge);
    connect(m_buttons, &QDialogButtonBox::accepted, this, &QDialog::accept);
    connect(m_buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);
    judge();
}

void LanguageDialog::fill()
{
    m_box->setEditable(true);
    m_box->setInsertPolicy(QComboBox::NoInsert);
    const QStringList codes = LanguageCode::known();
    for (const QString &code : codes)
        m_box->addItem(tr("%1 (%2)", "a language and its code").arg(LanguageCode::nativeName(code), code),
                       code);
    m_box->completer()->setFilterMode(Qt::MatchContains);
    m_box->completer()->setCompletionMode(QCompleter::PopupCompletion);
    m_box->clearEditText();
}

QString LanguageDialog::language() const
{
    const int item = m_box->findText(m_box->currentText());
    return item < 0 ? m_box->currentText().trimmed() : m_box->itemData(item).toString();
}

void LanguageDialog::judge()
{
    const QString code = language();
    const bool isValid = LanguageCode::isValid(code);
    const QString name = isValid ? LanguageCode::nativeName(code) : QString();
    if (code.isEmpty())
        m_verdict->setText(QString());
    else if (!isValid)
        m_verdict->setText(tr("No language has such a code: it is like de, pt_BR or sr@latin."));
    else if (name.isEmpty())
        m_verdict->setText(
            tr("The code %1 is well-formed, but no language of this name is known.").arg(code));
    else
        m_verdict->setText(tr("%1 (%2)", "a language and its code").arg(name, code));
    m_box->lineEdit()->setAccessibleDescription(m_verdict->text());
    m_buttons->button(QDialogButtonBox::Ok)->setEnabled(isValid);
}

} // namespace VelUI
