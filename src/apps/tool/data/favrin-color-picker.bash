# bash completion for favrin-color-picker

_favrin_color_picker()
{
    local current=${COMP_WORDS[COMP_CWORD]} previous=${COMP_WORDS[COMP_CWORD - 1]}
    local options='--color --title --suggest --no-opacity --allow-none --format --live --parent --timeout --help
        --version'
    COMPREPLY=()
    case $previous in
    -f | --format)
        mapfile -t COMPREPLY < <(compgen -W 'hex hex8 css json' -- "$current")
        return
        ;;
    -c | --color)
        mapfile -t COMPREPLY < <(compgen -W 'black white red green blue none' -- "$current")
        return
        ;;
    -t | --title | -s | --suggest | -p | --parent | --timeout)
        return
        ;;
    esac
    mapfile -t COMPREPLY < <(compgen -W "$options" -- "$current")
}
complete -F _favrin_color_picker favrin-color-picker
