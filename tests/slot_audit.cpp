// Compiled only for the slot audit: makes the compiler lay out the virtual
// table of every class a host calls through, by calling one virtual
// operation through a pointer of each class.
#include "../commands/compare_search.h"
#include "../commands/hstring_array.h"
#include "../commands/substring.h"
#include "../commands/test_print.h"
#include "../commands/token.h"
#include "../commands/token_array.h"
#include "../plugin/string_commands_plugin.h"

template <class T>
void layOut(T* object) {
  object->getRuntimeClass();
}

void layOutAll(HObject* a, Command* b, HomCorePluginBase* c, CommandPluginBase* d,
               TavixStringCommandsPlugin* e, StrCompareCmd* f, StrFindCmd* g, StrLeftCmd* h,
               StrLengthCmd* i, StrMidCmd* j, StrReplaceCmd* k, StrRightCmd* l,
               StrReverseFindCmd* m, StrTokCmd* n, StrTokArrayCmd* o, TestPrintCmd* p,
               HStringArray* q, Variable* r) {
  layOut(a), layOut(b), layOut(c), layOut(d), layOut(e), layOut(f), layOut(g), layOut(h);
  layOut(i), layOut(j), layOut(k), layOut(l), layOut(m), layOut(n), layOut(o), layOut(p);
  e->initialize();  // the plug-in overrides no getRuntimeClass
  delete q;         // the string array overrides only its destructor
  r->getType();
}
