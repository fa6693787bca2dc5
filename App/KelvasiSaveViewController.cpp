// SPDX-License-Identifier: Apache-2.0
#include "App/KelvasiSaveViewController.h"

#include <stdexcept>
#include <utility>

#include "Model/SnapshotFile.h"
#include "Platform/Clock.h"
#include "Platform/Files.h"
#include "Platform/MainQueue.h"
#include "Platform/PlistSerialiser.h"
#include "Platform/SystemLog.h"

namespace kelvasi {

namespace {

constexpr const char* interfaceName = "KelvasiSaveViewController";
constexpr const char* cellIdentifier = "SaveHistoryContentCell";

std::unique_ptr<InterfaceBody> loadInterface(UserInterface& ui) {
  auto interface = ui.loadInterface(interfaceName);
  if (!interface) throw std::runtime_error(std::string("no interface resource ") + interfaceName);
  return interface;
}

std::string descriptionOf(const PlistValue& entry) {
  const PlistValue text = entry.dictionary() ? entry.dictionary()->get("Description") : PlistValue();
  return text.string() ? *text.string() : "";
}

}  // namespace

KelvasiSaveViewController::KelvasiSaveViewController(const AppPlatform& platform, SaveShell& shell,
                                                     const PlistValue& saveHistory)
    : KelvasiSaveViewController(platform, shell, saveHistory, loadInterface(platform.shell.ui)) {}

KelvasiSaveViewController::KelvasiSaveViewController(const AppPlatform& platform, SaveShell& shell,
                                                     const PlistValue& saveHistory,
                                                     std::unique_ptr<InterfaceBody> interface)
    : ViewController(std::move(interface)),
      platform_(platform),
      shell_(shell),
      timeStamp_(platform.core.clock.now()),
      saveHistory_(saveHistory.shallowCopy()) {
  auto& parts = dynamic_cast<InterfaceBody&>(body());
  setSaveContentTable(*parts.tableView("saveContentTable"));
  setSaveDescription(*parts.textField("saveDescription"));
  parts.setAction("savePressed", [this] { savePressed(); });
  parts.setAction("cancelPressed", [this] { cancelPressed(); });
  parts.setAction("backgroundTouched", [this] { backgroundTouched(); });
}

KelvasiSaveViewController::~KelvasiSaveViewController() {
  saveContentTable_->setDataSource(nullptr);
  saveDescription_->setDelegate(nullptr);
}

void KelvasiSaveViewController::viewDidLoad() {
  takesField_ = true;
  saveDescription_->setDelegate(this);
  ViewController::viewDidLoad();
  saveContentTable_->sizeToFit();
}

void KelvasiSaveViewController::viewWillAppear(bool) {
  view().setFrame(platform_.shell.ui.mainScreen().applicationFrame());
}

void KelvasiSaveViewController::didReceiveMemoryWarning() {
  ViewController::didReceiveMemoryWarning();
}

void KelvasiSaveViewController::viewDidUnload() {
  ViewController::viewDidUnload();
}

void KelvasiSaveViewController::setSaveContentTable(TableView& table) {
  if (saveContentTable_) saveContentTable_->setDataSource(nullptr);
  saveContentTable_ = &table;
  table.setDataSource(this);
}

void KelvasiSaveViewController::setSaveDescription(TextField& field) {
  if (saveDescription_) saveDescription_->setDelegate(nullptr);
  saveDescription_ = &field;
  if (takesField_) field.setDelegate(this);
}

void KelvasiSaveViewController::savePressed() {
  const std::string path = snapshotPath(platform_.paths.logDirectory, platform_.core.clock.now());
  if (writeSnapshot(path)) {
    shell_.keepDescription("");
    platform_.shell.ui.showFileNotice("Snapshot saved", path);
  } else {
    shell_.keepDescription(saveDescription_->text().value_or(""));
    reportFailure(path);
  }
  postClose();
}

bool KelvasiSaveViewController::writeSnapshot(const std::string& path) const {
  const auto snapshot = snapshotDictionary(timeStamp_, saveHistory_, saveDescription_->text());
  const auto bytes = platform_.core.plists.serialiseXml(snapshot);
  return bytes && platform_.shell.files.write(path, *bytes);
}

void KelvasiSaveViewController::reportFailure(const std::string& path) const {
  platform_.core.log.print(LogPriority::error, "Unable to write snapshot to %s", path.c_str());
  platform_.shell.ui.showAlert("File Error", "Unable to write file to disk", "Close");
}

void KelvasiSaveViewController::cancelPressed() {
  postClose();
}

// Later: closing destroys this view, which is still at work on the press.
void KelvasiSaveViewController::postClose() const {
  platform_.link.queue.post([&shell = shell_] { shell.closeSaveView(); });
}

void KelvasiSaveViewController::backgroundTouched() {
  saveDescription_->resignFirstResponder();
}

bool KelvasiSaveViewController::textFieldShouldReturn(TextField&) {
  saveDescription_->resignFirstResponder();
  return true;
}

void KelvasiSaveViewController::tableViewDidSelectRowAtIndexPath(TableView&,
                                                                 const std::optional<IndexPath>&) {
  saveDescription_->resignFirstResponder();
}

std::unique_ptr<TableViewCell> KelvasiSaveViewController::tableViewCellForRowAtIndexPath(
    TableView& tableView, const IndexPath& indexPath) {
  auto cell = tableView.dequeueReusableCellWithIdentifier(cellIdentifier);
  if (!cell)
    cell = std::make_unique<TableViewCell>(tableView.makeCellBody(CellStyle::oneLabel), cellIdentifier);
  Label& label = cell->body().textLabel();
  label.setText(descriptionOf(saveHistory_.array()->at(indexPath.row)));
  label.setFont({.family = "Helvetica", .size = 13.0, .isBold = false});
  cell->body().setAccessory(CellAccessory::checkmark);
  cell->body().layOutStandard();
  return cell;
}

std::size_t KelvasiSaveViewController::numberOfSectionsInTableView(TableView&) {
  return 1;
}

std::size_t KelvasiSaveViewController::tableViewNumberOfRowsInSection(TableView&, std::size_t) {
  return saveHistory_.array() ? saveHistory_.array()->size() : 0;
}

}  // namespace kelvasi
