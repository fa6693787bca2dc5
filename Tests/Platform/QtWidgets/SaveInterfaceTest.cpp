// SPDX-License-Identifier: Apache-2.0
// The interface resource of the save view, the view over the panes, and alerts over both.
#include <QLineEdit>
#include <QPointer>
#include <QSignalSpy>
#include <QWindow>

#include "Platform/QtWidgets/AlertLayer.h"
#include "Platform/QtWidgets/BarButton.h"
#include "Platform/QtWidgets/ModalLayer.h"
#include "Platform/QtWidgets/SlideOverlay.h"
#include "Tests/Platform/QtWidgets/QtFixture.h"

namespace kelvasi {
namespace {

using test::RowsController;
using testing::ElementsAre;
using testing::IsEmpty;

constexpr const char* resource = "KelvasiSaveViewController";

// A controller of the resource that notes which of its actions were used.
class Form : public ViewController, public TextFieldDelegate {
 public:
  explicit Form(std::unique_ptr<InterfaceBody> interface) : ViewController(std::move(interface)) {
    auto& parts = static_cast<InterfaceBody&>(body());
    for (const char* const action : {"savePressed", "cancelPressed", "backgroundTouched"})
      parts.setAction(action, [this, action] { used.emplace_back(action); });
    field().setDelegate(this);
  }
  ~Form() override { field().setDelegate(nullptr); }
  bool textFieldShouldReturn(TextField&) override {
    used.emplace_back("return");
    return letsFieldReturn;
  }
  TextField& field() const { return *static_cast<InterfaceBody&>(body()).textField("saveDescription"); }
  std::vector<std::string> used;
  bool letsFieldReturn = true;
};

class SaveInterfaceTest : public test::QtFixture {
 protected:
  Form& present() {
    showRows(3);
    form = std::make_unique<Form>(ui->loadInterface(resource));
    stack->presentModalViewController(*form, true);
    settle();
    return *form;
  }
  ~SaveInterfaceTest() override {
    if (stack) stack->dismissModalViewController(false);
  }
  QLineEdit& edit() const { return *the<QLineEdit>(); }
  BarButton* button(const QString& text) const {
    for (BarButton* const found : all<BarButton>()) {
      if (found->text() == text && found->isVisible()) return found;
    }
    return nullptr;
  }

