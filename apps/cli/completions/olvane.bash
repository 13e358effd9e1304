# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT

# Completion of the olvane command for bash.

_olvane() {
    local cur prev words cword
    if declare -F _init_completion > /dev/null; then
        _init_completion || return
    else
        words=("${COMP_WORDS[@]}"); cword=$COMP_CWORD; cur=${words[cword]}; prev=${words[cword - 1]}
    fi
    local commands="people layout draw batch check kin judge page"
    local view="--view --generations --boxes --parents --up --down --direction --mirror --fold --compact --siblings --no-spouses --to --by --ways --language --marks --effort --all-parts --of --angle"
    local family="--no-aunts-uncles --no-cousins --no-siblings --no-sibling-spouses --no-nieces-nephews \
        --no-grandchildren --no-great-grandparents --no-spouses-of-children"
    local living="--hide-living --year"
    local encodings="UTF-8 UTF-16LE UTF-16BE ANSEL windows-1250 windows-1251 windows-1252 windows-1253 ISO-8859-2 \
        ISO-8859-15 KOI8-R GB18030 Big5 Shift_JIS EUC-JP EUC-KR IBM437 IBM850"
    case $prev in
        --view) COMPREPLY=($(compgen -W "family pedigree near ancestors descendants hourglass relatives fan kinship everybody" -- "$cur")); return ;;
        --of) COMPREPLY=($(compgen -W "ancestors descendants" -- "$cur")); return ;;
        --angle) COMPREPLY=($(compgen -W "90 180 270 360" -- "$cur")); return ;;
        --language) COMPREPLY=($(compgen -W "en de es" -- "$cur")); return ;;
        --parents) COMPREPLY=($(compgen -W "birth adoptive all-in-order" -- "$cur")); return ;;
        --by) COMPREPLY=($(compgen -W "blood marriage both" -- "$cur")); return ;;
        --effort) COMPREPLY=($(compgen -W "0 1 2 3 4" -- "$cur")); return ;;
        --ways | --marks | --to | --fold) return ;;
        --direction) COMPREPLY=($(compgen -W "down up left right" -- "$cur")); return ;;
        --up | --down) COMPREPLY=($(compgen -W "0 1 2 3 4 5 6 7 8" -- "$cur")); return ;;
        --generations) COMPREPLY=($(compgen -W "1 2 3 4 5 6 7 8 9 10 11 12" -- "$cur")); return ;;
        --boxes) COMPREPLY=($(compgen -W "tall wide" -- "$cur")); return ;;
        --theme) COMPREPLY=($(compgen -W "light dark print" -- "$cur")); return ;;
        --show) COMPREPLY=($(compgen -W "dates places occupation marriage" -- "$cur")); return ;;
        --fit) COMPREPLY=($(compgen -W "A4 A3 A2 A1 A0 letter" -- "$cur")); return ;;
        --sheets) COMPREPLY=($(compgen -W "1x2 2x1 2x2 2x3" -- "$cur")); return ;;
        --dpi) COMPREPLY=($(compgen -W "96 192 300" -- "$cur")); return ;;
        --format) COMPREPLY=($(compgen -W "text tsv json json1" -- "$cur")); return ;;
        --encoding) COMPREPLY=($(compgen -W "$encodings" -- "$cur")); return ;;
        --focus | --title | --year | --scale) return ;;
        -o | --output | --focus-from | --family) COMPREPLY=($(compgen -f -- "$cur")); return ;;
    esac
    if ((cword == 1)); then
        COMPREPLY=($(compgen -W "$commands --help --version" -- "$cur"))
        return
    fi
    if [[ $cur != -* ]]; then
        COMPREPLY=($(compgen -f -- "$cur"))
        return
    fi
    case ${words[1]} in
        people) COMPREPLY=($(compgen -W "--help --encoding --format" -- "$cur")) ;;
        layout) COMPREPLY=($(compgen -W "--help --encoding --focus --format $view $living $family" -- "$cur")) ;;
        draw) COMPREPLY=($(compgen -W "--help --encoding --focus --output --theme --title --fit --sheets --scale --dpi --unknown-parents --show $view $living $family" -- "$cur")) ;;
        batch) COMPREPLY=($(compgen -W "--help --encoding --focus-from --unbuffered $view $family" -- "$cur")) ;;
        check) COMPREPLY=($(compgen -W "--help --encoding --focus --all --format $view $family" -- "$cur")) ;;
        kin) COMPREPLY=($(compgen -W "--help --encoding --format --ways --language" -- "$cur")) ;;
        judge) COMPREPLY=($(compgen -W "--help --encoding --family --format" -- "$cur")) ;;
        page) COMPREPLY=($(compgen -W "--help --no-notes --no-media --photos --encoding --focus --map --output --title --view --generations --up --down --direction --to $living $family" -- "$cur")) ;;
    esac
}

complete -o filenames -F _olvane olvane
