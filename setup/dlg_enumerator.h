#pragma once

#include <cstdint>
#include <span>
#include <string>
#include <string_view>

namespace gridbay {

// A place of the setup that has a caption, by its page id.
struct PageEntry {
  std::int32_t id;
  std::string_view caption;
  std::string_view pageClass;   // empty for an item without a page
  std::int32_t templateId;      // 0 for an item without a page
  std::string_view grids = {};  // the classes of the page's grids, between commas
};

// The one table that turns a page id into its caption, its page class and its help.
class CDlgEnumerator {
 public:
  static constexpr std::int32_t kHighestId = 146;

  std::span<const PageEntry> pages() const;
  // Empty for an id that has none: the roots of the tree, whose captions the tree gives, and ids out of use.
  std::string_view GetCaption(std::int32_t id) const;
  // The page's class; empty for an item without one, whose pane shows the local page. The help topic and the
  // local page are those of an item without a page class, else empty.
  std::string_view GetPageClass(std::int32_t id, std::string* helpTopic, std::string* localPage) const;
  // The number of a page's own help topic; 0 for an item without a page class.
  std::int32_t GetHelpTopicNumber(std::int32_t id) const;

 private:
  const PageEntry* find(std::int32_t id) const;
};

}  // namespace gridbay
