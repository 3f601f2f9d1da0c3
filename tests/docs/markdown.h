/**
 * @file
 * The part of Markdown that the documents of this project use.
 */
#ifndef DOCS_MARKDOWN_H
#define DOCS_MARKDOWN_H

#include <string>
#include <vector>

/** The cells of a row, without the bars. */
typedef std::vector<std::string> TableRow;

/** A heading and the lines below it, up to the next heading. */
struct Chapter {
    std::string title; ///< without the leading #; empty for the text before the first heading
    int level = 0;     ///< the number of #
    std::vector<std::string> lines;

    /** The name by which links reach it. */
    std::string Anchor() const;

    /** The rows of all its tables, without the headers. */
    std::vector<TableRow> TableRows() const;

    /**
     * The items of its numbered list, each on one line: "1. text". Its nested bullets follow, each
     * on one line: "- text".
     */
    std::vector<std::vector<std::string>> NumberedItems() const;
};

/** @throw std::runtime_error the file cannot be read */
std::vector<Chapter> ReadMarkdown(const std::string& path);

/** The targets of all links in a text. */
std::vector<std::string> LinkTargets(const std::string& text);

/** The texts of all code spans in a text. */
std::vector<std::string> CodeSpans(const std::string& text);

bool StartsWith(const std::string& text, const std::string& start);

/** The whole content of a file. @throw std::runtime_error it cannot be read */
std::string ReadFile(const std::string& path);

/** All matches of the first group of a regular expression. */
std::vector<std::string> AllMatches(const std::string& text, const std::string& expression);

#endif
