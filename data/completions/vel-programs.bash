# SPDX-FileCopyrightText: The veluiextra developers
# SPDX-License-Identifier: LGPL-2.1-or-later

# Completes the command lines of all programs; bash loads it by the name of the one that is typed.

_vel_programs()
{
    local word=${COMP_WORDS[COMP_CWORD]} before=${COMP_WORDS[COMP_CWORD - 1]}
    local program=${1##*/} options= files=-f
    COMPREPLY=()
    case $program in
        vel-entryedit) options='--create --template --read-only --help --version' ;;
        vel-gallery) options='--page --screenshots --help --version' ;;
        vel-menuedit)
            options='--dir --desktop --toolbar --read-only --icon-size --pick --help --version'
            files=
            ;;
        vel-menuprint)
            options='--format --icon-theme --icon-size --run --help --version'
            files=-d
            ;;
        vel-menusync)
            options='--watch --help --version'
            files=-d
            ;;
        vel-open) options='--exec --trust --help --version' ;;
        vel-wmbridge)
            options='--startmenu --toolbar --shortcut --other --for --replace --help --version'
            files=
            ;;
        vel-wmfunc)
            options='--help --version'
            files=
            ;;
    esac
    case $program$before in
        vel-menuprint--format)
            COMPREPLY=($(compgen -W 'dmenu fluxbox icewm json jwm labwc openbox rofi text' -- "$word"))
            return
            ;;
        vel-wmbridge--for)
            COMPREPLY=($(compgen -W 'fluxbox icewm jwm labwc openbox' -- "$word"))
            return
            ;;
        vel-wmbridge--startmenu | vel-wmbridge--toolbar | vel-wmbridge--shortcut | vel-wmbridge--other)
            COMPREPLY=($(compgen -c -- "$word"))
            return
            ;;
        vel-menuedit--dir | vel-gallery--screenshots)
            compopt -o filenames 2>/dev/null
            COMPREPLY=($(compgen -d -- "$word"))
            return
            ;;
        *--icon-size | *--icon-theme | *--page | *--scale) return ;;
    esac
    if [[ $word == -* ]]; then
        COMPREPLY=($(compgen -W "$options" -- "$word"))
    elif [[ -n $files ]]; then
        compopt -o filenames 2>/dev/null
        local IFS=$'\n'
        COMPREPLY=($(compgen $files -- "$word"))
    fi
}

complete -F _vel_programs vel-entryedit vel-gallery vel-menuedit vel-menuprint vel-menusync vel-open \
    vel-wmbridge vel-wmfunc
