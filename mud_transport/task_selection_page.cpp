#include "mud_transport/task_selection_page.h"

#include "mud_transport/mud_transport_parts.h"
#include "mud_transport/task_selection.h"

namespace gridbay {
namespace {

using Task = CNmtTaskSelectionKvs;

constexpr int kMultiFraction = 0;  // the places of the tasks
constexpr int kMultiLayer = 1;
constexpr int kFirstCount = 3;  // of fractions or layers, in a task that has just been chosen

}  // namespace

// Salinity can only be chosen with layers here, though a file may have it with fractions too.
void CNmtTaskSelectionDlg::begin(bool isMultiFraction) {
  Task& task = *parts<MudTransportParts>().nmtTaskSelection;
  if (isMultiFraction == task.multiFraction) return;
  if (isMultiFraction) {
    task.SetFractions(kFirstCount);
    task.SetSalinity(false);
  } else {
    task.SetLayers(kFirstCount);
  }
}

void CNmtTaskSelectionDlg::DoDataExchange(Form& form) {
  const auto task = objectOf(&MudTransportParts::nmtTaskSelection);
  const auto isMultiFraction = [task] { return task().multiFraction; };
  const auto isMultiLayer = [task] { return !task().multiFraction; };
  // The count of a task, which is taken while that is the one.
  const auto count = [&](std::string_view label, std::int32_t Task::*held, void (Task::*set)(int),
                         const Control::Rule& isTask, int most, std::string_view limit) {
    form.Count(label,
               {.get = [task, held]() -> std::optional<std::int32_t> { return task().*held; },
                .set =
                    [task, held, set, isTask](std::int32_t n) {
                      if (isTask() && n != task().*held) (task().*set)(n);
                    }},
               most)
        .EnabledIf(isTask);
    form.Shown(limit, [] { return std::string(); }).Beside();
  };
  form.Group("Select task", [&] {
    Control& tasks =
        form.Radio("Task", Choices{{kMultiFraction, "Multi fraction"}, {kMultiLayer, "Multi layer"}},
                   {.get = [isMultiLayer]() -> std::optional<std::int32_t> { return isMultiLayer() ? 1 : 0; },
                    .set = [](std::int32_t) {}});
    // The counts that the page shows are those of the other task: the model gives the new ones.
    tasks.Changed([this, &tasks] {
      SetEditName(tasks.name());
      begin(tasks.index == kMultiFraction);
      UpdateDoc();
      SetEditName({});
    });
    count("Number of fractions:", &Task::fractions, &Task::SetFractions, isMultiFraction,
          Task::kMostFractions, "(Max 8)");
    count("Number of layers:", &Task::layers, &Task::SetLayers, isMultiLayer, Task::kMostLayers, "(Max 12)");
  });
  form.Group("Salinity", [&] {
    form.Check("Include salinity component",
               Binding<std::int32_t>{
                   .get = [task]() -> std::optional<std::int32_t> { return task().includeSalinity ? 1 : 0; },
                   .set = [task](std::int32_t on) { task().SetSalinity(on != 0); }})
        .EnabledIf(isMultiLayer);
  });
}

}  // namespace gridbay
