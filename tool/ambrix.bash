# Completion of the ambrix command line for bash.

_ambrix() {
  local word=$2 previous=$3 command=${COMP_WORDS[1]}
  local commands="info dump check call convert session"
  declare -A options=(
    [info]="--attributes --json --time-limit --memory-limit --help"
    [dump]="--records --format --output --defuse-formulas --raw-times --time-limit --memory-limit --help"
    [check]="--json --quiet --time-limit --memory-limit --help"
    [call]="--file --extended --help"
    [convert]="--compression --majority --checksum --skip-unsupported --time-limit --memory-limit --help"
    [session]="--extended --max-array-bytes --max-line-bytes --help"
  )
  declare -A values=(
    [--format]="table csv json"
    [--majority]="row column"
    [--checksum]="md5 none"
    [--compression]="none rle huff ahuff gzip"
  )
  if [[ $COMP_CWORD == 1 ]]; then
    mapfile -t COMPREPLY < <(compgen -W "$commands --help --version" -- "$word")
  elif [[ -n ${values[$previous]:-} ]]; then
    mapfile -t COMPREPLY < <(compgen -W "${values[$previous]}" -- "$word")
  elif [[ $word == -* ]]; then
    mapfile -t COMPREPLY < <(compgen -W "${options[$command]:-}" -- "$word")
  fi
}
complete -o default -F _ambrix ambrix
