// SPDX-License-Identifier: MIT
// Builds the tree from the events of libfyaml, which reads YAML 1.2 and limits nesting.
#include "tools/steps/yaml.hpp"

#include <libfyaml.h>

#include <map>
#include <new>

namespace qz::tools::steps {
namespace {

/// How many nodes there may be for each byte of the text, once aliases are followed. Without
/// aliases there is hardly more than one node for two bytes.
constexpr std::size_t mostNodesForAByte = 4;

/// How deeply lists and tables can be nested. A walk-through needs less than ten levels.
constexpr std::size_t deepestNesting = 100;

struct YamlRefusal {
  std::size_t offset;  // in the text
  std::string message;
};

/// Puts each node into the one that is open.
class TreeBuilder {
 public:
  /// `start` is the place of the text's first byte.
  TreeBuilder(std::size_t mostNodes, Place start) : mostNodes_(mostNodes), start_(start) {}

  NodeRef root() const { return root_; }

  void begin(Node::Kind kind, std::size_t offset, const std::string& anchor) {
    if (open_.size() == deepestNesting) {
      throw YamlRefusal{offset, "lists and tables are nested too deeply; expected at most " +
                                    std::to_string(deepestNesting) + " levels"};
    }
    open_.push_back(
        {std::make_shared<Node>(Node{.kind = kind, .place = start_ + offset}), anchor, nullptr});
  }

  void end() {
    const Open closed = open_.back();
    open_.pop_back();
    keep(closed.node, closed.anchor, closed.node->place - start_);
  }

  void addScalar(std::string text, bool isPlain, std::size_t offset, const std::string& anchor) {
    const bool isNothing = isPlain && (text.empty() || text == "~" || text == "null");
    const auto kind = isNothing ? Node::Kind::nothing : Node::Kind::scalar;
    keep(std::make_shared<Node>(
             Node{.kind = kind, .place = start_ + offset, .text = std::move(text)}),
         anchor, offset);
  }

  void addAlias(const std::string& anchor, std::size_t offset) {
    const auto known = anchors_.find(anchor);
    if (known == anchors_.end()) {
      throw YamlRefusal{offset, "nothing before this has the anchor “" + anchor + "”"};
    }
    add(known->second, offset);
  }

 private:
  struct Open {
    std::shared_ptr<Node> node;
    std::string anchor;
    NodeRef key;  // of the entry that is being read
  };

  void keep(const NodeRef& node, const std::string& anchor, std::size_t offset) {
    if (!anchor.empty()) anchors_[anchor] = node;
    add(node, offset);
  }

  void add(const NodeRef& node, std::size_t offset) {
    if (open_.empty()) {
      root_ = node;
      return;
    }
    Open& parent = open_.back();
    parent.node->size += node->size;
    if (parent.node->size > mostNodes_) {
      throw YamlRefusal{offset, "the aliases of this file repeat too much; expected at most " +
                                    std::to_string(mostNodes_) + " values"};
    }
    if (parent.node->kind == Node::Kind::list) {
      parent.node->elements.push_back(node);
    } else if (!parent.key) {
      parent.key = node;
    } else {
      parent.node->entries.emplace_back(std::move(parent.key), node);
      parent.key = nullptr;
    }
  }

  std::size_t mostNodes_;
  Place start_;
  NodeRef root_;
  std::vector<Open> open_;
  std::map<std::string, NodeRef> anchors_;
};

std::string tokenText(fy_token* token) {
  if (!token) return {};
  std::size_t size = 0;
  const char* const text = fy_token_get_text(token, &size);
  if (!text) throw std::bad_alloc();
  return {text, size};
}

/// The parser, and what it has found wrong.
class YamlParser {
 public:
  YamlParser(std::string_view text, Place start) : text_(text), start_(start) {
    fy_diag_cfg quiet;
    fy_diag_cfg_default(&quiet);
    diagnostics_.reset(fy_diag_create(&quiet));
    if (!diagnostics_) throw std::bad_alloc();
    fy_diag_set_collect_errors(diagnostics_.get(), true);
    const fy_parse_cfg options = {
        .search_path = "", .flags = FYPCF_QUIET, .userdata = nullptr, .diag = diagnostics_.get()};
    parser_.reset(fy_parser_create(&options));
    if (!parser_ || fy_parser_set_string(parser_.get(), text.data(), text.size()) != 0) {
      throw std::bad_alloc();
    }
  }

