-- Stored queries over families and people.

-- One cheap row that wakes the connection.
CREATE VIEW [qry_search_window] AS
SELECT [startup_id], [Version], [network_Version] FROM [tbl_startup];

-- Setup lists in their order.
CREATE VIEW [Qry_status_list] AS
SELECT [status_id], [status], [position] FROM [tbl_status_setup] ORDER BY [position], [status_id];

CREATE VIEW [Qry_group_setup] AS
SELECT [group_id], [group], [not_active], [position] FROM [tbl_group_setup] ORDER BY [position], [group_id];

-- Only the groups that still meet.
CREATE VIEW [Qry_group_list] AS
SELECT [group_id], [group], [not_active], [position] FROM [tbl_group_setup]
WHERE [not_active] = 0
ORDER BY [position], [group_id];

CREATE VIEW [Qry_ministry_list] AS
SELECT [ministry_id], [ministry], [position] FROM [tbl_ministry_setup] ORDER BY [position], [ministry_id];

CREATE VIEW [Qry_individual_date_list] AS
SELECT [in_date_id], [date_description], [position] FROM [tbl_individual_date_setup] ORDER BY [position], [in_date_id];

CREATE VIEW [Qry_flexi_list] AS
SELECT [flexi_id], [flexi], [position] FROM [tbl_flexi_setup] ORDER BY [position], [flexi_id];

CREATE VIEW [Qry_family_group_list] AS
SELECT [family_group_id], [family_group], [position] FROM [tbl_family_group_setup]
ORDER BY [position], [family_group_id];

CREATE VIEW [Qry_family_date_list] AS
SELECT [fam_date_id], [date_description], [position] FROM [tbl_family_date_setup] ORDER BY [position], [fam_date_id];

CREATE VIEW [Qry_title_list] AS
SELECT [title_id], [Title], [position] FROM [tbl_title] ORDER BY [position], [title_id];

CREATE VIEW [Qry_occupation_list] AS
SELECT [occupation_id], [occupation], [position] FROM [tbl_occupation_setup] ORDER BY [position], [occupation_id];

CREATE VIEW [Qry_suburb_list] AS
SELECT [suburb_id], [suburb], [postcode], [position] FROM [tbl_suburb_setup] ORDER BY [position], [suburb_id];

-- What people and families carry, with the text of each item. The reader orders them: a server does not look into an
-- ordered view for the one owner that is asked for.
CREATE VIEW [qry_status_load] AS
SELECT l.[person_id], l.[status_id], i.[status], l.[s_position]
FROM [tbl_status] l
JOIN [tbl_status_setup] i ON i.[status_id] = l.[status_id];

CREATE VIEW [qry_group_load] AS
SELECT l.[person_id], l.[group_id], i.[group], i.[not_active], l.[g_position]
FROM [tbl_group] l
JOIN [tbl_group_setup] i ON i.[group_id] = l.[group_id];

CREATE VIEW [qry_ministry_load] AS
SELECT l.[person_id], l.[ministry_id], i.[ministry], l.[ministry_type], l.[m_position]
FROM [tbl_ministry] l
JOIN [tbl_ministry_setup] i ON i.[ministry_id] = l.[ministry_id];

CREATE VIEW [qry_flexi_load] AS
SELECT l.[person_id], l.[flexi_id], i.[flexi], l.[flexi_field], l.[flexi_tagged], i.[position]
FROM [tbl_flexi] l
JOIN [tbl_flexi_setup] i ON i.[flexi_id] = l.[flexi_id];

CREATE VIEW [qry_individual_date_load] AS
SELECT l.[person_id], l.[in_date_id], i.[date_description], l.[in_date], l.[in_date_tagged], i.[position]
FROM [tbl_individual_date] l
JOIN [tbl_individual_date_setup] i ON i.[in_date_id] = l.[in_date_id];

CREATE VIEW [qry_occupation_load] AS
SELECT l.[person_id], l.[occupation_id], i.[occupation], i.[position]
FROM [tbl_occupation] l
JOIN [tbl_occupation_setup] i ON i.[occupation_id] = l.[occupation_id];

