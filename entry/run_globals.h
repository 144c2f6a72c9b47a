// The objects of the current run, shared by every subsystem. Each is reached
// through its getter and setter; the setter keeps its own reference. They
// live until the next start replaces them or the API object's teardown
// releases them.
#ifndef KELQLN_ENTRY_RUN_GLOBALS_H_
#define KELQLN_ENTRY_RUN_GLOBALS_H_

#include <cstdint>
#include <memory>
#include <string>

#include "automation/basic_collection.h"
#include "automation/variant.h"

namespace kelqln {

class API;
class kelModelUpdateEngine;
class kelSortedComponents;
class kelSortedCVProjects;

// The string service object.
automation::Object GetStringRes();
void SetStringRes(automation::Object value);

// The modelling tool's application object and its current model.
automation::Object GetOrelApp();
void SetOrelApp(automation::Object value);
automation::Object GetOrelModel();
void SetOrelModel(automation::Object value);

// The tool's "VisualStudio" add-in, which is also the settings store.
automation::Object GetOrelVSAddIn();
void SetOrelVSAddIn(automation::Object value);
// Its root registry path, read once when the run is built.
const std::string& GetOrelVSAddInRootRegistryPath();
void SetOrelVSAddInRootRegistryPath(std::string value);

std::shared_ptr<kelModelUpdateEngine> GetModelUpdateEngine();
void SetModelUpdateEngine(std::shared_ptr<kelModelUpdateEngine> value);

// The API object running the current start; empty between starts.
std::shared_ptr<API> GetQuillonAPI();
void SetQuillonAPI(std::shared_ptr<API> value);

std::shared_ptr<kelSortedCVProjects> GetSelectedCodeItems();
void SetSelectedCodeItems(std::shared_ptr<kelSortedCVProjects> value);
std::shared_ptr<kelSortedComponents> GetSelectedOrelItems();
void SetSelectedOrelItems(std::shared_ptr<kelSortedComponents> value);

bool GetSilentRun();
void SetSilentRun(bool value);

// The round-trip language add-ins' servers by add-in name, built once.
using AddInHandlerCollection = automation::BasicCollection<automation::Object>;
std::shared_ptr<AddInHandlerCollection> GetAddInHandlers();
void SetAddInHandlers(std::shared_ptr<AddInHandlerCollection> value);

// Text `number` of the run's string service. A missing service is error 91;
// an unknown number is the service's error.
std::string StringResText(int32_t number);

// Releases every global, as a fresh library has them; for hosts and tests
// that run several independent sessions in one process.
void ResetRunGlobals();

}  // namespace kelqln

#endif  // KELQLN_ENTRY_RUN_GLOBALS_H_
