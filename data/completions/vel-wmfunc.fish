# SPDX-FileCopyrightText: The veluiextra developers
# SPDX-License-Identifier: LGPL-2.1-or-later

complete -c vel-wmfunc -f
complete -c vel-wmfunc -l help -d 'Explain the program'
complete -c vel-wmfunc -l version -d 'Print the version'
