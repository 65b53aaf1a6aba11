#!/usr/bin/env bash
# Collects every translatable text of the application into the .ts files of
# the product's languages (GUIApplication/Language/MarigoldGuiApp_<code>.ts),
# dropping texts that no longer exist. Arguments name the languages (all
# of them by default). New texts arrive unfinished: the test
# of the translation files fails until each has its translation.
set -euo pipefail
here="$(cd "$(dirname "$0")/.." && pwd)"
app="$here/GUIApplication"
lupdate_bin="$(command -v lupdate || echo /usr/lib/qt5/bin/lupdate)"
codes=("$@")
[ ${#codes[@]} -eq 0 ] && codes=(en es fr de it pt ja ko zh_Hans zh_Hant)
ts=()
for c in "${codes[@]}"; do ts+=("$app/Language/MarigoldGuiApp_$c.ts"); done
"$lupdate_bin" -no-obsolete -locations none -extensions cpp,h,ui \
    "$app" -ts "${ts[@]}"

# English is the source language: its file carries each text as its own
# translation, so that a wording can be changed in the shipped file alone.
python3 - "$app/Language/MarigoldGuiApp_en.ts" <<'PY'
import re, sys, html
path = sys.argv[1]
text = open(path, encoding="utf-8").read()
def fill(m):
    source = m.group(1)
    return "<source>%s</source>\n        <translation>%s</translation>" % (source, source)
# A source never holds a raw "<" (the file escapes it), so a match stays inside
# its own message.
text = re.sub(r"<source>([^<]*)</source>\s*<translation type=\"unfinished\">[^<]*</translation>", fill, text)
text = re.sub(r"<source>([^<]*)</source>\s*<translation type=\"unfinished\"/>", fill, text)
open(path, "w", encoding="utf-8").write(text)
PY
