"""Prints what a reader library finds in a compiled help: title, home page, captions, and where words stand.

    read_chm.py FILE CODEPAGE [WORD...]

Texts come in the code page of the file's language and go out in UTF-8.
"""
import re
import sys

from chm import chm


def captions(sitemap, code_page):
    names = re.findall(rb'<param name="Name" value ?= ?"([^"]*)"', sitemap or b"", re.I)
    text = [name.decode(code_page) for name in names]
    return [re.sub(r"&#(\d+);", lambda number: chr(int(number[1])), name) for name in text]


def main(path, code_page, *words):
    help_file = chm.CHMFile()
    if not help_file.LoadCHM(path):
        sys.exit("can't be read")
    help_file.GetArchiveInfo()
    print("language:", hex(help_file.lcid))
    print("title:", help_file.title.decode(code_page))
    print("home:", help_file.home.decode(code_page))
    for name in captions(help_file.GetTopicsTree(), code_page):
        print("contents:", name)
    for name in captions(help_file.GetIndex(), code_page):
        print("index:", name)
    for word in words:
        pages = help_file.Search(word.encode(code_page), False, False)[1] or {}
        for page in sorted(page.decode(code_page) for page in pages.values()):
            print("found:", word, page)


sys.stdout.reconfigure(encoding="utf-8")
main(*sys.argv[1:])
