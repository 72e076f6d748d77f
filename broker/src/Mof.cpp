#include "tvr/broker/Mof.h"

#include <strings.h>

#include <cctype>
#include <fstream>
#include <sstream>

namespace tvr::broker {

namespace {

bool sameName(std::string_view a, std::string_view b) {
  return a.size() == b.size() && strncasecmp(a.data(), b.data(), a.size()) == 0;
}

bool hasQualifierIn(const std::vector<MofQualifier>& qualifiers, std::string_view name) {
  for (const MofQualifier& q : qualifiers)
    if (sameName(q.name, name)) return true;
  return false;
}

struct Token {
  enum class Kind { End, Identifier, String, Number, Punctuation } kind = Kind::End;
  std::string text; ///< identifier or number as written; string without quotes; the punctuation character
  int line = 0;
};

class Lexer {
public:
  Lexer(std::string_view text, std::string file) : text_(text), file_(std::move(file)) {}

  // Reads the next token; false with `error` set on a lexical error.
  bool next(Token& token, MofError* error) {
    if (!skipBlanksAndComments(error)) return false;
    token = Token{};
    token.line = line_;
    if (pos_ >= text_.size()) return true;
    const char c = text_[pos_];
    if (std::isalpha(static_cast<unsigned char>(c)) || c == '_') {
      const std::size_t start = pos_;
      while (pos_ < text_.size() && (std::isalnum(static_cast<unsigned char>(text_[pos_])) || text_[pos_] == '_'))
        ++pos_;
      token.kind = Token::Kind::Identifier;
      token.text = std::string(text_.substr(start, pos_ - start));
      return true;
    }
    if (std::isdigit(static_cast<unsigned char>(c)) || ((c == '-' || c == '+' || c == '.') && pos_ + 1 < text_.size() &&
                                                          std::isdigit(static_cast<unsigned char>(text_[pos_ + 1])))) {
      const std::size_t start = pos_++;
      while (pos_ < text_.size() && (std::isalnum(static_cast<unsigned char>(text_[pos_])) || text_[pos_] == '.' ||
                                     ((text_[pos_] == '-' || text_[pos_] == '+') &&
                                      (text_[pos_ - 1] == 'e' || text_[pos_ - 1] == 'E'))))
        ++pos_;
      token.kind = Token::Kind::Number;
      token.text = std::string(text_.substr(start, pos_ - start));
      return true;
    }
    if (c == '"') return stringLiteral(token, error);
    if (c == '\'') {
      // A char16 literal: 'x' or '\x'; kept as its text.
      const std::size_t start = pos_++;
      if (pos_ < text_.size() && text_[pos_] == '\\') ++pos_;
      ++pos_;
      if (pos_ >= text_.size() || text_[pos_] != '\'') return fail(error, "unterminated character literal");
      ++pos_;
      token.kind = Token::Kind::String;
      token.text = std::string(text_.substr(start + 1, pos_ - start - 2));
      return true;
    }
    if (std::string_view("[](){};:,=$#").find(c) != std::string_view::npos) {
      ++pos_;
      token.kind = Token::Kind::Punctuation;
      token.text = std::string(1, c);
      return true;
    }
    return fail(error, std::string("unexpected character '") + c + "'");
  }

  const std::string& file() const { return file_; }
  int line() const { return line_; }

private:
  bool skipBlanksAndComments(MofError* error) {
    for (;;) {
      while (pos_ < text_.size() && std::isspace(static_cast<unsigned char>(text_[pos_]))) {
        if (text_[pos_] == '\n') ++line_;
        ++pos_;
      }
      if (text_.substr(pos_, 2) == "//") {
        while (pos_ < text_.size() && text_[pos_] != '\n') ++pos_;
        continue;
      }
      if (text_.substr(pos_, 2) == "/*") {
        const int start = line_;
        pos_ += 2;
        while (pos_ < text_.size() && text_.substr(pos_, 2) != "*/") {
          if (text_[pos_] == '\n') ++line_;
          ++pos_;
        }
        if (pos_ >= text_.size()) {
          line_ = start;
          return fail(error, "unterminated comment");
        }
        pos_ += 2;
        continue;
      }
      return true;
    }
  }

