// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EntryFormHost.h"
#include "PropsTable.h"
#include "TypeChooser.h"

#include <functional>
#include <memory>

class QScrollArea;
class VelDesktopEntryPropsWidget;

namespace VelUI {
class EntryFormAssistance;
class FormLayout;
} // namespace VelUI

/// The parts of the properties form: the type of the entry, and a table of rows below it.
class VelDesktopEntryPropsWidgetPrivate : public VelUI::EntryFormHost
{
    Q_OBJECT

public:
    explicit VelDesktopEntryPropsWidgetPrivate(VelDesktopEntryPropsWidget *form);
    ~VelDesktopEntryPropsWidgetPrivate() override;

    /// The parts of \a form, for the dialog around it.
    static VelDesktopEntryPropsWidgetPrivate &of(VelDesktopEntryPropsWidget &form);

    QWidget *form() const override;
    VelUI::FormLayout *formLayout() const override { return layout; }
    const QVector<VelUI::FormRow> &formRows() const override { return m_rows; }
    VelUIDesktopEntry record() const override { return recordToSave(); }
    VelUIDesktopEntry baseRecord() const override { return recordToChange(); }
    Translations &translations() override { return m_translations; }
    QString filePath() const override { return path; }
    bool isReadOnly() const override { return readOnly; }
    QString type() const override { return typeChooser.type(); }
    bool isTypeDecided() const override { return typeChooser.isDecided(); }
    void showType(const QString &type, bool isDecided) override;
    VelUI::ShowInChoice *showInChoice() const override { return rows.showIn(); }
    void tellEdit() override;
    void quietly(const std::function<void()> &act) override;
    void applyReadOnly() override;

    /// Forgets which types another file had to choose from.
    void allowAllTypes();
    void load(const VelUIDesktopEntry &entry);
    void save(VelUIDesktopEntry *entry) const;
    /// Tells recordChanged(), but not while loading.
    void tellRecordChange();

    VelDesktopEntryPropsWidget *const q;
    QScrollArea *const scrollArea;
    VelUI::FormLayout *const layout;
    VelUI::TypeChooser typeChooser;
    VelUI::PropsTable rows;
    bool readOnly = false;
    QString path; ///< of the file that the entry will be, where the host knows it
    bool isLoading = false;
    bool isRetyping = false; ///< the fields of the old type are being emptied
    bool isCopying = false; ///< what is loaded counts as an edit
    VelUIDesktopEntry loaded{QString()};
    /// Give the entry as it would be saved, and without what the form shows; whoever saves it sets
    /// others.
    std::function<VelUIDesktopEntry()> recordToSave;
    std::function<VelUIDesktopEntry()> recordToChange;
    std::unique_ptr<VelUI::EntryFormAssistance> assistance; ///< null without

Q_SIGNALS:
    /// The user chose the other list of desktop environments.
    void showInSwitched();

private:
    VelUIDesktopEntry loadedAndChanged() const;
    void connectChanges();
    void keepInView(QWidget *focused);

    const QVector<VelUI::FormRow> m_rows;
    Translations m_translations;
};
