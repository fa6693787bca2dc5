// SPDX-License-Identifier: Apache-2.0
#include "Tools/CommandLine.h"

#include <iostream>

#include "Platform/Posix/PackageResources.h"
#include "Tools/ExitStatus.h"

namespace kelvasi {

CommandLine::CommandLine(const std::string& name, const std::string& description) : app_(description, name) {
  app_.set_version_flag("--version", PackageResources().bundleVersion().value_or("none"));
  // For the build, which makes manuals and completions of it; hidden, as it belongs to no group.
  const auto describe = [this] {
    std::cout << optionTable(app_, words_);
    throw CLI::Success();
  };
  app_.add_flag_callback("--describe", describe)->group("");
}

std::optional<int> CommandLine::parse(int argumentCount, const char* const* arguments) {
  try {
    app_.parse(argumentCount, arguments);
  } catch (const CLI::Success& success) {
    return app_.exit(success);
  } catch (const CLI::ParseError& error) {
    std::cerr << app_.get_name() << ": " << error.what() << " (try --help)\n";
    return exitWrongUsage;
  }
  return std::nullopt;
}

}  // namespace kelvasi
