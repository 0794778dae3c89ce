#pragma once
// The groups of rows. Each checks that engine and rivals agree before it adds what is timed.
#include "inputs.h"

void AddBoardRows(const WordList& words);
void AddFileRows(const WordList& words);
void AddLookupRows(const WordList& words);
void AddEditRows(const WordList& words);

/// Ends the run when engine and rival do not agree.
void Require(bool agreed, const char* about);
