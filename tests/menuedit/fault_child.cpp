// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// fault_child SCENE FOLDER OTHER_FOLDER [COUNT | next]
//
// Does the operation of a scene so many times, or without a count again and again until it is ended
// from outside; then none may fail. Prints "ready", then "done" for each operation that succeeded. With
// "next", does what comes next where operations were killed.

#include "FaultScene.h"

#include <QCoreApplication>

#include <cstdio>

int main(int argc, char **argv)
{
    const QCoreApplication application(argc, argv);
    const QStringList arguments = application.arguments();
    if (arguments.size() < 4)
        return 2;
    const std::unique_ptr<FaultScene> scene =
        FaultScene::make(arguments.at(1), arguments.at(2), arguments.at(3));
    if (!scene)
        return 2;
    if (arguments.value(4) == QLatin1String("next")) {
        scene->goOn();
        return 0;
    }
    std::setvbuf(stdout, nullptr, _IOLBF, BUFSIZ);
    std::puts("ready");
    const bool isEndless = arguments.size() == 4;
    const int count = arguments.value(4).toInt();
    for (int i = 0; isEndless || i < count; ++i) {
        if (scene->step(i))
            std::puts("done");
        else if (isEndless)
            return 1;
    }
    return 0;
}
