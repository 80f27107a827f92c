// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeyboardLayout.h"

#include <KKeyServer>

#include <QChar>
#include <QTextCodec>
#include <QX11Info>

#include <array>
#include <memory>

#include <X11/XKBlib.h>

namespace {

// Where Qt's keys without a character begin.
constexpr int FirstNamedKey = 0x01000000;
// Key symbols of any character of Unicode.
constexpr KeySym FirstUnicodeSymbol = 0x01000100;
constexpr KeySym LastUnicodeSymbol = 0x0110ffff;

struct MapDeleter
{
    void operator()(XkbDescPtr map) const { XkbFreeKeyboard(map, XkbAllComponentsMask, True); }
};
using Map = std::unique_ptr<XkbDescRec, MapDeleter>;

// The older symbols of a script have a block each, and below it the byte of an older encoding.
const char *encodingOf(unsigned int block)
{
    static constexpr std::array<const char *, 14> encodings = {
        nullptr,      "ISO-8859-2", "ISO-8859-3", "ISO-8859-4", nullptr, "ISO-8859-6", "KOI8-U",
        "ISO-8859-7", nullptr,      nullptr,      nullptr,      nullptr, "ISO-8859-8", "TIS-620"};
    constexpr unsigned int Latin9 = 0x13;
    if (block == Latin9)
        return "ISO-8859-15";
    return block < encodings.size() ? encodings.at(block) : nullptr;
}

// The character that a key symbol stands for; 0 for none.
uint characterOf(KeySym symbol)
{
    constexpr unsigned int Kana = 4;
    constexpr unsigned int Currency = 0x20;
    constexpr uint KanaOffset = 0xff61 - 0xa1;
    if (symbol >= FirstUnicodeSymbol && symbol <= LastUnicodeSymbol)
        return uint(symbol - 0x01000000);
    if (symbol > 0xffff)
        return 0;
    const auto byte = char(symbol & 0xff);
    const auto block = unsigned(symbol >> 8);
    if (block == 0 || block == Currency)
        return uint(symbol);
    if (block == Kana)
        return uint(symbol & 0xff) + KanaOffset;
    const char *encoding = encodingOf(block);
    const QTextCodec *codec = encoding ? QTextCodec::codecForName(encoding) : nullptr;
    return codec ? codec->toUnicode(&byte, 1).at(0).unicode() : 0;
}

// A key of the X server has a few groups, which users know as layouts.
class Layout
{
public:
    explicit Layout(Display *display)
        : m_map(XkbGetMap(display, XkbKeySymsMask | XkbKeyTypesMask, XkbUseCoreKbd))
    {
        XkbStateRec state = {};
        if (XkbGetState(display, XkbUseCoreKbd, &state) == Success)
            m_group = state.group;
    }

    bool isKnown() const { return m_map != nullptr; }

    // Whether some key gives a symbol that is wanted, in any group or in the one in use.
    template <typename IsWanted>
    bool has(bool anyGroup, const IsWanted &isWanted) const
    {
        for (int code = m_map->min_key_code; code <= m_map->max_key_code; ++code) {
            const int groups = XkbKeyNumGroups(m_map.get(), code);
            for (int group = 0; group < groups; ++group) {
                if ((anyGroup || group == m_group % groups) && hasInGroup(code, group, isWanted))
                    return true;
            }
        }
        return false;
    }

private:
    template <typename IsWanted>
    bool hasInGroup(int code, int group, const IsWanted &isWanted) const
    {
        const int levels = XkbKeyGroupWidth(m_map.get(), code, group);
        for (int level = 0; level < levels; ++level) {
            if (isWanted(XkbKeySymEntry(m_map.get(), code, level, group)))
                return true;
        }
        return false;
    }

    const Map m_map;
    int m_group = 0;
};

bool producesCharacter(const Layout &layout, uint character)
{
    const uint wanted = QChar::toUpper(character);
    const bool isLatin = character < 0x80;
    return layout.has(isLatin, [wanted](KeySym symbol) {
        const uint found = characterOf(symbol);
        return found != 0 && QChar::toUpper(found) == wanted;
    });
}

bool producesNamedKey(const Layout &layout, int chord)
{
    int wanted = 0;
    if (!KKeyServer::keyQtToSymX(chord, &wanted) || wanted == 0)
        return true;
    return layout.has(true, [wanted](KeySym symbol) { return symbol == KeySym(wanted); });
}

} // namespace

bool KeyboardLayout::produces(int chord)
{
    const int key = chord & ~int(Qt::KeyboardModifierMask);
    if (!QX11Info::isPlatformX11() || key == Qt::Key_unknown)
        return true;
    const Layout layout(QX11Info::display());
    if (!layout.isKnown())
        return true;
    const bool isOnKeypad = chord & int(Qt::KeypadModifier);
    return key < FirstNamedKey && !isOnKeypad ? producesCharacter(layout, uint(key))
                                              : producesNamedKey(layout, chord);
}
