"""Plays a game by keys alone while Orca reads, and prints what Orca said in each
situation.  spoken_game.py PROGRAM"""

import re
import subprocess
import sys
import time
from pathlib import Path

from desktop_player import Program, listed_words, press, traced_words, type_text, wait_for

QUIET = 3  # seconds without a word after which a situation is over


class Reader:
    """Orca, its speech read from its log."""

    def __init__(self, log):
        self.log = log
        self.heard = 0
        quiet = {"stdout": subprocess.DEVNULL, "stderr": subprocess.DEVNULL}
        self.speech = subprocess.Popen(["speech-dispatcher", "--run-single", "--timeout", "0"],
                                       **quiet)
        time.sleep(1)
        self.process = subprocess.Popen(["orca", "--debug-file", str(log)], **quiet)
        wait_for("Orca's first words", self.lines)

    def stop(self):
        for process in (self.process, self.speech):
            process.kill()
            process.wait()

    def lines(self):
        if not self.log.exists():
            return []
        log = self.log.read_text(encoding="utf-8", errors="replace")
        return re.findall(r"SPEECH OUTPUT: '(.*)'(?: voice=\w+)?\s*\{", log)

    def news(self):
        """What was said since the last call, once it is quiet."""
        count, since = len(self.lines()), time.monotonic()
        while time.monotonic() - since < QUIET:
            time.sleep(0.1)
            if len(self.lines()) != count:
                count, since = len(self.lines()), time.monotonic()
        said = self.lines()[self.heard:]
        self.heard = count
        return said


class Player:
    """Acts by keys and prints what is heard."""

    def __init__(self, reader):
        self.reader = reader

    def hear(self, situation, *keys, text=None, after=()):
        if text:
            type_text(text)
        for key in (*keys, *after):
            press(key)
        print(f"| {situation} | {' / '.join(self.reader.news())} |", flush=True)

    def wait_for_words(self, situation, words, seconds):
        heard = self.reader.heard
        wait_for(words, lambda: any(words in line for line in self.reader.lines()[heard:]), seconds)
        self.hear(situation)


def good_board(program, player, situation):
    """Starts games until the board has a known word, an unknown one and a missing letter."""
    listed = listed_words()
    while True:
        player.hear(situation, "alt+s")
        board = wait_for("letters on the board", program.board)
        texts = list(traced_words(board, 4))
        known = sorted({text for text in texts if text in listed})
        missing = set("bcdfghjklm") - set("".join(board).lower())
        if len(known) > 1 and missing:
            return known, next(text for text in texts if text not in listed), missing.pop()


def play(program, player):
    player.hear("the program starts")
    known, unknown, missing = good_board(program, player, "Alt+S")
    player.hear("F2", "F2")
    player.hear("where am I", "KP_Enter")
    player.hear(f"typing {missing}, which is not on the board", text=missing)
    player.hear(f"a word: {known[0]}", "Return", text=known[0])
    player.hear("its letters typed again, and Enter", "Return", text=known[0])
    player.hear(f"unknown: {unknown}", "Return", text=unknown)
    player.hear("too short: two letters", "Return", text=known[1][:2])
    player.hear("Alt+C", "alt+c")
    player.hear("Alt+C", "alt+c")
    player.hear("F2 with words", "F2")
    player.hear("Alt+P", "alt+p")
    player.hear("Return", "Return")
    player.hear("Alt+E", "alt+e")


def look_at_results(player):
    player.hear("Tab to your words", "Tab")
    player.hear("Down on the only word", "Down")
    player.hear("Tab to the words not in the dictionary", "Tab")
    player.hear("Down on the only word", "Down")
    player.hear("Alt+A", "alt+a")
    player.hear("Tab, Tab to Quorle's words", "Tab", "Tab")
    player.hear("Down", "Down")
    player.hear("Down", "Down")
    player.hear("Shift+Tab and Tab: back to the selected word", "shift+Tab", "Tab")
    player.hear("Alt+R", "alt+r")
    player.hear("Return", "Return")


def change_options(player):
    player.hear("Alt+O", "alt+o")
    player.hear("Tab, Tab to Game Time", "Tab", "Tab")
    player.hear("2:00", text="2:00")
    player.hear("Tab to Max Word Size", "Tab")
    player.hear("Up", "Up")
    player.hear("Down", "Down")
    player.hear("Tab, Tab to Min Word Size", "Tab", "Tab")
    player.hear("Down", "Down")
    player.hear("Up", "Up")
    player.hear("OK", "Tab", "space")


def edit_dictionary(program, player):
    player.hear("Alt+D", "alt+d")
    player.hear("a new word: zzyzx", "Return", text="zzyzx")
    player.hear("to the prefixes", "Tab", "Tab")
    player.hear("Down", "Down")
    player.hear("Tab to the words", "Tab")
    player.hear("Down", "Down")
    player.hear("Alt+R", "alt+r")
    words = Path.home() / "words.txt"
    letters = "abcdefghijklmnopqrstuvwxyz"
    words.write_text("".join(f"qj{a}{b}{c}{d}\n" for a in letters for b in letters
                             for c in letters for d in letters))
    program.press("Dictionary Editor", "File")  # by mouse: Alt alone is not always heeded here
    player.hear("the File menu")
    player.hear("Down, Down", "Down", "Down")
    player.hear("Return", "Return")
    player.hear("the file's name", text=str(words))
    player.hear("Return", "Return")
    player.hear("a while later")
    player.hear("Escape", "Escape")


def read_help(player):
    player.hear("Alt+H", "alt+h")
    player.hear("Down", "Down")
    player.hear("Down", "Down")
    player.hear("Tab to a link", "Tab")
    player.hear("Tab", "Tab")
    player.hear("Return follows it", "Return")
    player.hear("Down", "Down")
    player.hear("Alt+F4", "alt+F4")


def let_time_run_out(player):
    player.hear("Alt+S", "alt+s")
    player.hear("Alt+S during a game", "alt+s")
    player.wait_for_words("a minute left", "1 minute left", 80)
    player.wait_for_words("30 seconds left", "30 seconds left", 40)
    player.wait_for_words("10 seconds left", "10 seconds left", 40)
    player.wait_for_words("time is up", "Time is up", 20)
    time.sleep(1)
    player.hear("Return", "Return")


def main(executable):
    reader = Reader(Path.home() / "orca.log")
    reader.news()
    program = Program(executable, always_on=False)
    player = Player(reader)
    print("| keys | Orca said |\n|---|---|")
    try:
        play(program, player)
        look_at_results(player)
        change_options(player)
        edit_dictionary(program, player)
        read_help(player)
        let_time_run_out(player)
        player.hear("Alt+X", "alt+x")
        player.hear("Tab, space: No", "Tab", "space")
        wait_for("the end of the program", lambda: program.process.poll() is not None)
    finally:
        program.process.kill()
        reader.stop()


main(*sys.argv[1:])
