# SPDX-FileCopyrightText: The veluiextra developers
# SPDX-License-Identifier: LGPL-2.1-or-later

complete -c vel-menusync -f -a '(__fish_complete_directories)'
complete -c vel-menusync -l watch -d 'Follow the applications'
complete -c vel-menusync -l help -d 'Explain the options'
complete -c vel-menusync -l version -d 'Print the version'
