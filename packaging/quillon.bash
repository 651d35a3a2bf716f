# Completion of the command line of quillon, for bash.

# The options of a command, or of all.
_quillon_options() {
    printf '%s ' --help --version --lang --json --verbose --quiet --log --engine-stall \
        --engine-limit --memory-limit --require-isolation --engine-documents --filters --stand-ins
    case $1 in
    convert) printf '%s ' --out --printer --settings --ps --pdf --profile --jobs --set \
        --print --print-server --print-option --wait ;;
    settings) printf '%s ' --settings ;;
    watch)
        printf '%s ' --config --check --once --journal --queue --http \
            --out --printer --settings --ps --pdf --profile --jobs --set
        ;;
    serve) printf '%s ' --queue --config --map --any-version --http --jobs ;;
    queue) printf '%s ' --config --journal --queue --folder --state --limit ;;
    cancel) printf '%s ' --config --journal --queue ;;
    retry) printf '%s ' --config --journal --queue --folder --failed ;;
    pause | resume) printf '%s ' --config --journal --queue ;;
    print-server) printf '%s ' --cups-server-root --cups-server-bin ;;
    esac
}

# The keys of settings, each with what comes behind it.
_quillon_settings() {
    printf '%s= ' COLOR FRAMESLIDES HANDOUTSHORIZONTAL HANDOUTSVERTICAL HIGHQUALITY \
        OUTPUTFILETYPEPDF OUTPUTFILETYPEPS PRINTCOMMENTSANDINKMARKUP PRINTER PRINTHIDDENSLIDES \
        PRINTOUTPUTTYPE SCALETOFITPAGE SELECTEDDISTILLERPROFILE SLIDESPERPAGE
}

# The profiles that lie beside the program, one a line.
_quillon_profiles() {
    local program path
    program=$(readlink -f "$(type -P "$1")") || return
    for path in "${program%/*}"/JobOptions/*.joboptions; do
        printf '%s\n' "${path##*/}"
    done
}

# Chooses among words that stand on lines of their own.
_quillon_choose() {
    local IFS=$'\n'
    COMPREPLY=($(compgen -W "$1" -- "$2"))
}

_quillon_choose_files() {
    compopt -o filenames
    mapfile -t COMPREPLY < <(compgen "$1" -- "$2")
}

_quillon() {
    local current=$2 previous=$3 command='' word
    local commands=$'cancel\nconvert\nfilter\npause\nprint-server\nqueue\nresume\nretry\nscreen'
    commands+=$'\nserve\nsettings\nstatus\nwatch'
    for word in "${COMP_WORDS[@]:1:COMP_CWORD-1}"; do
        [[ -n $word && $'\n'$commands$'\n' == *$'\n'"$word"$'\n'* ]] && command=$word && break
    done

    case $previous in
    --lang) _quillon_choose $'de\nen\nes\nfr\nja' "$current" ;;
    --out | -o | --filters | --stand-ins | --cups-server-*) _quillon_choose_files -d "$current" ;;
    --config | --journal | --log | --settings) _quillon_choose_files -f "$current" ;;
    --profile)
        compopt -o filenames
        _quillon_choose "$(_quillon_profiles "$1")" "$current"
        ;;
    --set)
        compopt -o nospace
        _quillon_choose "$(_quillon_settings | tr ' ' '\n')" "$current"
        ;;
    --state)
        _quillon_choose $'waiting\nconverting\nsubmitting\nprinting\ndelivering\nfinished\narchived\nfailed\nvanished' \
            "$current"
        ;;
    --engine-* | --folder | --http | --jobs | -j | --limit | --map | --memory-limit | --printer | --print | --print-* | --queue) ;; # only the user knows
    *)
        if [[ $current == -* ]]; then
            _quillon_choose "$(_quillon_options "$command" | tr ' ' '\n')" "$current"
        elif [[ -z $command ]]; then
            _quillon_choose "$commands" "$current"
        elif [[ $command == print-server ]]; then
            _quillon_choose $'install\nremove\nstatus' "$current"
        elif [[ $command == @(convert|screen|watch) ]]; then
            _quillon_choose_files -f "$current"
        fi
        ;;
    esac
}
complete -F _quillon quillon
