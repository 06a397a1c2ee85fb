#include "pages/form_view.h"

#include <gtest/gtest.h>

#include "tests/support/pages.h"

namespace gridbay {
namespace pages_form_view_test {

class RadioPage final : public CV27SetupFormView {
 public:
  explicit RadioPage(CV27SetupDoc& document) : CV27SetupFormView(document, 1, PageId::bathymetry) {}
  void SetData() override {
    choice_ = 1;
    UpdateData(false);
  }
  int shownAtFirst = 0;
  int shownUnfilled = 0;

 protected:
  void DoDataExchange(Form& form) override { form.DDX_Radio("Choice", {"One", "Two"}, choice_); }
  int Initialize() override {
    shownAtFirst = form().find("Choice")->index;
    UpdateData(false);
    shownUnfilled = form().find("Choice")->index;
    return 1;
  }

 private:
  std::int32_t choice_ = -1;
};

TEST(FormView, ARadioGroupShowsNothingUntilThePageIsFilled) {
  test::TestHost host;
  CV27SetupDoc document(host);
  RadioPage page(document);
  page.OnInitialUpdate();
  EXPECT_EQ(page.shownAtFirst, -1);
  EXPECT_EQ(page.shownUnfilled, -1);
  EXPECT_EQ(page.form().find("Choice")->index, 1);
}

}  // namespace pages_form_view_test
}  // namespace gridbay
