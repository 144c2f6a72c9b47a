// Writes what the code says of one class into its model class: stereotype,
// attributes (type, initial value, visibility), operations (return type,
// visibility, parameters), inherit and realize relations, has-relationships
// and association ends. Every change is a "Log" line on the reporter; a
// relation to a class the model does not know is a "Warning". Members of the
// model class that the code no longer has go to the collector and stay in
// the model.
//
// Members are paired with the code by pairing.h: attributes and
// has-relationships by name, operations by name and parameter types and
// then by name alone (so a changed parameter list updates the operation),
// inherit and realize relations by the supplier's name, association ends
// as described at UpdateRoles.
//
// Visibility is kept as the tool property "Visibility" of the language's
// tool, which the model file keeps with the element.
#ifndef KELQLN_HOST_CODEVIEW_CLASS_UPDATER_H_
#define KELQLN_HOST_CODEVIEW_CLASS_UPDATER_H_

#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "host/codeview/code_model.h"
#include "host/codeview/reporter_link.h"
#include "host/codeview/vanished_element_collector.h"
#include "host/modeltool/class.h"
#include "host/modeltool/model.h"

namespace host::codeview {

inline constexpr char kVisibilityProperty[] = "Visibility";

class ClassUpdater {
 public:
  // The model class a class name of the code stands for, or nullptr when
  // the model knows none.
  using ClassResolver =
      std::function<std::shared_ptr<modeltool::Class>(const std::string&)>;

  ClassUpdater(modeltool::Model& model, std::string tool, ClassResolver resolve,
               const ReporterLink& reporter,
               VanishedElementCollector& collector);

  void Update(const CodeClass& code, modeltool::Class& cls);

 private:
  // Sets a text property to `wanted` when it differs; a change is reported
  // unless the element is new (its "added" line says it all).
  void Sync(const std::string& current, const std::string& wanted,
            const std::function<void(const std::string&)>& set,
            const std::string& subject, const char* property, bool report);
  void SyncVisibility(modeltool::Element& element, const std::string& wanted,
                      const std::string& subject, bool report);
  void Changed(const std::string& text) const { reporter_.Log(text); }
  void Vanished(modeltool::Class& cls, modeltool::Element& member);

  void UpdateAttributes(const CodeClass& code, modeltool::Class& cls);
  void UpdateOperations(const CodeClass& code, modeltool::Class& cls);
  void UpdateParameters(const CodeOperation& code,
                        modeltool::Operation& operation,
                        const std::string& subject, bool report);
  template <class Relation, class Make>
  void UpdateRelations(const std::vector<std::string>& bases,
                       const std::vector<std::shared_ptr<Relation>>& present,
                       Make make, const char* kind, modeltool::Class& cls);
  void UpdateHas(const CodeClass& code, modeltool::Class& cls);
  void UpdateRoles(const CodeClass& code, modeltool::Class& cls);

  modeltool::Model& model_;
  std::string tool_;
  ClassResolver resolve_;
  const ReporterLink& reporter_;
  VanishedElementCollector& collector_;
};

}  // namespace host::codeview

#endif  // KELQLN_HOST_CODEVIEW_CLASS_UPDATER_H_
