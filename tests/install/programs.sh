# Manual pages and completion name every option that a program's help prints; the desktop file is valid.
. "$SOURCE/tests/install/common.sh"

# offered WORD...: what the completion of the first word's program offers for the last one, a line each.
offered() (
  . "$staged/share/bash-completion/completions/$1"
  complete -p "$1" >/dev/null
  cd "$SOURCE"
  COMP_WORDS=("$@")
  COMP_CWORD=$(($# - 1))
  _brimol_options "$staged/bin/$1"
  printf '  %s\n' "${COMPREPLY[@]}" | sort -u
)

for program in "$staged"/bin/*; do
  name=$(basename "$program")
  options=$("$program" --help | grep -oE '^  --[a-z-]+' | sort -u)
  [[ $options == *--help* ]] || fail "$name --help prints no options."

  page=$(gzip -dc "$staged/share/man/man1/$name.1.gz" | sed 's/\\-/-/g')
  for option in $options; do
    grep -qE -- "$option( |\$|\")" <<<"$page" || fail "$name(1) does not name $option."
  done

  diff <(echo "$options") <(offered "$name" --) || fail "The completion of $name offers other options."
done

# The last word of a command line, and what it may become.
while IFS='>' read -r line wanted; do
  read -ra words <<<"$line"
  found=$(offered "${words[@]}" | xargs)
  [[ $found == "${wanted# }" ]] || fail "The completion of '${line% }' offers '$found'."
done <<'END'
brimol-replay --lint READ > README.md
brimol-replay --dir packag > packaging
brimol-replay --device READ >
brimol-replay menu.trace -- packag > packaging
factory_test ex > export
factory_test export --j > --json --junit
factory_test report --j >
factory_test report --serial READ >
factory_test --database READ > README.md
END

desktop-file-validate "$staged/share/applications/factory_test.desktop"

# What is for windows and browsers alone is opened for them alone.
opened=$(LD_DEBUG=files "$staged/bin/factory_test" --headless --shot "$WORK/menu.png" 2>&1)
! grep -E 'libSDL2|libwebsockets|libvncserver' <<<"$opened" || fail "A session without a user opens these."

# The devices stand in one table of the platform; the manual page and the layout lint name all of them.
page=$(gzip -dc "$staged/share/man/man7/brimol3_widget.7.gz" | sed 's/\\-/-/g')
devices=$("$staged/bin/factory_test" --help | sed -n '/^Devices:/,$p' | grep -oE '^  [a-z]+-[0-9.]+' | tr -d ' ')
[[ -n $devices ]] || fail "factory_test --help lists no devices."
linted=$(sed -nE 's/^set\(devices (.*)\)$/\1/p' "$SOURCE/tests/lint/CMakeLists.txt" | tr ' ' '\n')
diff <(echo "$devices") <(echo "$linted") || fail "The layout lint knows other devices."
for device in $devices; do
  grep -qE "^\.BR? $device( |\$)" <<<"$page" || fail "brimol3_widget(7) does not name $device."
done