CREATE VIEW [qry_family_group_load] AS
SELECT l.[surname_id], l.[family_group_id], i.[family_group], l.[f_position]
FROM [tbl_family_group] l
JOIN [tbl_family_group_setup] i ON i.[family_group_id] = l.[family_group_id];

CREATE VIEW [qry_family_date_load] AS
SELECT l.[surname_id], l.[family_date_id], i.[date_description], l.[family_date], l.[family_date_tagged], i.[position]
FROM [tbl_family_date] l
JOIN [tbl_family_date_setup] i ON i.[fam_date_id] = l.[family_date_id];

-- The postcode that holds is the family's own where it has one.
CREATE VIEW [Qry_suburb_load] AS
SELECT l.[surname_id], l.[suburb_id], l.[Type], i.[suburb], i.[postcode], l.[postcode_var],
    COALESCE(l.[postcode_var], i.[postcode]) AS [postcode_used]
FROM [tbl_suburb] l
LEFT JOIN [tbl_suburb_setup] i ON i.[suburb_id] = l.[suburb_id];

CREATE VIEW [Qry_events_load] AS
SELECT [surname_id], [event_date], [event], [e_position] FROM [tbl_events];

CREATE VIEW [qry_group_history] AS
SELECT h.[history_id], h.[person_id], h.[group_id], COALESCE(i.[group], h.[group]) AS [group],
    h.[date_in], h.[date_out], h.[completed]
FROM [tbl_group_history] h
LEFT JOIN [tbl_group_setup] i ON i.[group_id] = h.[group_id];

-- Families by surname. The first lists each with its first living person, and none without one. The other lists all,
-- with the person at the head of the family.
CREATE VIEW [qry_Kindrel_address_book] AS
SELECT f.[Surname_ID], f.[surname], f.[Primary_name], f.[Condition], f.[created], f.[last_edit],
    f.[booked_out], f.[booked_out_date], f.[booked_out_person], f.[active_in_book], f.[sort_key],
    p.[person_id], p.[Name], p.[position], p.[preferred_name], p.[Preferred_Name_hidden],
    p.[Active], p.[Decease], p.[Privacy], p.[Prospect], p.[archive], p.[contact],
    a.[res_street], a.[res_street2], a.[res_hidden], i.[suburb], COALESCE(s.[postcode_var], i.[postcode]) AS [postcode],
    a.[phone], a.[phone_hidden], a.[family_mobile], a.[family_mobile_hidden], a.[family_email], a.[family_email_hidden]
FROM [tbl_surname] f
JOIN [tbl_people] p ON p.[Surname_ID] = f.[Surname_ID] AND p.[Decease] = 0
    AND NOT EXISTS (
        SELECT 1 FROM [tbl_people] q
        WHERE q.[Surname_ID] = f.[Surname_ID] AND q.[Decease] = 0 AND q.[position] <= p.[position]
            AND (q.[position] < p.[position] OR q.[person_id] < p.[person_id]))
LEFT JOIN [tbl_address] a ON a.[surname_id] = f.[Surname_ID]
LEFT JOIN [tbl_suburb] s ON s.[surname_id] = f.[Surname_ID] AND s.[Type] = 1
LEFT JOIN [tbl_suburb_setup] i ON i.[suburb_id] = s.[suburb_id]
ORDER BY f.[sort_key], f.[Primary_name], f.[Surname_ID];

CREATE VIEW [qry_Kindrel_address_book_include_decease] AS
SELECT f.[Surname_ID], f.[surname], f.[Primary_name], f.[Condition], f.[created], f.[last_edit],
    f.[booked_out], f.[booked_out_date], f.[booked_out_person], f.[active_in_book], f.[sort_key],
    p.[person_id], p.[Name], p.[position], p.[preferred_name], p.[Preferred_Name_hidden],
    p.[Active], p.[Decease], p.[Privacy], p.[Prospect], p.[archive], p.[contact],
    a.[res_street], a.[res_street2], a.[res_hidden], i.[suburb], COALESCE(s.[postcode_var], i.[postcode]) AS [postcode],
    a.[phone], a.[phone_hidden], a.[family_mobile], a.[family_mobile_hidden], a.[family_email], a.[family_email_hidden]
