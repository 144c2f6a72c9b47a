// A model of the modelling tool: the component tree, the logical tree, the
// associations between classes, the current selection, a few settings and
// the file it is kept in.
//
// The model indexes every element it holds by unique id, so that a look-up
// by id (Find, and member 213 of its all-components and all-classes
// collections) takes constant time in a large model. Every change goes
// through the element classes' operations, which keep the index, the
// assignments on both sides and the back references (a class knows the
// relations that point at it and the associations it takes part in), so a
// deletion can remove everything that hangs on an element.
#ifndef KELQLN_HOST_MODELTOOL_MODEL_H_
#define KELQLN_HOST_MODELTOOL_MODEL_H_

#include <functional>
#include <memory>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

#include "automation/member_table.h"
#include "host/modeltool/unique_id.h"

namespace host::modeltool {

class Application;
class Association;
class Class;
class ClassRelation;
class Component;
class ComponentPackage;
class Element;
class LogicalPackage;
class Operation;

class Model : public automation::DispatchImpl<Model> {
 public:
  // Use Create or Load.
  explicit Model(UniqueIdGenerator generator);

  // An empty model: a root component package "Component View" and a root
  // logical package "Logical View". Without a generator, ids are
  // NewGuidText().
  static std::shared_ptr<Model> Create(UniqueIdGenerator generator = {});
  // Reads a model file (docs/model-format.md). kFileNotFound when it cannot
  // be opened; kBadFileFormat "<file>: <what is wrong>" when it is no valid
  // model. The file's path becomes the model's FilePath.
  static std::shared_ptr<Model> Load(const std::string& path,
                                     UniqueIdGenerator generator = {});

  static const automation::MemberTable<Model>& Members();

  const std::string& Name() const { return name_; }
  void SetName(std::string name) { name_ = std::move(name); }
  std::shared_ptr<Application> GetApplication() const {
    return application_.lock();
  }

  const std::shared_ptr<ComponentPackage>& RootComponentPackage() const {
    return root_component_package_;
  }
  const std::shared_ptr<LogicalPackage>& RootLogicalPackage() const {
    return root_logical_package_;
  }
  // Every component and every class of the model, in the order they were
  // made (or read).
  const std::vector<std::shared_ptr<Component>>& Components() const {
    return components_;
  }
  const std::vector<std::shared_ptr<Class>>& Classes() const {
    return classes_;
  }

  // A new association of two classes of this model: Role1 at `end1`, Role2
  // at `end2`, both navigable.
  std::shared_ptr<Association> NewAssociation(
      const std::shared_ptr<Class>& end1, const std::shared_ptr<Class>& end2,
      std::string name = "", const std::string& unique_id = "");
  // Removes the association and both its roles; false when it is not this
  // model's.
  bool DeleteAssociation(std::shared_ptr<Association> association);
  const std::vector<std::shared_ptr<Association>>& Associations() const {
    return associations_;
  }

  // The element with that id (compared exactly), or nullptr.
  std::shared_ptr<Element> FindElement(std::string_view unique_id) const;
  template <class T>
  std::shared_ptr<T> Find(std::string_view unique_id) const {
    return std::dynamic_pointer_cast<T>(FindElement(unique_id));
  }
  // The number of elements the model holds (packages and roots included).
  size_t ElementCount() const { return by_unique_id_.size(); }
  // Every broken invariant, in words: an element reachable from the roots
  // but not indexed or indexed but not reachable, a reference to an element
  // that is no longer in the model, an assignment or back reference kept on
  // one side only. Empty for a sound model.
  std::vector<std::string> IntegrityProblems() const;

  // The current selection, as the user made it in the tool. Select takes a
  // component, a component package, a class or a logical package of this
  // model (kInvalidProcedureCall for anything else) and adds it once.
  void Select(const std::shared_ptr<Element>& element);
  void ClearSelection();
  const std::vector<std::weak_ptr<Component>>& SelectedComponents() const {
    return selected_components_;
  }
  const std::vector<std::weak_ptr<ComponentPackage>>&
  SelectedComponentPackages() const {
    return selected_component_packages_;
  }
  const std::vector<std::weak_ptr<Class>>& SelectedClasses() const {
    return selected_classes_;
  }
  const std::vector<std::weak_ptr<LogicalPackage>>& SelectedLogicalPackages()
      const {
    return selected_logical_packages_;
  }

