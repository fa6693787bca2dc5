// SPDX-License-Identifier: Apache-2.0
// The decoders of one technology, found by section name and by effective log code.
#pragma once

#include <memory>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "LogGenerator/Base.h"
#include "LogGenerator/LastParsed.h"

namespace kelvasi {

// Section name to decoder; the decoder registered last under a name is the one that counts.
class ClassDictionary {
 public:
  void set(std::string_view sectionName, Base& decoder);
  Base* find(std::string_view sectionName) const;

 private:
  std::vector<std::pair<std::string, Base*>> entries_;
};

// Effective log code, in decimal, to the decoders subscribed to it in the order in which they registered.
class CodeDictionary {
 public:
  void append(LogCode logCode, Base& decoder);
  std::span<Base* const> find(LogCode logCode) const;
  // Decimal strings in the order in which the codes first came.
  std::vector<std::string> keys() const;

 private:
  std::vector<LogCode> codes_;
  std::vector<std::vector<Base*>> subscribers_;  // at the place of their code
};

class ClassIndex {
 public:
  explicit ClassIndex(const Platform& platform);
  virtual ~ClassIndex();
  ClassIndex(const ClassIndex&) = delete;
  ClassIndex& operator=(const ClassIndex&) = delete;

  // Null when no decoder has this section.
  Base* getClass(std::string_view sectionName) const { return classDict_.find(sectionName); }
  // In order of registration; empty when nobody wants the code.
  std::span<Base* const> getSubscribers(LogCode logCode) const { return codeDictionary_.find(logCode); }
  std::vector<std::string> getAllLogCodes() const { return codeDictionary_.keys(); }
  // From now on no decoder has anywhere to write.
  void unbindSections();
  // Of all decoders. Null: nobody listens.
  void gatherInto(Readings* readings);
  std::span<const std::unique_ptr<Base>> decoders() const { return decoders_; }
  // A debugging aid: writes to the system log what kind of thing the class dictionary is.
  void status() const;

 protected:
  // Creates a decoder, keeps it and registers it.
  template <typename Decoder>
  Decoder& create() {
    auto decoder = std::make_unique<Decoder>(platform_);
    Decoder& created = *decoder;
    decoders_.push_back(std::move(decoder));
    created.initWithDictCodeDict(classDict_, codeDictionary_);
    return created;
  }
  // Writes its line to the standard output, then releases the decoders in the order in which they were
  // created.
  void deallocWith(std::string_view line);

 private:
  LastParsed lastParsed_;
  Platform platform_;  // of the decoders too, its serialiser the one above
  std::vector<std::unique_ptr<Base>> decoders_;
  ClassDictionary classDict_;
  CodeDictionary codeDictionary_;
};

}  // namespace kelvasi
