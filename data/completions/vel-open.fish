# SPDX-FileCopyrightText: The veluiextra developers
# SPDX-License-Identifier: LGPL-2.1-or-later

complete -c vel-open -f
complete -c vel-open -l exec -rF -d 'Run this entry or open this file'
complete -c vel-open -l trust -d 'Run it whoever it belongs to'
complete -c vel-open -l help -d 'Explain the options'
complete -c vel-open -l version -d 'Print the version'
