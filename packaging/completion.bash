# Completes the toolkit's programs from what they print for --help: their options and commands, and names
# of files where one may stand.

# The options of the command line so far, each with what its value is called: _brimol_known PROGRAM WORD
_brimol_known() {
  local name=${1##*/}
  if [[ -n $2 ]] && grep -qxF -- "$2" < <(_brimol_commands "$1"); then
    "$1" "$2" --help | grep -E "^  ($name $2|FROM|SOME) " # what belongs to all commands, too
  else
    "$1" --help | grep -oE '^  --[a-z][a-z-]*( [^ ]+)?'
  fi 2>/dev/null
}

# What may stand in the place of options, such as `factory_test export`: _brimol_commands PROGRAM
_brimol_commands() { "$1" --help 2>/dev/null | sed -n "s/^  ${1##*/} \([a-z]*\) .*/\1/p"; }

_brimol_complete() { mapfile -t COMPREPLY < <(compgen "$@"); }

_brimol_files() {
  compopt -o filenames 2>/dev/null
  _brimol_complete "$@" -f -- "${COMP_WORDS[COMP_CWORD]}"
}

_brimol_options() {
  local word=${COMP_WORDS[COMP_CWORD]} before=${COMP_WORDS[COMP_CWORD - 1]} first known commands
  [[ $before != = ]] || before=${COMP_WORDS[COMP_CWORD - 2]}
  if [[ " ${COMP_WORDS[*]:1:COMP_CWORD - 1} " == *' -- '* ]]; then # another program's words
    if [[ $before == -- ]]; then _brimol_files -c; else _brimol_files; fi
    return
  fi
  ((COMP_CWORD == 1)) || first=${COMP_WORDS[1]}
  known=$(_brimol_known "$1" "${first:-}")
  commands=$(_brimol_commands "$1")
  if [[ $word == -* ]]; then
    _brimol_complete -W "$(grep -oE -- '--[a-z][a-z-]*' <<<"$known")" -- "$word"
  elif [[ -z ${first:-} && -n $commands ]]; then
    _brimol_complete -W "$commands" -- "$word"
  elif [[ $before == -* ]] && grep -qE -- "$before [^ ]" <<<"$known" &&
    ! grep -qE -- "$before (FILE|DIR|FROM)" <<<"$known"; then
    COMPREPLY=()
  else
    _brimol_files
  fi
}
complete -F _brimol_options factory_test brimol_gallery brimol-replay
