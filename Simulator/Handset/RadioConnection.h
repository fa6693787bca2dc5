// SPDX-License-Identifier: Apache-2.0
// The handset's radio connection: RRC state in UMTS, RR state in GSM, as registration and user need it.
#pragma once

#include <cstdint>
#include <optional>

#include "Simulator/Handset/Phase.h"
#include "Simulator/Radio/Cell.h"

namespace kelvasi::sim::gsm {

class RadioConnection {
 public:
  // The numbers of the RRC-state record.
  enum class Rrc : std::uint8_t { disconnected, connecting, fach, dch, cellPch, uraPch };

  explicit RadioConnection(Random random) : random_(random) {}

  // With what the two domains need, on the serving cell or on none, for so many seconds.
  void pass(const Cell* serving, Need circuitSwitched, Need packetSwitched, double seconds);

  Rrc rrc() const;
  bool isConnecting() const { return stage_ == Stage::connecting; }
  // Data or signalling can be exchanged.
  bool isConnected() const { return stage_ == Stage::connected; }
  bool isReleasing() const { return stage_ == Stage::releasing; }
  // From the security mode command on, as long as the connection lasts, in whichever state it is kept.
  bool isCiphered() const { return isEstablished() && establishedFor_ >= securityModeSeconds; }
  bool hasSpeech() const { return isConnected() && circuitSwitched_ == Need::speech; }
  // A burst of packet data is under way.
  bool isTransferring() const { return isConnected() && packetSwitched_ == Need::data && isBurst_; }
  // A circuit-switched channel.
  bool isDedicated() const { return isConnected() && circuitSwitched_ > Need::connecting; }
  // Since the last pass: into another technology; whether as a handover.
  bool hasChangedTechnology() const { return hasChangedTechnology_; }

 private:
  // After a data session UMTS keeps the connection for a while, on common channels and then without any.
  enum class Stage { none, connecting, connected, keptInFach, keptInUraPch, releasing };

  static constexpr double securityModeSeconds = 0.6;

  bool isEstablished() const { return stage_ >= Stage::connected; }
  bool isKept() const { return stage_ == Stage::keptInFach || stage_ == Stage::keptInUraPch; }
  bool isLeftBehind(const Cell& serving) const;
  void noteCell(const Cell& serving);
  void noteNeeds(Need circuitSwitched, Need packetSwitched);
  Stage next() const;
  Stage afterConnecting() const;
  Stage afterConnected() const;
  Need need() const;
  void passBursts(double seconds);
  void enter(Stage stage);

  Random random_;
  std::optional<Technology> technology_;
  Plmn plmn_;
  Need circuitSwitched_ = Need::none;
  Need packetSwitched_ = Need::none;
  bool isHeld_ = false;  // by a domain that already held it
  Stage stage_ = Stage::none;
  double inStage_ = 0;         // seconds
  double establishedFor_ = 0;  // seconds
  bool hasSession_ = false;    // data were transferred over this connection
  bool isBurst_ = false;
  double untilBurstTurns_ = 0;
  bool hasChangedTechnology_ = false;
};

}  // namespace kelvasi::sim::gsm
