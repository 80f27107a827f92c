// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MimeCacheReader.h"

#include <QtEndian>

namespace {

constexpr quint32 LiteralListPosition = 12;
constexpr quint32 SuffixTreePosition = 16;
constexpr quint32 GlobListPosition = 20;
constexpr quint32 EntrySize = 12;
constexpr int LongestSuffix = 256;

} // namespace

MimeCacheReader::MimeCacheReader(const QByteArray &cache)
    : m_cache(cache)
    , m_nodesLeft(cache.size() / int(EntrySize))
    , m_textLeft(cache.size())
{
}

bool MimeCacheReader::visitPatterns(const Visitor &visit)
{
    if (m_cache.size() < int(GlobListPosition) + 4)
        return false;
    const quint32 version = number(0);
    if (version != 0x10001 && version != 0x10002)
        return false;
    visitList(number(LiteralListPosition), visit);
    visitList(number(GlobListPosition), visit);
    const quint32 tree = number(SuffixTreePosition);
    visitTree(number(tree), number(tree + 4), QString(), visit);
    return m_valid;
}

quint32 MimeCacheReader::number(quint32 offset)
{
    if (m_cache.size() < 4 || offset > quint32(m_cache.size()) - 4) {
        m_valid = false;
        return 0;
    }
    return qFromBigEndian<quint32>(m_cache.constData() + offset);
}

QString MimeCacheReader::text(quint32 offset)
{
    const int end = offset < quint32(m_cache.size()) ? m_cache.indexOf('\0', int(offset)) : -1;
    if (end >= 0)
        m_textLeft -= end - int(offset);
    if (end < 0 || m_textLeft < 0) {
        m_valid = false;
        return QString();
    }
    // The MIME database of Qt takes the bytes for Latin-1 here.
    return QString::fromLatin1(m_cache.constData() + offset, end - int(offset));
}

void MimeCacheReader::visitList(quint32 offset, const Visitor &visit)
{
    const quint32 count = number(offset);
    for (quint32 i = 0; i < count && m_valid; ++i) {
        const quint32 entry = offset + 4 + EntrySize * i;
        const QString pattern = text(number(entry));
        number(entry + 8); // has to be there
        if (m_valid)
            visit(pattern);
    }
}

void MimeCacheReader::visitTree(quint32 count, quint32 offset, const QString &suffix, const Visitor &visit)
{
    for (quint32 i = 0; i < count && m_valid; ++i) {
        const quint32 entry = offset + EntrySize * i;
        const quint32 character = number(entry);
        const quint32 last = number(entry + 8);
        if (--m_nodesLeft < 0 || character > 0xffff || suffix.size() > LongestSuffix) {
            m_valid = false;
        } else if (character == 0) {
            visit(QLatin1Char('*') + suffix);
        } else {
            visitTree(number(entry + 4), last, QChar(ushort(character)) + suffix, visit);
        }
    }
}
