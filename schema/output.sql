-- What output remembers: saved recipients, what was sent and printed, the fields of exports.

-- A user's saved recipients in the user's order. A family address has the person at its head.
CREATE TABLE [tbl_email_memory] (
    [user_id] INTEGER DEFAULT 0 NOT NULL,           -- 0 without security
    [surname_id] INTEGER NOT NULL,
    [person_id] INTEGER NOT NULL,
    [address_kind] INTEGER DEFAULT 0 NOT NULL,      -- 0 as chosen for the run, 1 family, 2 individual, 3 business
    [position] INTEGER DEFAULT 0 NOT NULL
) STRICT;
CREATE INDEX [idx_email_memory_user] ON [tbl_email_memory] ([user_id], [position]);
CREATE INDEX [idx_email_memory_person] ON [tbl_email_memory] ([person_id]);
CREATE INDEX [idx_email_memory_family] ON [tbl_email_memory] ([surname_id]);

-- Every run of messages. Names and addresses are kept as they were, so that the history outlives people and projects.
CREATE TABLE [tbl_email_history] (
    [email_history_id] INTEGER PRIMARY KEY,
    [area] INTEGER DEFAULT 1 NOT NULL,              -- 1 e-mail manager, 2 roster
    [sent] TEXT,                                    -- time of the start
    [finished] TEXT,
    [user_id] INTEGER DEFAULT 0 NOT NULL,
    [sender_name] TEXT,
    [sender_address] TEXT,
    [transport] INTEGER DEFAULT 1 NOT NULL,         -- 1 mail server, 2 mail client
    [subject] TEXT,
    [message] TEXT,
    [message_format] INTEGER DEFAULT 0 NOT NULL,    -- 0 plain text, 1 HTML, 2 rich text
    [letter] TEXT,
    [address_kind] INTEGER DEFAULT 0 NOT NULL,      -- 1 family, 2 individual, 3 business
    [tracking] TEXT,                                -- who received tracking copies
    [cancelled] INTEGER DEFAULT 0 NOT NULL,
    [failure] TEXT,                                 -- what stopped the run as a whole
    [roster_projects] TEXT,
    [period_start] TEXT,
    [period_finish] TEXT
) STRICT;
CREATE INDEX [idx_email_history_sent] ON [tbl_email_history] ([area], [sent]);

CREATE TABLE [tbl_email_history_recipient] (
    [email_history_id] INTEGER NOT NULL,
    [position] INTEGER NOT NULL,
    [surname_id] INTEGER,
    [person_id] INTEGER,
    [recipient] TEXT,
    [address] TEXT,
    [address_kind] INTEGER DEFAULT 0 NOT NULL,
    [tracking_copy] INTEGER DEFAULT 0 NOT NULL,
    [outcome] INTEGER DEFAULT 0 NOT NULL,           -- 0 not sent, 1 sent, 2 failed, 3 no address, 4 cancelled
    [reason] TEXT,
    [sent] TEXT,
    PRIMARY KEY ([email_history_id], [position])
) STRICT;
CREATE INDEX [idx_email_history_recipient_person] ON [tbl_email_history_recipient] ([person_id]);
CREATE INDEX [idx_email_history_recipient_family] ON [tbl_email_history_recipient] ([surname_id]);

CREATE TABLE [tbl_email_history_attachment] (
    [email_history_id] INTEGER NOT NULL,
    [position] INTEGER NOT NULL,
    [file_name] TEXT,
    PRIMARY KEY ([email_history_id], [position])
) STRICT;

-- Everything printed that is to be found again, with the people whom it was printed for.
CREATE TABLE [tbl_print_history] (
    [print_history_id] INTEGER PRIMARY KEY,
    [area] INTEGER DEFAULT 1 NOT NULL,              -- 1 reports, 2 roster
    [printed] TEXT,
    [user_id] INTEGER DEFAULT 0 NOT NULL,
    [report] TEXT,                                  -- key of the layout
    [title] TEXT,
    [criteria] TEXT,
    [printer] TEXT,
    [pages] INTEGER DEFAULT 0 NOT NULL,
    [copies] INTEGER DEFAULT 1 NOT NULL,
    [cancelled] INTEGER DEFAULT 0 NOT NULL,
    [roster_projects] TEXT,
    [period_start] TEXT,
    [period_finish] TEXT
) STRICT;
CREATE INDEX [idx_print_history_printed] ON [tbl_print_history] ([area], [printed]);

CREATE TABLE [tbl_print_history_person] (
    [print_history_id] INTEGER NOT NULL,
    [position] INTEGER NOT NULL,
    [surname_id] INTEGER,
    [person_id] INTEGER,
    [recipient] TEXT,
    PRIMARY KEY ([print_history_id], [position])
) STRICT;
CREATE INDEX [idx_print_history_person_person] ON [tbl_print_history_person] ([person_id]);
CREATE INDEX [idx_print_history_person_family] ON [tbl_print_history_person] ([surname_id]);

-- The fields chosen for an export, by the key of each field.
CREATE TABLE [tbl_export_field_names] (
    [export_kind] INTEGER DEFAULT 1 NOT NULL,       -- 1 personal export, 2 directory export
    [field_name] TEXT NOT NULL,
    [position] INTEGER DEFAULT 0 NOT NULL,
    PRIMARY KEY ([export_kind], [field_name])
) STRICT;
