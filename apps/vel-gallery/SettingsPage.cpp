// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "GalleryPage.h"

#include <VelSettings.h>

#include <QCheckBox>
#include <QDialogButtonBox>
#include <QFile>
#include <QFontDatabase>
#include <QFormLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QSpinBox>
#include <QVBoxLayout>

namespace {

const QString sectionKey = QStringLiteral("SectionName");
const QString fontKey = QStringLiteral("font");
const QString sizeKey = QStringLiteral("size");
const QString flatKey = QStringLiteral("flat");

// A form over some keys of a file; Apply writes those that were changed, Reset reads them anew.
class SettingsPage : public QWidget
{
    Q_OBJECT

public:
    SettingsPage(const QString &path, QWidget *parent)
        : QWidget(parent)
        , m_path(path)
        , m_settings(path)
    {
        build();
        m_buttons->setEnabled(m_settings.isParsed());
        m_form->setEnabled(m_settings.isParsed());
        load();
    }

    static QString pageTitle() { return tr("Settings file"); }
    static QString pageCategory() { return tr("Settings"); }

private:
    void build()
    {
        m_state = new QLabel(this);
        m_state->setObjectName(QStringLiteral("stateLabel"));
        m_state->setWordWrap(true);
        m_state->setTextFormat(Qt::PlainText);

        m_buttons = new QDialogButtonBox(QDialogButtonBox::Apply | QDialogButtonBox::Reset, this);
        m_buttons->setObjectName(QStringLiteral("buttonBox"));
        connect(m_buttons->button(QDialogButtonBox::Apply), &QPushButton::clicked, this,
                &SettingsPage::apply);
        connect(m_buttons->button(QDialogButtonBox::Reset), &QPushButton::clicked, this,
                &SettingsPage::reset);

        auto *layout = new QVBoxLayout(this);
        layout->addWidget(m_state);
        layout->addWidget(buildForm());
        layout->addWidget(m_buttons);
        layout->addWidget(buildFileView(), 1);
    }

    QWidget *buildForm()
    {
        m_form = new QWidget(this);
        m_section = new QLineEdit(m_form);
        m_section->setObjectName(QStringLiteral("sectionEdit"));
        m_font = new QLineEdit(m_form);
        m_font->setObjectName(QStringLiteral("fontEdit"));
        m_size = new QSpinBox(m_form);
        m_size->setObjectName(QStringLiteral("sizeSpinBox"));
        m_size->setRange(0, 999);
        m_flat = new QCheckBox(tr("F&lat buttons"), m_form);
        m_flat->setObjectName(QStringLiteral("flatCheckBox"));

        auto *form = new QFormLayout(m_form);
        form->setContentsMargins(0, 0, 0, 0);
        form->addRow(tr("S&ection:"), m_section);
        form->addRow(tr("&Font:"), m_font);
        form->addRow(tr("&Size:"), m_size);
        form->addRow(m_flat);
        return m_form;
    }

    QWidget *buildFileView()
    {
        m_file = new QPlainTextEdit(this);
        m_file->setObjectName(QStringLiteral("fileView"));
        m_file->setAccessibleName(tr("Contents of the file on disk"));
        m_file->setReadOnly(true);
        m_file->setTabChangesFocus(true);
        m_file->setFont(QFontDatabase::systemFont(QFontDatabase::FixedFont));
        m_file->setLayoutDirection(Qt::LeftToRight);
        return m_file;
    }

    void load()
    {
        m_section->setText(m_settings.value(sectionKey).toString());
        m_font->setText(m_settings.value(fontKey).toString());
        m_size->setValue(m_settings.value(sizeKey).toInt());
        m_flat->setChecked(m_settings.value(flatKey).toBool());
        showFile();
    }

    void apply()
    {
        // Only what differs: a key that is not in the file is not added unasked.
        setIfChanged(sectionKey, m_settings.value(sectionKey).toString(), m_section->text());
        setIfChanged(fontKey, m_settings.value(fontKey).toString(), m_font->text());
        if (m_settings.value(sizeKey).toInt() != m_size->value())
            m_settings.setValue(sizeKey, m_size->value());
        if (m_settings.value(flatKey).toBool() != m_flat->isChecked())
            m_settings.setValue(flatKey, m_flat->isChecked());
        reset();
    }

    void setIfChanged(const QString &key, const QString &before, const QString &now)
    {
        if (before == now)
            return;
        if (now.isEmpty())
            m_settings.remove(key);
        else
            m_settings.setValue(key, now);
    }

    // Also takes over what other programs wrote.
    void reset()
    {
        m_settings.sync();
        load();
    }

    void showFile()
    {
        if (m_path.isEmpty()) {
            m_state->setText(tr("Name a settings file on the command line to edit it here."));
            return;
        }
        QFile file(m_path);
        if (!m_settings.isParsed() || !file.open(QIODevice::ReadOnly)) {
            m_state->setText(tr("%1 cannot be opened.").arg(m_path));
            return;
        }
        m_state->setText(m_path);
        m_file->setPlainText(QString::fromLocal8Bit(file.readAll()));
    }

    const QString m_path;
    VelSettings m_settings;
    QLabel *m_state = nullptr;
    QWidget *m_form = nullptr;
    QLineEdit *m_section = nullptr;
    QLineEdit *m_font = nullptr;
    QSpinBox *m_size = nullptr;
    QCheckBox *m_flat = nullptr;
    QDialogButtonBox *m_buttons = nullptr;
    QPlainTextEdit *m_file = nullptr;
};

} // namespace

GalleryPage settingsPage()
{
    GalleryPage page;
    page.name = QStringLiteral("settings");
    page.title = SettingsPage::pageTitle();
    page.category = SettingsPage::pageCategory();
    page.snippet = QStringLiteral(R"(VelSettings settings(path);
if (!settings.isParsed())
    return;

section->setText(settings.value("SectionName").toString());
size->setValue(settings.value("size", 10).toInt());
flat->setChecked(settings.value("flat").toBool());

// On "Apply":
settings.setValue("size", size->value());
settings.setValue("flat", flat->isChecked());
settings.sync();)");
    page.create = [](const GalleryContext &context, QWidget *parent) {
        return new SettingsPage(context.settingsFile, parent);
    };
    return page;
}

#include "SettingsPage.moc"
