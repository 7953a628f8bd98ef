#include "values/VariBoxParserBase.h"

#include "platform/glob/GlobHandle.h"
#include "values/VariBox.h"

VariBoxParserBase::VariBoxParserBase(VariBox* owner) : owner(owner) {}

VariBoxParserBase::~VariBoxParserBase() = default;

void VariBoxParserBase::setText(const WString& t) {
  if (t == text) return;
  text = t;
  // The parse may publish, and the model may delete the box and this parser with it.
  GlobHandle<VariBox> box(owner);
  handleParseText();
  if (VariBox* b = box.get()) b->parser_TextChanged(true);
}

VariBoxParserBase::PublishGuard::PublishGuard(VariBoxParserBase* parser)
    : parser_(parser), hadOwner_(parser->owner != nullptr), box_(parser->owner) {}

bool VariBoxParserBase::PublishGuard::parserAlive() const {
  if (!hadOwner_) return true;
  VariBox* b = box_.get();
  return b && b->getParser() == parser_;
}

void VariBoxParserBase::notifyValidatedTextChange(bool sendMessage) {
  if (owner) owner->parser_TextChanged(sendMessage);
}

void VariBoxParserBase::setAllowedCharacters(const String& characters) {
  if (owner) owner->parser_SetAllowedCharacters(characters);
}

void VariBoxParserBase::setMaxNumChars(unsigned char count) {
  if (owner) owner->parser_SetMaxNumChars(count);
}

void VariBoxParserBase::setEnabled(bool enabled) {
  if (owner) owner->setActive(enabled, true);
}
