#include "selection/kel_sorted_components.h"

#include <algorithm>

#include "automation/call.h"
#include "automation/case_folding.h"
#include "automation/error.h"
#include "entry/add_in_services.h"
#include "entry/debug_log.h"
#include "external/code_view.h"
#include "external/orel.h"
#include "platform/files.h"
#include "selection/identity_changes.h"
#include "selection/kel_sorted_class.h"
#include "selection/kel_sorted_component.h"
#include "selection/model_reads.h"
#include "shared/string_utilities.h"

namespace kelqln {
namespace {

namespace orel = external::orel;
using automation::CBool;
using automation::CObj;
using automation::CStr;
using automation::EqualsIgnoreCase;
using automation::Get;
using automation::Object;
using automation::Variant;

constexpr char kVCpp[] = "VC++";
constexpr char kMidl[] = "MIDL";
// The MIDL companion's trace lines of AddClass go out under the category of
// the synchronising sibling tool, which shares this code.
constexpr int32_t kMidlTraceCategory = 2;

// A step that may fail without stopping the operation it belongs to: the
// operations that go on past failing steps run each step through this.
template <class Step>
void Guarded(Step&& step) {
  try {
    step();
  } catch (const automation::Error&) {
    // The next step follows.
  }
}

// The language a component is filed under: its own, or "Unassigned" for
// none (and for no component: the pseudo-component's).
std::string FilingLanguageOf(const Object& component) {
  std::string language = component ? LanguageOf(component) : "";
  return language.empty() ? kelSortedComponents::kUnassigned : language;
}

bool IsInterfaceOrCoclass(const Object& cls) {
  std::string stereotype = StereotypeOf(cls);
  return EqualsIgnoreCase(stereotype, "interface") ||
         EqualsIgnoreCase(stereotype, "coclass");
}

bool HasMidlComponent(const Object& cls) {
  for (const Object& component : ItemsOf(cls, orel::class_::kComponents)) {
    if (StereotypeOf(component) == kMidl) return true;
  }
  return false;
}

std::string AssignedToMidlLine(const std::string& name, bool created) {
  return "AddClass: Assign to MIDL " + name +
         "\r\n\tCreate=" + CStr(Variant(created));
}

// Sets the element's "VC++" tool property, creating it (typed "Boolean" for
// a Boolean value, else "String") when missing. True when it existed.
bool SetToolProperty(const Object& element, const std::string& name,
                     const Variant& value) {
  try {
    std::string text = CStr(value);
    Object existing = CObj(automation::Call(
        element, orel::element::kFindToolProperty, kVCpp, name));
    if (existing) {
      automation::Call(element, orel::element::kOverrideToolProperty, kVCpp,
                       name, text);
      return true;
    }
    automation::Call(element, orel::element::kCreateToolProperty, kVCpp, name,
                     text, value.IsBoolean() ? "Boolean" : "String");
  } catch (const automation::Error&) {
    // A companion without the property still serves.
  }
  return false;
}

// Gives `target` the tool property `property` of another element, unless it
// has it already with the same value and type.
void CopyToolProperty(const Object& property, const Object& target) {
  namespace tp = orel::tool_property;
  std::string tool = CStr(Get(property, tp::kTool));
  std::string name = CStr(Get(property, tp::kName));
  std::string value = CStr(Get(property, tp::kValue));
  std::string type = CStr(Get(property, tp::kType));
  Object existing = CObj(
      automation::Call(target, orel::element::kFindToolProperty, tool, name));
  if (!existing) {
    automation::Call(target, orel::element::kCreateToolProperty, tool, name,
                     value, type);
  } else if (CStr(Get(existing, tp::kValue)) != value ||
             CStr(Get(existing, tp::kType)) != type) {
    automation::Call(target, orel::element::kOverrideToolProperty, tool, name,
                     value);
  }
}

// The VC++ add-in's component-properties service, or Nothing.
Object GetCompPropertiesAPI(const Object& component) {
  try {
    Object server = GetAddInServer(ApplicationOf(component), kVCpp, kVCpp);
    return CObj(automation::CallByName(
        server, external::code_view::add_in_server::kCompPropertiesApi));
  } catch (const automation::Error&) {
    return nullptr;  // no VC++ add-in: the companion gets no file
  }
}

// The interface definition file beside a project file: its name with the
// extension "idl", else "odl", when such a file can be read; "" otherwise,
// also for a project file without extension (whose directory names are not
// taken apart).
std::string FindInterfaceFile(const std::string& project_file) {
  size_t name_start = project_file.find_last_of("/\\");
  name_start = name_start == std::string::npos ? 0 : name_start + 1;
  size_t dot = project_file.rfind('.');
  if (dot == std::string::npos || dot < name_start) return "";
  std::string base = project_file.substr(0, dot + 1);
  for (const char* extension : {"idl", "odl"}) {
    if (platform::CanOpenForReading(base + extension)) return base + extension;
  }
  return "";
}

}  // namespace

kelSortedComponents::kelSortedComponents()
    : indexed_at_(IdentityChangeCount()) {}

NameCollection kelSortedComponents::GetIncludedLanguages() const {
  return IncludedLanguages(languages_, kUnassigned);
}

std::shared_ptr<const SortedComponentCollection>
kelSortedComponents::GetUnassignedComponents() const {
  return GetComponents(kUnassigned);
}

std::shared_ptr<SortedClassCollection>
kelSortedComponents::GetUnassignedClasses() const {
  auto pseudo = FindPseudoComponent();
  return pseudo ? pseudo->Classes() : std::make_shared<SortedClassCollection>();
}

std::shared_ptr<const SortedComponentCollection>
kelSortedComponents::GetComponents(std::string_view language) const {
  const Language* found =
      languages_.Find(language.empty() ? kUnassigned : language);
  return found ? found->entries : std::make_shared<SortedComponentCollection>();
}

std::shared_ptr<kelSortedComponent> kelSortedComponents::AddComponent(
    const Object& component) {
  if (!component) return nullptr;
  auto entry = GetSortedComponent(component);
  if (!entry) return nullptr;

  // A VC++ component's interfaces and coclasses also belong to a MIDL
  // component; those that have none are noted for the companion.
  bool vcpp_non_midl =
      LanguageOf(component) == kVCpp && StereotypeOf(component) != kMidl;
  std::vector<Object> noted;
  for (const Object& cls : ItemsOf(component, orel::component::kClasses)) {
    AddClass(cls, entry);
    if (vcpp_non_midl && IsInterfaceOrCoclass(cls) && !HasMidlComponent(cls)) {
      noted.push_back(cls);
    }
  }
  if (noted.empty()) return entry;

  std::string name = NameOf(component) + ".idl";
  MidlComponent midl = GetMidlComponent(component, name);
  if (!midl.component) {
    DebugLog("AddClass: CAN NOT Assign to MIDL " + name, kMidlTraceCategory,
             kDebugLevelError);
    return entry;
  }
  DebugLog(AssignedToMidlLine(name, midl.created), kDebugCategoryQln,
           kDebugLevelWarning);
  for (const Object& cls : noted) {
    automation::Call(cls, orel::class_::kAssignToComponent, midl.component);
    AddClassToSortedComponent(cls, GetSortedComponent(midl.component));
  }
  return entry;
}

std::shared_ptr<kelSortedComponent> kelSortedComponents::AddComponentNoClasses(
    const Object& component) {
  if (!component) return nullptr;
  try {
    std::string language = FilingLanguageOf(component);
    return File(LanguageComponents(language), component, language,
                UniqueIdOf(component));
  } catch (const automation::Error&) {
    return nullptr;  // filed already, or no readable component
  }
}

void kelSortedComponents::RemoveComponent(const Object& aOrelModule) {
  if (!aOrelModule) throw automation::Error(automation::kObjectNotSet);
  std::string id = UniqueIdOf(aOrelModule);
  if (const Placement* placement = FindPlacement(id)) Unfile(id, *placement);
}

void kelSortedComponents::AddClass(
    const Object& lClass, const std::shared_ptr<kelSortedComponent>& entry) {
  if (!lClass) return;
  if (entry) {
    Guarded([&] { AddClassToSortedComponent(lClass, entry); });
    return;
  }
  AddClassWithoutEntry(lClass);
}

std::shared_ptr<kelSortedClass> kelSortedComponents::AddClassInComponent(
    const Object& lClass, const Object& lComponent) {
  return AddClassToSortedComponent(lClass, GetSortedComponent(lComponent));
}

void kelSortedComponents::RemoveClassFromComponent(
    const Object& lClass, const Object& lComponent,
    bool fRemoveComponentIfLast) {
  auto entry = GetSortedComponent(lComponent);
  if (!entry) return;  // refused: there is nothing to remove
  entry->RemoveClass(UniqueIdOf(lClass));
  // The pseudo-component is only ever removed with the language
  // "Unassigned"; asking for it here would be an error after the work is
  // done.
  if (entry->Classes()->Empty() && fRemoveComponentIfLast && lComponent) {
    RemoveComponent(lComponent);
  }
}

void kelSortedComponents::RemoveClassFromAllComponents(
    const Object& lClass, bool fRemoveComponentIfLast) {
  std::vector<Object> components = ItemsOf(lClass, orel::class_::kComponents);
  if (components.empty()) {
    RemoveClassFromComponent(lClass, nullptr, false);
    return;
  }
  for (const Object& component : components) {
    RemoveClassFromComponent(lClass, component, fRemoveComponentIfLast);
  }
}

void kelSortedComponents::SortComponents(const Object& lComponents,
                                         const Object& lClasses) {
  for (const Object& component : ModelItems(lComponents)) {
    AddComponent(component);
  }
  for (const Object& cls : ModelItems(lClasses)) AddClass(cls);
}

void kelSortedComponents::SortSelection(const Object& lModel) {
  for (const Object& component :
       ItemsOf(lModel, orel::model::kSelectedComponents)) {
    AddComponent(component);
  }
  for (const Object& package :
       ItemsOf(lModel, orel::model::kSelectedComponentPackages)) {
    for (const Object& component :
         ItemsOf(package, orel::component_package::kComponents)) {
      AddComponent(component);
    }
  }
  for (const Object& cls : ItemsOf(lModel, orel::model::kSelectedClasses)) {
    AddClass(cls);
  }
  for (const Object& package :
       ItemsOf(lModel, orel::model::kSelectedLogicalPackages)) {
    for (const Object& cls :
         ItemsOf(package, orel::logical_package::kClasses)) {
      AddClass(cls);
    }
  }
}

void kelSortedComponents::SortSelectionAllComponents(const Object& lModel) {
  GetAllComponentsFromModel(lModel);
  for (const Object& cls : ItemsOf(lModel, orel::model::kSelectedClasses)) {
    AddClass(cls);
  }
  for (const Object& package :
       ItemsOf(lModel, orel::model::kSelectedLogicalPackages)) {
    for (const Object& cls :
         ItemsOf(package, orel::logical_package::kClasses)) {
      AddClass(cls);
    }
  }
}

void kelSortedComponents::GetAllComponentsAndClassesFromModel(
    const Object& lModel) {
  GetAllComponentsFromModel(lModel);
  GetAllClassesFromModel(lModel);
}

void kelSortedComponents::GetAllComponentsFromModel(const Object& lModel) {
  for (const Object& component : ItemsOf(lModel, orel::model::kAllComponents)) {
    AddComponent(component);
  }
}

void kelSortedComponents::GetAllClassesFromModel(const Object& lModel) {
  for (const Object& cls : ItemsOf(lModel, orel::model::kAllClasses)) {
    AddClass(cls);
  }
}

std::shared_ptr<kelSortedComponent> kelSortedComponents::FindComponent(
    const Object& aOrelModule) {
  if (!aOrelModule) return FindPseudoComponent();
  return FindComponentFromUniqueID(UniqueIdOf(aOrelModule));
}

std::shared_ptr<kelSortedComponent>
kelSortedComponents::FindComponentFromUniqueID(
    std::string_view aComponentUniqueID) {
  const Placement* placement = FindPlacement(aComponentUniqueID);
  return placement ? placement->entry : nullptr;
}

std::shared_ptr<kelSortedClass> kelSortedComponents::FindClassInComponent(
    const Object& aOrelClass, const Object& aOrelModule) {
  auto entry = FindComponent(aOrelModule);
  if (!entry) return nullptr;
  auto* found = entry->Classes()->Find(UniqueIdOf(aOrelClass));
  return found ? *found : nullptr;
}

Object kelSortedComponents::FindClass(std::string_view aClassUniqueID) const {
  for (const Language& language : languages_) {
    for (const auto& entry : *language.entries) {
      if (auto* found = entry->Classes()->Find(aClassUniqueID)) {
        return (*found)->Class();
      }
    }
  }
  return nullptr;
}

bool kelSortedComponents::IsClassInComponent(const Object& aOrelClass,
                                             const Object& aOrelModule) {
  return FindClassInComponent(aOrelClass, aOrelModule) != nullptr;
}

void kelSortedComponents::RemoveAllUnassignedItems() {
  if (!languages_.Contains(kUnassigned)) return;
  languages_.Remove(kUnassigned);
  for (auto& [id, placements] : by_unique_id_) {
    std::erase_if(placements, [](const Placement& placement) {
      return EqualsIgnoreCase(placement.language, kUnassigned);
    });
  }
}

ObjectCollection kelSortedComponents::GetAllOrelComponents() const {
  ObjectCollection components;
  for (const Language& language : languages_) {
    for (const auto& entry : *language.entries) {
      if (!entry->Component()) continue;
      std::string id = UniqueIdOf(entry->Component());
      if (!components.Contains(id)) components.Add(entry->Component(), id);
    }
  }
  return components;
}

std::shared_ptr<kelSortedComponents> kelSortedComponents::Clone() const {
  auto copy = std::make_shared<kelSortedComponents>();
  for (const Language& language : languages_) {
    for (const auto& entry : *language.entries) {
      copy->AddComponentNoClasses(entry->Component());
      for (const Object& cls : entry->GetOrelClasses()) copy->AddClass(cls);
    }
  }
  return copy;
}

bool kelSortedComponents::ContainsUnassignedClasses() const {
  return !GetUnassignedClasses()->Empty();
}

bool kelSortedComponents::ShouldAddClass(const Object& lComponent,
                                         const Object& lClass) {
  if (CBool(Get(lClass, orel::class_::kExcludedFromSelection))) return false;
  if (!excluded_stereotypes_) {
    excluded_stereotypes_ = GetExcludedClassStereotypes(ApplicationOf(lClass));
  }
  if (excluded_stereotypes_->Items().Contains(StereotypeOf(lClass))) {
    return false;
  }
  Object generator =
      lComponent
          ? GetStatementGenerator(ApplicationOf(lComponent),
                                  CStr(Get(lClass, orel::class_::kAddInName)))
          : GetStatementGenerator(ApplicationOf(lClass), kVSAddInName);
  if (!generator) return include_all_components_;
  return AskGenerator(generator, lComponent, lClass);
}

void kelSortedComponents::RemoveAllUnmodifiableUnassignedClasses() {
  auto pseudo = FindPseudoComponent();
  if (!pseudo) return;
  std::vector<Object> classes;
  for (const auto& entry : *pseudo->Classes())
    classes.push_back(entry->Class());
  for (const Object& cls : classes) {
    Object package = automation::GetObject(cls, orel::class_::kPackage);
    if (!CBool(Get(package, orel::logical_package::kIsModifiable))) {
      RemoveClassFromComponent(cls, nullptr, false);
    }
  }
}

std::shared_ptr<SortedComponentCollection>
kelSortedComponents::LanguageComponents(const std::string& language) {
  if (Language* found = languages_.Find(language)) return found->entries;
  auto components = std::make_shared<SortedComponentCollection>();
  languages_.Add(Language{language, components}, language);
  return components;
}

std::shared_ptr<kelSortedComponent> kelSortedComponents::GetSortedComponent(
    const Object& component) {
  std::string language = FilingLanguageOf(component);
  std::string key = component ? UniqueIdOf(component) : kUnassigned;
  auto components = LanguageComponents(language);
  if (auto* found = components->Find(key)) return *found;
  // The language stays registered when the component is refused; the
  // listings skip empty languages.
  if (!ShouldAddComponent(component)) return nullptr;
  return File(components, component, language, key);
}

std::shared_ptr<kelSortedComponent> kelSortedComponents::File(
    const std::shared_ptr<SortedComponentCollection>& components,
    const Object& component, const std::string& language,
    const std::string& key) {
  auto entry = std::make_shared<kelSortedComponent>(component);
  components->Add(entry, key);
  if (component) by_unique_id_[key].push_back({entry, language, key});
  return entry;
}

std::shared_ptr<kelSortedComponent> kelSortedComponents::FindPseudoComponent()
    const {
  const Language* language = languages_.Find(kUnassigned);
  if (!language) return nullptr;
  auto* found = language->entries->Find(kUnassigned);
  return found && !(*found)->Component() ? *found : nullptr;
}

bool kelSortedComponents::ShouldAddComponent(const Object& component) {
  if (!component) return true;
  Object generator =
      GetStatementGenerator(ApplicationOf(component), LanguageOf(component));
  if (!generator) return include_all_components_;
  return AskGenerator(generator, component, component);
}

bool kelSortedComponents::AskGenerator(const Object& generator,
                                       const Object& component,
                                       const Object& item) const {
  // The inclusion query: element, item, mode 0, no reporter, no code view.
  return CBool(automation::Call(
      generator, external::code_view::statement_generator::kProcess, component,
      item, int16_t{0}, int16_t{0}, nullptr));
}

Object kelSortedComponents::GetStatementGenerator(
    const Object& application, const std::string& add_in_name) {
  if (Object* cached = generators_.Find(add_in_name)) return *cached;
  try {
    // Most names have no add-in at all: asked first, that costs no error.
    if (!FindAddIn(application, add_in_name)) return nullptr;
    Object server = GetAddInServer(application, add_in_name, "");
    if (!server) return nullptr;
    // The generator is a round-trip member; an add-in's server that has no
    // separate round-trip server answers it itself.
    Object generator = CObj(automation::CallByName(
        GetRTEServerOf(server),
        external::code_view::rte_server::kStatementGenerator));
    if (generator) generators_.Add(generator, add_in_name);
    return generator;
  } catch (const automation::Error&) {
    return nullptr;  // no add-in to judge: the flag answers
  }
}

std::shared_ptr<kelSortedClass> kelSortedComponents::AddClassToSortedComponent(
    const Object& lClass, const std::shared_ptr<kelSortedComponent>& entry) {
  if (!entry) return nullptr;
  std::string key = UniqueIdOf(lClass);
  if (entry->IncludesClass(key)) return nullptr;
  if (!ShouldAddClass(entry->Component(), lClass)) return nullptr;
  auto sorted = std::make_shared<kelSortedClass>();
  sorted->SetClass(lClass);
  entry->Classes()->Add(sorted, std::move(key));
  return sorted;
}

void kelSortedComponents::AddClassWithoutEntry(const Object& lClass) {
  std::vector<Object> components;
  Guarded([&] { components = ItemsOf(lClass, orel::class_::kComponents); });
  int n = 0;  // entries the class went into, or was refused by
  bool vcpp_interface = false;
  if (!components.empty()) {
    Guarded([&] {
      vcpp_interface = LanguageOf(components.front()) == kVCpp &&
                       IsInterfaceOrCoclass(lClass);
    });
  }
  if (!vcpp_interface) {
    for (const Object& component : components) {
      Guarded([&] {
        AddClassToSortedComponent(lClass, GetSortedComponent(component));
      });
      ++n;
    }
  } else {
    int midl_components = 0;
    Object last;
    for (const Object& component : components) {
      Guarded([&] {
        if (StereotypeOf(component) == kMidl) ++midl_components;
      });
      Guarded([&] {
        AddClassToSortedComponent(lClass, GetSortedComponent(component));
      });
      ++n;
      last = component;
    }
    if (midl_components == 0) {
      std::string name;
      Guarded([&] { name = NameOf(last) + ".idl"; });
      MidlComponent midl = GetMidlComponent(last, name);
      if (!midl.component) {
        DebugLog("AddClass: CAN NOT Assign to MIDL " + name, kMidlTraceCategory,
                 kDebugLevelError);
      } else {
        DebugLog(AssignedToMidlLine(name, midl.created), kMidlTraceCategory,
                 kDebugLevelWarning);
        Guarded([&] {
          automation::Call(lClass, orel::class_::kAssignToComponent,
                           midl.component);
        });
        Guarded([&] { AddComponent(midl.component); });
      }
    }
  }
  // A class whose components all refused it was counted, and stays out.
  if (n == 0) {
    Guarded([&] {
      AddClassToSortedComponent(lClass, GetSortedComponent(nullptr));
    });
  }
}

kelSortedComponents::MidlComponent kelSortedComponents::GetMidlComponent(
    const Object& component, const std::string& name) const {
  namespace cp = orel::component_package;
  auto modifiable = [](const Object& package) {
    return CBool(Get(package, cp::kIsModifiable));
  };
  Object package;
  Guarded([&] {
    Object own =
        automation::GetObject(component, orel::component::kComponentPackage);
    if (modifiable(own)) package = own;
  });
  if (!package) {
    Guarded([&] {
      Object root = automation::GetObject(
          automation::GetObject(component, orel::component::kModel),
          orel::model::kRootComponentPackage);
      if (modifiable(root)) package = root;
    });
  }
  if (!package) return {};

  Object components;
  int32_t index = 0;
  Guarded([&] {
    components = CObj(automation::Call(package, cp::kComponents));
    index = automation::CLng(
        automation::Call(components, orel::collection::kIndexOfName, name));
  });
  if (index > 0) {
    // A component of that name serves only when it is a MIDL component of
    // the same language (or of none); otherwise no companion is made.
    try {
      Object found =
          CObj(automation::Call(components, orel::collection::kGetAt, index));
      std::string language = LanguageOf(found);
      bool usable =
          (language == LanguageOf(component) || language.empty()) &&
          CStr(automation::Call(found, orel::element::kToolPropertyValue, kVCpp,
                                "Kind")) == kMidl;
      return usable ? MidlComponent{found, false} : MidlComponent{};
    } catch (const automation::Error&) {
      return {};
    }
  }

  MidlComponent midl;
  Guarded([&] {
    midl.component = CObj(automation::Call(package, cp::kNewComponent, name));
  });
  if (!midl.component) return {};
  midl.created = true;
  const Object& made = midl.component;
  Guarded([&] {
    automation::Let(made, orel::component::kLanguage, LanguageOf(component));
  });
  Guarded([&] {
    automation::Let(made, orel::element::kStereotype, StereotypeOf(component));
  });
  Guarded([&] {
    for (const Object& property : ModelItems(automation::GetObject(
             component, orel::element::kToolProperties))) {
      Guarded([&] { CopyToolProperty(property, made); });
    }
  });
  Guarded([&] { automation::Let(made, orel::element::kStereotype, kMidl); });
  SetToolProperty(made, "Kind", kMidl);

  std::string project_file;
  Guarded([&] {
    project_file = Trim(CStr(automation::CallByName(
        GetCompPropertiesAPI(component),
        external::code_view::comp_properties::kProjectFile, component)));
  });
  std::string interface_file = FindInterfaceFile(project_file);
  if (!interface_file.empty()) {
    SetToolProperty(made, "FileName", interface_file);
  } else {
    for (const char* property :
         {"ProjectFile", "WorkspaceFile", "ProjectName", "FileName"}) {
      SetToolProperty(made, property, "");
    }
  }
  return midl;
}

void kelSortedComponents::RefreshIndex() {
  if (indexed_at_ != IdentityChangeCount()) RebuildIndex();
}

void kelSortedComponents::RebuildIndex() {
  indexed_at_.reset();
  by_unique_id_.clear();
  for (int32_t l = 1; l <= languages_.Count(); ++l) {
    const Language& language = languages_.Item(l);
    const SortedComponentCollection& components = *language.entries;
    for (int32_t i = 1; i <= components.Count(); ++i) {
      const auto& entry = components.Item(i);
      if (!entry->Component()) continue;
      by_unique_id_[UniqueIdOf(entry->Component())].push_back(
          {entry, language.name, *components.KeyAt(i)});
    }
  }
  indexed_at_ = IdentityChangeCount();
}

const kelSortedComponents::Placement* kelSortedComponents::FindPlacement(
    std::string_view id) {
  RefreshIndex();
  auto bucket = by_unique_id_.find(std::string(id));
  if (bucket == by_unique_id_.end()) return nullptr;
  // The identifier read now decides, as it would in a walk of the lists.
  std::vector<const Placement*> matches;
  for (const Placement& placement : bucket->second) {
    const Object& component = placement.entry->Component();
    if (component && UniqueIdOf(component) == id) matches.push_back(&placement);
  }
  // The same identifier in several languages: the first in list order.
  return FirstInListOrder(languages_, matches);
}

void kelSortedComponents::Unfile(std::string_view id,
                                 const Placement& placement) {
  Placement removed = placement;  // `placement` lives in the index
  Language* language = languages_.Find(removed.language);
  language->entries->Remove(removed.key);
  if (language->entries->Empty()) languages_.Remove(removed.language);
  std::vector<Placement>& bucket = by_unique_id_[std::string(id)];
  std::erase_if(bucket, [&](const Placement& candidate) {
    return candidate.entry == removed.entry;
  });
  if (bucket.empty()) by_unique_id_.erase(std::string(id));
}

}  // namespace kelqln
