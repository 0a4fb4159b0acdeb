// Reading programs and rewriting them without ever leaving half a file.
#pragma once

#include <string>

/// Reads a whole file, or standard input for "-"; false with a message on failure.
bool readProgramFile(const std::string &sPath, std::string &sBytes, std::string &sError);

/// Replaces a file's content: writes a temporary file beside it, keeps the
/// file's permissions, and renames it over the file, so that a failure leaves
/// the old content intact. False with a message on failure.
bool writeFileAtomically(const std::string &sPath, const std::string &sBytes, std::string &sError);
