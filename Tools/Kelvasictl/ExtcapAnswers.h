// SPDX-License-Identifier: Apache-2.0
// What Wireshark is told when it asks for interfaces, as the documentation of its extcap has the sentences.
#pragma once

#include <string>
#include <string_view>

namespace kelvasi {

inline constexpr std::string_view localInterface = "kelvasi";
inline constexpr std::string_view sshInterface = "kelvasi-ssh";

// The link of this machine is one as long as its daemon listens; a phone's by ssh always is.
std::string extcapInterfaces(std::string_view version, bool isDaemonThere);
std::string extcapDlts();
std::string extcapConfig(std::string_view interface);

}  // namespace kelvasi
