# Completes the options of the toolkit's programs from what they print for --help. An option whose
# value is called FILE or DIR there is completed with names of files.
_brimol_options() {
  local word=${COMP_WORDS[COMP_CWORD]} before=${COMP_WORDS[COMP_CWORD - 1]} help
  help=$("$1" --help 2>/dev/null)
  if [[ $word == -* ]]; then
    mapfile -t COMPREPLY < <(compgen -W "$(grep -oE -- '^  --[a-z][a-z-]*' <<<"$help")" -- "$word")
  elif [[ $before == -* ]] && ! grep -qE -- "$before (FILE|DIR)" <<<"$help"; then
    COMPREPLY=()
  else
    compopt -o filenames 2>/dev/null
    mapfile -t COMPREPLY < <(compgen -f -- "$word")
  fi
}
complete -F _brimol_options factory_test brimol_gallery brimol-replay
