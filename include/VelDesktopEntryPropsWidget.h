// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "veluiextra_export.h"

#include <QString>
#include <QStringList>
#include <QWidget>

#include <memory>

class VelDesktopEntryPropsWidgetPrivate;
class VelUIDesktopEntry;

/**
 * A form that shows and edits every key of one desktop entry.
 *
 * It has a row for each key, with a second row for the user's own language where the key has
 * one; rows that do not belong to the type of the entry (Application, Link or Directory) are
 * hidden and emptied, and come back with their values when the user takes the type back. Values go into the
 * entry exactly as they were typed.
 *
 * With setAssistance() the form also helps its user beyond that.
 *
 * The form keeps no record: values come in with loadFrom() and go out with saveTo(), which
 * may be given another record. It neither checks the values nor touches a file;
 * VelDesktopEntryEditDialog does.
 *
 * For the GUI thread alone.
 *
 * \image html gallery-desktop-entry-form.png
 *
 * \since 1.0
 */
class VELUIEXTRA_EXPORT VelDesktopEntryPropsWidget : public QWidget
{
    Q_OBJECT
    /// See setAssistance().
    Q_PROPERTY(bool assistance READ assistance WRITE setAssistance)
    /// Whether the user can look at the values only. See setReadOnly().
    Q_PROPERTY(bool readOnly READ isReadOnly WRITE setReadOnly)
    /// "Application", "Link" or "Directory". See setType().
    Q_PROPERTY(QString type READ type WRITE setType)
    /// Whether there is a button beside the field of a Link's address. See setShowURLInfoButton().
    Q_PROPERTY(bool showURLInfoButton READ showURLInfoButton WRITE setShowURLInfoButton)

public:
    /**
     * Makes an empty form of the type Application in which every type may be chosen.
     *
     * @param parent the widget that shows and owns the form
     */
    explicit VelDesktopEntryPropsWidget(QWidget *parent = nullptr);
    ~VelDesktopEntryPropsWidget() override;

    /**
     * Sets the type of the entry and the types among which the user may choose.
     *
     * @param type "Application", "Link" or "Directory"; nothing changes when it is empty or
     *             not among the allowed types
     * @param allowedTypes the types to choose from; all three when empty
     */
    void setType(const QString &type, const QStringList &allowedTypes);

    /**
     * Sets the type of the entry among the types that are allowed already.
     *
     * @param type "Application", "Link" or "Directory"; nothing changes when it is empty or not allowed
     */
    void setType(const QString &type);

    /// The type that the form shows: "Application", "Link" or "Directory".
    QString type() const;

    /**
     * Shows the values of an entry, with its type where that is allowed.
     *
     * @param entry the entry; of one that is not valid only the type is taken, and the other
     *              fields keep what they show
     */
    void loadFrom(const VelUIDesktopEntry &entry);

    /**
     * Writes the values of the form into an entry, which is not saved by that.
     *
     * Of the two lists of desktop environments the chosen one is written, and the other one is left
     * alone. The type is written unless the entry that was loaded has one that the form does not
     * know and the user chose no other.
     *
     * @param entry the entry to write to; nothing happens when it is null
     */
    void saveTo(VelUIDesktopEntry *entry);

    /**
     * Switches between showing and editing.
     *
     * @param readOnly whether the user can look at the values only; false at the start
     */
    void setReadOnly(bool readOnly);

    /// Whether the user can look at the values only.
    bool isReadOnly() const;

    /// Whether the form helps its users beyond the plain one; see setAssistance().
    bool assistance() const;
    /**
     * Switches on what goes beyond the plain form: what is wrong with the entry is said under its
     * rows, values are chosen from lists, every language of the entry is shown, everything is taken
     * back and done again, and the entry is tried and its file looked at before it is saved. Off, as
     * it is at first, the form has nothing of that.
     *
     * @param assistance whether the form is to help
     */
    void setAssistance(bool assistance);

    /**
     * Sets the frame around the form.
     *
     * @param style a shape and a shadow, as QFrame::setFrameStyle() takes them
     */
    void setFrameStyle(int style);

    /**
     * Shows or hides the button beside the field of a Link's address.
     *
     * @param show whether to show it; false at the start
     */
    void setShowURLInfoButton(bool show);

    /// Whether there is a button beside the field of a Link's address.
    bool showURLInfoButton() const;

Q_SIGNALS:
    /// Emitted when the user changed a value; loading an entry emits it once for each path or command
    /// that it changes.
    void changed();

    /**
     * Emitted when the button beside the field of a Link's address was pressed.
     *
     * @param url the text of that field
     */
    void requestedURLInfo(const QString &url);

private:
    friend class VelDesktopEntryPropsWidgetPrivate;
    Q_DISABLE_COPY(VelDesktopEntryPropsWidget)
    const std::unique_ptr<VelDesktopEntryPropsWidgetPrivate> d;
};
