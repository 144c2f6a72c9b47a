#include "selection/kel_sorted_cv_project.h"

#include "automation/call.h"
#include "automation/error.h"
#include "entry/add_in_services.h"
#include "entry/debug_log.h"
#include "external/code_view.h"
#include "external/orel.h"
#include "external/reporter_api.h"
#include "selection/identity_changes.h"
#include "selection/kel_sorted_cv_component.h"
#include "selection/model_reads.h"
#include "shared/string_utilities.h"

namespace kelqln {
namespace {

namespace cv = external::code_view;
namespace orel = external::orel;
using automation::CObj;
using automation::CStr;
using automation::Get;
using automation::Object;

constexpr char kClashText[] =
    "Could not change unique ID of \"%1\" to \"%2\" because \"%3\" already "
    "has that unique ID.";

}  // namespace

kelSortedCVProject::kelSortedCVProject()
    : kelSortedCVProject(nullptr, nullptr) {}

kelSortedCVProject::kelSortedCVProject(Object project, Object orel_component)
    : trace_("kelSortedCVProject", this),
      project_(std::move(project)),
      components_(std::make_shared<SortedCVComponentCollection>()),
      orel_component_(std::move(orel_component)) {}

kelSortedCVProject::~kelSortedCVProject() {
  trace_.Release(project_, cv::project::kName);
}

void kelSortedCVProject::SetProject(Object value) {
  if (value == project_) return;
  project_ = std::move(value);
  CountIdentityChange();
}

void kelSortedCVProject::SetComponents(
    std::shared_ptr<SortedCVComponentCollection> value) {
  components_ = value ? std::move(value)
                      : std::make_shared<SortedCVComponentCollection>();
}

void kelSortedCVProject::SetOrelComponent(Object value) {
  if (value == orel_component_) return;
  orel_component_ = std::move(value);
  CountIdentityChange();
}

ObjectCollection kelSortedCVProject::GetCodeViewComponents() const {
  ObjectCollection components;
  for (const auto& entry : *components_) components.Add(entry->Component());
  return components;
}

bool kelSortedCVProject::AddMemberInComponent(const Object& anKelMember,
                                              const Object& anKelComponent) {
  auto entry = FindComponent(anKelComponent);
  return entry && entry->AddMember(anKelMember);
}

bool kelSortedCVProject::RemoveMemberFromComponent(
    const Object& anKelMember, const Object& anKelComponent) {
  auto entry = FindComponent(anKelComponent);
  if (!entry || !entry->RemoveMember(anKelMember)) return false;
  if (entry->Members()->Empty()) RemoveComponent(anKelComponent);
  return true;
}

std::shared_ptr<kelSortedCVComponent> kelSortedCVProject::FindComponent(
    const Object& lComponent) const {
  int32_t position = PositionOf(lComponent);
  return position == 0 ? nullptr : components_->Item(position);
}

void kelSortedCVProject::RemoveComponent(const Object& lComponent) {
  int32_t position = PositionOf(lComponent);
  if (position != 0) components_->Remove(position);
}

Object kelSortedCVProject::InitCodeViewProject(const Object& lCodeView) {
  std::string language;
  try {
    language = LanguageOf(orel_component_);
    Object server = GetRTEServerOf(
        GetAddInServer(ApplicationOf(orel_component_), language, ""));
    SetProject(CObj(automation::CallByName(
        server, cv::rte_server::kCodeViewProject, orel_component_, lCodeView)));

    std::string id = CStr(Get(project_, cv::project::kUniqueId));
    std::string own_id = UniqueIdOf(orel_component_);
    if (id.empty()) {
      automation::Let(project_, cv::project::kUniqueId, own_id);
    } else if (id != own_id) {
      Object components = CObj(automation::Call(
          automation::GetObject(orel_component_, orel::component::kModel),
          orel::model::kAllComponents));
      Object holder = CObj(
          automation::Call(components, orel::collection::kFindByUniqueId, id));
      if (!holder) {
        automation::CallByName(orel_component_, orel::element::kSetUniqueId,
                               id);
        CountIdentityChange();
      } else {
        ReportIdentifierClash(lCodeView, holder, id);
      }
    }
  } catch (const automation::Error& error) {
    DebugLog("ERROR kelQLN.InitCodeViewProject(" + language +
                 "): " + error.Description(),
             kDebugCategoryQln, kDebugLevelError);
  }
  return project_;
}

int32_t kelSortedCVProject::PositionOf(const Object& lComponent) const {
  int32_t position = 0;
  for (const auto& entry : *components_) {
    ++position;
    if (entry->Component() == lComponent) return position;
  }
  return 0;
}

void kelSortedCVProject::ReportIdentifierClash(const Object& lCodeView,
                                               const Object& holder,
                                               const std::string& id) const {
  auto display_name = [](const Object& component) {
    return CStr(Get(component, orel::component::kDisplayName));
  };
  std::string text =
      ReplaceAll("%1", display_name(orel_component_), kClashText);
  text = ReplaceAll("%2", id, text);
  text = ReplaceAll("%3", display_name(holder), text);
  // An error, not a warning: the project cannot be matched to its
  // component's model elements until one of the two identifiers changes.
  automation::CallByName(lCodeView, external::reporter_api::kError, text);
}

}  // namespace kelqln
