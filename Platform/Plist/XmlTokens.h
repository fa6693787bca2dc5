// The markup of an XML document, piece by piece: enough to see its shape, with no meaning given to names.
#pragma once

#include <string_view>

namespace kelvasi {

struct XmlToken {
  enum class Kind {
    startTag,     // text is the name, attributes what stands between it and the tag's end
    emptyTag,     // likewise
    endTag,       // text is the name
    characters,   // text between markup, as it is written
    cdata,        // text is the section's content
    comment,      // text is the comment's content
    instruction,  // text is what stands between <? and ?>
    doctype,      // text is what stands between <! and >
    end,          // of the document
    malformed
  };
  Kind kind = Kind::end;
  std::string_view text;
  std::string_view attributes;
};

class XmlTokens {
 public:
  // `document` must outlive the tokens.
  explicit XmlTokens(std::string_view document) : rest_(document) {}
  // After `end` or `malformed` it stays at that.
  XmlToken next();
  // The document from the next token on.
  std::string_view rest() const { return rest_; }

 private:
  XmlToken markup();
  XmlToken tag();
  XmlToken enclosed(XmlToken::Kind kind, std::string_view open, std::string_view close);

  std::string_view rest_;
};

// The text without the white space around it.
std::string_view trimmed(std::string_view text);

}  // namespace kelvasi
