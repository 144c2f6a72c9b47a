// The string service object ("kelres.Strings"): every user-visible text of
// the system by number. Member 2(number) is the text; member 1(number) is
// the text read as a number. An unknown number is an error that names it,
// never an empty text.
#ifndef KELQLN_HOST_STRINGS_STRING_SERVICE_H_
#define KELQLN_HOST_STRINGS_STRING_SERVICE_H_

#include <cstdint>
#include <memory>
#include <string>

#include "automation/member_table.h"
#include "host/strings/string_table.h"

namespace host::strings {

class StringService : public automation::DispatchImpl<StringService> {
 public:
  explicit StringService(std::shared_ptr<const StringTable> table);

  static const automation::MemberTable<StringService>& Members();

  // automation::kInvalidProcedureCall when the table has no such number.
  const std::string& Text(int32_t number) const;
  // The text as a Long; kTypeMismatch, naming the number, when it is none.
  int32_t Number(int32_t number) const;

 private:
  std::shared_ptr<const StringTable> table_;
};

// Registers StringService under its programmatic identifier, so that
// automation::CreateObject("kelres.Strings") makes one with
// StringTable::ForThisProcess().
void RegisterStringService();

}  // namespace host::strings

#endif  // KELQLN_HOST_STRINGS_STRING_SERVICE_H_
