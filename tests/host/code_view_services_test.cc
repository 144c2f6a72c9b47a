// The language add-in's servers and the code-view project's services: the
// project of a component, opening it, the element index, and the answers
// the registry sets up per add-in.
#include <string>

#include "code_view_fixture.h"
#include "host/codeview/vanished_element_collector.h"

namespace host::codeview {
namespace {

using automation::CBool;
using automation::CLng;
using automation::GetObject;
using testing_support::ErrorOf;

TEST_F(CodeViewTest, AComponentsProjectComesFromItsProjectFile) {
  Object server = Server("VC++");
  Object project = Project();
  ASSERT_NE(project, nullptr);
  EXPECT_EQ(Project(), project) << "one project object per component";
  EXPECT_EQ(CStr(automation::Get(project, cv::project::kLanguage)), "VC++");
  EXPECT_EQ(automation::CObj(CallByName(
                server, cv::rte_server::kGetComponentFromProject, project)),
            Object(component_));
  // The name comes from the code once it can be read, else from the file.
  EXPECT_EQ(CStr(automation::Get(project, cv::project::kName)), "app");
  WriteCode(BaseDescription());
  automation::Call(project, cv::project::kOpen, Object(reporter_));
  EXPECT_EQ(CStr(automation::Get(project, cv::project::kName)), "Shapes");
  EXPECT_EQ(CLng(automation::Get(
                automation::GetObject(project, cv::project::kComponents),
                automation::Collection::kCount)),
            2);
  automation::Let(project, cv::project::kUniqueId, "{APP}");
  EXPECT_EQ(CStr(automation::Get(project, cv::project::kUniqueId)), "{APP}");

  // An absolute path is taken as it is.
  auto other = model_->RootComponentPackage()->NewComponent("Other");
  other->OverrideToolProperty("VC++", "ProjectFile", "  " + CodePath() + " ");
  Object second = automation::CObj(CallByName(
      server, cv::rte_server::kCodeViewProject, Object(other), Object()));
  EXPECT_NE(second, project);
  automation::Call(second, cv::project::kOpen, Object());

  // A component without project file has no project: a warning says so.
  auto bare = model_->RootComponentPackage()->NewComponent("Bare");
  EXPECT_EQ(
      automation::CObj(CallByName(server, cv::rte_server::kCodeViewProject,
                                  Object(bare), Object(reporter_))),
      nullptr);
  EXPECT_EQ(Warnings(),
            Lines{"The component Bare has no project file: its tool property "
                  "ProjectFile of the tool VC++ is not set"});
  // Nor is another language's project file taken.
  bare->OverrideToolProperty("Visual Basic", "ProjectFile", "app.json");
  EXPECT_EQ(
      automation::CObj(CallByName(server, cv::rte_server::kCodeViewProject,
                                  Object(bare), Object())),
      nullptr);
}

TEST_F(CodeViewTest, OpenFailsWithOneClearErrorLineWhenTheCodeCannotBeRead) {
  Json bad_visibility = BaseDescription();
  ClassIn(bad_visibility, "Shape")["attributes"][0]["visibility"] = "secret";
  Json twice = BaseDescription();
  twice["components"][1]["classes"].push_back({{"name", "Shape"}});
  Json misspelt = BaseDescription();
  ClassIn(misspelt, "Circle")["base"] = Json::array({"Shape"});
  const struct {
    const char* what;
    const char* text;  // nullptr: no file
    int number;
    const char* problem;
  } kCases[] = {
      {"no file", nullptr, automation::kFileNotFound, "does not exist"},
      {"no JSON", "{\"format\": ", automation::kBadFileFormat, "not JSON"},
      {"another format", R"({"format": "kelqln-model", "version": 1})",
       automation::kBadFileFormat, "\"format\" is not"},
      {"a wrong type", R"({"format": "kelqln-code-description", "version": 1,
          "components": [{"name": 5}]})",
       automation::kBadFileFormat, "components[0].name: expected a text"},
      {"an unknown field", nullptr, automation::kBadFileFormat,
       "components[0].classes[2]: unknown field \"base\""},
      {"a class twice", nullptr, automation::kBadFileFormat,
       "class \"Shape\" is described twice"},
      {"a bad visibility", nullptr, automation::kBadFileFormat,
       "attributes[0].visibility: \"secret\" is none of"},
      {"deep nesting",
       "{\"format\": \"kelqln-code-description\", \"version\": 1, \"name\": "
       "[[[[[[[[[[[[[[[[[[[[[[[[[[[[[[[[[[[[[[[[[[[[[[[[[]]]]]]]]]]]]]]]]]]]]"
       "]]]]]]]]]]]]]]]]]]]]]]]]]]]]]]}",
       automation::kBadFileFormat, "nested more than"},
  };
  const Json* documents[] = {nullptr,   nullptr, nullptr,         nullptr,
                             &misspelt, &twice,  &bad_visibility, nullptr};
  for (size_t i = 0; i < std::size(kCases); ++i) {
    const auto& test = kCases[i];
    SCOPED_TRACE(test.what);
    fs::remove(CodePath());
    if (test.text) WriteFile(CodePath(), test.text);
    if (documents[i]) WriteCode(*documents[i]);
    reporter_->calls.clear();
    Object project = Project();
    std::string description;
    EXPECT_EQ(ErrorOf(
                  [&] {
                    automation::Call(project, cv::project::kOpen,
                                     Object(reporter_));
                  },
                  &description),
              test.number);
    EXPECT_NE(description.find(CodePath()), std::string::npos) << description;
    EXPECT_NE(description.find(test.problem), std::string::npos) << description;
    ASSERT_EQ(Errors().size(), 1u);
    EXPECT_EQ(Errors()[0],
              "Cannot read the code of component App: " + description);
    EXPECT_TRUE(Logs().empty() && Warnings().empty());
    // Until it can be read, the project has no components; an update raises
    // the same error.
    EXPECT_EQ(CLng(automation::Get(GetObject(project, cv::project::kComponents),
                                   automation::Collection::kCount)),
              0);
    EXPECT_EQ(ErrorOf([&] {
                automation::Call(project, cv::project::kUpdateModel,
                                 Object(model_), Object(), NewCollector(),
                                 false);
              }),
              test.number);
  }
}

