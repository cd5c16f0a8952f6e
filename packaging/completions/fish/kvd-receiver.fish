complete -c kvd-receiver -f
complete -c kvd-receiver -l device -r -F -d "Treat a device as a remote"
complete -c kvd-receiver -l no-grab -d "Send the remotes' keys to the desktop too"
complete -c kvd-receiver -l pass-through -r -F -d "Socket of kvd-pass-through"
complete -c kvd-receiver -l list -d "List the devices"
complete -c kvd-receiver -l monitor -d "Show each button as it is pressed"
complete -c kvd-receiver -s h -l help -d "Show help"
complete -c kvd-receiver -l version -d "Show the version"
