// How the console shows what each line did: one renderer per mode. Plain
// output is a result on standard output and the messages on standard error;
// JSON is one object per line; check mode compares each case's outcome with
// the note beside it and reports the cases that differ.
#pragma once

#include <stddef.h>

#include "outcome.h"
#include "output_stream.h"
#include "plugin_session.h"
#include "script_line.h"

class Renderer {
 public:
  virtual ~Renderer() = default;
  // Whether lines are read as script cases, with notes.
  virtual bool readsCases() const { return false; }
  // Shows what a line (its text, length bytes, read into line) did; returns
  // whether it counts as passed.
  virtual bool show(int lineNumber, const char* text, const ScriptLine& line,
                    const Outcome& outcome) = 0;
  // The plug-in's identity and every command's registration.
  virtual void list(PluginSession& session) = 0;
};

class PlainRenderer : public Renderer {
 public:
  PlainRenderer(OutputStream& out, OutputStream& err) : m_out(out), m_err(err) {}
  bool show(int lineNumber, const char* text, const ScriptLine& line,
            const Outcome& outcome) override;
  void list(PluginSession& session) override;

 private:
  OutputStream& m_out;
  OutputStream& m_err;
};

class JsonRenderer : public Renderer {
 public:
  explicit JsonRenderer(OutputStream& out) : m_out(out) {}
  bool show(int lineNumber, const char* text, const ScriptLine& line,
            const Outcome& outcome) override;
  void list(PluginSession& session) override;

 private:
  OutputStream& m_out;
};

class CheckRenderer : public Renderer {
 public:
  // source names where the cases come from, in each report.
  CheckRenderer(OutputStream& out, OutputStream& err, const char* source)
      : m_out(out), m_plain(out, err), m_source(source) {}
  bool readsCases() const override { return true; }
  bool show(int lineNumber, const char* text, const ScriptLine& line,
            const Outcome& outcome) override;
  void list(PluginSession& session) override { m_plain.list(session); }
  // The summary: how many cases ran and how many differ; when the input
  // could not be read in full, that reading stopped after them.
  void summarize(bool inputReadInFull);

 private:
  OutputStream& m_out;
  PlainRenderer m_plain;
  const char* m_source;
  int m_casesRun = 0;
  int m_casesDiffering = 0;
};
