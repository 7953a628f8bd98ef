#pragma once
// What a value box asks of its parser. The box knows nothing of numbers: it hands every
// decision (stepping, typed text, the thermometer's position) to a parser, and shows the
// validated text that the parser keeps. The base versions do nothing and return false (0.0 for
// the position); VariBoxParserBasic and VariBoxParserLog are the families that do the work.
//
//   parser call                  reaches the owner box as
//   notifyValidatedTextChange    parser_TextChanged: the text is shown, "varibox_ValueChanged"
//                                sent when asked
//   setAllowedCharacters         parser_SetAllowedCharacters: the only characters typing enters
//   setMaxNumChars               parser_SetMaxNumChars: the text box's limit, text refreshed
//   setEnabled                   setActive(enabled, true)
//
// Each does nothing for a parser without an owner, so parsers can be driven alone.
//
// Choices made here:
// - setText reaches the owner only if it survived the parse: publishing a value can run model
//   code that deletes the box (and with it an owned parser).
#include <cstdint>

#include "foundation/DataChangeType.h"
#include "platform/glob/GlobHandle.h"
#include "platform/kw/String.h"

class VariBox;

class VariBoxParserBase {
 public:
  explicit VariBoxParserBase(VariBox* owner);
  VariBoxParserBase(const VariBoxParserBase&) = default;
  VariBoxParserBase& operator=(const VariBoxParserBase&) = default;

  // --- Virtual operations, in slot order ---
  virtual ~VariBoxParserBase();
  // Pushes the allowed characters, the maximum length and the text into the owner.
  virtual void init() {}
  virtual bool handleMajorInc() { return false; }
  virtual bool handleMinorInc() { return false; }
  virtual bool handleMajorDec() { return false; }
  virtual bool handleMinorDec() { return false; }
  // Publishes the current value once more (the box calls it at a drag's release).
  virtual bool handleNoChange() { return false; }
  // Reads the stored text as a new value.
  virtual bool handleParseText() { return false; }
  // Where the value lies in its range, 0 to 1, for the thermometer.
  virtual double getPositionWithinRange() { return 0.0; }

  const WString& getText() const { return text; }
  // Text typed by the user: parsed, then shown validated, and "varibox_ValueChanged" sent
  // whether or not the value moved. Text equal to the stored text changes nothing.
  void setText(const WString& t);
  VariBox* getOwner() const { return owner; }
  DataChangeType getDataChangeType() const { return dataChangeType; }

 protected:
  void notifyValidatedTextChange(bool sendMessage);
  void setAllowedCharacters(const String& characters);
  void setMaxNumChars(unsigned char count);
  void setEnabled(bool enabled);

  // Taken before publishing a value, which runs model code that may delete the owner box and
  // with it this parser: afterwards it tells whether the parser is still there to touch (its
  // box is alive and still holds it; a parser without a box belongs to its caller and lives).
  class PublishGuard {
   public:
    explicit PublishGuard(VariBoxParserBase* parser);
    bool parserAlive() const;

   private:
    VariBoxParserBase* parser_;
    bool hadOwner_;
    GlobHandle<VariBox> box_;
  };

  WString text;

 private:
  friend class VariBox;
  void setDataChangeType(DataChangeType why) { dataChangeType = why; }

  VariBox* owner;
  DataChangeType dataChangeType = kChangeDirect;
};
