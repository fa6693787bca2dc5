// SPDX-License-Identifier: Apache-2.0
// The one model of the application: the log-channel session with the telephony daemon, the generator and its
// state, and the display tree that the panes show. Everything runs on the main queue's thread.
#pragma once

#include <cstdint>
#include <functional>
#include <memory>
#include <span>

#include "LogGenerator/LogGenerator.h"
#include "LogGenerator/Readings.h"
#include "Model/KelvasiModelNode.h"
#include "Platform/MainQueue.h"
#include "Platform/MessagePort.h"
#include "Platform/Platform.h"
#include "Platform/TelephonyDaemon.h"

namespace kelvasi {

class KelvasiModel {
 public:
  // Called from the main queue after each tick that saw new data.
  using ViewControllerUpdate = std::function<void()>;
  using MessageHandler = std::function<void(std::span<const std::uint8_t> message)>;
  using ReadingsHandler = std::function<void(const Readings& readings, const Intake& intake)>;
  using StartCommandChange = std::function<PlistValue(PlistValue command)>;

  KelvasiModel(const Platform& platform, const LinkPlatform& link,
               ViewControllerUpdate updateViewControllerFromModel);
  ~KelvasiModel();
  KelvasiModel(const KelvasiModel&) = delete;
  KelvasiModel& operator=(const KelvasiModel&) = delete;

  // The session. Every failure goes to the system log and is tried again after 5 s, without limit.
  void restartMonitor();
  void startMonitor();
  bool createPorts();
  void destroyPorts();
  void configureGenerator();
  bool isConnected() const { return recvPort_ && sendPort_; }

  // One log message. A decoder's exception ends the process.
  void updateWithData(std::span<const std::uint8_t> data) noexcept;
  // From now on hands every log message that arrives to `handler`, as it came, instead of to the generator.
  void divertMessages(MessageHandler handler) { messageHandler_ = std::move(handler); }
  // From now on tells what each log message said, once the generator has taken it in.
  void gatherReadings(ReadingsHandler handler);
  // From now on a session begins with what `change` makes of the generator's start command.
  void changeStartCommand(StartCommandChange change) { startCommandChange_ = std::move(change); }
  // The display tick, every 2.0 s while the monitor runs.
  void refresh();
  // The same in the form of a timer's action.
  void refresh(const Timer*) { refresh(); }

  // The tree of the present display, built at most once per tick; null while there is no generator.
  NodeRef topLevelNodes();
  // Null when the tree has no node of exactly this path.
  NodeRef nodeAtPath(const std::string& path);
  // The generator's save contents; absent while there is no generator.
  PlistValue getSaveContents() const;

  // The generator's state; its keys are those of LogGenerator.
  const PlistDictionary& state() const { return *state_; }
  const LogGenerator* logGenerator() const { return logGenerator_.get(); }
  // Whether the tree last built shows what a generator of another technology has left. A session's records
  // have nowhere to go then.
  bool showsAnotherTechnology() const { return showsAnotherTechnology_; }
  // The same for who wants to ask it after the session has another one.
  std::shared_ptr<const LogGenerator> sharedLogGenerator() const { return logGenerator_; }
  // What the daemon called the technology when it was asked last; empty before.
  const std::string& technology() const { return technology_; }

 private:
  void retryMonitor();
  bool connectSendPort(const std::string& portName);
  std::optional<Bytes> askForTechnology();
  void makeGenerator(const std::string& technology);
  bool sendStartCommand();
  void portWasInvalidated(const void* port);
  void lookWhoseDisplayItIs();
  // A task that does nothing once the model is gone.
  Task whileAlive(std::function<void()> task) const;

  Platform platform_;
  LinkPlatform link_;
  ViewControllerUpdate updateViewControllerFromModel_;
  MessageHandler messageHandler_;  // empty: messages go to the generator
  ReadingsHandler readingsHandler_;
  Readings readings_;
  StartCommandChange startCommandChange_;

  std::unique_ptr<LocalPort> recvPort_;
  std::unique_ptr<RemotePort> sendPort_;
  std::unique_ptr<Timer> displayUpdateTimer_;  // the monitor counts as started while it exists
  bool updated_ = false;                       // data arrived since the last tick that consumed it
  std::shared_ptr<LogGenerator> logGenerator_;
  std::string technology_;
  PlistValue::Dictionary state_ = PlistDictionary::make();  // survives reconnections and changes of generator
  bool showsAnotherTechnology_ = false;
  NodeRef nodes_;  // set and dropped together with its index
  PathDictionary nodesByPath_;

  std::shared_ptr<const bool> alive_ = std::make_shared<const bool>(true);
};

}  // namespace kelvasi
