# SPDX-FileCopyrightText: The veluiextra developers
# SPDX-License-Identifier: LGPL-2.1-or-later

complete -c vel-menuprint -f -a '(__fish_complete_directories)'
complete -c vel-menuprint -l format -xa 'dmenu fluxbox icewm json jwm labwc openbox rofi text' -d 'What to print'
complete -c vel-menuprint -l icon-theme -x -d 'The icon theme'
complete -c vel-menuprint -l icon-size -x -d 'The edge of the icons in pixels'
complete -c vel-menuprint -l run -d 'Start the entry of the line on standard input'
complete -c vel-menuprint -l help -d 'Explain the options'
complete -c vel-menuprint -l version -d 'Print the version'