FROM [tbl_surname] f
LEFT JOIN [tbl_people] p ON p.[Surname_ID] = f.[Surname_ID]
    AND NOT EXISTS (
        SELECT 1 FROM [tbl_people] q
        WHERE q.[Surname_ID] = f.[Surname_ID] AND q.[position] <= p.[position]
            AND (q.[position] < p.[position] OR q.[person_id] < p.[person_id]))
LEFT JOIN [tbl_address] a ON a.[surname_id] = f.[Surname_ID]
LEFT JOIN [tbl_suburb] s ON s.[surname_id] = f.[Surname_ID] AND s.[Type] = 1
LEFT JOIN [tbl_suburb_setup] i ON i.[suburb_id] = s.[suburb_id]
ORDER BY f.[sort_key], f.[Primary_name], f.[Surname_ID];

-- Booking out.
CREATE VIEW [qry_test_booked] AS
SELECT [Surname_ID], [booked_out], [booked_out_date], [booked_out_person], [active_in_book] FROM [tbl_surname];

CREATE VIEW [qry_booked_surname_ordered] AS
SELECT [Surname_ID], [surname], [Primary_name], [Condition], [created], [last_edit],
    [booked_out], [booked_out_date], [booked_out_person], [active_in_book], [sort_key]
FROM [tbl_surname]
WHERE [booked_out] = -1
ORDER BY [sort_key], [Primary_name], [Surname_ID];

CREATE VIEW [qry_booked_people] AS
SELECT [Surname_ID], [person_id], [Name], [position], [Marital], [preferred_name], [Preferred_Name_hidden],
    [Active], [Decease], [Privacy], [Prospect], [archive], [contact]
FROM [tbl_people]
ORDER BY [Surname_ID], [position], [person_id];

-- What the search walks through, family by family.
CREATE VIEW [qry_search_names] AS
SELECT f.[Surname_ID], p.[person_id], p.[Name], f.[surname], d.[other_surname], d.[middle_name], p.[preferred_name],
    f.[Primary_name], f.[Condition], p.[position], p.[Preferred_Name_hidden], d.[surname_hidden], d.[middle_hidden],
    p.[Active], p.[Decease], p.[Privacy], p.[Prospect], p.[archive], p.[contact], f.[sort_key]
FROM [tbl_surname] f
JOIN [tbl_people] p ON p.[Surname_ID] = f.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = p.[person_id]
ORDER BY f.[sort_key], f.[Primary_name], f.[Surname_ID], p.[position];

CREATE VIEW [qry_search_all] AS
SELECT f.[Surname_ID], p.[person_id], p.[Name], f.[surname], d.[other_surname], d.[middle_name], p.[preferred_name],
    a.[phone], a.[family_fax], a.[family_mobile], a.[family_email], d.[mobile_phone], d.[Personal_email],
    d.[business_phone], d.[business_fax], d.[business_email],
    a.[res_street], a.[res_street2], a.[res_state], a.[res_country], a.[res_map],
    a.[post_street], a.[post_street2], a.[post_state], a.[post_country],
    f.[Primary_name], f.[Condition], p.[position], p.[Preferred_Name_hidden], d.[surname_hidden],
    p.[Active], p.[Decease], p.[Privacy], p.[Prospect], p.[archive], p.[contact], f.[sort_key]
FROM [tbl_surname] f
JOIN [tbl_people] p ON p.[Surname_ID] = f.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = p.[person_id]
LEFT JOIN [tbl_address] a ON a.[surname_id] = f.[Surname_ID]
ORDER BY f.[sort_key], f.[Primary_name], f.[Surname_ID], p.[position];

