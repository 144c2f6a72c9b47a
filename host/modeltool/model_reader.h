// Reads a model file (docs/model-format.md) into a new model. The file is
// checked as a whole before the model is handed out: a malformed or hostile
// file (wrong types, unknown fields, duplicate or dangling ids, absurd sizes
// or nesting) fails with automation::kBadFileFormat "<file>: <where>: <what
// is wrong>" and yields no model at all.
#ifndef KELQLN_HOST_MODELTOOL_MODEL_READER_H_
#define KELQLN_HOST_MODELTOOL_MODEL_READER_H_

#include <cstddef>
#include <memory>
#include <string>
#include <string_view>

#include "host/modeltool/unique_id.h"

namespace host::modeltool {

class Model;

class ModelReader {
 public:
  static constexpr size_t kMaxFileSize = size_t{256} << 20;
  static constexpr size_t kMaxTextSize = size_t{1} << 20;
  // Nesting of JSON arrays and objects; packages nest inside it.
  static constexpr int kMaxNesting = 200;

  // The model's FilePath is `path`.
  static std::shared_ptr<Model> ReadFile(const std::string& path,
                                         UniqueIdGenerator generator = {});
  // `file_name` names the text in error messages.
  static std::shared_ptr<Model> ReadText(std::string_view text,
                                         const std::string& file_name,
                                         UniqueIdGenerator generator = {});

 private:
  class Parser;
};

}  // namespace host::modeltool

#endif  // KELQLN_HOST_MODELTOOL_MODEL_READER_H_