TEST_F(CodeViewTest, TheElementIndexFindsClassesByNameAndUniqueId) {
  WriteCode(BaseDescription());
  Object project = Project();
  Object index = GetObject(project, cv::project::kElementIndex);
  auto find = [&index](const std::string& name, const std::string& id) {
    return automation::CObj(
        automation::Call(index, cv::element_index::kFind, name, id));
  };
  // Before any update: by name only, the code records no ids.
  Object shape = find("Shape", "");
  ASSERT_NE(shape, nullptr);
  EXPECT_EQ(find("Shape", ""), shape);
  EXPECT_EQ(CStr(automation::Get(shape, cv::component::kName)), "Shape");
  EXPECT_EQ(GetObject(shape, cv::component::kProject), project);
  EXPECT_EQ(CStr(automation::Get(shape, cv::project::kUniqueId)), "");
  EXPECT_EQ(find("Nowhere", ""), nullptr);
  Object header = find("shapes.h", "");
  ASSERT_NE(header, nullptr);
  EXPECT_EQ(CStr(automation::Get(header, cv::component::kName)), "shapes.h");

  Update(project);
  std::string id = ModelClass("Circle")->UniqueId();
  Object circle = find("", id);
  ASSERT_NE(circle, nullptr);
  EXPECT_EQ(CStr(automation::Get(circle, cv::component::kName)), "Circle");
  EXPECT_EQ(CStr(automation::Get(circle, cv::project::kUniqueId)), id);
  EXPECT_EQ(CStr(automation::Get(
                automation::CObj(automation::GetByName(circle, "Component")),
                cv::component::kName)),
            "shapes.h");
  // The id wins over the name.
  EXPECT_EQ(find("Shape", id), circle);
  EXPECT_EQ(find("Shape", "{NO SUCH ID}"), shape);

  // A class found by the index updates on its own, like a component.
  Json code = BaseDescription();
  ClassIn(code, "Shape")["attributes"][0]["type"] = "long";
  ClassIn(code, "Canvas").erase("has");
  WriteCode(code);
  automation::Call(project, cv::project::kOpen, Object(reporter_));
  Object collector = NewCollector();
  reporter_->calls.clear();
  automation::Call(shape, cv::component::kUpdateModel, Object(model_),
                   Object(reporter_), collector, true);
  EXPECT_EQ(Logs(), Lines{"Shape.x: type changed from \"int\" to \"long\""});
  EXPECT_TRUE(Vanished(collector).empty());
  EXPECT_EQ(ModelClass("Canvas")->HasRelationships().size(), 1u);
}

