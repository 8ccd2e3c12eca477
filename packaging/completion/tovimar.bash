# Completion of tovimar for bash. What may follow is read from the program's own help, so it is always that
# of the program at hand: commands and options by name, values and arguments by what the help calls them.

# _tovimar_section SECTION [COMMAND...]: the lines of a section of the command's help.
_tovimar_section() {
    local section=$1
    shift
    "$_tovimar_program" "$@" --help 2>/dev/null |
        awk -v section="$section:" '$0 == section { within = 1; next }
            /^[^ ]|^$/ { within = 0 }
            within && /^  [^ ]/'
}

# _tovimar_words SECTION [COMMAND...]: the first word of each of these lines.
_tovimar_words() {
    _tovimar_section "$@" | sed -E 's/^  (-h,)?([^ ]+).*/\2/'
}

# Names of the catalogue; they may hold blanks.
_tovimar_projects() {
    "$_tovimar_program" projects 2>/dev/null | sed -n '/^[^ ]/ { s/  ".*//; p }'
}

_tovimar_option_names() {
    "$_tovimar_program" options 2>/dev/null | sed -nE 's/^([A-Za-z]+)=.*/\1/p'
}

# _tovimar_option_values NAME: those that its description ends with, as in "(true, false)".
_tovimar_option_values() {
    "$_tovimar_program" options 2>/dev/null |
        awk -v name="$1=" 'index($0, name) == 1 { getline; if (match($0, /\([^()]*, [^()]*\)$/))
            print substr($0, RSTART + 1, RLENGTH - 2) }' | sed 's/, /\n/g'
}

# _tovimar_offer TYPED: the lines of standard input that begin so, quoted where the shell needs it.
_tovimar_offer() {
    local line typed=${1//\\/}
    while IFS= read -r line; do
        [[ -n $line && $line == "$typed"* ]] && COMPREPLY+=("$(printf %q "$line")")
    done
}

# _tovimar_files TYPED [SUFFIX...]: folders, and files that end so; "*" stands for any file.
_tovimar_files() {
    local typed=${1//\\/} suffix path
    shift
    typed=${typed#[\"\']}
    compopt -o filenames 2>/dev/null
    while IFS= read -r path; do
        COMPREPLY+=("$path")
    done < <(
        compgen -d -- "$typed"
        for suffix; do
            compgen -f -X "!$suffix" -- "$typed"
        done | while IFS= read -r path; do
            [[ -d $path ]] || printf '%s\n' "$path"
        done
    )
}

# _tovimar_value KIND TYPED COMMAND...: what the help calls KIND.
_tovimar_value() {
    local kind=$1 typed=$2
    shift 2
    case $kind in
        DIR) _tovimar_files "$typed" ;;
        FILE) if [[ $1 == convert-contents && $_tovimar_before != --output ]]; then
            _tovimar_files "$typed" '*.[hH][hH][cC]'
        else
            _tovimar_files "$typed" '*'
        fi ;;
        SOURCE) if [[ $1 == generate ]]; then
            _tovimar_files "$typed" '*.[aA][cC][cC][dD][bB]' '*.[mM][dD][bB]' '*.tvp'
        else
            _tovimar_files "$typed" '*.[aA][cC][cC][dD][bB]' '*.[mM][dD][bB]'
        fi ;;
        PROJECT)
            _tovimar_offer "$typed" < <(_tovimar_projects)
            [[ ${#COMPREPLY[@]} -gt 0 ]] || _tovimar_files "$typed" '*.tvp'
            ;;
        DATABASE) _tovimar_files "$typed" '*.[aA][cC][cC][dD][bB]' '*.[aA][cC][cC][dD][eE]' '*.[mM][dD][bBeE]' ;;
        WHAT) _tovimar_offer "$typed" <<<$'help\nweb\nfolder' ;;
        NAME) _tovimar_offer "$typed" < <(_tovimar_option_names) ;;
        VALUE) _tovimar_offer "$typed" < <(_tovimar_option_values "$_tovimar_before") ;;
        NAME=VALUE) if [[ $typed == *=* ]]; then
            _tovimar_offer "${typed#*=}" < <(_tovimar_option_values "${typed%%=*}")
        else
            compopt -o nospace 2>/dev/null
            _tovimar_offer "$typed" < <(_tovimar_option_names | sed 's/$/=/')
        fi ;;
    esac
}

_tovimar() {
    local _tovimar_program=${COMP_WORDS[0]} _tovimar_before='' word kind typed index
    local -a words=() command=() arguments=()
    COMPREPLY=()
    # The shell breaks words at "=".
    for ((index = 1; index <= COMP_CWORD; index++)); do
        word=${COMP_WORDS[index]}
        if [[ ${#words[@]} -gt 0 && ($word == = || ${words[-1]} == *= && ${COMP_WORDS[index - 1]} == =) ]]; then
            words[-1]+=$word
        else
            words+=("$word")
        fi
    done
    typed=${words[-1]}
    unset 'words[-1]'

    # Commands come first; an option that takes a value waits for it.
    local expected='' positional=0
    for word in "${words[@]}"; do
        if [[ -n $expected ]]; then
            expected=''
        elif [[ $word == -* ]]; then
            expected=$(_tovimar_section Options "${command[@]}" |
                sed -nE "s/^  (-h,)?${word//[^a-z-]/} ([A-Z=]+)( .*|\$)/\2/p")
        elif [[ $positional -eq 0 ]] &&
            _tovimar_words Commands "${command[@]}" | grep -qx -- "$word"; then
            command+=("$word")
        else
            positional=$((positional + 1))
        fi
        _tovimar_before=$word
    done

    if [[ -n $expected ]]; then
        _tovimar_value "$expected" "$typed" "${command[@]}"
    elif [[ $typed == --*=* ]]; then
        kind=$(_tovimar_section Options "${command[@]}" |
            sed -nE "s/^  ${typed%%=*} ([A-Z=]+)( .*|\$)/\1/p")
        _tovimar_value "$kind" "${typed#*=}" "${command[@]}"
    elif [[ $typed == -* ]]; then
        _tovimar_offer "$typed" < <(_tovimar_words Options "${command[@]}")
    else
        [[ $positional -gt 0 ]] || _tovimar_offer "$typed" < <(_tovimar_words Commands "${command[@]}")
        mapfile -t arguments < <([[ ${#command[@]} -eq 0 ]] || _tovimar_words Arguments "${command[@]}")
        # WHAT of "open" may be left out.
        if [[ ${command[0]} == open && $positional -eq 0 ]]; then
            _tovimar_value WHAT "$typed" open
            positional=1
        fi
        _tovimar_value "${arguments[positional]}" "$typed" "${command[@]}"
    fi
}

complete -F _tovimar tovimar
