// The reader of the description add-in: a project's code described in a JSON
// file (docs/code-description-format.md) instead of read from sources.
//
// The file is checked as a whole: wrong types, unknown or missing fields,
// names given twice and absurd sizes are refused with
// automation::kBadFileFormat "<file>: <where>: <what is wrong>", so a
// misspelt field never passes unnoticed as an empty one.
#ifndef KELQLN_HOST_CODEVIEW_DESCRIPTION_READER_H_
#define KELQLN_HOST_CODEVIEW_DESCRIPTION_READER_H_

#include <cstddef>
#include <string>
#include <string_view>

#include "host/codeview/project_reader.h"

namespace host::codeview {

class DescriptionReader : public ProjectReader {
 public:
  static constexpr char kFormatName[] = "kelqln-code-description";
  static constexpr int kVersion = 1;
  static constexpr size_t kMaxFileSize = size_t{64} << 20;
  static constexpr int kMaxNesting = 32;

  // kFileNotFound when there is no such file, kPathFileAccessError when it
  // cannot be read, kBadFileFormat when its content is refused.
  CodeProject Read(const std::string& path) const override;
  std::string WhatItReads() const override {
    return "code described in JSON files";
  }

  // `file_name` names the text in error messages.
  static CodeProject ReadText(std::string_view text,
                              const std::string& file_name);
};

}  // namespace host::codeview

#endif  // KELQLN_HOST_CODEVIEW_DESCRIPTION_READER_H_
