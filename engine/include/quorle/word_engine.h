/* The word engine: one dictionary of lower-case words, the search for all of
 * its words on a board, and a small settings store, as flat C functions.
 *
 * Conventions
 * 1. A word is 2 to 16 letters "a" to "z". Letters are also passed as indexes
 *    0 ("a") to 25 ("z").
 * 2. Strings passed in are NUL-terminated 8-bit text, owned by the caller and
 *    not kept. A path is a file name as the operating system takes it.
 * 3. Words and values passed out are letters alone: no terminator is written,
 *    the length is returned beside them. The caller owns every buffer.
 * 4. A function that can fail returns 1 for done and 0 for not done. A null
 *    pointer or a value out of range changes nothing and returns the
 *    function's "nothing" value. Nothing prints, aborts or throws.
 * 5. Files are replaced whole: after any fault the old or the new content
 *    stands. Only regular files are read or replaced.
 * 6. Integers are 32-bit signed unless marked. The functions are for one
 *    thread.
 */
#ifndef QUORLE_WORD_ENGINE_H
#define QUORLE_WORD_ENGINE_H

#include <stdint.h>

#if defined(__GNUC__)
#define QUORLE_ENGINE_API __attribute__((visibility("default")))
#else
#define QUORLE_ENGINE_API
#endif

#ifdef __cplusplus
extern "C" {
#endif

/* ---- The dictionary and its file ---------------------------------------- */

/* Loads the dictionary at `path` and takes its maximum word size; the minimum
 * stays. 0 when the file is missing, damaged, no dictionary or no regular
 * file: the dictionary and limits held before stay (at first: empty, 3, 16). */
QUORLE_ENGINE_API int32_t cReadBinaryDictionary(const char* path);

/* Saves every word and the maximum word size. 0 when that failed; `path` then
 * holds its old content (or the new, where only the folder's sync failed).
 * The form of the file is version 1 of FILE_FORMAT.md; only that is read.
 *
 * A file that cReadBinaryDictionary could not read is not lost when it is
 * replaced: before, it gets a second name, PATH.damaged, or PATH.damaged.2 and
 * so on, never that of an earlier one, and at no moment neither name stands. */
QUORLE_ENGINE_API int32_t cWriteBinaryDictionary(const char* path);

/* `*found` becomes 1 when `word` is held, else 0; `*other` becomes 1 when some
 * word begins with it (a held word begins with itself), else 0. Returns
 * `*found`. Any text may be asked about; `word` is not changed. With a null
 * out-pointer nothing is written and 0 returned. */
QUORLE_ENGINE_API int32_t cDictionaryCheck(char* word, int32_t* found, int32_t* other);

/* Adds a word. 1 also when it is held already; 0 when it is not a word or has
 * more letters than the maximum word size. */
QUORLE_ENGINE_API int32_t cDictionaryAdd(const char* word);

/* Removes a word. 0 when it is not held. */
QUORLE_ENGINE_API int32_t cDictionaryRemove(const char* word);

/* Removes every word; the limits stay. Always 1. */
QUORLE_ENGINE_API int32_t cDictionaryClear(void);

/* The number of words held. */
QUORLE_ENGINE_API int32_t cNumberOfWords(void);

/* ---- Listing ------------------------------------------------------------- */

/* The index, in alphabetical order from 0, of the first word that begins with
 * the two letters (0..25 each), or -1 when there is none. */
QUORLE_ENGINE_API int32_t cDictIndex(int32_t first, int32_t second);

/* Begins a listing of the words with that prefix, in the dictionary as it is
 * now; later changes do not disturb it. 1, also when there are none. Letters
 * out of range: 0, and a running listing goes on. */
QUORLE_ENGINE_API int32_t cStartDecodingWords(int32_t first, int32_t second);

/* Writes the listing's next word, in alphabetical order, to `buffer` (room for
 * 16 letters) and returns its length, 2..16; 0 at the end, `buffer` unchanged. */
QUORLE_ENGINE_API int16_t cDecodeNextWord(char* buffer);

/* ---- Word files ---------------------------------------------------------- */

/* Merges a text file of words into the dictionary, a step a call, each of at
 * most about 8 ms. Returns the percentage done: 0..99, never falling, then 100
 * once the words are in. Go on with the text "dummy" while it is below 100.
 *
 * While a merge steps, any other path (not null) is put in line behind it, once
 * for each call, and the call counts as a step; 100 comes when the last file
 * of the line is in, and a file missing by then is passed over. With nothing
 * stepping, "dummy", null and a path that is no readable regular file are 100
 * at once.
 *
 * Words stand between ASCII white space; capitals become lower case. A token
 * with any other character, or of less than 2 letters or more than the maximum
 * word size, is left out whole. A UTF-8 byte-order mark is passed over. The
 * dictionary changes once for each file, at its end; edits made meanwhile
 * count at once and are kept. */
QUORLE_ENGINE_API int32_t cReadTextFile(const char* path);

/* Writes every word, in alphabetical order, one a line ended by LF. */
QUORLE_ENGINE_API int32_t cWriteTextFile(const char* path);

/* ---- Board search -------------------------------------------------------- */

/* Finds every word within the limits on a 4 by 4 board of touching cubes, each
 * cube used at most once a word, and returns their number. `board`: 16 letters
 * "a" to "z" row by row, "q" standing for the Qu cube; anything else is a
 * search with 0 words. The Qu cube is "qu", or a "q" that ends the word. */
QUORLE_ENGINE_API int32_t cCheckForAllDefinedWords(const char* board);

/* Writes word `i` (0 to the number less one, alphabetical) of the last search
 * to `buffer` (room for 16 letters) and its length to `*n`, and returns 1.
 * `i` out of range: `*n` becomes 0, returns 0. Results stay as found, whatever
 * happens to the dictionary or the limits, until the next search. */
QUORLE_ENGINE_API int32_t cGetDefinedWord(int32_t i, char* buffer, int32_t* n);

/* ---- Word-size limits ---------------------------------------------------- */

/* The shortest and the longest word that counts on a board, 2..16. The longest
 * is also the longest that the dictionary takes in. */
QUORLE_ENGINE_API int32_t cMinWordSize(void);
QUORLE_ENGINE_API int32_t cMaxWordSize(void);

/* Sets a limit, 2..16; anything else is refused. A minimum over the maximum is
 * accepted: no word is then within the limits. A lowered maximum removes no
 * word by itself. */
QUORLE_ENGINE_API int32_t cSetMinWordSize(int32_t size);
QUORLE_ENGINE_API int32_t cSetMaxWordSize(int32_t size);

/* Removes every word longer than the maximum word size. 0 when memory runs
 * out; all words then stay. */
QUORLE_ENGINE_API int32_t cReduceWordSize(void);

/* ---- Settings ------------------------------------------------------------ */

/* Settings are texts under a key path and a value name, kept for the user in
 * $XDG_CONFIG_HOME/quorle/settings (~/.config when unset, empty or relative).
 * Key and name: 1..255 bytes without control characters. */

/* `*n`: in, the room in `buffer`; out, the number of characters written there.
 * Absent, unreadable or too long for the room: `*n` is 0, `buffer` unchanged.
 * Returns 1 when the value is there, else 0. */
QUORLE_ENGINE_API int32_t cGetRegValue(const char* key, const char* name, char* buffer, int32_t* n);

/* Stores the first `length` bytes of `text`: 0..255, no control characters.
 * 0 when refused or when the file could not be replaced. */
QUORLE_ENGINE_API int32_t cSetRegValue(const char* key, const char* name, const char* text,
                                       int32_t length);

#ifdef __cplusplus
}
#endif

#endif
