#include "entry/api.h"

#include <functional>
#include <utility>
#include <vector>

#include "automation/call.h"
#include "automation/class_registry.h"
#include "automation/collection.h"
#include "automation/error.h"
#include "engine/kel_model_update_engine.h"
#include "engine/model_update_engine_utilities.h"
#include "entry/add_in_services.h"
#include "entry/debug_log.h"
#include "entry/run_globals.h"
#include "entry/wizard_bridge.h"
#include "external/code_view.h"
#include "external/orel.h"
#include "external/string_service.h"
#include "reporting/api_progress.h"
#include "reporting/shared_simplereporter.h"
#include "selection/kel_sorted_components.h"
#include "selection/kel_sorted_cv_project.h"
#include "selection/kel_sorted_cv_projects.h"
#include "shared/model_element_utilities.h"

namespace kelqln {
namespace {

using automation::Args;
using automation::CallKind;
using automation::CStr;
using automation::Object;
using automation::OptionalArg;
using automation::RequiredArg;
using automation::Variant;
namespace orel = external::orel;
namespace code_view = external::code_view;

constexpr int32_t kText3623 = 3623;  // the progress display's component header
constexpr int32_t kText3624 = 3624;  // its class header

// The explorer tree's node and list-item collections.
constexpr automation::DispId kTreeNodes = 0x68030004;
constexpr automation::DispId kTreeListItems = 0x68030003;

// The language whose code-view projects are let go at teardown.
constexpr char kVisualCpp[] = "VC++";
constexpr char kDictionary[] = "Dictionary";

void TraceLine(const std::string& text) {
  DebugLog(text, kDebugCategoryQln, kDebugLevelTrace);
}

Variant ReporterVariant(const std::shared_ptr<IReporter>& reporter) {
  return Variant(std::dynamic_pointer_cast<automation::Dispatch>(reporter));
}

Object ObjectArg(const Args& args, size_t index) {
  return automation::CObj(OptionalArg(args, index, Variant(nullptr)));
}

std::string KindOf(const Object& element) {
  return CStr(automation::Get(element, orel::element::kKindName));
}

// A text "component\class" resolved to the model's class and component.
bool ResolveText(const std::string& text, Tokenizer& tokenizer, Object& cls,
                 Object& component) {
  tokenizer = Tokenizer(text);
  std::string component_name = tokenizer.Token("\\");
  std::string class_name = tokenizer.Token("\\");
  if (component_name.empty() || class_name.empty()) return false;
  return FindClassByNames(GetOrelApp(), class_name, component_name, cls,
                          component);
}

// Clears QuillonAPI when a start returns, however it returns: left set after
// a failure, the global would keep the API object, and with it the run,
// from ever ending.
struct QuillonAPIReset {
  QuillonAPIReset() = default;
  QuillonAPIReset(const QuillonAPIReset&) = delete;
  QuillonAPIReset& operator=(const QuillonAPIReset&) = delete;
  ~QuillonAPIReset() { SetQuillonAPI(nullptr); }
};

}  // namespace

const automation::MemberTable<API>& API::Members() {
  static const automation::MemberTable<API> table(
      "API",
      {
          {kStartQuillon, "StartQuillon", CallKind::kMethod,
           [](API& self, Args& args) {
             return ReporterVariant(self.StartQuillon(
                 automation::CObj(RequiredArg(args, 0)),
                 automation::CLng(OptionalArg(args, 1, Variant(kModal))),
                 ObjectArg(args, 2)));
           }},
          {kStartQuillonEx, "StartQuillonEx", CallKind::kMethod,
           [](API& self, Args& args) {
             return ReporterVariant(self.StartQuillonEx(
                 automation::CObj(RequiredArg(args, 0)),
                 automation::CLng(OptionalArg(args, 1, Variant(kModal))),
                 automation::CBool(OptionalArg(args, 2, Variant(false))),
                 ObjectArg(args, 3)));
           }},
          {kStartQuillonFromIDE, "StartQuillonFromIDE", CallKind::kMethod,
           [](API& self, Args& args) {
             self.StartQuillonFromIDE(
                 automation::CObj(RequiredArg(args, 0)), ObjectArg(args, 1),
                 automation::CBool(OptionalArg(args, 2, Variant(false))));
             return Variant();
           }},
          {kSelectionNodeCollection, "SelectionNodeCollection",
           CallKind::kPropertyGet,
           [](API& self, Args&) {
             return Variant(self.SelectionNodeCollection());
           }},
          {kSelectionListItemCollection, "SelectionListItemCollection",
           CallKind::kPropertyGet,
           [](API& self, Args&) {
             return Variant(self.SelectionListItemCollection());
           }},
          {kStart, "Start", CallKind::kMethod,
           [](API& self, Args& args) {
             return ReporterVariant(self.Start(
                 automation::CObj(RequiredArg(args, 0)),
                 automation::CObj(RequiredArg(args, 1)), ObjectArg(args, 2)));
           }},
          {kStartVisible, "StartVisible", CallKind::kMethod,
           [](API& self, Args& args) {
             return ReporterVariant(self.StartVisible(
                 automation::CObj(RequiredArg(args, 0)), ObjectArg(args, 1)));
           }},
          {automation::kNamedOnly, "LastErrorNumber", CallKind::kPropertyGet,
           [](API& self, Args&) { return Variant(self.LastErrorNumber()); }},
          {automation::kNamedOnly, "LastError", CallKind::kPropertyGet,
           [](API& self, Args&) { return Variant(self.LastError()); }},
      });
  return table;
}

API::API() { TraceLine("kelQLN:Class_Initialize"); }

API::~API() { Teardown(); }

std::shared_ptr<IReporter> API::StartQuillon(const Object& theOrelApp,
                                             int32_t lMode,
                                             const Object& Selection) {
  return StartQuillonEx(theOrelApp, lMode, false, Selection);
}

std::shared_ptr<IReporter> API::StartQuillonEx(const Object& theOrelApp,
                                               int32_t lMode,
                                               bool pUseSelection,
                                               const Object& Selection) {
  QuillonAPIReset reset_on_return;
  BuildRun(theOrelApp, true);
  if (Selection) {
    ProcessSelection(Selection, false);
  } else {
    Wizard().SetNewSelection(pUseSelection);
  }
  Wizard().Load();
  theAPIProgress->ComponentHeader(StringResText(kText3623));
  theAPIProgress->ClassHeader(StringResText(kText3624));
  Wizard().Show(lMode);
  Wizard().Unload();
  theAPIProgress->SetProgressDisplay(nullptr);
  theAPIProgress->SetStatusDisplay(nullptr);
  return theAPIProgress;
}

void API::StartQuillonFromIDE(const Object& theOrelApp, const Object& Projects,
                              bool fSilent) {
  SetSilentRun(fSilent);
  SetSelectedOrelItems(std::make_shared<kelSortedComponents>());
  if (Projects) {
    for (const Variant& item : automation::CollectionItems(Projects)) {
      Object project = automation::CObj(item);
      std::string language =
          CStr(automation::Get(project, code_view::project::kLanguage));
      Object rte_server =
          GetRTEServerOf(GetAddInServer(theOrelApp, language, kQuillonTag));
      if (!rte_server) continue;
      Args args{Variant(project)};
      Variant component = automation::InvokeByName(
          rte_server, code_view::rte_server::kGetComponentFromProject,
          CallKind::kMethod, args);
      GetSelectedOrelItems()->AddComponent(automation::CObj(component));
    }
  }
  StartVisible(theOrelApp, nullptr);
}

Object API::SelectionNodeCollection() {
  return automation::GetObject(Wizard().ExplorerTree(), kTreeNodes);
}

Object API::SelectionListItemCollection() {
  return automation::GetObject(Wizard().ExplorerTree(), kTreeListItems);
}

std::shared_ptr<IReporter> API::Start(Object theOrelApp, Object Selection,
                                      Object CallBack) {
  QuillonAPIReset reset_on_return;
  last_error_number_ = 0;
  last_error_.clear();
  try {
    BuildRun(theOrelApp, false);
    ProcessSelection(Selection, true);
    RunUpdate(CallBack, true);
  } catch (const automation::Error& error) {
    // The caller gets no reporter; the failure stays readable here and in
    // the debug log, so a host can still say why.
    last_error_number_ = error.Number();
    last_error_ = error.Description();
    DebugLog("ERROR kelQLN.Start: " + std::to_string(error.Number()) + " " +
                 error.Description(),
             kDebugCategoryQln, kDebugLevelError);
    return nullptr;
  }
  return theAPIProgress;
}

std::shared_ptr<IReporter> API::StartVisible(Object OrelApp, Object Selection) {
  return StartQuillon(OrelApp, kModal, Selection);
}

void API::RunUpdate(const Object& CallBack, bool Flag) {
  std::shared_ptr<kelModelUpdateEngine> engine = GetModelUpdateEngine();
  if (!engine) throw automation::Error(automation::kObjectNotSet);
  engine->UpdateModel(GetOrelApp(), GetSelectedCodeItems(), theAPIProgress,
                      CallBack, Flag);
}

void API::CancelUpdate() {
  std::shared_ptr<kelModelUpdateEngine> engine = GetModelUpdateEngine();
  if (!engine || !theAPIProgress) {
    throw automation::Error(automation::kObjectNotSet);
  }
  engine->RequestCancel();
  theAPIProgress->RaiseCancel();
}

void API::BuildRun(const Object& theOrelApp, bool with_wizard) {
  SetStringRes(automation::CreateObject(external::string_service::kProgId));
  theAPIProgress = APIProgress::Create();
  if (with_wizard) {
    theAPIProgress->SetProgressDisplay(Wizard().ProgressControl());
    theAPIProgress->SetStatusDisplay(Wizard().StatusControl());
  }
  SetQuillonAPI(Self());
  SetModelUpdateEngine(std::make_shared<kelModelUpdateEngine>());
  SetOrelApp(theOrelApp);
  SetOrelModel(
      automation::GetObject(theOrelApp, orel::application::kCurrentModel));
  Object settings_add_in = GetVSAddIn(theOrelApp);
  SetOrelVSAddIn(settings_add_in);
  SetOrelVSAddInRootRegistryPath(CStr(
      automation::GetByName(settings_add_in, orel::add_in::kRootRegistryPath)));
}

void API::ProcessSelection(const Object& Selection, bool IsCode) {
  Tokenizer tokenizer;
  if (IsCode) {
    SetSelectedCodeItems(std::make_shared<kelSortedCVProjects>());
  } else {
    SetSelectedOrelItems(std::make_shared<kelSortedComponents>());
  }
  auto add = [&](const Variant& item) {
    if (IsCode) {
      AddCodeSelectionItem(item, tokenizer);
    } else {
      AddModelSelectionItem(item, tokenizer);
    }
  };
  if (Variant(Selection).TypeName() == kDictionary) {
    for (const Variant& item : automation::CollectionItems(
             automation::CObj(automation::GetByName(Selection, "Items")))) {
      add(item);
    }
    return;
  }
  int16_t count = automation::CInt(automation::GetByName(Selection, "Count"));
  for (int32_t index = 1; index <= count; ++index) {
    add(automation::CallByName(Selection, "Item", static_cast<int16_t>(index)));
  }
}

void API::AddModelSelectionItem(const Variant& Item, Tokenizer& tokenizer) {
  if (Item.IsObject()) {
    const Object& element = Item.ObjectValue();
    std::string kind = KindOf(element);
    if (kind == orel::kind::kComponent) {
      GetSelectedOrelItems()->AddComponent(element);
    } else if (kind == orel::kind::kClass) {
      GetSelectedOrelItems()->AddClass(element, nullptr);
    }
    return;
  }
  if (!Item.IsString()) throw automation::Error(automation::kTypeMismatch);
  Object cls;
  Object component;
  if (ResolveText(Item.StringValue(), tokenizer, cls, component)) {
    GetSelectedOrelItems()->AddClassInComponent(cls, component);
  }
}

void API::AddCodeSelectionItem(const Variant& Item, Tokenizer& tokenizer) {
  Object cls;
  Object component;
  if (Item.IsObject()) {
    const Object& element = Item.ObjectValue();
    std::string kind = KindOf(element);
    if (kind == orel::kind::kComponent) {
      component = element;
      Object cv = CodeViewProjectOf(component);
      if (!cv) return;
      std::shared_ptr<kelSortedCVProject> entry =
          GetSelectedCodeItems()->FindProject(cv);
      if (!entry) entry = GetSelectedCodeItems()->AddProject(cv, component);
      if (!entry) throw automation::Error(automation::kObjectNotSet);
      entry->SetIsAllComponentsSelected(true);
      return;
    }
    if (kind != orel::kind::kClass) return;
    cls = element;
    Object components = automation::GetObject(cls, orel::class_::kComponents);
    if (automation::CLng(
            automation::Get(components, orel::collection::kCount)) < 1) {
      return;
    }
    component =
        automation::GetObject(components, orel::collection::kGetAt, int16_t{1});
  } else {
    if (!Item.IsString()) throw automation::Error(automation::kTypeMismatch);
    if (!ResolveText(Item.StringValue(), tokenizer, cls, component)) return;
  }

  Object cv = CodeViewProjectOf(component);
  if (!cv) return;
  std::string name = CStr(automation::Get(cls, orel::element::kName));
  std::string unique_id = CStr(automation::Get(cls, orel::element::kUniqueId));
  Object index = automation::GetObject(cv, code_view::project::kElementIndex);
  Object code_element = automation::CObj(automation::Call(
      index, code_view::element_index::kFind, name, unique_id));
  if (!code_element) return;
  GetSelectedCodeItems()->AddProject(cv, component);
  GetSelectedCodeItems()->AddComponentToProject(code_element);
}

Object API::CodeViewProjectOf(Object& component) {
  std::string language =
      CStr(automation::Get(component, orel::component::kLanguage));
  std::shared_ptr<kelReporterApi> reporter = theAPIProgress;
  Object cv = GetCodeViewProject(GetOrelApp(), language, component, reporter);
  // The run's reporter is an APIProgress; a look-up that hands back any
  // other kind cannot take its place.
  auto progress = std::dynamic_pointer_cast<APIProgress>(reporter);
  if (reporter && !progress) throw automation::Error(automation::kTypeMismatch);
  theAPIProgress = std::move(progress);
  return cv;
}

void API::Teardown() {
  TraceLine("BEGIN kelQLN:Class_Terminate");
  // Released in this order; the first failure ends the teardown and the
  // globals after it keep their references.
  const std::vector<std::pair<const char*, std::function<void()>>> releases{
      {"OrelApp", [] { SetOrelApp(nullptr); }},
      {"OrelModel", [] { SetOrelModel(nullptr); }},
      {"StringRes", [] { SetStringRes(nullptr); }},
      {"ModelUpdateEngine", [] { SetModelUpdateEngine(nullptr); }},
      {"theAPIProgress", [this] { theAPIProgress = nullptr; }},
      {"SelectedCodeItems",
       [] {
         // A "VC++" project keeps its code open until it is released.
         std::shared_ptr<kelSortedCVProjects> code_items =
             GetSelectedCodeItems();
         if (code_items) {
           auto projects = code_items->GetProjects(kVisualCpp);
           for (const auto& project : *projects) {
             automation::Call(project->Project(), code_view::project::kRelease,
                              shared_simplereporter::Create());
           }
         }
         SetSelectedCodeItems(nullptr);
       }},
      {"SelectedOrelItems", [] { SetSelectedOrelItems(nullptr); }},
      {"QuillonAPI", [] { SetQuillonAPI(nullptr); }},
      {"OrelVSAddIn", [] { SetOrelVSAddIn(nullptr); }},
      {"AddInHandlers", [] { SetAddInHandlers(nullptr); }},
  };
  for (const auto& [label, release] : releases) {
    try {
      release();
    } catch (const automation::Error& error) {
      DebugLog(
          "  FAIL RELEASING" + std::string(label) + ": " + error.Description(),
          kDebugCategoryQln, kDebugLevelError);
      return;
    }
  }
  TraceLine("  END kelQLN:Class_Terminate");
}

}  // namespace kelqln