-- Filters: one row for each person, here and below. The suburb is the residential one. Month, day and year are numbers
-- for ranges that ask for any year, for a month or for an age.
CREATE VIEW [qry_filter1_all] AS
SELECT p.[Surname_ID], p.[person_id], f.[surname], p.[Name], f.[Primary_name], p.[position],
    p.[preferred_name], p.[Preferred_Name_hidden], d.[other_surname], d.[surname_hidden],
    p.[contact], p.[Decease], p.[Active], p.[Privacy], p.[Prospect], p.[archive], f.[Condition], p.[Marital],
    d.[school_year], d.[birthdate], d.[birthdate_hidden],
    CAST(substr(d.[birthdate], 1, 4) AS BIGINT) AS [birthdate_year],
    CAST(substr(d.[birthdate], 6, 2) AS BIGINT) AS [birthdate_month],
    CAST(substr(d.[birthdate], 6, 2) AS BIGINT) * 100 + CAST(substr(d.[birthdate], 9, 2) AS BIGINT)
        AS [birthdate_month_day],
    substr(f.[sort_key], 1, 1) AS [Alpha_sort],
    CASE WHEN d.[other_surname] IS NULL OR d.[surname_hidden] <> 0 THEN f.[surname] ELSE d.[other_surname] END
        AS [sort_surname],
    p.[sort_key], f.[sort_key] AS [family_sort_key],
    s.[suburb_id], i.[suburb], s.[Type], COALESCE(s.[postcode_var], i.[postcode]) AS [postcode], s.[postcode_var],
    f.[booked_out], f.[active_in_book]
FROM [tbl_people] p
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = p.[person_id]
LEFT JOIN [tbl_suburb] s ON s.[surname_id] = p.[Surname_ID] AND s.[Type] = 1
LEFT JOIN [tbl_suburb_setup] i ON i.[suburb_id] = s.[suburb_id];

-- From here on a person appears once for each item carried, and once without an item when carrying none.
CREATE VIEW [qry_filter2_status] AS
SELECT b.[Surname_ID], b.[person_id], b.[surname], b.[Name], b.[Primary_name], b.[position], b.[preferred_name],
    b.[Preferred_Name_hidden], b.[other_surname], b.[surname_hidden], b.[contact], b.[Decease], b.[Active],
    b.[Privacy], b.[Prospect], b.[archive], b.[Condition], b.[Marital], b.[school_year], b.[birthdate],
    b.[birthdate_hidden], b.[birthdate_year], b.[birthdate_month], b.[birthdate_month_day], b.[Alpha_sort],
    b.[sort_surname], b.[sort_key], b.[family_sort_key], b.[suburb_id], b.[suburb], b.[Type], b.[postcode],
    b.[postcode_var], b.[booked_out], b.[active_in_book], l.[status_id], t.[status]
FROM [qry_filter1_all] b
LEFT JOIN [tbl_status] l ON l.[person_id] = b.[person_id]
LEFT JOIN [tbl_status_setup] t ON t.[status_id] = l.[status_id];

CREATE VIEW [qry_filter3_in_group] AS
SELECT b.[Surname_ID], b.[person_id], b.[surname], b.[Name], b.[Primary_name], b.[position], b.[preferred_name],
    b.[Preferred_Name_hidden], b.[other_surname], b.[surname_hidden], b.[contact], b.[Decease], b.[Active],
    b.[Privacy], b.[Prospect], b.[archive], b.[Condition], b.[Marital], b.[school_year], b.[birthdate],
    b.[birthdate_hidden], b.[birthdate_year], b.[birthdate_month], b.[birthdate_month_day], b.[Alpha_sort],
    b.[sort_surname], b.[sort_key], b.[family_sort_key], b.[suburb_id], b.[suburb], b.[Type], b.[postcode],
    b.[postcode_var], b.[booked_out], b.[active_in_book], l.[group_id], t.[group]
FROM [qry_filter1_all] b
LEFT JOIN [tbl_group] l ON l.[person_id] = b.[person_id]
LEFT JOIN [tbl_group_setup] t ON t.[group_id] = l.[group_id];

CREATE VIEW [qry_filter4_family_group] AS
SELECT b.[Surname_ID], b.[person_id], b.[surname], b.[Name], b.[Primary_name], b.[position], b.[preferred_name],
    b.[Preferred_Name_hidden], b.[other_surname], b.[surname_hidden], b.[contact], b.[Decease], b.[Active],
    b.[Privacy], b.[Prospect], b.[archive], b.[Condition], b.[Marital], b.[school_year], b.[birthdate],
    b.[birthdate_hidden], b.[birthdate_year], b.[birthdate_month], b.[birthdate_month_day], b.[Alpha_sort],
    b.[sort_surname], b.[sort_key], b.[family_sort_key], b.[suburb_id], b.[suburb], b.[Type], b.[postcode],
    b.[postcode_var], b.[booked_out], b.[active_in_book], l.[family_group_id], t.[family_group]
