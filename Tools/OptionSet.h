// SPDX-License-Identifier: Apache-2.0
// The options of a program or of a verb, each declared with what it fills. The library that reads them takes
// seconds to compile in every source that sees it, so none sees it but those of this folder.
#pragma once

#include <concepts>
#include <cstdint>
#include <functional>
#include <optional>
#include <stdexcept>
#include <string>
#include <vector>

namespace CLI {
class App;
class Option;
}  // namespace CLI

namespace kelvasi {

// Arguments that make no sense. What reads options throws it, and the program ends with status 2.
class WrongUsage : public std::runtime_error {
 public:
  WrongUsage(const std::string& option, const std::string& reason) : runtime_error(option + ": " + reason) {}

  static WrongUsage missing(const std::string& name) { return WrongUsage(name + " is required"); }

 private:
  explicit WrongUsage(const std::string& text) : runtime_error(text) {}
};

template <class T, class... Types>
concept OneOf = (std::same_as<T, Types> || ...);

// What an option may fill.
template <class T>
concept OptionValue = OneOf < T,
        std::string, std::optional<std::string>, std::vector<std::string>,
double, std::optional<double>, std::uint64_t, std::optional < unsigned >> ;

// What may be handed to a function instead: one value, or all of an option that may be given again.
template <class T>
concept OptionArgument = OneOf<T, std::string, double, std::vector<std::string>>;

// An option that was declared. A handle: it lasts as long as its set.
class Option {
 public:
  // Says what is wrong with a value, and nothing of a right one.
  using Check = std::function<std::string(const std::string& value)>;
  // Puts what is meant in the value's place.
  using Transform = std::function<std::string(std::string& value)>;

  explicit Option(CLI::Option& option) : option_(&option) {}

  // How --help names the value.
  Option& type(const std::string& name);
  Option& check(const Check& check);
  Option& transform(const Transform& transform);
  Option& oneOf(const std::vector<std::string>& words);
  // Whatever its case; the word as it stands here is what is meant.
  Option& oneOfInAnyCase(const std::vector<std::string>& words);
  // Both ends included; `range` tells them to people: "from 0 to 1000".
  Option& between(double least, double most, const std::string& range);
  Option& positive();
  Option& required();
  // Each value has the option's name before it.
  Option& oneValueEach();
  // --help shows what it is when it is not given.
  Option& showsDefault();
  // --help has no word of it.
  Option& hidden();
  Option& needs(const Option& other);
  Option& excludes(const Option& other);

 private:
  CLI::Option* option_;
};

// A handle too. What is filled outlives the parsing.
class OptionSet {
 public:
  explicit OptionSet(CLI::App& app) : app_(&app) {}

  Option addFlag(const std::string& name, bool& flag, const std::string& help);
  // Ends the program well after the action.
  Option addFlagThatEnds(const std::string& name, const std::function<void()>& action,
                         const std::string& help);
  template <OptionValue T>
  Option add(const std::string& name, T& value, const std::string& help);
  template <OptionArgument T>
  Option addReader(const std::string& name, const std::function<void(const T& value)>& read,
                   const std::string& help);

  // What stands below the options in --help.
  void setFooter(const std::string& text);
  // After all options are read; throws WrongUsage.
  void setCheck(const std::function<void()>& check);

 private:
  CLI::App* app_;
};

}  // namespace kelvasi
