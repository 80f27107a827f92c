// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EarlyChecks.h"

#include <VelRadioGroupBox.h>

#include <QPointer>
#include <QTimer>
#include <QVector>

#include <algorithm>

namespace {

using Boxes = QVector<QPointer<VelRadioGroupBox>>;

Boxes &waiting()
{
    static Boxes boxes;
    return boxes;
}

bool isBelow(const QObject *object, const QObject *above)
{
    for (const QObject *parent = object->parent(); parent; parent = parent->parent()) {
        if (parent == above)
            return true;
    }
    return false;
}

} // namespace

namespace EarlyChecks {

void note(VelRadioGroupBox *box)
{
    forget(*box);
    waiting().append(box);
    QTimer::singleShot(0, box, [box] { forget(*box); });
}

void forget(const VelRadioGroupBox &box)
{
    Boxes &boxes = waiting();
    boxes.erase(std::remove_if(boxes.begin(), boxes.end(),
                               [&box](const auto &other) { return !other || other == &box; }),
                boxes.end());
}

void fulfill(const VelRadioGroupBox &newcomer)
{
    // Whoever is checked forgets itself.
    const Boxes boxes = waiting();
    for (const QPointer<VelRadioGroupBox> &box : boxes) {
        if (box && box != &newcomer && box->parent() && isBelow(&newcomer, box->parent()))
            box->setChecked(true);
    }
}

} // namespace EarlyChecks
