// The ZitBlt configuration: "zitbltcfg.xml" (which ZitBlts each activity type shows, how each is
// built and which command refreshes it) and the status-bar configuration file handed whole to the
// list commands. Both are found along VORStartupPath and parsed once per process; a failed parse
// is retried on the next request, so a file added later is picked up. Every failure is quiet.
#pragma once

#include <vector>

#include "VORIDOMDocument.h"
#include "VORUnicodeString.h"

// One "ZitBlt" element of a matching "ActivityZitBlt" block; absent attributes are empty.
struct QELZitBltDefinition {
  VORUnicodeString name;          // "Name": key within the activity, id of the rep's command header
  VORUnicodeString type;          // "Type": rep class
  VORUnicodeString loadModule;    // "LoadModule": library of the rep class
  VORUnicodeString location;      // "Location": location keyword
  VORUnicodeString priority;      // "Priority"
  VORUnicodeString initialState;  // "InitialState"
  VORUnicodeString iconFile;      // "IconFile"
  bool hasUpdateData = false;     // an "UpdateData" element was there (only the first is read)
  VORUnicodeString updateCmdName;     // its "CmdName": update command class and header id
  VORUnicodeString updateLoadModule;  // its "LoadModule"
  // The module factories of the rep and of the update command, found on first use
  // (QELZitBltCommandFactory): a cached definition serves every activity of its type.
  mutable VORBaseUnknown* (*repFactory)(VORBaseUnknown*) = nullptr;
  mutable VORBaseUnknown* (*updateFactory)(VORBaseUnknown*) = nullptr;
};

namespace QELZitBltConfiguration {

// The parsed "zitbltcfg.xml": cached after the first success; every call retries after a
// failure. False (and document untouched) when VORStartupPath is unset, the file is missing
// or it is ill-formed.
bool LoadConfiguration(VORIDOMDocument_var& document);

// The "ZitBlt" elements of every "ActivityZitBlt" whose "ActivityType" equals activityType
// exactly, blocks and elements in document order. Answers are cached per (document, type).
const std::vector<QELZitBltDefinition>& DefinitionsFor(const VORIDOMDocument_var& document,
                                                       const VORUnicodeString& activityType);

// The definitions for the type name of activity (its VORISpecObject; none gives the empty type).
const std::vector<QELZitBltDefinition>& DefinitionsForActivity(const VORIDOMDocument_var& document,
                                                               VORBaseUnknown* activity);

// The same, read from the DOM every time: the plain version the cached one is checked against.
std::vector<QELZitBltDefinition> ReadDefinitions(const VORIDOMDocument_var& document,
                                                 const VORUnicodeString& activityType);

// Path of the status-bar configuration file: the setting "XMLFileForStatusbar" of the
// repository "QELPFViewerSettings" used as it stands when not empty, otherwise
// "StatusBarConfiguration.xml" along VORStartupPath; empty when neither gives a file name.
VORUnicodeString StatusBarConfigFile();

// Parses path (validation off, no entity resolution). False when it fails or is empty.
bool ParseConfigFile(const VORUnicodeString& path, VORIDOMDocument_var& document);

// Forgets the parsed "zitbltcfg.xml" and the cached answers (tests only: the product keeps
// both for the life of the process).
void ForgetForTests();

}  // namespace QELZitBltConfiguration
