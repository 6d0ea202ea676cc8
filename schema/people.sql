-- Families and people, what they carry, and the lists it is chosen from.

-- Families. The sort key is the surname without accents and case. It has no index: a list in its order reads faster by
-- key and sorts afterwards, and looking one name up takes milliseconds without.
CREATE TABLE [tbl_surname] (
    [Surname_ID] INTEGER PRIMARY KEY,
    [surname] TEXT,
    [Primary_name] TEXT,                            -- given name at position 1
    [Condition] INTEGER DEFAULT 0 NOT NULL,         -- 0 active, 1 privacy requested, 2 prospect, 3 archive
    [created] TEXT,
    [last_edit] TEXT,
    [booked_out] INTEGER DEFAULT 0 NOT NULL,
    [booked_out_date] TEXT,
    [booked_out_person] TEXT,
    [active_in_book] INTEGER DEFAULT 0 NOT NULL,    -- may be changed in this booked-out copy
    [sort_key] TEXT
) STRICT;
CREATE INDEX [idx_surname_condition] ON [tbl_surname] ([Condition]);
CREATE INDEX [idx_surname_booked] ON [tbl_surname] ([booked_out], [booked_out_person]);

-- People. The sort key is the surname by which the person sorts (their own unless empty or hidden), folded likewise.
CREATE TABLE [tbl_people] (
    [person_id] INTEGER PRIMARY KEY,
    [Surname_ID] INTEGER NOT NULL,
    [Name] TEXT,
    [position] INTEGER NOT NULL,                    -- 1 is the primary adult
    [Marital] INTEGER DEFAULT 0 NOT NULL,
    [preferred_name] TEXT,
    [Preferred_Name_hidden] INTEGER DEFAULT 0 NOT NULL,
    [Active] INTEGER DEFAULT 0 NOT NULL,
    [Decease] INTEGER DEFAULT 0 NOT NULL,
    [Privacy] INTEGER DEFAULT 0 NOT NULL,
    [Prospect] INTEGER DEFAULT 0 NOT NULL,
    [archive] INTEGER DEFAULT 0 NOT NULL,
    [contact] INTEGER DEFAULT 0 NOT NULL,
    [sort_key] TEXT
) STRICT;
CREATE INDEX [idx_people_family] ON [tbl_people] ([Surname_ID], [position], [person_id], [Decease]);

-- One row for each person.
CREATE TABLE [tbl_personal_details] (
    [person_id] INTEGER PRIMARY KEY,
    [Title] TEXT,
    [birthdate] TEXT,
    [school_year] INTEGER CHECK ([school_year] <> 0), -- -1 is the year before year 1, -2 kinder
    [middle_name] TEXT,
    [other_surname] TEXT,
    [mobile_phone] TEXT,
    [Personal_email] TEXT,
    [business_phone] TEXT,
    [business_fax] TEXT,
    [business_email] TEXT,
    [Title_hidden] INTEGER DEFAULT 0 NOT NULL,
    [birthdate_hidden] INTEGER DEFAULT 0 NOT NULL,
    [middle_hidden] INTEGER DEFAULT 0 NOT NULL,
    [surname_hidden] INTEGER DEFAULT 0 NOT NULL,
    [mobile_hidden] INTEGER DEFAULT 0 NOT NULL,
    [email_hidden] INTEGER DEFAULT 0 NOT NULL,
    [bussiness_phone_hidden] INTEGER DEFAULT 0 NOT NULL,
    [Bussiness_fax_hidden] INTEGER DEFAULT 0 NOT NULL,
    [bussiness_email_hidden] INTEGER DEFAULT 0 NOT NULL,
    [Bussiness_hidden] INTEGER DEFAULT 0 NOT NULL
) STRICT;
CREATE INDEX [idx_personal_details_birthdate] ON [tbl_personal_details] ([birthdate]);

