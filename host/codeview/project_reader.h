// How a language add-in reads a project's code. Each language brings its own
// reader; everything after reading (matching, model update, collecting what
// vanished) is the framework's.
#ifndef KELQLN_HOST_CODEVIEW_PROJECT_READER_H_
#define KELQLN_HOST_CODEVIEW_PROJECT_READER_H_

#include <string>

#include "host/codeview/code_model.h"

namespace host::codeview {

class ProjectReader {
 public:
  virtual ~ProjectReader() = default;

  // The code of the project whose file is `path`. A file that cannot be read
  // or makes no sense raises automation::Error whose description names the
  // file and says what is wrong.
  virtual CodeProject Read(const std::string& path) const = 0;

  // What the reader reads, for the add-in's description of itself
  // ("code described in JSON files").
  virtual std::string WhatItReads() const = 0;
};

}  // namespace host::codeview

#endif  // KELQLN_HOST_CODEVIEW_PROJECT_READER_H_
