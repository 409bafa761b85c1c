# The guide does what it says, in a fresh home with an installation of its own. What it leaves behind is
# the application of application.sh.
. "$SOURCE/tests/install/common.sh"
export HOME=$WORK/guide BRIMOL_DISPLAY=headless
rm -rf "$HOME"
mkdir -p "$HOME/build"
ln -s "$BUILD" "$HOME/build/release"
printf 'brimol-trace 1\ntap "Leave"\n' >"$HOME/by_hand.trace"
python3 "$here/guide.py" "$SOURCE/docs/guide.md" >"$HOME/guide.sh"
cd "$HOME"
bash guide.sh

for file in bench/results/lamp/report.html bench/results/lamp.xml bench/results/tests.xml; do
  [[ -s $file ]] || fail "The guide's CI script wrote no $file."
done
grep -q "libbrimol3_widget.so.$INTERFACE => $HOME/brimol/" <<<"$(ldd bench/build/bench)" ||
  fail "The guide's program does not run with the installed library."
