// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "veluiextra_export.h"

#include <QGroupBox>

#include <memory>

class VelRadioGroupBoxPrivate;

/**
 * A group box whose title carries a radio button.
 *
 * It lets a form offer alternative groups of settings: the widgets of a box are enabled only
 * while its title is chosen. All boxes below one parent object, at whatever depth, make up one
 * exclusive group, so that checking one unchecks the others; boxes below another parent do not
 * belong to it. The user cannot uncheck a box, only choose another one. A box that is alone
 * below its parent can never be checked.
 *
 * A new box is unchecked: a form checks the one that applies once all of them exist. So a form
 * that uic compiles can check its last box only; another one is checked after setupUi().
 *
 * \code
 * auto *form = new QWidget;
 * auto *automatic = new VelRadioGroupBox(tr("Automatic"), form);
 * auto *manual = new VelRadioGroupBox(tr("Manual"), form);
 * manual->setChecked(true); // automatic is unchecked, its widgets are disabled
 * \endcode
 *
 * Changes are told by QGroupBox::toggled(); QGroupBox::clicked() is never emitted. Space
 * chooses the box that has the focus. The letter that the title underlines has no shortcut.
 * Screen readers are told of a radio button named by the title.
 *
 * The property "checked" and QGroupBox::setChecked(), which is not virtual, uncheck the others of the
 * group as well.
 *
 * For the GUI thread alone.
 *
 * \image html gallery-radio-group-box.png
 *
 * \since 1.0
 */
class VELUIEXTRA_EXPORT VelRadioGroupBox : public QGroupBox
{
    Q_OBJECT

public:
    /**
     * Makes an unchecked box without a title.
     * @param parent owns the box and gathers its group; null leaves the caller the owner.
     */
    explicit VelRadioGroupBox(QWidget *parent = nullptr);

    /**
     * Makes an unchecked box.
     * @param title the text beside the radio button; a letter after "&" is underlined.
     * @param parent owns the box and gathers its group; null leaves the caller the owner.
     */
    explicit VelRadioGroupBox(const QString &title, QWidget *parent = nullptr);

    ~VelRadioGroupBox() override;

    /**
     * Checks or unchecks the box.
     *
     * Checking it unchecks all other boxes below the same parent first. It does nothing when the
     * box has no parent or is the only one below it. Unchecking leaves the others as they are.
     * @param on whether the box is to be checked.
     */
    void setChecked(bool on);

protected:
    /**
     * Hands \a event to QWidget::event(): the base class never toggles the box by itself.
     * @return whether the event was recognized.
     */
    bool event(QEvent *event) override;

    /// Lowers the radio button when the left button goes down on it or on the title.
    void mousePressEvent(QMouseEvent *event) override;

    /// Chooses the box when the button that was pressed on the title is released there.
    void mouseReleaseEvent(QMouseEvent *event) override;

    /// Raises and lowers the radio button as the held pointer leaves the title and returns.
    void mouseMoveEvent(QMouseEvent *event) override;

    /// Lowers the radio button for Space and Select; all other keys go to QWidget.
    void keyPressEvent(QKeyEvent *event) override;

    /// Chooses the box for Space and Select; all other keys go to QWidget.
    void keyReleaseEvent(QKeyEvent *event) override;

    /// Draws the box with the frame and title of the style and a radio button before the title.
    void paintEvent(QPaintEvent *event) override;

    /**
     * Fills \a option with what the style has to know, the held-down radio button included.
     * @param option the option to fill; the caller's, not null.
     */
#if QT_VERSION_MAJOR >= 6
    void initStyleOption(QStyleOptionGroupBox *option) const override;
#else
    void initStyleOption(QStyleOptionGroupBox *option) const;
#endif

    /**
     * Tells whether \a point lies on the radio button or on the title.
     * @param point a position in pixels, relative to the box.
     */
    bool hitButtonOrLabel(const QPoint &point) const;

private:
    void init();

    const std::unique_ptr<VelRadioGroupBoxPrivate> d;
};
