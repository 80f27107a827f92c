// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QMetaMethod>
#include <QStringList>

/// The signals and slots that a class itself declares, in their order, as in
/// "signal changed()" and "public slot clear()".
inline QStringList metaMethodsOf(const QMetaObject &meta)
{
    QStringList methods;
    for (int i = meta.methodOffset(); i < meta.methodCount(); ++i) {
        const QMetaMethod method = meta.method(i);
        const char *kind = method.methodType() == QMetaMethod::Signal ? "signal "
            : method.access() == QMetaMethod::Public                  ? "public slot "
                                                                      : "private slot ";
        methods.append(QLatin1String(kind) + QString::fromLatin1(method.methodSignature()));
    }
    return methods;
}
