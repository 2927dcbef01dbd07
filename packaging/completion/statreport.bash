# SPDX-License-Identifier: MIT
# bash completion for statreport

_statreport_files()
{
    # Folders always, and files with one of the suffixes given.
    local suffixes=$1
    compopt -o filenames
    mapfile -t COMPREPLY < <(compgen -d -- "$current"; compgen -f -X "!*.@($suffixes)" -- "$current")
}

_statreport_words()
{
    mapfile -t COMPREPLY < <(compgen -W "$1" -- "$current")
}

_statreport()
{
    local current=${COMP_WORDS[COMP_CWORD]} previous=${COMP_WORDS[COMP_CWORD - 1]} command=${COMP_WORDS[1]}
    local common="--help --version --json-errors --language --quiet"
    local data="--session --table --unit --type-column --name-column --decimal --digits"
    COMPREPLY=()
    shopt -q extglob || { shopt -s extglob; }

    case $previous in
    --session) _statreport_files "json"; return ;;
    --table) _statreport_files "csv|tsv|tab|txt|xls|json"; return ;;
    --image) _statreport_files "png|jpg|jpeg|tif|tiff|bmp"; return ;;
    -o | --output) _statreport_files "pdf"; return ;;
    --decimal) _statreport_words "point comma"; return ;;
    --group-by) _statreport_words "object measurement"; return ;;
    --format)
        if [ "$command" = stats ]; then _statreport_words "text csv json"; else _statreport_words "text json"; fi
        return ;;
    --language) _statreport_words "English German French Spanish Italian Russian Japanese Korean Arabic ChineseSimple ChineseTraditional Slovakian"; return ;;
    --unit | --type-column | --name-column | --digits) return ;;
    esac

    if [ "$COMP_CWORD" -eq 1 ]; then
        _statreport_words "render stats check blocks $common"
        return
    fi
    case $command in
    render)
        if [[ $current == -* ]]; then _statreport_words "$data --image -o --output $common"; else _statreport_files "rtp"; fi ;;
    stats) _statreport_words "$data --group-by --format $common" ;;
    check) if [[ $current == -* ]]; then _statreport_words "$common"; else _statreport_files "rtp"; fi ;;
    blocks) _statreport_words "--format $common" ;;
    esac
}

complete -F _statreport statreport
