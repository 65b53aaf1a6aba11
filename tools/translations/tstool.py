#!/usr/bin/env python3
"""Work on the translation files without a translation editor.

  tstool.py todo CODE            the unfinished texts of MarigoldGuiApp_CODE.ts,
                                 one per line: context<TAB>source (newlines as \\n)
  tstool.py fill CODE FILE.tsv   takes lines context<TAB>source<TAB>translation
                                 and writes them into the file as finished
  tstool.py stats                unfinished count per language

Run scripts/update-translations.sh first, so that every file holds every
text of the program.
"""
import html
import os
import re
import sys

HERE = os.path.dirname(os.path.abspath(__file__))
LANG_DIR = os.path.normpath(os.path.join(HERE, "..", "..", "GUIApplication", "Language"))

MESSAGE = re.compile(r"(<message>\s*<source>)(.*?)(</source>\s*)(<translation[^>]*?(?:/>|>.*?</translation>))", re.S)
CONTEXT = re.compile(r"<context>\s*<name>(.*?)</name>(.*?)</context>", re.S)


def path_of(code):
    return os.path.join(LANG_DIR, "MarigoldGuiApp_%s.ts" % code)


def escape(text):
    return html.escape(text, quote=False).replace('"', "&quot;").replace("'", "&apos;")


def unescape_line(text):
    return text.replace("\\n", "\n")


def todo(code):
    data = open(path_of(code), encoding="utf-8").read()
    for ctx in CONTEXT.finditer(data):
        name = html.unescape(ctx.group(1))
        for m in MESSAGE.finditer(ctx.group(2)):
            if 'type="unfinished"' in m.group(4):
                source = html.unescape(m.group(2)).replace("\n", "\\n")
                print("%s\t%s" % (name, source))


def fill(code, tsv):
    table = {}
    for line in open(tsv, encoding="utf-8"):
        line = line.rstrip("\n")
        if not line.strip():
            continue
        parts = line.split("\t")
        if len(parts) != 3:
            sys.exit("bad line (need context, source, translation): %r" % line)
        table[(parts[0], unescape_line(parts[1]))] = unescape_line(parts[2])
    data = open(path_of(code), encoding="utf-8").read()
    done = 0

    def context_sub(ctx):
        nonlocal done
        name = html.unescape(ctx.group(1))

        def message_sub(m):
            nonlocal done
            key = (name, html.unescape(m.group(2)))
            if key not in table:
                return m.group(0)
            done += 1
            return "%s%s%s<translation>%s</translation>" % (m.group(1), m.group(2), m.group(3), escape(table[key]))

        return ctx.group(0).replace(ctx.group(2), MESSAGE.sub(message_sub, ctx.group(2)))

    data = CONTEXT.sub(context_sub, data)
    open(path_of(code), "w", encoding="utf-8").write(data)
    print("%s: %d of %d filled" % (code, done, len(table)))


def stats():
    for name in sorted(os.listdir(LANG_DIR)):
        if name.endswith(".ts"):
            data = open(os.path.join(LANG_DIR, name), encoding="utf-8").read()
            print("%-24s %4d messages, %4d unfinished" % (name, data.count("<message"), data.count('type="unfinished"')))


if __name__ == "__main__":
    if len(sys.argv) >= 3 and sys.argv[1] == "todo":
        todo(sys.argv[2])
    elif len(sys.argv) >= 4 and sys.argv[1] == "fill":
        fill(sys.argv[2], sys.argv[3])
    elif len(sys.argv) >= 2 and sys.argv[1] == "stats":
        stats()
    else:
        sys.exit(__doc__)
