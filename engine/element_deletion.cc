#include "engine/element_deletion.h"

#include <cstdint>
#include <vector>

#include "automation/call.h"
#include "entry/run_globals.h"
#include "external/orel.h"
#include "selection/kel_sorted_class.h"
#include "selection/kel_sorted_component.h"
#include "selection/kel_sorted_components.h"
#include "shared/string_utilities.h"

namespace kelqln {
namespace {

using automation::CBool;
using automation::CStr;
using automation::Object;
namespace orel = external::orel;

// The modelling tool's kind names of the members.
constexpr int32_t kText30100 = 30100;  // attribute
constexpr int32_t kText30101 = 30101;  // has-relationship
constexpr int32_t kText30102 = 30102;  // inherit relation
constexpr int32_t kText30103 = 30103;  // operation
constexpr int32_t kText30104 = 30104;  // role
constexpr int32_t kText30114 = 30114;  // inherit relation, as well
constexpr int32_t kText30115 = 30115;  // realize relation
// The lines, each with "%1" for the element's name.
constexpr int32_t kText3633 = 3633;  // class
constexpr int32_t kText3634 = 3634;  // attribute
constexpr int32_t kText3635 = 3635;  // operation
constexpr int32_t kText3636 = 3636;  // has-relationship
constexpr int32_t kText3637 = 3637;  // inherit relation
constexpr int32_t kText3638 = 3638;  // role
constexpr int32_t kText3639 = 3639;  // association
constexpr int32_t kText3652 = 3652;  // realize relation

// A kind of member the owner class deletes with one member of its own.
struct MemberKind {
  std::string kind_name;
  int32_t line;
  automation::DispId delete_member;
};

std::vector<MemberKind> MemberKinds() {
  return {
      {StringResText(kText30100), kText3634, orel::class_::kDeleteAttribute},
      {StringResText(kText30103), kText3635, orel::class_::kDeleteOperation},
      {StringResText(kText30101), kText3636,
       orel::class_::kDeleteHasRelationship},
      {StringResText(kText30102), kText3637,
       orel::class_::kDeleteInheritRelation},
      {StringResText(kText30114), kText3637,
       orel::class_::kDeleteInheritRelation},
      {StringResText(kText30115), kText3652,
       orel::class_::kDeleteRealizeRelation},
  };
}

std::string Line(int32_t number, const Object& element) {
  return ReplaceAll("%1", CStr(automation::Get(element, orel::element::kName)),
                    StringResText(number));
}

class Deleter {
 public:
  Deleter(kelReporterApi& reporter, const std::string& done,
          const std::string& failed)
      : reporter_(reporter),
        done_(done),
        failed_(failed),
        kinds_(MemberKinds()),
        role_kind_(StringResText(kText30104)) {}

  void DeleteClass(const Object& cls) {
    std::string text = Line(kText3633, cls);
    Object package = automation::GetObject(cls, orel::class_::kPackage);
    Report(text, CBool(automation::Call(
                     package, orel::logical_package::kDeleteClass, cls)));
  }

  void DeleteMember(const Object& owner, const Object& member) {
    std::string kind = CStr(automation::Get(member, orel::element::kKindName));
    if (kind == role_kind_) return DeleteRole(owner, member);
    for (const MemberKind& known : kinds_) {
      if (kind != known.kind_name) continue;
      std::string text = Line(known.line, member);
      Report(text, CBool(automation::Call(owner, known.delete_member, member)));
      return;
    }
  }

 private:
  // An association navigable both ways keeps its other end: only this role
  // stops being navigable. Otherwise the role is all the association has
  // left, and the association goes.
  void DeleteRole(const Object& owner, const Object& role) {
    Object association = automation::CObj(
        automation::GetByName(role, orel::role::kAssociationName));
    std::string text = Line(kText3638, role);
    bool first_navigable =
        Navigable(association, orel::association::kRole1Name);
    bool second_navigable =
        Navigable(association, orel::association::kRole2Name);
    if (first_navigable && second_navigable) {
      automation::LetByName(role, orel::role::kNavigable, false);
      reporter_.Log(text + done_);
      return;
    }
    std::string name =
        CStr(automation::GetByName(association, orel::association::kNameName));
    if (!CBool(automation::Call(owner, orel::class_::kDeleteAssociation,
                                association))) {
      Report(text, false);
      return;
    }
    reporter_.Log(text + done_);
    reporter_.Log(ReplaceAll("%1", name, StringResText(kText3639)) + done_);
  }

  static bool Navigable(const Object& association, const char* role) {
    return CBool(automation::GetByName(
        automation::CObj(automation::GetByName(association, role)),
        orel::role::kNavigable));
  }

  void Report(const std::string& text, bool deleted) {
    if (deleted) {
      reporter_.Log(text + done_);
      return;
    }
    std::string line = text + failed_;
    reporter_.Error(line);
  }

  kelReporterApi& reporter_;
  const std::string& done_;
  const std::string& failed_;
  std::vector<MemberKind> kinds_;
  std::string role_kind_;
};

}  // namespace

void DeleteSelectedElements(const kelSortedComponents& selection,
                            const std::string& language,
                            kelReporterApi& reporter, const std::string& done,
                            const std::string& failed) {
  Deleter deleter(reporter, done, failed);
  auto components = selection.GetComponents(language);
  for (const auto& component : *components) {
    for (const auto& sorted_class : *component->Classes()) {
      const Object& cls = sorted_class->Class();
      if (sorted_class->Members()->Empty()) {
        deleter.DeleteClass(cls);
        continue;
      }
      for (const Object& member : *sorted_class->Members()) {
        deleter.DeleteMember(cls, member);
      }
    }
  }
}

}  // namespace kelqln