-- One row for each family.
CREATE TABLE [tbl_address] (
    [surname_id] INTEGER PRIMARY KEY,
    [res_street] TEXT,
    [res_street2] TEXT,
    [res_state] TEXT,
    [res_country] TEXT,
    [res_map] TEXT,
    [res_ref] TEXT,
    [post_street] TEXT,
    [post_street2] TEXT,
    [post_state] TEXT,
    [post_country] TEXT,
    [phone] TEXT,
    [family_fax] TEXT,
    [family_mobile] TEXT,
    [family_email] TEXT,
    [family_email_description] TEXT,
    [res_hidden] INTEGER DEFAULT 0 NOT NULL,
    [post_hidden] INTEGER DEFAULT 0 NOT NULL,
    [phone_hidden] INTEGER DEFAULT 0 NOT NULL,
    [family_fax_hidden] INTEGER DEFAULT 0 NOT NULL,
    [family_email_hidden] INTEGER DEFAULT 0 NOT NULL,
    [family_mobile_hidden] INTEGER DEFAULT 0 NOT NULL,
    [transfer_exists] INTEGER DEFAULT 0 NOT NULL,
    [audio_note] TEXT
) STRICT;

-- Type is 1 for the residential and 2 for the postal suburb. A family may have a postcode and no suburb.
CREATE TABLE [tbl_suburb] (
    [surname_id] INTEGER NOT NULL,
    [suburb_id] INTEGER,
    [Type] INTEGER NOT NULL,
    [postcode_var] TEXT,
    PRIMARY KEY ([surname_id], [Type])
) STRICT;
CREATE INDEX [idx_suburb_item] ON [tbl_suburb] ([suburb_id], [Type]);

CREATE TABLE [tbl_other_contact] (
    [surname_id] INTEGER NOT NULL,
    [contact] TEXT,
    [phone] TEXT,
    [position] INTEGER DEFAULT 0 NOT NULL
) STRICT;
CREATE INDEX [idx_other_contact_family] ON [tbl_other_contact] ([surname_id], [position]);

CREATE TABLE [tbl_events] (
    [surname_id] INTEGER NOT NULL,
    [event_date] TEXT,
    [event] TEXT,
    [e_position] INTEGER DEFAULT 0 NOT NULL
) STRICT;
CREATE INDEX [idx_events_family] ON [tbl_events] ([surname_id], [e_position]);
CREATE INDEX [idx_events_date] ON [tbl_events] ([event_date]);

CREATE TABLE [tbl_visitation] (
    [surname_id] INTEGER NOT NULL,
    [date] TEXT,
    [visitor] TEXT,
    [comments] TEXT
) STRICT;
CREATE INDEX [idx_visitation_family] ON [tbl_visitation] ([surname_id], [date]);
CREATE INDEX [idx_visitation_date] ON [tbl_visitation] ([date]);

-- Which sections of a family record are open. A missing row means all of them.
CREATE TABLE [tbl_record_access] (
    [surname_id] INTEGER PRIMARY KEY,
    [Address] INTEGER DEFAULT -1 NOT NULL,
    [Details] INTEGER DEFAULT -1 NOT NULL,
    [status] INTEGER DEFAULT -1 NOT NULL,
    [groups] INTEGER DEFAULT -1 NOT NULL,
    [ministry] INTEGER DEFAULT -1 NOT NULL,
    [date] INTEGER DEFAULT -1 NOT NULL,
    [flexi] INTEGER DEFAULT -1 NOT NULL,
    [contact] INTEGER DEFAULT -1 NOT NULL,
    [visitation] INTEGER DEFAULT -1 NOT NULL,
    [family_group] INTEGER DEFAULT -1 NOT NULL,
    [family_date] INTEGER DEFAULT -1 NOT NULL,
    [occupation] INTEGER DEFAULT -1 NOT NULL,
    [events] INTEGER DEFAULT -1 NOT NULL,
    [pin] INTEGER DEFAULT -1 NOT NULL
) STRICT;

-- What a person carries. Nobody carries an item twice, a ministry once in each state.
CREATE TABLE [tbl_status] (
    [person_id] INTEGER NOT NULL,
    [status_id] INTEGER NOT NULL,
    [s_position] INTEGER DEFAULT 0 NOT NULL,
    PRIMARY KEY ([person_id], [status_id])
) STRICT;
CREATE INDEX [idx_status_item] ON [tbl_status] ([status_id], [person_id]);

