#pragma once
// The board search for processors with wide registers: sixteen chains are extended at once, each
// in a lane of its own. It finds what the search one by one finds, on boards without a Qu cube,
// where chains of as many cubes have as many letters.
#if defined(__x86_64__)
#include <array>
#include <cstddef>
#include <cstdint>
#include <vector>

#include "found_words.h"
#include "hard_boards.h"
#include "letter_match.h"
#include "node_store.h"
#include "rank_set.h"
#include "search_order.h"

struct WideSearchTask {
    const std::uint32_t* nodes;
    NodeIndex root;
    CubeBits cubes;
    std::array<std::uint32_t, Cubes> touching;  // bit i: cube i touches the cube
    std::uint32_t minLetters;
    std::uint32_t maxLetters;
};

class WideSearch {
  public:
    /// Whether this machine can do it.
    static bool canRun();

    /// Appends the words found for the first time to `out`; `found` holds them then, too.
    void run(const WideSearchTask& task, RankSet& found, RecentChains& recent,
             std::vector<FoundWord>& out);

  private:
    static constexpr std::size_t Lanes = 16;
    // Each level takes what one block can grow to; whole registers are written at its end.
    static constexpr std::size_t Room = (Cubes + 1) * Block * MostTouching + Lanes;
    static constexpr std::size_t StepRoom = Block * MostTouching + 2 * Lanes;

    /// Chains that can go on, field by field.
    struct Chains {
        std::array<std::uint32_t, Room> node;
        std::array<std::uint32_t, Room> mask;       // of the node: letters that go on
        std::array<std::uint32_t, Room> firstWord;  // index of the first word below the node
        std::array<std::uint32_t, Room> low;        // the path's last eight cubes
        std::array<std::uint32_t, Room> high;       // those before them
        std::array<std::uint16_t, Room> used;       // bit i: cube i is in the chain
        std::array<std::uint16_t, Room> next;       // bit i: the chain can go on with cube i
    };
    struct Words {
        std::array<std::uint32_t, StepRoom> index;
        std::array<std::uint32_t, StepRoom> low;
        std::array<std::uint32_t, StepRoom> high;
        std::array<std::uint32_t, StepRoom> isNew;  // numbers of those found for the first time
    };
    /// What becomes of a block's chains, each with each cube that it can go on with.
    struct Steps {
        std::array<std::uint32_t, StepRoom> edge;  // where the letter's link stands
        std::array<std::uint64_t, StepRoom> link;  // and, in the higher half, what it skips
        std::array<std::uint32_t, StepRoom> node;
        std::array<std::uint32_t, StepRoom> mask;
        std::array<std::uint32_t, StepRoom> firstWord;
        std::array<std::uint32_t, StepRoom> low;
        std::array<std::uint32_t, StepRoom> high;
        std::array<std::uint32_t, StepRoom> used;
        std::array<std::uint32_t, StepRoom> around;  // cubes that touch the last one, not used
    };
    struct Parents;

    bool start();
    std::size_t extendBlock(std::size_t begin, std::size_t end, std::size_t to,
                            std::uint32_t letters);
    std::size_t listSteps(std::size_t begin, std::size_t end);
    std::size_t listCubes(std::size_t begin, std::size_t end);
    void joinCubes(const Parents& parents, std::size_t cubes, std::size_t step);
    void fetchLinks(std::size_t steps);
    std::size_t followLinks(std::size_t steps, bool isLongEnough);
    void fetchMasks(std::size_t steps);
    std::size_t keepChains(std::size_t steps, std::size_t to);
    std::size_t thinOut(std::size_t begin, std::size_t end, std::uint32_t letters);
    void moveChain(std::size_t from, std::size_t to);
    void keepNew(std::size_t count, std::uint32_t letters);

    WideSearchTask task_{};
    RankSet* found_ = nullptr;
    RecentChains* recent_ = nullptr;
    std::vector<FoundWord>* out_ = nullptr;
    std::array<Level<std::size_t>, Cubes + 2> levels_;
    Chains chains_;
    Words words_;
    Steps steps_;
    // The next cubes of sixteen chains, four bits for the chain and four for the cube.
    std::array<std::uint8_t, Lanes * Cubes + 64> cubes_;
};
#endif
