// The round-trip server of a language add-in: what the system asks a
// language for, by member name (external/code_view.h, rte_server):
//
//   CodeViewProject(component, reporter)  the component's code-view project;
//       Nothing, with a warning on the reporter, when the component has no
//       project file. The same component and file give the same project
//       object while anyone holds it.
//   StatementGenerator                    statement_generator.h
//   LanguageInfo                          the registry's "LanguageInfo", else
//                                         the language and what it reads
//   CodeIcons                             pictures keyed "LANGUAGE",
//       "PROJECT", "COMPONENT" and by the stereotypes of "IconStereotypes"
//   ShouldBackupModel                     the registry's "ShouldBackupModel"
//   OnModelUpdateStart, OnModelUpdateEnd  notices; "IsModelUpdating" tells
//                                         whether a start came without end
//   GetComponentFromProject(project)      the project's model component
//   ComponentInfo(component)              a text on the component's code
//   OnNewComponent(model, ...)            a collection of one new component
//       of the language in the model's root component package, when the
//       registry's "SupportsNewComponent" says so; else error 438
//   OnProperties(...)                     nothing to show without a window
//   GetContextClass(member)               the class owning a model member
//
// A member listed in the registry's "FailingMembers" raises instead. The
// server serves the add-in it is connected to (Connect), whose name is the
// language's and whose registry key holds its settings (add_in_settings.h);
// unconnected, every member raises "Object variable not set" (91).
#ifndef KELQLN_HOST_CODEVIEW_ROUND_TRIP_SERVER_H_
#define KELQLN_HOST_CODEVIEW_ROUND_TRIP_SERVER_H_

#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "automation/collection.h"
#include "automation/member_table.h"
#include "host/codeview/add_in_settings.h"
#include "host/codeview/project_reader.h"
#include "host/codeview/reporter_link.h"

namespace host::codeview {

class CodeViewProject;

class RoundTripServer : public automation::DispatchImpl<RoundTripServer> {
 public:
  explicit RoundTripServer(std::shared_ptr<const ProjectReader> reader);

  static const automation::MemberTable<RoundTripServer>& Members();

  void Connect(std::string add_in_name, std::string registry_key);
  const AddInSettings& Settings() const { return *settings_; }

  // Raises when `member` may not answer now: the server is not connected,
  // or the registry says the member fails.
  void Answer(std::string_view member) const;

 private:
  std::shared_ptr<CodeViewProject> ProjectFor(
      const automation::Variant& component, const ReporterLink& reporter);
  std::shared_ptr<automation::Collection> CodeIcons() const;
  std::string ComponentInfo(const automation::Variant& component);
  std::shared_ptr<automation::Collection> NewComponent(
      const automation::Variant& model) const;

  std::shared_ptr<const ProjectReader> reader_;
  std::shared_ptr<const AddInSettings> settings_ =
      std::make_shared<AddInSettings>();
  std::vector<std::weak_ptr<CodeViewProject>> projects_;
  bool updating_ = false;
};

}  // namespace host::codeview

#endif  // KELQLN_HOST_CODEVIEW_ROUND_TRIP_SERVER_H_