  const std::string& DefaultLanguage() const { return default_language_; }
  void SetDefaultLanguage(std::string language) {
    default_language_ = std::move(language);
  }
  // Whether the update asks the language add-ins about a backup first.
  bool AskForBackup() const { return ask_for_backup_; }
  void SetAskForBackup(bool ask) { ask_for_backup_ = ask; }

  // "" until the model is read from or saved to a file.
  const std::string& FilePath() const { return file_path_; }
  // Writes the model to FilePath atomically (never a half-written file);
  // kPathFileAccessError when the model has no file yet or the write fails,
  // and then the file on disk is the one before.
  void Save();
  // As Save, to `path`, which becomes the FilePath when the save succeeds.
  void SaveAs(const std::string& path);
  // A trial run (a host's dry run): while set, Save and SaveAs write nothing
  // and the file stays as it was, whoever asks for the save.
  void SetSavesSkipped(bool skipped) { saves_skipped_ = skipped; }

  void SetUniqueIdGenerator(UniqueIdGenerator generator);

 private:
  friend class Class;
  friend class Component;
  friend class ComponentPackage;
  friend class Element;
  friend class LogicalPackage;
  friend class ModelReader;
  friend class Operation;

  struct ExactHash {
    using is_transparent = void;
    size_t operator()(std::string_view text) const {
      return std::hash<std::string_view>()(text);
    }
  };

  std::shared_ptr<Model> Self() {
    return std::static_pointer_cast<Model>(shared_from_this());
  }
  // Gives `element` its id (a new one when `unique_id` is "") and indexes it.
  // kDuplicateKey when the id is taken.
  void Register(Element& element, const std::string& unique_id);
  void ChangeUniqueId(Element& element, const std::string& unique_id);
  // Takes the element out of the index and cuts it loose from the model.
  void Forget(Element& element);
  void ForgetSelected(const Element& element);
  void AddComponent(std::shared_ptr<Component> component);
  void AddClass(std::shared_ptr<Class> cls);
  void DestroyComponent(std::shared_ptr<Component> component);
  void DestroyClass(std::shared_ptr<Class> cls);
  // Takes a relation out of its supplier's back references and the index
  // (its owner has already dropped it).
  void DestroyRelation(ClassRelation& relation);
  void DestroyOperation(Operation& operation);
  // NewAssociation with the roles' ids given ("" takes new ones).
  std::shared_ptr<Association> MakeAssociation(
      const std::shared_ptr<Class>& end1, const std::shared_ptr<Class>& end2,
      std::string name, const std::string& unique_id,
      const std::string& role1_id, const std::string& role2_id);

  UniqueIdGenerator generator_;
  std::weak_ptr<Application> application_;
  std::string name_;
  std::shared_ptr<ComponentPackage> root_component_package_;
  std::shared_ptr<LogicalPackage> root_logical_package_;
  std::vector<std::shared_ptr<Component>> components_;
  std::vector<std::shared_ptr<Class>> classes_;
  std::vector<std::shared_ptr<Association>> associations_;
  std::unordered_map<std::string, std::weak_ptr<Element>, ExactHash,
                     std::equal_to<>>
      by_unique_id_;
  std::vector<std::weak_ptr<Component>> selected_components_;
  std::vector<std::weak_ptr<ComponentPackage>> selected_component_packages_;
  std::vector<std::weak_ptr<Class>> selected_classes_;
  std::vector<std::weak_ptr<LogicalPackage>> selected_logical_packages_;
  std::string default_language_;
  bool ask_for_backup_ = false;
  std::string file_path_;
  bool saves_skipped_ = false;

  friend class Application;
};

}  // namespace host::modeltool

#endif  // KELQLN_HOST_MODELTOOL_MODEL_H_
