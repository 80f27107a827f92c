# SPDX-FileCopyrightText: The veluiextra developers
# SPDX-License-Identifier: LGPL-2.1-or-later

complete -c vel-gallery -l page -x -d 'Open this page first'
complete -c vel-gallery -l screenshots -xa '(__fish_complete_directories)' -d 'Write screenshots into a folder and exit'
complete -c vel-gallery -l help -d 'Explain the options'
complete -c vel-gallery -l version -d 'Print the version'
