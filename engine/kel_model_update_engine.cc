#include "engine/kel_model_update_engine.h"

#include <cmath>
#include <utility>
#include <vector>

#include "automation/call.h"
#include "automation/class_registry.h"
#include "automation/error.h"
#include "engine/element_deletion.h"
#include "engine/model_update_engine_utilities.h"
#include "entry/add_in_services.h"
#include "entry/debug_log.h"
#include "entry/run_globals.h"
#include "entry/wizard_bridge.h"
#include "external/code_view.h"
#include "external/orel.h"
#include "platform/clock.h"
#include "platform/message_pump.h"
#include "platform/registry.h"
#include "reporting/api_progress.h"
#include "reporting/reporter_api_dispatch.h"
#include "selection/kel_sorted_class.h"
#include "selection/kel_sorted_component.h"
#include "selection/kel_sorted_components.h"
#include "selection/kel_sorted_cv_component.h"
#include "selection/kel_sorted_cv_project.h"
#include "selection/kel_sorted_cv_projects.h"
#include "shared/string_utilities.h"

namespace kelqln {

using automation::Args;
using automation::CallKind;
using automation::CStr;
using automation::Object;
using automation::Variant;
namespace orel = external::orel;
namespace code_view = external::code_view;

namespace {

constexpr int32_t kText1621 = 1621;  // totals: "%1" errors, "%2" warnings
constexpr int32_t kText1647 = 1647;
constexpr int32_t kText1648 = 1648;
constexpr int32_t kText3609 = 3609;  // appended to a deletion done
constexpr int32_t kText3610 = 3610;  // appended to a deletion that failed
constexpr int32_t kText3611 = 3611;  // the run was cancelled
constexpr int32_t kText3625 = 3625;  // "%1" component, "%2" code-view project
constexpr int32_t kText3626 = 3626;  // "%1" code-view component
constexpr int32_t kText3627 = 3627;
constexpr int32_t kText3628 = 3628;  // "%1" language
constexpr int32_t kText3629 = 3629;
constexpr int32_t kText3630 = 3630;  // "%1" language
constexpr int32_t kText3631 = 3631;  // "%1" language: no code-view project
constexpr int32_t kText3632 = 3632;
constexpr int32_t kText3640 = 3640;  // "%1" warnings
constexpr int32_t kText3641 = 3641;  // one warning
constexpr int32_t kText3642 = 3642;  // "%1" errors, after warnings
constexpr int32_t kText3643 = 3643;  // "%1" errors
constexpr int32_t kText3644 = 3644;  // one error, after warnings
constexpr int32_t kText3645 = 3645;  // one error
constexpr int32_t kText3646 = 3646;  // "%1" component, "%2" the phrase
constexpr int32_t kText3647 = 3647;  // "%2" component, nothing to report
constexpr int32_t kText3648 = 3648;  // nothing was selected
constexpr int32_t kText3660 = 3660;  // "%1" component, "%2" the error

// The answers of "ShouldBackupModel".
constexpr int32_t kBackupSave = 1;
constexpr int32_t kBackupSaveAs = 2;

// Milliseconds to wait after each project's first progress line, read from
// the settings add-in's key; a batch without anyone watching sets it to 0.
constexpr char kProjectPauseValue[] = "ProjectPause";

constexpr uint32_t kSynchronizePollMs = 10;

// The members of a silent run's callback object, called by name.
constexpr char kOnSynchronize[] = "OnSynchronize";
constexpr char kOnCompleted[] = "OnCompleted";

std::string Filled(int32_t number, const std::string& value) {
  return ReplaceAll("%1", value, StringResText(number));
}

std::string NameOf(const Object& element) {
  return CStr(automation::Get(element, orel::element::kName));
}

float ProjectPauseSeconds() {
  Variant value = ReadRegistryValue(platform::kHkeyLocalMachine, kVSAddInKey,
                                    kProjectPauseValue);
  // A dword beyond 2^31 - 1 reads as negative: no sensible pause either.
  if (value.Type() != automation::VarType::kLong ||
      automation::CLng(value) < 0) {
    return kelModelUpdateEngine::kDefaultProjectPauseSeconds;
  }
  return static_cast<float>(automation::CLng(value)) / 1000.0f;
}

void ReportError(kelReporterApi& reporter, std::string text) {
  reporter.Error(text);
}

// The member that gives a member's owner class, by the member's kind name;
// null for a kind that is no member of a class.
const automation::DispId* OwnerMemberOf(const std::string& kind) {
  static const std::pair<const char*, automation::DispId> kOwners[] = {
      {orel::kind::kAttribute, orel::owner::kOfAttribute},
      {orel::kind::kOperation, orel::owner::kOfOperation},
      {orel::kind::kRole, orel::owner::kOfRole},
      {orel::kind::kInheritRelation, orel::owner::kOfInheritRelation},
      {orel::kind::kRealizeRelation, orel::owner::kOfRealizeRelation},
      {orel::kind::kHasRelationship, orel::owner::kOfHasRelationship},
  };
  for (const auto& [name, owner] : kOwners) {
    if (kind == name) return &owner;
  }
  return nullptr;
}

// The items of a collection object from outside (a code-view collection, a
// callback's list).
std::vector<Variant> ItemsOf(const Variant& collection) {
  return automation::CollectionItems(automation::CObj(collection));
}

}  // namespace

// What one call of UpdateModel keeps; none of it outlives the run.
struct kelModelUpdateEngine::Run {
  Object application;
  Object model;
  std::shared_ptr<kelSortedCVProjects> code_selection;
  Object callback;
  bool silent = false;
  float project_pause = kDefaultProjectPauseSeconds;
  std::string done;    // text 3609
  std::string failed;  // text 3610
  // The reporter's counts after the previous project, across languages.
  int32_t warnings_before = 0;
  int32_t errors_before = 0;
};

kelModelUpdateEngine::kelModelUpdateEngine() {
  DebugLog("kelQLNEngine:Class_Initialize", kDebugCategoryQln,
           kDebugLevelTrace);
}

kelModelUpdateEngine::~kelModelUpdateEngine() {
  DebugLog("kelQLNEngine:Class_Terminate", kDebugCategoryQln, kDebugLevelTrace);
}

void kelModelUpdateEngine::ShowSummaryPage(bool fSilent) {
  if (!reporter_) throw automation::Error(automation::kObjectNotSet);
  reporter_->Log(StringResText(kText1647));
  reporter_->Log(StringResText(kText1648));
  int32_t errors = reporter_->ErrorCount();
  int32_t warnings = reporter_->WarningCount();
  std::string totals = ReplaceAll("%2", std::to_string(warnings),
                                  Filled(kText1621, std::to_string(errors)));
  reporter_->Log(totals);
  reporter_->Summary(totals);
  // Only the run's own kind of reporter has displays to switch; a reporter
  // that a callback put in its place still gets the closing lines, and the
  // run ends as it should rather than fail after all its work is done.
  if (auto progress = std::dynamic_pointer_cast<APIProgress>(reporter_)) {
    progress->ShowLog();
    progress->ShowSummary();
    progress->SetShowLogOnDemand(false);
    progress->SetShowSummaryOnDemand(false);
  }
  if (!fSilent) Wizard().DisplaySummaryPage();
}

std::shared_ptr<kelSortedComponents> kelModelUpdateEngine::ShowSynchronizePage(
    const std::shared_ptr<kelSortedComponents>& candidates) {
  WizardBridge& wizard = Wizard();
  wizard.SetSynchronizeConfirmed(false);
  wizard.DisplaySynchronizePage(candidates);
  while (!wizard.SynchronizeConfirmed()) {
    platform::Sleep(kSynchronizePollMs);
    platform::DoEvents();
  }
  return wizard.SynchronizeChoice();
}

std::shared_ptr<automation::Collection>
kelModelUpdateEngine::GetAddInEventServers(const Object& theOrelApp) {
  auto servers = automation::Collection::Create();
  Object add_ins;
  int32_t count = 0;
  try {
    add_ins = automation::GetObject(
        automation::GetObject(theOrelApp, orel::application::kAddInManager),
        orel::add_in_manager::kAddIns);
    count =
        automation::CLng(automation::Get(add_ins, orel::collection::kCount));
  } catch (const automation::Error&) {
    return servers;
  }
  for (int32_t i = 1; i <= count; ++i) {
    try {
      Object add_in =
          automation::GetObject(add_ins, orel::collection::kGetAt, i);
      if (!automation::CBool(automation::Get(add_in, orel::add_in::kIsActive)))
        continue;
      std::string name = CStr(automation::Get(add_in, orel::add_in::kName));
      if (!IsRTEAddIn(theOrelApp, name, "")) continue;
      Object server = GetAddInServer(theOrelApp, name, "");
      if (server) servers->Items().Add(Variant(server), name);
    } catch (const automation::Error&) {
      // This add-in is left out; the others are still asked.
    }
  }
  return servers;
}

void kelModelUpdateEngine::UpdateModel(
    const Object& theOrelApp,
    const std::shared_ptr<kelSortedCVProjects>& codeSelection,
    std::shared_ptr<APIProgress>& progress, const Object& CallBack,
    bool fSilent) {
  if (!progress || !codeSelection) {
    throw automation::Error(automation::kObjectNotSet);
  }
  progress->SetShowLogOnDemand(true);
  progress->SetShowSummaryOnDemand(true);
  reporter_ = progress;
  Run run;
  run.application = theOrelApp;
  run.code_selection = codeSelection;
  run.callback = CallBack;
  run.silent = fSilent;
  run.done = StringResText(kText3609);
  run.failed = StringResText(kText3610);
  run.project_pause = ProjectPauseSeconds();
  cancelled_ = false;
  if (IsCancelled()) return;

  std::shared_ptr<automation::Collection> servers =
      GetAddInEventServers(theOrelApp);
  NameCollection languages = codeSelection->GetIncludedLanguages();
  run.model =
      automation::GetObject(theOrelApp, orel::application::kCurrentModel);
  if (automation::CBool(automation::Get(run.model, orel::model::kAskForBackup)))
    Backup(run, *servers, languages);

  for (const std::string& language : languages) {
    // A language without an active round-trip add-in has no server: the
    // look-up fails and ends the run.
    Object server = automation::CObj(servers->Items().Item(language));
    NotifyModelUpdate(language, server, true);
    reporter_->Log(StringResText(kText3627));
    reporter_->Log(Filled(kText3628, language));
    reporter_->Summary(StringResText(kText3629));
    // The selection's own collection: each project processed leaves it.
    std::shared_ptr<const SortedCVProjectCollection> projects =
        codeSelection->GetProjects(language);
    reporter_->ComponentCount(automation::CInt(Variant(projects->Count())));
    int32_t next = 1;
    while (projects->Count() >= next) {
      std::shared_ptr<kelSortedCVProject> project = projects->Item(next);
      if (!UpdateProject(run, language, server, project)) return;
      // The clean-up may find no entry to remove (the code-view look-up can
      // hand back another component than the one the entry was filed
      // under); the loop moves on past the project all the same.
      if (projects->Count() >= next && projects->Item(next) == project) ++next;
    }
    NotifyModelUpdate(language, server, false);
  }

  if (languages.Empty()) {
    reporter_->Log(StringResText(kText3648));
    reporter_->Summary(StringResText(kText3648));
  }
  ShowSummaryPage(fSilent);
  if (fSilent && CallBack) {
    try {
      Args args{Variant(ReporterObject(reporter_))};
      automation::InvokeByName(CallBack, kOnCompleted, CallKind::kMethod, args);
      // A reporter the callback hands back is not kept: the run is over.
    } catch (const automation::Error&) {
      // The run is done; a callback that fails to hear it changes nothing.
    }
  }
  reporter_ = nullptr;
}

void kelModelUpdateEngine::RequestCancel() { cancelled_ = true; }

bool kelModelUpdateEngine::IsCancelled() {
  platform::DoEvents();
  if (cancelled_) {
    if (!reporter_) throw automation::Error(automation::kObjectNotSet);
    ReportError(*reporter_, StringResText(kText3611));
    reporter_->Summary(StringResText(kText3611));
    ShowCancelledSummary();
  }
  return cancelled_;
}

void kelModelUpdateEngine::ShowCancelledSummary() { ShowSummaryPage(false); }

void kelModelUpdateEngine::Pause(float seconds) {
  double start = platform::MonotonicSeconds();
  for (;;) {
    double left = seconds - (platform::MonotonicSeconds() - start);
    if (left <= 0) return;
    platform::Sleep(static_cast<uint32_t>(std::ceil(left * 1000.0)));
  }
}

void kelModelUpdateEngine::NotifyModelUpdate(const std::string& language,
                                             const Object& server,
                                             bool starting) {
  const char* notice = starting ? code_view::rte_server::kOnModelUpdateStart
                                : code_view::rte_server::kOnModelUpdateEnd;
  auto notify = [notice](const Object& add_in_server) {
    try {
      automation::CallByName(GetRTEServerOf(add_in_server), notice);
    } catch (const automation::Error&) {
      // A notice is a courtesy; an add-in that cannot take it is skipped.
    }
  };
  notify(server);
  std::shared_ptr<automation::Collection> others;
  try {
    others = GetAddInServers(GetOrelApp(), language, "");
  } catch (const automation::Error&) {
    return;
  }
  for (const Variant& other : others->Items()) {
    if (other.IsObject()) notify(other.ObjectValue());
  }
}

void kelModelUpdateEngine::SynchronizeWithCallBack(
    const Object& CallBack, std::shared_ptr<kelSortedComponents>& selection,
    const Object& component) {
  if (!CallBack) return;
  auto list = automation::Collection::Create();
  for (const std::string& language : selection->GetIncludedLanguages()) {
    auto components = selection->GetComponents(language);
    for (const auto& sorted_component : *components) {
      for (const auto& sorted_class : *sorted_component->Classes()) {
        if (sorted_class->Members()->Empty()) {
          list->Items().Add(Variant(sorted_class->Class()));
          continue;
        }
        for (const Object& member : *sorted_class->Members()) {
          list->Items().Add(Variant(member));
        }
      }
    }
  }
  try {
    CallBack->IdOfName(kOnSynchronize);
  } catch (const automation::Error&) {
    return;  // a caller that only wants "OnCompleted": every candidate goes
  }
  std::vector<Variant> confirmed;
  std::shared_ptr<kelReporterApi> reporter;
  try {
    Args args{Variant(GetOrelApp()), Variant(list),
              Variant(ReporterObject(reporter_))};
    automation::InvokeByName(CallBack, kOnSynchronize, CallKind::kMethod, args);
    if (args.size() != 3) {
      throw automation::Error(automation::kWrongArgumentCount);
    }
    confirmed = ItemsOf(args[1]);
    reporter = ReporterOf(args[2]);
    if (!reporter) throw automation::Error(automation::kObjectNotSet);
  } catch (const automation::Error& error) {
    selection = std::make_shared<kelSortedComponents>();
    std::string what =
        "error " + std::to_string(error.Number()) + ", " + error.Description();
    ReportError(*reporter_,
                ReplaceAll("%2", what, Filled(kText3660, NameOf(component))));
    return;
  }
  reporter_ = std::move(reporter);

  selection = std::make_shared<kelSortedComponents>();
  for (const Variant& element : confirmed) {
    Object object = automation::CObj(element);
    std::string kind = CStr(automation::Get(object, orel::element::kKindName));
    if (kind == orel::kind::kClass) {
      selection->AddClassInComponent(object, component);
      continue;
    }
    const automation::DispId* owner = OwnerMemberOf(kind);
    if (owner == nullptr) continue;  // no kind that can be deleted
    AddToSelection(object, automation::GetObject(object, *owner), component,
                   *selection);
  }
}

void kelModelUpdateEngine::AddToSelection(const Object& member,
                                          const Object& owner,
                                          const Object& component,
                                          kelSortedComponents& selection) {
  std::shared_ptr<kelSortedClass> entry =
      selection.FindClassInComponent(owner, component);
  if (!entry) entry = selection.AddClassInComponent(owner, component);
  if (!entry) throw automation::Error(automation::kObjectNotSet);
  entry->AddMember(member);
}

void kelModelUpdateEngine::Backup(const Run& run,
                                  const automation::Collection& servers,
                                  const NameCollection& languages) {
  int32_t choice = 0;
  for (const std::string& language : languages) {
    try {
      Object server = automation::CObj(servers.Items().Item(language));
      int32_t answer = automation::CLng(automation::CallByName(
          GetRTEServerOf(server), code_view::rte_server::kShouldBackupModel));
      if (answer == kBackupSaveAs) {
        choice = kBackupSaveAs;
        break;
      }
      if (answer == kBackupSave) choice = kBackupSave;
    } catch (const automation::Error&) {
      // A server that cannot answer leaves the choice as it is.
    }
  }
  if (choice == kBackupSave) {
    SaveModel(run.application);
  } else if (choice == kBackupSaveAs && !run.silent) {
    SaveModelUnderChosenName(run.application);
  }
}

bool kelModelUpdateEngine::UpdateProject(
    Run& run, const std::string& language, const Object& server,
    const std::shared_ptr<kelSortedCVProject>& project) {
  Object collector = automation::CreateObject(code_view::collector::kProgId);
  Object component = project->OrelComponent();
  reporter_->TickText(Filled(kText3630, language), false);
  Pause(run.project_pause);
  Object cv = project->Project();
  if (!cv) {
    cv = GetCodeViewProject(run.application, language, component, reporter_);
    // The look-up may hand back another reporter, but the run needs one.
    if (!reporter_) throw automation::Error(automation::kObjectNotSet);
  }
  if (!cv) {
    ReportError(*reporter_, Filled(kText3631, language));
    RemoveProject(run, *project, component);
    return true;
  }
  std::string cv_name = CStr(automation::Get(cv, code_view::project::kName));
  std::string component_name = NameOf(component);
  reporter_->Component(cv_name);
  reporter_->Log(ReplaceAll("%2", cv_name, Filled(kText3625, component_name)));
  reporter_->Summary(component_name);

  Object reporter = ReporterObject(reporter_);
  try {
    automation::Call(cv, code_view::project::kOpen, reporter);
  } catch (const automation::Error&) {
    // A project that does not open has said why on the reporter; it is let
    // go and the run goes on with the next one.
    try {
      automation::Call(cv, code_view::project::kRelease, reporter);
    } catch (const automation::Error&) {
      // Under the open's guard: the project is dropped all the same.
    }
    RemoveProject(run, *project, component);
    return true;
  }
  automation::Call(cv, code_view::project::kUpdateModel, run.model, reporter,
                   collector, false);
  if (!UpdateComponents(run, cv, *project, collector)) {
    NotifyModelUpdate(language, server, false);
    automation::Call(cv, code_view::project::kRelease,
                     ReporterObject(reporter_));
    return false;
  }
  SynchronizeProject(run, language, component, collector);
  reporter = ReporterObject(reporter_);
  automation::Call(cv, code_view::project::kFinish, reporter);
  automation::Call(cv, code_view::project::kRelease, reporter);
  ReportProjectResult(run, component_name);
  RemoveProject(run, *project, component);
  return true;
}

bool kelModelUpdateEngine::UpdateComponents(const Run& run, const Object& cv,
                                            const kelSortedCVProject& project,
                                            const Object& collector) {
  std::vector<Variant> all =
      ItemsOf(automation::Get(cv, code_view::project::kComponents));
  int16_t all_count =
      automation::CInt(Variant(static_cast<int32_t>(all.size())));
  reporter_->TickCount(all_count, true);

  std::vector<Object> chosen;
  if (project.IsAllComponentsSelected()) {
    reporter_->ClassCount(all_count);
    for (const Variant& component : all) {
      chosen.push_back(automation::CObj(component));
    }
  } else {
    reporter_->ClassCount(
        automation::CInt(Variant(project.Components()->Count())));
    for (const auto& sorted : *project.Components()) {
      chosen.push_back(sorted->Component());
    }
  }
  for (const Object& component : chosen) {
    std::string name =
        CStr(automation::Get(component, code_view::component::kName));
    reporter_->Class(name);
    // With every component chosen the log lists them; a partial choice
    // shows each on the progress tick instead.
    if (project.IsAllComponentsSelected()) {
      reporter_->Log(Filled(kText3626, name));
      reporter_->Tick("");
    } else {
      reporter_->Tick(Filled(kText3626, name));
    }
    if (IsCancelled()) return false;
    automation::Call(component, code_view::component::kUpdateModel, run.model,
                     ReporterObject(reporter_), collector, true);
  }
  return true;
}

void kelModelUpdateEngine::SynchronizeProject(const Run& run,
                                              const std::string& language,
                                              const Object& component,
                                              const Object& collector) {
  std::vector<Variant> classes = ItemsOf(
      automation::Get(collector, code_view::collector::kVanishedClasses));
  std::vector<Variant> entries = ItemsOf(
      automation::Get(collector, code_view::collector::kVanishedMembers));
  if (classes.empty() && entries.empty()) return;

  auto selection = std::make_shared<kelSortedComponents>();
  for (const Variant& cls : classes) {
    selection->AddClassInComponent(automation::CObj(cls), component);
  }
  for (const Variant& entry : entries) {
    Object owner = automation::GetObject(automation::CObj(entry),
                                         code_view::collector_entry::kClass);
    std::shared_ptr<kelSortedClass> sorted_class =
        selection->AddClassInComponent(owner, component);
    if (!sorted_class) throw automation::Error(automation::kObjectNotSet);
    for (const Variant& member : ItemsOf(automation::Get(
             automation::CObj(entry), code_view::collector_entry::kMembers))) {
      sorted_class->AddMember(automation::CObj(member));
    }
  }
  if (run.silent) {
    SynchronizeWithCallBack(run.callback, selection, component);
  } else {
    selection = ShowSynchronizePage(selection);
    if (!selection) throw automation::Error(automation::kObjectNotSet);
  }
  reporter_->TickText(StringResText(kText3632), false);
  DeleteSelectedElements(*selection, language, *reporter_, run.done,
                         run.failed);
}

void kelModelUpdateEngine::ReportProjectResult(
    Run& run, const std::string& component_name) {
  int32_t warnings_now = reporter_->WarningCount();
  int32_t errors_now = reporter_->ErrorCount();
  int32_t warnings = warnings_now - run.warnings_before;
  int32_t errors = errors_now - run.errors_before;
  run.warnings_before = warnings_now;
  run.errors_before = errors_now;

  std::string phrase;
  if (warnings > 1) {
    phrase = Filled(kText3640, std::to_string(warnings));
  } else if (warnings == 1) {
    phrase = StringResText(kText3641);
  }
  if (errors > 1) {
    phrase += phrase.empty() ? Filled(kText3643, std::to_string(errors))
                             : Filled(kText3642, std::to_string(errors));
  } else if (errors == 1) {
    phrase += StringResText(phrase.empty() ? kText3645 : kText3644);
  }
  if (warnings > 0 || errors > 0) {
    reporter_->Summary(
        ReplaceAll("%2", phrase, Filled(kText3646, component_name)));
  } else {
    // Text 3647 takes the component's name as "%2".
    reporter_->Summary(
        ReplaceAll("%2", component_name, StringResText(kText3647)));
  }
}

void kelModelUpdateEngine::RemoveProject(const Run& run,
                                         const kelSortedCVProject& project,
                                         const Object& component) {
  if (project.Project()) {
    run.code_selection->RemoveProject(project.Project());
    return;
  }
  run.code_selection->RemoveProjectWithUniqueID(
      CStr(automation::Get(component, orel::element::kUniqueId)));
}

}  // namespace kelqln
