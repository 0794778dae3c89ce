#include "state/game_state.h"

GameState State;