  bool stringLiteral(Token& token, MofError* error) {
    ++pos_;
    std::string value;
    for (;;) {
      if (pos_ >= text_.size() || text_[pos_] == '\n') return fail(error, "unterminated string");
      const char c = text_[pos_++];
      if (c == '"') break;
      if (c == '\\' && pos_ < text_.size()) {
        const char e = text_[pos_++];
        switch (e) {
        case 'n': value += '\n'; break;
        case 't': value += '\t'; break;
        case 'r': value += '\r'; break;
        default: value += e; break;
        }
        continue;
      }
      value += c;
    }
    token.kind = Token::Kind::String;
    token.text = std::move(value);
    return true;
  }

  bool fail(MofError* error, std::string message) {
    if (error) *error = MofError{file_, line_, std::move(message)};
    return false;
  }

  std::string_view text_;
  std::string file_;
  std::size_t pos_ = 0;
  int line_ = 1;
};

} // namespace

class MofParser {
public:
  MofParser(std::string_view text, std::string file, std::string includeDirectory, MofSchema& schema, int depth)
      : lexer_(text, std::move(file)), includeDirectory_(std::move(includeDirectory)), schema_(schema),
        depth_(depth) {}

  bool parse(MofError* error) {
    error_ = error;
    if (!advance()) return false;
    while (current_.kind != Token::Kind::End)
      if (!statement()) return false;
    return true;
  }

private:
  using Kind = Token::Kind;

  bool advance() { return lexer_.next(current_, error_); }

  bool fail(const std::string& message) {
    if (error_) *error_ = MofError{lexer_.file(), current_.line, message};
    return false;
  }

  bool isWord(std::string_view word) const {
    return current_.kind == Kind::Identifier && sameName(current_.text, word);
  }
  bool isPunct(char c) const { return current_.kind == Kind::Punctuation && current_.text[0] == c; }

  bool expectPunct(char c) {
    if (!isPunct(c)) return fail(std::string("expected '") + c + "'" + found());
    return advance();
  }

  bool identifier(std::string& out, const char* what) {
    if (current_.kind != Kind::Identifier) return fail(std::string("expected ") + what + found());
    out = current_.text;
    return advance();
  }

  std::string found() const {
    switch (current_.kind) {
    case Kind::End: return ", found the end of the file";
    case Kind::String: return ", found a string";
    default: return ", found '" + current_.text + "'";
    }
  }

  bool statement() {
    if (isPunct('#')) return pragma();
    if (isWord("qualifier")) return skipThroughSemicolon();
    std::vector<MofQualifier> qualifiers;
    if (isPunct('[') && !qualifierList(qualifiers)) return false;
    if (isWord("class")) return classDeclaration(std::move(qualifiers));
    if (isWord("instance")) return instanceDeclaration();
    return fail("expected a class or instance declaration" + found());
  }

  bool pragma() {
    const int line = current_.line;
    if (!advance()) return false;
    std::string name;
    if (!identifier(name, "a pragma name")) return false;
    if (!sameName(name, "pragma")) return fail("expected 'pragma' after '#'");
    if (!identifier(name, "a pragma name")) return false;
    if (!expectPunct('(')) return false;
    std::string argument;
    if (current_.kind == Kind::String) argument = current_.text;
    while (!isPunct(')')) {
      if (current_.kind == Kind::End) return fail("unterminated pragma");
      if (!advance()) return false;
    }
    if (!advance()) return false;
    if (sameName(name, "include") && !includeDirectory_.empty()) return include(argument, line);
    return true;
  }

  bool include(const std::string& file, int line) {
    if (depth_ > 16) return fail("includes nested too deep");
    const std::string path = includeDirectory_ + "/" + file;
    std::ifstream in(path);
    if (!in) {
      if (error_) *error_ = MofError{lexer_.file(), line, "cannot read included file " + path};
      return false;
    }
    std::ostringstream text;
    text << in.rdbuf();
    const std::string content = text.str();
    const std::size_t slash = path.find_last_of('/');
    MofParser nested(content, path, path.substr(0, slash), schema_, depth_ + 1);
    return nested.parse(error_);
  }

  bool skipThroughSemicolon() {
    int nesting = 0;
    for (;;) {
      if (current_.kind == Kind::End) return fail("unterminated declaration");
      if (isPunct('(') || isPunct('{') || isPunct('[')) ++nesting;
      if (isPunct(')') || isPunct('}') || isPunct(']')) --nesting;
      if (nesting == 0 && isPunct(';')) return advance();
      if (!advance()) return false;
    }
  }

