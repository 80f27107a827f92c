// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

namespace VelUI {

class ChoiceModel;

/// Where choices come from that take a while to be read.
class ChoiceSource
{
public:
    virtual ~ChoiceSource() = default;

    /// Reads some more into \a model, for a moment that nobody notices; false when that was all.
    virtual bool read(ChoiceModel *model) = 0;
};

} // namespace VelUI