FROM [qry_filter1_all] b
LEFT JOIN [tbl_family_group] l ON l.[surname_id] = b.[Surname_ID]
LEFT JOIN [tbl_family_group_setup] t ON t.[family_group_id] = l.[family_group_id];

CREATE VIEW [qry_filter5_ministry] AS
SELECT b.[Surname_ID], b.[person_id], b.[surname], b.[Name], b.[Primary_name], b.[position], b.[preferred_name],
    b.[Preferred_Name_hidden], b.[other_surname], b.[surname_hidden], b.[contact], b.[Decease], b.[Active],
    b.[Privacy], b.[Prospect], b.[archive], b.[Condition], b.[Marital], b.[school_year], b.[birthdate],
    b.[birthdate_hidden], b.[birthdate_year], b.[birthdate_month], b.[birthdate_month_day], b.[Alpha_sort],
    b.[sort_surname], b.[sort_key], b.[family_sort_key], b.[suburb_id], b.[suburb], b.[Type], b.[postcode],
    b.[postcode_var], b.[booked_out], b.[active_in_book], l.[ministry_id], l.[ministry_type], t.[ministry]
FROM [qry_filter1_all] b
LEFT JOIN [tbl_ministry] l ON l.[person_id] = b.[person_id]
LEFT JOIN [tbl_ministry_setup] t ON t.[ministry_id] = l.[ministry_id];

CREATE VIEW [qry_filter7_in_date] AS
SELECT b.[Surname_ID], b.[person_id], b.[surname], b.[Name], b.[Primary_name], b.[position], b.[preferred_name],
    b.[Preferred_Name_hidden], b.[other_surname], b.[surname_hidden], b.[contact], b.[Decease], b.[Active],
    b.[Privacy], b.[Prospect], b.[archive], b.[Condition], b.[Marital], b.[school_year], b.[birthdate],
    b.[birthdate_hidden], b.[birthdate_year], b.[birthdate_month], b.[birthdate_month_day], b.[Alpha_sort],
    b.[sort_surname], b.[sort_key], b.[family_sort_key], b.[suburb_id], b.[suburb], b.[Type], b.[postcode],
    b.[postcode_var], b.[booked_out], b.[active_in_book], l.[in_date_id], l.[in_date],
    CAST(substr(l.[in_date], 6, 2) AS BIGINT) * 100 + CAST(substr(l.[in_date], 9, 2) AS BIGINT) AS [in_date_month_day],
    l.[in_date_tagged]
FROM [qry_filter1_all] b
LEFT JOIN [tbl_individual_date] l ON l.[person_id] = b.[person_id];

CREATE VIEW [qry_filter8_family_date] AS
SELECT b.[Surname_ID], b.[person_id], b.[surname], b.[Name], b.[Primary_name], b.[position], b.[preferred_name],
    b.[Preferred_Name_hidden], b.[other_surname], b.[surname_hidden], b.[contact], b.[Decease], b.[Active],
    b.[Privacy], b.[Prospect], b.[archive], b.[Condition], b.[Marital], b.[school_year], b.[birthdate],
    b.[birthdate_hidden], b.[birthdate_year], b.[birthdate_month], b.[birthdate_month_day], b.[Alpha_sort],
    b.[sort_surname], b.[sort_key], b.[family_sort_key], b.[suburb_id], b.[suburb], b.[Type], b.[postcode],
    b.[postcode_var], b.[booked_out], b.[active_in_book], l.[family_date_id], l.[family_date],
    CAST(substr(l.[family_date], 6, 2) AS BIGINT) * 100 + CAST(substr(l.[family_date], 9, 2) AS BIGINT)
        AS [family_date_month_day],
    l.[family_date_tagged]
FROM [qry_filter1_all] b
LEFT JOIN [tbl_family_date] l ON l.[surname_id] = b.[Surname_ID];

