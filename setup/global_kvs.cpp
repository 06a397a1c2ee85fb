#include "setup/global_kvs.h"

#include <algorithm>
#include <optional>

#include "setup/skeleton.h"

namespace gridbay {
namespace {

constexpr std::string_view kOptionParameters = "OPTION_PARAMETERS";

KvsSection findPlace(KvsSection from, std::string_view place) {
  for (const std::string_view section : sectionsOf(place)) {
    if (from != nullptr) from = kvsSectionByNameNum(from, section, 1);
  }
  return from;
}

// What is left of a path behind another one that it begins with, without the slash.
std::optional<std::string_view> behind(std::string_view path, std::string_view start) {
  if (path.size() < start.size() || !sameName(path.substr(0, start.size()), start)) return std::nullopt;
  if (path.size() == start.size()) return std::string_view();
  return path[start.size()] == '/' ? std::optional(path.substr(start.size() + 1)) : std::nullopt;
}

// The cursor of a file in writing, moved from place to place with no more closing and opening than it takes.
class PlaceCursor {
 public:
  explicit PlaceCursor(KvsFile& file) : file_(file) {}

  void moveTo(std::string_view place) {
    const std::vector<std::string_view> wanted = sectionsOf(place);
    std::size_t shared = 0;
    while (shared < open_.size() && shared < wanted.size() && open_[shared] == wanted[shared]) ++shared;
    closeTo(shared);
    for (; open_.size() < wanted.size(); open_.push_back(wanted[open_.size()])) {
      kvsAddSection(file_, wanted[open_.size()]);
    }
  }
  void closeTo(std::size_t depth) {
    for (; open_.size() > depth; open_.pop_back()) kvsEndSection(file_);
  }
  // The section that is open, by its own name.
  std::string_view name() const { return open_.back(); }

 private:
  KvsFile& file_;
  std::vector<std::string_view> open_;
};

// The options are looked for at the top of the source, by the name of the section that they stand in.
void passOptionsThrough(std::string_view name, KvsSection sourceTarget, KvsFile& file) {
  kvsAddSection(file, kOptionParameters);
  const KvsSection section = sourceTarget == nullptr ? nullptr : kvsSectionByNameNum(sourceTarget, name, 1);
  const KvsSection options =
      section == nullptr ? nullptr : kvsSectionByNameNum(section, kOptionParameters, 1);
  if (options != nullptr) CKvsBase::CopySection(options, file);
  kvsEndSection(file);
}

template <class... Rooms>
void createAll(CGlobalKvs& root) {
  (root.Rooms::create(root), ...);
}

}  // namespace

CGlobalKvs::CGlobalKvs(MessageHost* host) : ModelRoot(nullptr), host_(host) {
  createAll<BasicParts, HydrodynamicParts, StructureParts, AdvectionDispersionParts, MudTransportParts,
            MudTransportExpandedParts, EcologyParts>(*this);
  // Counts reach their followers through the root, and so come when all members are there.
  for (const auto setCount : startingCounts()) setCount(*this);
}

CGlobalKvs::~CGlobalKvs() = default;

unsigned CGlobalKvs::Validate(ValidationList& messages, int deep) {
  if (deep == 0) return 0;
  unsigned faults = 0;
  for (const CheckRow& row : checkingOrder()) {
    if (holds(row.condition, *this)) faults += row.object(*this).Validate(messages, deep);
  }
  return faults;
}

void CGlobalKvs::Save(KvsFile& file, const std::string& documentPath) {
  const KvsSection sourceTarget =
      sourceFile_ == nullptr ? nullptr : kvsTargetByNameNum(*sourceFile_, kTarget, 1);
  kvsAddTarget(file, kTarget);
  PlaceCursor cursor(file);
  bool isOut = false;
  for (const FileRow& row : savingOrder()) {
    const bool applies = holds(row.condition, *this);
    if (row.what == FileRow::What::place) {
      isOut = !applies;
      if (applies) cursor.moveTo(row.name);
    }
    if (isOut || !applies) continue;
    if (row.what == FileRow::What::child) row.object(*this).Save(file, documentPath);
    if (row.what == FileRow::What::options) passOptionsThrough(cursor.name(), sourceTarget, file);
    if (row.what == FileRow::What::zeroKeyword) kvsPutParam(file, row.name, 0);
  }
  cursor.closeTo(0);
  kvsEndSection(file);
}

void CGlobalKvs::Load(KvsSection file, const std::string& documentPath) {
  const KvsSection target = kvsSectionByNameNum(file, kTarget, 1);
  if (target == nullptr) return;
  KvsSection section = nullptr;
  for (const FileRow& row : loadingOrder()) {
    const bool applies = holds(row.condition, *this);
    if (row.what == FileRow::What::place) {
      section = applies ? findPlace(target, row.name) : nullptr;
    } else if (section != nullptr && applies) {
      row.object(*this).Load(section, documentPath);
    }
  }
}

void CGlobalKvs::AssignState(const CKvsBase& other) {
  auto& model = const_cast<CGlobalKvs&>(static_cast<const CGlobalKvs&>(other));
  for (const MemberRow member : members()) member(*this).AssignState(member(model));
}

bool CGlobalKvs::SameState(const CKvsBase& other) const {
  auto& self = const_cast<CGlobalKvs&>(*this);
  auto& model = const_cast<CGlobalKvs&>(static_cast<const CGlobalKvs&>(other));
  return std::ranges::all_of(members(),
                             [&](const MemberRow member) { return member(self).SameState(member(model)); });
}

bool CGlobalKvs::AccessPath(std::string_view path, PathAccess& access) {
  std::string_view place;
  bool isOut = false;
  for (const FileRow& row : savingOrder()) {
    const bool applies = holds(row.condition, *this);
    if (row.what == FileRow::What::place) {
      place = row.name;
      isOut = !applies;
      if (!isOut && access.what == PathAccess::What::look && behind(place, path)) access.isSection = true;
      if (access.isSection) return true;
    }
    if (row.what != FileRow::What::child || isOut || !applies) continue;
    const std::optional<std::string_view> rest = behind(path, place);
    if (rest && !rest->empty() && row.object(*this).AccessPath(*rest, access)) return true;
  }
  return false;
}

bool CGlobalKvs::KnowsSection(std::string_view path) {
  std::string_view place;
  bool isOut = false;
  for (const FileRow& row : savingOrder()) {
    if (row.what == FileRow::What::place) {
      place = row.name;
      isOut = !holds(row.condition, *this);
    }
    if (row.what != FileRow::What::options || isOut) continue;
    const std::string_view section = place.substr(place.rfind('/') + 1);
    const std::optional<std::string_view> rest = behind(path, section);
    if (rest && (rest->empty() || behind(*rest, kOptionParameters))) return true;
  }
  PathAccess access{.what = PathAccess::What::look, .onlySections = true};
  return AccessPath(path, access) && access.isSection;
}

std::vector<CKvsBase*> CGlobalKvs::children() {
  std::vector<CKvsBase*> children;
  for (const MemberRow member : members()) children.push_back(&member(*this));
  return children;
}

void CGlobalKvs::ShowMessage(const std::string& text) {
  if (host_ != nullptr) host_->show(text);
}

}  // namespace gridbay
