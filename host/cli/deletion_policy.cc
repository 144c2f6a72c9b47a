#include "host/cli/deletion_policy.h"

#include <istream>
#include <optional>
#include <ostream>
#include <string>

#include "automation/case_folding.h"

namespace host::cli {
namespace {

enum class Answer { kYes, kNo, kAll, kNone };

std::optional<Answer> Parse(std::string text) {
  const char* blank = " \t\r";
  text.erase(0, text.find_first_not_of(blank));
  text.erase(text.find_last_not_of(blank) + 1);
  // The capital N is the stronger answer of the two.
  if (text == "N") return Answer::kNone;
  std::string word = automation::FoldCase(text);
  if (word == "y" || word == "yes") return Answer::kYes;
  if (word == "n" || word == "no") return Answer::kNo;
  if (word == "a" || word == "all") return Answer::kAll;
  if (word == "none") return Answer::kNone;
  return std::nullopt;
}

}  // namespace

bool DeletionPolicy::Confirms(const ElementSummary& element) {
  while (mode_ == Mode::kAsk) {
    out_ << "Delete " << element.kind << " \"" << element.name << "\" of "
         << element.owner << "? [y]es, [n]o, [a]ll, [N]one: " << std::flush;
    std::string line;
    if (!std::getline(in_, line)) {
      out_ << "\nEnd of input: the remaining elements stay in the model.\n";
      mode_ = Mode::kNone;
      break;
    }
    std::optional<Answer> answer = Parse(line);
    if (!answer) continue;
    if (*answer == Answer::kYes) return true;
    if (*answer == Answer::kNo) return false;
    mode_ = *answer == Answer::kAll ? Mode::kAll : Mode::kNone;
  }
  return mode_ == Mode::kAll;
}

}  // namespace host::cli
