# Completion of onramp-check for bash.
_onramp_check() {
  local word=${COMP_WORDS[COMP_CWORD]}
  if [[ $word == -* ]]; then
    mapfile -t COMPREPLY < <(compgen -W "--json --strict --keys --texts --help --version" -- "$word")
  else
    mapfile -t COMPREPLY < <(compgen -d -- "$word")
    compopt -o filenames
  fi
}
complete -F _onramp_check onramp-check
