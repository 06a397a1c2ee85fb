#include "core/global_kvs.h"

#include <vector>

#include "basic/area_description.h"
#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/mass_budget.h"
#include "basic/simulation_period.h"
#include "basic/source_sink.h"
#include "core/module_selection.h"
#include "hydrodynamic/boundary.h"

namespace gridbay {
namespace {

constexpr std::string_view kOptionParameters = "OPTION_PARAMETERS";
constexpr std::int32_t kAnyModule = -1;

// A part of the skeleton: the sections that the root opens around it, as a path, and what stands there.
struct Row {
  enum class What { child, options, sectionOnly, zeroKeyword };

  What what;
  std::string_view place;
  std::int32_t module = kAnyModule;  // the module code that this row takes part with
  std::string_view keyword = {};
  void (*create)(CGlobalKvs&) = nullptr;
  CKvsBase& (*object)(CGlobalKvs&) = nullptr;
};

template <auto member>
void createChild(CGlobalKvs& root) {
  using Child = typename std::remove_reference_t<decltype(root.*member)>::element_type;
  root.*member = std::make_unique<Child>(&root);
}

template <auto member>
CKvsBase& childOf(CGlobalKvs& root) {
  return *(root.*member);
}

template <auto member>
constexpr Row child(std::string_view place, std::int32_t module = kAnyModule) {
  return {Row::What::child, place, module, {}, createChild<member>, childOf<member>};
}

// The engine's options, which the editor does not know and must not lose.
constexpr Row options(std::string_view place, std::int32_t module = kAnyModule) {
  return {Row::What::options, place, module};
}

constexpr Row sectionOnly(std::string_view place, std::int32_t module = kAnyModule) {
  return {Row::What::sectionOnly, place, module};
}

constexpr Row zeroKeyword(std::string_view place, std::int32_t module, std::string_view keyword) {
  return {Row::What::zeroKeyword, place, module, keyword};
}

using G = CGlobalKvs;

// The order of the file, and of a load.
constexpr Row kSkeleton[] = {
    options("NESTED_MODEL_GLOBALS"),
    child<&G::moduleSelection>("NESTED_MODEL_GLOBALS"),
    child<&G::bathymetry>("NESTED_MODEL_GLOBALS"),
    child<&G::boundary>("NESTED_MODEL_GLOBALS"),
    child<&G::sourceSink>("NESTED_MODEL_GLOBALS"),
    child<&G::areaDescription>("NESTED_MODEL_GLOBALS"),
    child<&G::simulationPeriod>("NESTED_MODEL_GLOBALS"),
    child<&G::massBudget>("NESTED_MODEL_GLOBALS"),

    options("HYDRODYNAMIC_MODULE"),
    child<&G::nhdBoundary>("HYDRODYNAMIC_MODULE"),
    sectionOnly("HYDRODYNAMIC_MODULE/STRUCTURE_MODULE"),
    sectionOnly("HYDRODYNAMIC_MODULE/STRUCTURES"),

    options("ADVECTION_DISPERSION_MODULE"),
    zeroKeyword("ADVECTION_DISPERSION_MODULE/Cohesive_Sediment_Conditions", module::kAdvectionDispersion,
                "No_of_Sediment_Fractions"),

    options("MUD_TRANSPORT_MODULE"),
    sectionOnly("MUD_TRANSPORT_MODULE/MT_PARAMETERS", module::kMudTransport),

    options("MUD_TRANSPORT_EXPANDED_MODULE"),
    sectionOnly("MUD_TRANSPORT_EXPANDED_MODULE/FORCING_FUNCTIONS/WAVE_DATA", module::kMudTransportExpanded),
    sectionOnly("MUD_TRANSPORT_EXPANDED_MODULE/FORCING_FUNCTIONS/DREDGING", module::kMudTransportExpanded),
    sectionOnly("MUD_TRANSPORT_EXPANDED_MODULE/Watercoloumn_Parameters/FALL_VELOCITY_PARAMETERS",
                module::kMudTransportExpanded),
    sectionOnly("MUD_TRANSPORT_EXPANDED_MODULE/BED_PARAMETERS/EROSION_COEFFICIENTS",
                module::kMudTransportExpanded),
    sectionOnly("MUD_TRANSPORT_EXPANDED_MODULE/BED_PARAMETERS/SLIDING", module::kMudTransportExpanded),
    // Saved in here, but looked for at the top of the source: so its options come through only from there.
    options("MUD_TRANSPORT_EXPANDED_MODULE/XENOBIOTIC_MODULE", module::kMudTransportExpanded),

    options("BIO_RIG_MODULE"),
    sectionOnly("BIO_RIG_MODULE/AD_TRANSPORT_PARAMETERS", module::kEcological),
};

// A step of the whole-model check.
struct Check {
  CKvsBase& (*object)(CGlobalKvs&);
};

constexpr Check kChecks[] = {
    {childOf<&G::bathymetry>},  {childOf<&G::areaDescription>}, {childOf<&G::simulationPeriod>},
    {childOf<&G::boundary>},    {childOf<&G::sourceSink>},      {childOf<&G::massBudget>},
    {childOf<&G::nhdBoundary>},
};

std::vector<std::string_view> partsOf(std::string_view place) {
  std::vector<std::string_view> parts;
  for (std::size_t start = 0; start <= place.size();) {
    const std::size_t end = std::min(place.find('/', start), place.size());
    parts.push_back(place.substr(start, end - start));
    start = end + 1;
  }
  return parts;
}

KvsSection findPlace(KvsSection from, std::string_view place) {
  for (const std::string_view part : partsOf(place)) {
    if (from != nullptr) from = kvsSectionByNameNum(from, part, 1);
  }
  return from;
}

// The cursor of a file in writing, moved from place to place with no more closing and opening than it takes.
class PlaceCursor {
 public:
  explicit PlaceCursor(KvsFile& file) : file_(file) {}

