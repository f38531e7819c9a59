# bash completion for zornet
# SPDX-License-Identifier: MIT

_zornet() {
  local word=$2 previous=$3
  [[ $word != = ]] || word=""
  [[ $previous != = ]] || previous=${COMP_WORDS[COMP_CWORD - 2]}
  COMPREPLY=()
  case $previous in
    --color) mapfile -t COMPREPLY < <(compgen -W "auto always never" -- "$word") ;;
    --module-path) mapfile -t COMPREPLY < <(compgen -d -- "$word") ;;
    --dot | --svg | --parts) mapfile -t COMPREPLY < <(compgen -f -- "$word") ;;
    --solutions | --explain | --budget | --step-limit | --time-limit) ;;
    *)
      if [[ $word == -* ]]; then
        mapfile -t COMPREPLY < <(compgen -W "--budget --color --dot --explain --help --json-stream --module-path --parts --quiet
          --raw --solutions --split --stats --step-limit --svg --time-limit --trace --version" -- "$word")
      else
        mapfile -t COMPREPLY < <(compgen -f -X '!*.szn' -- "$word"; compgen -d -- "$word")
      fi
      ;;
  esac
}

complete -o filenames -F _zornet zornet
