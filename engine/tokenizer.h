// Splits a text into tokens, one per call from left to right, at any of a set
// of separator characters. Used to split selection texts of the form
// component "\" class, and texts of the engine's own.
#ifndef KELQLN_ENGINE_TOKENIZER_H_
#define KELQLN_ENGINE_TOKENIZER_H_

#include <cstddef>
#include <string>
#include <string_view>

namespace kelqln {

class Tokenizer {
 public:
  // Loads `text`, starts at its beginning and takes one blank as the
  // separator. A default tokenizer holds the empty text and gives only empty
  // tokens; load another text by assigning a new Tokenizer.
  Tokenizer() = default;
  explicit Tokenizer(std::string_view text);

  // The next token: the text up to the first of the separators, which is
  // consumed (exactly one separator character, so adjacent separators give
  // empty tokens between them), or the whole rest when none follows. A
  // non-blank `separators` replaces the stored set; a blank one keeps it.
  // Once the text is used up every call gives the empty text.
  std::string Token(std::string_view separators);

  // Takes the next token with the stored separators and drops it.
  void Skip();

 private:
  std::string text_;
  size_t position_ = 0;  // 0-based byte offset of the next token
  std::string separators_ = " ";
};

}  // namespace kelqln

#endif  // KELQLN_ENGINE_TOKENIZER_H_