  void moveTo(std::string_view place) {
    const std::vector<std::string_view> wanted = partsOf(place);
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

 private:
  KvsFile& file_;
  std::vector<std::string_view> open_;
};

void passOptionsThrough(std::string_view place, KvsSection sourceTarget, KvsFile& file) {
  kvsAddSection(file, kOptionParameters);
  const KvsSection section =
      sourceTarget == nullptr ? nullptr : kvsSectionByNameNum(sourceTarget, partsOf(place).back(), 1);
  const KvsSection optionSection =
      section == nullptr ? nullptr : kvsSectionByNameNum(section, kOptionParameters, 1);
  if (optionSection != nullptr) CKvsBase::CopySection(optionSection, file);
  kvsEndSection(file);
}

}  // namespace

CGlobalKvs::CGlobalKvs(MessageHost* host) : CKvsBase(nullptr), host_(host) {
  for (const Row& row : kSkeleton) {
    if (row.create != nullptr) row.create(*this);
  }
  // Counts reach their followers through the root, and so come when all parts are there.
  bathymetry->SetNoAreas(1);
}

CGlobalKvs::~CGlobalKvs() = default;

unsigned CGlobalKvs::Validate(ValidationList& messages, int deep) {
  if (deep == 0) return 0;
  unsigned faults = 0;
  for (const Check& check : kChecks) faults += check.object(*this).Validate(messages, deep);
  return faults;
}

void CGlobalKvs::Save(KvsFile& file, const std::string& documentPath) {
  const KvsSection sourceTarget =
      sourceFile_ == nullptr ? nullptr : kvsTargetByNameNum(*sourceFile_, kTarget, 1);
  kvsAddTarget(file, kTarget);
  PlaceCursor cursor(file);
  for (const Row& row : kSkeleton) {
    if (row.module != kAnyModule && row.module != moduleSelection->simulationType) continue;
    cursor.moveTo(row.place);
    switch (row.what) {
      case Row::What::child:
        row.object(*this).Save(file, documentPath);
        break;
      case Row::What::options:
        passOptionsThrough(row.place, sourceTarget, file);
        break;
      case Row::What::zeroKeyword:
        kvsPutParam(file, row.keyword, 0);
        break;
      case Row::What::sectionOnly:
        break;
    }
  }
  cursor.closeTo(0);
  kvsEndSection(file);
}

void CGlobalKvs::Load(KvsSection file, const std::string& documentPath) {
  const KvsSection target = kvsSectionByNameNum(file, kTarget, 1);
  if (target == nullptr) return;
  for (const Row& row : kSkeleton) {
    if (row.what != Row::What::child) continue;
    if (row.module != kAnyModule && row.module != moduleSelection->simulationType) continue;
    if (const KvsSection section = findPlace(target, row.place); section != nullptr) {
      row.object(*this).Load(section, documentPath);
    }
  }
}

std::vector<CKvsBase*> CGlobalKvs::parts() {
  std::vector<CKvsBase*> parts;
  for (const Row& row : kSkeleton) {
    if (row.what == Row::What::child) parts.push_back(&row.object(*this));
  }
  return parts;
}

void CGlobalKvs::ShowMessage(const std::string& text) {
  if (host_ != nullptr) host_->show(text);
}

}  // namespace gridbay
