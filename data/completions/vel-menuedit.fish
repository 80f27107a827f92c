# SPDX-FileCopyrightText: The veluiextra developers
# SPDX-License-Identifier: LGPL-2.1-or-later

complete -c vel-menuedit -f
complete -c vel-menuedit -l dir -xa '(__fish_complete_directories)' -d 'The menu directory'
complete -c vel-menuedit -l desktop -d 'Show the desktop folder'
complete -c vel-menuedit -l toolbar -d 'Show the tool bar'
complete -c vel-menuedit -l read-only -d 'Look only'
complete -c vel-menuedit -l icon-size -x -d 'The edge of the icons in pixels'
complete -c vel-menuedit -l pick -d 'Pick an entry and print it'
complete -c vel-menuedit -l help -d 'Explain the options'
complete -c vel-menuedit -l version -d 'Print the version'
