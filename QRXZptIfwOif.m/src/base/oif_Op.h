#ifndef QRX_OIF_OP_H
#define QRX_OIF_OP_H

/// How a keyword of a step stands to what steps before it said: it adds to that and changes it, or it begins
/// anew and ends what it doesn't say again.
enum class oif_Op { MODIFY, NEW };

#endif
