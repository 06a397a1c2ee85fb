#include "ecology/model_definition_page.h"

#include "ecology/ecology_parts.h"
#include "ecology/model_definition.h"
#include "ecology/page_texts.h"
#include "platform/files/paths.h"

namespace gridbay {
namespace {

using Definition = CWQSModelDefinitionKvs;

constexpr PageId kAdTransport{115};

// The pages whose values go with the model.
constexpr PageId kDependent[] = {
    PageId::ecoStartingConditions,
    PageId::ecoStateVariables,
    PageId::ecoInitialConditions,
    kAdTransport,
    PageId::ecoBoundary,
    PageId::ecoDispersion,
    PageId::ecoSourceSink,
    PageId::ecoPrecipitation,
    PageId::ecoEvaporation,
    PageId::ecoInfiltration,
    PageId::ecoDeposition,
    PageId::ecoConstants,
    PageId::ecoForcings,
    PageId::ecoMassBudget,
    PageId::ecoResults,
};

struct Count {
  const char* label;
  CSolverItem::Kind kind;
};
constexpr Count kCounts[] = {
    {"State Variables", CSolverItem::kStateVariable},
    {"Constants", CSolverItem::kConstant},
    {"Forcings", CSolverItem::kForcing},
    {"Auxiliary Variables", CSolverItem::kAuxiliaryVariable},
    {"Processes", CSolverItem::kProcess},
    {"Derived Outputs", CSolverItem::kDerivedOutput},
};

}  // namespace

void CWQSModelDefinitionDlg::DoDataExchange(Form& form) {
  const auto model = objectOf(&EcologyParts::wqsModelDefinition);
  const auto fromFile = [this] { return isFromFile(); };

  form.Group("Model Selection", [&] {
    // The two controls show one thing: only the one that the user has changed is stored.
    modelList_ = &form.List("Model", [this] { return models(); },
                            {.get = [this] { return std::optional<std::int32_t>(chosenPlace()); },
                             .set =
                                 [this, &form](std::int32_t place) {
                                   if (form.acting() == modelList_) choosePlace(place);
                                 }});
    Control& file = form.Text("File", {.get = [model] { return std::optional(model().modelFile.text()); },
                                       .set =
                                           [this, &form](const std::string& name) {
                                             if (form.acting() == fileEdit_) typeFile(name);
                                           }});
    fileEdit_ = &file;
    file.isFile = true;
    file.EnabledIf(fromFile);
    form.Button("...", [this] { browse(); }).Beside().EnabledIf(fromFile);
    form.Shown("Problem", [model] { return model().definition().fault; }).VisibleIf([model] {
      return !model().definition().fault.empty();
    });
  });
  form.Group("Summary", [&] {
    for (const auto& [label, kind] : kCounts)
      form.Shown(label, [model, declared = kind] { return std::to_string(model().items(declared).size()); });
  });
  form.Group("Solution Parameters", [&] {
    form.List("Integration Method", Choices::numbered({"Euler", "RK4", "RKQC"}, Definition::kEuler), model,
              &Definition::integration);
    form.Number("Update Frequency", model, &Definition::frequency);
    form.Shown("(in AD time steps)", [] { return std::string(); }).Beside();
  });
  form.Check("Disable Processes (AD Transport only)", model, &Definition::disableProcesses);
}

Choices CWQSModelDefinitionDlg::models() {
  std::vector<std::string> names;
  for (const ModelTemplate& found : parts<EcologyParts>().wqsModelDefinition->templates())
    names.push_back(found.name);
  return Choices::numbered(names);
}

int CWQSModelDefinitionDlg::chosenPlace() {
  Definition& model = *parts<EcologyParts>().wqsModelDefinition;
  const std::vector<ModelTemplate>& templates = model.templates();
  const int last = static_cast<int>(templates.size()) - 1;
  if (fromFile_) return last;
  const std::string file = model.modelFile.absolute();
  for (int place = 0; place < last; ++place) {
    if (sameName(templates[static_cast<std::size_t>(place)].path, file)) return place;
  }
  return last;
}

bool CWQSModelDefinitionDlg::isFromFile() {
  return chosenPlace() + 1 == static_cast<int>(parts<EcologyParts>().wqsModelDefinition->templates().size());
}

// "From File ..." alone changes nothing yet: the model stays until a file is named.
void CWQSModelDefinitionDlg::choosePlace(int place) {
  const std::vector<ModelTemplate>& templates = parts<EcologyParts>().wqsModelDefinition->templates();
  if (place < 0 || place >= static_cast<int>(templates.size())) return;
  const std::string path = templates[static_cast<std::size_t>(place)].path;
  fromFile_ = path.empty();
  if (fromFile_ || chosenPlace() == place) return;
  UFileName file;
  file.Set(path, document().path());
  take(file);
}

void CWQSModelDefinitionDlg::typeFile(const std::string& name) {
  if (name == parts<EcologyParts>().wqsModelDefinition->modelFile.text()) return;
  UFileName file;
  file.Set(name, document().path());
  if (isReadableFile(file.absolute())) {
    fromFile_ = true;
    take(file);
  } else {
    document().host().show(formatted(texts::cannotAccessFile, name));
  }
}

void CWQSModelDefinitionDlg::browse() {
  std::string name = parts<EcologyParts>().wqsModelDefinition->modelFile.text();
  if (!document().host().chooseFile(texts::modelFile.filter, texts::modelFile.extension, &name)) return;
  UFileName file;
  file.Set(name, document().path());
  fromFile_ = true;
  SetEditName("File");
  take(file);
  UpdateDoc();
  SetEditName({});
}

void CWQSModelDefinitionDlg::take(const UFileName& file) {
  Definition& model = *parts<EcologyParts>().wqsModelDefinition;
  document().host().doLongWork(texts::readingModel.format, [&](const Progress&) { model.Choose(file); });
  for (const PageId page : kDependent) document().UnTouch(page);
}

}  // namespace gridbay
