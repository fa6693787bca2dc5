// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/Base.h"

#include "LogGenerator/ArrayLock.h"
#include "LogGenerator/ClassIndex.h"
#include "LogGenerator/Exceptions.h"

namespace kelvasi {

void Base::initWithDictCodeDict(ClassDictionary& classDict, CodeDictionary& codeDict) {
  classDict.set(getSectionName(), *this);
  updateLogCodeDict(codeDict);
}

void Base::updateLogCodeDict(CodeDictionary& codeDict) {
  const std::span<const LogCode> codes = getLogCodeArray();
  log().print(LogPriority::warning, "Array Count: %d", static_cast<int>(codes.size()));
  for (const LogCode code : codes) codeDict.append(code, *this);
}

void Base::updateSectionRef(PlistValue container) {
  moveToSection(std::move(container));
  trace(getSectionName());
}

void Base::setSectionPath(std::string path) {
  section_ = {.name = std::string(getSectionName()), .path = std::move(path), .role = role()};
}

Outcome Base::updateWithData(RecordView, LogCode) {
  throw UnimplementedMethodError("Base::updateWithData");
}

std::string_view Base::getSectionName() const {
  throw UnimplementedMethodError("Base::getSectionName");
}

SectionKind Base::sectionKind() const {
  throw UnimplementedMethodError("Base::sectionKind");
}

std::span<const LogCode> Base::getLogCodeArray() const {
  throw UnimplementedMethodError("Base::getLogCodeArray");
}

void Base::clearElementsInArray(PlistArray& array) {
  const ArrayGuard guard;
  array.removeAll();
}

void Base::replaceArrayWith(PlistArray& target, const PlistArray& source) {
  const ArrayGuard guard;
  target.removeAll();
  for (const PlistValue& element : source) target.append(element);
}

void Base::trace(std::string_view text, LogPriority priority) const {
  if (log().wants(priority)) log().write(priority, text);
}

void Base::logUnknownMessage(LogCode logCode) const {
  log().print(LogPriority::error, "Received an unknown log message: %d", static_cast<int>(logCode));
}

}  // namespace kelvasi
