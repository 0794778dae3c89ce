#pragma once
// The groups of rows. Each checks that engine and rivals agree before it adds what is timed.
#include <memory>

#include "inputs.h"
#include "table.h"
#include "usual_way.h"

void AddBoardRows(const WordList& words);
/// Searches as processors without wide registers make them.
void AddPlainSearch(const Row& row, const std::vector<std::string>& boards,
                    const std::string& dictionary, const std::shared_ptr<UsualWay>& usual);
void AddFileRows(const WordList& words);
void AddLookupRows(const WordList& words);
void AddEditRows(const WordList& words);

/// Ends the run when engine and rival do not agree.
void Require(bool agreed, const char* about);
