#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <vector>

#include "pages/form.h"

namespace gridbay {

// Something that two setups hold differently, as their pages show it; or, where no page does, by its keyword.
struct Difference {
  std::int32_t page = 0;      // 0 where none shows it
  std::string pageName = {};  // with the root of the tree that it stands under
  std::string thing = {};     // "Drying depth", "Type, row 2"; a path; empty for a page as a whole
  // What each shows; nothing where it has no such thing.
  std::optional<std::string> own = {};
  std::optional<std::string> other = {};

  // Where on its page: a control by its label and number among those of that label; or a row and column (0
  // for the whole row) of the n-th table, from 1. What is shown for the current row of a table has that row.
  std::string label = {};
  int labelNumber = 0;
  int table = 0;
  int row = 0;
  int column = 0;
  int currentRow = 0;

  // The keywords that make it, by their paths, as far as they are known.
  std::vector<std::string> keywords = {};

  bool operator==(const Difference&) const = default;
};

// What two setups have each made into something else, with the one or the other to be chosen.
struct MergeQuestion {
  std::string path;
  std::int32_t page = 0;      // 0 where none shows it
  std::string pageName = {};  // with the root of the tree that it stands under
  std::string thing = {};     // "Drying depth", or the path
  // What each holds, in the words of the page where one shows it; nothing where it has no such thing.
  std::optional<std::string> base = {};
  std::optional<std::string> own = {};
  std::optional<std::string> other = {};
  bool takesOther = false;
};

// Two setups that have come from a third, on their way to one, which an open setup becomes. All of it is
// virtual, as a host links nothing of it. What takes long changes nothing here and hands back bytes, so that
// a copy of the process can do it.
class SetupMerging {
 public:
  virtual ~SetupMerging() = default;

  // Reads the setups: the one that two have come from, and these; for an empty `own` the open one as it is
  // now. What is found, for `start`, which tells what is wrong, or nothing.
  virtual std::string read(const std::string& base, const std::string& own,
                           const std::string& other) const = 0;
  virtual std::string start(const std::string& found) = 0;
  // Sections of the other setup that this version does not know, by their paths, and that the first has not
  // alike: they are left out.
  virtual const std::vector<std::string>& leftOut() const = 0;
  // What is to be chosen, by its paths, or in the words of the pages once these are worked out and taken.
  virtual std::vector<MergeQuestion>& questions() = 0;
  virtual std::string word() const = 0;
  virtual bool takeWords(const std::string& words) = 0;
  // Works out the result by what was chosen, for `finish`, which puts it in the place of the setup as one
  // step. What is wrong, or empty.
  virtual std::string make() const = 0;
  virtual std::string finish(const std::string& made) = 0;
};

// An open setup beside another one, which is never changed. As above, what takes long hands back bytes.
class SetupComparison {
 public:
  virtual ~SetupComparison() = default;

  // Reads the setup to compare with: what is read, for `open`, which tells what is wrong, or nothing when
  // nothing has been compared yet.
  virtual std::string read(const std::string& path) const = 0;
  virtual std::string open(const std::string& path, const std::string& read) = 0;
  virtual void close() = 0;
  virtual bool isOpen() const = 0;
  virtual std::string otherPath() const = 0;

  // Compares the setup as it is now: what is found, for `take`. That is false, and changes nothing, where it
  // is of a setup that has been edited since, or is nothing.
  virtual std::string compare() const = 0;
  virtual bool take(const std::string& found) = 0;
  // Whether what was taken last is of the setup as it is now.
  virtual bool isCurrent() const = 0;
  // All that differed when it was taken, in the order of the tree.
  virtual const std::vector<Difference>& differences() const = 0;
  // The other setup's page; null where it has none. Nothing on it can be used. It lives until the next call.
  virtual Form* openPage(std::int32_t id) = 0;
  // What the user sees is in other units.
  virtual void unitsChanged() = 0;

  // Makes a difference as the other setup has it; or all of a page; or all. One step each. To be called while
  // the differences are current. What is wrong, or empty.
  virtual std::string takeOver(std::size_t place) = 0;
  virtual std::string takeOverPage(std::int32_t id) = 0;
  virtual std::string takeOverAll() = 0;

  virtual SetupMerging& merging() = 0;
};

}  // namespace gridbay
