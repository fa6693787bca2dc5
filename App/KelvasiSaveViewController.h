// SPDX-License-Identifier: Apache-2.0
// The view that lists what a snapshot will hold and writes it, with the user's description.
#pragma once

#include "App/AppPlatform.h"
#include "App/SaveShell.h"
#include "Platform/UserInterface/UserInterface.h"
#include "Plist/PlistValue.h"

namespace kelvasi {

class KelvasiSaveViewController : public ViewController,
                                  private TableViewDataSource,
                                  private TextFieldDelegate {
 public:
  // `saveHistory` is an array of dictionaries with a string under "Description", or absent. Its array is
  // copied. Throws std::runtime_error when the interface resource "KelvasiSaveViewController" is missing.
  KelvasiSaveViewController(const AppPlatform& platform, SaveShell& shell, const PlistValue& saveHistory);
  ~KelvasiSaveViewController() override;

  void viewDidLoad() override;
  void viewWillAppear(bool animated) override;
  void didReceiveMemoryWarning() override;
  void viewDidUnload() override;

  // Writes the snapshot, says where it is or that it failed, and has the view closed.
  void savePressed();
  void cancelPressed();
  void backgroundTouched();

  // The parts of the interface; they live in it unless replaced.
  TableView& saveContentTable() const { return *saveContentTable_; }
  void setSaveContentTable(TableView& table);
  TextField& saveDescription() const { return *saveDescription_; }
  void setSaveDescription(TextField& field);

 private:
  bool textFieldShouldReturn(TextField& textField) override;
  void tableViewDidSelectRowAtIndexPath(TableView& tableView,
                                        const std::optional<IndexPath>& indexPath) override;
  std::unique_ptr<TableViewCell> tableViewCellForRowAtIndexPath(TableView& tableView,
                                                                const IndexPath& indexPath) override;
  std::size_t numberOfSectionsInTableView(TableView& tableView) override;
  std::size_t tableViewNumberOfRowsInSection(TableView& tableView, std::size_t section) override;

  KelvasiSaveViewController(const AppPlatform& platform, SaveShell& shell, const PlistValue& saveHistory,
                            std::unique_ptr<InterfaceBody> interface);
  bool writeSnapshot(const std::string& path) const;
  void reportFailure(const std::string& path) const;
  void postClose() const;

  AppPlatform platform_;
  SaveShell& shell_;
  PlistDate timeStamp_;
  PlistValue saveHistory_;
  TableView* saveContentTable_ = nullptr;
  TextField* saveDescription_ = nullptr;
  bool takesField_ = false;  // since the view was loaded this is the field's delegate
};

}  // namespace kelvasi
