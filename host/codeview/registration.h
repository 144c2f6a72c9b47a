// Makes the code-view classes creatable by programmatic identifier:
//
//   "kelcv.Description"               the description add-in's server
//                                     (language_add_in_server.h reading
//                                     description_reader.h)
//   "kelcv.VanishedElementCollector"  vanished_element_collector.h
//
// A host calls this once before the modelling tool makes add-in servers.
#ifndef KELQLN_HOST_CODEVIEW_REGISTRATION_H_
#define KELQLN_HOST_CODEVIEW_REGISTRATION_H_

namespace host::codeview {

inline constexpr char kDescriptionProgId[] = "kelcv.Description";

void RegisterCodeViewClasses();

}  // namespace host::codeview

#endif  // KELQLN_HOST_CODEVIEW_REGISTRATION_H_
