#include "engine/tokenizer.h"

#include "shared/string_utilities.h"

namespace kelqln {
namespace {

// The length of the UTF-8 sequence that begins with `lead`: a separator is a
// whole character, never a piece of one.
size_t SequenceLength(unsigned char lead) {
  if (lead >= 0xF0) return 4;
  if (lead >= 0xE0) return 3;
  if (lead >= 0xC0) return 2;
  return 1;
}

}  // namespace

Tokenizer::Tokenizer(std::string_view text) : text_(text) {}

std::string Tokenizer::Token(std::string_view separators) {
  if (position_ >= text_.size()) return std::string();
  if (!IsBlank(separators)) separators_ = std::string(separators);

  size_t found = std::string::npos;
  size_t found_length = 0;
  for (size_t i = 0; i < separators_.size();) {
    size_t length = SequenceLength(static_cast<unsigned char>(separators_[i]));
    std::string_view separator =
        std::string_view(separators_).substr(i, length);
    size_t at = text_.find(separator, position_);
    if (at < found) {
      found = at;
      found_length = separator.size();
    }
    i += length;
  }

  std::string token;
  if (found == std::string::npos) {
    token = text_.substr(position_);
    position_ = text_.size();
  } else {
    token = text_.substr(position_, found - position_);
    position_ = found + found_length;
  }
  return token;
}

void Tokenizer::Skip() { Token(std::string_view()); }

}  // namespace kelqln
