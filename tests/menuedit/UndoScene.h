// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FaultScene.h"

/// Deletions, edits, moves, replacements, duplicates and new folders that are undone and done again.
class UndoScene : public FaultScene
{
public:
    using FaultScene::FaultScene;

    bool step(int number) override;
    QString fault() const override;

protected:
    void fill() override;
    void nextOperation() override;
    QStringList places() const override;

private:
    bool remove();
    bool edit();
    bool move();
    bool create();
    bool replace();
    bool duplicate();
    QString games() const { return path(QStringLiteral("menu/games")); }

    Tree m_games;
};
