// The system as a host sees it: libkelqln.so loaded as an in-process server,
// kelQLN.API created by its programmatic identifier and driven late-bound,
// on models of the modelling tool whose code the description add-in reads.
#include <gtest/gtest.h>

#include <filesystem>
#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "automation/call.h"
#include "automation/case_folding.h"
#include "automation/class_registry.h"
#include "automation/collection.h"
#include "automation/dictionary.h"
#include "automation/error.h"
#include "automation/server_module.h"
#include "external/code_view.h"
#include "host/modeltool/association.h"
#include "host/modeltool/attribute.h"
#include "host/modeltool/role.h"
#include "tests/support/error_of.h"
#include "tests/support/recording_object.h"
#include "tests/support/update_scene.h"

namespace {

namespace fs = std::filesystem;
namespace cv = external::code_view;
using automation::Args;
using automation::CallByName;
using automation::CallKind;
using automation::CStr;
using automation::DispId;
using automation::Object;
using automation::Variant;
using testing_support::Lines;
using testing_support::TextsOf;
using testing_support::UpdateScene;

automation::ServerLibrary& Library() {
  static automation::ServerLibrary library =
      automation::ServerLibrary::Load(KELQLN_LIBRARY_PATH);
  return library;
}

// The library reads its debug settings once: one log file for the process.
fs::path DebugLog() {
  return fs::temp_directory_path() /
         ("kelqln-library-test-" + std::to_string(::getpid()) + ".log");
}

// A callback object with the members a test gives it, by name; any other
// name is unknown (438). It records the members called, in order.
class Callback : public automation::Dispatch {
 public:
  using Handler = std::function<Variant(Args&)>;
  using Members = std::vector<std::pair<std::string, Handler>>;

  explicit Callback(Members members) : members_(std::move(members)) {}

  Variant Invoke(DispId id, CallKind, Args& args) override {
    heard.push_back(members_.at(id).first);
    return members_.at(id).second(args);
  }
  DispId IdOfName(std::string_view name) const override {
    for (size_t i = 0; i < members_.size(); ++i) {
      if (automation::EqualsIgnoreCase(members_[i].first, name)) return i;
    }
    throw automation::Error(automation::kNoSuchMember);
  }
  std::string TypeName() const override { return "Callback"; }

  Lines heard;

 private:
  Members members_;
};

Object CollectionOf(const std::vector<Variant>& items) {
  auto collection = automation::Collection::Create();
  for (const Variant& item : items) collection->Items().Add(item);
  return collection;
}

// What a run hands back: the reporter's lines, or, when Start failed, the
// failure the API object kept.
struct Outcome {
  Variant reporter;
  int32_t error_number = 0;
  std::string error;

  Lines Logs() const { return TextsOf(CallByName(Reporter(), "Logs")); }
  Lines Errors() const { return TextsOf(CallByName(Reporter(), "Errors")); }
  Lines Warnings() const { return TextsOf(CallByName(Reporter(), "Warnings")); }
  Lines Summaries() const {
    return TextsOf(CallByName(Reporter(), "Summaries"));
  }
  Object Reporter() const { return automation::CObj(reporter); }
};

// The code of component Orders: Order with two attributes, an operation and
// the ends of two associations: "places" with Customer, which declares its
// own end too (navigable both ways), and "contains" with Item (one way).
constexpr char kOrdersBefore[] = R"({
  "format": "kelqln-code-description", "version": 1, "name": "OrdersProject",
  "components": [{"name": "orders.cls", "classes": [
    {"name": "Order",
     "attributes": [{"name": "id", "type": "Long"},
                    {"name": "note", "type": "String"}],
     "operations": [{"name": "Submit"}],
     "roles": [{"name": "customer", "class": "Customer", "association": "places"},
               {"name": "items", "class": "Item", "association": "contains"}]},
    {"name": "Customer",
     "roles": [{"name": "orders", "class": "Order", "association": "places"}]},
    {"name": "Item"},
    {"name": "Legacy"}]}]})";

