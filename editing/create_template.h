#pragma once

class CMultiDocTemplate;

// A new template of parameter documents, which the caller owns.
CMultiDocTemplate* createTemplate();
