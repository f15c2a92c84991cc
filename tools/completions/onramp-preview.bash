# Completion of onramp-preview for bash.
_onramp_preview() {
  local word=${COMP_WORDS[COMP_CWORD]}
  if [[ $word == -* ]]; then
    mapfile -t COMPREPLY < <(compgen -W "--pictures --languages --help --system-version" -- "$word")
  else
    mapfile -t COMPREPLY < <(compgen -d -- "$word")
    compopt -o filenames
  fi
}
complete -F _onramp_preview onramp-preview
