# Completion of tovimar for fish, read from the program's own help.

# The command typed so far, "settings get" being one of two words.
function __tovimar_command
    set -l words (string match -rv '^-' -- (commandline -opc)[2..])
    set -q words[1]; and echo $words[1]
    contains -- "$words[1]" projects settings; and set -q words[2]; and echo $words[2]
end

# The first word of each line of a section of its help, with what it means.
function __tovimar_section
    tovimar (__tovimar_command) --help 2>/dev/null | awk -v section="$argv[1]:" '
        $0 == section { within = 1; next }
        /^[^ ]|^$/ { within = 0 }
        within && /^  [^ ]/ { word = $1; sub(/^-h,/, "", word); text = $0
            sub(/^  [^ ]+( [^ ]+)* +/, "", text); print word "\t" text }'
end

function __tovimar_takes
    __tovimar_section Arguments | string match -qr "^($argv[1])\t"
end

function __tovimar_options
    tovimar options 2>/dev/null | string match -r '^[A-Za-z]+='
end

complete -c tovimar -f -n 'not __tovimar_takes "SOURCE|PROJECT|FILE|DATABASE"' -a '(__tovimar_section Commands)'
complete -c tovimar -n 'string match -q -- "-*" (commandline -ct)' -a '(__tovimar_section Options)'
complete -c tovimar -n '__tovimar_takes PROJECT' -a "(tovimar projects 2>/dev/null | string match -r '^[^ ].*?(?=  \"|\$)')"
complete -c tovimar -f -n '__tovimar_takes WHAT' -a 'help web folder'
complete -c tovimar -f -n '__tovimar_takes NAME' -a '(__tovimar_options | string trim -rc =)'
complete -c tovimar -l option -x -a '(__tovimar_options)'
complete -c tovimar -l output -r
complete -c tovimar -l copy-to -x -a '(__fish_complete_directories)'
complete -c tovimar -l source -r
complete -c tovimar -l project -r
