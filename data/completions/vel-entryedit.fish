# SPDX-FileCopyrightText: The veluiextra developers
# SPDX-License-Identifier: LGPL-2.1-or-later

complete -c vel-entryedit -l create -d 'Make the entry when there is none'
complete -c vel-entryedit -l template -rF -d 'Begin a new entry like this one'
complete -c vel-entryedit -l read-only -d 'Look only'
complete -c vel-entryedit -l help -d 'Explain the options'
complete -c vel-entryedit -l version -d 'Print the version'
