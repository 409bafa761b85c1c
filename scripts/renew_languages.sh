#!/usr/bin/env bash
# Brings the factory test's catalogues up to date with its sources: new texts come in untranslated, and texts
# that are gone leave. Translate what is empty or marked fuzzy then; the tests languages.* name what is left.
set -euo pipefail
cd "$(dirname "$0")/.."

cmake --preset release >/dev/null
cmake --build --preset release --target factory_test_catalogues
for catalogue in apps/factory_test/language/*.po; do
  msgmerge --quiet --update --backup=none --no-location "$catalogue" \
    build/release/apps/factory_test/language/factory_test.pot
  msgattrib --no-obsolete --output-file="$catalogue" "$catalogue"
  echo "$catalogue: $(msgfmt --statistics -o /dev/null "$catalogue" 2>&1)"
done
