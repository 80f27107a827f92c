// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ShowInChoice.h"

#include "FormLayout.h"
#include "NamedField.h"
#include "StringListEdit.h"

#include <QButtonGroup>
#include <QRadioButton>

namespace VelUI {

namespace {

// A button that heads a row: Tab reaches it whether or not it is the checked one.
class RowRadioButton : public QRadioButton
{
public:
    explicit RowRadioButton(QWidget *parent)
        : QRadioButton(parent)
    {
    }

protected:
    void focusInEvent(QFocusEvent *event) override
    {
        // Takes Tab away from the others of the group.
        QRadioButton::focusInEvent(event);
        const QList<QAbstractButton *> buttons = group() ? group()->buttons() : QList<QAbstractButton *>();
        for (QAbstractButton *button : buttons)
            button->setFocusPolicy(Qt::StrongFocus);
    }
};

QRadioButton *makeButton(const char *objectName, const QString &text, QWidget *parent)
{
    auto *button = makeField<RowRadioButton>(objectName, parent);
    button->setText(text);
    return button;
}

} // namespace

ShowInChoice::ShowInChoice(const Texts &texts, FormLayout *layout)
    : QObject(layout->parentWidget())
    , m_onlyButton(makeButton("onlyShowInButton", texts.only, layout->parentWidget()))
    , m_only(makeField<StringListEdit>("onlyShowInEdit", layout->parentWidget()))
    , m_noButton(makeButton("notShowInButton", texts.no, layout->parentWidget()))
    , m_no(makeField<StringListEdit>("notShowInEdit", layout->parentWidget()))
{
    m_only->setTexts(texts.only, texts.only, texts.addLabel, texts.only, texts.editLabel);
    m_no->setTexts(texts.no, texts.no, texts.addLabel, texts.no, texts.editLabel);
    layout->addRow(m_onlyButton, m_only);
    layout->addRow(m_noButton, m_no);

    auto *group = new QButtonGroup(this);
    group->setExclusive(true);
    group->addButton(m_onlyButton);
    group->addButton(m_noButton);
    m_onlyButton->setChecked(true);
    m_no->setEnabled(false);
    connect(m_onlyButton, &QRadioButton::toggled, m_only, &QWidget::setEnabled);
    connect(m_onlyButton, &QRadioButton::toggled, m_no, &QWidget::setDisabled);
    connect(m_onlyButton, &QRadioButton::toggled, this, [this] {
        if (!m_isLoading)
            Q_EMIT switched();
    });
}

void ShowInChoice::load(const QStringList &only, const QStringList &no)
{
    m_isLoading = true;
    m_only->setStrings(only);
    m_no->setStrings(no);
    (no.isEmpty() ? m_onlyButton : m_noButton)->setChecked(true);
    m_isLoading = false;
}

void ShowInChoice::choose(bool only)
{
    m_isLoading = true;
    (only ? m_onlyButton : m_noButton)->setChecked(true);
    m_isLoading = false;
}

bool ShowInChoice::isOnlyChosen() const
{
    return m_onlyButton->isChecked();
}

QStringList ShowInChoice::only() const
{
    return m_only->strings();
}

QStringList ShowInChoice::no() const
{
    return m_no->strings();
}

} // namespace VelUI
