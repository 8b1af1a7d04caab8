package com.brindlex.kernel.quorvane.console.mask;

/** The kinds of secrets that a log holds. */
public enum Secret {
    /** A trading password, old or new: always replaced. */
    PASSWORD,
    /** An ID number. */
    ID,
    /** An account number. */
    ACCOUNT,
    /** A signature, or the text of a certificate. */
    SIGNATURE,
    /** Name, address, telephone number and birthday of an applicant. */
    PERSON
}
