#pragma once
// A dictionary file that could not be read may hold years of words that can still be rescued: it
// gets a second name, NAME.damaged (.damaged.2, .damaged.3 …), before a save replaces it.
#include <sys/stat.h>

#include <string>

namespace Quorle {

class SecondName {
  public:
    /// `name`: the file, within the open folder. False when no name could be given, and the file
    /// must not be replaced.
    bool give(int folder, const std::string& name, const struct stat& file);
    /// The file keeps its first name only, when it is not replaced after all.
    void takeBack() const;

  private:
    int folder_ = -1;
    std::string first_;
    std::string second_;
    bool isNew_ = false;
    bool isOnly_ = false;  // the file has moved to its second name
};

}  // namespace Quorle
