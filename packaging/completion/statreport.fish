# SPDX-License-Identifier: MIT
set -l commands render stats check blocks
complete -c statreport -f
complete -c statreport -n "not __fish_seen_subcommand_from $commands" -a render -d "Print a report"
complete -c statreport -n "not __fish_seen_subcommand_from $commands" -a stats -d "Print statistics"
complete -c statreport -n "not __fish_seen_subcommand_from $commands" -a check -d "Say what a template holds"
complete -c statreport -n "not __fish_seen_subcommand_from $commands" -a blocks -d "List the block types"
complete -c statreport -s h -l help -d "Show a help text"
complete -c statreport -s v -l version -d "Show the version"
complete -c statreport -l json-errors -d "Write errors as one line of JSON each"
complete -c statreport -l language -x -a "English German French Spanish Italian Russian Japanese Korean Arabic ChineseSimple ChineseTraditional Slovakian" -d "Language of texts and reports"
complete -c statreport -s q -l quiet -d "Write no notes and no progress"
for command in render stats
    complete -c statreport -n "__fish_seen_subcommand_from $command" -l session -r -F -d "A session of the Measuring Desk"
    complete -c statreport -n "__fish_seen_subcommand_from $command" -l table -r -F -d "A table"
    complete -c statreport -n "__fish_seen_subcommand_from $command" -l unit -x -d "Unit of values that state none, or Name=unit"
    complete -c statreport -n "__fish_seen_subcommand_from $command" -l type-column -x -d "Column with the object types"
    complete -c statreport -n "__fish_seen_subcommand_from $command" -l name-column -x -d "Column with the object names"
    complete -c statreport -n "__fish_seen_subcommand_from $command" -l decimal -x -a "point comma" -d "Decimal mark"
    complete -c statreport -n "__fish_seen_subcommand_from $command" -l digits -x -d "Significant digits, 0 is automatic"
end
complete -c statreport -n "__fish_seen_subcommand_from render" -l image -r -F -d "The image that was measured"
complete -c statreport -n "__fish_seen_subcommand_from render" -s o -l output -r -F -d "The PDF file to write"
complete -c statreport -n "__fish_seen_subcommand_from render check" -F
complete -c statreport -n "__fish_seen_subcommand_from stats" -l group-by -x -a "object measurement" -d "Groups"
complete -c statreport -n "__fish_seen_subcommand_from stats" -l format -x -a "text csv json" -d "Output"
complete -c statreport -n "__fish_seen_subcommand_from blocks" -l format -x -a "text json" -d "Output"
