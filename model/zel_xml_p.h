// Internal: what XML 1.0 text may hold, for writing documents that every XML
// reader accepts without touching the process-wide QDom settings.
// Never installed; include it from sources only.
#ifndef ZEL_XML_P_H
#define ZEL_XML_P_H

#include <QString>

namespace ZelXml {

// True when name is a valid element or attribute name for every XML 1.0
// reader, Qt's included: the XML 1.0 (fourth edition, Appendix B) letters and
// name characters, ASCII '_', '-', '.', and only where the Unicode category
// agrees (letters start a name; marks, digits and modifier letters may follow).
// ':' is refused, since an undeclared prefix fails namespace-aware readers, as
// are characters outside the Basic Multilingual Plane.
bool isValidName(const QString& name);

// The text without the characters XML 1.0 cannot carry: control characters
// other than tab, line feed and carriage return, unpaired surrogates, U+FFFE
// and U+FFFF. Returns the text itself in the usual case where nothing goes.
QString xmlCharsOnly(const QString& text);

} // namespace ZelXml

#endif
