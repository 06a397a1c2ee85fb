#include "setup/page_factory.h"

#include "basic/area_description_page.h"
#include "basic/bathymetry_page.h"
#include "basic/boundary_page.h"
#include "basic/mass_budget_page.h"
#include "basic/module_selection_page.h"
#include "basic/simulation_period_page.h"
#include "basic/source_sink_page.h"
#include "hydrodynamic/boundary_page.h"
#include "structures/dike_page.h"

namespace gridbay {
namespace {

template <class Page>
std::unique_ptr<CV27SetupFormView> make(CVdDoc& document) {
  return std::make_unique<Page>(document);
}

struct Entry {
  std::string_view pageClass;
  std::unique_ptr<CV27SetupFormView> (*make)(CVdDoc&);
};

constexpr Entry kPages[] = {
    {"CModuleSelectionDlg", make<CModuleSelectionDlg>},
    {"CBathymetryDlg", make<CBathymetryDlg>},
    {"CSimulationPeriodDlg", make<CSimulationPeriodDlg>},
    {"CBoundaryDlg", make<CBoundaryDlg>},
    {"CSourceSinkDlg", make<CSourceSinkDlg>},
    {"CAreaDescriptionDlg", make<CAreaDescriptionDlg>},
    {"CMassBudgetDlg", make<CMassBudgetDlg>},
    {"CNhdBoundaryDlg", make<CNhdBoundaryDlg>},
    {"CNHdDikeDlg", make<CNHdDikeDlg>},
};

}  // namespace

std::unique_ptr<CV27SetupFormView> makePage(std::string_view pageClass, CVdDoc& document) {
  for (const Entry& entry : kPages) {
    if (entry.pageClass != pageClass) continue;
    std::unique_ptr<CV27SetupFormView> page = entry.make(document);
    page->OnInitialUpdate();
    return page;
  }
  return nullptr;
}

}  // namespace gridbay
