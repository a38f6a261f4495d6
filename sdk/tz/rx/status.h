#pragma once

// What the host's operations answer. Operations on objects of a drawing give an ErrorStatus, in
// which zero is success; questions to the user give a PromptStatus, in which 5100 is an answer.
// Both are plain numbers to the operations that carry them, so either may be compared with an int.
//
//   if (tzdbOpenObject(entity, id, TzDb::kForWrite) != Tzad::eOk) return;
//   if (tzedGetVar(L"TEXTSIZE", &value) != Tzad::ePromptNormal) return;

namespace Tzad {

// Success is 0. The numbers up to 100 are those that a user meets in messages; those from 1001 are
// this host's own and are only told apart by their names.
enum [[nodiscard]] ErrorStatus : int{
    eOk = 0,
    eWasOpenForRead = 15,       // another holder has the object open for read
    eWasOpenForWrite = 45,      // another holder has the object open for write
    eAlreadyOpenForWrite = 83,  // the object is already open for write, as seen by an upgrade too
    eOnLockedLayer = 87,        // opening or upgrading for write is refused: the layer is locked

    eInvalidInput = 1001,        // an argument outside what the operation takes
    eNullObjectId = 1002,        // the id names nothing
    eNullObjectPointer = 1003,   // a null pointer where an object is needed
    eUnknownHandle = 1004,       // no object of the drawing has the handle or id
    eWrongObjectType = 1005,     // the object is of another class
    eWrongDatabase = 1006,       // the object belongs to another drawing
    eKeyNotFound = 1007,         // no entry of that name or key
    eDuplicateKey = 1008,        // an entry of that name or key exists
    eWasErased = 1009,           // the object is erased
    eNotOpenForRead = 1010,      // the object is not open
    eNotOpenForWrite = 1011,     // the object is not open for write
    eNoDatabase = 1012,          // the object is in no drawing
    eAlreadyInDatabase = 1013,   // the object is in a drawing already
    eInvalidIndex = 1014,        // an index outside the rows there are
    eOutOfRange = 1015,          // a value outside its limits
    eDegenerateGeometry = 1016,  // a zero direction, parallel vectors, a number that is not finite
    eNotApplicable = 1017,       // the operation means nothing for this object
    eInvalidSymbolName = 1018,   // a name that no table record may have
    eInUse = 1019,               // something still refers to the object
    eEndOfIteration = 1020,      // the iterator is done
    eFileNotFound = 1021,        // there is no such file
    eFileError = 1022,           // the file cannot be read or written
    eMalformedFile = 1023,       // the file's contents cannot be understood
    eNewerFile = 1024,           // the file was written by a newer version
    eNoDocument = 1025,          // no drawing is open
    eNotImplemented = 1026,      // this host does not offer the operation
    eFieldNotEvaluated = 1027,   // a field has no value
    eInternal = 1028,            // a failure with no status of its own
};

// How a question ended.
enum PromptStatus : int {
    ePromptNone = 5000,      // an empty answer
    ePromptNormal = 5100,    // an answer
    ePromptError = -5001,    // the question could not be asked, or picked nothing
    ePromptCancel = -5002,   // the user cancelled
    ePromptReject = -5003,   // the host cannot do this now
    ePromptKeyword = -5005,  // a keyword, fetched with tzedGetInput
    ePromptTooLong = -5008,  // the line is too long; the embedded host asks again instead
};

}  // namespace Tzad
