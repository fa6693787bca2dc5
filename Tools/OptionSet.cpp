// SPDX-License-Identifier: Apache-2.0
#include "Tools/OptionSet.h"

#include <CLI/CLI.hpp>
#include <charconv>

namespace kelvasi {

namespace {

std::string readBetween(const std::string& text, double least, double most, const std::string& range) {
  double number = 0;
  const char* const end = text.data() + text.size();
  const auto [rest, error] = std::from_chars(text.data(), end, number);
  const bool isNumber = error == std::errc() && rest == end;
  if (isNumber && number >= least && number <= most) return {};
  return "\"" + text + "\" is no number " + range;
}

}  // namespace

Option& Option::type(const std::string& name) {
  option_->type_name(name);
  return *this;
}

Option& Option::check(const Check& check) {
  option_->check(check);
  return *this;
}

Option& Option::transform(const Transform& transform) {
  option_->transform(CLI::Validator(transform, ""));
  return *this;
}

Option& Option::oneOf(const std::vector<std::string>& words) {
  option_->check(CLI::IsMember(words));
  return *this;
}

Option& Option::oneOfInAnyCase(const std::vector<std::string>& words) {
  option_->transform(CLI::IsMember(words, CLI::ignore_case));
  return *this;
}

Option& Option::between(double least, double most, const std::string& range) {
  return check([=](const std::string& text) { return readBetween(text, least, most, range); });
}

Option& Option::positive() {
  option_->check(CLI::PositiveNumber);
  return *this;
}

Option& Option::required() {
  option_->required();
  return *this;
}

Option& Option::oneValueEach() {
  option_->allow_extra_args(false);
  return *this;
}

Option& Option::showsDefault() {
  option_->capture_default_str();
  return *this;
}

Option& Option::hidden() {
  option_->group("");
  return *this;
}

Option& Option::needs(const Option& other) {
  option_->needs(other.option_);
  return *this;
}

Option& Option::excludes(const Option& other) {
  option_->excludes(other.option_);
  return *this;
}

Option OptionSet::addFlag(const std::string& name, bool& flag, const std::string& help) {
  return Option(*app_->add_flag(name, flag, help));
}

Option OptionSet::addFlagThatEnds(const std::string& name, const std::function<void()>& action,
                                  const std::string& help) {
  const auto end = [action] {
    action();
    throw CLI::Success();
  };
  return Option(*app_->add_flag_callback(name, end, help));
}

template <OptionValue T>
Option OptionSet::add(const std::string& name, T& value, const std::string& help) {
  return Option(*app_->add_option(name, value, help));
}

template <OptionArgument T>
Option OptionSet::addReader(const std::string& name, const std::function<void(const T&)>& read,
                            const std::string& help) {
  return Option(*app_->add_option_function<T>(name, read, help));
}

void OptionSet::setFooter(const std::string& text) {
  app_->footer(text);
}

void OptionSet::setCheck(const std::function<void()>& check) {
  app_->callback(check);
}

template Option OptionSet::add(const std::string&, std::string&, const std::string&);
template Option OptionSet::add(const std::string&, std::optional<std::string>&, const std::string&);
template Option OptionSet::add(const std::string&, std::vector<std::string>&, const std::string&);
template Option OptionSet::add(const std::string&, double&, const std::string&);
template Option OptionSet::add(const std::string&, std::optional<double>&, const std::string&);
template Option OptionSet::add(const std::string&, std::uint64_t&, const std::string&);
template Option OptionSet::add(const std::string&, std::optional<unsigned>&, const std::string&);
template Option OptionSet::addReader(const std::string&, const std::function<void(const std::string&)>&,
                                     const std::string&);
template Option OptionSet::addReader(const std::string&, const std::function<void(const double&)>&,
                                     const std::string&);
template Option OptionSet::addReader(const std::string&,
                                     const std::function<void(const std::vector<std::string>&)>&,
                                     const std::string&);

}  // namespace kelvasi
