# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT

# Completion of the olvane command for fish.

complete -c olvane -n __fish_use_subcommand -f -a people -d 'List persons'
complete -c olvane -n __fish_use_subcommand -f -a layout -d 'Print where everybody stands'
complete -c olvane -n __fish_use_subcommand -f -a draw -d 'Draw a family or pedigree'
complete -c olvane -n __fish_use_subcommand -f -a batch -d 'Print many layouts'
complete -c olvane -n __fish_use_subcommand -f -a check -d 'Tell what is wrong or odd'
complete -c olvane -n __fish_use_subcommand -f -a judge -d 'Count what is hard to read in pictures'
complete -c olvane -n __fish_use_subcommand -f -a page -d 'Write a page for any browser'
complete -c olvane -n __fish_use_subcommand -l version -d 'Show the version'
complete -c olvane -l help -d 'Show help'
complete -c olvane -n 'not __fish_use_subcommand' -l encoding -x -a 'UTF-8 UTF-16LE UTF-16BE ANSEL windows-1250 windows-1251 windows-1252 windows-1253 ISO-8859-2 ISO-8859-15 KOI8-R GB18030 Big5 Shift_JIS EUC-JP EUC-KR IBM437 IBM850' -d 'Encoding of the file'

set -l layouts layout draw batch check
complete -c olvane -n "__fish_seen_subcommand_from $layouts" -l view -x -a 'family pedigree' -d 'Which relatives'
complete -c olvane -n "__fish_seen_subcommand_from $layouts" -l generations -x -a '(seq 12)' -d 'Generations of a pedigree'
complete -c olvane -n "__fish_seen_subcommand_from $layouts" -l boxes -x -a 'tall wide' -d 'Form of the boxes'
complete -c olvane -n "__fish_seen_subcommand_from $layouts" -l no-aunts-uncles -d 'Leave out siblings of the parents'
complete -c olvane -n "__fish_seen_subcommand_from $layouts" -l no-cousins -d 'Leave out cousins'
complete -c olvane -n "__fish_seen_subcommand_from $layouts" -l no-siblings -d 'Leave out siblings'
complete -c olvane -n "__fish_seen_subcommand_from $layouts" -l no-sibling-spouses -d 'Leave out spouses of the siblings'
complete -c olvane -n "__fish_seen_subcommand_from $layouts" -l no-nieces-nephews -d 'Leave out children of the siblings'
complete -c olvane -n "__fish_seen_subcommand_from $layouts" -l no-grandchildren -d 'Leave out grandchildren'
complete -c olvane -n "__fish_seen_subcommand_from $layouts" -l no-great-grandparents -d 'Leave out great-grandparents'
complete -c olvane -n "__fish_seen_subcommand_from $layouts" -l no-spouses-of-children -d 'Leave out spouses of the children'

complete -c olvane -n '__fish_seen_subcommand_from layout draw check page' -l focus -x -d 'The person in the middle'
complete -c olvane -n '__fish_seen_subcommand_from layout draw page' -l hide-living -d 'Tell nothing of the living'
complete -c olvane -n '__fish_seen_subcommand_from layout draw page' -l year -x -d 'The year to count from'
complete -c olvane -n '__fish_seen_subcommand_from layout' -l format -x -a 'text json' -d 'Form of the output'
complete -c olvane -n '__fish_seen_subcommand_from draw page' -s o -l output -r -d 'Picture or page to write'
complete -c olvane -n '__fish_seen_subcommand_from draw' -l theme -x -a 'light dark print' -d 'Colours'
complete -c olvane -n '__fish_seen_subcommand_from draw page' -l title -x -d 'Title'
complete -c olvane -n '__fish_seen_subcommand_from draw' -l page -x -a 'A4 A3 letter' -d 'Paper to lay the picture out on'
complete -c olvane -n '__fish_seen_subcommand_from batch' -l focus-from -r -d 'File with the focuses'
complete -c olvane -n '__fish_seen_subcommand_from judge' -l family -r -d 'GEDCOM file of the family'
complete -c olvane -n '__fish_seen_subcommand_from batch' -l unbuffered -d 'Answer each line at once'
complete -c olvane -n '__fish_seen_subcommand_from people judge' -l format -x -a 'text tsv json' -d 'Form of the output'
complete -c olvane -n '__fish_seen_subcommand_from page' -l view -x -a 'family pedigree' -d 'Which relatives'
complete -c olvane -n '__fish_seen_subcommand_from check' -l all -d 'Look at every layout'
