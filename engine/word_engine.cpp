#include "quorle/word_engine.h"
