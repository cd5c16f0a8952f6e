function __kvremote_buttons
    kvremote list 2>/dev/null | tail -n +2 | string replace -r '^(\S+)\s+\S+\s+\S+\s+' '$1\t'
end

set -l first "test (count (commandline -opc)) -eq 1; or string match -q -- --user (commandline -opc)[-2]"
set -l button "not $first; and not __fish_seen_subcommand_from lock quit list"
complete -c kvremote -f
complete -c kvremote -n $first -a "(__kvremote_buttons)"
complete -c kvremote -n $first -a lock -d "Lock or unlock the screen"
complete -c kvremote -n $first -a quit -d "Ask kvd to quit"
complete -c kvremote -n $first -a list -d "List the buttons"
complete -c kvremote -n "string match -q -- lock (commandline -opc)[-1]" -a "on off"
complete -c kvremote -n $button -l press -d "Send the press alone"
complete -c kvremote -n $button -l release -d "Send the release alone"
complete -c kvremote -n $button -l hold -x -d "Press, wait and release"
complete -c kvremote -n $first -l raw -d "Send numbers: page, usage, value, extra field"
complete -c kvremote -l user -x -a "(__fish_complete_users)" -d "Send to the kvd of another user"
complete -c kvremote -s h -l help -d "Show help"
complete -c kvremote -l version -d "Show the version"
