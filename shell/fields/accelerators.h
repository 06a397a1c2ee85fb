#pragma once

#include <QString>

namespace gridbay::shell {

// The letters that lead to the controls of a page: each is taken once, and none that a menu has.
class Accelerators {
 public:
  // A text with its own key, or with the first letter that is free. An ampersand that is no key stays one.
  QString take(const QString& text) {
    QString plain;
    qsizetype own = -1;
    for (qsizetype i = 0; i < text.size(); ++i) {
      if (text[i] != '&') {
        plain += text[i];
      } else if (i + 1 < text.size() && text[i + 1].isLetterOrNumber()) {
        own = plain.size();
      } else {
        plain += "&&";
        if (i + 1 < text.size() && text[i + 1] == '&') ++i;
      }
    }
    if (own >= 0 && isFree(plain[own])) return marked(plain, own);
    for (qsizetype i = 0; i < plain.size(); ++i) {
      if (plain[i].unicode() < 128 && plain[i].isLetter() && isFree(plain[i])) return marked(plain, i);
    }
    return plain;
  }
  // Gives back the letter of a text that is shown no more.
  void release(const QString& text) {
    for (qsizetype i = 0; i + 1 < text.size(); ++i) {
      if (text[i] == '&' && text[++i] != '&') used_.remove(text[i].toUpper());
    }
  }

 private:
  bool isFree(QChar letter) const { return !used_.contains(letter.toUpper()); }
  QString marked(const QString& plain, qsizetype at) {
    used_ += plain[at].toUpper();
    return QString(plain).insert(at, '&');
  }

  QString used_ = "FEVRWH";
};

}  // namespace gridbay::shell