CREATE TABLE [tbl_group] (
    [person_id] INTEGER NOT NULL,
    [group_id] INTEGER NOT NULL,
    [g_position] INTEGER DEFAULT 0 NOT NULL,
    PRIMARY KEY ([person_id], [group_id])
) STRICT;
CREATE INDEX [idx_group_item] ON [tbl_group] ([group_id], [person_id]);

CREATE TABLE [tbl_ministry] (
    [person_id] INTEGER NOT NULL,
    [ministry_id] INTEGER NOT NULL,
    [ministry_type] INTEGER DEFAULT 1 NOT NULL,     -- 1 active, 2 potential
    [m_position] INTEGER DEFAULT 0 NOT NULL,
    PRIMARY KEY ([person_id], [ministry_id], [ministry_type])
) STRICT;
CREATE INDEX [idx_ministry_item] ON [tbl_ministry] ([ministry_id], [ministry_type], [person_id]);

CREATE TABLE [tbl_flexi] (
    [person_id] INTEGER NOT NULL,
    [flexi_id] INTEGER NOT NULL,
    [flexi_field] TEXT,
    [flexi_tagged] INTEGER DEFAULT 0 NOT NULL,
    PRIMARY KEY ([person_id], [flexi_id])
) STRICT;
CREATE INDEX [idx_flexi_item] ON [tbl_flexi] ([flexi_id], [person_id]);

CREATE TABLE [tbl_individual_date] (
    [person_id] INTEGER NOT NULL,
    [in_date_id] INTEGER NOT NULL,
    [in_date] TEXT,
    [in_date_tagged] INTEGER DEFAULT 0 NOT NULL,
    PRIMARY KEY ([person_id], [in_date_id])
) STRICT;
CREATE INDEX [idx_individual_date_item] ON [tbl_individual_date] ([in_date_id], [in_date]);

CREATE TABLE [tbl_occupation] (
    [person_id] INTEGER NOT NULL,
    [occupation_id] INTEGER NOT NULL,
    PRIMARY KEY ([person_id], [occupation_id])
) STRICT;
CREATE INDEX [idx_occupation_item] ON [tbl_occupation] ([occupation_id], [person_id]);

-- Giving numbers. No two people share one.
CREATE TABLE [tbl_pin] (
    [person_id] INTEGER PRIMARY KEY,
    [personal_pin] TEXT
) STRICT;
CREATE UNIQUE INDEX [idx_pin_number] ON [tbl_pin] ([personal_pin]);

-- Present and past memberships of groups. The name of a group is kept here once the group itself is removed.
CREATE TABLE [tbl_group_history] (
    [history_id] INTEGER PRIMARY KEY,
    [person_id] INTEGER NOT NULL,
    [group_id] INTEGER NOT NULL,
    [group] TEXT,
    [date_in] TEXT,
    [date_out] TEXT,
    [completed] INTEGER DEFAULT 0 NOT NULL
) STRICT;
CREATE INDEX [idx_group_history_person] ON [tbl_group_history] ([person_id], [group_id]);
CREATE INDEX [idx_group_history_group] ON [tbl_group_history] ([group_id]);

-- What a family carries.
CREATE TABLE [tbl_family_group] (
    [surname_id] INTEGER NOT NULL,
    [family_group_id] INTEGER NOT NULL,
    [f_position] INTEGER DEFAULT 0 NOT NULL,
    PRIMARY KEY ([surname_id], [family_group_id])
) STRICT;
CREATE INDEX [idx_family_group_item] ON [tbl_family_group] ([family_group_id], [surname_id]);

CREATE TABLE [tbl_family_date] (
    [surname_id] INTEGER NOT NULL,
    [family_date_id] INTEGER NOT NULL,
    [family_date] TEXT,
    [family_date_tagged] INTEGER DEFAULT 0 NOT NULL,
    PRIMARY KEY ([surname_id], [family_date_id])
) STRICT;
CREATE INDEX [idx_family_date_item] ON [tbl_family_date] ([family_date_id], [family_date]);

-- Setup lists.
CREATE TABLE [tbl_status_setup] (
    [status_id] INTEGER PRIMARY KEY,
    [status] TEXT,
    [position] INTEGER DEFAULT 0 NOT NULL
) STRICT;

