/**
 * @file
 * The declarations of the library's headers, read from their text.
 */
#ifndef DOCS_DECLARATIONS_H
#define DOCS_DECLARATIONS_H

#include <map>
#include <string>
#include <utility>
#include <vector>

/** The event classes, in the order of declaration. */
std::vector<std::string> DeclaredEvents();

/** Every callback's declaration, "Name(parameters)", by its name. */
const std::map<std::string, std::string>& DeclaredCallbacks();

/** A name and its number. */
typedef std::pair<std::string, int> Enumerator;

/** The enumerators of every enumeration that events carry, by the name of the enumeration. */
std::map<std::string, std::vector<Enumerator>> DeclaredEnumerations();

/** The number of an enumerator of any enumeration. @throw std::out_of_range there is none */
int NumberOf(const std::string& enumerator);

/** The names of the parameters of a signature, "Name(type name, type name)". */
std::vector<std::string> ParameterNames(const std::string& signature);

#endif