  NodeRef read() {
    TreeBuilder builder(mostNodesForAByte * text_.size() + 1, start_);
    while (fy_event* const event = fy_parser_parse(parser_.get())) {
      const EventOwner owner{parser_.get(), event};
      handle(*event, builder);
    }
    if (fy_parser_get_stream_error(parser_.get())) refuse();
    if (!builder.root()) throw YamlRefusal{0, "an empty file; expected a walk-through in steps"};
    return builder.root();
  }

 private:
  struct EventOwner {
    fy_parser* parser;
    fy_event* event;
    ~EventOwner() { fy_parser_event_free(parser, event); }
  };

  [[noreturn]] void refuse() const {
    void* previous = nullptr;
    const fy_diag_error* const error = fy_diag_errors_iterate(diagnostics_.get(), &previous);
    if (!error) throw YamlRefusal{0, "not YAML"};
    const fy_mark* const mark = error->fyt ? fy_token_start_mark(error->fyt) : nullptr;
    throw YamlRefusal{mark ? mark->input_pos : 0, std::string("not YAML: ") + error->msg};
  }

  void handle(const fy_event& event, TreeBuilder& builder) {
    const fy_mark* const mark = fy_event_start_mark(const_cast<fy_event*>(&event));
    if (mark) offset_ = mark->input_pos;
    const std::size_t offset = offset_;  // of what is left out: that of its key
    switch (event.type) {
      case FYET_DOCUMENT_START:
        if (builder.root()) {
          throw YamlRefusal{offset, "a second document; expected one walk-through in a file"};
        }
        return;
      case FYET_MAPPING_START:
        return builder.begin(Node::Kind::table, offset, tokenText(event.mapping_start.anchor));
      case FYET_SEQUENCE_START:
        return builder.begin(Node::Kind::list, offset, tokenText(event.sequence_start.anchor));
      case FYET_MAPPING_END:
      case FYET_SEQUENCE_END:
        return builder.end();
      case FYET_SCALAR: {
        fy_token* const value = event.scalar.value;
        const bool isPlain = !value || fy_token_scalar_style(value) == FYSS_PLAIN;
        return builder.addScalar(tokenText(value), isPlain, offset, tokenText(event.scalar.anchor));
      }
      case FYET_ALIAS:
        return builder.addAlias(tokenText(event.alias.anchor), offset - 1);  // at the star
      default:
        return;
    }
  }

  struct Destroyer {
    void operator()(fy_parser* parser) const { fy_parser_destroy(parser); }
    void operator()(fy_diag* diagnostics) const { fy_diag_destroy(diagnostics); }
  };

  std::string_view text_;
  Place start_;
  std::size_t offset_ = 0;  // of the last event that has one
  std::unique_ptr<fy_diag, Destroyer> diagnostics_;
  std::unique_ptr<fy_parser, Destroyer> parser_;
};

/// Refuses lines that begin with a percent sign: a source needs no directives, and the parser does
/// not come back from some that are wrong.
void refuseDirectives(std::string_view text) {
  for (std::size_t i = 0; i < text.size(); i = text.find('\n', i) + 1) {
    if (text[i] == '%') throw YamlRefusal{i, "expected no directive at the beginning of a line"};
    if (text.find('\n', i) == std::string_view::npos) return;
  }
}

}  // namespace

NodeRef readYaml(std::string_view text, Place begin, Mistakes& mistakes) {
  try {
    refuseDirectives(text);
    return YamlParser(text, begin).read();
  } catch (const YamlRefusal& refusal) {
    mistakes.add(begin + refusal.offset, refusal.message);
  }
  return nullptr;
}

}  // namespace qz::tools::steps
