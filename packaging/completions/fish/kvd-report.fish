complete -c kvd-report -f
complete -c kvd-report -n "not string match -qrv -- '^-' (commandline -opc)[2..]" \
    -a "(kvremote list 2>/dev/null | tail -n +2 | string replace -r '^(\S+)\s+\S+\s+\S+\s+' '\$1\t')"
complete -c kvd-report -l json -d "Write one JSON object"
complete -c kvd-report -s h -l help -d "Show help"
complete -c kvd-report -l version -d "Show the version"