CREATE VIEW [qry_filter9_flexi] AS
SELECT b.[Surname_ID], b.[person_id], b.[surname], b.[Name], b.[Primary_name], b.[position], b.[preferred_name],
    b.[Preferred_Name_hidden], b.[other_surname], b.[surname_hidden], b.[contact], b.[Decease], b.[Active],
    b.[Privacy], b.[Prospect], b.[archive], b.[Condition], b.[Marital], b.[school_year], b.[birthdate],
    b.[birthdate_hidden], b.[birthdate_year], b.[birthdate_month], b.[birthdate_month_day], b.[Alpha_sort],
    b.[sort_surname], b.[sort_key], b.[family_sort_key], b.[suburb_id], b.[suburb], b.[Type], b.[postcode],
    b.[postcode_var], b.[booked_out], b.[active_in_book], l.[flexi_id], l.[flexi_field], l.[flexi_tagged], t.[flexi]
FROM [qry_filter1_all] b
LEFT JOIN [tbl_flexi] l ON l.[person_id] = b.[person_id]
LEFT JOIN [tbl_flexi_setup] t ON t.[flexi_id] = l.[flexi_id];

CREATE VIEW [qry_filter10_occupation] AS
SELECT b.[Surname_ID], b.[person_id], b.[surname], b.[Name], b.[Primary_name], b.[position], b.[preferred_name],
    b.[Preferred_Name_hidden], b.[other_surname], b.[surname_hidden], b.[contact], b.[Decease], b.[Active],
    b.[Privacy], b.[Prospect], b.[archive], b.[Condition], b.[Marital], b.[school_year], b.[birthdate],
    b.[birthdate_hidden], b.[birthdate_year], b.[birthdate_month], b.[birthdate_month_day], b.[Alpha_sort],
    b.[sort_surname], b.[sort_key], b.[family_sort_key], b.[suburb_id], b.[suburb], b.[Type], b.[postcode],
    b.[postcode_var], b.[booked_out], b.[active_in_book], l.[occupation_id], t.[occupation], d.[Bussiness_hidden]
FROM [qry_filter1_all] b
LEFT JOIN [tbl_occupation] l ON l.[person_id] = b.[person_id]
LEFT JOIN [tbl_occupation_setup] t ON t.[occupation_id] = l.[occupation_id]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = b.[person_id];

-- Residential and postal suburbs alike.
CREATE VIEW [qry_filter11_suburb] AS
SELECT b.[Surname_ID], b.[person_id], b.[surname], b.[Name], b.[Primary_name], b.[position], b.[preferred_name],
    b.[Preferred_Name_hidden], b.[other_surname], b.[surname_hidden], b.[contact], b.[Decease], b.[Active],
    b.[Privacy], b.[Prospect], b.[archive], b.[Condition], b.[Marital], b.[school_year], b.[birthdate],
    b.[birthdate_hidden], b.[birthdate_year], b.[birthdate_month], b.[birthdate_month_day], b.[Alpha_sort],
    b.[sort_surname], b.[sort_key], b.[family_sort_key], b.[booked_out], b.[active_in_book], l.[suburb_id],
    t.[suburb], l.[Type], COALESCE(l.[postcode_var], t.[postcode]) AS [postcode], l.[postcode_var]
FROM [qry_filter1_all] b
LEFT JOIN [tbl_suburb] l ON l.[surname_id] = b.[Surname_ID]
LEFT JOIN [tbl_suburb_setup] t ON t.[suburb_id] = l.[suburb_id];

-- Every combination of what a person and the family carry: to be asked for few people only.
CREATE VIEW [qry_filter_everything] AS
SELECT b.[Surname_ID], b.[person_id], b.[surname], b.[Name], b.[Primary_name], b.[position], b.[preferred_name],
    b.[Preferred_Name_hidden], b.[other_surname], b.[surname_hidden], b.[contact], b.[Decease], b.[Active],
    b.[Privacy], b.[Prospect], b.[archive], b.[Condition], b.[Marital], b.[school_year], b.[birthdate],
    b.[birthdate_hidden], b.[birthdate_year], b.[birthdate_month], b.[birthdate_month_day], b.[Alpha_sort],
    b.[sort_surname], b.[sort_key], b.[family_sort_key], b.[suburb_id], b.[suburb], b.[Type], b.[postcode],
    b.[postcode_var], b.[booked_out], b.[active_in_book], st.[status_id], g.[group_id], fg.[family_group_id],
    m.[ministry_id], m.[ministry_type], pd.[in_date_id], pd.[in_date],
    CAST(substr(pd.[in_date], 6, 2) AS BIGINT) * 100 + CAST(substr(pd.[in_date], 9, 2) AS BIGINT)
        AS [in_date_month_day],
    pd.[in_date_tagged], fd.[family_date_id], fd.[family_date],
    CAST(substr(fd.[family_date], 6, 2) AS BIGINT) * 100 + CAST(substr(fd.[family_date], 9, 2) AS BIGINT)
        AS [family_date_month_day],
    fd.[family_date_tagged], fl.[flexi_id], fl.[flexi_field], fl.[flexi_tagged], o.[occupation_id]
