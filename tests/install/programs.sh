# Manual pages and completion name every option that a program's help prints; the desktop file is valid.
. "$SOURCE/tests/install/common.sh"

for program in "$staged"/bin/*; do
  name=$(basename "$program")
  options=$("$program" --help | grep -oE '^  --[a-z-]+' | sort -u)
  [[ $options == *--help* ]] || fail "$name --help prints no options."

  page=$(gzip -dc "$staged/share/man/man1/$name.1.gz" | sed 's/\\-/-/g')
  for option in $options; do
    grep -qE -- "$option( |\$|\")" <<<"$page" || fail "$name(1) does not name $option."
  done

  offered=$(
    . "$staged/share/bash-completion/completions/$name"
    complete -p "$name" >/dev/null
    COMP_WORDS=("$program" --)
    COMP_CWORD=1
    _brimol_options "$program"
    printf '  %s\n' "${COMPREPLY[@]}" | sort -u
  )
  diff <(echo "$options") <(echo "$offered") || fail "The completion of $name offers other options."
done

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
