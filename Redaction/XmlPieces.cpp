// SPDX-License-Identifier: Apache-2.0
// A walk over the markup of an XML property list. Whether it is one at all, the reader of property lists
// says.
#include <algorithm>
#include <array>
#include <optional>
#include <string_view>

#include "Redaction/PlistPieces.h"

namespace kelvasi {

namespace {

struct Element {
  std::string_view name;
  PlistPiece::Form form;
};
constexpr std::array elements{
    Element{"string", PlistPiece::Form::text}, Element{"integer", PlistPiece::Form::decimal},
    Element{"data", PlistPiece::Form::base64}, Element{"real", PlistPiece::Form::moment},
    Element{"date", PlistPiece::Form::moment},
};

bool isBlank(std::string_view text) {
  return text.find_first_not_of(" \t\r\n") == std::string_view::npos;
}

class Walk {
 public:
  Walk(std::span<std::uint8_t> document, const TakePiece& take)
      : document_(document),
        text_(reinterpret_cast<const char*>(document.data()), document.size()),
        take_(take) {}

  bool run() {
    while (at_ < text_.size()) {
      if (!(text_[at_] == '<' ? markup() : characters())) return false;
    }
    return path_.empty();
  }

 private:
  bool characters() {
    const std::size_t end = std::min(text_.find('<', at_), text_.size());
    content(at_, end);
    at_ = end;
    return true;
  }

  // What stands outside of a value and is no white space.
  void content(std::size_t begin, std::size_t end) {
    if (isKey_) {
      key_ += text_.substr(begin, end - begin);
    } else if (form_) {
      give(*form_, begin, end);
    } else if (!isBlank(text_.substr(begin, end - begin))) {
      give(PlistPiece::Form::aside, begin, end);
    }
  }

  void give(PlistPiece::Form form, std::size_t begin, std::size_t end) {
    if (begin < end)
      take_({form, path_, document_.subspan(begin, end - begin), form == PlistPiece::Form::base64});
  }

  bool markup() {
    const std::string_view rest = text_.substr(at_);
    if (rest.starts_with("<!--")) return enclosed(4, "-->", true);
    if (rest.starts_with("<![CDATA[")) return enclosed(9, "]]>", false);
    if (rest.starts_with("<!") || rest.starts_with("<?")) return skipTo(">");
    return tag();
  }

  bool enclosed(std::size_t opening, std::string_view closing, bool isComment) {
    const std::size_t begin = at_ + opening;
    const std::size_t end = text_.find(closing, begin);
    if (end == std::string_view::npos) return false;
    if (isComment) {
      give(PlistPiece::Form::aside, begin, end);
    } else {
      content(begin, end);
    }
    at_ = end + closing.size();
    return true;
  }

  bool skipTo(std::string_view closing) {
    const std::size_t end = text_.find(closing, at_);
    if (end == std::string_view::npos) return false;
    at_ = end + closing.size();
    return true;
  }

  bool tag() {
    const std::size_t begin = at_ + 1;
    if (!skipTo(">")) return false;
    std::string_view name = text_.substr(begin, at_ - 1 - begin);
    const bool isClosing = name.starts_with('/');
    const bool isEmpty = name.ends_with('/');
    if (isClosing) name.remove_prefix(1);
    if (isEmpty) name.remove_suffix(1);
    name = name.substr(0, name.find_first_of(" \t\r\n"));
    if (isClosing) return close(name);
    return isEmpty || open(name);
  }

  bool open(std::string_view name) {
    isKey_ = name == "key";
    if (isKey_) key_.clear();
    if (name == "dict" || name == "array") path_.emplace_back();
    const auto element = std::ranges::find(elements, name, &Element::name);
    if (element != elements.end()) form_ = element->form;
    return true;
  }

  bool close(std::string_view name) {
    if (isKey_ && !path_.empty()) path_.back() = key_;
    isKey_ = false;
    form_.reset();
    if (name != "dict" && name != "array") return true;
    if (path_.empty()) return false;
    path_.pop_back();
    return true;
  }

  std::span<std::uint8_t> document_;
  std::string_view text_;
  const TakePiece& take_;
  std::size_t at_ = 0;
  std::vector<std::string> path_;  // an entry for each container
  bool isKey_ = false;
  std::string key_;
  std::optional<PlistPiece::Form> form_;
};

}  // namespace

bool forEachXmlPiece(std::span<std::uint8_t> document, const TakePiece& take) {
  return Walk(document, take).run();
}

bool forEachPiece(std::span<std::uint8_t> document, const TakePiece& take) {
  constexpr std::string_view magic = "bplist";
  const bool isBinary = document.size() >= magic.size() &&
                        std::ranges::equal(document.first(magic.size()), magic, {}, {},
                                           [](char each) { return static_cast<std::uint8_t>(each); });
  return isBinary ? forEachBinaryPiece(document, take) : forEachXmlPiece(document, take);
}

}  // namespace kelvasi