FROM [qry_filter1_all] b
LEFT JOIN [tbl_status] st ON st.[person_id] = b.[person_id]
LEFT JOIN [tbl_group] g ON g.[person_id] = b.[person_id]
LEFT JOIN [tbl_family_group] fg ON fg.[surname_id] = b.[Surname_ID]
LEFT JOIN [tbl_ministry] m ON m.[person_id] = b.[person_id]
LEFT JOIN [tbl_individual_date] pd ON pd.[person_id] = b.[person_id]
LEFT JOIN [tbl_family_date] fd ON fd.[surname_id] = b.[Surname_ID]
LEFT JOIN [tbl_flexi] fl ON fl.[person_id] = b.[person_id]
LEFT JOIN [tbl_occupation] o ON o.[person_id] = b.[person_id];

-- The same with the letter of the surname by which the person sorts.
CREATE VIEW [qry_filter_everything_personal_sort] AS
SELECT b.[Surname_ID], b.[person_id], b.[surname], b.[Name], b.[Primary_name], b.[position], b.[preferred_name],
    b.[Preferred_Name_hidden], b.[other_surname], b.[surname_hidden], b.[contact], b.[Decease], b.[Active],
    b.[Privacy], b.[Prospect], b.[archive], b.[Condition], b.[Marital], b.[school_year], b.[birthdate],
    b.[birthdate_hidden], b.[birthdate_year], b.[birthdate_month], b.[birthdate_month_day],
    substr(b.[sort_key], 1, 1) AS [Alpha_sort], b.[sort_surname], b.[sort_key], b.[family_sort_key], b.[suburb_id],
    b.[suburb], b.[Type], b.[postcode], b.[postcode_var], b.[booked_out], b.[active_in_book], b.[status_id],
    b.[group_id], b.[family_group_id], b.[ministry_id], b.[ministry_type], b.[in_date_id], b.[in_date],
    b.[in_date_month_day], b.[in_date_tagged], b.[family_date_id], b.[family_date], b.[family_date_month_day],
    b.[family_date_tagged], b.[flexi_id], b.[flexi_field], b.[flexi_tagged], b.[occupation_id]
FROM [qry_filter_everything] b;

-- The same with the events and visits of the family.
CREATE VIEW [qry_filter_everything_personal_date] AS
SELECT b.[Surname_ID], b.[person_id], b.[surname], b.[Name], b.[Primary_name], b.[position], b.[preferred_name],
    b.[Preferred_Name_hidden], b.[other_surname], b.[surname_hidden], b.[contact], b.[Decease], b.[Active],
    b.[Privacy], b.[Prospect], b.[archive], b.[Condition], b.[Marital], b.[school_year], b.[birthdate],
    b.[birthdate_hidden], b.[birthdate_year], b.[birthdate_month], b.[birthdate_month_day], b.[Alpha_sort],
    b.[sort_surname], b.[sort_key], b.[family_sort_key], b.[suburb_id], b.[suburb], b.[Type], b.[postcode],
    b.[postcode_var], b.[booked_out], b.[active_in_book], b.[status_id], b.[group_id], b.[family_group_id],
    b.[ministry_id], b.[ministry_type], b.[in_date_id], b.[in_date], b.[in_date_month_day], b.[in_date_tagged],
    b.[family_date_id], b.[family_date], b.[family_date_month_day], b.[family_date_tagged], b.[flexi_id],
    b.[flexi_field], b.[flexi_tagged], b.[occupation_id], e.[event_date], v.[date]
FROM [qry_filter_everything] b
LEFT JOIN [tbl_events] e ON e.[surname_id] = b.[Surname_ID]
LEFT JOIN [tbl_visitation] v ON v.[surname_id] = b.[Surname_ID];
