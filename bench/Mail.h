#pragma once

namespace pelmar::bench {

// "mail [CARDS]": the e-mail campaign of a generated company of that many cards to an SMTP
// server on loopback, one message per recipient and in groups of 20, against a plain Python
// smtplib loop sending the same number of the same message to the same server. Prints messages
// a second for each.
int measureMail(int cards);

}  // namespace pelmar::bench