CREATE TABLE [tbl_group_setup] (
    [group_id] INTEGER PRIMARY KEY,
    [group] TEXT,
    [not_active] INTEGER DEFAULT 0 NOT NULL,        -- no longer meets, kept for its history
    [position] INTEGER DEFAULT 0 NOT NULL
) STRICT;

CREATE TABLE [tbl_group_details] (
    [group_id] INTEGER PRIMARY KEY,
    [Day] TEXT,
    [Time] TEXT,
    [Frequency] TEXT,
    [Address] TEXT,
    [leader] TEXT,
    [leader_phone] TEXT,
    [assistant_leader] TEXT,
    [assistant_leader_phone] TEXT,
    [host] TEXT,
    [host_phone] TEXT,
    [comments] TEXT
) STRICT;

CREATE TABLE [tbl_ministry_setup] (
    [ministry_id] INTEGER PRIMARY KEY,
    [ministry] TEXT,
    [position] INTEGER DEFAULT 0 NOT NULL
) STRICT;

CREATE TABLE [tbl_individual_date_setup] (
    [in_date_id] INTEGER PRIMARY KEY,
    [date_description] TEXT,
    [position] INTEGER DEFAULT 0 NOT NULL
) STRICT;

CREATE TABLE [tbl_flexi_setup] (
    [flexi_id] INTEGER PRIMARY KEY,
    [flexi] TEXT,
    [position] INTEGER DEFAULT 0 NOT NULL
) STRICT;

CREATE TABLE [tbl_family_group_setup] (
    [family_group_id] INTEGER PRIMARY KEY,
    [family_group] TEXT,
    [position] INTEGER DEFAULT 0 NOT NULL
) STRICT;

CREATE TABLE [tbl_family_date_setup] (
    [fam_date_id] INTEGER PRIMARY KEY,              -- family_date_id elsewhere
    [date_description] TEXT,
    [position] INTEGER DEFAULT 0 NOT NULL
) STRICT;

CREATE TABLE [tbl_title] (
    [title_id] INTEGER PRIMARY KEY,
    [Title] TEXT,
    [position] INTEGER DEFAULT 0 NOT NULL
) STRICT;

CREATE TABLE [tbl_occupation_setup] (
    [occupation_id] INTEGER PRIMARY KEY,
    [occupation] TEXT,
    [position] INTEGER DEFAULT 0 NOT NULL
) STRICT;

CREATE TABLE [tbl_suburb_setup] (
    [suburb_id] INTEGER PRIMARY KEY,
    [suburb] TEXT,
    [postcode] TEXT,
    [position] INTEGER DEFAULT 0 NOT NULL
) STRICT;

-- Fusions: named sets of filter entries.
CREATE TABLE [Tbl_fusion_group] (
    [fusion_id] INTEGER PRIMARY KEY,
    [fusion_group] TEXT,
    [fusion_status] TEXT,                           -- active, privacy, prospect, archived, contact, deceased
    [position] INTEGER DEFAULT 0 NOT NULL
) STRICT;

-- Entries of a fusion, in their order.
CREATE TABLE [Tbl_fusion_records] (
    [field0] INTEGER DEFAULT 0 NOT NULL,            -- kind of item
    [field1] INTEGER DEFAULT 0 NOT NULL,            -- key of the item
    [field2] INTEGER DEFAULT 0 NOT NULL,            -- mode
    [field3] TEXT,                                  -- text of the item
    [field4] INTEGER DEFAULT 0 NOT NULL,            -- ministry state, or -1 for marked rows only
    [field5] TEXT,                                  -- value asked of a flexi field
    [field6] INTEGER NOT NULL,                      -- the fusion
    [position] INTEGER DEFAULT 0 NOT NULL
) STRICT;
CREATE INDEX [idx_fusion_records_fusion] ON [Tbl_fusion_records] ([field6], [position]);
CREATE INDEX [idx_fusion_records_item] ON [Tbl_fusion_records] ([field0], [field1]);

-- Filters kept by name.
CREATE TABLE [tbl_filter_memory] (
    [filter_id] INTEGER PRIMARY KEY,
    [filter_name] TEXT,
    [content] TEXT,
    [position] INTEGER DEFAULT 0 NOT NULL
) STRICT;
