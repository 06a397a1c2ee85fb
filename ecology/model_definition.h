#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "core/table_kvs.h"
#include "ecology/model_definition_file.h"

namespace gridbay {

// A model that the user can choose from a list.
struct ModelTemplate {
  std::string path;  // empty for "From File ...", which is the last
  std::string name;
};

// The ecological model: a file of its own, which declares all that the lists of this module are made of. It
// is read anew on each load, and what it declares goes with the state.
class CWQSModelDefinitionKvs final : public TableKvs<CWQSModelDefinitionKvs> {
 public:
  enum Integration : std::int32_t { kEuler = 1, kRungeKutta4 = 2, kRungeKuttaQualityControlled = 3 };

  explicit CWQSModelDefinitionKvs(CKvsBase* parent);

  UFileName modelFile;
  std::int32_t integration = kEuler;
  std::int32_t frequency = 1;  // in time steps of the transport
  bool disableProcesses = false;

  static constexpr auto table() {
    using Self = CWQSModelDefinitionKvs;
    return keywords(section("MODEL_DEFINITION", ModelFileRow{{"Model_Definition_File", &Self::modelFile}},
                            keyword("Integration_Method", &Self::integration),
                            keyword("Update_Frequency", &Self::frequency),
                            keyword("Disable_Processes", &Self::disableProcesses)),
                    StateVariablesRow{});
  }

  // Reads the settings and then the model; the settings keep what the file lacks.
  void Load(KvsSection section, const std::string& documentPath) override;
  unsigned Validate(ValidationList& messages, int deep) override;

  // Reads the model, and has all lists that are made of it made anew: what the user had given there is lost.
  void Read();
  // The same for another file.
  void Choose(const UFileName& file) {
    modelFile = file;
    Read();
  }

  const ModelDefinition& definition() const { return *definition_; }
  const std::vector<CSolverItem>& items(CSolverItem::Kind kind) const { return definition_->items[kind]; }
  const std::vector<CSolverItem>& stateVariables() const { return items(CSolverItem::kStateVariable); }
  const std::vector<CSolverItem>& constants() const { return items(CSolverItem::kConstant); }
  const std::vector<CSolverItem>& forcings() const { return items(CSolverItem::kForcing); }
  const std::vector<CSolverItem>& auxiliaryVariables() const {
    return items(CSolverItem::kAuxiliaryVariable);
  }
  const std::vector<CSolverItem>& processes() const { return items(CSolverItem::kProcess); }
  const std::vector<CSolverItem>& derivedOutputs() const { return items(CSolverItem::kDerivedOutput); }
  const std::vector<std::int32_t>& transported() const { return definition_->transported; }
  const std::vector<const CSolverItem*>& outputItems() const { return definition_->outputItems; }

  // Declaration `number` of a kind, and that of the transported state variable `number`, from 1; null out of
  // range.
  const CSolverItem* item(CSolverItem::Kind kind, int number) const;
  const CSolverItem* StateVariable(int number) const { return item(CSolverItem::kStateVariable, number); }
  const CSolverItem* Constant(int number) const { return item(CSolverItem::kConstant, number); }
  const CSolverItem* Forcing(int number) const { return item(CSolverItem::kForcing, number); }
  const CSolverItem* Transported(int number) const;
  int GetNoStateVariables() const { return static_cast<int>(stateVariables().size()); }
  int GetNoTransported() const { return static_cast<int>(transported().size()); }

  // The models that come with the program, and behind them "From File ...". They are looked for once.
  const std::vector<ModelTemplate>& templates();
  // Looks for them in another folder.
  void FindTemplates(const std::string& folder);

 private:
  // A path that sets the file reads it, too.
  struct ModelFileRow : Keyword<CWQSModelDefinitionKvs, UFileName> {
    void set(CWQSModelDefinitionKvs& object, KvsSection from, const std::string& documentPath) const {
      load(object, from, documentPath);
      object.Read();
    }
    void copy(CWQSModelDefinitionKvs& object, const CWQSModelDefinitionKvs& other) const {
      object.modelFile = other.modelFile;
      object.definition_ = other.definition_;
    }
    static constexpr auto members() {
      return std::tuple(&CWQSModelDefinitionKvs::modelFile, &CWQSModelDefinitionKvs::definition_);
    }
  };
  // What the engine is told of the state variables. It is never read: the model's own file holds.
  struct StateVariablesRow {
    void save(const CWQSModelDefinitionKvs& object, KvsFile& file, const std::string& documentPath) const;
    void load(CWQSModelDefinitionKvs&, KvsSection, const std::string&) const {}
    void copy(CWQSModelDefinitionKvs&, const CWQSModelDefinitionKvs&) const {}
    static constexpr auto members() { return std::tuple(); }
    bool access(CWQSModelDefinitionKvs& object, std::string_view path, PathAccess& access) const;
  };

  std::shared_ptr<const ModelDefinition> definition_;
  std::vector<ModelTemplate> templates_;  // empty until they are asked for
};

// The definition that a part of the model belongs with; null where it stands in no whole model.
CWQSModelDefinitionKvs* modelDefinitionOf(CKvsBase& object);

}  // namespace gridbay
