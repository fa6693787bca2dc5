// SPDX-License-Identifier: Apache-2.0
#include "Tools/CommandLine.h"

#include <CLI/CLI.hpp>
#include <iostream>

#include "Platform/Posix/PackageResources.h"
#include "Tools/ExitStatus.h"
#include "Tools/OptionTable.h"

namespace kelvasi {

CommandLine::CommandLine(const std::string& name, const std::string& description)
    : app_(std::make_unique<CLI::App>(description, name)) {
  app_->set_version_flag("--version", PackageResources().bundleVersion().value_or("none"));
  // For the build, which makes manuals and completions of it; hidden, as it belongs to no group.
  const auto describe = [this] {
    std::cout << optionTable(*app_, words_);
    throw CLI::Success();
  };
  app_->add_flag_callback("--describe", describe)->group("");
}

CommandLine::~CommandLine() = default;

OptionSet CommandLine::addVerb(const std::string& name, const std::string& help) {
  return OptionSet(*app_->add_subcommand(name, help));
}

void CommandLine::addHelpVerb() {
  std::vector<std::string> names;
  for (const CLI::App* verb : app_->get_subcommands({})) names.push_back(verb->get_name());
  CLI::App& help = *app_->add_subcommand("help", "explain a verb");
  names.push_back(help.get_name());
  const auto asked = std::make_shared<std::string>();
  help.add_option("VERB", *asked, "the verb; otherwise all of them are listed")
      ->type_name("NAME")
      ->check(CLI::IsMember(names));
  app_->require_subcommand(0, 1);  // so that the verb asked for is not taken for another one to run
  help.final_callback([&app = *app_, asked] {
    const std::string& name = app.get_name();
    std::cout << (asked->empty() ? app.get_formatter()->make_help(&app, name, CLI::AppFormatMode::Normal)
                                 : app.get_subcommand(*asked)->help(name));
    throw CLI::Success();
  });
}

std::optional<int> CommandLine::parse(int argumentCount, const char* const* arguments) {
  try {
    app_->parse(argumentCount, arguments);
  } catch (const CLI::Success& success) {
    return app_->exit(success);
  } catch (const CLI::ParseError& error) {
    return refuse(error.what());
  } catch (const WrongUsage& error) {
    return refuse(error.what());
  }
  return std::nullopt;
}

bool CommandLine::asksFor(const std::string& verb) const {
  return app_->got_subcommand(verb);
}

int CommandLine::refuse(const std::string& reason) const {
  std::cerr << app_->get_name() << ": " << reason << " (try --help)\n";
  return exitWrongUsage;
}

}  // namespace kelvasi
