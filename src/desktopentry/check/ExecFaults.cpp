// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ExecFaults.h"

#include <cstring>

namespace {

// Quoting and the escapes of the file lie over each other: in quotes two backslashes protect what
// follows, one and its letter stand for something plain.
class Reader
{
public:
    explicit Reader(const QByteArray &value)
        : m_value(value)
    {
    }

    QVector<ExecFaults::Fault> faults()
    {
        for (m_at = 0; m_at < m_value.size(); ++m_at)
            read(m_value.at(m_at));
        if (m_isQuoted)
            add(EntryProblem::OpenQuote, '"');
        return m_faults;
    }

private:
    void read(char c)
    {
        if (c == '"')
            readQuote();
        else if (c == '\\')
            readBackslash();
        else if (c == '%')
            readCode();
        else if (m_isQuoted && (c == '`' || c == '$'))
            readProtected(c);
        else if (!m_isQuoted && std::strchr("'`$<>~|&;*?#()", c))
            add(EntryProblem::ReservedCharacter, c);
    }

    void readQuote()
    {
        m_isQuoted = !m_isQuoted || m_isProtected;
        m_isProtected = false;
    }

    void readBackslash()
    {
        if (++m_at == m_value.size())
            add(EntryProblem::OpenEscape, '\\');
        else if (m_value.at(m_at) == '\\' && m_isQuoted)
            m_isProtected = !m_isProtected;
        else if (m_value.at(m_at) == '\\')
            add(EntryProblem::ReservedCharacter, '\\');
    }

    void readProtected(char c)
    {
        if (!m_isProtected)
            add(EntryProblem::UnescapedCharacter, c);
        m_isProtected = false;
    }

    void readCode()
    {
        if (++m_at == m_value.size())
            return add(EntryProblem::IncompleteFieldCode, '%');
        const char code = m_value.at(m_at);
        if (code == '%')
            return;
        if (std::strchr("fFuU", code))
            readFileCode(code);
        else if (std::strchr("ick", code))
            readOwnCode(code);
        else
            add(std::strchr("dDnNvm", code) ? EntryProblem::DeprecatedFieldCode
                                            : EntryProblem::UnknownFieldCode,
                code);
    }

    void readFileCode(char code)
    {
        if (m_hasFileCode)
            add(EntryProblem::SeveralFileCodes, code);
        m_hasFileCode = true;
        const bool isList = code == 'F' || code == 'U';
        if (m_isQuoted || (isList && !standsAlone()))
            add(EntryProblem::MisplacedFieldCode, code);
    }

    void readOwnCode(char code)
    {
        if (m_ownCodes.contains(code))
            add(EntryProblem::DoubledFieldCode, code);
        m_ownCodes += code;
        if (m_isQuoted)
            add(EntryProblem::MisplacedFieldCode, code);
    }

    bool standsAlone() const
    {
        const bool begins = m_at < 2 || m_value.at(m_at - 2) == ' ';
        return begins && (m_at + 1 == m_value.size() || m_value.at(m_at + 1) == ' ');
    }

    void add(EntryProblem problem, char c)
    {
        const ExecFaults::Fault fault{problem, QLatin1Char(c)};
        if (!m_faults.contains(fault))
            m_faults.append(fault);
    }

    const QByteArray m_value;
    int m_at = 0;
    bool m_isQuoted = false;
    bool m_isProtected = false;
    bool m_hasFileCode = false;
    QByteArray m_ownCodes;
    QVector<ExecFaults::Fault> m_faults;
};

} // namespace

QVector<ExecFaults::Fault> ExecFaults::find(const QByteArray &value)
{
    return Reader(value).faults();
}
