"""Plays the installed program: a word it does not know is taken into the dictionary, and a second
start still holds it.  installed_game.py PROGRAM"""

import sys
import time
from pathlib import Path

sys.path.insert(0, str(Path(__file__).resolve().parents[2] / "packaging"))

from desktop_player import (News, Program, listed_words, press, traced_words, type_text, wait_for,
                            xdotool)


def play_and_correct(executable):
    news = News()
    program = Program(executable)
    xdotool("search", "--onlyvisible", "--class", "^quorle$")  # what the desktop file names
    listed = listed_words()
    known = set()
    while not known:  # a board may be that poor
        program.press("Quorle", "Start game")
        texts = list(traced_words(wait_for("letters on the board", program.board), 4))
        known = listed.intersection(texts)
    unknown = next(text for text in texts if text not in listed)
    type_text(unknown)
    press("Return")
    wait_for("a screen reader's news", lambda: news.has("not in dictionary. 1 word entered"))
    program.press("Quorle", "End game")
    results = "Gorvat Results"
    assert known.intersection(program.words(results, "Quorle's words"))
    program.click(program.control(results, unknown))
    program.press(results, "Add to dictionary")
    wait_for("the correction", lambda: unknown in program.words(results, "Your words"))
    time.sleep(2.2)  # OK does nothing in the first two seconds
    program.press(results, "OK")
    program.leave("Yes")
    return unknown


dictionary = Path.home() / ".local/share/quorle/Dictionary.dat"
assert not dictionary.exists()
word = play_and_correct(sys.argv[1])
assert dictionary.is_file()
second = Program(sys.argv[1])
assert word in second.browse(word[:2])
numerals = {"cii", "civ", "clii", "clxiv"}  # no player accepts these
assert not numerals.intersection(second.browse("ci") + second.browse("cl"))
second.leave()
