// SPDX-License-Identifier: Apache-2.0
// The window as a screen reader goes through it.
#include <QAccessible>

#include "Platform/QtWidgets/FileNotice.h"
#include "Tests/Platform/QtWidgets/QtFixture.h"

namespace kelvasi {
namespace {

using test::RowsController;
using testing::Contains;
using testing::ElementsAre;

// A row of a name and a value, as panes have.
class PairCell : public TableViewCell {
 public:
  PairCell(UserInterface& ui, TableView& table)
      : TableViewCell(table.makeCellBody(CellStyle::twoLabelValue), "pair"),
        name_(ui.makeLabel()),
        value_(ui.makeLabel()) {
    body().contentView().addSubview(*name_);
    body().contentView().addSubview(*value_);
  }
  void show(const std::string& name, const std::string& value) {
    name_->setText(name);
    value_->setText(value);
  }

 private:
  std::unique_ptr<Label> name_;
  std::unique_ptr<Label> value_;
};

class PairsController : public TableViewController {
 public:
  explicit PairsController(UserInterface& ui) : TableViewController(ui.makeTableControllerBody()), ui_(ui) {
    setTitle("Serving Cell");
  }
  std::size_t tableViewNumberOfRowsInSection(TableView&, std::size_t) override { return pairs.size(); }
  std::unique_ptr<TableViewCell> tableViewCellForRowAtIndexPath(TableView& table,
                                                                const IndexPath& path) override {
    auto reused = table.dequeueReusableCellWithIdentifier("pair");
    std::unique_ptr<PairCell> cell(static_cast<PairCell*>(reused.release()));
    if (!cell) cell = std::make_unique<PairCell>(ui_, table);
    cell->show(pairs[path.row].first, pairs[path.row].second);
    return cell;
  }
  void tableViewDidSelectRowAtIndexPath(TableView&, const std::optional<IndexPath>&) override {}

  std::vector<std::pair<std::string, std::string>> pairs{{"RSRP", "-95 dBm"}, {"Band", "7"}};

 private:
  UserInterface& ui_;
};

class ReaderWalkTest : public test::QtFixture {
 protected:
  PairsController& showPairs() {
    auto made = std::make_unique<PairsController>(*ui);
    PairsController& pane = *made;
    showRoot(std::move(made));
    stack->setToolbarHidden(false, false);
    pane.setToolbarItems({ToolbarLabel{.text = "Updated", .font = Font::system(14), .size = {80, 20}},
                          FlexibleSpace{}, SaveButton{[] {}}},
                         true);
    settle();
    return pane;
  }
  // Everything under the window that has a name and is in sight, in the order of the tree.
  std::vector<std::string> walk() const {
    std::vector<std::string> met;
    visit(QAccessible::queryAccessibleInterface(&windowWidget()), met);
    return met;
  }

 private:
  static std::string nameOf(QAccessible::Role role) {
    switch (role) {
      case QAccessible::Window:
        return "window";
      case QAccessible::ToolBar:
        return "tool bar";
      case QAccessible::List:
        return "list";
      case QAccessible::ListItem:
        return "row";
      case QAccessible::Button:
        return "button";
      case QAccessible::StaticText:
        return "text";
      case QAccessible::Notification:
        return "notice";
      default:
        return "other";
    }
  }
  static void visit(QAccessibleInterface* at, std::vector<std::string>& met) {
    if (!at || at->state().invisible) return;
    const QString name = at->text(QAccessible::Name);
    if (!name.isEmpty()) {
      const QString value = at->text(QAccessible::Value);
      met.push_back(nameOf(at->role()) + " " + name.toStdString() +
                    (value.isEmpty() ? "" : ": " + value.toStdString()));
    }
    for (int child = 0; child < at->childCount(); ++child) visit(at->child(child), met);
  }
};

TEST_F(ReaderWalkTest, AReaderFindsItsWayFromTheWindowToEveryRow) {
  showPairs();
  windowWidget().setWindowTitle("Kelvasi");
  EXPECT_THAT(walk(),
              ElementsAre("window Kelvasi", "tool bar Serving Cell", "list Serving Cell", "row RSRP: -95 dBm",
                          "row Band: 7", "tool bar Status", "text Updated", "button Save"));
}

TEST_F(ReaderWalkTest, ANoticeIsMetWithItsButton) {
  showPairs();
  ui->showFileNotice("Snapshot saved", "/logs/a.kelvasi");
  settle();
  EXPECT_THAT(walk(), Contains("notice Snapshot saved"));
  EXPECT_THAT(walk(), Contains("button Copy path"));
}

}  // namespace
}  // namespace kelvasi
