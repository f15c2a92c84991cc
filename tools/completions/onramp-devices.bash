# Completion of onramp-devices for bash.
_onramp_devices() {
  local word=${COMP_WORDS[COMP_CWORD]} before=${COMP_WORDS[COMP_CWORD-1]} command=${COMP_WORDS[1]}
  local options="--help --version"
  if ((COMP_CWORD == 1)); then
    mapfile -t COMPREPLY < <(compgen -W "browse ask uri hosts $options" -- "$word")
    return
  fi
  case $command in
    browse) options="--medium --model --seconds --all-types --json --verbose --help" ;;
    ask) options="--json --verbose --help" ;;
    uri) options="--seconds --help" ;;
    hosts) options="--no-search --json --help" ;;
  esac
  if [[ $word == "=" ]]; then  # bash splits "--medium=DIR" into three words
    word=
  elif [[ $before == "=" ]]; then
    before=${COMP_WORDS[COMP_CWORD-2]}
  fi
  if [[ $before == --medium || $before == -m ]]; then
    mapfile -t COMPREPLY < <(compgen -d -- "$word")
    compopt -o filenames
  elif [[ $word == -* ]]; then
    mapfile -t COMPREPLY < <(compgen -W "$options" -- "$word")
  elif [[ $command == ask ]]; then
    mapfile -t COMPREPLY < <(compgen -A hostname -- "$word")
  fi
}
complete -F _onramp_devices onramp-devices