// The same code a while later: Order's id is a Currency, it has a total and
// no note, and it follows neither association; Legacy is gone, Cart is new.
constexpr char kOrdersAfter[] = R"({
  "format": "kelqln-code-description", "version": 1, "name": "OrdersProject",
  "components": [{"name": "orders.cls", "classes": [
    {"name": "Order",
     "attributes": [{"name": "id", "type": "Currency"},
                    {"name": "total", "type": "Currency"}],
     "operations": [{"name": "Submit"}]},
    {"name": "Customer",
     "roles": [{"name": "orders", "class": "Order", "association": "places"}]},
    {"name": "Item"},
    {"name": "Cart"}]}]})";

// Code of one class in one unit.
std::string CodeOfClass(const std::string& project, const std::string& cls,
                        const std::string& extra = "") {
  return R"({"format": "kelqln-code-description", "version": 1, "name": ")" +
         project + R"(", "components": [{"name": "unit", "classes": [
           {"name": ")" +
         cls + "\"" + extra + "}]}]}";
}

class LibraryTest : public ::testing::Test {
 protected:
  void SetUp() override { Library(); }

  // Starts a silent run with a new API object, which ends with the call.
  Outcome Start(const Object& selection, const Object& callback = nullptr) {
    Object api = automation::CreateObject("kelQLN.API");
    Outcome run;
    run.reporter =
        CallByName(api, "Start", Object(scene_->App()), selection, callback);
    run.error_number =
        automation::CLng(automation::GetByName(api, "LastErrorNumber"));
    run.error = CStr(automation::GetByName(api, "LastError"));
    return run;
  }

  // The scene with component Orders (language VB) whose model is made by a
  // first run from kOrdersBefore; the code is then kOrdersAfter.
  void MakeOrders() {
    NewScene({{"VB"}, {"Java"}});
    orders_ = scene_->AddComponent("Orders", "VB");
    scene_->WriteCode("Orders", kOrdersBefore);
    Outcome first = Start(CollectionOf({Variant(Object(orders_))}));
    ASSERT_TRUE(first.Errors().empty()) << first.Errors()[0];
    scene_->WriteCode("Orders", kOrdersAfter);
    scene_->TakeDebugLines();
  }

  void NewScene(const std::vector<UpdateScene::Language>& languages) {
    scene_.reset();  // the new scene takes the old one's directory
    scene_ = std::make_unique<UpdateScene>("library", languages, DebugLog());
  }

  Object OrdersSelection() const {
    return CollectionOf({Variant(Object(orders_))});
  }

  std::unique_ptr<UpdateScene> scene_;
  std::shared_ptr<host::modeltool::Component> orders_;
};

// The lines every run of MakeOrders' second code starts with, and the
// deletions when every candidate goes.
const Lines kOrdersUpdated{
    "----------------------------------------",
    "Language VB",
    "Updating component Orders from project OrdersProject",
    "Reading orders.cls",
    "Class Cart added to package Orders and component Orders",
    "Order.id: type changed from \"Long\" to \"Currency\"",
    "Order: attribute total added",
};
const Lines kAllDeleted{
    "Deleting class Legacy - done",         "Deleting attribute note - done",
    "Deleting role customer - done",        "Deleting role items - done",
    "Deleting association contains - done",
};
const Lines kClosing{
    "The model update is finished.",
    "The summary lists the result of every component.",
    "The update finished with 0 error(s) and 0 warning(s).",
};

Lines Concat(std::initializer_list<Lines> parts) {
  Lines all;
  for (const Lines& part : parts)
    all.insert(all.end(), part.begin(), part.end());
  return all;
}

// The model's classes and Order's attributes, in words.
std::string Holding(const UpdateScene& scene) {
  std::string text;
  for (const auto& cls : scene.Model()->Classes()) text += cls->Name() + " ";
  text += "/";
  for (const auto& attribute : scene.ModelClass("Order")->Attributes()) {
    text += " " + attribute->Name();
  }
  return text;
}

const char kAllGone[] = "Order Customer Item Cart / id total";
const char kNoneGone[] = "Order Customer Item Legacy Cart / id note total";

TEST_F(LibraryTest, ASilentRunCreatesUpdatesAndDeletesAndReportsEachStep) {
  MakeOrders();
  Object reporter_heard;
  auto callback = std::make_shared<Callback>(
      Callback::Members{{"OnCompleted", [&reporter_heard](Args& args) {
                           reporter_heard = automation::CObj(args.at(0));
                           return Variant();
                         }}});
  Outcome run = Start(OrdersSelection(), callback);

  EXPECT_EQ(run.Logs(), Concat({kOrdersUpdated, kAllDeleted, kClosing}));
  EXPECT_EQ(run.Errors(), Lines{});
  EXPECT_EQ(run.Warnings(), Lines{});
  EXPECT_EQ(run.Summaries(), (Lines{"Components updated:", "Orders",
                                    "Orders: updated", kClosing.back()}));
  // A callback without "OnSynchronize" lets every candidate go.
  EXPECT_EQ(callback->heard, Lines{"OnCompleted"});
  EXPECT_EQ(reporter_heard, run.Reporter());
  EXPECT_EQ(Holding(*scene_), kAllGone);
  EXPECT_EQ(scene_->ModelClass("Order")->Attributes()[0]->Type(), "Currency");
  // "places" stays, no longer followed from Order; "contains" is gone.
  ASSERT_EQ(scene_->Model()->Associations().size(), 1u);
  const auto& places = scene_->Model()->Associations()[0];
  EXPECT_EQ(places->Name(), "places");
  EXPECT_NE(places->Role1()->IsNavigable(), places->Role2()->IsNavigable());
}

TEST_F(LibraryTest, TheCallbackDecidesWhatIsDeleted) {
  // Each handler works on the arguments of "OnSynchronize": (application,
  // list, reporter).
  const struct {
    const char* what;
    std::function<Variant(UpdateScene&, Args&)> on_synchronize;
    Lines deleted;
    Lines errors;
    std::string holding;
  } kCases[] = {
      {"empties the list",
       [](UpdateScene&, Args& args) {
         args.at(1) = Variant(CollectionOf({}));
         return Variant();
       },
       {},
       {},
       kNoneGone},
      {"adds a class that vanished from nowhere",
       [](UpdateScene& scene, Args& args) {
         CallByName(automation::CObj(args.at(1)), "Add",
                    Object(scene.ModelClass("Customer")));
         return Variant();
       },
       Concat({kAllDeleted, {"Deleting class Customer - done"}}),
       {},
       "Order Item Cart / id total"},
      {"hands back a class and one of its attributes",
       [](UpdateScene& scene, Args& args) {
         auto order = scene.ModelClass("Order");
         args.at(1) =
             Variant(CollectionOf({Variant(Object(order)),
                                   Variant(Object(order->Attributes()[1]))}));
         return Variant();
       },
       {"Deleting attribute note - done"},
       {},
       "Order Customer Item Legacy Cart / id total"},
      {"fails",
       [](UpdateScene&, Args&) -> Variant {
         throw automation::Error(5, "the user walked away");
       },
       {},
       {"Error: Nothing was deleted from Orders: the confirmation of the "
        "deletions failed (error 5, the user walked away)."},
       kNoneGone},
      {"hands back no list",
       [](UpdateScene&, Args& args) {
         args.at(1) = Variant("everything");
         return Variant();
       },
       {},
       {"Error: Nothing was deleted from Orders: the confirmation of the "
        "deletions failed (error 424, Object required)."},
       kNoneGone},
  };
  for (const auto& row : kCases) {
    SCOPED_TRACE(row.what);
    MakeOrders();
    Lines heard_list;
    auto callback = std::make_shared<Callback>(Callback::Members{
        {"OnSynchronize",
         [&](Args& args) {
           EXPECT_EQ(automation::CObj(args.at(0)), Object(scene_->App()));
           for (const Variant& element :
                automation::CollectionItems(automation::CObj(args.at(1)))) {
             heard_list.push_back(
                 CStr(automation::Get(automation::CObj(element), 100)));
           }
           return row.on_synchronize(*scene_, args);
         }},
        {"OnCompleted", [](Args&) { return Variant(); }}});
    Outcome run = Start(OrdersSelection(), callback);
    ASSERT_EQ(run.error_number, 0) << run.error;

    EXPECT_EQ(heard_list, (Lines{"Legacy", "note", "customer", "items"}));
    EXPECT_EQ(run.Logs(), Concat({kOrdersUpdated, row.deleted, kClosing}));
    EXPECT_EQ(run.Errors(), row.errors);
    EXPECT_EQ(Holding(*scene_), row.holding);
    EXPECT_EQ(callback->heard, (Lines{"OnSynchronize", "OnCompleted"}));
  }
}

TEST_F(LibraryTest, TheLanguagesAnswersDecideTheBackupOfASilentRun) {
  // A save under a new name needs a user to name the file: a silent run
  // makes no backup then, whichever language asks for it.
  const struct {
    const char* vb;
    const char* java;
    bool saved;
  } kCases[] = {
      {"1", "2", false},    {"2", "1", false}, {"0", "1", true},
      {"1", "fails", true}, {"3", "0", false},
  };
  for (const auto& row : kCases) {
    SCOPED_TRACE(std::string(row.vb) + " " + row.java);
    NewScene({{"VB"}, {"Java"}});
    for (const auto& [language, answer] :
         {std::pair{"VB", row.vb}, std::pair{"Java", row.java}}) {
      std::string name = std::string("In") + language;
      scene_->AddComponent(name, language);
      scene_->WriteCode(name, CodeOfClass(name, name + "Class"));
      if (std::string(answer) == "fails") {
        scene_->SetSetting(language, "FailingMembers", "ShouldBackupModel");
      } else {
        scene_->SetSetting(language, "ShouldBackupModel",
                           static_cast<uint32_t>(std::stoi(answer)));
      }
    }
    scene_->Model()->SetAskForBackup(true);
    scene_->Model()->Save();
    fs::remove(scene_->ModelPath());
    std::vector<Variant> components;
    for (const auto& component : scene_->Model()->Components()) {
      components.emplace_back(Object(component));
    }
    Outcome run = Start(CollectionOf(components));
    ASSERT_EQ(run.error_number, 0) << run.error;

    ASSERT_EQ(fs::exists(scene_->ModelPath()), row.saved);
    // The backup is the model as it was before the update.
    if (row.saved) {
      EXPECT_TRUE(
          host::modeltool::Model::Load(scene_->ModelPath())->Classes().empty());
    }
    EXPECT_EQ(scene_->Model()->Classes().size(), 2u);
  }
}

TEST_F(LibraryTest, ASelectionIsReadAsADictionaryACountedListOrTexts) {
  const Lines kNothing{"Nothing was selected for the update.", kClosing.back()};
  const Lines kOrders{"Components updated:", "Orders", "Orders: updated",
                      kClosing.back()};
  auto dictionary = [](const std::vector<Variant>& items) {
    auto selection = automation::Dictionary::Create();
    int32_t key = 0;
    for (const Variant& item : items) selection->Add(Variant(++key), item);
    return Object(selection);
  };
  const struct {
    const char* what;
    std::function<Object(const Object& orders)> selection;
    Lines summaries;
  } kCases[] = {
      {"an empty list", [](const Object&) { return CollectionOf({}); },
       kNothing},
      {"a dictionary",
       [&](const Object& orders) { return dictionary({Variant(orders)}); },
       kOrders},
      {"an empty dictionary", [&](const Object&) { return dictionary({}); },
       kNothing},
      {"a class by its component's and its own name",
       [](const Object&) { return CollectionOf({Variant("Orders\\Order")}); },
       kOrders},
      {"texts that name no class",
       [](const Object&) {
         return CollectionOf({Variant("Order"), Variant("\\Order"),
                              Variant("Orders\\"), Variant("Nope\\Order"),
                              Variant("Orders\\Nope")});
       },
       kNothing},
  };
  for (const auto& row : kCases) {
    SCOPED_TRACE(row.what);
    MakeOrders();
    Outcome run = Start(row.selection(Object(orders_)));
    ASSERT_EQ(run.error_number, 0) << run.error;
    EXPECT_EQ(run.Summaries(), row.summaries);
    EXPECT_EQ(run.Errors(), Lines{});
  }
  // A selection element that is neither a model element nor a text.
  Outcome run = Start(CollectionOf({Variant(int32_t{7})}));
  EXPECT_FALSE(run.Reporter());
  EXPECT_EQ(run.error_number, automation::kTypeMismatch);
}

TEST_F(LibraryTest, AReporterTheCallbackHandsBackTakesOverAndCountsPerProject) {
  // The counts of the result lines run on across languages: Billing's line
  // counts the error that Broken, the last project of VB, reported.
  MakeOrders();
  auto broken = scene_->AddComponent("Broken", "VB");
  scene_->WriteCode("Broken", R"({"format": "other"})");
  auto billing = scene_->AddComponent("Billing", "Java");
  scene_->WriteCode(
      "Billing", CodeOfClass("Billing", "Invoice", R"(, "bases": ["Ledger"])"));
  auto clean = scene_->AddComponent("Clean", "Java");
  scene_->WriteCode("Clean", CodeOfClass("Clean", "Receipt"));
  Object simple;
  Object completed;
  auto callback = std::make_shared<Callback>(Callback::Members{
      {"OnSynchronize",
       [&simple](Args& args) {
         simple = automation::CreateObject("kelQLN.shared_simplereporter");
         args.at(2) = Variant(simple);
         return Variant();
       }},
      {"OnCompleted", [&completed](Args& args) {
         completed = automation::CObj(args.at(0));
         return Variant();
       }}});
  Outcome run =
      Start(CollectionOf({Variant(Object(orders_)), Variant(Object(broken)),
                          Variant(Object(billing)), Variant(Object(clean))}),
            callback);
  ASSERT_EQ(run.error_number, 0) << run.error;

  // Everything after the confirmation went to the new reporter.
  EXPECT_EQ(run.Logs(), kOrdersUpdated);
  EXPECT_EQ(run.Summaries(), (Lines{"Components updated:", "Orders"}));
  ASSERT_TRUE(simple);
  EXPECT_EQ(completed, simple);
  // Log and summary lines follow each other without a break; errors and
  // warnings begin a line.
  std::string broken_file = (scene_->Directory() / "Broken.json").string();
  EXPECT_EQ(
      CStr(automation::GetByName(simple, "Text")),
      "Deleting class Legacy - doneDeleting attribute note - done"
      "Deleting role customer - doneDeleting role items - done"
      "Deleting association contains - doneOrders: updated"
      "Updating component Broken from project BrokenBroken\r\n"
      "Cannot read the code of component Broken: " +
          broken_file +
          ": (file): \"format\" is not "
          "\"kelqln-code-description\""
          "----------------------------------------Language Java"
          "Components updated:Updating component Billing from project Billing"
          "BillingReading unitPackage Billing added"
          "Class Invoice added to package Billing and component Billing\r\n"
          "Invoice: Ledger is not a class of the model; no inherit relation "
          "to itBilling: updated with 1 warning and 1 error"
          "Updating component Clean from project CleanCleanReading unit"
          "Package Clean addedClass Receipt added to package Clean and "
          "component CleanClean: updatedThe model update is finished."
          "The summary lists the result of every component."
          "The update finished with 1 error(s) and 1 warning(s)."
          "The update finished with 1 error(s) and 1 warning(s).");
  EXPECT_EQ(automation::CLng(automation::GetByName(simple, "Errors")), 1);
  EXPECT_EQ(automation::CLng(automation::GetByName(simple, "Warnings")), 1);
}

TEST_F(LibraryTest, ALanguageWithoutActiveAddInEndsTheRunAndTeardownLetsGo) {
  const struct {
    const char* what;
    std::function<Variant()> release;
    Lines teardown;
  } kCases[] = {
      {"the VC++ project lets go",
       [] { return Variant(); },
       {"BEGIN kelQLN:Class_Terminate", "kelQLNEngine:Class_Terminate",
        "  END kelQLN:Class_Terminate"}},
      {"the VC++ project fails to, the first time",
       [failed = false]() mutable -> Variant {
         if (failed) return Variant();
         failed = true;
         throw automation::Error(5, "still building");
       },
       {"BEGIN kelQLN:Class_Terminate", "kelQLNEngine:Class_Terminate",
        "  FAIL RELEASINGSelectedCodeItems: still building"}},
  };
  for (const auto& row : kCases) {
    SCOPED_TRACE(row.what);
    auto project = testing_support::RecordingObject::Create(
        [&row](DispId id, CallKind, Args&) {
          if (id == cv::project::kComponents) {
            return Variant(automation::Collection::Create());
          }
          return id == cv::project::kRelease ? row.release() : Variant();
        });
    auto server = testing_support::RecordingObject::Create();
    server->responder = [&](DispId id, CallKind, Args&) {
      return id == server->IdOfName(cv::rte_server::kCodeViewProject)
                 ? Variant(Object(project))
                 : Variant();
    };
    automation::RegisterClass("kelqlnTest.VisualCpp", "",
                              [server] { return Object(server); });
    NewScene({{"Java", host::codeview::kDescriptionProgId, false},
              {"VC++", "kelqlnTest.VisualCpp"}});
    auto stale = scene_->AddComponent("Stale", "Java");
    scene_->WriteCode("Stale", CodeOfClass("Stale", "Old"));
    auto native = scene_->AddComponent("Native", "VC++");

    Outcome run =
        Start(CollectionOf({Variant(Object(stale)), Variant(Object(native))}));

    EXPECT_FALSE(run.Reporter());
    EXPECT_EQ(run.error_number, automation::kInvalidProcedureCall);
    EXPECT_EQ(run.error, "Invalid procedure call or argument");
    EXPECT_TRUE(scene_->Model()->Classes().empty());
    // The entries' own trace lines carry addresses: only the API's and the
    // engine's lines are compared.
    Lines lines;
    for (const std::string& line : scene_->TakeDebugLines()) {
      std::string message = line.substr(20);
      if (message.find("kelSortedCV") == std::string::npos) {
        lines.push_back(message);
      }
    }
    EXPECT_EQ(
        lines,
        Concat({{"kelQLN:Class_Initialize", "kelQLNEngine:Class_Initialize",
                 "ERROR kelQLN.Start: 5 Invalid procedure call or argument"},
                row.teardown}));
    auto releases = project->CallsTo(cv::project::kRelease);
    ASSERT_EQ(releases.size(), 1u);
    EXPECT_EQ(releases[0].args.at(0).TypeName(), "shared_simplereporter");
    // A teardown that stopped left the globals after the failure set; the
    // next API object's teardown releases them.
    automation::CreateObject("kelQLN.API");
    scene_->TakeDebugLines();
    server->calls.clear();  // they hold the add-in, which holds the server
  }
  automation::UnregisterClass("kelqlnTest.VisualCpp");
}

TEST_F(LibraryTest, ObjectsKeepTheLibraryLoadedAndTheWizardRoadNeedsAWizard) {
  MakeOrders();
  EXPECT_EQ(Library().CanUnloadNow(), automation::kSOk);
  Outcome run = Start(OrdersSelection());
  // The API object is gone; the reporter it handed back is not.
  EXPECT_EQ(Library().CanUnloadNow(), automation::kSFalse);
  run.reporter = Variant();
  EXPECT_EQ(Library().CanUnloadNow(), automation::kSOk);

  Object api = automation::CreateObject("kelQLN.API");
  std::string description;
  EXPECT_EQ(testing_support::ErrorOf(
                [&] { CallByName(api, "StartVisible", Object(scene_->App())); },
                &description),
            automation::kCannotCreateObject);
  EXPECT_EQ(description, "The wizard is not available in this process");
  // From the development environment, the add-in look-up comes first and
  // fails on a project whose language has no add-in.
  auto project =
      testing_support::RecordingObject::Create([](DispId id, CallKind, Args&) {
        return id == cv::project::kLanguage ? Variant("Nope") : Variant();
      });
  EXPECT_EQ(testing_support::ErrorOf([&] {
              CallByName(api, "StartQuillonFromIDE", Object(scene_->App()),
                         CollectionOf({Variant(Object(project))}));
            }),
            automation::kObjectNotSet);
}

}  // namespace
