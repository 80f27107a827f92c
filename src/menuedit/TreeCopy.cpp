// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TreeCopy.h"

#include "FileProgress.h"
#include "OneStep.h"
#include "StagedCopies.h"

namespace TreeCopy {

namespace {

std::error_code byCopying(const Path &source, const Path &target, FileCopy::Kind kind, FileProgress &progress)
{
    StagedCopies copies(kind, progress);
    const std::error_code error = copies.add(source, target);
    return error ? error : copies.reveal();
}

} // namespace

std::error_code copy(const Path &source, const Path &target, FileProgress &progress)
{
    return byCopying(source, target, FileCopy::Kind::Copy, progress);
}

std::error_code moveAtOnce(const Path &source, const Path &target, FileProgress &progress)
{
    const std::error_code error =
        OneStep::isRelativeLink(source) ? OneStep::moveLink(source, target) : OneStep::rename(source, target);
    if (!error)
        progress.advance();
    return error;
}

std::error_code move(const Path &source, const Path &target, FileProgress &progress)
{
    const std::error_code error = moveAtOnce(source, target, progress);
    return error == std::errc::cross_device_link ? byCopying(source, target, FileCopy::Kind::Move, progress)
                                                 : error;
}

} // namespace TreeCopy
