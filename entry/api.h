// The library's entry object. A host creates an API (kelQLN.API) and starts
// one run with it: silently with Start, which updates the model from the
// code of the selected components and lets a callback object confirm the
// deletions, or with the wizard (StartQuillon and its relatives). Every
// start builds the run in the run globals (entry/run_globals.h) and hands
// back the run's reporter, from which the caller reads the errors,
// warnings, log lines and summary lines.
//
// Late-bound hosts reach _API by its dispatch ids below, and two members of
// our own by name: "LastErrorNumber" and "LastError", the number and the
// description of the failure that made the last Start hand back Nothing
// (0 and "" after a Start that succeeded), so a host can tell its user why.
//
// When the object ends, it releases the run globals (its teardown, written
// to the debug log); a failure while releasing stops there, with a
// "FAIL RELEASING" line.
#ifndef KELQLN_ENTRY_API_H_
#define KELQLN_ENTRY_API_H_

#include <cstdint>
#include <memory>
#include <string>

#include "automation/member_table.h"
#include "automation/server_module.h"
#include "engine/tokenizer.h"
#include "entry/model_update.h"
#include "entry/server_module.h"

namespace kelqln {

class APIProgress;

class API : public automation::DispatchImpl<API>, public ModelUpdate {
 public:
  static constexpr char kProgId[] = "kelQLN.API";
  static constexpr char kClassId[] = "{6B0C2E40-7A3D-4F1B-9C55-0E2A61D4B700}";

  // _API
  static constexpr automation::DispId kStartQuillon = 0x60030002;
  static constexpr automation::DispId kStartQuillonEx = 0x60030003;
  static constexpr automation::DispId kStartQuillonFromIDE = 0x60030004;
  static constexpr automation::DispId kSelectionNodeCollection = 0x68030001;
  static constexpr automation::DispId kSelectionListItemCollection = 0x68030000;
  static constexpr automation::DispId kStart = 0x60030008;
  static constexpr automation::DispId kStartVisible = 0x60030009;

  // The window show modes of the wizard.
  static constexpr int32_t kModeless = 0;
  static constexpr int32_t kModal = 1;

  // Writes "kelQLN:Class_Initialize" to the debug log.
  API();
  // The teardown.
  ~API() override;
  API(const API&) = delete;
  API& operator=(const API&) = delete;

  static std::shared_ptr<API> Create() { return std::make_shared<API>(); }
  static const automation::MemberTable<API>& Members();

  // _API: the wizard road. Without a wizard in the process (see
  // entry/wizard_bridge.h) these raise its error once they need it.
  // StartQuillon is StartQuillonEx with pUseSelection False.
  std::shared_ptr<IReporter> StartQuillon(
      const automation::Object& theOrelApp, int32_t lMode = kModal,
      const automation::Object& Selection = nullptr);
  // Builds the run with the wizard's displays, takes `Selection` as a model
  // selection (or, without one, lets the wizard build it from the tool's
  // selection when `pUseSelection`), and shows the wizard with `lMode`.
  std::shared_ptr<IReporter> StartQuillonEx(
      const automation::Object& theOrelApp, int32_t lMode, bool pUseSelection,
      const automation::Object& Selection);
  // Finds the model components of the development environment's projects
  // (through their language add-ins' "GetComponentFromProject") and shows
  // the wizard on them. A project whose language names no add-in of the tool
  // fails the call (91) before the wizard is shown.
  void StartQuillonFromIDE(const automation::Object& theOrelApp,
                           const automation::Object& Projects, bool fSilent);
  // The node and list-item collections of the wizard's explorer tree.
  automation::Object SelectionNodeCollection();
  automation::Object SelectionListItemCollection();

  // ModelUpdate. Start builds the run without a window, takes `Selection` as
  // a code selection and runs the update; a failure anywhere hands back
  // Nothing (see LastErrorNumber). StartVisible is StartQuillon, modal.
  std::shared_ptr<IReporter> Start(automation::Object theOrelApp,
                                   automation::Object Selection,
                                   automation::Object CallBack) override;
  std::shared_ptr<IReporter> StartVisible(
      automation::Object OrelApp, automation::Object Selection) override;

  // For the wizard: runs the engine over the run's code selection; `Flag`
  // is the engine's fSilent. CancelUpdate asks the engine to stop and marks
  // the reporter cancelled.
  void RunUpdate(const automation::Object& CallBack, bool Flag);
  void CancelUpdate();

  // Why the last Start handed back Nothing; 0 and "" when it did not.
  int32_t LastErrorNumber() const { return last_error_number_; }
  const std::string& LastError() const { return last_error_; }

 private:
  std::shared_ptr<API> Self() {
    return std::static_pointer_cast<API>(shared_from_this());
  }
  // The steps common to the starts; `with_wizard` gives the reporter the
  // wizard's displays.
  void BuildRun(const automation::Object& theOrelApp, bool with_wizard);
  // Files the elements of `Selection` (a dictionary's Items, or any object's
  // Item(1) to Item(Count)) in a new code or model selection.
  void ProcessSelection(const automation::Object& Selection, bool IsCode);
  void AddCodeSelectionItem(const automation::Variant& Item,
                            Tokenizer& tokenizer);
  void AddModelSelectionItem(const automation::Variant& Item,
                             Tokenizer& tokenizer);
  // The code-view project of `component` from its language's add-in; the
  // look-up may replace the component and the run's reporter.
  automation::Object CodeViewProjectOf(automation::Object& component);
  void Teardown();

  std::shared_ptr<APIProgress> theAPIProgress;
  int32_t last_error_number_ = 0;
  std::string last_error_;
  automation::ServerModule::LiveObject live_{KelQLNModule()};
};

}  // namespace kelqln

#endif  // KELQLN_ENTRY_API_H_
