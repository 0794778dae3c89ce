#include <cstdio>
#include <cstdlib>

#include "rows.h"
#include "table.h"

void Require(bool agreed, const char* about) {
    if (agreed) return;
    std::fprintf(stderr, "engine and rival do not agree: %s\n", about);
    std::exit(1);
}

int main(int argc, char** argv) {
    const WordList words = ReadWordList("american-english-huge");
    Require(!words.empty(), "the list of wamerican-huge is not installed");
    // Memory first, while the process is young.
    AddEditRows(words);
    AddBoardRows(words);
    AddFileRows(words);
    AddLookupRows(words);
    RunRows(argc, argv);
}
