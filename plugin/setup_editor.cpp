#include "plugin/setup_editor.h"

#include <algorithm>

#include "pages/gridbay_doc.h"
#include "pages/page_factory.h"

namespace gridbay {
namespace {

struct Cover {
  std::int32_t id;
  const char* text;
};

constexpr Cover kCovers[] = {
    {1,
     "A setup is everything that a simulation needs. Work through the basic parameters first: the areas and "
     "their grids, "
     "then the period, the open boundaries and the sources. Then give the conditions of the flow. Check the "
     "setup with "
     "Validate before you start it."},
    {2,
     "What every model has. Begin with the bathymetry: it gives the grids that all else lies on. Then set "
     "the simulation "
     "period, see to the open boundaries, place sources and sinks, and set the depths of flooding and "
     "drying."},
    {3,
     "What is dissolved or suspended in the water: the components, where they start from, what comes in at "
     "boundaries and "
     "sources, how they spread and decay."},
    {4,
     "The flow itself: how it starts, what drives it at the open boundaries, what flows in at the sources, "
     "resistance and "
     "structures, and last the results to keep."},
    {5, "Fractions of mud in the water and layers of it in the bed."},
    {6, "Mud in the water and in the bed."},
    {7, "The ecological model: its definition, its state variables and what they depend on."},
    {42, "Weirs, culverts and dikes. Each is a named line that the engine places on the grid."},
    {61, "The bed: its layers, and how they erode, slide and change the depth."},
    {115, "How the state variables are carried and spread by the flow."},
};

class Editor final : public SetupEditor {
 public:
  explicit Editor(SetupHost& host) : document_(host), tree_(document_.enumerator()) {
    tree_.OnInitialUpdate(&document_.root());
    document_.AddView(this, [this] { update(); });
  }

  bool open(const std::string& path) override {
    if (!document_.OnOpenDocument(path)) return false;
    tree_.OnInitialUpdate(&document_.root());
    update();
    return true;
  }
  bool save(const std::string& path) override { return document_.OnSaveDocument(path); }
  std::string path() const override { return document_.path(); }
  std::string fileKind() const override { return document_.fileKind(); }
  bool isModified() const override { return document_.IsModified(); }

  std::vector<Item> items() const override {
    std::vector<Item> items;
    for (const TreeItem& item : tree_.items())
      items.push_back({item.id, item.caption, item.depth, tree_.IsVisible(item)});
    return items;
  }
  Form* openPage(std::int32_t id) override {
    std::string topic;
    std::string local;
    page_ = makePage(document_.enumerator().GetPageClass(id, &topic, &local), document_);
    return page_ == nullptr ? nullptr : &page_->form();
  }
  void refreshPage() override {
    if (page_ != nullptr) page_->SetData();
  }
  std::string cover(std::int32_t id) const override {
    const auto* found = std::ranges::find(kCovers, id, &Cover::id);
    return found != std::end(kCovers)
               ? found->text
               : "This page is not a part of this version yet. What a setup holds of it "
                 "is not edited here.";
  }

  std::vector<Command> commands() const override {
    std::vector<Command> commands;
    commands.reserve(CGridbayDoc::kCommands.size());
    for (const DocCommand& command : CGridbayDoc::kCommands) {
      commands.push_back({command.id, std::string(command.text), document_.IsChecked(command.id)});
    }
    return commands;
  }
  bool command(int id) override { return document_.OnCommand(id); }
  void setUnitSystem(UnitSystem system) override {
    document_.units().setSystem(system);
    refreshPage();
    update();
  }
  void onChange(std::function<void()> changed) override { changed_ = std::move(changed); }

 private:
  void update() {
    tree_.OnUpdate(&document_.root());
    if (changed_) changed_();
  }

  CGridbayDoc document_;
  CNavigationView tree_;
  std::unique_ptr<CV27SetupFormView> page_;
  std::function<void()> changed_;
};

}  // namespace

std::unique_ptr<SetupEditor> makeSetupEditor(SetupHost& host) {
  return std::make_unique<Editor>(host);
}

}  // namespace gridbay