  // A button that is pressed by its shortcut shows that it is down for a moment first.
  void awaitUses(std::size_t count) const {
    EXPECT_TRUE(QTest::qWaitFor([&] { return form->used.size() >= count; }, 60'000));
  }

  std::unique_ptr<Form> form;
};

TEST_F(SaveInterfaceTest, TheResourceHasItsPartsByName) {
  const auto interface = ui->loadInterface(resource);
  ASSERT_NE(interface, nullptr);
  EXPECT_NE(interface->tableView("saveContentTable"), nullptr);
  EXPECT_NE(interface->textField("saveDescription"), nullptr);
  EXPECT_EQ(interface->tableView("saveDescription"), nullptr);
  EXPECT_EQ(interface->textField("nothing"), nullptr);
  EXPECT_EQ(interface->textField("saveDescription"), interface->textField("saveDescription"));
}

TEST_F(SaveInterfaceTest, ThereIsNoOtherResource) {
  EXPECT_EQ(ui->loadInterface("KelvasiSaveView"), nullptr);
}

TEST_F(SaveInterfaceTest, ButtonsAndBackgroundRunTheirActions) {
  const Form& shown = present();
  button("Save")->click();
  button("Cancel")->click();
  QTest::mouseClick(&widgetOf(shown.view()), Qt::LeftButton, {}, {195, 830});
  EXPECT_THAT(shown.used, ElementsAre("savePressed", "cancelPressed", "backgroundTouched"));
}

TEST_F(SaveInterfaceTest, CtrlSSavesAndEscapeCancels) {
  const Form& shown = present();
  key(Qt::Key_S, Qt::ControlModifier);
  awaitUses(1);
  key(Qt::Key_Escape);
  awaitUses(2);
  EXPECT_THAT(shown.used, ElementsAre("savePressed", "cancelPressed"));
}

TEST_F(SaveInterfaceTest, KeysAreThroughAtOnceSoThatNothingComesBetween) {
  const Form& shown = present();
  key(Qt::Key_S, Qt::ControlModifier);
  EXPECT_THAT(shown.used, ElementsAre("savePressed"));
}

TEST_F(SaveInterfaceTest, AKeyThatIsHeldSinceBeforeDoesNotWorkTheForm) {
  const Form& shown = present();
  repeatKey(Qt::Key_S, Qt::ControlModifier);
  repeatKey(Qt::Key_Escape);
  settle();
  EXPECT_THAT(shown.used, IsEmpty());
}

TEST_F(SaveInterfaceTest, AKeyThatIsHeldInTheFieldTypesOn) {
  const Form& shown = present();
  repeatKey(Qt::Key_A, Qt::NoModifier, "a");
  repeatKey(Qt::Key_A, Qt::NoModifier, "a");
  EXPECT_EQ(shown.field().text(), "aa");
}

TEST_F(SaveInterfaceTest, ItLiesOverTheWholeWindowAndTheFieldHasTheKeyboard) {
  const Form& shown = present();
  EXPECT_EQ(widgetOf(shown.view()).geometry(), QRect(0, 0, 390, 844));
  EXPECT_TRUE(edit().hasFocus());
  QTest::keyClicks(QApplication::focusWidget(), "at the bridge");
  EXPECT_EQ(shown.field().text(), "at the bridge");
}

TEST_F(SaveInterfaceTest, AnUntouchedFieldHoldsAnEmptyText) {
  EXPECT_EQ(present().field().text(), "");
}

TEST_F(SaveInterfaceTest, ReturnAsksTheDelegate) {
  const Form& shown = present();
  key(Qt::Key_Return);
  EXPECT_THAT(shown.used, ElementsAre("return"));
}

TEST_F(SaveInterfaceTest, TheDelegatesAnswerDecidesWhetherTheFieldHandlesReturn) {
  Form& shown = present();
  const QSignalSpy handled(&edit(), &QLineEdit::returnPressed);
  shown.letsFieldReturn = false;
  key(Qt::Key_Return);
  EXPECT_EQ(handled.count(), 0);
  shown.letsFieldReturn = true;
  key(Qt::Key_Enter);
  EXPECT_EQ(handled.count(), 1);
  EXPECT_THAT(shown.used, ElementsAre("return", "return"));
}

TEST_F(SaveInterfaceTest, WithoutADelegateTheFieldHandlesReturn) {
  Form& shown = present();
  const QSignalSpy handled(&edit(), &QLineEdit::returnPressed);
  shown.field().setDelegate(nullptr);
  key(Qt::Key_Return);
  EXPECT_EQ(handled.count(), 1);
}

TEST_F(SaveInterfaceTest, AFieldGivesUpTheKeyboard) {
  Form& shown = present();
  shown.field().resignFirstResponder();
  EXPECT_FALSE(edit().hasFocus());
}

TEST_F(SaveInterfaceTest, KeysGoOnWorkingTheFormAfterTheFieldGaveUpTheKeyboard) {
  Form& shown = present();
  shown.field().resignFirstResponder();
  QTest::keyClick(&windowWidget(), Qt::Key_S, Qt::ControlModifier);
  awaitUses(1);
  EXPECT_THAT(shown.used, ElementsAre("savePressed"));
}

TEST_F(SaveInterfaceTest, TabStaysInTheForm) {
  const Form& shown = present();
  for (int press = 0; press < 10; ++press) {
    key(Qt::Key_Tab);
    EXPECT_TRUE(widgetOf(shown.view()).isAncestorOf(QApplication::focusWidget()));
  }
}

TEST_F(SaveInterfaceTest, TabComesBackIntoTheFormAfterTheFieldGaveUpTheKeyboard) {
  Form& shown = present();
  for (const Qt::Key pressed : {Qt::Key_Backtab, Qt::Key_Tab}) {
    shown.field().resignFirstResponder();
    QTest::keyClick(windowWidget().windowHandle(), pressed);
    EXPECT_TRUE(widgetOf(shown.view()).isAncestorOf(QApplication::focusWidget())) << pressed;
    edit().setFocus();
  }
}

TEST_F(SaveInterfaceTest, ItFollowsTheSizeOfTheWindow) {
  const Form& shown = present();
  windowWidget().resize(500, 700);
  settle();
  EXPECT_EQ(widgetOf(shown.view()).size(), QSize(500, 700));
}

struct SixRows : TableViewDataSource {
  std::size_t tableViewNumberOfRowsInSection(TableView&, std::size_t) override { return 6; }
  std::unique_ptr<TableViewCell> tableViewCellForRowAtIndexPath(TableView& table, const IndexPath&) override {
    return std::make_unique<TableViewCell>(table.makeCellBody(CellStyle::oneLabel), "row");
  }
  void tableViewDidSelectRowAtIndexPath(TableView&, const std::optional<IndexPath>&) override {}
};

TEST_F(SaveInterfaceTest, TheListFillsItsCardAndIsAsHighAsItsRows) {
  SixRows rows;
  TableView& table = *static_cast<InterfaceBody&>(present().body()).tableView("saveContentTable");
  table.setDataSource(&rows);
  table.sizeToFit();
  settle();
  const QWidget& list = widgetOf(table);
  EXPECT_EQ(list.geometry(), list.parentWidget()->rect());
  EXPECT_EQ(list.height(), 300);
  table.setDataSource(nullptr);
}

TEST_F(SaveInterfaceTest, DismissedItIsTakenAwayAndThePaneHasTheKeyboardAgain) {
  present();
  stack->dismissModalViewController(true);
  settle();
  EXPECT_EQ(the<ModalLayer>(), nullptr);
  EXPECT_EQ(QApplication::focusWidget(), the<TableWidget>());
}

TEST_F(SaveInterfaceTest, AnimatedItRisesAndSinks) {
  animate();
  const Form& shown = present();
  ASSERT_TRUE(the<ModalLayer>()->isRising());
  while (the<ModalLayer>()->isRising()) QTest::qWait(1);
  EXPECT_EQ(widgetOf(shown.view()).geometry(), QRect(0, 0, 390, 844));
  stack->dismissModalViewController(true);
  ASSERT_NE(the<SlideOverlay>(), nullptr);
  while (the<SlideOverlay>()) QTest::qWait(1);
}

// A button that its shortcut pressed is clicked a moment later, perhaps between the two.
TEST_F(SaveInterfaceTest, AClickAfterTheControllerIsGoneAndBeforeItsWidgetsAreRunsNoAction) {
  auto interface = ui->loadInterface(resource);
  int used = 0;
  interface->setAction("savePressed", [&used] { ++used; });
  const QPointer<BarButton> save = widgetOf(interface->view()).findChild<BarButton*>("saveSnapshot");
  save->click();
  interface.reset();
  ASSERT_NE(save, nullptr);
  save->click();
  EXPECT_EQ(used, 1);
}

TEST_F(SaveInterfaceTest, TheStackMayGoWhileTheViewIsOpen) {
  present();
  stack.reset();
  EXPECT_EQ(the<ModalLayer>(), nullptr);
}

class AlertTest : public SaveInterfaceTest {
 protected:
  AlertLayer& alert() {
    ui->showAlert("File Error", "Unable to write file to disk", "Close");
    settle();
    return *the<AlertLayer>();
  }
};

TEST_F(AlertTest, ShowsItsTextsAndOneButton) {
  showRows(3);
  const AlertLayer& shown = alert();
  EXPECT_EQ(shown.accessibleName(), "File Error");
  EXPECT_EQ(shown.accessibleDescription(), "Unable to write file to disk");
  ASSERT_NE(button("Close"), nullptr);
  EXPECT_TRUE(button("Close")->hasFocus());
  EXPECT_EQ(shown.geometry(), QRect(0, 0, 390, 844));
}

TEST_F(AlertTest, ItsButtonEnterAndEscapeCloseIt) {
  showRows(3);
  alert();
  button("Close")->click();
  settle();
  EXPECT_EQ(the<AlertLayer>(), nullptr);
  for (const Qt::Key pressed : {Qt::Key_Return, Qt::Key_Escape}) {
    alert();
    key(pressed);
    settle();
    EXPECT_EQ(the<AlertLayer>(), nullptr);
  }
  EXPECT_EQ(QApplication::focusWidget(), the<TableWidget>());
}

TEST_F(AlertTest, NothingBeneathIsReachedByKeyboardOrMouse) {
  const test::RowsController& pane = showRows(3);
  alert();
  key(Qt::Key_Tab);
  EXPECT_TRUE(button("Close")->hasFocus());
  QTest::mouseClick(QApplication::widgetAt(windowWidget().mapToGlobal(QPoint(100, 70))), Qt::LeftButton);
  EXPECT_THAT(pane.opened, IsEmpty());
}

TEST_F(AlertTest, KeepsTheKeyboardWhileThePaneBelowItGoesAndComes) {
  showRows(3);
  push(3, "Next");
  alert();
  stack->popViewController(true);
  settle();
  EXPECT_TRUE(button("Close")->hasFocus());
  push(3, "Another");
  EXPECT_TRUE(button("Close")->hasFocus());
  key(Qt::Key_Return);
  settle();
  EXPECT_EQ(the<AlertLayer>(), nullptr);
  EXPECT_EQ(stack->viewControllers().size(), 2U);
  EXPECT_EQ(QApplication::focusWidget(), &tableOf(static_cast<RowsController&>(stack->topViewController())));
}

TEST_F(AlertTest, ItStaysAboveAViewThatIsPresentedLater) {
  showRows(3);
  const AlertLayer& shown = alert();
  form = std::make_unique<Form>(ui->loadInterface(resource));
  stack->presentModalViewController(*form, true);
  settle();
  EXPECT_TRUE(shown.isAncestorOf(windowWidget().childAt(195, 400)));
}

TEST_F(AlertTest, ItGoesWithItsWindow) {
  showRows(3);
  const QPointer<AlertLayer> shown = &alert();
  window.reset();
  EXPECT_EQ(shown, nullptr);
}

TEST_F(AlertTest, ItStaysAfterTheSaveViewBelowItIsGone) {
  present();
  alert();
  stack->dismissModalViewController(true);
  settle();
  ASSERT_NE(the<AlertLayer>(), nullptr);
  EXPECT_TRUE(the<AlertLayer>()->isVisible());
  key(Qt::Key_Return);
  settle();
  EXPECT_EQ(the<AlertLayer>(), nullptr);
}

}  // namespace
}  // namespace kelvasi