  bool qualifierList(std::vector<MofQualifier>& out) {
    if (!expectPunct('[')) return false;
    for (;;) {
      MofQualifier q;
      if (!identifier(q.name, "a qualifier name")) return false;
      if (isPunct('(')) {
        if (!advance() || !valueTexts(q.values, ')')) return false;
      } else if (isPunct('{')) {
        if (!advance() || !valueTexts(q.values, '}')) return false;
      }
      // Old-style flavors after a colon: `Key : ToSubclass`.
      if (isPunct(':')) {
        if (!advance()) return false;
        std::string flavor;
        if (!identifier(flavor, "a flavor")) return false;
        while (current_.kind == Kind::Identifier)
          if (!advance()) return false;
      }
      out.push_back(std::move(q));
      if (isPunct(']')) return advance();
      if (!expectPunct(',')) return false;
    }
  }

  // Values up to the closing character: strings (adjacent ones joined),
  // numbers, identifiers, aliases, nested arrays.
  bool valueTexts(std::vector<std::string>& out, char close) {
    while (!isPunct(close)) {
      std::string value;
      if (!valueText(value)) return false;
      out.push_back(std::move(value));
      if (isPunct(',')) {
        if (!advance()) return false;
      } else if (!isPunct(close)) {
        return fail(std::string("expected ',' or '") + close + "'" + found());
      }
    }
    return advance();
  }

  bool valueText(std::string& out) {
    if (current_.kind == Kind::String) {
      while (current_.kind == Kind::String) {
        out += current_.text;
        if (!advance()) return false;
      }
      return true;
    }
    if (current_.kind == Kind::Number || current_.kind == Kind::Identifier) {
      out = current_.text;
      return advance();
    }
    if (isPunct('$')) {
      if (!advance()) return false;
      std::string alias;
      if (!identifier(alias, "an alias name")) return false;
      out = "$" + alias;
      return true;
    }
    if (isPunct('{')) {
      std::vector<std::string> items;
      if (!advance() || !valueTexts(items, '}')) return false;
      out = "{";
      for (std::size_t i = 0; i < items.size(); ++i) out += (i ? "," : "") + items[i];
      out += "}";
      return true;
    }
    return fail("expected a value" + found());
  }

  bool classDeclaration(std::vector<MofQualifier> qualifiers) {
    MofClass c;
    c.qualifiers = std::move(qualifiers);
    c.file = lexer_.file();
    c.line = current_.line;
    if (!advance()) return false;
    if (!identifier(c.name, "a class name")) return false;
    if (isPunct(':')) {
      if (!advance() || !identifier(c.superclass, "a superclass name")) return false;
    }
    if (!expectPunct('{')) return false;
    while (!isPunct('}'))
      if (!feature(c)) return false;
    if (!advance() || !expectPunct(';')) return false;
    schema_.merge(singleClass(std::move(c)));
    return true;
  }

  static MofSchema singleClass(MofClass c) {
    MofSchema one;
    one.classes_.push_back(std::move(c));
    return one;
  }

  bool feature(MofClass& c) {
    std::vector<MofQualifier> qualifiers;
    if (isPunct('[') && !qualifierList(qualifiers)) return false;
    const int line = current_.line;
    std::string type;
    if (!identifier(type, "a property type")) return false;
    std::string name;
    if (!identifier(name, "a property name")) return false;
    if (sameName(name, "ref")) {
      MofProperty p;
      p.type = "ref";
      p.refClass = type;
      p.qualifiers = std::move(qualifiers);
      p.line = line;
      if (!identifier(p.name, "a reference name")) return false;
      if (!defaultValue()) return false;
      c.properties.push_back(std::move(p));
      return expectPunct(';');
    }
    if (isPunct('(')) {
      int nesting = 0;
      do {
        if (current_.kind == Kind::End) return fail("unterminated method declaration");
        if (isPunct('(')) ++nesting;
        if (isPunct(')')) --nesting;
        if (!advance()) return false;
      } while (nesting > 0);
      c.methods.push_back(MofMethod{name, type, line});
      return expectPunct(';');
    }
    MofProperty p;
    p.name = name;
    p.type = type;
    p.qualifiers = std::move(qualifiers);
    p.line = line;
    if (isPunct('[')) {
      if (!advance()) return false;
      if (current_.kind == Kind::Number && !advance()) return false;
      if (!expectPunct(']')) return false;
      p.array = true;
    }
    if (!defaultValue()) return false;
    c.properties.push_back(std::move(p));
    return expectPunct(';');
  }

  bool defaultValue() {
    if (!isPunct('=')) return true;
    if (!advance()) return false;
    std::string ignored;
    return valueText(ignored);
  }

