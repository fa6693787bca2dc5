// SPDX-License-Identifier: Apache-2.0
#include "Model/KelvasiModel.h"

#include <utility>

#include "Platform/Clock.h"
#include "Platform/SystemLog.h"

namespace kelvasi {

KelvasiModel::KelvasiModel(const Platform& platform, const LinkPlatform& link,
                           ViewControllerUpdate updateViewControllerFromModel)
    : platform_(platform),
      link_(link),
      updateViewControllerFromModel_(std::move(updateViewControllerFromModel)) {}

KelvasiModel::~KelvasiModel() {
  destroyPorts();
}

void KelvasiModel::updateWithData(std::span<const std::uint8_t> data) noexcept {
  if (messageHandler_) {
    messageHandler_(data);
  } else if (logGenerator_) {
    logGenerator_->setArrival(arrivalAt(platform_.clock.now()));
    logGenerator_->updateState(*state_, data);
    if (readingsHandler_) readingsHandler_(readings_, logGenerator_->intake());
  }
  updated_ = true;
}

void KelvasiModel::gatherReadings(ReadingsHandler handler) {
  readingsHandler_ = std::move(handler);
  if (logGenerator_) logGenerator_->gatherInto(&readings_);
}

void KelvasiModel::refresh() {
  if (sendPort_ && recvPort_ && !sendPort_->isValid()) recvPort_->invalidate();
  if (!updated_) return;
  updated_ = false;
  nodes_.reset();
  nodesByPath_.clear();
  link_.queue.post(whileAlive(updateViewControllerFromModel_));
}

NodeRef KelvasiModel::topLevelNodes() {
  if (nodes_ || !logGenerator_) return nodes_;
  const PlistValue display = logGenerator_->generateLogUsingState(*state_);
  nodesByPath_.clear();
  nodes_ = KelvasiModelNode::makeTreeFromObject(display, nodesByPath_);
  lookWhoseDisplayItIs();
  return nodes_;
}

// Told once each time that it becomes so.
void KelvasiModel::lookWhoseDisplayItIs() {
  const bool wasAnother = std::exchange(showsAnotherTechnology_, !logGenerator_->ownsDisplay(*state_));
  if (showsAnotherTechnology_ && !wasAnother)
    platform_.log.print(
        LogPriority::notice,
        "The display is that of another technology than the daemon's, and stays until a new start");
}

NodeRef KelvasiModel::nodeAtPath(const std::string& path) {
  if (!nodes_) topLevelNodes();
  const auto node = nodesByPath_.find(path);
  return node == nodesByPath_.end() ? nullptr : node->second;
}

PlistValue KelvasiModel::getSaveContents() const {
  return logGenerator_ ? logGenerator_->getSaveContentsFromState(*state_) : PlistValue();
}

Task KelvasiModel::whileAlive(std::function<void()> task) const {
  return [alive = std::weak_ptr<const bool>(alive_), task = std::move(task)] {
    if (alive.lock()) task();
  };
}

}  // namespace kelvasi
