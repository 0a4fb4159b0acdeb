// Layer program: built on the record and host/; the checker and the model build on it.
// The host's two roads through a program's text: reading its configuration
// lines into a record, and putting a regenerated configuration block back
// into the program with every other byte kept as it was.
#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "robotconfig/core/RobotConfiguration.h"

/// A program's bytes split into lines. Line endings are kept apart so that
/// the text can be rebuilt byte for byte.
class CProgramText {
 public:
  struct TLine {
    size_t nOffset;     ///< first byte of the line
    size_t nLength;     ///< bytes before the line end
    size_t nEolLength;  ///< 0 (last line without end), 1 ("\n") or 2 ("\r\n")
  };

  explicit CProgramText(std::string sBytes);

  const std::string &bytes() const { return m_sBytes; }
  const std::vector<TLine> &lines() const { return m_lines; }
  /// A line's text without its line end.
  std::string_view lineText(size_t nIndex) const;
  /// Longest part of a line that is decoded: configuration words sit at a
  /// line's start, and a huge line must not cost four times its size.
  static constexpr size_t kMaxDecodedLineBytes = size_t(1) << 20;
  /// A line's text decoded for the tokenizer (undecodable bytes kept), cut
  /// to its first kMaxDecodedLineBytes bytes.
  CString lineString(size_t nIndex) const {
    return CString::fromUtf8(lineText(nIndex).substr(0, kMaxDecodedLineBytes));
  }
  /// lineString into `sLine`, reusing its storage.
  void decodeLine(size_t nIndex, CString &sLine) const {
    CString::decodeUtf8(lineText(nIndex).substr(0, kMaxDecodedLineBytes), sLine);
  }
  /// The line end the program uses: that of its first line, "\n" by default.
  const char *lineEnding() const { return m_bCrLf ? "\r\n" : "\n"; }
  /// The byte-order mark the text starts with ("" when none); it belongs to no line.
  std::string_view byteOrderMark() const { return std::string_view(m_sBytes).substr(0, m_nBomLength); }

 private:
  std::string m_sBytes;
  std::vector<TLine> m_lines;
  bool m_bCrLf = false;
  size_t m_nBomLength = 0;
};

/// A configuration line the record refused.
struct TConfigurationDiagnostic {
  int nLine;         ///< 1-based line number
  CString sMessage;  ///< the reader's message (a generic text when it gave none)
};

/// Watches the reading road line by line: a checker sees the record just
/// before and just after each configuration line is read.
class CReadingObserver {
 public:
  virtual ~CReadingObserver() = default;
  /// Before the dispatcher reads configuration line `nLine` (1-based).
  virtual void beforeLine(int nLine, const TTokenizedConfigParms &parms) = 0;
  /// After it; `bAccepted` is false when the line was refused (the refusal
  /// is in the returned diagnostics).
  virtual void afterLine(int nLine, const TTokenizedConfigParms &parms, bool bAccepted) = 0;
  /// After the last line, before the after-reading steps.
  virtual void beforeAfterReadingSteps() {}
};

/// Reads a program's configuration into `config`: clears it, then hands every
/// configuration line in order to the line dispatcher, then runs the
/// after-reading steps. Returns the refused lines. `pObserver`, when given,
/// watches each line.
std::vector<TConfigurationDiagnostic> readProgramConfiguration(CRobotConfigurationBasic &config,
                                                               const CProgramText &program,
                                                               CReadingObserver *pObserver = nullptr);

/// The program with its configuration block replaced by `sGenerated` (the
/// generator's text, lines ending in "\r\n"), written with the program's own
/// line ending. The block is every configuration line, the marker line that
/// closes the block and one blank line after it; it is regenerated where its
/// first line stood, or at the top when the program had none. An empty text
/// leaves the empty-block marker in place of an existing block and changes
/// nothing in a program without one.
std::string replaceConfigurationBlock(const CProgramText &program, const CString &sGenerated);

/// True when replacing the program's block by `sGenerated` would change no byte.
bool programHoldsBlock(const CProgramText &program, const CString &sGenerated);

class CHostRobotConfiguration;

/// The block `config` generates, settled: a few rules make the first block of
/// a hand-written configuration read back differently (a board word that
/// names no board, an I2C use that follows the sensors), so the block is read
/// back and regenerated until it no longer changes. False when it does not
/// settle within a few rounds; `sBlock` then holds the last block and
/// `pRefused`, when given, the lines of it that did not read back.
/// `pProgram`, when given, is the program `config` was read from (starting
/// from the same board): when it already holds the first block, that block
/// is settled without reading it back. `pHeld`, when given with `pProgram`,
/// tells whether the program already holds the settled block (replacing its
/// block would change no byte).
bool generateSettledBlock(CHostRobotConfiguration &config, CString &sBlock,
                          std::vector<TConfigurationDiagnostic> *pRefused = nullptr,
                          const CProgramText *pProgram = nullptr, bool *pHeld = nullptr);

/// `sGenerated` with "\r\n" line ends turned into the program's line ending.
std::string encodeGeneratedBlock(const CString &sGenerated, const char *pzLineEnding);