  bool instanceDeclaration() {
    MofInstance instance;
    instance.file = lexer_.file();
    instance.line = current_.line;
    if (!advance()) return false;
    if (!isWord("of")) return fail("expected 'of' after 'instance'" + found());
    if (!advance() || !identifier(instance.className, "a class name")) return false;
    if (isWord("as")) {
      if (!advance() || !expectPunct('$')) return false;
      std::string alias;
      if (!identifier(alias, "an alias name")) return false;
    }
    if (!expectPunct('{')) return false;
    while (!isPunct('}')) {
      if (isPunct('[')) {
        std::vector<MofQualifier> ignored;
        if (!qualifierList(ignored)) return false;
      }
      std::string name;
      if (!identifier(name, "a property name")) return false;
      if (!expectPunct('=')) return false;
      std::string value;
      if (!valueText(value)) return false;
      instance.values.emplace_back(std::move(name), std::move(value));
      if (!expectPunct(';')) return false;
    }
    if (!advance() || !expectPunct(';')) return false;
    schema_.instances_.push_back(std::move(instance));
    return true;
  }

  Lexer lexer_;
  std::string includeDirectory_;
  MofSchema& schema_;
  int depth_;
  Token current_;
  MofError* error_ = nullptr;
};

std::string MofError::str() const { return file + ":" + std::to_string(line) + ": " + message; }

bool MofProperty::hasQualifier(std::string_view name) const { return hasQualifierIn(qualifiers, name); }

bool MofClass::hasQualifier(std::string_view name) const { return hasQualifierIn(qualifiers, name); }

const MofProperty* MofClass::property(std::string_view name) const {
  for (const MofProperty& p : properties)
    if (sameName(p.name, name)) return &p;
  return nullptr;
}

std::optional<MofSchema> MofSchema::parse(std::string_view text, const std::string& origin, MofError* error,
                                          const std::string& includeDirectory) {
  MofSchema schema;
  MofParser parser(text, origin, includeDirectory, schema, 0);
  if (!parser.parse(error)) return std::nullopt;
  return schema;
}

std::optional<MofSchema> MofSchema::load(const std::string& path, MofError* error) {
  std::ifstream in(path);
  if (!in) {
    if (error) *error = MofError{path, 0, "cannot read MOF file"};
    return std::nullopt;
  }
  std::ostringstream text;
  text << in.rdbuf();
  const std::size_t slash = path.find_last_of('/');
  return parse(text.str(), path, error, slash == std::string::npos ? "." : path.substr(0, slash));
}

const MofClass* MofSchema::find(std::string_view className) const {
  for (const MofClass& c : classes_)
    if (sameName(c.name, className)) return &c;
  return nullptr;
}

void MofSchema::merge(const MofSchema& other) {
  for (const MofClass& c : other.classes_) {
    bool replaced = false;
    for (MofClass& mine : classes_) {
      if (sameName(mine.name, c.name)) {
        mine = c;
        replaced = true;
        break;
      }
    }
    if (!replaced) classes_.push_back(c);
  }
  instances_.insert(instances_.end(), other.instances_.begin(), other.instances_.end());
}

std::vector<std::string> MofSchema::ancestry(std::string_view className) const {
  std::vector<std::string> chain;
  const MofClass* c = find(className);
  while (c && chain.size() < 64) {
    chain.push_back(c->name);
    c = c->superclass.empty() ? nullptr : find(c->superclass);
  }
  return chain;
}

std::vector<std::string> MofSchema::keysOf(std::string_view className) const {
  std::vector<std::string> keys;
  const std::vector<std::string> chain = ancestry(className);
  // From the root down, so inherited keys come first. A key stays a key in
  // every subclass; declaring it again does not add it twice.
  for (auto it = chain.rbegin(); it != chain.rend(); ++it) {
    for (const MofProperty& p : find(*it)->properties) {
      if (!p.isKey()) continue;
      bool known = false;
      for (const std::string& k : keys) known = known || sameName(k, p.name);
      if (!known) keys.push_back(p.name);
    }
  }
  return keys;
}

const MofProperty* MofSchema::findProperty(std::string_view className, std::string_view property) const {
  for (const std::string& name : ancestry(className))
    if (const MofProperty* p = find(name)->property(property)) return p;
  return nullptr;
}

std::map<std::string, std::vector<std::string>> classKeysOf(const MofSchema& schema) {
  std::map<std::string, std::vector<std::string>> keys;
  for (const MofClass& c : schema.classes()) {
    std::vector<std::string> k = schema.keysOf(c.name);
    if (!k.empty()) keys[c.name] = std::move(k);
  }
  return keys;
}

} // namespace tvr::broker
