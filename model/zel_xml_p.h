// Internal: what XML 1.0 text may hold, for writing documents that every XML
// reader accepts without touching the process-wide QDom settings.
// Never installed; include it from sources only.
#ifndef ZEL_XML_P_H
#define ZEL_XML_P_H

#include <QString>
#include <QStringView>

namespace ZelXml {

// True when name is an element or attribute name that both Qt 5's and Qt 6's
// DOM write and read back as the same name: the XML 1.0 (fourth edition,
// Appendix B) letters and name characters, less five that Qt 5's reader
// refuses, and ASCII '_', '-', '.' (letters and '_' start a name). ':' is
// refused, since an undeclared prefix fails namespace-aware readers (Qt 6
// reads "a:" as an error), as are characters outside the Basic Multilingual
// Plane.
bool isValidName(QStringView name);

// The text without the characters XML 1.0 cannot carry: control characters
// other than tab, line feed and carriage return, unpaired surrogates, U+FFFE
// and U+FFFF. Returns the text itself in the usual case where nothing goes.
QString xmlCharsOnly(const QString& text);

// Writes text as the content of an element, exactly as QDomDocument's writer
// writes a text node inside an element whose text is xmlCharsOnly(text): the
// characters XML 1.0 cannot carry left out, '<' as "&lt;", '&' as "&amp;",
// '>' after "]]" as "&gt;" and a carriage return as "&#xd;" (so that it
// survives line-end normalisation); everything else, quotes included, as it
// is. out must have room for kMaxEscapedLength characters per unit of text.
// Returns the end of what was written.
const int kMaxEscapedLength = 5;
QChar* writeElementText(QStringView text, QChar* out);

} // namespace ZelXml

#endif
