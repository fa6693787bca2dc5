// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/ExtcapAnswers.h"

#include <array>

namespace kelvasi {

namespace {

// One question in the window of an interface's options.
struct Question {
  std::string_view option;
  std::string_view display;
  std::string_view type;
  std::string_view tooltip;
  std::string_view more = {};
};

constexpr std::array sshQuestions{
    Question{"--remote-host", "Phone", "string", "Its name or address, as ssh takes it", "{required=true}"},
    Question{"--remote-port", "Port", "unsigned", "Of the phone's ssh server; empty: as ssh is configured",
             "{range=1,65535}"},
    Question{"--remote-username", "User", "string",
             "Whose link it is: the daemon and kelvasictl run under one user"},
    Question{"--remote-command", "kelvasictl there", "string", "The program on the phone",
             "{default=kelvasictl}"},
};
constexpr std::array allQuestions{
    Question{"--all-codes", "Further log codes", "string",
             "A range such as 0xB000-0xB1FF, to be asked for beside those that are shown"},
};

std::string interface(std::string_view value, std::string_view display) {
  return "interface {value=" + std::string(value) + "}{display=" + std::string(display) + "}\n";
}

void append(std::string& to, std::size_t& number, const Question& question) {
  to += "arg {number=" + std::to_string(number++) + "}{call=" + std::string(question.option) +
        "}{display=" + std::string(question.display) + "}{type=" + std::string(question.type) +
        "}{tooltip=" + std::string(question.tooltip) + "}" + std::string(question.more) + "\n";
}

}  // namespace

std::string extcapInterfaces(std::string_view version, bool isDaemonThere) {
  std::string text = "extcap {version=" + std::string(version) + "}{display=Kelvasi}\n";
  if (isDaemonThere) text += interface(localInterface, "Kelvasi: modem of this device");
  return text + interface(sshInterface, "Kelvasi: modem of a phone, by ssh");
}

std::string extcapDlts() {
  return "dlt {number=147}{name=USER0}{display=Kelvasi log channel}\n";
}

std::string extcapConfig(std::string_view interface) {
  std::string text;
  std::size_t number = 0;
  if (interface == sshInterface) {
    for (const Question& question : sshQuestions) append(text, number, question);
  }
  for (const Question& question : allQuestions) append(text, number, question);
  return text;
}

}  // namespace kelvasi
