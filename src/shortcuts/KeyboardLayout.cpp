// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeyboardLayout.h"

#include "KeySymbols.h"

#include <frame/QtMajor.h>

#include <QChar>

#include <memory>

#include <X11/XKBlib.h>
#include <xkbcommon/xkbcommon.h>

namespace {

// Where Qt's keys without a character begin.
constexpr int FirstNamedKey = 0x01000000;

// The character that a symbol stands for; 0 for none, as keys of the keypad have.
uint characterOf(KeySym symbol)
{
    constexpr KeySym FirstFunction = 0xfd00;
    constexpr KeySym LastFunction = 0xffff;
    if (symbol >= FirstFunction && symbol <= LastFunction)
        return 0;
    return xkb_keysym_to_utf32(xkb_keysym_t(symbol));
}

struct MapDeleter
{
    void operator()(XkbDescPtr map) const { XkbFreeKeyboard(map, XkbAllComponentsMask, True); }
};
using Map = std::unique_ptr<XkbDescRec, MapDeleter>;

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
    const std::optional<KeySymbols::Symbol> key = KeySymbols::ofKey(chord);
    const int wanted = key ? key->symbol : 0;
    if (wanted == 0)
        return true;
    return layout.has(true, [wanted](KeySym symbol) { return symbol == KeySym(wanted); });
}

} // namespace

bool KeyboardLayout::produces(int chord)
{
    const int key = chord & ~int(Qt::KeyboardModifierMask);
    Display *const display = QtMajor::x11Display();
    if (!display || key == Qt::Key_unknown)
        return true;
    const Layout layout(display);
    if (!layout.isKnown())
        return true;
    const bool isOnKeypad = chord & int(Qt::KeypadModifier);
    return key < FirstNamedKey && !isOnKeypad ? producesCharacter(layout, uint(key))
                                              : producesNamedKey(layout, chord);
}
