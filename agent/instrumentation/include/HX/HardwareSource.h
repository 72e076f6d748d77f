//===- HX/HardwareSource.h - Where cursors read the hardware from ---------===//
//
/// \file
/// Cursors (HX::Instrumentation) read one process-wide hardware source:
///
/// - the live machine: the hardware the operating system reports, read below
///   a file-system root (normally "/"; another root lets a copied tree of
///   system files stand in for a machine);
/// - a hardware-tree file: a JSON description of a machine, for tests, demos
///   and machines at hand only on paper.
///
/// At load the source is the tree file named by the setting
/// HX_HARDWARE_TREE when that is set and not empty, otherwise the live
/// machine below the setting HX_FS_ROOT (default "/"). Settings come from
/// tvr::settings: the environment first, then the configuration file.
///
/// A hardware-tree file is a JSON object:
///
/// \code
///   {
///     "systemName": "lab-42.example.com",            (optional)
///     "faults": { "throwOnSelect": ["SlotNode"] },    (optional)
///     "nodes": [ <node>, ... ]                        (required)
///   }
/// \endcode
///
/// and a node is an object with
///
/// - "type": a NodeLexicon::NodeType enumerator name, e.g. "ChassisNode";
/// - "name" (optional): the node's PropNodeName, a non-empty string;
/// - "segment" (optional): the node's path segment, a non-empty string;
///   by default the name, or "<type>#<n>" without a name, n counting the
///   nodes of that type among the node's siblings (named or not) from 0;
/// - "status" (optional): an integer from 0 to 4294967295, default 0;
/// - "description" (optional): a string, default empty;
/// - "properties" (optional): an object from NodeLexicon::Properties
///   enumerator names to a string or an integer from 0 to 4294967295; the
///   name is not allowed here (it is "name");
/// - "children" (optional): an array of nodes, nested at most 64 levels.
///
/// Unknown keys, unknown type or property names and values of the wrong
/// kind make the whole file refused. Two nodes may share a path text.
///
/// The parsed tree is kept while the file stays the same (same device,
/// inode, size, modification and change times), checked with one stat per
/// selectNode: a changed or replaced file is read at the next selectNode, an
/// unchanged one is not parsed again. A refused file makes selectNode throw
/// and is logged once per distinct refusal (category
/// "TVR.HX.Instrumentation", level 6000).
//
//===----------------------------------------------------------------------===//

#ifndef HX_HARDWARESOURCE_H
#define HX_HARDWARESOURCE_H

#include <cstdint>
#include <optional>
#include <string>

namespace HX {

/// Makes cursors read the hardware-tree file at \p path, from their next
/// selectNode on. For tools and tests. The file is not read here.
void useHardwareTree(std::string path);

/// Makes cursors read the live machine below \p fsRoot, from their next
/// selectNode on.
void useLiveMachine(std::string fsRoot = "/");

/// Describes the source in use: "tree file <path>" or
/// "live machine at <root>".
std::string describeHardwareSource();

/// Checks the hardware-tree file at \p path as selectNode would, without
/// using it, caching it or logging.
///
/// \returns nullopt when the file is accepted, otherwise the refusal message
///   (the file, the JSON pointer of the offending place and what is wrong,
///   e.g. "lab.json: /nodes/0/status: expected an integer from 0 to
///   4294967295, found -1").
std::optional<std::string> checkHardwareTree(const std::string &path);

/// The system name the hardware-tree file in use gives.
///
/// \returns nullopt when the live machine is in use, when the tree has no
///   "systemName", or when the tree file is refused. Never throws.
std::optional<std::string> hardwareTreeSystemName();

/// How many times this process has read a hardware-tree file for cursors.
/// An unchanged file is read once however often cursors select from it; a
/// diagnostic for tools and tests.
std::uint64_t hardwareTreeReads();

} // namespace HX

#endif // HX_HARDWARESOURCE_H
