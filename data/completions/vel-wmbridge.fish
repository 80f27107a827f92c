# SPDX-FileCopyrightText: The veluiextra developers
# SPDX-License-Identifier: LGPL-2.1-or-later

complete -c vel-wmbridge -f
complete -c vel-wmbridge -l startmenu -xa '(__fish_complete_command)' -d 'Run when the start menu has changed'
complete -c vel-wmbridge -l toolbar -xa '(__fish_complete_command)' -d 'Run when the tool bar has changed'
complete -c vel-wmbridge -l shortcut -xa '(__fish_complete_command)' -d 'Run when the entries of the desktop have changed'
complete -c vel-wmbridge -l other -xa '(__fish_complete_command)' -d 'Run for every other line'
complete -c vel-wmbridge -l for -xa 'fluxbox icewm jwm labwc openbox' -d 'Do what this window manager needs'
complete -c vel-wmbridge -l replace -d 'Take the channel from another program'
complete -c vel-wmbridge -l help -d 'Explain the options'
complete -c vel-wmbridge -l version -d 'Print the version'
