#include "token_array.h"

#include "command.h"
#include "hstring.h"
#include "hstring_array.h"
#include "token_scan.h"

namespace {

// Character-set mode: runs of delimiters anywhere separate once, so no
// element is empty and none holds a delimiter character.
void splitByCharSet(HString& text, const TokenOptions& options, HStringArray& tokens) {
  const DelimiterSet set(options);
  for (int start = 0; start < text.GetLength();) {
    const TokenSpan span = scanCharSetToken(text, start, set);
    if (span.end > start) tokens.add(text.Mid(start, span.end - start));
    start = span.next;
  }
}

// Match-all mode: every occurrence ends one element, empty ones included;
// nothing follows an occurrence that ends the text.
void splitByDelimiterString(HString& text, const TokenOptions& options, HStringArray& tokens) {
  int start = 0;
  for (TokenSpan span; (span = scanMatchAllToken(text, start, options)).end < text.GetLength();
       start = span.next) {
    tokens.add(text.Mid(start, span.end - start));
  }
  if (start < text.GetLength()) tokens.add(text.Mid(start));
}

}  // namespace

const CommandDescription StrTokArrayCmd::kDescription =
    stringCommand("strTokArray", "Get HString Token Array", "\"string\"", Variable::TypeStringArray,
                  kHostSoloAnswer)
        .withOptions(kTokenOptions);

bool StrTokArrayCmd::run(const TArray<CommandOption>& options, const TArray<Variable>& args,
                         Variable& result) {
  HString text(args[0].getStringValue(-1));
  TokenOptions tokenOptions;
  if (!readTokenOptions(options, tokenOptions)) return false;
  HStringArray tokens;
  if (tokenOptions.matchAll) {
    splitByDelimiterString(text, tokenOptions, tokens);
  } else {
    splitByCharSet(text, tokenOptions, tokens);
  }
  if (tokens.count() == 0) {
    Command::logWarning("Couldn't find any string tokens");
    return true;
  }
  Variable value(Variable::TypeStringArray, tokens.count());
  for (int i = 0; i < tokens.count(); ++i) value.setValue(tokens[i].GetStr(), i);
  result = value;
  return true;
}
