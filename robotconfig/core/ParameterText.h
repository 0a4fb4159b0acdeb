// How a text given by a user (a device, model, network or node name, a data-log
// parameter) is written into a configuration line so that reading the line
// gives the text back whole.
#pragma once

#include "robotconfig/host/CString.h"

/// `sText` as a parameter of a configuration line: between double quotes when
/// it is empty or holds a character that ends an unquoted parameter (blank,
/// tab, comma, parenthesis) or starts with a double quote; as it is otherwise.
/// A text that holds a double quote cannot be quoted and is written as it is:
/// no line can carry one that also needs quotes.
CString textAsParameter(const CString &sText);

/// A name column's parameter: empty for an empty name (the column then reads
/// back as an empty name), else textAsParameter.
CString nameAsParameter(const CString &sName);
