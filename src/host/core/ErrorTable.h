// Every error the library raises, by facility and code, with the localisation key of its message.
// The workspace's entries are fixed by the library's public contract; facility 110 holds the core
// library's own errors about documents and files.
#pragma once

#include <cstddef>

namespace orvcore::config {

struct ErrorEntry {
    int facility;
    int code;
    char const* key;
};

namespace errors {

inline constexpr ErrorEntry CannotCreateOverlayWindow{
    102, 20, "$$$/orvworkspace/Error/CannotCreateOverlayWindow=Unable to create overlay window."};
inline constexpr ErrorEntry CannotCreateEmptyOverlayWindow{
    102, 21,
    "$$$/orvworkspace/Error/CannotCreateEmptyOverlayWindow=Attempted to create empty overlay window."};
inline constexpr ErrorEntry InvalidWorkspace{
    102, 22, "$$$/orvworkspace/workspace/Error/InvalidWorkspace=Not a valid workspace definition."};
inline constexpr ErrorEntry UnableToLoadWorkspace{
    102, 23,
    "$$$/orvworkspace/workspace/Error/UnableToLoadWorkspace=Unable to load workspace; Incompatible workspace "
    "definition version."};
inline constexpr ErrorEntry WorkspaceManagerAlreadyInitialized{
    102, 24,
    "$$$/orvworkspace/workspace/Error/WorkspaceManager/AlreadyIntialized=Workspaces Manager already "
    "initialized"};
inline constexpr ErrorEntry WorkspaceManagerNotInitialized{
    102, 25,
    "$$$/orvworkspace/workspace/Error/WorkspaceManager/NotInitialized=Workspaces Manager not initialized"};
inline constexpr ErrorEntry WorkspaceAlreadyExists{
    102, 26,
    "$$$/orvworkspace/workspace/Error/WorkspaceManager/WorkspaceAlreadyExists=A workspace with this name "
    "already "
    "exists."};
inline constexpr ErrorEntry CannotCreateWorkspace{
    102, 27,
    "$$$/orvworkspace/workspace/Error/WorkspaceManager/CannotCreateWorkspace=Could not create workspace."};
inline constexpr ErrorEntry UnknownWorkspace{
    102, 28, "$$$/orvworkspace/workspace/Error/WorkspaceManager/UnknownWorkspace=Unknown workspace."};
inline constexpr ErrorEntry UnableToAccessResource{
    105, 20,
    "$$$/orvworkspace/utility/Error/ResourceUtils/UnableToAccessResource=Unable to access resource."};
inline constexpr ErrorEntry InvalidTypeConversion{
    105, 21, "$$$/orvcore/utility/Error/InvalidTypeConversion=Invalid type conversion."};
inline constexpr ErrorEntry NonInvertibleMatrix{
    107, 0, "$$$/orvcore/geom/matrix/Error/NonInvertableMatrix=Matrix cannot be inverted."};
inline constexpr ErrorEntry InvalidToolMapAccess{
    108, 20, "$$$/orvworkspace/sharedui/Error/InvalidToolMapAccess=Invalid tool map access."};

// "@0" is the document's name (its file path, or "fragment"), "@1" the problem.
inline constexpr ErrorEntry MalformedPropList{
    110, 20, "$$$/orvcore/proplist/Error/MalformedDocument=The property list '@0' is malformed: @1."};
inline constexpr ErrorEntry CannotReadFile{
    110, 21, "$$$/orvcore/filesupport/Error/CannotReadFile=Unable to read the file '@0': @1."};
inline constexpr ErrorEntry CannotWriteFile{
    110, 22, "$$$/orvcore/filesupport/Error/CannotWriteFile=Unable to write the file '@0': @1."};

} // namespace errors

// The whole table, in facility and code order.
ErrorEntry const* ErrorTableBegin();
ErrorEntry const* ErrorTableEnd();

// The entry of a facility and code, or null when the table has none.
ErrorEntry const* FindErrorEntry(int facility, int code);

} // namespace orvcore::config
