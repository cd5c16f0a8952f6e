// As much of XML as a property list needs: elements, text, comments; no attributes but the root's, no
// declarations of its own.
#pragma once

#include <string>
#include <string_view>

namespace property_list {

/// Thrown where a document is malformed; the message begins with the line.
struct Malformed {
  std::string message;
};

/// Reads a document from its beginning to its end, one tag or text a call. Every call throws Malformed when
/// the document does not go on as asked.
class XmlReader {
 public:
  struct Tag {
    std::string_view name;
    /// Opened and closed in one: <name/>.
    bool closed;
  };

  /// The document must outlive the reader; names are borrowed from it.
  explicit XmlReader(std::string_view document) : document_(document), rest_(document) {}

  /// Checks that the document is text in UTF-8, and skips what stands before the root's tag.
  void begin();
  /// Checks that nothing but comments is left.
  void end();

  Tag openTag(bool withAttributes = false);
  void closeTag(std::string_view name);
  bool atClosingTag() const { return rest_.starts_with("</"); }
  /// Blanks and comments.
  void skipBetweenTags();
  /// The text up to the closing tag, which is read too.
  std::string readText(const Tag& tag);
  [[noreturn]] void fail(std::string_view message) const;

 private:
  char32_t readReference();
  void skipBlanks();
  void skipComment();
  void skipDocumentType();
  bool skip(std::string_view expected);
  std::string_view takeName();
  std::string_view takeUntil(std::string_view mark);

  std::string_view document_;
  std::string_view rest_;
};

}  // namespace property_list
