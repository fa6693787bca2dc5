// SPDX-License-Identifier: Apache-2.0
#include "Platform/UserInterface/Application.h"

#include <stdexcept>

namespace kelvasi {

namespace {

std::unique_ptr<Application> make(const ApplicationClasses& classes, std::string_view name) {
  const auto found = classes.find(name);
  if (found == classes.end()) throw std::invalid_argument("no application class " + std::string(name));
  return found->second();
}

}  // namespace

LaunchedApplication::LaunchedApplication(const ApplicationClasses& classes, std::string_view applicationClass,
                                         std::string_view delegateClass)
    : application_(make(classes, applicationClass)),
      otherDelegate_(delegateClass == applicationClass ? nullptr : make(classes, delegateClass)),
      delegate_((otherDelegate_ ? otherDelegate_ : application_)->asDelegate()) {
  if (!delegate_) throw std::invalid_argument("no delegate is " + std::string(delegateClass));
}

}  // namespace kelvasi
