// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryText.h"

#include <algorithm>

namespace {

bool isBlank(char c)
{
    return c == ' ' || (c >= '\t' && c <= '\r');
}

QByteArray withoutLeadingBlanks(const QByteArray &line)
{
    int begin = 0;
    while (begin < line.size() && isBlank(line.at(begin)))
        ++begin;
    return line.mid(begin);
}

QByteArray withoutTrailingBlanks(const QByteArray &line)
{
    int end = line.size();
    while (end > 0 && isBlank(line.at(end - 1)))
        --end;
    return line.left(end);
}

bool isLetterOrDigit(char c)
{
    return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9');
}

bool isOfName(char c)
{
    return isLetterOrDigit(c) || c == '-';
}

bool isOfLocale(char c)
{
    return isOfName(c) || c == '_' || c == '@' || c == '.';
}

EntryText::Key keyOf(const QByteArray &written, const QByteArray &value)
{
    EntryText::Key key{written, written, {}, value, true, true, false};
    const int bracket = written.indexOf('[');
    if (bracket >= 0) {
        key.name = written.left(bracket);
        key.locale = written.mid(bracket + 1, written.size() - bracket - 2);
        // Behind another bracket there is no language for them.
        key.isReadable = written.endsWith(']') && !key.locale.isEmpty() && key.locale.back() != '['
            && std::all_of(key.locale.cbegin(), key.locale.cend() - 1, isOfLocale);
        key.isWellFormed = key.isReadable && isOfLocale(key.locale.back());
    }
    if (key.name.isEmpty() || !std::all_of(key.name.cbegin(), key.name.cend(), isOfName))
        key.isReadable = key.isWellFormed = false;
    return key;
}

char unescaped(char code)
{
    switch (code) {
    case 's':
        return ' ';
    case 'n':
        return '\n';
    case 't':
        return '\t';
    case 'r':
        return '\r';
    case '\\':
        return '\\';
    default:
        return '\0';
    }
}

} // namespace

EntryText::EntryText(const QByteArray &bytes)
    : m_isEmpty(bytes.isEmpty())
{
    int begin = 0;
    while (begin < bytes.size()) {
        int end = begin;
        while (end < bytes.size() && bytes.at(end) != '\n' && bytes.at(end) != '\r')
            ++end;
        const QByteArray line = bytes.mid(begin, end - begin);
        if (end < bytes.size() && bytes.at(end) == '\r') {
            m_faults.append({Fault::CarriageReturn, line});
            end += end + 1 < bytes.size() && bytes.at(end + 1) == '\n' ? 1 : 0;
        }
        read(line);
        begin = end + 1;
    }
}

void EntryText::read(QByteArray line)
{
    if (line.isEmpty())
        return;
    if (isBlank(line.front())) {
        m_faults.append({Fault::LeadingBlank, line});
        line = withoutLeadingBlanks(line);
    }
    if (!line.isEmpty() && line.front() != '#' && !readGroup(line) && !readKey(line))
        m_faults.append({Fault::Stray, line});
}

bool EntryText::readGroup(const QByteArray &line)
{
    const QByteArray header = withoutTrailingBlanks(line);
    if (header.front() != '[' || header.back() != ']' || header.size() < 2)
        return false;
    if (header != line)
        m_faults.append({Fault::TrailingBlank, line});
    const QByteArray name = header.mid(1, header.size() - 2);
    m_current = m_places.value(name, m_groups.size());
    if (m_current == m_groups.size()) {
        m_places.insert(name, m_current);
        m_groups.append({name, 0, {}, {}});
    }
    ++m_groups[m_current].count;
    return true;
}

bool EntryText::readKey(const QByteArray &line)
{
    const int equals = line.indexOf('=');
    if (equals <= 0)
        return false;
    if (m_current < 0)
        m_faults.append({Fault::KeyBeforeGroup, line});
    else
        add(keyOf(withoutTrailingBlanks(line.left(equals)), withoutLeadingBlanks(line.mid(equals + 1))));
    return true;
}

void EntryText::add(Key key)
{
    Group &group = m_groups[m_current];
    QVector<int> &lines = group.lines[key.written];
    key.isRepetition = !lines.isEmpty();
    lines.append(group.keys.size());
    group.keys.append(key);
}

const EntryText::Group *EntryText::group(const QByteArray &name) const
{
    const auto found = m_places.constFind(name);
    return found == m_places.constEnd() ? nullptr : &m_groups.at(*found);
}

const EntryText::Group *EntryText::mainGroup() const
{
    return group(QByteArrayLiteral("Desktop Entry"));
}

const EntryText::Key *EntryText::key(const Group &group, const QByteArray &name)
{
    const auto found = group.lines.constFind(name);
    return found == group.lines.constEnd() ? nullptr : &group.keys.at(found->constLast());
}

int EntryText::count(const Group &group, const Key &key)
{
    return group.lines.value(key.written).size();
}

QString EntryText::text(const QByteArray &value)
{
    QByteArray text;
    for (int i = 0; i < value.size(); ++i) {
        const char meant = value.at(i) == '\\' && i + 1 < value.size() ? unescaped(value.at(i + 1)) : '\0';
        text += meant ? meant : value.at(i);
        i += meant ? 1 : 0;
    }
    return QString::fromUtf8(text);
}

QByteArrayList EntryText::items(const QByteArray &value)
{
    QByteArrayList items = value.split(';');
    if (items.constLast().isEmpty())
        items.removeLast();
    return items;
}