TEST_F(CodeViewTest, OneServerClassServesEachAddInWithItsOwnSettings) {
  SetSetting("VC++", "ShouldBackupModel", 2u);
  SetSetting("VC++", "RefusedStereotypes", " Interface ; utility");
  SetSetting("VC++", "LanguageInfo", "Visual C++ 6");
  SetSetting("Visual Basic", "SupportsNewComponent", 1u);
  SetSetting("Visual Basic", "NewComponentName", "Project");
  SetSetting("Visual Basic", "FailingMembers", "CodeIcons");
  Object cpp = Server("VC++");
  Object basic = Server("Visual Basic");
  ASSERT_NE(cpp, basic);

  EXPECT_EQ(CLng(CallByName(cpp, cv::rte_server::kShouldBackupModel)), 2);
  EXPECT_EQ(CLng(CallByName(basic, cv::rte_server::kShouldBackupModel)), 0);
  EXPECT_EQ(CStr(automation::GetByName(cpp, cv::rte_server::kLanguageInfo)),
            "Visual C++ 6");
  EXPECT_EQ(CStr(automation::GetByName(basic, cv::rte_server::kLanguageInfo)),
            "Visual Basic: code described in JSON files");

  // The statement generator leaves out what has a refused stereotype, on
  // the element or on the item.
  auto iface = model_->RootLogicalPackage()->NewClass("IUnknown");
  iface->SetStereotype("interface");
  auto plain = model_->RootLogicalPackage()->NewClass("Plain");
  auto utility = model_->RootComponentPackage()->NewComponent("Helpers");
  utility->SetStereotype("Utility");
  const struct {
    Object server;
    Object element, item;
    bool include;
  } kQueries[] = {
      {cpp, component_, iface, false},     {cpp, component_, plain, true},
      {cpp, nullptr, iface, false},        {cpp, utility, plain, false},
      {cpp, component_, component_, true}, {basic, component_, iface, true},
  };
  for (const auto& query : kQueries) {
    Object generator = automation::CObj(automation::GetByName(
        query.server, cv::rte_server::kStatementGenerator));
    automation::Args args{Variant(query.element), Variant(query.item),
                          Variant(int16_t{0}), Variant(Object(reporter_)),
                          Variant(false)};
    Variant answer =
        automation::Invoke(generator, cv::statement_generator::kProcess,
                           automation::CallKind::kMethod, args);
    EXPECT_EQ(CBool(answer), query.include);
    EXPECT_EQ(CBool(args[4]), query.include);
  }
  EXPECT_EQ(Logs().size(), 3u);
  // As the system asks about a model class: 0 stands for no reporter.
  Object generator = automation::CObj(
      automation::GetByName(cpp, cv::rte_server::kStatementGenerator));
  EXPECT_FALSE(CBool(automation::Call(
      generator, cv::statement_generator::kProcess, Object(component_),
      Object(iface), int16_t{0}, int16_t{0}, Object())));
  EXPECT_EQ(Logs().size(), 3u);

  // New components: only where the registry allows them.
  EXPECT_EQ(ErrorOf([&] {
              CallByName(cpp, cv::rte_server::kOnNewComponent, Object(model_),
                         Variant());
            }),
            automation::kNoSuchMember);
  for (const char* expected : {"Project", "Project 2"}) {
    Object made = automation::CObj(CallByName(
        basic, cv::rte_server::kOnNewComponent, Object(app_), Variant()));
    auto components = Items(made);
    ASSERT_EQ(components.size(), 1u);
    auto component =
        std::dynamic_pointer_cast<modeltool::Component>(components[0]);
    ASSERT_NE(component, nullptr);
    EXPECT_EQ(component->Name(), expected);
    EXPECT_EQ(component->Language(), "Visual Basic");
    EXPECT_EQ(component->Package(), model_->RootComponentPackage());
  }

  // A member set up to fail raises; the others still answer.
  EXPECT_NE(ErrorOf([&] {
              automation::GetByName(basic, cv::rte_server::kCodeIcons);
            }),
            0);
  Object icons =
      automation::CObj(automation::GetByName(cpp, cv::rte_server::kCodeIcons));
  for (const char* key : {"LANGUAGE", "PROJECT", "COMPONENT"}) {
    EXPECT_NE(automation::CObj(
                  automation::Call(icons, automation::Collection::kItem, key)),
              nullptr);
  }

  // Only the "VC++" add-in answers CompPropertiesAPI.
  Object cpp_server =
      GetObject(app_->AddIns()->Find("VC++"), orel::add_in::kServer);
  Object properties = automation::CObj(
      automation::GetByName(cpp_server, cv::add_in_server::kCompPropertiesApi));
  EXPECT_EQ(CStr(CallByName(properties, cv::comp_properties::kProjectFile,
                            Object(component_))),
            CodePath());
  Object basic_server =
      GetObject(app_->AddIns()->Find("Visual Basic"), orel::add_in::kServer);
  EXPECT_EQ(ErrorOf([&] {
              automation::GetByName(basic_server,
                                    cv::add_in_server::kCompPropertiesApi);
            }),
            automation::kNoSuchMember);
}

