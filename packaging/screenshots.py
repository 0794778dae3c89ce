"""Plays a little and takes the pictures.  screenshots.py PROGRAM FOLDER"""

import subprocess
import sys
import time

from desktop_player import Program, listed_words, press, traced_words, type_text, wait_for, xdotool


def picture(title, path):
    xdotool("mousemove", 2700, 1500)
    time.sleep(1)
    windows = subprocess.run(["xdotool", "search", "--onlyvisible", "--name", f"^{title}$"],
                             check=True, capture_output=True, text=True).stdout.split()
    subprocess.run(["import", "-window", windows[-1], "-strip", path], check=True)


def good_board(program):
    """Starts games until a listed word of six letters is on the board; the words on it."""
    listed = listed_words()
    while True:
        program.press("Quorle", "Start game")
        board = wait_for("letters on the board", program.board)
        words = {length: sorted(set(traced_words(board, length)) & listed)
                 for length in (4, 5, 6)}
        if words[6] and len(words[5]) >= 2 and len(words[4]) >= 5:
            unknown = next(text for text in traced_words(board, 4) if text not in listed)
            return words, unknown


def main(executable, folder):
    program = Program(executable, scale=2)
    words, unknown = good_board(program)
    for word in [*words[4][:4], unknown, *words[5][:2]]:
        type_text(word)
        press("Return")
        time.sleep(1)
    type_text(words[6][0])
    picture("Quorle", f"{folder}/board.png")

    press("Return")
    program.press("Quorle", "End game")
    program.click(program.control("Gorvat Results", words[6][0]))
    picture("Gorvat Results", f"{folder}/results.png")

    time.sleep(2)  # OK does nothing in the first two seconds
    program.press("Gorvat Results", "OK")
    program.browse("qu")
    picture("Dictionary Editor", f"{folder}/editor.png")
    program.leave()


main(*sys.argv[1:])
