// Applying a job: creating the object a job file names and setting its members through the object's
// automation interface, by name and in file order. The program knows no class of the library: it reads
// each member's type from the interface's own description.
//
// Values: numbers, booleans and strings are passed as they are and converted by the automation layer.
// A member that takes an object accepts
//   - an array: the values of the object's settable properties in the interface's own order
//     (a coordinate [x, y], a rectangle [left, top, right, bottom], a range [minimum, maximum], ...),
//   - an object: a nested job, whose "class" may be left out where the member's type fixes the class,
//   - null: no object.
// An object without "class" starts from the member's current value (its getter hands out a new copy) or,
// where there is no getter or no value, from a new object of the default class of the member's
// interface; its keys are applied and the object is put, as the library's own clients do.
// A key naming a method with one argument takes an array and calls the method once per element.
#pragma once

#include "tools/job_json.h"

#include "platform/com_ptr.h"
#include "platform/dispatch.h"

#include <string>

namespace Norvane::Lumis::Scanning::Tool {

struct JobObject {
    CComPtr<IDispatch> object;
    std::string className; // the class as registered ("PatternLine"), whichever name the job used
};

// Creates the object named by the job's "class" (a coclass name or ProgID) and applies every other key.
// A failure throws ToolError "<JSON path>: <reason>", with the library's error text and HRESULT where
// the library refused a value: "RenderingProperties.PatternAlignmentsX.Range: Range values not correct
// (0x80070057)".
JobObject ApplyJob(const Json& job);

} // namespace Norvane::Lumis::Scanning::Tool