TEST_F(CodeViewTest, ModelUpdateNoticesAndTheContextClass) {
  Object server = Server("VC++");
  EXPECT_FALSE(CBool(automation::GetByName(server, "IsModelUpdating")));
  CallByName(server, cv::rte_server::kOnModelUpdateStart);
  EXPECT_TRUE(CBool(automation::GetByName(server, "IsModelUpdating")));
  CallByName(server, cv::rte_server::kOnModelUpdateEnd);
  EXPECT_FALSE(CBool(automation::GetByName(server, "IsModelUpdating")));

  WriteCode(BaseDescription());
  Update(Project());
  auto shape = ModelClass("Shape");
  EXPECT_EQ(
      automation::CObj(CallByName(server, cv::rte_server::kGetContextClass,
                                  Object(shape->Attributes()[0]))),
      Object(shape));
  std::string info = CStr(
      CallByName(server, cv::rte_server::kComponentInfo, Object(component_)));
  EXPECT_NE(info.find("2 components, 4 classes"), std::string::npos) << info;
}

TEST_F(CodeViewTest, AServerNotConnectedToAnAddInAnswersNothing) {
  Object server = automation::CreateObject(kDescriptionProgId);
  Object round_trip =
      automation::CObj(CallByName(server, cv::add_in_server::kGetRteServer));
  EXPECT_EQ(ErrorOf([&] {
              automation::GetByName(round_trip, cv::rte_server::kLanguageInfo);
            }),
            automation::kObjectNotSet);
}

TEST_F(CodeViewTest, TheExampleOfTheFormatsDocumentIsValidCode) {
  std::string document = ReadFile(std::string(KELQLN_SOURCE_ROOT) +
                                  "/docs/code-description-format.md");
  size_t start = document.find("```json\n");
  ASSERT_NE(start, std::string::npos);
  start += 8;
  size_t end = document.find("```", start);
  WriteFile(CodePath(), document.substr(start, end - start));
  Object collector = Update(Project());
  EXPECT_TRUE(Errors().empty());
  EXPECT_TRUE(Warnings().empty()) << Report();
  EXPECT_TRUE(Vanished(collector).empty());
  EXPECT_GE(model_->Classes().size(), 2u);
}

TEST_F(CodeViewTest, TheDefaultRegistryInstallsTheDescriptionAddIns) {
  platform::UseRegistryFile(std::string(KELQLN_SOURCE_ROOT) +
                            "/data/registry.reg");
  app_ = modeltool::Application::Create();
  modeltool::LoadAddInsFromRegistry(*app_->AddIns(),
                                    (directory_ / "settings.json").string());
  app_->SetCurrentModel(model_);
  EXPECT_EQ(CStr(automation::GetByName(Server("VC++"),
                                       cv::rte_server::kLanguageInfo)),
            "VC++: code described in JSON files");
  EXPECT_EQ(ErrorOf([&] {
              CallByName(Server("VC++"), cv::rte_server::kOnNewComponent,
                         Object(app_), Variant());
            }),
            automation::kNoSuchMember);
  Object made = automation::CObj(CallByName(Server("Visual Basic"),
                                            cv::rte_server::kOnNewComponent,
                                            Object(app_), Variant()));
  EXPECT_EQ(Items(made).size(), 1u);
  WriteCode(BaseDescription());
  EXPECT_TRUE(Vanished(Update(Project())).empty());
  EXPECT_EQ(model_->Classes().size(), 4u);
}

TEST(VanishedElementCollectorTest, ListsEachElementOnceAndAClassAsAWhole) {
  modeltool::SampleModel s;
  auto collector = std::make_shared<VanishedElementCollector>();
  collector->AddMember(s.shape, s.x);
  collector->AddMember(s.shape, s.x);
  collector->AddMember(s.circle, s.circle_is_shape);
  collector->AddMember(s.shape, s.draw);
  collector->AddClass(s.canvas);
  collector->AddClass(s.canvas);
  collector->AddMember(s.canvas, s.canvas_has_shapes);
  EXPECT_EQ(Vanished(collector),
            (std::multiset<std::string>{"Canvas", "Shape: Attribute x",
                                        "Shape: Operation Draw",
                                        "Circle: InheritRelation Shape"}));
  // A class listed later takes the place of its members.
  collector->AddClass(s.shape);
  EXPECT_EQ(Vanished(collector),
            (std::multiset<std::string>{"Canvas", "Shape",
                                        "Circle: InheritRelation Shape"}));
}

}  // namespace
}  // namespace host::codeview
