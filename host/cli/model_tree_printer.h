// `kelqln show`: a model as an indented tree, for people who want to see
// what an update did. The component view lists each component with its
// language, its code project and its classes; the logical view each class
// with its attributes, operations, relations and association ends:
//
//   Model Library
//   Component View
//     component Lending (VC++, project lending.json)
//       class Book
//   Logical View
//     package Lending
//       class Book <<entity>>
//         attribute title : string = ""
//         operation Describe(verbose : bool) : string
//         has shelf : Shelf
//         inherits Item
//         realizes IPrintable
//         role loans -> Loan [0..*] (association borrows, aggregate)
#ifndef KELQLN_HOST_CLI_MODEL_TREE_PRINTER_H_
#define KELQLN_HOST_CLI_MODEL_TREE_PRINTER_H_

#include <iosfwd>
#include <string>

namespace host::modeltool {
class Class;
class ComponentPackage;
class LogicalPackage;
class Model;
}  // namespace host::modeltool

namespace host::cli {

class ModelTreePrinter {
 public:
  explicit ModelTreePrinter(std::ostream& out) : out_(out) {}

  void Print(const modeltool::Model& model);

 private:
  void PrintPackage(const modeltool::ComponentPackage& package, int depth);
  void PrintPackage(const modeltool::LogicalPackage& package, int depth);
  void PrintClass(const modeltool::Class& cls, int depth);
  void Line(int depth, const std::string& text);

  std::ostream& out_;
};

}  // namespace host::cli

#endif  // KELQLN_HOST_CLI_MODEL_TREE_PRINTER_H_
