// The rest of the system's way to the language add-ins' round-trip services
// (the add-in cache, a component's code-view project, the statement
// generator's answer), and the engine's model backup with its save dialog.
#ifndef KELQLN_ENGINE_MODEL_UPDATE_ENGINE_UTILITIES_H_
#define KELQLN_ENGINE_MODEL_UPDATE_ENGINE_UTILITIES_H_

#include <memory>
#include <string>
#include <string_view>

#include "automation/variant.h"
#include "reporting/kel_reporter_api.h"

namespace kelqln {

// The server of the round-trip language add-in `name`. The first call walks
// the add-ins of the OrelApp global once and keeps every round-trip add-in's
// server in AddInHandlers; later calls look only there, so an add-in
// installed afterwards is found only once the cache is released. A name that
// is not there raises the collection's missing-key error (5). A walk that
// fails leaves no cache behind: the next call walks again rather than miss,
// for the rest of the session, the add-ins after the failure.
automation::Object GetLanguageAddIn(std::string_view name);

// The code-view project of model component `component` from the round-trip
// server of add-in `language`, or Nothing. The server may hand back another
// component and another reporter; both are copied back. Any failure is
// written to the debug log and gives Nothing.
automation::Object GetCodeViewProject(
    const automation::Object& theOrelApp, std::string_view language,
    automation::Object& component, std::shared_ptr<kelReporterApi>& reporter);

// The statement generator's answer about `element` (a model component): its
// language's generator is asked through its first operation, and the element
// it hands back is copied back. Any failure answers false.
bool QueryStatementGenerator(automation::Object& element);

// Saves the current model of `theOrelApp` in place or, when it has never
// been saved, under the name the user picks in a save dialog (nothing is
// saved when that name is blank). Failures of the save reach the caller.
void SaveModel(const automation::Object& theOrelApp);

// Tells the application that a save dialog comes, asks for a file name in
// it and saves the current model of `theOrelApp` under that name; a blank
// name saves nothing.
void SaveModelUnderChosenName(const automation::Object& theOrelApp);

// Shows the common save dialog with `filter`, and `title` and `owner` when
// given, starting from `fileName` unless that is empty; `fileName` becomes
// the dialog's answer. Without the dialog component nothing happens and
// `fileName` is unchanged.
void ShowSaveDialog(
    std::string& fileName, const std::string& filter,
    const automation::Variant& title = automation::Variant::Missing(),
    const automation::Variant& owner = automation::Variant::Missing());

}  // namespace kelqln

#endif  // KELQLN_ENGINE_MODEL_UPDATE_ENGINE_UTILITIES_H_
