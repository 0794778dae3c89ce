"""Plays the installed program twice: a game whose unknown word is taken into the
dictionary, and a second start that still holds the word.  installed_game.py PROGRAM"""

import sys
import time
from pathlib import Path

sys.path.insert(0, str(Path(__file__).resolve().parents[2] / "packaging"))

from desktop_player import (News, Program, listed_words, press, traced_words, type_text, wait_for,
                            xdotool)


def choose_words(program):
    """Starts games until the board has both: a listed word and a text that is none."""
    listed = listed_words()
    while True:
        program.press("Quorle", "Start game")
        board = wait_for("letters on the board", program.board)
        texts = list(traced_words(board, 4))
        known = [text for text in texts if text in listed]
        if known:
            return known[0], next(text for text in texts if text not in listed)


def enter(program, word):
    type_text(word)
    press("Return")
    wait_for(f"{word} in the word list", lambda: word in program.words("Quorle", "Your words"))


def play_and_correct(executable):
    news = News()
    program = Program(executable)
    xdotool("search", "--onlyvisible", "--class", "^quorle$")  # what the desktop file names
    known, unknown = choose_words(program)
    enter(program, known)
    enter(program, unknown)
    for said in ("right. 1 word entered", "not in dictionary. 2 words entered"):
        wait_for(f"'{said}' told to a screen reader", lambda said=said: news.has(said))
    program.press("Quorle", "End game")
    results = "Gorvat Results"
    assert program.words(results, "Your words") == [known]
    assert program.words(results, "Not in dictionary") == [unknown]
    assert known in program.words(results, "Quorle's words")
    program.click(program.control(results, unknown))
    program.press(results, "Add to dictionary")
    wait_for("the corrected word",
             lambda: unknown in program.words(results, "Quorle's words")
             and unknown in program.words(results, "Your words"))
    time.sleep(2.2)  # OK does nothing in the first two seconds
    program.press(results, "OK")
    program.leave("Yes")
    return unknown


def find_again(executable, word):
    program = Program(executable)
    assert word in program.browse(word[:2])
    program.leave()


def main(executable):
    dictionary = Path.home() / ".local/share/quorle/Dictionary.dat"
    assert not dictionary.exists()
    word = play_and_correct(executable)
    assert dictionary.is_file()
    find_again(executable, word)
    print(f"'{word}' was played, corrected, saved and found again")


main(sys.argv[1])
