// SPDX-License-Identifier: Apache-2.0
// What the system is given of its surroundings, as references that outlive every user.
#pragma once

namespace kelvasi {

class Clock;
class DateFormatters;
class Files;
class MainQueue;
class MessagePorts;
class PlistSerialiser;
class Preferences;
class Resources;
class SystemLog;
class TelephonyDaemon;
class TraceOutput;
class UserInterface;

// Enough for generators and decoders: no event loop in it.
struct Platform {
  SystemLog& log;
  TraceOutput& trace;
  const PlistSerialiser& plists;
  const Resources& resources;
  const Clock& clock;
};

// What the live session needs besides.
struct LinkPlatform {
  MainQueue& queue;
  MessagePorts& ports;
  TelephonyDaemon& daemon;
};

// What the application's shell needs besides.
struct ShellPlatform {
  UserInterface& ui;
  Preferences& preferences;
  const DateFormatters& dateFormatters;
  Files& files;
};

}  // namespace kelvasi
