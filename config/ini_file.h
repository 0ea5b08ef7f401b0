#pragma once

#include <memory>
#include <string>

class wxFileConfig;
struct ConfigRecord;

// Parses INI file bytes as a text editor may have left them: a byte-order mark, Windows or
// old Mac line ends, UTF-16. Never logs, never fails: junk yields an empty or partial object.
std::unique_ptr<wxFileConfig> ParseIni(std::string bytes);

// The bytes of the file that the record writes.
std::string FormatIni(const ConfigRecord& record);

// Convenience for a whole round trip through the file format.
void ReadIniBytes(const std::string& bytes, ConfigRecord& record);
