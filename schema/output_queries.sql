-- Stored queries that output reads. Nothing is hidden here: what may be shown is decided after reading.

CREATE VIEW [Qry_report_find_personal_details] AS
SELECT p.[person_id], p.[Surname_ID], f.[surname], p.[Name], f.[Primary_name], p.[position], p.[Marital],
    p.[preferred_name], p.[Preferred_Name_hidden], d.[Title], d.[birthdate], d.[school_year], d.[middle_name],
    d.[other_surname], d.[mobile_phone], d.[Personal_email], d.[business_phone], d.[business_fax], d.[business_email],
    d.[Title_hidden], d.[birthdate_hidden], d.[middle_hidden], d.[surname_hidden], d.[mobile_hidden], d.[email_hidden],
    d.[bussiness_phone_hidden], d.[Bussiness_fax_hidden], d.[bussiness_email_hidden], d.[Bussiness_hidden],
    p.[Active], p.[Decease], p.[Privacy], p.[Prospect], p.[archive], p.[contact], f.[Condition],
    f.[created], f.[last_edit], p.[sort_key], f.[sort_key] AS [family_sort_key]
FROM [tbl_people] p
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = p.[person_id];

CREATE VIEW [Qry_letter_find_personal_details] AS
SELECT p.[Surname_ID], p.[person_id], f.[surname], p.[Name], f.[Primary_name], p.[position], p.[Marital],
    p.[preferred_name], p.[Preferred_Name_hidden], d.[Title], d.[Title_hidden], d.[other_surname], d.[surname_hidden],
    p.[Active], p.[Decease], p.[Privacy], p.[Prospect], p.[archive], p.[contact], f.[Condition]
FROM [tbl_people] p
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = p.[person_id]
ORDER BY p.[Surname_ID], p.[position], p.[person_id];

CREATE VIEW [Qry_letter_find_address] AS
SELECT f.[Surname_ID], f.[surname], a.[res_street], a.[res_street2], i.[suburb],
    COALESCE(s.[postcode_var], i.[postcode]) AS [postcode], a.[res_state], a.[res_country], a.[res_hidden]
FROM [tbl_surname] f
LEFT JOIN [tbl_address] a ON a.[surname_id] = f.[Surname_ID]
LEFT JOIN [tbl_suburb] s ON s.[surname_id] = f.[Surname_ID] AND s.[Type] = 1
LEFT JOIN [tbl_suburb_setup] i ON i.[suburb_id] = s.[suburb_id];

CREATE VIEW [Qry_letter_find_postal_address] AS
SELECT f.[Surname_ID], f.[surname], a.[post_street], a.[post_street2], i.[suburb],
    COALESCE(s.[postcode_var], i.[postcode]) AS [postcode], a.[post_state], a.[post_country], a.[post_hidden]
FROM [tbl_surname] f
LEFT JOIN [tbl_address] a ON a.[surname_id] = f.[Surname_ID]
LEFT JOIN [tbl_suburb] s ON s.[surname_id] = f.[Surname_ID] AND s.[Type] = 2
LEFT JOIN [tbl_suburb_setup] i ON i.[suburb_id] = s.[suburb_id];

CREATE VIEW [Qry_mail_export] AS
SELECT p.[person_id], p.[Surname_ID], f.[surname], p.[Name], f.[Primary_name], p.[position],
    p.[preferred_name], p.[Preferred_Name_hidden], d.[Title], d.[Title_hidden], d.[other_surname], d.[surname_hidden],
    a.[res_street], a.[res_street2], a.[res_state], a.[res_country], a.[res_hidden],
    a.[post_street], a.[post_street2], a.[post_state], a.[post_country], a.[post_hidden]
FROM [tbl_people] p
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = p.[person_id]
LEFT JOIN [tbl_address] a ON a.[surname_id] = p.[Surname_ID];

CREATE VIEW [qry_occupation_report] AS
SELECT p.[person_id], p.[Surname_ID], f.[surname], p.[Name], f.[Primary_name], p.[position],
    p.[preferred_name], p.[Preferred_Name_hidden], l.[occupation_id], i.[occupation],
    i.[position] AS [occupation_position], COALESCE(d.[Bussiness_hidden], 0) AS [Bussiness_hidden]
FROM [tbl_occupation] l
JOIN [tbl_occupation_setup] i ON i.[occupation_id] = l.[occupation_id]
JOIN [tbl_people] p ON p.[person_id] = l.[person_id]
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = p.[person_id];

CREATE VIEW [qry_email_search] AS
SELECT p.[person_id], p.[Surname_ID], f.[surname], p.[Name], f.[Primary_name], p.[position],
    p.[preferred_name], p.[Preferred_Name_hidden], d.[other_surname], d.[surname_hidden],
    a.[family_email], d.[Personal_email], d.[business_email], a.[family_email_description],
    COALESCE(a.[family_email_hidden], 0) AS [family_email_hidden], COALESCE(d.[email_hidden], 0) AS [email_hidden],
    COALESCE(d.[bussiness_email_hidden], 0) AS [bussiness_email_hidden],
    COALESCE(d.[Bussiness_hidden], 0) AS [Bussiness_hidden],
    p.[Active], p.[Decease], p.[Privacy], p.[Prospect], p.[archive], p.[contact], f.[Condition],
    p.[sort_key], f.[sort_key] AS [family_sort_key]
FROM [tbl_people] p
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = p.[person_id]
LEFT JOIN [tbl_address] a ON a.[surname_id] = p.[Surname_ID];

CREATE VIEW [qry_email_memory] AS
SELECT [user_id], [surname_id], [person_id], [address_kind], [position] FROM [tbl_email_memory] ORDER BY [position];

CREATE VIEW [Qry_email_memory_names] AS
SELECT m.[user_id], m.[surname_id], m.[person_id], m.[address_kind], m.[position], f.[surname], p.[Name],
    f.[Primary_name], p.[position] AS [family_position], p.[preferred_name], p.[Preferred_Name_hidden],
    a.[family_email], d.[Personal_email], d.[business_email], a.[family_email_description],
    COALESCE(a.[family_email_hidden], 0) AS [family_email_hidden], COALESCE(d.[email_hidden], 0) AS [email_hidden],
    COALESCE(d.[bussiness_email_hidden], 0) AS [bussiness_email_hidden],
    COALESCE(d.[Bussiness_hidden], 0) AS [Bussiness_hidden]
FROM [tbl_email_memory] m
JOIN [tbl_surname] f ON f.[Surname_ID] = m.[surname_id]
JOIN [tbl_people] p ON p.[person_id] = m.[person_id]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = m.[person_id]
LEFT JOIN [tbl_address] a ON a.[surname_id] = m.[surname_id]
ORDER BY m.[position];
