// The host's command base class. A command declares its name, description,
// category and options while it is constructed; the host then checks a
// script's arguments with checkArgSyntax and, only when that answers true,
// runs execute. Commands are released through deleteThis, never deleted.
#pragma once

#include <stddef.h>

#include "command_option.h"
#include "core_export.h"
#include "hobject.h"
#include "hstring.h"
#include "tarray.h"
#include "variable.h"

class TAVIXCORE_API Command : public HObject {
 public:
  // Name, description and a third string this host keeps but does not use.
  // The command starts with one reference, its creator's.
  Command(const HString& name, const HString& description, const HString& extra);

  const HRuntimeClass* getRuntimeClass() const override;

  // Runs the command on arguments that passed checkArgSyntax. Returns false
  // only after logging an error; after an error or a warning the result is
  // left as it was.
  virtual bool execute(const TArray<CommandOption>& options, const TArray<Variable>& args,
                       Variable& result) = 0;
  // Default: the empty text.
  virtual void getArgSyntaxString(HString& syntax) const;
  // Default: any arguments are accepted.
  virtual bool checkArgSyntax(const TArray<Variable>& args,
                              const TArray<CommandOption>& options) const;
  // Default: true.
  virtual bool canExecuteSolo() const;
  // Default: TypeNone.
  virtual Variable::VarType getReturnType() const;
  // Default: looks the name up among the declared options; when found, sets
  // index and type to its declared-option index and value type and returns 1,
  // otherwise returns 0 and leaves both alone.
  virtual int getOptionSyntax(const char* name, int& index, Variable::VarType& type) const;
  // Default: false.
  virtual bool isUndoable() const;

  void setCommandCategory(HString category, HString subCategory);
  // Takes ownership of option and declares it with the next declared-option
  // index; returns it. The size and flag are kept for the host's layout and
  // not used. A null option is not added and null is returned.
  CommandOption* addOption(CommandOption* option, size_t size, bool flag);

  void ref();
  // Drops one reference; at zero the command is destroyed through its
  // virtual destructor.
  void unref();

  // printf-style messages to the host's log.
  static void logError(const char* format, ...) TAVIX_PRINTF(1, 2);
  static void logWarning(const char* format, ...) TAVIX_PRINTF(1, 2);

  static const HRuntimeClass s_classCommand;

  // Read-back for hosts and tests.
  const char* getName() const;
  const char* getDescription() const;
  const char* getCategory() const;
  int getNumOptions() const;
  // The declared option at index, or null outside 0..getNumOptions()-1.
  const CommandOption* getOption(int index) const;

 protected:
  ~Command() override;

 private:
  struct Data;
  Data* m_data;
};
