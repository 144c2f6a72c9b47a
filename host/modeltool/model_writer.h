// Writes a model as the text of a model file (docs/model-format.md).
#ifndef KELQLN_HOST_MODELTOOL_MODEL_WRITER_H_
#define KELQLN_HOST_MODELTOOL_MODEL_WRITER_H_

#include <string>

namespace host::modeltool {

class Model;

class ModelWriter {
 public:
  static std::string ToText(const Model& model);
};

}  // namespace host::modeltool

#endif  // KELQLN_HOST_MODELTOOL_MODEL_WRITER_H_
